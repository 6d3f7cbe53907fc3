// The loading protocol on a real tree control: the placeholder, the animation thread with its
// tick and progress steps, the join before the children show, the children button, no second
// load of an item that has children, and no load beside a running one or without its placeholder.
#include "explorer/HourglassFX.h"
#include "explorer/ProgressFX.h"
#include "explorer/WaitingTreeCtrl.h"

#include "CaseTimeLimit.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <atomic>
#include <cstring>
#include <functional>
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
  bool refusePlaceholder = false;
  bool redrawOn = true;
  std::function<void()> duringFill;
  int fills = 0, waitBegins = 0, placeholders = 0;
  bool placeholderGoneDuringFill = false, threadEndedAtShow = false, handlesClosedAtShow = false;
  RECT placeholderText{};
  HANDLE animationThread = nullptr;  // opened by the thread itself, so it is a real handle
  std::atomic<bool> lastStepBegun{false};
  std::atomic<int> ticksEnded{0};
  int ticksEndedAtShow = -1;

  LRESULT WindowProc(UINT message, WPARAM wParam, LPARAM lParam) override {
    if (message == TVM_INSERTITEMA && std::strcmp(reinterpret_cast<TVINSERTSTRUCTA *>(lParam)->item.pszText, "Loading...") == 0) {
      if (refusePlaceholder) return 0;
      ++placeholders;
    }
    if (message == WM_SETREDRAW) redrawOn = wParam != 0;
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
    if (duringFill) duringFill();
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
  Tree() { m_bEraseIcon = 1; }
  void UseCursor(HCURSOR cursor) { m_hCursor.Reset(cursor); }

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
  int ItemCount(HTREEITEM parent = TVI_ROOT) const {
    int count = 0;
    for (HTREEITEM child = m_tree.GetChildItem(parent); child; child = m_tree.GetNextSiblingItem(child))
      count += 1 + ItemCount(child);
    return count;
  }
  bool Expanded(HTREEITEM item) const { return m_tree.GetItemState(item, TVIS_EXPANDED) & TVIS_EXPANDED; }
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

// Loads start only from a prepared expansion, one at a time: numpad "*" expands nothing, an
// expansion asked for while a load runs (the shell pumps messages) is refused, and neither a
// stray expanded notification nor a refused placeholder deletes the tree or leaves it frozen.
TEST_F(WaitingTree, NoLoadBesideARunningOneOrWithoutItsPlaceholder) {
  struct Case {
    const char *name;
    std::function<void(Tree &tree, HTREEITEM folder, HTREEITEM other)> act;
    int fills;
    bool folderExpanded, otherExpanded;
  } cases[] = {
      {"numpad * on the selected folder",
       [](Tree &tree, HTREEITEM folder, HTREEITEM) {
         tree.SelectItem(folder);
         tree.SendMessage(WM_KEYDOWN, VK_MULTIPLY, 0);
       },
       0, false, false},
      {"the other folder expanded while the folder loads",
       [](Tree &tree, HTREEITEM folder, HTREEITEM other) {
         tree.duringFill = [&tree, other] { tree.Expand(other, TVE_EXPAND); };
         tree.Expand(folder, TVE_EXPAND);
       },
       1, true, false},
      {"an expanded notification with no expanding one before it",
       [this](Tree &tree, HTREEITEM folder, HTREEITEM other) {
         tree.Expand(folder, TVE_EXPAND);
         Notify(TVN_ITEMEXPANDEDA, other);
       },
       1, true, false},
      {"the placeholder cannot be inserted",
       [](Tree &tree, HTREEITEM folder, HTREEITEM) {
         tree.refusePlaceholder = true;
         tree.Expand(folder, TVE_EXPAND);
       },
       0, false, false},
  };
  for (const Case &c : cases) {
    SCOPED_TRACE(c.name);
    m_tree.DeleteAllItems();
    m_tree.fills = 0;
    m_tree.children = 2;
    m_tree.refusePlaceholder = false;
    m_tree.duringFill = nullptr;
    HTREEITEM folder = Folder("folder"), other = Folder("other");
    const int before = ItemCount();
    c.act(m_tree, folder, other);
    EXPECT_EQ(m_tree.fills, c.fills);
    EXPECT_EQ(ItemCount(), before + 2 * c.fills);
    EXPECT_EQ(Expanded(folder), c.folderExpanded);
    EXPECT_EQ(Expanded(other), c.otherExpanded);
    EXPECT_TRUE(m_tree.redrawOn);
    m_tree.duringFill = nullptr;
    m_tree.refusePlaceholder = false;
    m_tree.Expand(other, TVE_EXPAND);
    EXPECT_TRUE(Expanded(other)) << "the next expansion loads";
  }
}

// With no image list the hourglass has no place, and is not drawn at all. The loading effects
// draw in the colours the tree shows: the window colour when the tree has none of its own.
TEST_F(WaitingTree, NoHourglassWithoutItsPlaceAndTheTreesColours) {
  m_tree.SetImageList(nullptr, TVSIL_NORMAL);
  m_tree.UseCursor(static_cast<HCURSOR>(LoadImageA(nullptr, MAKEINTRESOURCEA(32512), IMAGE_CURSOR, 0, 0, LR_DEFAULTSIZE)));
  HTREEITEM unmeasured = Folder("unmeasured");
  m_tree.UpdateWindow();
  RECT row{};
  m_tree.GetItemRect(unmeasured, &row, FALSE);
  auto corner = [&] {  // where an hourglass at no place would go, over the first item's row
    std::vector<COLORREF> pixels;
    const HDC dc = GetDC(m_tree.m_hWnd);
    for (int y = 0; y < row.bottom; ++y)
      for (int x = 0; x < GetSystemMetrics(SM_CXICON); ++x) pixels.push_back(GetPixel(dc, x, y));
    ReleaseDC(m_tree.m_hWnd, dc);
    return pixels;
  };
  const std::vector<COLORREF> before = corner();
  std::vector<COLORREF> during;
  m_tree.children = 8;  // 480 ms: several ticks
  m_tree.duringFill = [&] { during = corner(); };
  m_tree.Expand(unmeasured, TVE_EXPAND);
  EXPECT_GE(m_tree.frames.size(), 2u);
  EXPECT_TRUE(during == before) << "nothing drawn over the first item";

  // A cursor that is all transparent: the hourglass shows its background brush alone.
  const std::vector<BYTE> clear(32 * 32 / 8, 0xFF), none(32 * 32 / 8, 0x00);
  m_tree.UseCursor(CreateCursor(nullptr, 0, 0, 32, 32, clear.data(), none.data()));
  m_tree.SetImageList(m_images, TVSIL_NORMAL);
  const int element = COLOR_WINDOW;
  const COLORREF window = GetSysColor(COLOR_WINDOW), theme = RGB(40, 60, 80);
  SetSysColors(1, &element, &theme);
  COLORREF erased = CLR_INVALID;
  m_tree.children = 4;
  m_tree.duringFill = [&] {
    const HDC dc = GetDC(m_tree.m_hWnd);
    erased = GetPixel(dc, m_tree.IconRect().left, m_tree.IconRect().top);
    ReleaseDC(m_tree.m_hWnd, dc);
  };
  m_tree.Expand(Folder("folder"), TVE_EXPAND);
  SetSysColors(1, &element, &window);
  EXPECT_EQ(erased, theme) << "the icon's place erased, and the hourglass drawn, in the window colour";
}
}  // namespace
