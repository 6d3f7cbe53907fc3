// Waits on its own thread for a dialog of this process that has the button, reads it and
// presses the button, as a person would.
#pragma once

#include <windows.h>

#include <atomic>
#include <string>
#include <thread>

class DialogAnswerer {
 public:
  explicit DialogAnswerer(int buttonId) : m_nButton(buttonId), m_thread([this] { Watch(); }) {}
  ~DialogAnswerer() { Caption(); }
  DialogAnswerer(const DialogAnswerer &) = delete;
  DialogAnswerer &operator=(const DialogAnswerer &) = delete;

  // Caption of the dialog answered, empty while none was.
  std::string Caption() {
    Stop();
    return m_caption;
  }
  // The texts of the dialog's static controls (a message box's message), one after another.
  std::wstring Text() {
    Stop();
    return m_text;
  }

 private:
  struct Search {
    int button;
    HWND found;
  };

  static BOOL CALLBACK Match(HWND window, LPARAM param) {
    auto *search = reinterpret_cast<Search *>(param);
    DWORD process = 0;
    GetWindowThreadProcessId(window, &process);
    char className[32] = "";
    GetClassNameA(window, className, sizeof className);
    if (process != GetCurrentProcessId() || std::string(className) != "#32770" || !IsWindowVisible(window) ||
        !GetDlgItem(window, search->button))
      return TRUE;
    search->found = window;
    return FALSE;
  }

  void Stop() {
    m_bStop = true;
    if (m_thread.joinable()) m_thread.join();
  }

  void Watch() {
    for (int tries = 0; tries < 300 && !m_bStop; ++tries) {
      Search search{m_nButton, nullptr};
      EnumWindows(Match, reinterpret_cast<LPARAM>(&search));
      if (search.found) {
        char caption[256] = "";
        GetWindowTextA(search.found, caption, sizeof caption);
        m_caption = caption;
        for (HWND child = FindWindowExA(search.found, nullptr, "Static", nullptr); child;
             child = FindWindowExA(search.found, child, "Static", nullptr)) {
          wchar_t text[2048] = L"";
          GetWindowTextW(child, text, 2048);
          m_text += text;
        }
        SendMessageA(GetDlgItem(search.found, m_nButton), BM_CLICK, 0, 0);
        return;
      }
      Sleep(50);
    }
  }

  int m_nButton;
  std::string m_caption;
  std::wstring m_text;
  std::atomic<bool> m_bStop{false};
  std::thread m_thread;
};
