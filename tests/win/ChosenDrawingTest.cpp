// Which drawing a browse call returns and which files it touches, on real windows: the drawing
// chosen by a click, by the search or remembered from the last browse; nothing chosen once the
// folder is read again or where no folder is shown; drawings whose names the code page cannot
// hold. A watcher thread acts on the windows as a person would, then presses Insert.
#include "ExplorerHarness.h"
#include "ScratchFolder.h"
#include "TreeWatch.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <atomic>

namespace {
constexpr int kAccept = 32795, kCancel = 32796, kMarkAll = 32793, kPaste = 0xE125;
constexpr UINT kBackgroundPaste = 2;

HWND ViewOf(HWND frame) { return GetDlgItem(GetDlgItem(frame, 0xE900), 0xE901); }

std::wstring Wide(const std::string &text) { return std::wstring(text.begin(), text.end()); }

// Posted input, and what it posted in turn, has been handled once two markers posted after it
// (limits of the search box's text) have come back; false when the browse ended first.
bool Sync(HWND box) {
  static WPARAM marker = 200000;
  for (int round = 0; round < 2; ++round) {
    const WPARAM mark = ++marker;
    if (!PostMessageA(box, EM_SETLIMITTEXT, mark, 0)) return false;
    for (int waited = 0; WPARAM(SendMessageA(box, EM_GETLIMITTEXT, 0, 0)) != mark; ++waited) {
      if (!IsWindow(box)) return false;
      if (waited == 10000) return ADD_FAILURE() << "the explorer stopped taking messages", false;
      Sleep(1);
    }
  }
  return true;
}

struct Tile {
  HWND hwnd, caption;
  std::string name;
  bool marked;
};

// The view's tiles, each with the caption box beneath it.
std::vector<Tile> Tiles(HWND view) {
  std::vector<Tile> tiles;
  for (HWND tile : Children(view, "FwWnd")) {
    RECT picture;
    GetWindowRect(tile, &picture);
    for (HWND edit : Children(view, "Edit")) {
      RECT caption;
      GetWindowRect(edit, &caption);
      if (caption.top != picture.bottom + GetSystemMetrics(SM_CYEDGE) || caption.left != picture.left + GetSystemMetrics(SM_CXEDGE))
        continue;
      DWORD start = 0, end = 0;
      SendMessageA(edit, EM_GETSEL, reinterpret_cast<WPARAM>(&start), reinterpret_cast<LPARAM>(&end));
      tiles.push_back(Tile{tile, edit, WindowText(edit), end > start});
    }
  }
  std::sort(tiles.begin(), tiles.end(), [](const Tile &a, const Tile &b) { return a.name < b.name; });
  return tiles;
}

Tile TileNamed(HWND view, const std::string &name) {
  for (const Tile &tile : Tiles(view))
    if (tile.name == name) return tile;
  ADD_FAILURE() << "no tile " << name;
  return Tile{nullptr, nullptr, "", false};
}

// What the person sees of the choice: the title, Insert enabled or not, the marked tiles.
struct Choice {
  std::string title;
  bool insert;
  std::vector<std::string> marked;
  bool operator==(const Choice &other) const {
    return title == other.title && insert == other.insert && marked == other.marked;
  }
};
std::ostream &operator<<(std::ostream &out, const Choice &choice) {
  out << '"' << choice.title << "\" Insert " << (choice.insert ? "enabled" : "disabled") << ", marked:";
  for (const std::string &name : choice.marked) out << ' ' << name;
  return out;
}

Choice Shown(HWND frame) {
  Choice choice{WindowText(frame), SendMessageA(ToolBars(frame)[1], TB_ISBUTTONENABLED, kAccept, 0) != 0, {}};
  for (const Tile &tile : Tiles(ViewOf(frame)))
    if (tile.marked) choice.marked.push_back(tile.name);
  return choice;
}

void Click(HWND box, HWND window, UINT down, WPARAM buttons) {
  PostMessageA(window, down, buttons, 0);
  PostMessageA(window, down + 1, 0, 0);
  Sync(box);
}

// Answers the next pop-up menu with an item's key, then every confirmation of the shell with a
// button until it is destroyed. The menu's own loop takes other messages too: the watcher waits
// for the first answer before it waits for the explorer.
class MenuAnswerer {
 public:
  MenuAnswerer(WPARAM key, int confirmButton)
      : m_thread([this, key, confirmButton] {
          // A key that reaches the menu before its loop has begun is lost: it is sent again while
          // the menu still shows.
          if (HWND menu = WaitForWindow("#32768", nullptr, 5000))
            for (int tries = 0; tries < 5 && IsWindowVisible(menu); ++tries) {
              PostMessageA(menu, WM_KEYDOWN, key, 0);
              for (int waited = 0; waited < 1000 && IsWindowVisible(menu); waited += 20) Sleep(20);
            }
          while (!m_bStop) {
            if (HWND confirm = FindWindowA("#32770", "Confirm file deletion"); confirm && IsWindowVisible(confirm)) {
              SendMessageA(GetDlgItem(confirm, confirmButton), BM_CLICK, 0, 0);
              m_bAnswered = true;
            }
            Sleep(20);
          }
        }) {}
  ~MenuAnswerer() {
    m_bStop = true;
    m_thread.join();
  }
  MenuAnswerer(const MenuAnswerer &) = delete;
  MenuAnswerer &operator=(const MenuAnswerer &) = delete;

  void WaitForAnswer() const {
    for (int waited = 0; !m_bAnswered; waited += 20) {
      if (waited >= 10000) return ADD_FAILURE() << "the shell asked nothing";
      Sleep(20);
    }
  }

 private:
  std::atomic<bool> m_bStop{false}, m_bAnswered{false};
  std::thread m_thread;
};

// Clicks the Insert button as the mouse does; a disabled one does nothing, and the browse is
// then closed.
void PressInsertThenClose(HWND frame) {
  const std::vector<HWND> bars = ToolBars(frame);
  if (bars.size() != 2) return;  // the browse has ended already
  HWND bar = bars[1];
  RECT button{};
  SendMessageA(bar, TB_GETRECT, kAccept, reinterpret_cast<LPARAM>(&button));
  const LPARAM centre = MAKELPARAM((button.left + button.right) / 2, (button.top + button.bottom) / 2);
  PostMessageA(bar, WM_LBUTTONDOWN, MK_LBUTTON, centre);
  PostMessageA(bar, WM_LBUTTONUP, 0, centre);
  PostMessageA(frame, WM_COMMAND, kCancel, 0);
}

class ChosenDrawing : public BrowseTest {
 protected:
  // Browses the scratch folder with `remembered` as the drawing of the last browse; the watcher
  // gets the frame and its search box, and Insert is pressed after it.
  std::wstring Run(const std::string &remembered, const std::function<void(HWND frame, HWND box)> &watcher,
                   char separator = '\\') {
    m_state.Write("[CurrentPath]\r\nPath=\r\nName=" + remembered +
                  "\r\nShellPath=\r\n\r\n[Size]\r\nSplitterSize=120\r\nWindowWidth=1000\r\nWindowHeight=700\r\n\r\n"
                  "[View]\r\nPictureWidth=0\r\nPictureHeight=0\r\nSort=0\r\n");
    std::string start = Folder() + "\\";
    std::replace(start.begin(), start.end(), '\\', separator);
    const BrowseOutcome outcome = Browse(BrowseArgs(Wide(start).c_str()), [&](HWND frame) {
      HWND box = Children(ToolBars(frame)[0], "Edit")[0];
      if (!Sync(box)) return;
      watcher(frame, box);
      PressInsertThenClose(frame);
    });
    EXPECT_TRUE(outcome.watcherFoundFrame);
    if (outcome.resultKind == RTNIL) return L"nil";
    return outcome.texts.empty() ? L"<nothing>" : outcome.texts[0];
  }
  std::string Folder() const { return m_folder.Path(); }
  std::wstring Returned(const std::string &name) const { return Wide(Folder() + "\\" + name); }
  bool OnDisk(const std::string &name) const { return GetFileAttributesA(m_folder.File(name).c_str()) != INVALID_FILE_ATTRIBUTES; }

  ScratchFolder m_folder{"chosen"};
};

TEST_F(ChosenDrawing, TheRememberedDrawingIsChosenWhenTheSearchFindsIt) {
  for (const char *name : {"door-1.dwg", "door-2.dwg", "door-3.dwg"}) m_folder.File(name, "");
  const struct {
    const char *remembered;
    Choice shown{};
    std::wstring returned;
  } rows[] = {{"door-2.dwg", {Folder() + "\\door-2.dwg", true, {"door-2.dwg"}}, Returned("door-2.dwg")},
              {"gone.dwg", {Folder(), false, {}}, L"nil"}};
  for (const auto &row : rows) {
    Choice shown{};
    const std::wstring returned = Run(row.remembered, [&](HWND frame, HWND) { shown = Shown(frame); });
    EXPECT_EQ(shown, row.shown) << row.remembered;
    EXPECT_EQ(returned, row.returned) << row.remembered;
  }
}

// The start folder is written with "/", as LISP programs write it.
TEST_F(ChosenDrawing, ClickOrSearchThenInsertReturnsTheDrawingMarkedAndNamedInTheTitle) {
  for (const char *name : {"a.dwg", "plan.dwg", "plan2.dwg"}) m_folder.File(name, "");
  const struct {
    const char *clicked, *typed;
    Choice shown{};
    std::wstring returned;
  } rows[] = {{"plan.dwg", "", {Folder() + "\\plan.dwg", true, {"plan.dwg"}}, Returned("plan.dwg")},
              {"", "plan.dwg", {Folder() + "\\plan.dwg", true, {"plan.dwg"}}, Returned("plan.dwg")},
              {"", "PLAN2", {Folder() + "\\plan2.dwg", true, {"plan2.dwg"}}, Returned("plan2.dwg")},
              {"a.dwg", "plx", {Folder(), false, {}}, L"nil"}};
  for (const auto &row : rows) {
    Choice shown{};
    const std::wstring returned = Run(
        "",
        [&](HWND frame, HWND box) {
          if (*row.clicked) Click(box, TileNamed(ViewOf(frame), row.clicked).hwnd, WM_LBUTTONDOWN, MK_LBUTTON);
          if (*row.typed) SendMessageA(box, WM_SETTEXT, 0, LPARAM(row.typed));
          // End requests posted to any window but the host dialog are not the explorer's.
          for (HWND other : {frame, ViewOf(frame), box}) PostMessageA(other, WM_APP, 2, 0);
          PostThreadMessageA(GetWindowThreadProcessId(frame, nullptr), WM_APP, 2, 0);
          if (Sync(box)) shown = Shown(frame);
        },
        '/');
    EXPECT_EQ(shown, row.shown) << row.clicked << row.typed;
    EXPECT_EQ(returned, row.returned) << row.clicked << row.typed;
  }
}

TEST_F(ChosenDrawing, AfterDeleteRenameOrPasteNothingIsChosenUntilTheUserChoosesAgain) {
  const ScratchFolder elsewhere("chosen-paste");
  const std::string pasted = elsewhere.File("new.dwg", "");
  const struct {
    const char *action;
    std::vector<std::string> onDisk;
  } rows[] = {{"delete", {"a.dwg"}}, {"rename", {"a.dwg", "plan3.dwg"}}, {"paste", {"a.dwg", "new.dwg", "plan.dwg"}}};
  for (const auto &row : rows) {
    for (const char *name : {"a.dwg", "plan.dwg"}) m_folder.File(name, "");
    Choice shown{};
    const std::wstring returned = Run("", [&](HWND frame, HWND box) {
      const Tile plan = TileNamed(ViewOf(frame), "plan.dwg");
      Click(box, plan.hwnd, WM_LBUTTONDOWN, MK_LBUTTON);
      if (row.action == std::string("delete")) {
        const MenuAnswerer answer('D', IDYES);
        Click(box, plan.hwnd, WM_RBUTTONDOWN, MK_RBUTTON);
        answer.WaitForAnswer();
        Sync(box);
      } else if (row.action == std::string("rename")) {
        Click(box, plan.caption, WM_LBUTTONDBLCLK, MK_LBUTTON);
        SendMessageA(plan.caption, WM_SETTEXT, 0, LPARAM("plan3.dwg"));
        PostMessageA(plan.caption, WM_KEYDOWN, VK_RETURN, 0);
      } else {
        PutFileOnClipboard(pasted);
        PostMessageA(frame, WM_COMMAND, kPaste, 0);
      }
      if (Sync(box)) shown = Shown(frame);
    });
    EXPECT_EQ(shown, (Choice{Folder(), false, {}})) << row.action;
    EXPECT_EQ(returned, L"nil") << row.action;
    std::vector<std::string> onDisk;
    for (const char *name : {"a.dwg", "new.dwg", "plan.dwg", "plan3.dwg"})
      if (OnDisk(name)) onDisk.push_back(name), DeleteFileA(m_folder.File(name).c_str());
    EXPECT_EQ(onDisk, row.onDisk) << row.action;
  }
}

// My Computer has no file-system folder: nothing is shown, nothing chosen, nothing pasted.
TEST_F(ChosenDrawing, WhereNoFolderIsShownPasteIsDisabledAndPastesNothing) {
  m_folder.File("a.dwg", "");
  const ScratchFolder elsewhere("chosen-nofolder");
  PutFileOnClipboard(elsewhere.File("new.dwg", ""));
  Choice shown{};
  UINT pasteState = 0;
  const std::wstring returned = Run("a.dwg", [&](HWND frame, HWND box) {
    HWND tree = FindTree(frame);
    HTREEITEM computer = ChildNamed(tree, TreeNext(tree, nullptr, TVGN_ROOT), "My Computer");
    SendMessageA(tree, TVM_SELECTITEM, TVGN_CARET, reinterpret_cast<LPARAM>(computer));
    PostMessageA(frame, WM_COMMAND, kPaste, 0);
    std::thread menu([&] {
      HWND popup = WaitForWindow("#32768", nullptr, 5000);
      pasteState = GetMenuState(reinterpret_cast<HMENU>(SendMessageA(popup, MN_GETHMENU, 0, 0)), kBackgroundPaste, MF_BYCOMMAND);
      PostMessageA(popup, WM_KEYDOWN, VK_ESCAPE, 0);
    });
    Click(box, ViewOf(frame), WM_RBUTTONDOWN, MK_RBUTTON);
    menu.join();
    if (Sync(box)) shown = Shown(frame);
  });
  EXPECT_EQ(shown, (Choice{"Desktop\\My Computer", false, {}}));
  EXPECT_TRUE(pasteState & MF_GRAYED) << "the view's Paste";
  EXPECT_FALSE(OnDisk("new.dwg"));
  EXPECT_EQ(returned, L"nil");
}

// Under code page 1252 "план.dwg" and "日本.dwg" read "????.dwg" and "??.dwg", and "plān.dwg"
// reads "plan.dwg", another file: they are left out, and the status bar says how many.
TEST_F(ChosenDrawing, NamesTheCodePageCannotHoldAreLeftOutAndCounted) {
  ASSERT_EQ(GetACP(), 1252u);
  const std::wstring folder = Wide(Folder()) + L"\\";
  const std::wstring unheld[] = {L"\u043f\u043b\u0430\u043d.dwg", L"\u65e5\u672c.dwg", L"pl\u0101n.dwg"};
  for (const std::wstring &name : unheld) CloseHandle(CreateFileW((folder + name).c_str(), GENERIC_WRITE, 0, nullptr, CREATE_NEW, 0, nullptr));
  for (const char *name : {"a.dwg", "plan.dwg"}) m_folder.File(name, "");
  std::vector<std::string> names;
  std::string status;
  Run("", [&](HWND frame, HWND box) {
    for (const Tile &tile : Tiles(ViewOf(frame))) names.push_back(tile.name);
    char text[256] = "";
    SendMessageA(FindWindowExA(frame, nullptr, STATUSCLASSNAMEA, nullptr), SB_GETTEXTA, 0, reinterpret_cast<LPARAM>(text));
    status = text;
    PostMessageA(frame, WM_COMMAND, kMarkAll, 0);
    const MenuAnswerer answer('D', IDYES);
    Click(box, ViewOf(frame), WM_RBUTTONDOWN, MK_RBUTTON);
    answer.WaitForAnswer();
    Sync(box);
  });
  EXPECT_EQ(names, (std::vector<std::string>{"a.dwg", "plan.dwg"}));
  EXPECT_EQ(status, "3 drawings are not shown: their names have characters that this system's code page cannot hold");
  EXPECT_FALSE(OnDisk("a.dwg"));
  EXPECT_FALSE(OnDisk("plan.dwg"));
  for (const std::wstring &name : unheld)
    EXPECT_NE(GetFileAttributesW((folder + name).c_str()), INVALID_FILE_ATTRIBUTES) << "a file left out is never touched";
}
}  // namespace
