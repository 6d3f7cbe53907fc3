// The folder tree under a Cyrillic code page (1251), where letter case is more than A to Z: a
// start folder typed in another letter case than the folder's name opens that folder.
#include "ScratchFolder.h"
#include "TreeWatch.h"

#include <gtest/gtest.h>

namespace {
std::string Ansi(const std::wstring &text) {
  char buffer[MAX_PATH] = "";
  WideCharToMultiByte(CP_ACP, 0, text.c_str(), -1, buffer, sizeof buffer, nullptr, nullptr);
  return buffer;
}

using CyrillicTree = BrowseTest;

TEST_F(CyrillicTree, AStartFolderInAnotherLetterCaseOpensTheFolder) {
  ASSERT_EQ(GetACP(), 1251u) << "runs under LC_ALL=ru_RU.UTF-8, with that locale generated";
  m_state.Remove();
  const ScratchFolder scratch("cyrillic");
  const std::wstring root(scratch.Path().begin(), scratch.Path().end());
  const std::wstring folder = root + L"\\Проекты";
  ASSERT_TRUE(CreateDirectoryW(folder.c_str(), nullptr));
  ASSERT_TRUE(CreateDirectoryW((folder + L"\\Чертежи").c_str(), nullptr));

  std::string selected;
  std::vector<std::string> children;
  wchar_t current[MAX_PATH] = L"";
  Browse(BrowseArgs((root + L"\\пРОЕКТЫ\\").c_str()), [&](HWND frame) {
    HWND tree = FindTree(frame);
    const HTREEITEM caret = TreeNext(tree, nullptr, TVGN_CARET);
    selected = ItemText(tree, caret);
    children = ChildTexts(tree, caret);
    GetCurrentDirectoryW(MAX_PATH, current);
    PostMessageA(frame, WM_CLOSE, 0, 0);
  });
  EXPECT_EQ(selected, Ansi(L"Проекты"));
  EXPECT_EQ(children, std::vector<std::string>{Ansi(L"Чертежи")});
  EXPECT_EQ(std::wstring(current), folder);
}
}  // namespace
