// The scroll view on a real window: scroll sizes give the bars their ranges, scrolling moves
// the content and the view's child windows, and every step stays inside the range.
#include "fw/View.h"
#include "FwTestWindows.h"

#include <gtest/gtest.h>

#include <cstdio>
#include <string>
#include <tuple>

namespace {
using fwtest::Log;
using fwtest::Pump;

class RecordingView : public fw::CScrollView {
 public:
  BOOL OnScroll(UINT scrollCode, UINT pos, BOOL doScroll) override {
    char text[40];
    std::snprintf(text, sizeof text, "OnScroll %04X %u", scrollCode, pos);
    log.push_back(text);
    return CScrollView::OnScroll(scrollCode, pos, doScroll);
  }
  BOOL OnScrollBy(SIZE sizeScroll, BOOL doScroll) override {
    log.push_back("OnScrollBy " + std::to_string(sizeScroll.cx) + "," + std::to_string(sizeScroll.cy));
    return CScrollView::OnScrollBy(sizeScroll, doScroll);
  }
  void OnDraw(HDC dc) override { GetViewportOrgEx(dc, &drawnOrigin); }

  Log log;
  POINT drawnOrigin{1, 1};
};

// A 300 pixel high view over content 1600 pixels high, scrolled in steps of 160, with a child
// window at content position (10, 500).
class ScrollViewTest : public ::testing::Test {
 protected:
  void SetUp() override {
    ASSERT_TRUE(parent.Create(600, 400));
    ASSERT_TRUE(view.Create(nullptr, nullptr, WS_CHILD | WS_VISIBLE, RECT{0, 0, 400, 300}, &parent, 0xE901));
    child = CreateWindowExA(0, "STATIC", "tile", WS_CHILD | WS_VISIBLE, 10, 500, 50, 20, view, nullptr, nullptr, nullptr);
    ASSERT_NE(nullptr, child);
    view.SetScrollSizes(MM_TEXT, SIZE{380, 1600}, SIZE{100, 160}, SIZE{100, 160});
  }
  void TearDown() override { view.DestroyWindow(); }

  int ChildTop() const {
    RECT rect;
    GetWindowRect(child, &rect);
    POINT corner{rect.left, rect.top};
    ScreenToClient(view, &corner);
    return corner.y;
  }
  int Position() const { return view.GetScrollPosition().y; }
  void Scroll(UINT code, UINT pos = 0) { view.SendMessage(WM_VSCROLL, MAKEWPARAM(code, pos), 0); }

  fwtest::TopWindow parent;
  RecordingView view;
  HWND child = nullptr;
};

TEST_F(ScrollViewTest, ScrollSizesSetTheBarsThatTheContentNeedsAndATallerWindowHasNone) {
  SCROLLINFO info{sizeof(info), SIF_ALL, 0, 0, 0, 0, 0};
  ASSERT_TRUE(GetScrollInfo(view, SB_VERT, &info));
  EXPECT_EQ(std::make_tuple(0, 1599, 300u), std::make_tuple(info.nMin, info.nMax, info.nPage));
  EXPECT_FALSE(GetWindowLongA(view, GWL_STYLE) & WS_HSCROLL);  // 380 still fits beside the vertical bar

  view.ScrollToPosition(POINT{0, 640});
  view.MoveWindow(RECT{0, 0, 400, 1700});
  EXPECT_FALSE(GetWindowLongA(view, GWL_STYLE) & WS_VSCROLL);
  EXPECT_EQ(0, Position());
  EXPECT_EQ(500, ChildTop());
  EXPECT_FALSE(view.OnScrollBy(SIZE{0, 160}, TRUE));
  Pump();
}

TEST_F(ScrollViewTest, ScrollToPositionMovesTheChildrenAndStaysInTheRange) {
  view.ScrollToPosition(POINT{0, 320});
  EXPECT_EQ(180, ChildTop());
  view.Invalidate();
  view.UpdateWindow();
  EXPECT_EQ(-320, view.drawnOrigin.y);  // drawing happens in content coordinates
  view.ScrollToPosition(POINT{0, 5000});
  EXPECT_EQ(1300, Position());  // the last page
  EXPECT_EQ(500 - 1300, ChildTop());
  view.ScrollToPosition(POINT{-20, -5});
  EXPECT_EQ(500, ChildTop());
}

TEST_F(ScrollViewTest, EachScrollBarStepGoesThroughOnScrollAndOnScrollByTheWheelStraightToOnScrollBy) {
  Scroll(SB_LINEDOWN);
  Scroll(SB_PAGEDOWN);
  Scroll(SB_LINEUP);
  Scroll(SB_THUMBTRACK, 960);
  Scroll(SB_THUMBPOSITION, 100);  // the position was taken while tracking
  view.SendMessage(WM_MOUSEWHEEL, MAKEWPARAM(0, static_cast<WORD>(-WHEEL_DELTA)), 0);  // a line, not more than a page
  EXPECT_EQ((Log{"OnScroll 01FF 0", "OnScrollBy 0,160", "OnScroll 03FF 0", "OnScrollBy 0,160", "OnScroll 00FF 0",
                 "OnScrollBy 0,-160", "OnScroll 05FF 960", "OnScrollBy 0,800", "OnScroll 04FF 100", "OnScrollBy 0,0",
                 "OnScrollBy 0,160"}),
            view.log);
  EXPECT_EQ(1120, Position());
  EXPECT_EQ(500 - 1120, ChildTop());

  // The last step stops at the end of the range; past it nothing moves.
  Scroll(SB_LINEDOWN);
  EXPECT_TRUE(view.OnScroll(MAKEWORD(0xFF, SB_LINEDOWN), 0, TRUE));
  EXPECT_EQ(1300, Position());
  EXPECT_FALSE(view.OnScroll(MAKEWORD(0xFF, SB_LINEDOWN), 0, TRUE));
  Scroll(SB_TOP);
  EXPECT_FALSE(view.OnScroll(MAKEWORD(0xFF, SB_LINEUP), 0, TRUE));
  EXPECT_EQ(500, ChildTop());
  // Without doScroll the step is only asked about.
  EXPECT_TRUE(view.OnScrollBy(SIZE{0, 160}, FALSE));
  EXPECT_EQ(0, Position());

  // Steps start from the scroll bar's position: here set back to the top without moving the
  // content, as a view with a wrapping range does.
  view.ScrollToPosition(POINT{0, 1120});
  SetScrollPos(view, SB_VERT, 0, TRUE);
  Scroll(SB_LINEDOWN);
  EXPECT_EQ(160, Position());
  EXPECT_EQ(500 - 1120 - 160, ChildTop());
}

}  // namespace
