// The loading protocol on a real tree control: the placeholder, the animation thread with its
// tick and progress steps, the join before the children show, the children button, and no
// second load of an item that has children.
#include "explorer/HourglassFX.h"
#include "explorer/ProgressFX.h"
#include "explorer/WaitingTreeCtrl.h"

#include "CaseTimeLimit.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <atomic>
#include <cstring>
#include <vector>

namespace {
constexpr DWORD kSlowTickMs = 300;

class RecordingTree : public CWaitingTreeCtrl {
 public:
  ~RecordingTree() override {
    if (animationThread) CloseHandle(animationThread);
  }
  int children = 0;
  bool fillResult = true;
  int fills = 0, waitBegins = 0, placeholders = 0;
  bool placeholderGoneDuringFill = false, threadEndedAtShow = false, handlesClosedAtShow = false;
  RECT placeholderText{};
  HANDLE animationThread = nullptr;  // opened by the thread itself, so it is a real handle
  std::atomic<bool> lastStepBegun{false};
  std::atomic<int> ticksEnded{0};
  int ticksEndedAtShow = -1;

  LRESULT WindowProc(UINT message, WPARAM wParam, LPARAM lParam) override {
    if (message == TVM_INSERTITEMA && std::strcmp(reinterpret_cast<TVINSERTSTRUCTA *>(lParam)->item.pszText, "Loading...") == 0)
      ++placeholders;
    if (message == WM_SETREDRAW && wParam && animationThread) {
      threadEndedAtShow = WaitForSingleObject(animationThread, 0) == WAIT_OBJECT_0;
      ticksEndedAtShow = ticksEnded;
      handlesClosedAtShow = !m_hThread && !m_hTickEvent && !m_hProgressEvent;
    }
    return CWaitingTreeCtrl::WindowProc(message, wParam, lParam);
  }

 protected:
  void OnWaitBegin(HTREEITEM placeholder) override {
    ++waitBegins;
    GetItemRect(placeholder, &placeholderText, TRUE);
  }
  // The step that completes the progress is slow: a tree shown before the thread's end would
  // find it still drawing.
  void OnWaitTick(bool isTick, int total, int done) override {
    if (!animationThread) animationThread = OpenThread(SYNCHRONIZE, FALSE, GetCurrentThreadId());
    if (!isTick && total > 0 && done == total && !lastStepBegun.exchange(true)) Sleep(kSlowTickMs);
  }
  bool FillItemChildren(HTREEITEM item) override {
    ++fills;
    placeholderGoneDuringFill = GetChildItem(item) == nullptr;
    SetProgress(children, 0);
    for (int i = 0; i < children; ++i, Sleep(60)) {
      InsertItem("child", item);
      StepProgress(1);
    }
    if (children) {
      const WaitingFor waiting("the animation thread to draw the last progress step");
      const DWORD start = GetTickCount();
      while (!lastStepBegun && GetTickCount() - start < 10000) Sleep(1);
      EXPECT_TRUE(lastStepBegun) << "the last progress step was never drawn";
    }
    return fillResult;
  }
};

class Tree : public CHourglassFX<CProgressFX<RecordingTree>> {
 public:
  std::vector<int> frames, fillWidths;

 protected:
  void OnWaitTick(bool isTick, int total, int done) override {
    CHourglassFX::OnWaitTick(isTick, total, done);
    if (isTick)
      frames.push_back(FrameIndex());
    else
      fillWidths.push_back(FillRect().right - FillRect().left);
    ++ticksEnded;
  }
};

class WaitingTree : public ::testing::Test {
 protected:
  void SetUp() override {
    ASSERT_TRUE(m_parent.CreateEx(0, nullptr, "tree", WS_OVERLAPPEDWINDOW | WS_VISIBLE, RECT{0, 0, 400, 300}, HWND{}, 0));
    ASSERT_TRUE(m_tree.Create(WS_CHILD | WS_VISIBLE | TVS_HASBUTTONS, RECT{0, 0, 380, 260}, &m_parent, 1));
    m_tree.SetImageList(m_images, TVSIL_NORMAL);
    m_tree.SetTickPeriod(125);
  }
  void TearDown() override { ImageList_Destroy(m_images); }
  HTREEITEM Folder(const char *name) const {
    TVINSERTSTRUCTA insert{};
    insert.hParent = TVI_ROOT;
    insert.hInsertAfter = TVI_LAST;
    insert.item.mask = TVIF_TEXT | TVIF_CHILDREN;
    insert.item.pszText = const_cast<char *>(name);
    insert.item.cChildren = 1;
    return m_tree.InsertItem(insert);
  }
  int ChildrenButton(HTREEITEM item) const {
    TVITEMA query{};
    query.mask = TVIF_CHILDREN;
    query.hItem = item;
    m_tree.GetItem(&query);
    return query.cChildren;
  }
  void Notify(UINT code, HTREEITEM item) const {
    NMTREEVIEWA notice{};
    notice.hdr = NMHDR{m_tree.m_hWnd, 1, code};
    notice.action = TVE_EXPAND;
    notice.itemNew.hItem = item;
    SendMessageA(m_parent.m_hWnd, WM_NOTIFY, 1, reinterpret_cast<LPARAM>(&notice));
  }

  fw::CWnd m_parent;
  Tree m_tree;
  HIMAGELIST m_images = ImageList_Create(16, 16, ILC_COLOR32, 1, 1);
};

TEST_F(WaitingTree, LoadsBehindThePlaceholderAndJoinsTheAnimationBeforeShowing) {
  m_tree.children = 12;
  HTREEITEM folder = Folder("folder");
  {
    const WaitingFor waiting("the folder's load, which ends with the join of the animation thread");
    m_tree.Expand(folder, TVE_EXPAND);
  }

  EXPECT_EQ(m_tree.fills, 1);
  EXPECT_EQ(m_tree.placeholders, 1);
  EXPECT_TRUE(m_tree.placeholderGoneDuringFill);
  ASSERT_NE(m_tree.animationThread, nullptr) << "the animation thread never ticked";
  EXPECT_TRUE(m_tree.threadEndedAtShow);
  EXPECT_TRUE(m_tree.handlesClosedAtShow);
  WaitForSingleObject(m_tree.animationThread, 5000);  // a tick still running is counted once it ends
  EXPECT_EQ(m_tree.ticksEnded, m_tree.ticksEndedAtShow) << "a tick ran after the tree was shown";
  ASSERT_GE(m_tree.frames.size(), 3u) << "12 children at 60 ms take several ticks";
  for (size_t i = 0; i < m_tree.frames.size(); ++i) EXPECT_EQ(m_tree.frames[i], static_cast<int>((i + 1) % 10));
  ASSERT_GE(m_tree.fillWidths.size(), 2u);
  EXPECT_TRUE(std::is_sorted(m_tree.fillWidths.begin(), m_tree.fillWidths.end())) << ::testing::PrintToString(m_tree.fillWidths);
  EXPECT_LT(m_tree.fillWidths.front(), m_tree.fillWidths.back());
  EXPECT_EQ(m_tree.fillWidths.back(), 56 - 2 * 3) << "the bar is full when the last child is in";

  const RECT &text = m_tree.placeholderText, &bar = m_tree.BarRect(), &icon = m_tree.IconRect();
  const int textHeight = text.bottom - text.top, barHeight = textHeight - 2 * std::max(0, (textHeight - 16) / 2);
  EXPECT_EQ(bar.left, text.right + 3);
  EXPECT_EQ(bar.right - bar.left, 56);
  EXPECT_EQ(bar.bottom - bar.top, barHeight);
  EXPECT_EQ(m_tree.FillRect().left, bar.left + 3);
  EXPECT_EQ(icon.right, text.left - 3);
  EXPECT_EQ(icon.right - icon.left, GetSystemMetrics(SM_CXSMICON));

  int count = 0;
  for (HTREEITEM child = m_tree.GetChildItem(folder); child; child = m_tree.GetNextSiblingItem(child)) ++count;
  EXPECT_EQ(count, 12);
  EXPECT_EQ(ChildrenButton(folder), 1);
}

// The children button follows what was found only when the fill says so; an item loaded once is
// not loaded again, whatever expands it.
TEST_F(WaitingTree, ChildrenButtonFollowsTheFillAndASecondExpansionLoadsNothing) {
  HTREEITEM empty = Folder("fixed drive");
  m_tree.Expand(empty, TVE_EXPAND);
  EXPECT_EQ(ChildrenButton(empty), 0);

  m_tree.children = 2;
  HTREEITEM folder = Folder("folder");
  m_tree.Expand(folder, TVE_EXPAND);
  m_tree.Expand(folder, TVE_COLLAPSE);
  m_tree.Expand(folder, TVE_EXPAND);
  Notify(TVN_ITEMEXPANDINGA, folder);  // as a tree that reports every expansion would
  Notify(TVN_ITEMEXPANDEDA, folder);
  EXPECT_EQ(m_tree.fills, 2);
  EXPECT_EQ(m_tree.placeholders, 2);
  EXPECT_EQ(m_tree.waitBegins, 2);

  m_tree.fillResult = false;
  m_tree.children = 0;
  HTREEITEM kept = Folder("removable drive");
  m_tree.Expand(kept, TVE_EXPAND);
  EXPECT_EQ(ChildrenButton(kept), 1);
  EXPECT_EQ(m_tree.GetItemState(kept, TVIS_EXPANDED) & TVIS_EXPANDED, 0u);
}
}  // namespace
