// The start folder's shell path: splitting as _splitpath does, and joining the tree's labels.
#include "host/ShellPathCompose.h"
#include "host/SplitPath.h"

#include <gtest/gtest.h>

namespace {
const ShellFolderNames kNames{"Desktop", "My Computer", "My Network Places"};

std::string Compose(const std::string &folder, const std::string &driveDisplayName) {
  return ComposeStartShellPath(kNames, driveDisplayName, SplitPath(folder).directory);
}

TEST(SplitPath, KeepsDriveAndDirectoryAndDropsTheFileName) {
  EXPECT_EQ(SplitPath("C:\\Proj\\").drive, "C:");
  EXPECT_EQ(SplitPath("C:\\Proj\\").directory, "\\Proj\\");
  EXPECT_EQ(SplitPath("C:\\Proj").directory, "\\") << "Proj without a separator is a file name";
  EXPECT_EQ(SplitPath("C:\\Proj\\plan.dwg").directory, "\\Proj\\");
  EXPECT_EQ(SplitPath("c:relative\\x.dwg").directory, "relative\\");
  EXPECT_EQ(SplitPath("C:").directory, "");
  EXPECT_EQ(SplitPath("C:/mixed/seps/a.dwg").directory, "/mixed/seps/");
}

TEST(SplitPath, UncPathHasNoDrive) {
  const PathParts parts = SplitPath("\\\\server\\share\\dwg\\");
  EXPECT_EQ(parts.drive, "");
  EXPECT_EQ(parts.directory, "\\\\server\\share\\dwg\\");
}

TEST(SplitPath, BareNamesAndEmptyText) {
  EXPECT_EQ(SplitPath("plan.dwg").directory, "");
  EXPECT_EQ(SplitPath("").drive, "");
  EXPECT_EQ(SplitPath("x").drive, "");
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
TEST(SplitPath, BaseNameDropsFolderAndLastExtension) {
  EXPECT_EQ(SplitPath("plan.dwg").baseName, "plan");
  EXPECT_EQ(SplitPath("C:\\Proj\\plan.dwg").baseName, "plan");
  EXPECT_EQ(SplitPath("plan.dwg.old").baseName, "plan.dwg");
  EXPECT_EQ(SplitPath("noext").baseName, "noext");
  EXPECT_EQ(SplitPath(".dwg").baseName, "");
  EXPECT_EQ(SplitPath("c:x.dwg").baseName, "x");
}
}  // namespace
