// The shell file operation: the lists it hands the shell, its flags and title, and runs that
// must not reach the shell.
#include "ScratchFolder.h"
#include "filecmd/ShellFileOp.h"
#include "fw/WinApp.h"

#include <gtest/gtest.h>

#include <filesystem>
#include <fstream>
#include <string>

namespace {
namespace fs = std::filesystem;

std::string ListBytes(const CShellFileOp &operation, int which) {
  const char *list = which == 0 ? operation.GetOperation().pFrom : operation.GetOperation().pTo;
  return list ? std::string(list, static_cast<size_t>(operation.GetListSize(which))) : std::string();
}

TEST(ShellFileOp, SourceAndDestinationListsAreIndependent) {
  CShellFileOp operation;
  EXPECT_EQ(operation.GetOperation().pFrom, nullptr);
  ASSERT_TRUE(operation.AddFile(7, "D:\\target"));
  EXPECT_EQ(operation.GetOperation().pFrom, nullptr);
  ASSERT_TRUE(operation.AddFile(0, "C:\\a.dwg"));
  EXPECT_EQ(ListBytes(operation, 0), std::string("C:\\a.dwg\0\0", 10));
  operation.ClearFiles(0);
  EXPECT_EQ(operation.GetOperation().pFrom, nullptr);
  EXPECT_EQ(operation.GetListSize(0), 0);
  ASSERT_TRUE(operation.AddFile(0, "C:\\b.dwg"));
  EXPECT_EQ(ListBytes(operation, 0), std::string("C:\\b.dwg\0\0", 10));
  EXPECT_EQ(ListBytes(operation, 1), std::string("D:\\target\0\0", 11));
}

TEST(ShellFileOp, TitleIsAPrivateCopyOfATextOrAStringResourceAndEmptyOrMissingClearsIt) {
  CShellFileOp operation;
  char text[] = "Copying drawings";
  operation.SetTitle(text);
  text[0] = 'X';
  ASSERT_NE(operation.GetOperation().lpszProgressTitle, nullptr);
  EXPECT_STREQ(operation.GetOperation().lpszProgressTitle, "Copying drawings");
  operation.SetTitle("");
  EXPECT_EQ(operation.GetOperation().lpszProgressTitle, nullptr);
  // Wine's shell keeps its own confirmation captions as strings: a module with known texts.
  fw::AfxSetResourceHandle(GetModuleHandleA("shell32.dll"));
  operation.SetTitle(130u);
  ASSERT_NE(operation.GetOperation().lpszProgressTitle, nullptr);
  EXPECT_STREQ(operation.GetOperation().lpszProgressTitle, "Confirm file deletion");
  operation.SetTitle(0xFFF0u);
  EXPECT_EQ(operation.GetOperation().lpszProgressTitle, nullptr);
  fw::AfxSetResourceHandle(nullptr);
}

TEST(ShellFileOp, DeleteRunsWithAllowUndoAloneWhateverWasSet) {
  CShellFileOp operation;
  operation.SetFlags(FOF_NOCONFIRMATION | FOF_SILENT | FOF_NOERRORUI);
  EXPECT_EQ(operation.GetFlags(), FOF_NOCONFIRMATION | FOF_SILENT | FOF_NOERRORUI);
  // Nothing to delete: the shell is not called, and the flags still say what a run uses.
  EXPECT_EQ(operation.DeleteFiles(), ERROR_INVALID_PARAMETER);
  EXPECT_EQ(operation.GetFlags(), FOF_ALLOWUNDO);
  EXPECT_FALSE(operation.AnyOperationsAborted());
  EXPECT_EQ(operation.GetOperation().wFunc, static_cast<UINT>(FO_DELETE));
}

TEST(ShellFileOp, ListShortOfAPathNeverReachesTheShell) {
  ScratchFolder folder("shell-op");
  const std::string source = folder.File("a.txt", "alpha");
  const std::string target = folder.File("copy.txt");
  CShellFileOp operation;
  ASSERT_TRUE(operation.AddFile(0, source.c_str()));
  EXPECT_FALSE(operation.AddFile(0, nullptr));
  ASSERT_TRUE(operation.AddFile(1, target.c_str()));
  EXPECT_EQ(operation.CopyFiles(), ERROR_NOT_ENOUGH_MEMORY);
  EXPECT_FALSE(fs::exists(target));
  EXPECT_EQ(ListBytes(operation, 0), source + std::string(2, '\0'));

  // A fresh list runs again.
  operation.ClearFiles(0);
  ASSERT_TRUE(operation.AddFile(0, source.c_str()));
  EXPECT_EQ(operation.CopyFiles(), 0);
  EXPECT_EQ(Content(target), "alpha");
}

TEST(ShellFileOp, OneCallFormRunsAtOnce) {
  ScratchFolder folder("shell-op");
  const std::string from = folder.File("plan.dwg", "plan");
  const std::string to = folder.File("plan2.dwg");
  {
    CShellFileOp unknownKind(nullptr, 9, from.c_str(), to.c_str(), 0, "title");
    EXPECT_TRUE(fs::exists(from));
    EXPECT_STREQ(unknownKind.GetOperation().lpszProgressTitle, "title");
  }
  CShellFileOp rename(nullptr, 4, from.c_str(), to.c_str(), 0, nullptr);
  EXPECT_FALSE(fs::exists(from));
  EXPECT_EQ(Content(to), "plan");
  EXPECT_FALSE(rename.AnyOperationsAborted());
}
}  // namespace
