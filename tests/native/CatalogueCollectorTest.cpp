// Handing a scan's records over to the catalogue.
#include "catalogue/ListingCollector.h"

#include <gtest/gtest.h>

#include <string>

namespace {
TEST(ListingCollector, ReplacesTheCatalogueInListingOrderUnmarked) {
  DwgCatalogue catalogue;
  catalogue.SetSize(0, 100);
  catalogue.Add(DwgData("old.dwg", 1, 1));
  catalogue[0].Select();

  ListingCollector records;
  records.Add("b.dwg", -7, 0);
  records.Add("a long name of a drawing, past any short-text buffer.dwg", 4102444800, 0xFFFFFFFFu);
  records.Add(".dwg", 0, 0);
  records.MoveInto(catalogue, 100);

  ASSERT_EQ(catalogue.GetSize(), 3);
  EXPECT_EQ(catalogue[0].m_strDwgName, "b.dwg");
  EXPECT_EQ(catalogue[0].m_tLastWrite, -7);
  EXPECT_EQ(catalogue[1].m_strDwgName, "a long name of a drawing, past any short-text buffer.dwg");
  EXPECT_EQ(catalogue[1].m_tLastWrite, 4102444800);
  EXPECT_EQ(catalogue[1].m_nFileSize, 0xFFFFFFFFu);
  EXPECT_EQ(catalogue[2].m_strDwgName, ".dwg");
  for (int i = 0; i < 3; ++i) EXPECT_FALSE(catalogue[i].IsSelected());
}

TEST(ListingCollector, NothingCollectedLeavesAnEmptyCatalogue) {
  DwgCatalogue catalogue;
  catalogue.Add(DwgData("old.dwg", 1, 1));
  ListingCollector().MoveInto(catalogue, 100);
  EXPECT_EQ(catalogue.GetSize(), 0);
}

TEST(ListingCollector, TheCatalogueStillGrowsAfterwards) {
  DwgCatalogue catalogue;
  ListingCollector records;
  for (int i = 0; i < 250; ++i) records.Add(("d" + std::to_string(i) + ".dwg").c_str(), i, static_cast<uint32_t>(i));
  records.MoveInto(catalogue, 100);
  catalogue.Add(DwgData("pasted.dwg", 0, 0));
  ASSERT_EQ(catalogue.GetSize(), 251);
  EXPECT_EQ(catalogue[249].m_strDwgName, "d249.dwg");
  EXPECT_EQ(catalogue[250].m_strDwgName, "pasted.dwg");
}
}  // namespace
