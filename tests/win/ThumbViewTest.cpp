// The thumbnail view of a browse call on real windows: the ring of tiles and its geometry,
// scrolling by keys, wheel and scroll bar, picture sizes, marks and both context menus, accept,
// search, rename and the tooltip's text. A watcher thread acts on the windows as a person would.
#include "ExplorerHarness.h"
#include "ScratchFolder.h"

#include <gtest/gtest.h>
#include <shellapi.h>

#include <array>
#include <cstdio>
#include <filesystem>

namespace {
constexpr int kIncrease = 32774, kDecrease = 32775, kMarkAll = 32793, kCopy = 57634, kCancel = 32796;

int CaptionHeight() {
  TEXTMETRICA metrics{};
  HDC screen = GetDC(nullptr);
  GetTextMetricsA(screen, &metrics);
  ReleaseDC(nullptr, screen);
  return metrics.tmHeight + 2 + GetSystemMetrics(SM_CYEDGE);
}

HWND ViewOf(HWND frame) { return GetDlgItem(GetDlgItem(frame, 0xE900), 0xE901); }
HWND SearchBox(HWND frame) { return Children(ToolBars(frame)[0], "Edit")[0]; }

struct Tile {
  HWND hwnd, caption;
  RECT rect;
  std::string name;
  bool marked;
};

// Tile windows in the view's client coordinates, each with the caption box beneath it, top-left first.
std::vector<Tile> Tiles(HWND view) {
  const auto rectOf = [view](HWND hwnd) {
    RECT r;
    GetWindowRect(hwnd, &r);
    MapWindowPoints(nullptr, view, reinterpret_cast<POINT *>(&r), 2);
    return r;
  };
  std::vector<Tile> tiles;
  for (HWND tile : Children(view, "FwWnd")) {
    Tile t{tile, nullptr, rectOf(tile), "", false};
    for (HWND edit : Children(view, "Edit")) {
      const RECT r = rectOf(edit);
      if (r.top != t.rect.bottom + GetSystemMetrics(SM_CYEDGE) || r.left != t.rect.left + GetSystemMetrics(SM_CXEDGE)) continue;
      DWORD start = 0, end = 0;
      SendMessageA(edit, EM_GETSEL, reinterpret_cast<WPARAM>(&start), reinterpret_cast<LPARAM>(&end));
      t = Tile{tile, edit, t.rect, WindowText(edit), end > start};
    }
    tiles.push_back(t);
  }
  std::sort(tiles.begin(), tiles.end(), [](const Tile &a, const Tile &b) {
    return a.rect.top != b.rect.top ? a.rect.top < b.rect.top : a.rect.left < b.rect.left;
  });
  return tiles;
}

// Captions of the tiles inside the client area, or of all tiles; indexes of the marked ones.
std::vector<std::string> Names(HWND view, bool visibleOnly = true) {
  RECT client;
  GetClientRect(view, &client);
  std::vector<std::string> names;
  for (const Tile &t : Tiles(view))
    if (!visibleOnly || (t.rect.bottom > 0 && t.rect.top < client.bottom)) names.push_back(t.name);
  return names;
}
std::vector<int> Marked(HWND view) {
  std::vector<int> marked;
  const std::vector<Tile> tiles = Tiles(view);
  for (size_t i = 0; i < tiles.size(); ++i)
    if (tiles[i].marked) marked.push_back(static_cast<int>(i));
  return marked;
}

// d000.dwg ... for `count` records from `first`.
std::vector<std::string> Drawings(int first, int count, int records) {
  std::vector<std::string> names;
  char name[16];
  for (int i = first; i < std::min(records, first + count); ++i) names.push_back((std::snprintf(name, 16, "d%03d.dwg", i), name));
  return names;
}

// Posted input has been handled, and what it posted in turn, once two markers posted after it
// (limits of the search box's text) have arrived: a thread takes its posted messages in order.
void Sync(HWND frame) {
  static WPARAM marker = 100000;
  const WaitingFor waiting("the view's thread to take the messages posted to it");
  for (int round = 0; round < 2; ++round) {
    PostMessageA(SearchBox(frame), EM_SETLIMITTEXT, ++marker, 0);
    const DWORD start = GetTickCount();
    while (WPARAM(SendMessageA(SearchBox(frame), EM_GETLIMITTEXT, 0, 0)) != marker) {
      ASSERT_LT(GetTickCount() - start, 10000u) << "the view's thread took no posted message for 10 s";
      Sleep(1);
    }
  }
}
void Post(HWND frame, HWND target, UINT message, WPARAM wParam, LPARAM lParam = 0) {
  PostMessageA(target, message, wParam, lParam);
  Sync(frame);
}

// Sizes the frame so that the view's client area is width x height.
void SizeView(HWND frame, int width, int height) {
  RECT client, window;
  GetClientRect(ViewOf(frame), &client);
  GetWindowRect(frame, &window);
  SetWindowPos(frame, nullptr, 0, 0, window.right - window.left + width - client.right,
               window.bottom - window.top + height - client.bottom, SWP_NOMOVE | SWP_NOZORDER);
}

std::vector<std::string> ClipboardPaths() {
  std::vector<std::string> paths;
  if (!OpenClipboard(nullptr)) return {"(the clipboard could not be opened)"};
  if (HANDLE drop = GetClipboardData(CF_HDROP)) {
    const UINT count = DragQueryFileA(HDROP(drop), 0xFFFFFFFF, nullptr, 0);
    for (UINT i = 0; i < count; ++i) {
      char path[MAX_PATH] = "";
      DragQueryFileA(HDROP(drop), i, path, MAX_PATH);
      paths.push_back(path);
    }
  }
  CloseClipboard();
  return paths;
}

bool AcceptEnabled(HWND frame) { return SendMessageA(ToolBars(frame)[1], TB_ISBUTTONENABLED, 32795, 0) != 0; }

class ThumbView : public BrowseTest {
 protected:
  // Browses the scratch folder, or the one given, with the given picture size; the watcher's view is
  // width x height.
  BrowseOutcome Run(int width, int height, const std::function<void(HWND frame, HWND view)> &watcher, int pictureWidth = 0,
                    int pictureHeight = 0, bool cancel = true, std::string folder = {}) {
    m_state.Write("[Size]\r\nSplitterSize=120\r\nWindowWidth=1000\r\nWindowHeight=700\r\n\r\n[View]\r\nPictureWidth=" +
                  std::to_string(pictureWidth) + "\r\nPictureHeight=" + std::to_string(pictureHeight) + "\r\nSort=0\r\n");
    folder = (folder.empty() ? Folder() : folder) + "\\";
    return Browse(BrowseArgs(std::wstring(folder.begin(), folder.end()).c_str()), [&](HWND frame) {
      SizeView(frame, width, height);
      // The X server's focus events reach the new frame a little later and move the focus to its
      // active pane; a person does not click within that moment either.
      Sleep(500);
      Sync(frame);
      watcher(frame, ViewOf(frame));
      if (cancel) PostMessageA(frame, WM_COMMAND, kCancel, 0);
    });
  }
  std::string Folder() const { return m_folder.Path(); }
  void MakeDrawings(int count) {
    for (const std::string &name : Drawings(0, count, count)) m_folder.File(name, "");
  }

  ScratchFolder m_folder{"thumbview"};
  const int m_step = 143 + CaptionHeight();
};

TEST_F(ThumbView, KeysWheelAndScrollBarKeepEveryVisibleRowFilled) {
  constexpr WPARAM kWheelDown = 0xFF88u << 16, kWheelUp = WHEEL_DELTA << 16, kThumbAt330 = 330 << 16 | SB_THUMBPOSITION;
  const std::vector<std::array<WPARAM, 3>> cases{
      {WM_KEYDOWN, VK_DOWN, 0},  {WM_KEYDOWN, VK_UP, 0},          {WM_KEYDOWN, VK_UP, 0},        {WM_KEYDOWN, VK_NEXT, 16},
      {WM_KEYDOWN, VK_PRIOR, 0}, {WM_KEYDOWN, VK_END, 104},       {WM_KEYDOWN, VK_DOWN, 104},    {WM_KEYDOWN, VK_PRIOR, 88},
      {WM_KEYDOWN, VK_HOME, 0},  {WM_KEYDOWN, VK_DOWN, 0},        {WM_KEYDOWN, VK_DOWN, 0},      {WM_KEYDOWN, VK_DOWN, 0},
      {WM_KEYDOWN, VK_DOWN, 4},  {WM_KEYDOWN, VK_UP, 4},          {WM_KEYDOWN, VK_RIGHT, 4},     {WM_KEYDOWN, VK_HOME, 0},
      {WM_MOUSEWHEEL, kWheelDown, 12}, {WM_MOUSEWHEEL, kWheelUp, 0}, {WM_VSCROLL, SB_BOTTOM, 104},
      {WM_VSCROLL, SB_TOP, 0},   {WM_VSCROLL, kThumbAt330, 8},    {WM_VSCROLL, SB_PAGEDOWN, 24}, {WM_VSCROLL, SB_PAGEUP, 8}};
  MakeDrawings(120);
  Run(4 * 178 + 20, 4 * m_step, [&](HWND frame, HWND view) {
    for (const auto &[message, wParam, firstRecord] : cases) {
      Post(frame, view, static_cast<UINT>(message), wParam);
      EXPECT_EQ(Names(view), Drawings(static_cast<int>(firstRecord), 16, 120)) << message << " " << wParam;
      EXPECT_LE(Tiles(view).size(), 24u);
    }
    SendMessageA(SearchBox(frame), WM_SETTEXT, 0, LPARAM("d119"));  // the last row at the top
    EXPECT_EQ(Names(view), Drawings(116, 4, 120));
    // The ring has wrapped several times: a click marks the drawing the tile shows.
    for (const Tile &tile : Tiles(view))
      if (tile.name == "d117.dwg") Post(frame, tile.hwnd, WM_LBUTTONDOWN, MK_LBUTTON);
    SendMessageA(frame, WM_COMMAND, kCopy, 0);
    EXPECT_EQ(ClipboardPaths(), std::vector<std::string>{Folder() + "\\d117.dwg"});
  });
}

TEST_F(ThumbView, WhenEveryRowFitsNoneIsLeftAboveTheTop) {
  MakeDrawings(12);  // 3 rows of 4
  Run(4 * 178 + 20, 2 * m_step, [&](HWND frame, HWND view) {
    Post(frame, view, WM_KEYDOWN, VK_END);
    ASSERT_EQ(Names(view), Drawings(4, 8, 12));
    SizeView(frame, 4 * 178 + 20, 3 * m_step + 10);
    EXPECT_EQ(Names(view), Drawings(0, 12, 12));
    SendMessageA(SearchBox(frame), WM_SETTEXT, 0, LPARAM("d011"));
    EXPECT_EQ(Names(view), Drawings(0, 12, 12));
  });
}

TEST_F(ThumbView, TheScrollBarWrapsAtTheCappedRange) {
  MakeDrawings(1000);
  Run(
      100, 640,
      [&](HWND, HWND view) {
        for (int i = 0; i < 199; ++i) SendMessageA(view, WM_VSCROLL, SB_LINEDOWN, 0);
        EXPECT_EQ(GetScrollPos(view, SB_VERT), 31840);
        SendMessageA(view, WM_VSCROLL, SB_LINEDOWN, 0);
        EXPECT_EQ(GetScrollPos(view, SB_VERT), 160);
        EXPECT_EQ(Names(view), Drawings(200, 4, 1000));
      },
      100, 160 - CaptionHeight());
}

// Line steps from the top row `top` (in rows of `columns`), each followed by a look at the
// captions: every row in view filled with the drawings that belong there, the top one at the top.
void StepAndCheck(HWND frame, HWND view, WPARAM code, int steps, int &top, int columns, int records, int rowsInView) {
  const int lastTop = (records + columns - 1) / columns - 1;
  for (int i = 0; i < steps; ++i) {
    Post(frame, view, WM_VSCROLL, code);
    top = std::clamp(top + (code == SB_LINEDOWN ? 1 : -1), 0, lastTop);
    ASSERT_EQ(Names(view), Drawings(top * columns, rowsInView * columns, records)) << "top row " << top;
    const std::vector<Tile> tiles = Tiles(view);
    ASSERT_TRUE(std::any_of(tiles.begin(), tiles.end(), [&](const Tile &t) { return t.rect.top == 0; })) << "top row " << top;
  }
}

TEST_F(ThumbView, RowsStayFilledAcrossTheWrapAfterEndPageDownAndAColumnChange) {
  MakeDrawings(1000);  // row step 160; a view 30 pixels more than 4 rows shows part of a fifth
  int top = 0;
  Run(
      100, 4 * 160 + 30,
      [&](HWND frame, HWND view) {
        Post(frame, view, WM_KEYDOWN, VK_END);
        top = 996;
        StepAndCheck(frame, view, SB_LINEUP, 4, top, 1, 1000, 5);  // across the wrap at the first steps
        Post(frame, view, WM_KEYDOWN, VK_HOME);
        for (int i = 0; i < 50; ++i) Post(frame, view, WM_KEYDOWN, VK_NEXT);
        top = 200;  // beyond the wrap of the capped range
        ASSERT_EQ(Names(view), Drawings(200, 5, 1000));
        StepAndCheck(frame, view, SB_LINEDOWN, 3, top, 1, 1000, 5);
        StepAndCheck(frame, view, SB_LINEUP, 6, top, 1, 1000, 5);
      },
      100, 160 - CaptionHeight());
  Run(
      5 * 178 + 20, 4 * 160 + 30,
      [&](HWND frame, HWND view) {
        Post(frame, view, WM_KEYDOWN, VK_END);        // 200 rows of 5: the range is not capped
        SizeView(frame, 4 * 178 + 20, 4 * 160 + 30);  // 250 rows of 4: it is
        Sync(frame);
        top = 5 * 196 / 4;
        ASSERT_EQ(Names(view), Drawings(top * 4, 20, 1000));
        StepAndCheck(frame, view, SB_LINEUP, 50, top, 4, 1000, 5);
        StepAndCheck(frame, view, SB_LINEDOWN, 3, top, 4, 1000, 5);
      },
      173, 160 - CaptionHeight());
}

TEST_F(ThumbView, AStateFilePictureSizeTheViewCannotShowIsNotTaken) {
  MakeDrawings(3);
  for (const auto &[stored, shown] : std::vector<std::pair<int, int>>{{-CaptionHeight(), 143}, {-20, 143}, {100000, 4096}})
    Run(
        4 * 178 + 20, 400,
        [&, shown = shown](HWND, HWND view) { EXPECT_EQ(Tiles(view)[0].rect.bottom - Tiles(view)[0].rect.top, shown); }, 173,
        stored);
}

TEST_F(ThumbView, PictureSizesStepAndKeepTheTopRowsFirstDrawing) {
  const std::vector<std::array<int, 3>> steps{
      {kIncrease, 216, 179}, {kIncrease, 270, 224}, {kIncrease, 338, 280}, {kIncrease, 423, 350}, {kIncrease, 423, 350},
      {kDecrease, 338, 280}, {kDecrease, 270, 224}, {kDecrease, 216, 179}, {kDecrease, 173, 143}, {kDecrease, 138, 114},
      {kDecrease, 110, 91},  {kDecrease, 88, 73},   {kDecrease, 70, 58},   {kDecrease, 56, 46},   {kDecrease, 45, 37},
      {kDecrease, 36, 30},   {kDecrease, 29, 24},   {kDecrease, 23, 19},   {kDecrease, 23, 19}};
  MakeDrawings(30);
  Run(4 * 178 + 20, 400, [&](HWND frame, HWND view) {
    SendMessageA(SearchBox(frame), WM_SETTEXT, 0, LPARAM("d010"));
    for (const auto &[command, width, height] : steps) {
      const std::string first = Tiles(view)[0].name;
      SendMessageA(frame, WM_COMMAND, command, 0);
      const std::vector<Tile> tiles = Tiles(view);
      EXPECT_EQ(tiles[0].rect.right - tiles[0].rect.left, width);
      EXPECT_EQ(tiles[0].rect.bottom - tiles[0].rect.top, height);
      EXPECT_TRUE(std::any_of(tiles.begin(), tiles.end(), [&](const Tile &t) { return t.rect.top == 0 && t.name == first; }));
    }
  });
}

// Answers the context menu with its items' keys and the shell's confirmation with a button.
std::thread Answer(std::vector<WPARAM> keys, int confirmButton = 0) {
  return std::thread([keys, confirmButton] {
    HWND menu = WaitForPopupMenu();
    if (!menu) return;
    for (WPARAM key : keys) PostMessageA(menu, WM_KEYDOWN, key, 0);
    if (HWND confirm = confirmButton ? WaitForWindow("#32770", "Confirm file deletion", 5000) : nullptr)
      SendMessageA(GetDlgItem(confirm, confirmButton), BM_CLICK, 0, 0);
  });
}

TEST_F(ThumbView, ClicksMarkDrawingsAndBothMenusActOnTheMarks) {
  struct Case {
    UINT message;
    int tile;
    WPARAM buttons;
    std::vector<int> marked;
    bool accept;
    const char *title;  // after the folder; null: unchanged
    std::vector<WPARAM> menu;
    int confirm;
  };
  const std::vector<Case> cases{{WM_LBUTTONDOWN, 0, MK_LBUTTON, {0}, true, "\\d000.dwg", {}, 0},
                                {WM_LBUTTONDOWN, 1, MK_LBUTTON | MK_CONTROL, {0, 1}, true, "\\d001.dwg", {}, 0},
                                {WM_LBUTTONDOWN, 1, MK_LBUTTON | MK_CONTROL, {0}, false, "", {}, 0},
                                {WM_LBUTTONDOWN, 2, MK_LBUTTON | MK_SHIFT, {0}, false, nullptr, {}, 0},
                                {WM_LBUTTONDOWN, 2, MK_LBUTTON, {2}, true, "\\d002.dwg", {}, 0},
                                {WM_RBUTTONDOWN, 3, MK_RBUTTON, {2, 3}, true, "\\d003.dwg", {VK_DOWN, VK_RETURN}, 0},
                                {WM_RBUTTONDOWN, 4, MK_RBUTTON, {}, false, "", {'D'}, IDNO}};  // refused, rescanned
  MakeDrawings(6);
  const ScratchFolder elsewhere("thumbview-other");
  const std::string other = elsewhere.File("new.dwg", "");
  std::vector<std::string> copiedFromMenu, copiedAll;
  Run(4 * 178 + 20, 400, [&](HWND frame, HWND view) {
    std::string title = WindowText(frame);
    for (const Case &c : cases) {
      std::thread answer = c.menu.empty() ? std::thread() : Answer(c.menu, c.confirm);
      Post(frame, Tiles(view)[c.tile].hwnd, c.message, c.buttons);
      if (answer.joinable()) answer.join();
      Sync(frame);
      if (c.title) title = Folder() + c.title;
      EXPECT_EQ(Marked(view), c.marked) << c.tile;
      EXPECT_EQ(AcceptEnabled(frame), c.accept) << c.tile;
      EXPECT_EQ(WindowText(frame), title) << c.tile;
      if (c.menu.size() == 2) copiedFromMenu = ClipboardPaths();
    }
    SendMessageA(frame, WM_COMMAND, kMarkAll, 0);
    SendMessageA(frame, WM_COMMAND, kCopy, 0);
    copiedAll = ClipboardPaths();
    PutFileOnClipboard(other);
    std::thread answer = Answer({'P'});
    Post(frame, view, WM_RBUTTONDOWN, MK_RBUTTON, MAKELPARAM(4 * 178 + 10, 5));  // the background's &Paste
    answer.join();
    Sync(frame);
    EXPECT_EQ(Names(view, false).back(), "new.dwg");
  });
  const auto inFolder = [&](std::vector<std::string> names) {
    for (std::string &name : names) name = Folder() + "\\" + name;
    return names;
  };
  EXPECT_EQ(copiedFromMenu, inFolder({"d002.dwg", "d003.dwg"}));
  EXPECT_EQ(copiedAll, inFolder(Drawings(0, 6, 6)));
  EXPECT_EQ(GetFileAttributesA(m_folder.File("d004.dwg").c_str()) != INVALID_FILE_ATTRIBUTES, true);
}

TEST_F(ThumbView, DoubleClickAcceptsTheDrawingAsANestedList) {
  MakeDrawings(3);
  const BrowseOutcome outcome = Run(
      4 * 178 + 20, 400,
      [](HWND, HWND view) {
        PostMessageA(Tiles(view)[1].hwnd, WM_LBUTTONDOWN, MK_LBUTTON, 0);
        PostMessageA(Tiles(view)[1].hwnd, WM_LBUTTONDBLCLK, MK_LBUTTON, 0);
      },
      0, 0, false);
  const std::string file = Folder() + "\\d001.dwg";
  EXPECT_EQ(outcome.kinds, (std::vector<int>{RTSTR, RTLB, RTSTR, RTSTR, RTSTR, RTLE}));
  EXPECT_EQ(outcome.texts, (std::vector<std::wstring>{std::wstring(file.begin(), file.end()), L"", L"", L""}));
}

TEST_F(ThumbView, SearchFindsByPrefixAndClickingTheBoxEmptiesIt) {
  for (const char *name : {"a.dwg", "Plan.dwg", "plot.dwg"}) m_folder.File(name, "");
  Run(4 * 178 + 20, 400, [&](HWND frame, HWND view) {
    const std::vector<Tile> tiles = Tiles(view);  // room for 4 columns: 3 tiles in one row
    ASSERT_EQ(tiles.size(), 3u);
    EXPECT_EQ(tiles[2].rect.left * 1000 + tiles[2].rect.top, 356 * 1000);
    for (const auto &[text, marked] : std::vector<std::pair<const char *, std::vector<int>>>{{"pl", {1}}, {"a.dwg", {0}}}) {
      SendMessageA(ToolBars(frame)[1], TB_ENABLEBUTTON, 32795, FALSE);
      SendMessageA(SearchBox(frame), WM_SETTEXT, 0, LPARAM(text));
      EXPECT_EQ(Marked(view), marked) << text;
      EXPECT_EQ(WindowText(frame), Folder() + (marked[0] == 0 ? "\\a.dwg" : "\\plan.dwg")) << text;
      EXPECT_TRUE(AcceptEnabled(frame)) << text;
    }
    Post(frame, SearchBox(frame), WM_LBUTTONDOWN, MK_LBUTTON);
    EXPECT_EQ(WindowText(SearchBox(frame)), "");
    EXPECT_EQ(WindowText(frame), Folder() + "\\a.dwg");
  });
}

// A double click on a caption box starts its rename, as a person's click, release and second click.
void StartRename(HWND frame, HWND caption) {
  PostMessageA(caption, WM_LBUTTONDOWN, MK_LBUTTON, 0);
  PostMessageA(caption, WM_LBUTTONUP, 0, 0);
  Post(frame, caption, WM_LBUTTONDBLCLK, MK_LBUTTON);
}
HWND CaptionOf(HWND view, const std::string &name) {
  for (const Tile &t : Tiles(view))
    if (t.name == name) return t.caption;
  return nullptr;
}
bool ReadOnly(HWND edit) { return (GetWindowLongA(edit, GWL_STYLE) & ES_READONLY) != 0; }

// The names of the files in a folder, sorted.
std::vector<std::string> FilesIn(const std::string &folder) {
  std::vector<std::string> names;
  for (const auto &entry : std::filesystem::directory_iterator(folder)) names.push_back(entry.path().filename().string());
  std::sort(names.begin(), names.end());
  return names;
}

// The message box of a refused rename once it shows: its text; then OK is pressed.
std::string AnswerRefusal(const std::function<void()> &whileShown = {}) {
  HWND box = WaitForWindow("#32770", "Rename", 10000);
  if (!box) return "(no message)";
  if (whileShown) whileShown();
  std::string text;
  for (HWND child = FindWindowExA(box, nullptr, "Static", nullptr); child; child = FindWindowExA(box, child, "Static", nullptr))
    text += WindowText(child);
  const DWORD thread = GetWindowThreadProcessId(box, nullptr);
  SendMessageA(GetDlgItem(box, IDOK), BM_CLICK, 0, 0);
  // The box gone and the focus given on inside the frame before the next click.
  GUITHREADINFO info{};
  info.cbSize = sizeof info;
  for (int waited = 0; waited < 5000 && (IsWindow(box) || (GetGUIThreadInfo(thread, &info), !info.hwndFocus)); waited += 10)
    Sleep(10);
  return text;
}

TEST_F(ThumbView, ARenameGivenUpLeavesTheFileAndShowsItsName) {
  for (const char *name : {"b.dwg", "c.dwg"}) m_folder.File(name, "");
  Run(4 * 178 + 20, 400, [&](HWND frame, HWND view) {
    for (const WPARAM key : {VK_ESCAPE, VK_TAB, VK_PRIOR}) {  // Page Up rebuilds every tile
      HWND caption = Tiles(view)[0].caption;
      StartRename(frame, caption);
      EXPECT_FALSE(ReadOnly(caption));
      SendMessageA(caption, WM_SETTEXT, 0, LPARAM("x.dwg"));
      Post(frame, caption, WM_KEYDOWN, key);
      EXPECT_EQ(Names(view), (std::vector<std::string>{"b.dwg", "c.dwg"})) << key;
    }
  });
  EXPECT_EQ(FilesIn(Folder()), (std::vector<std::string>{"b.dwg", "c.dwg"}));
}

TEST_F(ThumbView, ARenameTakesOnlyAPlainFileNameAndSaysWhichRuleARefusedOneBreaks) {
  const std::string outside = Folder().substr(Folder().rfind('\\') + 1) + ".dwg";  // a name no other run leaves
  const char *separator = "cannot contain \\, / or :", *device = "name devices", *dotOrSpace = "end with a dot or a space",
             *character = "control characters or any of";
  const std::vector<std::pair<std::string, const char *>> refused{{"", "empty"},
                                                                  {"a/b.dwg", separator},
                                                                  {"..\\" + outside, separator},
                                                                  {"c:" + outside, separator},
                                                                  {"con.dwg", device},
                                                                  {"NUL", device},
                                                                  {"lpt1.txt", device},
                                                                  {"plan.", dotOrSpace},
                                                                  {"plan ", dotOrSpace},
                                                                  {"a<b.dwg", character},
                                                                  {"why?.dwg", character},
                                                                  {"tab\t.dwg", character},
                                                                  {"c.dwg", "\"c.dwg\" is already in this folder"},
                                                                  {"good.dwg", nullptr}};
  for (const char *name : {"b.dwg", "c.dwg"}) m_folder.File(name, "");
  Run(4 * 178 + 20, 400, [&](HWND frame, HWND view) {
    bool fromMenu = false;
    for (const auto &[typed, rule] : refused) {
      HWND caption = CaptionOf(view, "b.dwg");
      if ((fromMenu = !fromMenu)) {  // every other rename from the tile menu
        std::thread answer = Answer({'R'});
        Post(frame, Tiles(view)[0].hwnd, WM_RBUTTONDOWN, MK_RBUTTON);
        answer.join();
        Sync(frame);
      } else {
        StartRename(frame, caption);
      }
      SendMessageA(caption, WM_SETTEXT, 0, LPARAM(typed.c_str()));
      PostMessageA(caption, WM_KEYDOWN, VK_RETURN, 0);
      if (!rule) break;
      const std::string message = AnswerRefusal();
      Sync(frame);
      EXPECT_NE(message.find("\"b.dwg\" was not renamed."), std::string::npos) << typed << ": " << message;
      EXPECT_NE(message.find(rule), std::string::npos) << typed << ": " << message;
      EXPECT_EQ(Names(view), (std::vector<std::string>{"b.dwg", "c.dwg"})) << typed;
      EXPECT_TRUE(ReadOnly(caption)) << typed;
    }
    Sync(frame);
    EXPECT_EQ(Names(view), (std::vector<std::string>{"c.dwg", "good.dwg"}));
  });
  EXPECT_EQ(FilesIn(Folder()), (std::vector<std::string>{"c.dwg", "good.dwg"}));
  EXPECT_EQ(GetFileAttributesA((Folder() + "\\..\\" + outside).c_str()), INVALID_FILE_ATTRIBUTES);
}

TEST_F(ThumbView, TheFolderShownAnewWhileARefusalIsUpLeavesNothingBehind) {
  constexpr int kSortByName = 32799;
  for (const char *name : {"b.dwg", "c.dwg"}) m_folder.File(name, "");
  Run(4 * 178 + 20, 400, [&](HWND frame, HWND view) {
    HWND caption = CaptionOf(view, "b.dwg");
    StartRename(frame, caption);
    SendMessageA(caption, WM_SETTEXT, 0, LPARAM("c.dwg"));
    PostMessageA(caption, WM_KEYDOWN, VK_RETURN, 0);
    // Inside the message's own loop the sort command builds every tile anew.
    AnswerRefusal([&] { SendMessageA(frame, WM_COMMAND, kSortByName, 0); });
    Sync(frame);
    EXPECT_FALSE(IsWindow(caption));
    EXPECT_EQ(Names(view), (std::vector<std::string>{"b.dwg", "c.dwg"}));
  });
  EXPECT_EQ(FilesIn(Folder()), (std::vector<std::string>{"b.dwg", "c.dwg"}));
}

TEST_F(ThumbView, ClickingAnotherTileEndsARenameAsEscapeDoes) {
  MakeDrawings(3);
  const BrowseOutcome outcome = Run(
      4 * 178 + 20, 400,
      [&](HWND frame, HWND view) {
        HWND caption = Tiles(view)[0].caption;
        StartRename(frame, caption);
        SendMessageA(caption, EM_SETSEL, 0, 4);  // "d000" of d000.dwg
        Post(frame, Tiles(view)[1].hwnd, WM_LBUTTONDOWN, MK_LBUTTON);
        EXPECT_EQ(WindowText(caption), "d000.dwg");
        EXPECT_TRUE(ReadOnly(caption));
        EXPECT_EQ(Marked(view), std::vector<int>{1});
        // No rename is left to take the Enter: it accepts the drawing clicked, and the frame goes.
        PostMessageA(caption, WM_KEYDOWN, VK_RETURN, 0);
      },
      0, 0, false);
  const std::string chosen = Folder() + "\\d001.dwg";
  ASSERT_FALSE(outcome.texts.empty());
  EXPECT_EQ(outcome.texts[0], std::wstring(chosen.begin(), chosen.end()));
  EXPECT_EQ(FilesIn(Folder()), Drawings(0, 3, 3));
}

TEST_F(ThumbView, EditingKeysMoveTheCaretOfACaptionBeingRenamedAndTheFramesKeysStayItsCommands) {
  MakeDrawings(12);
  Run(4 * 178 + 20, 400, [&](HWND frame, HWND view) {
    HWND caption = Tiles(view)[4].caption;  // d004.dwg
    StartRename(frame, caption);
    for (const auto &[key, caret] : std::vector<std::pair<WPARAM, int>>{{VK_HOME, 0}, {VK_END, 8}, {VK_LEFT, 7}, {VK_RIGHT, 8}}) {
      Post(frame, caption, WM_KEYDOWN, key);
      DWORD start = 99, end = 99;
      SendMessageA(caption, EM_GETSEL, reinterpret_cast<WPARAM>(&start), reinterpret_cast<LPARAM>(&end));
      EXPECT_EQ(start * 100 + end, DWORD(caret * 101)) << key;
      EXPECT_TRUE(IsWindow(caption) && !ReadOnly(caption)) << key;
    }
    SendMessageA(caption, EM_SETSEL, 0, 4);
    Post(frame, caption, WM_KEYDOWN, VK_DELETE);  // the frame's Delete clears the selected text
    EXPECT_EQ(WindowText(caption), ".dwg");
    Post(frame, caption, WM_KEYDOWN, VK_ESCAPE);
    EXPECT_EQ(WindowText(caption), "d004.dwg");
  });
  EXPECT_EQ(FilesIn(Folder()), Drawings(0, 12, 12));
}

TEST_F(ThumbView, AReusedCaptionBoxStartsClean) {
  MakeDrawings(40);  // 4 columns, 2 visible rows: a ring of 16 slots, d016 takes the slot of d000
  Run(4 * 178 + 20, 2 * m_step, [&](HWND frame, HWND view) {
    HWND first = Tiles(view)[0].caption;
    StartRename(frame, first);
    SendMessageA(first, WM_SETTEXT, 0, LPARAM("typed.dwg"));
    Post(frame, first, WM_KEYDOWN, VK_ESCAPE);
    for (int i = 0; i < 3; ++i) Post(frame, view, WM_VSCROLL, SB_LINEDOWN);
    ASSERT_EQ(Names(view), Drawings(12, 8, 40));
    HWND reused = CaptionOf(view, "d016.dwg");
    PostMessageA(reused, WM_LBUTTONDOWN, MK_LBUTTON, 0);
    Post(frame, reused, WM_LBUTTONUP, 0);
    Post(frame, view, WM_VSCROLL, SB_LINEUP);  // the view takes the focus from the caption
    EXPECT_EQ(Names(view, false), Drawings(8, 16, 40));
    StartRename(frame, Tiles(view)[8].caption);
    SendMessageA(Tiles(view)[8].caption, WM_SETTEXT, 0, LPARAM("moved.dwg"));
    Post(frame, Tiles(view)[8].caption, WM_KEYDOWN, VK_RETURN);
  });
  std::vector<std::string> expected = Drawings(0, 40, 40);
  expected[16] = "moved.dwg";
  std::sort(expected.begin(), expected.end());
  EXPECT_EQ(FilesIn(Folder()), expected);
}

TEST_F(ThumbView, WhatIsMarkedIsVisiblyMarkedAndDeleteTakesExactlyThat) {
  MakeDrawings(40);
  Run(4 * 178 + 20, 2 * m_step, [&](HWND frame, HWND view) {
    SendMessageA(frame, WM_COMMAND, kMarkAll, 0);
    EXPECT_EQ(Marked(view).size(), Tiles(view).size()) << "every caption of the ring shows its mark";
    Post(frame, Tiles(view)[1].hwnd, WM_LBUTTONDOWN, MK_LBUTTON);
    Post(frame, Tiles(view)[2].hwnd, WM_LBUTTONDOWN, MK_LBUTTON | MK_CONTROL);
    PostMessageA(Tiles(view)[2].caption, WM_LBUTTONDOWN, MK_LBUTTON, 0);
    Post(frame, Tiles(view)[2].caption, WM_LBUTTONUP, 0);
    EXPECT_EQ(Marked(view), (std::vector<int>{1, 2}));
    for (const WPARAM code : {SB_LINEDOWN, SB_LINEDOWN, SB_LINEDOWN, SB_LINEDOWN, SB_LINEUP, SB_LINEUP, SB_LINEUP, SB_LINEUP})
      Post(frame, view, WM_VSCROLL, code);
    EXPECT_EQ(Marked(view), (std::vector<int>{1, 2}));
    std::thread answer = Answer({'D'}, IDYES);
    Post(frame, Tiles(view)[2].hwnd, WM_RBUTTONDOWN, MK_RBUTTON);
    answer.join();
    Sync(frame);
  });
  std::vector<std::string> kept = Drawings(0, 40, 40);
  kept.erase(kept.begin() + 1, kept.begin() + 3);
  EXPECT_EQ(FilesIn(Folder()), kept);
  for (const char *name : {"d001.dwg", "d002.dwg"}) RemoveFromTrash(name);
}

TEST_F(ThumbView, TheTooltipNamesSizeAndDateOfEachTile) {
  const std::string file = m_folder.File("d000.dwg", "12345");
  SYSTEMTIME local{2026, 3, 0, 7, 9, 5, 8, 0}, utc;
  FILETIME written;
  TzSpecificLocalTimeToSystemTime(nullptr, &local, &utc);
  SystemTimeToFileTime(&utc, &written);
  HANDLE handle = CreateFileA(file.c_str(), FILE_WRITE_ATTRIBUTES, 0, nullptr, OPEN_EXISTING, 0, nullptr);
  SetFileTime(handle, nullptr, nullptr, &written);
  CloseHandle(handle);
  std::string text;
  Run(4 * 178 + 20, 400, [&](HWND frame, HWND view) {
    std::vector<HWND> windows;  // the view's tooltip is the one that knows the tile
    EnumThreadWindows(
        GetWindowThreadProcessId(frame, nullptr),
        [](HWND hwnd, LPARAM found) { return reinterpret_cast<std::vector<HWND> *>(found)->push_back(hwnd), TRUE; },
        reinterpret_cast<LPARAM>(&windows));
    char buffer[256] = "";
    const std::vector<Tile> tiles = Tiles(view);
    ASSERT_EQ(tiles.size(), 1u);
    HWND tile = tiles[0].hwnd;
    TTTOOLINFOA tool{sizeof tool, 0, tile, reinterpret_cast<UINT_PTR>(tile), {}, nullptr, buffer, 0, nullptr};
    for (HWND tip : windows)
      if (!*buffer) SendMessageA(tip, TTM_GETTEXTA, sizeof buffer, reinterpret_cast<LPARAM>(&tool));
    text = buffer;
  });
  EXPECT_EQ(text, "d000.dwg" + std::string(12, ' ') + "Size=5" + std::string(14, ' ') + "07/03/2026;09.05.08");
}

// What the browse's thread is sent while a test watches it: tiles created in the view, focus lost
// by the search box, the view shown or hidden.
struct SentRecord {
  static inline HWND view, box;
  static inline int tilesCreated, boxFocusLost, viewShownOrHidden;
  static LRESULT CALLBACK Hook(int code, WPARAM wParam, LPARAM lParam) {
    const CWPSTRUCT &sent = *reinterpret_cast<CWPSTRUCT *>(lParam);
    char name[16] = "";
    if (sent.message == WM_CREATE && GetParent(sent.hwnd) == view && GetClassNameA(sent.hwnd, name, sizeof name) &&
        std::string(name) == "FwWnd")
      ++tilesCreated;
    if (sent.message == WM_KILLFOCUS && sent.hwnd == box) ++boxFocusLost;
    if (sent.message == WM_SHOWWINDOW && sent.hwnd == view) ++viewShownOrHidden;
    return CallNextHookEx(nullptr, code, wParam, lParam);
  }
};

HWND FocusOf(HWND frame) {
  GUITHREADINFO info{};
  info.cbSize = sizeof info;
  GetGUIThreadInfo(GetWindowThreadProcessId(frame, nullptr), &info);
  return info.hwndFocus;
}

TEST_F(ThumbView, ATypedSearchBuildsTheRingOnceInPlaceAndKeepsTheFocus) {
  const std::vector<std::pair<WPARAM, int>> keys{{'d', 0}, {'1', 100}, {'1', 108}};  // the first record shown
  MakeDrawings(120);
  Run(4 * 178 + 20, 4 * m_step, [&](HWND frame, HWND view) {
    Post(frame, SearchBox(frame), WM_LBUTTONDOWN, MK_LBUTTON);
    Post(frame, SearchBox(frame), WM_LBUTTONUP, 0);
    ASSERT_EQ(FocusOf(frame), SearchBox(frame));
    SentRecord::view = view;
    SentRecord::box = SearchBox(frame);
    HHOOK hook = SetWindowsHookExA(WH_CALLWNDPROC, SentRecord::Hook, nullptr, GetWindowThreadProcessId(frame, nullptr));
    for (const auto &[key, first] : keys) {
      SentRecord::tilesCreated = SentRecord::boxFocusLost = SentRecord::viewShownOrHidden = 0;
      Post(frame, SearchBox(frame), WM_CHAR, key);
      EXPECT_EQ(Names(view), Drawings(first, 16, 120)) << char(key);
      EXPECT_EQ(SentRecord::tilesCreated, std::min(24, 120 - first)) << char(key);
      EXPECT_EQ(SentRecord::boxFocusLost, 0) << char(key);
      EXPECT_EQ(SentRecord::viewShownOrHidden, 0) << char(key);
      EXPECT_EQ(FocusOf(frame), SearchBox(frame)) << char(key);
    }
    UnhookWindowsHookEx(hook);
  });
}

TEST_F(ThumbView, TheThumbJumpsToItsRowOfAHundredThousandAndTheLineKeysGoOnFromThere) {
  constexpr int kRecords = 100000, kLastTop = kRecords / 4 - 4;
  const auto drawings = [&](int first, int count) {
    std::vector<std::string> names;
    char name[16];
    for (int i = first; i < std::min(kRecords, first + count); ++i)
      names.push_back((std::snprintf(name, 16, "d%06d.dwg", i), name));
    return names;
  };
  Run(
      4 * 178 + 20, 4 * m_step,
      [&](HWND frame, HWND view) {
        SCROLLINFO bar{};
        bar.cbSize = sizeof bar;
        bar.fMask = SIF_ALL;
        GetScrollInfo(view, SB_VERT, &bar);
        const int limit = bar.nMax - static_cast<int>(bar.nPage) + 1, middle = limit / 2;
        const int row = static_cast<int>(static_cast<long long>(middle) * kLastTop / limit);
        ASSERT_NEAR(row, kLastTop / 2, 1);
        // While dragged the thumb names its row and leaves the tiles; let go, the rows are built there.
        Post(frame, view, WM_VSCROLL, MAKEWPARAM(SB_THUMBTRACK, middle));
        char status[64] = "";
        SendMessageA(FindWindowExA(frame, nullptr, STATUSCLASSNAMEA, nullptr), SB_GETTEXTA, 0, reinterpret_cast<LPARAM>(status));
        EXPECT_EQ(status, drawings(row * 4, 1)[0]);
        EXPECT_EQ(Names(view), drawings(0, 16));
        Post(frame, view, WM_VSCROLL, MAKEWPARAM(SB_THUMBPOSITION, middle));
        ASSERT_EQ(Names(view), drawings(row * 4, 16));
        EXPECT_NEAR(GetScrollPos(view, SB_VERT), middle, m_step);
        // Down and back up past the row of the jump, every visible row filled in its place.
        const std::vector<std::pair<WPARAM, int>> steps{{SB_LINEDOWN, 1}, {SB_LINEDOWN, 2}, {SB_LINEUP, 1},  {SB_LINEUP, 0},
                                                        {SB_LINEUP, -1},  {SB_LINEUP, -2},  {SB_LINEUP, -3}, {SB_LINEDOWN, -2}};
        for (const auto &[step, offset] : steps) {
          Post(frame, view, WM_VSCROLL, step);
          EXPECT_EQ(Names(view), drawings((row + offset) * 4, 16)) << offset;
        }
        // The thumb let go at the end of its track shows the last rows.
        Post(frame, view, WM_VSCROLL, MAKEWPARAM(SB_THUMBPOSITION, limit));
        EXPECT_EQ(Names(view), drawings(kLastTop * 4, 16));
        Post(frame, view, WM_VSCROLL, SB_LINEUP);
        EXPECT_EQ(Names(view), drawings((kLastTop - 1) * 4, 16));
      },
      0, 0, true, "Z:\\tmp\\lumvex-test-view-100k");  // made by the build, empty drawings
}
}  // namespace
