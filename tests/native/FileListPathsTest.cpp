// Which clipboard paths count as drawings, and the paths the view's copy and delete build.
#include "filecmd/DwgPath.h"
#include "filecmd/MarkedPaths.h"

#include <gtest/gtest.h>

namespace {
TEST(FileListPaths, DrawingExtensionInAnyCase) {
  EXPECT_TRUE(IsDwgPath("C:\\work\\plan.dwg"));
  EXPECT_TRUE(IsDwgPath("C:\\work\\x.DWG"));
  EXPECT_TRUE(IsDwgPath("z:/tmp/Mixed.DwG"));
  EXPECT_TRUE(IsDwgPath("C:\\work\\.dwg"));
  EXPECT_TRUE(IsDwgPath("d:plan.1.dwg"));
  EXPECT_TRUE(IsDwgPath("\\\\server\\v1.2\\x.dwg"));
}

TEST(FileListPaths, OtherFilesAreNotDrawings) {
  EXPECT_FALSE(IsDwgPath("C:\\work\\notes.txt"));
  EXPECT_FALSE(IsDwgPath("C:\\work\\plan.dwgx"));
  EXPECT_FALSE(IsDwgPath("C:\\work\\plan.dw"));
  EXPECT_FALSE(IsDwgPath("C:\\work.dwg\\plan"));
  EXPECT_FALSE(IsDwgPath("z:/x.dwg/plan"));
  EXPECT_FALSE(IsDwgPath("C:\\work\\plandwg"));
  EXPECT_FALSE(IsDwgPath(""));
}

TEST(FileListPaths, FolderGetsOneSeparator) {
  EXPECT_EQ(FolderWithSeparator("C:\\Work"), "C:\\Work\\");
  EXPECT_EQ(FolderWithSeparator("C:\\"), "C:\\");
  EXPECT_EQ(FolderWithSeparator(""), "\\");
}

TEST(FileListPaths, MarkedRecordsInCatalogueOrder) {
  DwgCatalogue catalogue;
  for (const char *name : {"a.dwg", "b.dwg", "c.dwg"}) catalogue.Add(DwgData(name, 0, 0));
  EXPECT_TRUE(MarkedPaths(catalogue, "C:\\Work").empty());
  catalogue[2].Select();
  catalogue[0].Select();
  EXPECT_EQ(MarkedPaths(catalogue, "C:\\Work"), (std::vector<std::string>{"C:\\Work\\a.dwg", "C:\\Work\\c.dwg"}));
  EXPECT_EQ(MarkedPaths(catalogue, "C:\\"), (std::vector<std::string>{"C:\\a.dwg", "C:\\c.dwg"}));
}
}  // namespace
