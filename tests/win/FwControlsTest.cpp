// The framework's controls on real windows: messages pass through the object before the
// control's own procedure, notifications come back to the control's object, tool bars and the
// status bar built from resources.
#include "fw/Controls.h"
#include "fw/StatusBar.h"
#include "fw/ToolBar.h"
#include "fw/FrameWnd.h"
#include "fw/WinApp.h"
#include "FwTestWindows.h"

#include <gtest/gtest.h>

#include <commctrl.h>

#include <string>
#include <vector>

namespace {
using fwtest::Log;
using fwtest::Pump;

// The commands of the test's tool bar resource.
constexpr UINT kFirst = 101, kSecond = 102, kThird = 103, kSlot = 106;

std::string NotificationName(UINT code) {
  switch (code) {
    case TVN_SELCHANGINGA:
    case TVN_SELCHANGINGW: return "TVN_SELCHANGING";
    case TVN_SELCHANGEDA:
    case TVN_SELCHANGEDW: return "TVN_SELCHANGED";
    case TVN_ITEMEXPANDINGA:
    case TVN_ITEMEXPANDINGW: return "TVN_ITEMEXPANDING";
    case TVN_ITEMEXPANDEDA:
    case TVN_ITEMEXPANDEDW: return "TVN_ITEMEXPANDED";
    default: return {};
  }
}

// The parent: records what command routing and the bars' prompts bring to it.
class Parent : public fwtest::TopWindow {
 public:
  BOOL OnCmdMsg(UINT id, int code, fw::CCmdUI *cmdUI) override {
    if (code == fw::CN_UPDATE_COMMAND_UI) {
      for (UINT disabled : disabledCommands)
        if (id == disabled) {
          cmdUI->Enable(FALSE);
          return TRUE;
        }
      return FALSE;
    }
    const std::string name = NotificationName(static_cast<UINT>(code));
    if (!name.empty()) log.push_back("parent " + name);
    return FALSE;
  }
  LRESULT WindowProc(UINT message, WPARAM wParam, LPARAM lParam) override {
    if (message == fw::WM_SETMESSAGESTRING) {
      log.push_back("prompt " + std::to_string(wParam));
      return 0;
    }
    return TopWindow::WindowProc(message, wParam, lParam);
  }

  Log log;
  std::vector<UINT> disabledCommands;
};

// A tree whose object records the notifications reflected back to it and keeps them from the
// parent.
class ReflectingTree : public fw::CTreeCtrl {
 public:
  explicit ReflectingTree(Log &log) : m_log(log) {}
  BOOL OnChildNotify(UINT message, WPARAM wParam, LPARAM lParam, LRESULT *result) override {
    const std::string name = message == WM_NOTIFY ? NotificationName(reinterpret_cast<NMHDR *>(lParam)->code) : std::string();
    if (name.empty()) return CTreeCtrl::OnChildNotify(message, wParam, lParam, result);
    m_log.push_back("control " + name);
    *result = 0;
    return TRUE;
  }

 private:
  Log &m_log;
};

TEST(FwTreeCtrlTest, NotificationsAreReflectedToTheTreeInTheOrderTheControlSendsThem) {
  Parent parent;
  ASSERT_TRUE(parent.Create());
  ReflectingTree tree(parent.log);
  ASSERT_TRUE(tree.Create(WS_CHILD | WS_VISIBLE | TVS_HASBUTTONS, RECT{0, 0, 300, 300}, &parent, 0xE900));
  const HTREEITEM root = tree.InsertItem("Desktop");
  tree.InsertItem("My Computer", root);
  tree.Expand(root, TVE_EXPAND);
  tree.SelectItem(tree.InsertItem("Documents", root));
  EXPECT_EQ((Log{"control TVN_ITEMEXPANDING", "control TVN_ITEMEXPANDED", "control TVN_SELCHANGING", "control TVN_SELCHANGED"}),
            parent.log);
}

// Tool bars are built from this program's own resources.
class ToolBarTest : public ::testing::Test {
 protected:
  void SetUp() override {
    fw::AfxSetResourceHandle(GetModuleHandleA(nullptr));
    ASSERT_TRUE(parent.Create());
    ASSERT_TRUE(bar.CreateEx(&parent, TBSTYLE_FLAT,
                             WS_CHILD | WS_VISIBLE | fw::CBRS_TOP | fw::CBRS_GRIPPER | fw::CBRS_TOOLTIPS | fw::CBRS_FLYBY,
                             RECT{0, 0, 0, 0}, AFX_IDW_TOOLBAR));
    ASSERT_TRUE(bar.LoadToolBar(128));
    height = bar.CalcFixedLayout(TRUE, TRUE).cy;
    bar.MoveWindow(RECT{0, 0, 600, height});
    Pump();
  }

  Parent parent;
  fw::CToolBar bar;
  int height = 0;
};

TEST_F(ToolBarTest, ButtonsSeparatorsAndPicturesComeFromTheResourceAndASeparatorWidens) {
  ASSERT_EQ(11, bar.GetCount());
  EXPECT_EQ(9, bar.CommandToIndex(kSlot));
  EXPECT_EQ(-1, bar.CommandToIndex(4711));
  // The buttons' pictures are the resource's 16 x 20 images, one per button.
  HIMAGELIST images = reinterpret_cast<HIMAGELIST>(bar.SendMessage(TB_GETIMAGELIST));
  int pictureWidth = 0, pictureHeight = 0;
  ASSERT_TRUE(ImageList_GetIconSize(images, &pictureWidth, &pictureHeight));
  EXPECT_EQ(std::make_pair(16, 20), std::make_pair(pictureWidth, pictureHeight));
  EXPECT_EQ(7, ImageList_GetImageCount(images));

  // A separator widened to make room for a child control keeps its command.
  bar.SetButtonInfo(9, kSlot, fw::TBBS_SEPARATOR, 125);
  RECT slot{}, next{};
  bar.GetItemRect(9, &slot);
  bar.GetItemRect(10, &next);
  EXPECT_EQ(125, slot.right - slot.left);
  EXPECT_EQ(slot.right, next.left);
  EXPECT_EQ(9, bar.CommandToIndex(kSlot));
}

TEST_F(ToolBarTest, PointingAtButtonsShowsTheirPromptsUntilThePointerLeaves) {
  RECT first{}, second{};
  bar.GetItemRect(0, &first);
  bar.GetItemRect(2, &second);
  fwtest::MouseTo(fwtest::ScreenPoint(bar, (first.left + first.right) / 2, (first.top + first.bottom) / 2));
  fwtest::MouseTo(fwtest::ScreenPoint(bar, (first.left + first.right) / 2 + 1, (first.top + first.bottom) / 2));
  fwtest::MouseTo(fwtest::ScreenPoint(bar, (second.left + second.right) / 2, (second.top + second.bottom) / 2));
  fwtest::MouseTo(fwtest::ScreenPoint(parent, 300, 300));
  Pump(600);  // leaving is noticed on the window system's mouse tracking timer
  EXPECT_EQ((Log{"prompt " + std::to_string(kFirst), "prompt " + std::to_string(kSecond), "prompt " + std::to_string(AFX_IDS_IDLEMESSAGE)}), parent.log);
}

TEST_F(ToolBarTest, IdleUpdateRunsHandlersAndLeavesOtherButtonsAsTheyWere) {
  bar.EnableButton(kFirst, FALSE);  // set directly, as the frame does for its accept button
  parent.disabledCommands = {kSecond};
  bar.OnUpdateCmdUI(&parent);
  EXPECT_FALSE(bar.IsButtonEnabled(kFirst));
  EXPECT_FALSE(bar.IsButtonEnabled(kSecond));
  EXPECT_TRUE(bar.IsButtonEnabled(kThird));
}

class StatusBarTest : public ::testing::Test {
 protected:
  void SetUp() override {
    fw::AfxSetResourceHandle(GetModuleHandleA(nullptr));
    ASSERT_TRUE(parent.Create());
    ASSERT_TRUE(bar.Create(&parent));
    const UINT indicators[] = {ID_SEPARATOR, ID_INDICATOR_CAPS, ID_INDICATOR_NUM, ID_INDICATOR_SCRL};
    ASSERT_TRUE(bar.SetIndicators(indicators, 4));
    const int height = bar.CalcFixedLayout(TRUE, TRUE).cy;
    bar.MoveWindow(RECT{0, 400 - height, 600, 400});
  }
  std::string Shown(int index) const {
    char text[256] = "";
    bar.SendMessage(SB_GETTEXTA, static_cast<WPARAM>(index), reinterpret_cast<LPARAM>(text));
    return text;
  }
  static void SetToggles(bool caps, bool num, bool scroll) {
    BYTE keys[256] = {};
    GetKeyboardState(keys);
    keys[VK_CAPITAL] = caps ? 1 : 0;
    keys[VK_NUMLOCK] = num ? 1 : 0;
    keys[VK_SCROLL] = scroll ? 1 : 0;
    SetKeyboardState(keys);
  }

  Parent parent;
  fw::CStatusBar bar;
};

TEST_F(StatusBarTest, PanesFollowTheIndicatorsAndKeyIndicatorsShowOnlyWhileTheirKeyIsOn) {
  ASSERT_EQ(4, bar.GetCount());
  EXPECT_EQ(2, bar.CommandToIndex(ID_INDICATOR_NUM));
  bar.SetMessagePaneText("Scroll to begin");
  EXPECT_EQ("Scroll to begin", Shown(0));
  EXPECT_EQ("Scroll to begin", bar.GetPaneText(0));

  // CAP is not in this program's strings: the usual word; NUMLK is, and is kept while hidden.
  SetToggles(true, false, false);
  bar.OnUpdateCmdUI(&parent);
  EXPECT_EQ((std::vector<std::string>{"CAP", "", ""}), (std::vector<std::string>{Shown(1), Shown(2), Shown(3)}));
  EXPECT_EQ("NUMLK", bar.GetPaneText(2));
  SetToggles(false, true, true);
  bar.OnUpdateCmdUI(&parent);
  EXPECT_EQ((std::vector<std::string>{"", "NUMLK", "SCRL"}), (std::vector<std::string>{Shown(1), Shown(2), Shown(3)}));

  // An update handler of the frame decides instead of the key.
  parent.disabledCommands = {ID_INDICATOR_NUM};
  bar.OnUpdateCmdUI(&parent);
  EXPECT_EQ("", Shown(2));
  SetToggles(false, false, false);
}

}  // namespace
