// Runs browse calls of the loaded module while a watcher thread finds the explorer frame,
// looks at it and acts on it as a person would, then reads the LISP result.
#pragma once

#include "CaseTimeLimit.h"
#include "ModuleHarness.h"

#include <windows.h>
#include <commctrl.h>
#include <ole2.h>
#include <shlobj.h>

#include <atomic>
#include <cstdio>
#include <cstring>
#include <fstream>
#include <functional>
#include <sstream>
#include <string>
#include <thread>
#include <vector>

// Keeps the module's state file as it was before the test and restores it after.
class StateFileGuard {
 public:
  StateFileGuard() : m_path(Narrow(ProgramFolder()) + "Lumvex1.ini") {
    std::ifstream in(m_path, std::ios::binary);
    m_existed = in.good();
    if (m_existed) m_content.assign(std::istreambuf_iterator<char>(in), {});
  }
  ~StateFileGuard() {
    if (m_existed)
      std::ofstream(m_path, std::ios::binary) << m_content;
    else
      DeleteFileA(m_path.c_str());
  }
  StateFileGuard(const StateFileGuard &) = delete;
  StateFileGuard &operator=(const StateFileGuard &) = delete;

  const std::string &Path() const { return m_path; }
  void Write(const std::string &content) const { std::ofstream(m_path, std::ios::binary) << content; }
  void Remove() const { DeleteFileA(m_path.c_str()); }
  std::string Read() const {
    std::ifstream in(m_path, std::ios::binary);
    return std::string(std::istreambuf_iterator<char>(in), {});
  }

  static std::string Narrow(const std::wstring &text) { return std::string(text.begin(), text.end()); }

 private:
  std::string m_path;
  bool m_existed = false;
  std::string m_content;
};

#if __has_include(<gtest/gtest.h>)  // the benchmarks that share this header build without gtest
#include <gtest/gtest.h>
inline void WaitGaveUp(const std::string &what) { ADD_FAILURE() << "gave up waiting for " << what; }
#else
inline void WaitGaveUp(const std::string &what) { std::fprintf(stderr, "gave up waiting for %s\n", what.c_str()); }
#endif

// A visible top-level window of this process with the class and, unless null, the title: other
// programs on the same display may show windows of the same kind at any time. Null, and a
// failed case, when none comes within the time.
inline HWND WaitForWindow(const char *className, const char *title, int milliseconds = 15000) {
  const std::string what = std::string("a window of class ") + className + (title ? std::string(" titled ") + title : "");
  const WaitingFor waiting(what);
  struct Search {
    const char *className, *title;
    HWND found;
  } search{className, title, nullptr};
  for (int waited = 0; waited < milliseconds; waited += 50) {
    EnumWindows(
        [](HWND hwnd, LPARAM param) {
          auto *search = reinterpret_cast<Search *>(param);
          DWORD process = 0;
          GetWindowThreadProcessId(hwnd, &process);
          char name[64] = "";
          GetClassNameA(hwnd, name, sizeof name);
          if (process != GetCurrentProcessId() || !IsWindowVisible(hwnd) || std::strcmp(name, search->className) != 0)
            return TRUE;
          // The title as the window keeps it: asking the window would wait for its thread.
          wchar_t text[256] = L"";
          InternalGetWindowText(hwnd, text, 256);
          if (search->title && std::wstring(text) != std::wstring(search->title, search->title + std::strlen(search->title)))
            return TRUE;
          search->found = hwnd;
          return FALSE;
        },
        reinterpret_cast<LPARAM>(&search));
    if (search.found) return search.found;
    Sleep(50);
  }
  WaitGaveUp(what);
  return nullptr;
}

// The popup menu this process opens, or null and a failed case; a menu that shows only after
// the wait is closed, so that its loop cannot hold the test.
inline HWND WaitForPopupMenu() {
  HWND menu = WaitForWindow("#32768", nullptr, 5000);
  if (!menu) EndMenu();
  return menu;
}

// The frame once the explorer has started: its thread answers only when back in its message
// loop, that is after the frame was placed, shown and given its first texts.
inline HWND WaitForFrame() {
  HWND frame = WaitForWindow("FwFrame128", nullptr);
  if (frame) SendMessageA(frame, WM_NULL, 0, 0);
  return frame;
}

inline std::string WindowText(HWND hwnd) {
  char text[512] = "";
  GetWindowTextA(hwnd, text, sizeof text);
  return text;
}

inline std::vector<HWND> Children(HWND parent, const char *className) {
  std::vector<HWND> found;
  for (HWND child = FindWindowExA(parent, nullptr, className, nullptr); child;
       child = FindWindowExA(parent, child, className, nullptr))
    found.push_back(child);
  return found;
}

// The frame's tool bars: the top one first.
inline std::vector<HWND> ToolBars(HWND frame) {
  std::vector<HWND> bars = Children(frame, TOOLBARCLASSNAMEA);
  std::sort(bars.begin(), bars.end(), [](HWND a, HWND b) {
    RECT ra, rb;
    GetWindowRect(a, &ra);
    GetWindowRect(b, &rb);
    return ra.top < rb.top;
  });
  return bars;
}

inline std::vector<int> ToolBarIds(HWND bar) {
  std::vector<int> ids;
  const int count = static_cast<int>(SendMessageA(bar, TB_BUTTONCOUNT, 0, 0));
  for (int i = 0; i < count; ++i) {
    TBBUTTON button{};
    SendMessageA(bar, TB_GETBUTTON, i, reinterpret_cast<LPARAM>(&button));
    ids.push_back((button.fsStyle & TBSTYLE_SEP) && button.idCommand <= 0 ? 0 : button.idCommand);
  }
  return ids;
}

// One browse call: the watcher runs on its own thread while the call's modal loop runs here.
struct BrowseOutcome {
  int resultKind = 0;
  std::vector<int> kinds;           // the type of every node of the result, in order
  std::vector<std::wstring> texts;  // every string of the result, in order
  bool watcherFoundFrame = false;
};

// When no frame shows, the watcher closes whatever the call shows instead until it returns.
inline BrowseOutcome Browse(resbuf *args, const std::function<void(HWND frame)> &watcher) {
  BrowseOutcome outcome;
  const DWORD caller = GetCurrentThreadId();
  std::atomic<bool> returned{false};
  std::thread watch([&] {
    HWND frame = WaitForFrame();
    outcome.watcherFoundFrame = frame != nullptr;
    if (frame) return watcher(frame);
    const WaitingFor waiting("the browse call to return after its windows were closed");
    while (!returned) {
      EnumThreadWindows(caller, [](HWND hwnd, LPARAM) { return PostMessageA(hwnd, WM_CLOSE, 0, 0), TRUE; }, 0);
      Sleep(100);
    }
  });
  {
    const WaitingFor waiting("the browse call to return");
    devhostInvoke(L"Lumvex", args);
  }
  returned = true;
  watch.join();
  outcome.resultKind = devhostResultKind();
  resbuf *result = devhostResultCopy();
  for (resbuf *node = result; node; node = node->rbnext) {
    outcome.kinds.push_back(node->restype);
    if (node->restype == RTSTR) outcome.texts.emplace_back(node->resval.rstring);
  }
  acutRelRb(result);
  devhostClearResult();
  return outcome;
}

inline resbuf *BrowseArgs(const wchar_t *folder, const wchar_t *accept = L"Insert", const wchar_t *cancel = L"Close") {
  return acutBuildList(RTSHORT, 0, RTSHORT, 0, RTSTR, folder, RTSTR, accept, RTSTR, cancel, 0);
}

#if __has_include(<gtest/gtest.h>)
// Browse calls of the module loaded into the host, with OLE initialised on the host's thread as
// the CAD application has it, and the state file as it was before the test.
class BrowseTest : public ::testing::Test {
 protected:
  static void SetUpTestSuite() { OleInitialize(nullptr); }
  static void TearDownTestSuite() { OleUninitialize(); }
  void SetUp() override { ASSERT_EQ(m_module.LoadResult(), kDevhostLoaded); }
  StateFileGuard m_state;
  LoadedModule m_module;
};
#endif

// Puts one file on the clipboard as an ANSI file list, as the shell's copy does.
inline void PutFileOnClipboard(const std::string &path) {
  HGLOBAL block = GlobalAlloc(GMEM_MOVEABLE | GMEM_ZEROINIT, sizeof(DROPFILES) + path.size() + 2);
  auto *files = static_cast<DROPFILES *>(GlobalLock(block));
  files->pFiles = sizeof(DROPFILES);
  path.copy(reinterpret_cast<char *>(files + 1), path.size());
  GlobalUnlock(block);
  OpenClipboard(nullptr);
  EmptyClipboard();
  SetClipboardData(CF_HDROP, block);
  CloseClipboard();
}
