// A window the explorer needs cannot be made (the system is out of resources, say): the browse
// ends as cancelled at once instead of running an empty modal loop, and leaves the host and
// the remembered state as they were.
#include "ExplorerHarness.h"

#include <gtest/gtest.h>

#include <atomic>

namespace {
// Refuses on this thread the creation of every window of one class.
class RefusedWindowClass {
 public:
  explicit RefusedWindowClass(const char *className) : m_hook(nullptr) {
    s_className = className;
    m_hook = SetWindowsHookExA(WH_CBT, Hook, nullptr, GetCurrentThreadId());
  }
  ~RefusedWindowClass() { UnhookWindowsHookEx(m_hook); }
  RefusedWindowClass(const RefusedWindowClass &) = delete;
  RefusedWindowClass &operator=(const RefusedWindowClass &) = delete;

 private:
  static LRESULT CALLBACK Hook(int code, WPARAM wParam, LPARAM lParam) {
    char name[64] = "";
    if (code == HCBT_CREATEWND && GetClassNameA(reinterpret_cast<HWND>(wParam), name, sizeof name) &&
        lstrcmpiA(name, s_className) == 0)
      return 1;
    return CallNextHookEx(nullptr, code, wParam, lParam);
  }

  static inline const char *s_className = nullptr;
  HHOOK m_hook;
};

// Ends a modal run of this thread that is still going after a while, so that a browse that
// would never return fails the test instead of hanging it.
class HangBreaker {
 public:
  HangBreaker() : m_thread(GetCurrentThreadId()), m_watch([this] { Watch(); }) {}
  ~HangBreaker() { Broke(); }
  bool Broke() {
    m_bDone = true;
    if (m_watch.joinable()) m_watch.join();
    return m_bBroke;
  }

 private:
  void Watch() {
    for (int waited = 0; waited < 8000 && !m_bDone; waited += 50) Sleep(50);
    if (m_bDone) return;
    m_bBroke = true;
    EnumThreadWindows(
        m_thread,
        [](HWND window, LPARAM) {
          char name[16] = "";
          GetClassNameA(window, name, sizeof name);
          if (std::string(name) == "#32770") PostMessageA(window, WM_APP, 2, 0);
          return TRUE;
        },
        0);
  }

  DWORD m_thread;
  std::atomic<bool> m_bDone{false};
  bool m_bBroke = false;
  std::thread m_watch;
};

using ExplorerBuildFailure = BrowseTest;

TEST_F(ExplorerBuildFailure, BrowseEndsAsCancelledWithTheHostEnabledAndTheStateUntouched) {
  HWND host = CreateWindowExA(0, "STATIC", "host", WS_OVERLAPPEDWINDOW, 0, 0, 100, 100, nullptr, nullptr, nullptr, nullptr);
  devhostSetWindows(host, nullptr);
  const std::string remembered =
      "[CurrentPath]\r\nPath=\r\nName=plan.dwg\r\nShellPath=\r\n\r\n[Size]\r\nSplitterSize=150\r\nWindowWidth=700\r\n"
      "WindowHeight=500\r\n\r\n[View]\r\nPictureWidth=80\r\nPictureHeight=60\r\nSort=2\r\n\r\n";

  // A pane view, a tool bar, the status bar.
  for (const char *refused : {"FwView", TOOLBARCLASSNAMEA, STATUSCLASSNAMEA}) {
    m_state.Write(remembered);
    int resultKind = 0;
    bool hung = false;
    {
      RefusedWindowClass refuse(refused);
      HangBreaker breaker;
      EXPECT_TRUE(devhostInvoke(L"Lumvex", BrowseArgs(L"")));
      hung = breaker.Broke();
      resultKind = devhostResultKind();
      devhostClearResult();
    }
    EXPECT_FALSE(hung) << refused << ": the browse never returned";
    EXPECT_EQ(resultKind, RTNIL) << refused;
    EXPECT_TRUE(IsWindowEnabled(host)) << refused;
    EXPECT_EQ(m_state.Read(), remembered) << refused;
  }
  devhostSetWindows(nullptr, nullptr);
  DestroyWindow(host);
}
}  // namespace
