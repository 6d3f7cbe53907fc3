// The splitter on real windows: panes laid out from the column widths, the bar dragged with
// the mouse, and views that tell their frame when they are clicked.
#include "fw/SplitterWnd.h"
#include "fw/FrameWnd.h"
#include "FwTestWindows.h"

#include <gtest/gtest.h>

#include <memory>
#include <tuple>
#include <string>

namespace {
using fwtest::Log;
using fwtest::MouseButton;
using fwtest::MouseTo;
using fwtest::Pump;
using fwtest::ScreenPoint;

class Parent : public fwtest::TopWindow {
 public:
  BOOL OnCmdMsg(UINT id, int code, fw::CCmdUI *) override {
    if (code == fw::CN_COMMAND) log.push_back("command " + std::to_string(id));
    return FALSE;
  }
  Log log;
};

RECT PaneRect(const fw::CSplitterWnd &splitter, int col) {
  RECT rect{};
  splitter.GetPane(0, col)->GetWindowRect(&rect);
  MapWindowPoints(nullptr, splitter, reinterpret_cast<POINT *>(&rect), 2);
  return rect;
}

int ColumnWidth(const fw::CSplitterWnd &splitter, int col) {
  int cur = -1, min = -1;
  splitter.GetColumnInfo(col, cur, min);
  return cur;
}

class SplitterTest : public ::testing::Test {
 protected:
  void SetUp() override {
    ASSERT_TRUE(parent.Create(600, 400));
    ASSERT_TRUE(splitter.CreateStatic(&parent, 1, 2));
    ASSERT_TRUE(splitter.CreateView<fw::CView>(0, 0, SIZE{150, 100}));
    ASSERT_TRUE(splitter.CreateView(0, 1, std::make_unique<fw::CView>(), SIZE{100, 100}));
    splitter.MoveWindow(RECT{0, 0, 600, 400});
    Pump();
  }

  Parent parent;
  fw::CSplitterWnd splitter;
};

TEST_F(SplitterTest, PanesTakeTheirIdsAndTheIdealWidthOfTheFirstColumnTheLastTakesTheRest) {
  EXPECT_EQ(static_cast<int>(AFX_IDW_PANE_FIRST), splitter.GetDlgCtrlID());
  EXPECT_EQ(0xE900, splitter.GetPane(0, 0)->GetDlgCtrlID());
  EXPECT_EQ(0xE901, splitter.GetPane(0, 1)->GetDlgCtrlID());

  // The same border all round the panes and a bar between them.
  const RECT left = PaneRect(splitter, 0), right = PaneRect(splitter, 1);
  const int border = left.left, bar = right.left - left.right;
  EXPECT_EQ(std::make_tuple(left.top, 400 - left.bottom, 600 - right.right), std::make_tuple(border, border, border));
  EXPECT_EQ(150, left.right - left.left);
  EXPECT_EQ(600 - 2 * border - 150 - bar, ColumnWidth(splitter, 1));

  splitter.SetColumnInfo(0, 250, 40);
  splitter.RecalcLayout();
  EXPECT_EQ(border + 250, PaneRect(splitter, 0).right);

  // Below its minimum a column is hidden and the next one moves up to the border.
  splitter.SetColumnInfo(0, 30, 40);
  splitter.RecalcLayout();
  EXPECT_EQ(0, ColumnWidth(splitter, 0));
  EXPECT_FALSE(splitter.GetPane(0, 0)->IsWindowVisible());
  EXPECT_EQ(border + bar, PaneRect(splitter, 1).left);

  // A first column wider than the window leaves nothing to the second.
  splitter.SetColumnInfo(0, 5000, 0);
  splitter.RecalcLayout();
  EXPECT_EQ(600 - 2 * border, ColumnWidth(splitter, 0));
  EXPECT_EQ(0, ColumnWidth(splitter, 1));
  EXPECT_FALSE(splitter.GetPane(0, 1)->IsWindowVisible());

  // Resizing the splitter lays it out again.
  splitter.SetColumnInfo(0, 150, 0);
  splitter.MoveWindow(RECT{0, 0, 500, 300});
  EXPECT_EQ(500 - 2 * border - 150 - bar, ColumnWidth(splitter, 1));
  EXPECT_TRUE(splitter.GetPane(0, 1)->IsWindowVisible());
}

TEST_F(SplitterTest, DraggingTheBarWithTheMouseSetsTheFirstColumnsWidth) {
  const POINT bar = ScreenPoint(splitter, 155, 200);
  MouseTo(bar);
  EXPECT_EQ(LoadCursor(nullptr, IDC_SIZEWE), GetCursor());

  // While dragging, the splitter holds the mouse and shows an inverted track where the bar will go.
  HDC dc = GetDC(parent);
  const COLORREF before[2] = {GetPixel(dc, 215, 200), GetPixel(dc, 216, 200)};
  MouseButton(true);
  EXPECT_EQ(splitter.GetSafeHwnd(), GetCapture());
  const POINT start = fwtest::CursorPosition();
  MouseTo(POINT{bar.x + 60, bar.y + 30});
  const int moved = fwtest::CursorPosition().x - start.x;  // 60, give or take the pointer's rounding
  ASSERT_NEAR(60, moved, 1);
  const COLORREF during[2] = {GetPixel(dc, 215, 200), GetPixel(dc, 216, 200)};
  EXPECT_TRUE(before[0] != during[0] || before[1] != during[1]);
  EXPECT_EQ(150, ColumnWidth(splitter, 0));  // nothing moves before the button is released
  MouseButton(false);
  ReleaseDC(parent, dc);

  EXPECT_EQ(nullptr, GetCapture());
  const int width = 150 + moved;
  EXPECT_EQ(width, ColumnWidth(splitter, 0));
  const int border = PaneRect(splitter, 0).left, gap = PaneRect(splitter, 1).left - PaneRect(splitter, 0).right;
  EXPECT_EQ(border + width, PaneRect(splitter, 0).right);

  // Escape during a drag leaves the width as it was.
  MouseTo(ScreenPoint(splitter, 215, 100));
  MouseButton(true);
  MouseTo(ScreenPoint(splitter, 300, 100));
  splitter.SendMessage(WM_KEYDOWN, VK_ESCAPE, 0);
  MouseButton(false);
  EXPECT_EQ(width, ColumnWidth(splitter, 0));

  // The bar cannot be dragged past the end of the second pane, which then has no room left.
  MouseTo(ScreenPoint(splitter, border + width + 3, 300));  // away from the last press: no double click
  MouseButton(true);
  MouseTo(ScreenPoint(splitter, 900, 300));
  MouseButton(false);
  EXPECT_EQ(600 - 2 * border - gap, ColumnWidth(splitter, 0));
  EXPECT_EQ(0, ColumnWidth(splitter, 1));
}

}  // namespace
