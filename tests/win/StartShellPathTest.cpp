// The shell path of a start folder, from the names the shell really gives (Wine's here).
#include "host/StartShellPath.h"

#include <gtest/gtest.h>

#include <string>

namespace {
std::string StartShellPath(const char *folder, size_t capacity = 260) {
  std::string out(capacity, '#');
  MakeStartShellPath(folder, out.data(), capacity);
  return out.c_str();
}

TEST(StartShellPath, FolderWithTrailingSeparator) {
  EXPECT_EQ(StartShellPath("C:\\Proj\\"), "Desktop\\My Computer\\ (C:)\\Proj\\");
}

TEST(StartShellPath, FolderWithoutTrailingSeparatorIsTakenAsAFileName) {
  EXPECT_EQ(StartShellPath("C:\\Proj"), "Desktop\\My Computer\\ (C:)\\");
}

TEST(StartShellPath, DrawingPathSelectsItsFolder) {
  EXPECT_EQ(StartShellPath("C:\\Proj\\plan.dwg"), "Desktop\\My Computer\\ (C:)\\Proj\\");
  EXPECT_EQ(StartShellPath("z:\\blocks\\door.dwg"), "Desktop\\My Computer\\ (Z:)\\blocks\\");
}

TEST(StartShellPath, NetworkFolderHasNoDrive) {
  EXPECT_EQ(StartShellPath("\\\\server\\share\\dwg\\"), "Desktop\\My Network Places\\\\server\\share\\dwg\\");
}

TEST(StartShellPath, PathThatDoesNotFitIsLeftEmpty) {
  const std::string folder = "C:\\" + std::string(250, 'd') + "\\";
  EXPECT_EQ(StartShellPath(folder.c_str()), "");
  EXPECT_EQ(StartShellPath("C:\\Proj\\", 10), "");
  EXPECT_EQ(StartShellPath("C:\\Proj\\", 33), "Desktop\\My Computer\\ (C:)\\Proj\\");
}
}  // namespace
