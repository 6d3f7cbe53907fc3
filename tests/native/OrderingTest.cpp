// Sorting the catalogue by the view's key, and the search's prefix match.
#include "catalogue/Ordering.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <string>
#include <vector>

namespace {
using Names = std::vector<std::string>;

DwgCatalogue Catalogue(const std::vector<DwgData> &records) {
  DwgCatalogue catalogue;
  catalogue.SetSize(0, 100);
  for (const DwgData &record : records) catalogue.Add(record);
  return catalogue;
}

Names NamesOf(const DwgCatalogue &catalogue) {
  Names names;
  for (int i = 0; i < catalogue.GetSize(); ++i) names.push_back(catalogue[i].m_strDwgName);
  return names;
}

// The listing order and the three sorted orders all differ.
std::vector<DwgData> Listing() {
  return {DwgData("C.dwg", -5, 0x80000000u), DwgData("b.dwg", 200, 7), DwgData("a.dwg", 100, 0xFFFFFFF0u)};
}

TEST(Ordering, EachKeyAscendingMarksTravelWithTheirRecordsOtherKeysLeaveTheListing) {
  const struct {
    int key;
    Names names;
  } rows[] = {{kSortByName, {"a.dwg", "b.dwg", "C.dwg"}},
              {kSortByDate, {"C.dwg", "a.dwg", "b.dwg"}},
              {kSortBySize, {"b.dwg", "C.dwg", "a.dwg"}},
              {-1, {"C.dwg", "b.dwg", "a.dwg"}},
              {3, {"C.dwg", "b.dwg", "a.dwg"}}};
  for (const auto &row : rows) {
    std::vector<DwgData> listing = Listing();
    listing[0].Select();
    DwgCatalogue catalogue = Catalogue(listing);
    SortRecords(catalogue, row.key);
    EXPECT_EQ(NamesOf(catalogue), row.names) << "key " << row.key;
    for (int i = 0; i < 3; ++i) EXPECT_EQ(catalogue[i].IsSelected(), catalogue[i].m_strDwgName == "C.dwg");
  }
  DwgCatalogue empty;
  SortRecords(empty, kSortByName);
  EXPECT_EQ(empty.GetSize(), 0);
}

TEST(Ordering, ByNameIsTheOrderOfTheComparisonForAnyName) {
  // Long shared beginnings, capitals, short names and bytes past ASCII before and after the
  // 16th byte: the name sort must agree with CompareByName (case-blind) on every one.
  EXPECT_FALSE(CompareByName(DwgData("PLAN.dwg", 0, 0), DwgData("plan.dwg", 0, 0)));
  EXPECT_TRUE(CompareByName(DwgData("PLAN.dwg", 0, 0), DwgData("plan2.dwg", 0, 0)));
  std::vector<DwgData> records;
  int number = 0;
  for (const char *stem : {"project-level-01-", "PROJECT-LEVEL-01-", "project-level-0", "p", "\xC4rger-", "plan\xE4-",
                           "project-level-01-\xC4-", "z", "_", "project-level-01-a"})
    for (int i = 0; i < 12; ++i) records.emplace_back(stem + std::to_string(number++ * 37 % 1000) + ".dwg", 0, 0);
  DwgCatalogue catalogue = Catalogue(records);
  SortRecords(catalogue, kSortByName);
  std::sort(records.begin(), records.end(), CompareByName);
  EXPECT_EQ(NamesOf(catalogue), NamesOf(Catalogue(records)));
}

TEST(Ordering, ManyEqualKeysInOrderAndEveryRecordArrivesWhole) {
  std::vector<DwgData> records;
  for (int i = 0; i < 1000; ++i) records.emplace_back("r" + std::to_string((i * 7919) % 1000) + ".dwg", (i * 31) % 50, i % 4);
  for (int key : {kSortByName, kSortByDate, kSortBySize}) {
    DwgCatalogue catalogue = Catalogue(records);
    SortRecords(catalogue, key);
    ASSERT_EQ(catalogue.GetSize(), 1000);
    const auto before = key == kSortByName ? CompareByName : key == kSortByDate ? CompareByDate : CompareBySize;
    for (int i = 0; i < 1000; ++i) {
      const DwgData &record = catalogue[i];
      if (i > 0) EXPECT_FALSE(before(record, catalogue[i - 1])) << "key " << key << ", record " << i;
      const int number = std::stoi(record.m_strDwgName.substr(1)), original = number * 679 % 1000;  // 679 * 7919 = 1 mod 1000
      EXPECT_EQ(std::make_pair(record.m_tLastWrite, record.m_nFileSize), std::make_pair(int64_t(original * 31 % 50), uint32_t(original % 4)));
    }
  }
}

TEST(PrefixMatch, FirstNameInTheCurrentOrderThatBeginsWithTheTextOrIsIt) {
  DwgCatalogue catalogue =
      Catalogue({DwgData("plan.dwg", 2, 0), DwgData("plan2.dwg", 0, 0), DwgData("plan-a.dwg", 1, 0), DwgData("*star.dwg", 0, 0)});
  const std::pair<const char *, int> rows[] = {{"PLAN", 0},  {"plan2", 1},        {"Plan-", 2},     {"p", 0},
                                               {"*", 3},     {"plan.dwg", 0},     {"PLAN2.DWG", 1}, {"", -1},
                                               {"pl?n", -1}, {"plan.dwg.old", -1}};
  for (const auto &[text, index] : rows) EXPECT_EQ(FindPrefixMatch(catalogue, text), index) << '"' << text << '"';
  EXPECT_EQ(FindPrefixMatch(DwgCatalogue(), "plan"), -1);
  SortRecords(catalogue, kSortByName);  // "-" sorts before "."
  EXPECT_EQ(catalogue[FindPrefixMatch(catalogue, "plan")].m_strDwgName, "plan-a.dwg");
}
}  // namespace
