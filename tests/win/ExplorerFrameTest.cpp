// The explorer frame of a browse call, on real windows: layout, commands, check marks, how the
// browse ends and what it leaves in the state file.
#include "ExplorerHarness.h"
#include "ScratchFolder.h"

#include <gtest/gtest.h>
#include <shlobj.h>

namespace {
constexpr int kAccept = 32795;
constexpr int kCancel = 32796;
constexpr int kSortByName = 32799;
constexpr int kSortByDate = 32788;
constexpr int kSortBySize = 32789;
constexpr int kAppExit = 0xE141;
constexpr int kViewToolbar = 0xE800;
constexpr int kViewStatusBar = 0xE801;
constexpr int kEditPaste = 0xE125;

std::string StateFile(int sort, int width, int height, const std::string &path = "", const std::string &name = "",
                      const std::string &shellPath = "") {
  std::ostringstream ini;
  ini << "[CurrentPath]\r\nPath=" << path << "\r\nName=" << name << "\r\nShellPath=" << shellPath << "\r\n\r\n"
      << "[Size]\r\nSplitterSize=150\r\nWindowWidth=" << width << "\r\nWindowHeight=" << height << "\r\n\r\n"
      << "[View]\r\nPictureWidth=0\r\nPictureHeight=0\r\nSort=" << sort << "\r\n\r\n";
  return ini.str();
}

std::string IniValue(const std::string &ini, const std::string &key) {
  const std::string marker = "\r\n" + key + "=";
  const size_t at = ini.find(marker);
  if (at == std::string::npos) return "<missing>";
  const size_t start = at + marker.size();
  return ini.substr(start, ini.find("\r\n", start) - start);
}

void Command(HWND frame, int id) { PostMessageA(frame, WM_COMMAND, id, 0); }
std::string StatusText(HWND frame) {
  char text[128] = "";
  SendMessageA(FindWindowExA(frame, nullptr, STATUSCLASSNAMEA, nullptr), SB_GETTEXTA, 0, reinterpret_cast<LPARAM>(text));
  return text;
}

using ExplorerFrame = BrowseTest;

TEST_F(ExplorerFrame, LayoutOfToolBarsLabelsCaptionsAndStatusBar) {
  m_state.Remove();
  HWND host = CreateWindowExA(0, "STATIC", "host", WS_OVERLAPPEDWINDOW, 0, 0, 100, 100, nullptr, nullptr, nullptr, nullptr);
  devhostSetWindows(host, nullptr);
  bool hostEnabledDuring = true;
  std::vector<int> topIds, bottomIds;
  std::vector<std::string> topTexts, bottomTexts;
  std::vector<RECT> captionRects, buttonRects;
  int statusParts = 0;
  std::string statusText, title;
  bool acceptEnabled = true;
  const BrowseOutcome outcome = Browse(BrowseArgs(L""), [&](HWND frame) {
    title = WindowText(frame);
    const std::vector<HWND> bars = ToolBars(frame);
    if (bars.size() != 2) return Command(frame, kCancel);
    topIds = ToolBarIds(bars[0]);
    bottomIds = ToolBarIds(bars[1]);
    for (HWND label : Children(bars[0], "STATIC")) topTexts.push_back(WindowText(label));
    for (HWND caption : Children(bars[1], "STATIC")) {
      bottomTexts.push_back(WindowText(caption));
      RECT rect;
      GetWindowRect(caption, &rect);
      captionRects.push_back(rect);
    }
    for (int index : {0, 2}) {
      RECT rect;
      SendMessageA(bars[1], TB_GETITEMRECT, index, reinterpret_cast<LPARAM>(&rect));
      MapWindowPoints(bars[1], nullptr, reinterpret_cast<POINT *>(&rect), 2);
      buttonRects.push_back(rect);
    }
    acceptEnabled = SendMessageA(bars[1], TB_ISBUTTONENABLED, kAccept, 0) != 0;
    HWND status = FindWindowExA(frame, nullptr, STATUSCLASSNAMEA, nullptr);
    statusParts = static_cast<int>(SendMessageA(status, SB_GETPARTS, 0, 0));
    statusText = StatusText(frame);
    hostEnabledDuring = IsWindowEnabled(host);
    Command(frame, kCancel);
  });
  EXPECT_FALSE(hostEnabledDuring);
  EXPECT_TRUE(IsWindowEnabled(host));
  devhostSetWindows(nullptr, nullptr);
  DestroyWindow(host);
  ASSERT_TRUE(outcome.watcherFoundFrame);
  EXPECT_EQ(title, "ombra3");
  EXPECT_EQ(topIds, (std::vector<int>{32771, 0, 32774, 0, 32775, 0, 32782, 0, 32804, 32790, 32805}));
  EXPECT_EQ(bottomIds, (std::vector<int>{kAccept, 0, kCancel}));
  EXPECT_EQ(topTexts, (std::vector<std::string>{"Search:", " Layer name:"}));
  EXPECT_EQ(bottomTexts, (std::vector<std::string>{"Insert", "Close"}));
  ASSERT_EQ(captionRects.size(), 2u);
  for (size_t i = 0; i < 2; ++i) {
    const int captionCentreX = (captionRects[i].left + captionRects[i].right) / 2;
    const int buttonCentreX = (buttonRects[i].left + buttonRects[i].right) / 2;
    EXPECT_NEAR(captionCentreX, buttonCentreX, 1) << "caption " << i << " is centred over its button";
    EXPECT_LT(captionRects[i].right - captionRects[i].left, buttonRects[i].right - buttonRects[i].left);
  }
  EXPECT_FALSE(acceptEnabled) << "nothing is chosen yet";
  EXPECT_EQ(statusParts, 4);
  EXPECT_EQ(statusText, "Ready");
  EXPECT_EQ(outcome.resultKind, RTNIL);

  bottomTexts.clear();  // without captions
  Browse(acutBuildList(RTSHORT, 0, RTSHORT, 0, RTSTR, L"", RTSTR, L"", RTSTR, L"", 0), [&](HWND frame) {
    for (HWND caption : Children(ToolBars(frame).back(), "STATIC")) bottomTexts.push_back(WindowText(caption));
    Command(frame, kCancel);
  });
  EXPECT_EQ(bottomTexts, (std::vector<std::string>{"Ok", "Cancel"}));
}

TEST_F(ExplorerFrame, SortMenuChecksTheKeyAndTheSortCommandsSetIt) {
  const struct {
    int remembered, command;
    std::vector<bool> checked;
    const char *saved;
  } rows[] = {{0, 0, {true, false, false}, "0"},           {1, 0, {false, true, false}, "1"},
              {2, 0, {false, false, true}, "2"},           {7, 0, {false, false, false}, "7"},  // kept as it was
              {7, kSortBySize, {false, false, true}, "2"}, {2, kSortByName, {true, false, false}, "0"}};
  for (const auto &row : rows) {
    m_state.Write(StateFile(row.remembered, 0, 0));
    std::vector<bool> checked;
    Browse(BrowseArgs(L""), [&](HWND frame) {
      if (row.command) SendMessageA(frame, WM_COMMAND, row.command, 0);
      HMENU sort = GetSubMenu(GetMenu(frame), 2);
      SendMessageA(frame, WM_INITMENUPOPUP, reinterpret_cast<WPARAM>(sort), 2);
      for (int id : {kSortByName, kSortByDate, kSortBySize}) checked.push_back(GetMenuState(sort, id, MF_BYCOMMAND) & MF_CHECKED);
      Command(frame, kCancel);
    });
    EXPECT_EQ(checked, row.checked) << "remembered " << row.remembered << ", command " << row.command;
    EXPECT_EQ(IniValue(m_state.Read(), "Sort"), row.saved);
  }
}

// Every way of ending the browse stores the frame's size, here changed from the remembered one;
// a minimised frame stores the size it is restored to. The drawing of the last browse is chosen
// again, so that accept has a drawing to return.
TEST_F(ExplorerFrame, TheFirstEndMessageDecidesAcceptOrCancel) {
  ScratchFolder scratch("end");
  scratch.File("a.dwg", "");
  const std::string start = scratch.Path() + "\\";
  const std::pair<std::function<void(HWND)>, int> rows[] = {
      {[](HWND frame) { Command(frame, kAccept), PostMessageA(frame, WM_CLOSE, 0, 0); }, RTLB},
      {[](HWND frame) { Command(frame, kCancel), Command(frame, kAccept); }, RTNIL},
      {[](HWND frame) { Command(frame, kAppExit); }, RTNIL},
      {[](HWND frame) { PostMessageA(frame, WM_SYSCOMMAND, SC_CLOSE, 0); }, RTNIL},  // the close box
      {[](HWND frame) {  // Escape in the folder tree
         PostMessageA(GetWindow(GetDlgItem(GetDlgItem(frame, 0xE900), 0xE900), GW_CHILD), WM_KEYDOWN, VK_ESCAPE, 0);
       },
       RTNIL},
      {[](HWND frame) { ShowWindow(frame, SW_MINIMIZE), Command(frame, kCancel); }, RTNIL},
  };
  for (size_t i = 0; i < std::size(rows); ++i) {
    m_state.Write(StateFile(0, 900, 600, "", "a.dwg"));
    RECT frameRect{};
    const BrowseOutcome outcome = Browse(BrowseArgs(std::wstring(start.begin(), start.end()).c_str()), [&](HWND frame) {
      SetWindowPos(frame, nullptr, 0, 0, 800 + static_cast<int>(i), 500, SWP_NOMOVE | SWP_NOZORDER);
      GetWindowRect(frame, &frameRect);
      rows[i].first(frame);
    });
    EXPECT_EQ(outcome.resultKind, rows[i].second) << "way " << i;
    const std::string ini = m_state.Read();
    EXPECT_EQ(IniValue(ini, "WindowWidth") + "x" + IniValue(ini, "WindowHeight"),
              std::to_string(frameRect.right - frameRect.left) + "x" + std::to_string(frameRect.bottom - frameRect.top))
        << "way " << i;
  }
}

// Accept returns the drawing the search found for the remembered name, joined to its folder with
// one separator, and the folder's settings; the name is remembered for the next browse.
TEST_F(ExplorerFrame, AcceptReturnsThePathWithTheFolderSettingsOrThreeEmptyTexts) {
  ScratchFolder scratch("accept");
  const std::string folder = scratch.Path();
  scratch.File("plan.dwg", "");
  scratch.File("datains.ini", "[Default Parameters]\r\nLayer=WALLS\r\nLisp command=MYCMD\r\nColor=1\r\n\r\n");
  const std::string root = "C:\\lumvex-accept-root.dwg";
  std::ofstream(root.c_str()) << "";
  const struct {
    std::string start, name;
    std::vector<std::wstring> texts;
  } rows[] = {{folder + "\\", "plan.dwg", {std::wstring(folder.begin(), folder.end()) + L"\\plan.dwg", L"WALLS", L"1", L"MYCMD"}},
              {"C:\\", "lumvex-accept-root.dwg", {std::wstring(root.begin(), root.end()), L"", L"", L""}}};
  for (const auto &row : rows) {
    m_state.Write(StateFile(0, 0, 0, "", row.name));
    std::string searchText;
    const BrowseOutcome outcome = Browse(BrowseArgs(std::wstring(row.start.begin(), row.start.end()).c_str()), [&](HWND frame) {
      searchText = WindowText(Children(ToolBars(frame)[0], "EDIT")[0]);
      Command(frame, kAccept);
      Command(frame, kCancel);  // ends the browse when accept had nothing to return
    });
    EXPECT_EQ(outcome.resultKind, RTLB);
    EXPECT_EQ(outcome.texts, row.texts);
    EXPECT_EQ(searchText, row.name.substr(0, row.name.find('.'))) << "the remembered name's base name goes into the search box";
    EXPECT_EQ(IniValue(m_state.Read(), "Name"), row.name);
  }
  DeleteFileA(root.c_str());
  EXPECT_EQ(IniValue(m_state.Read(), "Path"), "C:\\");
}

TEST_F(ExplorerFrame, MenuPromptsShowInTheStatusBarAndItsCommandHidesItAndTheToolBar) {
  std::vector<std::string> prompts;  // a command's, a popup's, after the menu closes
  std::vector<bool> shown;           // top bar, bottom bar, status bar, the two check marks
  Browse(BrowseArgs(L""), [&](HWND frame) {
    SendMessageA(frame, WM_MENUSELECT, MAKEWPARAM(kSortByName, MF_STRING),
                 reinterpret_cast<LPARAM>(GetSubMenu(GetMenu(frame), 2)));
    prompts.push_back(StatusText(frame));
    SendMessageA(frame, WM_MENUSELECT, MAKEWPARAM(0, MF_POPUP), reinterpret_cast<LPARAM>(GetMenu(frame)));
    prompts.push_back(StatusText(frame));
    SendMessageA(frame, WM_MENUSELECT, MAKEWPARAM(0, 0xFFFF), 0);
    prompts.push_back(StatusText(frame));
    const std::vector<HWND> bars = ToolBars(frame);
    SendMessageA(frame, WM_COMMAND, kViewToolbar, 0);
    SendMessageA(frame, WM_COMMAND, kViewStatusBar, 0);
    HMENU view = GetSubMenu(GetMenu(frame), 1);
    SendMessageA(frame, WM_INITMENUPOPUP, reinterpret_cast<WPARAM>(view), 1);
    shown = {IsWindowVisible(bars[0]) != 0, IsWindowVisible(bars[1]) != 0,
             IsWindowVisible(FindWindowExA(frame, nullptr, STATUSCLASSNAMEA, nullptr)) != 0,
             (GetMenuState(view, kViewToolbar, MF_BYCOMMAND) & MF_CHECKED) != 0,
             (GetMenuState(view, kViewStatusBar, MF_BYCOMMAND) & MF_CHECKED) != 0};
    Command(frame, kCancel);
  });
  EXPECT_EQ(prompts, (std::vector<std::string>{"Sort by name", "", "Ready"}));
  EXPECT_EQ(shown, (std::vector<bool>{false, true, false, false, false})) << "the toggle is the top tool bar's";
}

TEST_F(ExplorerFrame, PasteRescansTheFolderAndShowsItInTheTitleAndItsLayerInTheLabel) {
  ScratchFolder source("paste-source");
  const std::string drawing = source.File("door.dwg", "AC1018");
  struct Case {
    const char *settings;  // nullptr: no datains.ini
    const char *label;
  };
  for (const Case &c :
       {Case{nullptr, " Layer name: Current"}, Case{"[Default Parameters]\r\nLayer=\r\nColor=3\r\n", " Layer name: Current"},
        Case{"[Default Parameters]\r\nLayer=WALLS\r\n", " Layer name: WALLS"}}) {
    ScratchFolder target("paste-target");
    const std::string folder = target.Path();
    if (c.settings) target.File("datains.ini", c.settings);
    // The folder of the last browse, as the tree names it: the browse opens there.
    m_state.Write(StateFile(0, 0, 0, folder, "", "Desktop\\My Computer\\ (C:)" + folder.substr(2)));
    SetCurrentDirectoryA(folder.c_str());
    PutFileOnClipboard(drawing);
    std::string label, title;
    Browse(BrowseArgs(L""), [&](HWND frame) {
      SendMessageA(frame, WM_COMMAND, kEditPaste, 0);
      const std::vector<HWND> bars = ToolBars(frame);
      if (!bars.empty()) label = WindowText(Children(bars[0], "STATIC").back());
      title = WindowText(frame);
      Command(frame, kCancel);
    });
    SetCurrentDirectoryA(StateFileGuard::Narrow(ProgramFolder()).c_str());
    EXPECT_EQ(label, c.label);
    EXPECT_EQ(title, folder);
    EXPECT_NE(GetFileAttributesA((folder + "\\door.dwg").c_str()), INVALID_FILE_ATTRIBUTES) << "the drawing was pasted";
  }
}
TEST_F(ExplorerFrame, FrameAcceleratorsWorkInsideTheModalLoop) {
  HWND focus = nullptr, rightPane = nullptr;
  Browse(BrowseArgs(L""), [&](HWND frame) {
    HWND splitter = GetDlgItem(frame, 0xE900);
    rightPane = GetDlgItem(splitter, 0xE901);
    // F6 is the frame's accelerator for the next pane: a key for the left pane goes up from it
    // to the frame, whose table turns it into the command that moves the focus on.
    PostMessageA(GetDlgItem(splitter, 0xE900), WM_KEYDOWN, VK_F6, 0);
    // Posted input is taken after sent messages: wait until the key has been handled.
    for (int waited = 0; waited < 3000 && focus != rightPane; waited += 20) {
      Sleep(20);
      GUITHREADINFO info{};
      info.cbSize = sizeof info;
      GetGUIThreadInfo(GetWindowThreadProcessId(frame, nullptr), &info);
      focus = info.hwndFocus;
    }
    Command(frame, kCancel);
  });
  char focusClass[64] = "";
  GetClassNameA(focus, focusClass, sizeof focusClass);
  EXPECT_EQ(focus, rightPane) << "focus on a " << focusClass << " id " << GetDlgCtrlID(focus);
}

}  // namespace
