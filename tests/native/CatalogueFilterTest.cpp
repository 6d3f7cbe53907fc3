// The scan's choice of entries and the place of the explorer state file.
#include "catalogue/ScanFilter.h"
#include "catalogue/StateFilePath.h"
#include "host/SplitPath.h"

#include <gtest/gtest.h>

#include <string>

namespace {
const char kDwg[] = ".dwg";

// The name the catalogue would hold, or "-" when the entry is not taken.
std::string Taken(std::string name, bool isFolder = false) { return TakeListingEntry(name.data(), isFolder, kDwg) ? name : "-"; }

TEST(ScanFilter, FilesAreTakenByExtensionWithoutRegardToCase) {
  EXPECT_EQ(Taken("A.DWG"), "a.dwg");
  EXPECT_EQ(Taken("b.Dwg"), "b.dwg");
  EXPECT_EQ(Taken("c.txt"), "-");
}

TEST(ScanFilter, ExtensionMayStandAnywhereInTheName) {
  EXPECT_EQ(Taken("Plan.dwg.OLD"), "plan.dwg.old");
  EXPECT_EQ(Taken("a.dwgx"), "a.dwgx");
  EXPECT_EQ(Taken(".dwg"), ".dwg");
  EXPECT_EQ(Taken("plandwg"), "-");
  EXPECT_EQ(Taken("plan.dw"), "-");
}

TEST(ScanFilter, FoldersCountOnlyWhenTheirNameBeginsWithADot) {
  EXPECT_EQ(Taken("old.dwg", true), "-");
  EXPECT_EQ(Taken("OLD.DWG", true), "-");
  EXPECT_EQ(Taken(".dwg", true), ".dwg");
  EXPECT_EQ(Taken(".Backup.DWG", true), ".backup.dwg");
  EXPECT_EQ(Taken(".", true), "-");
  EXPECT_EQ(Taken("..", true), "-");
}

TEST(ScanFilter, OnlyAsciiCapitalsAreLowered) {
  // 0xC4 is a capital letter in Latin-1 and a lead byte in double-byte code pages: either
  // way the scan leaves it alone.
  std::string name = "\xC4RGER.DWG";
  LowerAsciiInPlace(name.data());
  EXPECT_EQ(name, "\xC4rger.dwg");
  EXPECT_EQ(Taken("[PLAN]_@Z.DWG"), "[plan]_@z.dwg");
}

TEST(StateFilePath, ModuleNameWithExtensionIni) {
  EXPECT_EQ(ComposeStateFilePath("C:\\Program Files\\Lumvex\\Lumvex1.arx"), "C:\\Program Files\\Lumvex\\Lumvex1.ini");
  EXPECT_EQ(ComposeStateFilePath("Z:\\work\\build.v2\\bin\\Lumvex1.arx"), "Z:\\work\\build.v2\\bin\\Lumvex1.ini");
  EXPECT_EQ(ComposeStateFilePath("C:\\a\\lumvex.test.arx"), "C:\\a\\lumvex.test.ini");
  EXPECT_EQ(ComposeStateFilePath("C:\\a\\Lumvex1"), "C:\\a\\Lumvex1.ini");
  EXPECT_EQ(ComposeStateFilePath("\\\\server\\share\\Lumvex1.arx"), "\\\\server\\share\\Lumvex1.ini");
  EXPECT_EQ(ComposeStateFilePath("C:Lumvex1.arx"), "C:Lumvex1.ini");
}

TEST(StateFilePath, SplitsLikeTheRunTime) {
  const PathParts parts = SplitPath("C:\\dir.x/sub\\name.tar.gz");
  EXPECT_EQ(parts.drive, "C:");
  EXPECT_EQ(parts.directory, "\\dir.x/sub\\");
  EXPECT_EQ(parts.baseName, "name.tar");
  EXPECT_EQ(parts.extension, ".gz");

  const PathParts bare = SplitPath("name");
  EXPECT_EQ(bare.drive, "");
  EXPECT_EQ(bare.directory, "");
  EXPECT_EQ(bare.baseName, "name");
  EXPECT_EQ(bare.extension, "");
}
}  // namespace
