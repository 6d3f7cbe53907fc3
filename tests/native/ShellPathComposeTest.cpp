// The start folder's shell path: splitting as _splitpath does, and joining the tree's labels.
#include "host/ShellPathCompose.h"

#include <gtest/gtest.h>

namespace {
const ShellFolderNames kNames{"Desktop", "My Computer", "My Network Places"};

std::string Compose(const std::string &folder, const std::string &driveDisplayName) {
  return ComposeStartShellPath(kNames, driveDisplayName, SplitFolderPath(folder).directory);
}

TEST(SplitFolderPath, KeepsDriveAndDirectoryAndDropsTheFileName) {
  EXPECT_EQ(SplitFolderPath("C:\\Proj\\").drive, "C:");
  EXPECT_EQ(SplitFolderPath("C:\\Proj\\").directory, "\\Proj\\");
  EXPECT_EQ(SplitFolderPath("C:\\Proj").directory, "\\") << "Proj without a separator is a file name";
  EXPECT_EQ(SplitFolderPath("C:\\Proj\\plan.dwg").directory, "\\Proj\\");
  EXPECT_EQ(SplitFolderPath("c:relative\\x.dwg").directory, "relative\\");
  EXPECT_EQ(SplitFolderPath("C:").directory, "");
  EXPECT_EQ(SplitFolderPath("C:/mixed/seps/a.dwg").directory, "/mixed/seps/");
}

TEST(SplitFolderPath, UncPathHasNoDrive) {
  const FolderPathParts parts = SplitFolderPath("\\\\server\\share\\dwg\\");
  EXPECT_EQ(parts.drive, "");
  EXPECT_EQ(parts.directory, "\\\\server\\share\\dwg\\");
}

TEST(SplitFolderPath, BareNamesAndEmptyText) {
  EXPECT_EQ(SplitFolderPath("plan.dwg").directory, "");
  EXPECT_EQ(SplitFolderPath("").drive, "");
  EXPECT_EQ(SplitFolderPath("x").drive, "");
}

TEST(ComposeStartShellPath, DriveFoldersGoThroughTheDrivesFolder) {
  EXPECT_EQ(Compose("C:\\Proj\\", " (C:)"), "Desktop\\My Computer\\ (C:)\\Proj\\");
  EXPECT_EQ(Compose("C:\\Proj", " (C:)"), "Desktop\\My Computer\\ (C:)\\");
  EXPECT_EQ(Compose("C:\\Proj\\plan.dwg", " (C:)"), "Desktop\\My Computer\\ (C:)\\Proj\\");
}

TEST(ComposeStartShellPath, PathsWithoutDriveGoThroughTheNetworkFolder) {
  EXPECT_EQ(Compose("\\\\server\\share\\dwg\\", ""), "Desktop\\My Network Places\\\\server\\share\\dwg\\");
}
}  // namespace

namespace {
TEST(FileBaseName, DropsFolderAndLastExtension) {
  EXPECT_EQ(FileBaseName("plan.dwg"), "plan");
  EXPECT_EQ(FileBaseName("C:\\Proj\\plan.dwg"), "plan");
  EXPECT_EQ(FileBaseName("plan.dwg.old"), "plan.dwg");
  EXPECT_EQ(FileBaseName("noext"), "noext");
  EXPECT_EQ(FileBaseName(".dwg"), "");
  EXPECT_EQ(FileBaseName("c:x.dwg"), "x");
}
}  // namespace
