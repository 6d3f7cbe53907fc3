// The folder tree of a browse call: the Desktop as its single root, the walk along a start
// folder typed in another letter case and along the remembered path, the scanned folder as the
// current directory, siblings in the shell's order, the button of a folder found empty, and the
// folders that labels do not reach opened by their item ids.
#include "ScratchFolder.h"
#include "TreeWatch.h"

#include <gtest/gtest.h>
#include <shlobj.h>
#include <shlwapi.h>

#include <algorithm>
#include <cctype>

namespace {
std::string Lower(std::string text) {
  std::transform(text.begin(), text.end(), text.begin(), [](unsigned char c) { return std::tolower(c); });
  return text;
}

std::string DesktopName() {
  IShellFolder *desktop = nullptr;
  SHGetDesktopFolder(&desktop);
  ITEMIDLIST empty{};
  STRRET name{};
  char text[MAX_PATH] = "";
  if (SUCCEEDED(desktop->GetDisplayNameOf(&empty, SHGDN_INFOLDER, &name))) StrRetToBufA(&name, &empty, text, MAX_PATH);
  desktop->Release();
  return text;
}

using ShellTree = BrowseTest;

TEST_F(ShellTree, TheDesktopIsTheSingleRootTheTreeOpensAlongTheStartFolderInAnyCaseThenAlongTheRememberedPath) {
  m_state.Remove();
  const ScratchFolder scratch("tree");
  const std::string plans = scratch.Path() + "\\Plans";
  CreateDirectoryA(plans.c_str(), nullptr);
  for (const char *name : {"b", "A", "C"}) CreateDirectoryA((plans + "\\" + name).c_str(), nullptr);
  std::string upper = plans + "\\";
  std::transform(upper.begin(), upper.end(), upper.begin(), [](unsigned char c) { return std::toupper(c); });

  for (const std::string &start : {upper, std::string()}) {
    std::string selected, current, highlighted, emptyButton = "?";
    std::vector<std::string> roots, children;
    Browse(BrowseArgs(std::wstring(start.begin(), start.end()).c_str()), [&](HWND frame) {
      HWND tree = FindTree(frame);
      roots = ChildTexts(tree, nullptr);
      HTREEITEM caret = TreeNext(tree, nullptr, TVGN_CARET);
      selected = ItemText(tree, caret);
      char directory[MAX_PATH] = "";
      GetCurrentDirectoryA(MAX_PATH, directory);
      current = directory;
      children = ChildTexts(tree, caret);
      SendMessageA(tree, TVM_SELECTITEM, TVGN_CARET, reinterpret_cast<LPARAM>(ChildNamed(tree, caret, "b")));
      highlighted = ItemText(tree, TreeNext(tree, nullptr, TVGN_DROPHILITE));
      SendMessageA(tree, TVM_SELECTITEM, TVGN_CARET, reinterpret_cast<LPARAM>(caret));
      HTREEITEM empty = ChildNamed(tree, caret, "A");
      SendMessageA(tree, TVM_EXPAND, TVE_EXPAND, reinterpret_cast<LPARAM>(empty));
      TVITEMA button{};
      button.mask = TVIF_CHILDREN;
      button.hItem = empty;
      SendMessageA(tree, TVM_GETITEMA, 0, reinterpret_cast<LPARAM>(&button));
      emptyButton = std::to_string(button.cChildren);
      PostMessageA(frame, WM_CLOSE, 0, 0);
    });
    const char *how = start.empty() ? "remembered path" : "start folder";
    EXPECT_EQ(roots, std::vector<std::string>{DesktopName()}) << how;
    EXPECT_EQ(selected, "Plans") << how;
    EXPECT_EQ(Lower(current), Lower(plans)) << how;
    EXPECT_EQ(children, (std::vector<std::string>{"A", "b", "C"})) << how << ": the shell's order";
    EXPECT_EQ(highlighted, "b") << how << ": the highlight follows the folder chosen";
    EXPECT_EQ(emptyButton, "0") << how << ": a fixed-drive folder found empty";
  }
}

// Where the walk along labels stops short, the folder opens by the ids the shell parses for it:
// hidden folders, which the tree does not list, and a remembered path whose labels are gone.
TEST_F(ShellTree, FoldersTheLabelsDoNotReachOpenByTheirIds) {
  const ScratchFolder scratch("ids");
  for (const char *folder : {"Plans", ".archive", ".archive\\.old"}) CreateDirectoryA((scratch.Path() + "\\" + folder).c_str(), nullptr);
  const struct {
    const char *name;
    std::string start, state, selected, folder;
  } cases[] = {
      {"a hidden start folder", scratch.Path() + "\\.archive\\", "", ".archive", ".archive"},
      {"a hidden folder in a hidden one, given with a file name", scratch.Path() + "\\.archive\\.old\\plan.dwg", "", ".old",
       ".archive\\.old"},
      {"a remembered path whose labels are gone", "",
       "[CurrentPath]\r\nPath=" + scratch.Path() + "\\Plans\r\nShellPath=Desktop\\Gone\\Plans\r\n", "Plans", "Plans"},
  };
  for (const auto &c : cases) {
    SCOPED_TRACE(c.name);
    m_state.Write(c.state);
    std::string selected, current;
    Browse(BrowseArgs(std::wstring(c.start.begin(), c.start.end()).c_str()), [&](HWND frame) {
      HWND tree = FindTree(frame);
      selected = ItemText(tree, TreeNext(tree, nullptr, TVGN_CARET));
      char directory[MAX_PATH] = "";
      GetCurrentDirectoryA(MAX_PATH, directory);
      current = directory;
      PostMessageA(frame, WM_CLOSE, 0, 0);
    });
    EXPECT_EQ(selected, c.selected);
    EXPECT_EQ(Lower(current), Lower(scratch.Path() + "\\" + c.folder));
  }
}

// A drag of the splitter resizes the tree's pane: the tree stays where the person scrolled it,
// even with the folder shown out of sight.
TEST_F(ShellTree, ResizingThePaneKeepsTheScrollPosition) {
  const ScratchFolder scratch("scroll");
  const std::string plans = scratch.Path() + "\\Plans";
  CreateDirectoryA(plans.c_str(), nullptr);
  for (int i = 0; i < 60; ++i) CreateDirectoryA((plans + "\\f" + std::to_string(10 + i)).c_str(), nullptr);
  const std::string start = plans + "\\";
  std::string before, after;
  Browse(BrowseArgs(std::wstring(start.begin(), start.end()).c_str()), [&](HWND frame) {
    HWND tree = FindTree(frame);
    const HTREEITEM scrolledTo = ChildNamed(tree, TreeNext(tree, nullptr, TVGN_CARET), "f20");
    SendMessageA(tree, TVM_SELECTITEM, TVGN_FIRSTVISIBLE, reinterpret_cast<LPARAM>(scrolledTo));
    before = ItemText(tree, TreeNext(tree, nullptr, TVGN_FIRSTVISIBLE));
    HWND pane = GetParent(tree);
    RECT rect;
    GetClientRect(pane, &rect);
    SetWindowPos(pane, nullptr, 0, 0, rect.right + 40, rect.bottom, SWP_NOMOVE | SWP_NOZORDER);
    after = ItemText(tree, TreeNext(tree, nullptr, TVGN_FIRSTVISIBLE));
    PostMessageA(frame, WM_CLOSE, 0, 0);
  });
  EXPECT_EQ(before, "f20");
  EXPECT_EQ(after, "f20");
}
}  // namespace
