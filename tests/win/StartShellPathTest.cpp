// The start folder's shell path from the names the shell really gives (Wine's here); how the
// names are put together is tested natively.
#include "host/StartShellPath.h"

#include <gtest/gtest.h>

#include <string>

namespace {
std::string StartShellPath(const std::string &folder, size_t capacity = 260) {
  std::string out(capacity, '#');
  MakeStartShellPath(folder.c_str(), out.data(), capacity);
  return out.c_str();
}

TEST(StartShellPath, DrivesAndNetworkFoldersByTheirShellNamesLeftEmptyWhenTooLong) {
  EXPECT_EQ(StartShellPath("C:\\Proj\\plan.dwg"), "Desktop\\My Computer\\ (C:)\\Proj\\");
  EXPECT_EQ(StartShellPath("z:\\blocks\\"), "Desktop\\My Computer\\ (Z:)\\blocks\\");
  EXPECT_EQ(StartShellPath("\\\\server\\share\\dwg\\"), "Desktop\\My Network Places\\\\server\\share\\dwg\\");
  // "/" as LISP programs write it
  EXPECT_EQ(StartShellPath("C:/Proj/plan.dwg"), "Desktop\\My Computer\\ (C:)\\Proj\\");
  EXPECT_EQ(StartShellPath("//server/share/dwg/"), "Desktop\\My Network Places\\\\server\\share\\dwg\\");
  EXPECT_EQ(StartShellPath("C:\\Proj\\", 32), "Desktop\\My Computer\\ (C:)\\Proj\\");
  EXPECT_EQ(StartShellPath("C:\\Proj\\", 31), "");
  EXPECT_EQ(StartShellPath("C:\\" + std::string(250, 'd') + "\\"), "");
}
}  // namespace
