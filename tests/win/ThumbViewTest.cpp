// The thumbnail view of a browse call on real windows: the ring of tiles and its geometry,
// scrolling by keys, wheel and scroll bar, picture sizes, marks and both context menus, accept,
// search, rename and the tooltip's text. A watcher thread acts on the windows as a person would.
#include "ExplorerHarness.h"
#include "ScratchFolder.h"

#include <gtest/gtest.h>
#include <shellapi.h>

#include <array>
#include <cstdio>

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
  for (int round = 0; round < 2; ++round) {
    PostMessageA(SearchBox(frame), EM_SETLIMITTEXT, ++marker, 0);
    for (int waited = 0; waited < 10000 && WPARAM(SendMessageA(SearchBox(frame), EM_GETLIMITTEXT, 0, 0)) != marker; ++waited)
      Sleep(1);
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

bool AcceptEnabled(HWND frame) { return SendMessageA(ToolBars(frame)[1], TB_ISBUTTONENABLED, 32795, 0) != 0; }

class ThumbView : public BrowseTest {
 protected:
  // Browses the scratch folder with the given picture size; the watcher's view is width x height.
  BrowseOutcome Run(int width, int height, const std::function<void(HWND frame, HWND view)> &watcher, int pictureWidth = 0,
                    int pictureHeight = 0, bool cancel = true) {
    m_state.Write("[Size]\r\nSplitterSize=120\r\nWindowWidth=1000\r\nWindowHeight=700\r\n\r\n[View]\r\nPictureWidth=" +
                  std::to_string(pictureWidth) + "\r\nPictureHeight=" + std::to_string(pictureHeight) + "\r\nSort=0\r\n");
    const std::string folder = Folder() + "\\";
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
  constexpr WPARAM kWheelDown = 0xFF88u << 16, kWheelUp = WHEEL_DELTA << 16, kThumbTo330 = 330 << 16 | SB_THUMBTRACK;
  const std::vector<std::array<WPARAM, 3>> cases{
      {WM_KEYDOWN, VK_DOWN, 4},  {WM_KEYDOWN, VK_UP, 0},          {WM_KEYDOWN, VK_UP, 0},       {WM_KEYDOWN, VK_NEXT, 16},
      {WM_KEYDOWN, VK_PRIOR, 0}, {WM_KEYDOWN, VK_END, 104},       {WM_KEYDOWN, VK_DOWN, 104},   {WM_KEYDOWN, VK_PRIOR, 88},
      {WM_KEYDOWN, VK_HOME, 0},  {WM_MOUSEWHEEL, kWheelDown, 12}, {WM_MOUSEWHEEL, kWheelUp, 0}, {WM_VSCROLL, SB_BOTTOM, 104},
      {WM_VSCROLL, SB_TOP, 0},   {WM_VSCROLL, kThumbTo330, 4}};
  MakeDrawings(120);
  Run(4 * 178 + 20, 4 * m_step, [&](HWND frame, HWND view) {
    for (const auto &[message, wParam, firstRecord] : cases) {
      Post(frame, view, static_cast<UINT>(message), wParam);
      EXPECT_EQ(Names(view), Drawings(static_cast<int>(firstRecord), 16, 120)) << message << " " << wParam;
      EXPECT_LE(Tiles(view).size(), 24u);
    }
    SendMessageA(SearchBox(frame), WM_SETTEXT, 0, LPARAM("d119"));  // the last row at the top
    EXPECT_EQ(Names(view), Drawings(116, 4, 120));
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
    HWND menu = WaitForWindow("#32768", nullptr, 5000);
    for (WPARAM key : keys) PostMessageA(menu, WM_KEYDOWN, key, 0);
    if (HWND confirm = confirmButton ? WaitForWindow("#32770", "Confirm file deletion", 5000) : nullptr)
      SendMessageA(GetDlgItem(confirm, confirmButton), BM_CLICK, 0, 0);
  });
}

int ClipboardFileCount() {
  int count = -1;
  if (!OpenClipboard(nullptr)) return count;
  if (HANDLE drop = GetClipboardData(CF_HDROP)) count = static_cast<int>(DragQueryFileA(HDROP(drop), 0xFFFFFFFF, nullptr, 0));
  CloseClipboard();
  return count;
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
  int copiedFromMenu = 0, copiedAll = 0;
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
      if (c.menu.size() == 2) copiedFromMenu = ClipboardFileCount();
    }
    SendMessageA(frame, WM_COMMAND, kMarkAll, 0);
    SendMessageA(frame, WM_COMMAND, kCopy, 0);
    copiedAll = ClipboardFileCount();
    PutFileOnClipboard(other);
    std::thread answer = Answer({'P'});
    Post(frame, view, WM_RBUTTONDOWN, MK_RBUTTON, MAKELPARAM(4 * 178 + 10, 5));  // the background's &Paste
    answer.join();
    Sync(frame);
    EXPECT_EQ(Names(view, false).back(), "new.dwg");
  });
  EXPECT_EQ(copiedFromMenu, 2);
  EXPECT_EQ(copiedAll, 6);
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

TEST_F(ThumbView, RenameInPlaceOrGiveUp) {
  const std::vector<std::pair<const char *, WPARAM>> cases{
      {"e.dwg", VK_RETURN}, {"e.dwg", VK_RETURN}, {"x.dwg", VK_ESCAPE}, {"x.dwg", VK_TAB}, {"x.dwg", VK_HOME}};
  for (const char *name : {"b.dwg", "c.dwg"}) m_folder.File(name, "");
  Run(4 * 178 + 20, 400, [&](HWND frame, HWND view) {
    for (const auto &[typed, key] : cases) {
      HWND caption = Tiles(view)[0].caption;  // b.dwg, then c.dwg (renaming onto e.dwg is refused)
      PostMessageA(caption, WM_LBUTTONDOWN, MK_LBUTTON, 0);
      PostMessageA(caption, WM_LBUTTONUP, 0, 0);
      Post(frame, caption, WM_LBUTTONDBLCLK, MK_LBUTTON);
      EXPECT_EQ(GetWindowLongA(caption, GWL_STYLE) & ES_READONLY, 0);
      SendMessageA(caption, WM_SETTEXT, 0, LPARAM(typed));
      Post(frame, caption, WM_KEYDOWN, key);
      EXPECT_EQ(Names(view), (std::vector<std::string>{"c.dwg", "e.dwg"})) << key;
    }
  });
  EXPECT_EQ(GetFileAttributesA(m_folder.File("b.dwg").c_str()), INVALID_FILE_ATTRIBUTES);
  EXPECT_EQ(GetFileAttributesA(m_folder.File("x.dwg").c_str()), INVALID_FILE_ATTRIBUTES);
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
}  // namespace
