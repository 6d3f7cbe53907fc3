// The folder tree under a double-byte code page (932), where the second byte of a character
// can be the code of a backslash ("表" is 0x95 0x5C): such a folder opens from a start folder
// and from the remembered labels alone.
#include "ScratchFolder.h"
#include "TreeWatch.h"

#include <gtest/gtest.h>

namespace {
std::string Ansi(const std::wstring &text) {
  char buffer[MAX_PATH] = "";
  WideCharToMultiByte(CP_ACP, 0, text.c_str(), -1, buffer, sizeof buffer, nullptr, nullptr);
  return buffer;
}

using DoubleByteTree = BrowseTest;

TEST_F(DoubleByteTree, AFolderWhoseNameHoldsABackslashByteOpens) {
  ASSERT_EQ(GetACP(), 932u) << "runs under LC_ALL=ja_JP.UTF-8, with that locale generated";
  m_state.Remove();
  const ScratchFolder scratch("double-byte");
  const std::wstring root(scratch.Path().begin(), scratch.Path().end());
  const std::wstring folder = root + L"\\表";
  ASSERT_TRUE(CreateDirectoryW(folder.c_str(), nullptr));

  // A start folder with a file name after the folder; then the labels remembered from it,
  // without the folder's path.
  for (const std::wstring &start : {folder + L"\\表y.dwg", std::wstring()}) {
    if (start.empty()) {
      std::string state = m_state.Read();
      const size_t path = state.find("\nPath=");
      ASSERT_NE(path, std::string::npos) << state;
      state.erase(path + 1, state.find('\n', path + 1) - path);
      m_state.Write(state);
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
    EXPECT_EQ(selected, Ansi(L"表")) << how;
    EXPECT_EQ(std::wstring(current), folder) << how;
  }
}
}  // namespace
