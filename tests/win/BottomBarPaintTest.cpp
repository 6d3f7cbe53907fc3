// The bottom bar looks the way it acts, read back from the screen: its captions show whatever
// the frame's size went through (squeezed out of the frame by its size grip and given room
// again), and the accept caption is drawn enabled when the button is.
#include "ExplorerHarness.h"
#include "ScratchFolder.h"
#include "ScreenPixels.h"
#include "res/resource.h"

#include <gtest/gtest.h>

namespace {

// Dark pixels inside the window on the screen: the captions' letters and the buttons' pictures.
int InkOn(HWND window) {
  RECT rect{};
  GetWindowRect(window, &rect);
  int ink = 0;
  for (DWORD pixel : ScreenPixels(rect)) ink += (pixel & 0xFF) + (pixel >> 8 & 0xFF) + (pixel >> 16) < 200;
  return ink;
}

// The ink once the frame's thread has painted what it was asked to (or what it shows after 3 s).
int SettledInk(HWND frame, HWND bar, int wanted) {
  int ink = 0;
  for (int waited = 0; waited < 3000; waited += 50) {
    SendMessageA(frame, WM_NULL, 0, 0);
    ink = InkOn(bar);
    if (ink >= wanted) break;
    Sleep(50);
  }
  return ink;
}

void MouseTo(POINT at, DWORD buttons = 0) {
  INPUT input{};
  input.type = INPUT_MOUSE;
  input.mi.dx = at.x * 65535 / (GetSystemMetrics(SM_CXSCREEN) - 1);
  input.mi.dy = at.y * 65535 / (GetSystemMetrics(SM_CYSCREEN) - 1);
  input.mi.dwFlags = MOUSEEVENTF_MOVE | MOUSEEVENTF_ABSOLUTE | buttons;
  SendInput(1, &input, sizeof input);
  Sleep(60);
}

// Drags the frame's size grip, its lower right corner, by (dx, dy) in steps, as a person does.
void DragGrip(HWND frame, int dx, int dy) {
  RECT rect{};
  GetWindowRect(frame, &rect);
  const POINT grip{rect.right - 2, rect.bottom - 2};
  MouseTo(grip);
  MouseTo(grip, MOUSEEVENTF_LEFTDOWN);
  for (int step = 1; step <= 8; ++step) MouseTo(POINT{grip.x + dx * step / 8, grip.y + dy * step / 8});
  MouseTo(POINT{grip.x + dx, grip.y + dy}, MOUSEEVENTF_LEFTUP);
  SendMessageA(frame, WM_NULL, 0, 0);
}

class BottomBar : public BrowseTest {};

TEST_F(BottomBar, ShowsItsCaptionsAgainAfterTheFrameWasSqueezedAndEnlarged) {
  m_state.Write("[Size]\r\nSplitterSize=200\r\nWindowWidth=900\r\nWindowHeight=600\r\n");
  Browse(BrowseArgs(L""), [](HWND frame) {
    const std::vector<HWND> bars = ToolBars(frame);
    ASSERT_EQ(bars.size(), 2u);
    HWND bottom = bars[1];
    const int shown = SettledInk(frame, bottom, 1);
    ASSERT_GT(shown, 20) << "the bar's captions never showed";
    SetWindowPos(frame, nullptr, 100, 100, 0, 0, SWP_NOSIZE | SWP_NOZORDER);
    DragGrip(frame, -800, -560);
    DragGrip(frame, 800, 560);
    EXPECT_GE(SettledInk(frame, bottom, shown), shown) << "the bar is blank after the frame grew again";
    PostMessageA(frame, WM_COMMAND, ID_BROWSE_CANCEL, 0);
  });
}

TEST_F(BottomBar, TheAcceptCaptionIsDrawnEnabledWhenTheRememberedDrawingIsFoundAtTheStart) {
  const ScratchFolder folder("bottombar");
  folder.File("a.dwg", "");
  m_state.Write("[CurrentPath]\r\nPath=\r\nName=a.dwg\r\nShellPath=\r\n\r\n[Size]\r\nSplitterSize=200\r\n"
                "WindowWidth=900\r\nWindowHeight=600\r\n");
  const std::string start = folder.Path() + "\\";
  Browse(BrowseArgs(std::wstring(start.begin(), start.end()).c_str()), [](HWND frame) {
    HWND bottom = ToolBars(frame).at(1);
    ASSERT_TRUE(SendMessageA(bottom, TB_ISBUTTONENABLED, ID_BROWSE_ACCEPT, 0)) << "the remembered drawing was not found";
    HWND caption = FindWindowExA(bottom, nullptr, "Static", nullptr);  // the accept caption comes first
    ASSERT_TRUE(caption);
    EXPECT_TRUE(IsWindowEnabled(caption));
    EXPECT_GT(SettledInk(frame, caption, 20), 20) << "the caption reads as disabled";
    PostMessageA(frame, WM_COMMAND, ID_BROWSE_CANCEL, 0);
  });
}

}  // namespace
