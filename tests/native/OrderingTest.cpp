// Sorting the catalogue by the view's key, and the search's prefix match.
#include "catalogue/Ordering.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <string>
#include <vector>

namespace {
DwgCatalogue Catalogue(const std::vector<DwgData> &records) {
  DwgCatalogue catalogue;
  catalogue.SetSize(0, 100);
  for (const DwgData &record : records) catalogue.Add(record);
  return catalogue;
}

std::vector<std::string> Names(const DwgCatalogue &catalogue) {
  std::vector<std::string> names;
  for (int i = 0; i < catalogue.GetSize(); ++i) names.push_back(catalogue[i].m_strDwgName);
  return names;
}

using Names3 = std::vector<std::string>;

// Listing order deliberately differs from every sorted order, and the smallest/oldest record
// is the last one so that sorting must reach it.
DwgCatalogue Listing() { return Catalogue({DwgData("b.dwg", 200, 30), DwgData("c.dwg", 300, 20), DwgData("a.dwg", 100, 10)}); }

TEST(Ordering, ByNameDateAndSizeAscending) {
  DwgCatalogue catalogue = Listing();
  SortRecords(catalogue, kSortByName);
  EXPECT_EQ(Names(catalogue), (Names3{"a.dwg", "b.dwg", "c.dwg"}));

  catalogue = Catalogue({DwgData("new.dwg", 1700000000, 1), DwgData("mid.dwg", 0, 1), DwgData("old.dwg", -5, 1)});
  SortRecords(catalogue, kSortByDate);
  EXPECT_EQ(Names(catalogue), (Names3{"old.dwg", "mid.dwg", "new.dwg"}));

  catalogue = Catalogue({DwgData("big.dwg", 0, 0xFFFFFFF0u), DwgData("mid.dwg", 0, 0x80000000u), DwgData("tiny.dwg", 0, 7)});
  SortRecords(catalogue, kSortBySize);
  EXPECT_EQ(Names(catalogue), (Names3{"tiny.dwg", "mid.dwg", "big.dwg"}));
}

TEST(Ordering, NamesCompareWithoutRegardToCase) {
  DwgCatalogue catalogue = Catalogue({DwgData("b.dwg", 0, 0), DwgData("A.dwg", 0, 0), DwgData("c.dwg", 0, 0)});
  SortRecords(catalogue, kSortByName);
  EXPECT_EQ(Names(catalogue), (Names3{"A.dwg", "b.dwg", "c.dwg"}));
  EXPECT_TRUE(CompareByName(DwgData("PLAN.dwg", 0, 0), DwgData("plan2.dwg", 0, 0)));
  EXPECT_FALSE(CompareByName(DwgData("PLAN.dwg", 0, 0), DwgData("plan.dwg", 0, 0)));
  EXPECT_FALSE(CompareByName(DwgData("plan.dwg", 0, 0), DwgData("PLAN.dwg", 0, 0)));
}

TEST(Ordering, ByNameIsTheOrderOfTheComparisonForAnyName) {
  // Long shared beginnings, capitals, short names and bytes past ASCII before and after the
  // 16th byte: the name sort must agree with CompareByName on every one.
  std::vector<DwgData> records;
  const char *stems[] = {"project-level-01-",
                         "PROJECT-LEVEL-01-",
                         "project-level-0",
                         "p",
                         "\xC4rger-",
                         "plan\xE4-",
                         "project-level-01-\xC4-",
                         "z",
                         "_",
                         "project-level-01-a"};
  int number = 0;
  for (const char *stem : stems)
    for (int i = 0; i < 12; ++i) records.emplace_back(stem + std::to_string(number++ * 37 % 1000) + ".dwg", 0, 0);

  DwgCatalogue catalogue = Catalogue(records);
  SortRecords(catalogue, kSortByName);
  std::sort(records.begin(), records.end(), CompareByName);
  std::vector<std::string> expected;
  for (const DwgData &record : records) expected.push_back(record.m_strDwgName);
  EXPECT_EQ(Names(catalogue), expected);
}

TEST(Ordering, OtherKeysLeaveTheListingOrder) {
  for (int key : {-1, 3, 5, 7}) {
    DwgCatalogue catalogue = Listing();
    SortRecords(catalogue, key);
    EXPECT_EQ(Names(catalogue), (Names3{"b.dwg", "c.dwg", "a.dwg"})) << "key " << key;
  }
  DwgCatalogue empty;
  SortRecords(empty, kSortByName);
  EXPECT_EQ(empty.GetSize(), 0);
}

TEST(Ordering, MarksTravelWithTheirRecords) {
  DwgCatalogue catalogue = Listing();
  catalogue[0].Select();  // b.dwg
  catalogue[2].Select();  // a.dwg
  for (int key : {kSortByName, kSortBySize, kSortByDate}) {
    SortRecords(catalogue, key);
    for (int i = 0; i < catalogue.GetSize(); ++i)
      EXPECT_EQ(catalogue[i].IsSelected(), catalogue[i].m_strDwgName != "c.dwg") << catalogue[i].m_strDwgName;
  }
}

TEST(Ordering, EveryRecordKeepsAllItsFields) {
  // Many equal keys and a shuffled start: whatever the sort moves, each record must arrive
  // whole, and the keys in order. Equal keys may end in any order.
  std::vector<DwgData> records;
  for (int i = 0; i < 1000; ++i) {
    records.emplace_back("r" + std::to_string((i * 7919) % 1000) + ".dwg", (i * 31) % 50, static_cast<uint32_t>(i % 4));
    if (i % 5 == 0) records.back().Select();
  }
  const auto findOriginal = [&](const std::string &name) {
    return std::find_if(records.begin(), records.end(), [&](const DwgData &r) { return r.m_strDwgName == name; });
  };
  for (int key : {kSortByName, kSortByDate, kSortBySize}) {
    DwgCatalogue catalogue = Catalogue(records);
    SortRecords(catalogue, key);
    ASSERT_EQ(catalogue.GetSize(), 1000);
    std::vector<std::string> names = Names(catalogue);
    std::sort(names.begin(), names.end());
    EXPECT_EQ(std::unique(names.begin(), names.end()), names.end()) << "a record was lost or doubled, key " << key;
    for (int i = 0; i < catalogue.GetSize(); ++i) {
      const DwgData &record = catalogue[i];
      const auto original = findOriginal(record.m_strDwgName);
      ASSERT_NE(original, records.end());
      EXPECT_EQ(record.m_tLastWrite, original->m_tLastWrite);
      EXPECT_EQ(record.m_nFileSize, original->m_nFileSize);
      EXPECT_EQ(record.IsSelected(), original->IsSelected());
      if (i > 0) {
        const DwgData &previous = catalogue[i - 1];
        if (key == kSortByName) EXPECT_TRUE(CompareByName(previous, record));
        if (key == kSortByDate) EXPECT_FALSE(CompareByDate(record, previous));
        if (key == kSortBySize) EXPECT_FALSE(CompareBySize(record, previous));
      }
    }
  }
}

TEST(PrefixMatch, FirstLongerNameThatBeginsWithTheText) {
  const DwgCatalogue catalogue = Catalogue({DwgData("plan.dwg", 0, 0), DwgData("plan2.dwg", 0, 0), DwgData("plan-a.dwg", 0, 0)});
  EXPECT_EQ(FindPrefixMatch(catalogue, "PLAN"), 0);
  EXPECT_EQ(FindPrefixMatch(catalogue, "plan2"), 1);
  EXPECT_EQ(FindPrefixMatch(catalogue, "Plan-"), 2);
  EXPECT_EQ(FindPrefixMatch(catalogue, "p"), 0);
}

TEST(PrefixMatch, WholeNameEmptyTextAndWildcardsMatchNothing) {
  const DwgCatalogue catalogue = Catalogue({DwgData("plan.dwg", 0, 0), DwgData("plan2.dwg", 0, 0)});
  EXPECT_EQ(FindPrefixMatch(catalogue, "plan.dwg"), -1);
  EXPECT_EQ(FindPrefixMatch(catalogue, "PLAN2.DWG"), -1);
  EXPECT_EQ(FindPrefixMatch(catalogue, ""), -1);
  EXPECT_EQ(FindPrefixMatch(catalogue, "*"), -1);
  EXPECT_EQ(FindPrefixMatch(catalogue, "pl?n"), -1);
  EXPECT_EQ(FindPrefixMatch(catalogue, "plan.dwg.old"), -1);
  EXPECT_EQ(FindPrefixMatch(DwgCatalogue(), "plan"), -1);
}

TEST(PrefixMatch, StarIsAnOrdinaryCharacter) {
  const DwgCatalogue catalogue = Catalogue({DwgData("a.dwg", 0, 0), DwgData("*star.dwg", 0, 0), DwgData("?.dwg", 0, 0)});
  EXPECT_EQ(FindPrefixMatch(catalogue, "*"), 1);
  EXPECT_EQ(FindPrefixMatch(catalogue, "?"), 2);
}

TEST(PrefixMatch, FollowsTheCurrentSortOrder) {
  DwgCatalogue catalogue = Catalogue({DwgData("plan.dwg", 2, 0), DwgData("plan-a.dwg", 1, 0)});
  EXPECT_EQ(FindPrefixMatch(catalogue, "plan"), 0);
  SortRecords(catalogue, kSortByName);  // "-" sorts before "."
  EXPECT_EQ(catalogue[FindPrefixMatch(catalogue, "plan")].m_strDwgName, "plan-a.dwg");
}
}  // namespace
