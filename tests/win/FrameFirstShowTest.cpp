// The explorer frame is placed and sized before it is first shown: wherever it shows, it shows
// at the remembered place and size (or maximised), never first at its default place.
#include "ExplorerHarness.h"

#include <gtest/gtest.h>

#include <string>
#include <vector>

namespace {
std::vector<RECT> g_shownAt;  // the frame's rectangle after each change while it was shown

LRESULT CALLBACK RecordFramePlaces(int code, WPARAM wParam, LPARAM lParam) {
  const auto *sent = reinterpret_cast<const CWPRETSTRUCT *>(lParam);
  char name[32] = "";
  if (code == HC_ACTION && sent->message == WM_WINDOWPOSCHANGED && GetClassNameA(sent->hwnd, name, sizeof name) &&
      std::string(name) == "FwFrame128" && IsWindowVisible(sent->hwnd)) {
    RECT rect;
    GetWindowRect(sent->hwnd, &rect);
    g_shownAt.push_back(rect);
  }
  return CallNextHookEx(nullptr, code, wParam, lParam);
}

std::string Size(const RECT &rect) { return std::to_string(rect.right - rect.left) + "x" + std::to_string(rect.bottom - rect.top); }

using FrameFirstShow = BrowseTest;

TEST_F(FrameFirstShow, ShowsOnlyAtItsRememberedPlaceOrMaximised) {
  for (const int size : {600, 5000}) {
    SCOPED_TRACE(size);
    m_state.Write("[Size]\r\nSplitterSize=150\r\nWindowWidth=" + std::to_string(size) + "\r\nWindowHeight=" + std::to_string(size) +
                  "\r\n\r\n");
    g_shownAt.clear();
    RECT final{};
    bool zoomed = false;
    const HHOOK hook = SetWindowsHookExA(WH_CALLWNDPROCRET, RecordFramePlaces, nullptr, GetCurrentThreadId());
    Browse(BrowseArgs(L""), [&](HWND frame) {
      GetWindowRect(frame, &final);
      zoomed = IsZoomed(frame);
      PostMessageA(frame, WM_CLOSE, 0, 0);
    });
    UnhookWindowsHookEx(hook);
    EXPECT_EQ(zoomed, size == 5000);
    if (size == 600) {
      EXPECT_EQ(Size(final), "600x600");
    }
    ASSERT_FALSE(g_shownAt.empty());
    for (const RECT &rect : g_shownAt) EXPECT_TRUE(EqualRect(&rect, &final)) << Size(rect) << " at " << rect.left << "," << rect.top;
  }
}
}  // namespace
