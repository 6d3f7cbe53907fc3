// The scan's choice of directory entries, and handing its records over to the catalogue.
#include "catalogue/ListingCollector.h"
#include "catalogue/ScanFilter.h"

#include <gtest/gtest.h>

#include <string>

namespace {
TEST(ScanFilter, FilesByExtensionAnywhereInTheLoweredNameFoldersOnlyWithALeadingDot) {
  const struct {
    const char *name;
    bool isFolder;
    const char *taken;  // the name the catalogue holds, or nullptr
  } rows[] = {{"A.DWG", false, "a.dwg"},
              {"b.Dwg", false, "b.dwg"},
              {"c.txt", false, nullptr},
              {"Plan.dwg.OLD", false, "plan.dwg.old"},
              {"a.dwgx", false, "a.dwgx"},
              {".dwg", false, ".dwg"},
              {"plandwg", false, nullptr},
              {"plan.dw", false, nullptr},
              {"[PLAN]_@Z.DWG", false, "[plan]_@z.dwg"},
              {"old.dwg", true, nullptr},
              {".dwg", true, ".dwg"},
              {".Backup.DWG", true, ".backup.dwg"},
              {".", true, nullptr},
              {"..", true, nullptr}};
  for (const auto &row : rows) {
    std::string name = row.name;
    EXPECT_EQ(TakeListingEntry(name.data(), row.isFolder, ".dwg"), row.taken != nullptr) << row.name;
    if (row.taken) EXPECT_EQ(name, row.taken);
  }
  // 0xC4 is a capital in Latin-1 and a lead byte in double-byte code pages: either way it stays.
  std::string name = "\xC4RGER.DWG";
  LowerAsciiInPlace(name.data());
  EXPECT_EQ(name, "\xC4rger.dwg");
}

TEST(ListingCollector, ReplacesTheCatalogueInListingOrderUnmarkedAndLeavesItGrowable) {
  DwgCatalogue catalogue;
  catalogue.SetSize(0, 100);
  catalogue.Add(DwgData("old.dwg", 1, 1));
  catalogue[0].Select();
  ListingCollector records;
  records.Add("b.dwg", -7, 0);
  records.Add("a long name of a drawing, past any short-text buffer.dwg", 4102444800, 0xFFFFFFFFu);
  for (int i = 0; i < 250; ++i) records.Add(("d" + std::to_string(i) + ".dwg").c_str(), i, 0);
  records.MoveInto(catalogue, 100);
  catalogue.Add(DwgData("pasted.dwg", 0, 0));

  ASSERT_EQ(catalogue.GetSize(), 253);
  EXPECT_EQ(catalogue[0].m_strDwgName, "b.dwg");
  EXPECT_EQ(catalogue[0].m_tLastWrite, -7);
  EXPECT_EQ(catalogue[1].m_strDwgName, "a long name of a drawing, past any short-text buffer.dwg");
  EXPECT_EQ(catalogue[1].m_tLastWrite, 4102444800);
  EXPECT_EQ(catalogue[1].m_nFileSize, 0xFFFFFFFFu);
  EXPECT_EQ(catalogue[251].m_strDwgName, "d249.dwg");
  EXPECT_EQ(catalogue[252].m_strDwgName, "pasted.dwg");
  for (int i = 0; i < 3; ++i) EXPECT_FALSE(catalogue[i].IsSelected());

  ListingCollector().MoveInto(catalogue, 100);
  EXPECT_EQ(catalogue.GetSize(), 0);
}
}  // namespace
