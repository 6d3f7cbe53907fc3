// The thumbnail view of a browse call on real windows: the ring of tiles and its geometry,
// scrolling by keys, wheel and scroll bar, picture sizes, marks, accept, search, rename and the
// tooltip's text. A watcher thread acts on the windows as a person would.
#include "ExplorerHarness.h"
#include "ScratchFolder.h"

#include <gtest/gtest.h>
#include <ole2.h>
#include <shellapi.h>

#include <array>
#include <cstdio>
#include <ctime>

namespace {
constexpr int kIncrease = 32774, kDecrease = 32775, kMarkAll = 32793, kCopy = 57634, kCancel = 32796;
constexpr int kRefreshFolder = WM_APP + 0x10;

int CaptionHeight() {
  HDC screen = GetDC(nullptr);
  TEXTMETRICA metrics{};
  GetTextMetricsA(screen, &metrics);
  ReleaseDC(nullptr, screen);
  return metrics.tmHeight + 2 + GetSystemMetrics(SM_CYEDGE);
}

struct Tile {
  HWND hwnd;
  RECT rect;
  std::string caption;
  bool marked;
};

HWND ViewOf(HWND frame) { return GetDlgItem(GetDlgItem(frame, 0xE900), 0xE901); }

// Tile windows in the view's client coordinates with the caption box beneath each, top-left first.
std::vector<Tile> Tiles(HWND view) {
  std::vector<Tile> tiles;
  for (HWND tile : Children(view, "FwWnd")) {
    Tile t{tile, {}, "", false};
    GetWindowRect(tile, &t.rect);
    MapWindowPoints(nullptr, view, reinterpret_cast<POINT *>(&t.rect), 2);
    for (HWND edit : Children(view, "Edit")) {
      RECT r;
      GetWindowRect(edit, &r);
      MapWindowPoints(nullptr, view, reinterpret_cast<POINT *>(&r), 2);
      if (r.top != t.rect.bottom + GetSystemMetrics(SM_CYEDGE) || r.left != t.rect.left + GetSystemMetrics(SM_CXEDGE)) continue;
      t.caption = WindowText(edit);
      DWORD start = 0, end = 0;
      SendMessageA(edit, EM_GETSEL, reinterpret_cast<WPARAM>(&start), reinterpret_cast<LPARAM>(&end));
      t.marked = end > start;
    }
    tiles.push_back(t);
  }
  std::sort(tiles.begin(), tiles.end(), [](const Tile &a, const Tile &b) {
    return a.rect.top != b.rect.top ? a.rect.top < b.rect.top : a.rect.left < b.rect.left;
  });
  return tiles;
}

// Captions of the tiles that show inside the client area.
std::vector<std::string> Visible(HWND view) {
  RECT client;
  GetClientRect(view, &client);
  std::vector<std::string> names;
  for (const Tile &t : Tiles(view))
    if (t.rect.bottom > 0 && t.rect.top < client.bottom) names.push_back(t.caption);
  return names;
}

// The names the view should show from record `first` for `rows` rows of `columns`.
std::vector<std::string> Expected(int first, int rows, int columns, int records) {
  std::vector<std::string> names;
  for (int i = first; i < std::min(records, first + rows * columns); ++i) {
    char name[16];
    std::snprintf(name, sizeof name, "d%03d.dwg", i);
    names.push_back(name);
  }
  return names;
}

// Posted input has been handled, and what it posted in turn, once two markers posted after it
// (a limit of the search box's text) have arrived: a thread takes its posted messages in order.
void Sync(HWND frame) {
  static WPARAM marker = 100000;
  HWND box = Children(ToolBars(frame)[0], "Edit")[0];
  for (int round = 0; round < 2; ++round) {
    PostMessageA(box, EM_SETLIMITTEXT, ++marker, 0);
    for (int waited = 0; waited < 10000 && WPARAM(SendMessageA(box, EM_GETLIMITTEXT, 0, 0)) != marker; ++waited) Sleep(1);
  }
}

void Key(HWND frame, HWND target, WPARAM key) {
  PostMessageA(target, WM_KEYDOWN, key, 0);
  Sync(frame);
}

// Sizes the frame so that the view's client area is width x height.
void SizeView(HWND frame, int width, int height) {
  RECT client, window;
  GetClientRect(ViewOf(frame), &client);
  GetWindowRect(frame, &window);
  SetWindowPos(frame, nullptr, 0, 0, window.right - window.left + width - client.right,
               window.bottom - window.top + height - client.bottom, SWP_NOMOVE | SWP_NOZORDER);
  Sync(frame);
}

std::string State(int pictureWidth = 0, int pictureHeight = 0) {
  return "[Size]\r\nSplitterSize=120\r\nWindowWidth=1000\r\nWindowHeight=700\r\n\r\n[View]\r\nPictureWidth=" +
         std::to_string(pictureWidth) + "\r\nPictureHeight=" + std::to_string(pictureHeight) + "\r\nSort=0\r\n";
}

class ThumbView : public ::testing::Test {
 protected:
  static void SetUpTestSuite() { OleInitialize(nullptr); }
  static void TearDownTestSuite() { OleUninitialize(); }
  void SetUp() override { ASSERT_EQ(m_module.LoadResult(), kDevhostLoaded); }

  // A folder of `count` empty drawings d000.dwg, d001.dwg, ...
  void MakeDrawings(int count) {
    for (int i = 0; i < count; ++i) m_folder.File(Expected(i, 1, 1, count)[0], "");
  }
  BrowseOutcome BrowseFolder(const std::function<void(HWND frame, HWND view)> &watcher, const std::string &state = State()) {
    m_state.Write(state);
    const std::string folder = m_folder.Path() + "\\";
    return Browse(BrowseArgs(std::wstring(folder.begin(), folder.end()).c_str()), [&](HWND frame) {
      watcher(frame, ViewOf(frame));
      PostMessageA(frame, WM_COMMAND, kCancel, 0);
    });
  }

  StateFileGuard m_state;
  LoadedModule m_module;
  ScratchFolder m_folder{"thumbview"};
};

TEST_F(ThumbView, RingGeometryFromTheClientSize) {
  struct Case {
    int drawings, width, height;
    std::vector<POINT> corners;  // of every tile window, in rows of columns
  };
  const int step = 143 + CaptionHeight();
  MakeDrawings(3);
  for (const Case &c : std::vector<Case>{{3, 4 * 178 + 20, 400, {{0, 0}, {178, 0}, {356, 0}}},
                                         {3, 100, 3 * step, {{0, 0}, {0, step}, {0, 2 * step}}}}) {
    BrowseFolder([&](HWND frame, HWND view) {
      SizeView(frame, c.width, c.height);
      std::vector<POINT> corners;
      for (const Tile &t : Tiles(view)) corners.push_back({t.rect.left, t.rect.top});
      ASSERT_EQ(corners.size(), c.corners.size()) << c.width;
      for (size_t i = 0; i < corners.size(); ++i) EXPECT_TRUE(corners[i].x == c.corners[i].x && corners[i].y == c.corners[i].y);
      EXPECT_EQ(Visible(view), Expected(0, 3, 1, 3));
    });
  }
}

TEST_F(ThumbView, KeysWheelAndScrollBarKeepEveryVisibleRowFilled) {
  struct Case {
    const char *action;
    std::function<void(HWND frame, HWND view)> act;
    int firstRecord;
  };
  const auto key = [](WPARAM k) { return [k](HWND frame, HWND view) { Key(frame, view, k); }; };
  const auto bar = [](WPARAM code) { return [code](HWND, HWND view) { SendMessageA(view, WM_VSCROLL, code, 0); }; };
  const auto wheel = [](short delta) {
    return [delta](HWND, HWND view) { SendMessageA(view, WM_MOUSEWHEEL, MAKEWPARAM(0, static_cast<WORD>(delta)), 0); };
  };
  const auto search = [](const char *text) {
    return [text](HWND frame, HWND) { SendMessageA(Children(ToolBars(frame)[0], "Edit")[0], WM_SETTEXT, 0, LPARAM(text)); };
  };
  const std::vector<Case> cases{{"down", key(VK_DOWN), 4},
                                {"up", key(VK_UP), 0},
                                {"up at row 0", key(VK_UP), 0},
                                {"page down", key(VK_NEXT), 16},
                                {"page up", key(VK_PRIOR), 0},
                                {"end", key(VK_END), 104},
                                {"down at the end", key(VK_DOWN), 104},
                                {"page up from 26", key(VK_PRIOR), 88},
                                {"home", key(VK_HOME), 0},
                                {"wheel down", wheel(-WHEEL_DELTA), 12},
                                {"wheel up", wheel(WHEEL_DELTA), 0},
                                {"bar bottom", bar(SB_BOTTOM), 104},
                                {"bar top", bar(SB_TOP), 0},
                                {"thumb two rows", bar(MAKEWPARAM(SB_THUMBTRACK, 330)), 4},
                                {"search in the last row", search("d119"), 116}};
  MakeDrawings(120);
  const int step = 143 + CaptionHeight();
  BrowseFolder([&](HWND frame, HWND view) {
    SizeView(frame, 4 * 178 + 20, 4 * step);
    for (const Case &c : cases) {
      c.act(frame, view);
      EXPECT_EQ(Visible(view), Expected(c.firstRecord, 4, 4, 120)) << c.action;
      EXPECT_LE(Tiles(view).size(), 24u) << c.action;
    }
  });
}

TEST_F(ThumbView, TheScrollBarWrapsAtTheCappedRange) {
  MakeDrawings(1000);
  BrowseFolder(
      [&](HWND frame, HWND view) {
        SizeView(frame, 100, 640);
        for (int i = 0; i < 199; ++i) SendMessageA(view, WM_VSCROLL, SB_LINEDOWN, 0);
        EXPECT_EQ(GetScrollPos(view, SB_VERT), 31840);
        SendMessageA(view, WM_VSCROLL, SB_LINEDOWN, 0);
        EXPECT_EQ(GetScrollPos(view, SB_VERT), 160);
        EXPECT_EQ(Visible(view), Expected(200, 4, 1, 1000));
      },
      State(100, 160 - CaptionHeight()));
}

TEST_F(ThumbView, PictureSizesStepAndKeepTheTopRowsFirstDrawing) {
  const std::vector<std::array<int, 3>> steps{
      {kIncrease, 216, 179}, {kIncrease, 270, 224}, {kIncrease, 338, 280}, {kIncrease, 423, 350}, {kIncrease, 423, 350},
      {kDecrease, 338, 280}, {kDecrease, 270, 224}, {kDecrease, 216, 179}, {kDecrease, 173, 143}, {kDecrease, 138, 114},
      {kDecrease, 110, 91},  {kDecrease, 88, 73},   {kDecrease, 70, 58},   {kDecrease, 56, 46},   {kDecrease, 45, 37},
      {kDecrease, 36, 30},   {kDecrease, 29, 24},   {kDecrease, 23, 19},   {kDecrease, 23, 19}};
  MakeDrawings(30);
  BrowseFolder([&](HWND frame, HWND view) {
    SizeView(frame, 4 * 178 + 20, 400);
    SendMessageA(Children(ToolBars(frame)[0], "Edit")[0], WM_SETTEXT, 0, LPARAM("d010"));
    for (const auto &s : steps) {
      const std::string first = Tiles(view)[0].caption;
      SendMessageA(frame, WM_COMMAND, s[0], 0);
      const std::vector<Tile> tiles = Tiles(view);
      ASSERT_FALSE(tiles.empty());
      EXPECT_EQ(tiles[0].rect.right - tiles[0].rect.left, s[1]);
      EXPECT_EQ(tiles[0].rect.bottom - tiles[0].rect.top, s[2]);
      bool inTopRow = false;
      for (const Tile &t : tiles) inTopRow |= t.rect.top == 0 && t.caption == first;
      EXPECT_TRUE(inTopRow) << s[1];
    }
  });
}

bool AcceptEnabled(HWND frame) { return SendMessageA(ToolBars(frame)[1], TB_ISBUTTONENABLED, 32795, 0) != 0; }

std::vector<int> Marked(HWND view) {
  std::vector<int> marked;
  const std::vector<Tile> tiles = Tiles(view);
  for (size_t i = 0; i < tiles.size(); ++i)
    if (tiles[i].marked) marked.push_back(static_cast<int>(i));
  return marked;
}

int ClipboardFileCount() {
  int count = -1;
  if (OpenClipboard(nullptr)) {
    if (HANDLE drop = GetClipboardData(CF_HDROP)) count = static_cast<int>(DragQueryFileA(HDROP(drop), 0xFFFFFFFF, nullptr, 0));
    CloseClipboard();
  }
  return count;
}

// The context menu the thread shows now, answered with keys once it is there.
void AnswerMenu(const std::vector<WPARAM> &keys) {
  HWND menu = WaitForWindow("#32768", nullptr, 5000);
  for (WPARAM key : keys) PostMessageA(menu, WM_KEYDOWN, key, 0);
}

TEST_F(ThumbView, ClicksMarkDrawingsAndTheMenusActOnEveryMark) {
  struct Case {
    const char *action;
    UINT message;
    int tile;
    WPARAM buttons;
    std::vector<int> marked;
    bool accept;
    const char *title;  // after the folder; null when unchanged
  };
  const std::vector<Case> cases{{"click", WM_LBUTTONDOWN, 0, MK_LBUTTON, {0}, true, "\\d000.dwg"},
                                {"ctrl+click marks", WM_LBUTTONDOWN, 1, MK_LBUTTON | MK_CONTROL, {0, 1}, true, "\\d001.dwg"},
                                {"ctrl+click unmarks", WM_LBUTTONDOWN, 1, MK_LBUTTON | MK_CONTROL, {0}, false, ""},
                                {"shift+click", WM_LBUTTONDOWN, 2, MK_LBUTTON | MK_SHIFT, {0}, false, nullptr},
                                {"click after ctrl+clicks", WM_LBUTTONDOWN, 2, MK_LBUTTON, {2}, true, "\\d002.dwg"},
                                {"right click adds", WM_RBUTTONDOWN, 3, MK_RBUTTON, {2, 3}, true, "\\d003.dwg"}};
  MakeDrawings(6);
  int copiedFromMenu = 0, copiedAll = 0;
  BrowseFolder([&](HWND frame, HWND view) {
    SizeView(frame, 4 * 178 + 20, 400);
    const std::vector<Tile> tiles = Tiles(view);
    std::string title = WindowText(frame);
    for (const Case &c : cases) {
      std::thread menu;
      if (c.message == WM_RBUTTONDOWN) menu = std::thread(AnswerMenu, std::vector<WPARAM>{VK_DOWN, VK_RETURN});  // &Copy
      PostMessageA(tiles[c.tile].hwnd, c.message, c.buttons, 0);
      if (menu.joinable()) menu.join();
      Sync(frame);
      if (c.title) title = m_folder.Path() + c.title;
      EXPECT_EQ(Marked(view), c.marked) << c.action;
      EXPECT_EQ(AcceptEnabled(frame), c.accept) << c.action;
      EXPECT_EQ(WindowText(frame), title) << c.action;
    }
    copiedFromMenu = ClipboardFileCount();
    SendMessageA(frame, WM_COMMAND, kMarkAll, 0);
    SendMessageA(frame, WM_COMMAND, kCopy, 0);
    copiedAll = ClipboardFileCount();
  });
  EXPECT_EQ(copiedFromMenu, 2);
  EXPECT_EQ(copiedAll, 6);
}

TEST_F(ThumbView, DoubleClickAcceptsTheDrawingAsANestedList) {
  MakeDrawings(3);
  m_state.Write(State());
  const std::string folder = m_folder.Path() + "\\";
  std::thread watch([] {
    HWND frame = WaitForFrame();
    HWND tile = Tiles(ViewOf(frame))[1].hwnd;
    PostMessageA(tile, WM_LBUTTONDOWN, MK_LBUTTON, 0);
    PostMessageA(tile, WM_LBUTTONDBLCLK, MK_LBUTTON, 0);
  });
  devhostInvoke(L"Lumvex", BrowseArgs(std::wstring(folder.begin(), folder.end()).c_str()));
  watch.join();
  std::vector<std::pair<int, std::wstring>> shape;
  resbuf *result = devhostResultCopy();
  for (resbuf *node = result; node; node = node->rbnext)
    shape.emplace_back(node->restype, node->restype == RTSTR ? node->resval.rstring : L"");
  acutRelRb(result);
  devhostClearResult();
  std::string path = folder + "d001.dwg";
  for (char &ch : path) ch = static_cast<char>(tolower(static_cast<unsigned char>(ch)));
  const std::vector<std::pair<int, std::wstring>> expected{
      {RTSTR, std::wstring(path.begin(), path.end())}, {RTLB, L""}, {RTSTR, L""}, {RTSTR, L""}, {RTSTR, L""}, {RTLE, L""}};
  EXPECT_EQ(shape, expected);
}

TEST_F(ThumbView, SearchFindsByPrefixAndClickingTheBoxEmptiesIt) {
  struct Case {
    const char *text;
    std::vector<int> marked;
    const char *title;
  };
  for (const char *name : {"a.dwg", "Plan.dwg", "plot.dwg"}) m_folder.File(name, "");
  BrowseFolder([&](HWND frame, HWND view) {
    HWND box = Children(ToolBars(frame)[0], "Edit")[0];
    for (const Case &c : std::vector<Case>{{"pl", {1}, "\\plan.dwg"}, {"a.dwg", {}, "\\a.dwg"}}) {
      SendMessageA(ToolBars(frame)[1], TB_ENABLEBUTTON, 32795, FALSE);
      SendMessageA(box, WM_SETTEXT, 0, LPARAM(c.text));
      EXPECT_EQ(Marked(view), c.marked) << c.text;
      EXPECT_EQ(WindowText(frame), m_folder.Path() + c.title) << c.text;
      EXPECT_TRUE(AcceptEnabled(frame)) << c.text;
    }
    PostMessageA(box, WM_LBUTTONDOWN, MK_LBUTTON, 0);
    Sync(frame);
    EXPECT_EQ(WindowText(box), "");
    EXPECT_EQ(WindowText(frame), m_folder.Path() + "\\a.dwg");
  });
}

TEST_F(ThumbView, RenameInPlaceOrGiveUp) {
  struct Case {
    const char *how;
    const char *typed;
    std::function<void(HWND frame, HWND caption)> end;
    std::vector<std::string> captions;
  };
  const auto key = [](WPARAM k) { return [k](HWND frame, HWND caption) { Key(frame, caption, k); }; };
  const std::vector<Case> cases{{"enter", "e.dwg", key(VK_RETURN), {"c.dwg", "e.dwg"}},
                                {"refused by the shell", "e.dwg", key(VK_RETURN), {"c.dwg", "e.dwg"}},
                                {"escape", "x.dwg", key(VK_ESCAPE), {"c.dwg", "e.dwg"}},
                                {"focus leaves", "x.dwg", key(VK_TAB), {"c.dwg", "e.dwg"}},
                                {"home rebuilds", "x.dwg", key(VK_HOME), {"c.dwg", "e.dwg"}}};
  for (const char *name : {"b.dwg", "c.dwg"}) m_folder.File(name, "");
  BrowseFolder([&](HWND frame, HWND view) {
    for (const Case &c : cases) {
      HWND caption = nullptr;
      for (HWND edit : Children(view, "Edit"))
        if (WindowText(edit) == Tiles(view)[0].caption) caption = edit;
      PostMessageA(caption, WM_LBUTTONDOWN, MK_LBUTTON, 0);
      PostMessageA(caption, WM_LBUTTONUP, 0, 0);
      PostMessageA(caption, WM_LBUTTONDBLCLK, MK_LBUTTON, 0);
      Sync(frame);
      EXPECT_EQ(GetWindowLongA(caption, GWL_STYLE) & ES_READONLY, 0) << c.how;
      SendMessageA(caption, WM_SETTEXT, 0, LPARAM(c.typed));
      c.end(frame, caption);
      Sync(frame);
      std::vector<std::string> captions;
      for (const Tile &t : Tiles(view)) captions.push_back(t.caption);
      EXPECT_EQ(captions, c.captions) << c.how;
    }
  });
  EXPECT_EQ(GetFileAttributesA(m_folder.File("b.dwg").c_str()), INVALID_FILE_ATTRIBUTES);
  EXPECT_NE(GetFileAttributesA(m_folder.File("e.dwg").c_str()), INVALID_FILE_ATTRIBUTES);
  EXPECT_EQ(GetFileAttributesA(m_folder.File("x.dwg").c_str()), INVALID_FILE_ATTRIBUTES);
}

TEST_F(ThumbView, TheTooltipNamesSizeAndDateOfEachTile) {
  const std::string file = m_folder.File("d000.dwg", "12345");
  SYSTEMTIME local{2026, 3, 0, 7, 9, 5, 8, 0}, utc;
  TzSpecificLocalTimeToSystemTime(nullptr, &local, &utc);
  FILETIME written;
  SystemTimeToFileTime(&utc, &written);
  HANDLE handle = CreateFileA(file.c_str(), FILE_WRITE_ATTRIBUTES, 0, nullptr, OPEN_EXISTING, 0, nullptr);
  SetFileTime(handle, nullptr, nullptr, &written);
  CloseHandle(handle);
  std::string text;
  size_t tools = 0;
  BrowseFolder([&](HWND frame, HWND view) {
    // The view's tooltip is the one that knows the tile.
    std::vector<HWND> windows;
    EnumThreadWindows(
        GetWindowThreadProcessId(frame, nullptr),
        [](HWND hwnd, LPARAM found) {
          reinterpret_cast<std::vector<HWND> *>(found)->push_back(hwnd);
          return TRUE;
        },
        reinterpret_cast<LPARAM>(&windows));
    char buffer[256] = "";
    TTTOOLINFOA tool{sizeof tool, 0, Tiles(view)[0].hwnd, reinterpret_cast<UINT_PTR>(Tiles(view)[0].hwnd), {}, nullptr, buffer, 0,
                     nullptr};
    for (HWND tip : windows) {
      SendMessageA(tip, TTM_GETTEXTA, sizeof buffer, reinterpret_cast<LPARAM>(&tool));
      if (*buffer && text.empty()) tools = static_cast<size_t>(SendMessageA(tip, TTM_GETTOOLCOUNT, 0, 0)), text = buffer;
    }
  });
  EXPECT_EQ(tools, 1u);
  EXPECT_EQ(text, "d000.dwg" + std::string(12, ' ') + "Size=5" + std::string(14, ' ') + "07/03/2026;09.05.08");
}
}  // namespace
