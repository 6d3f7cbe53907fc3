// The folder tree under code pages where narrow text is more than ASCII, run once under each:
// Cyrillic (1251), where letter case is more than A to Z, and Japanese (932), where the second
// byte of a character can be the code of a backslash ("表" is 0x95 0x5C).
#include "ScratchFolder.h"
#include "TreeWatch.h"

#include <gtest/gtest.h>

namespace {
std::string Ansi(const std::wstring &text) {
  char buffer[MAX_PATH] = "";
  WideCharToMultiByte(CP_ACP, 0, text.c_str(), -1, buffer, sizeof buffer, nullptr, nullptr);
  return buffer;
}

using CodePageTree = BrowseTest;

// The folder opens from a start folder (typed in another letter case; with a file name after
// the folder), then from the labels remembered from it alone, without the folder's path, the
// folder's label typed as in the start folder.
TEST_F(CodePageTree, AFolderOutsideAsciiOpensFromTheStartFolderAndFromTheRememberedLabels) {
  const UINT codePage = GetACP();
  ASSERT_TRUE(codePage == 1251 || codePage == 932) << "runs under LC_ALL=ru_RU.UTF-8 or ja_JP.UTF-8, the locale generated";
  m_state.Remove();
  const ScratchFolder scratch("code-page");
  const std::wstring root(scratch.Path().begin(), scratch.Path().end()), name = codePage == 1251 ? L"Проекты" : L"表";
  const std::wstring folder = root + L"\\" + name, typed = codePage == 1251 ? L"пРОЕКТЫ" : name;
  ASSERT_TRUE(CreateDirectoryW(folder.c_str(), nullptr));
  for (const std::wstring &start : {codePage == 1251 ? root + L"\\" + typed + L"\\" : folder + L"\\表y.dwg", std::wstring()}) {
    if (start.empty()) {
      std::string state = m_state.Read();
      const size_t path = state.find("\nPath="), label = state.rfind(Ansi(name));
      ASSERT_TRUE(path != std::string::npos && label != std::string::npos) << state;
      state.replace(label, Ansi(name).size(), Ansi(typed));
      m_state.Write(state.erase(path + 1, state.find('\n', path + 1) - path));
    }
    std::string selected;
    wchar_t current[MAX_PATH] = L"";
    Browse(BrowseArgs(start.c_str()), [&](HWND frame) {
      HWND tree = FindTree(frame);
      selected = ItemText(tree, TreeNext(tree, nullptr, TVGN_CARET));
      GetCurrentDirectoryW(MAX_PATH, current);
      PostMessageA(frame, WM_CLOSE, 0, 0);
    });
    const char *how = start.empty() ? "remembered labels" : "start folder";
    EXPECT_EQ(selected, Ansi(name)) << how;
    EXPECT_EQ(std::wstring(current), folder) << how;
  }
}
}  // namespace
