// Scanning real folders into the catalogue.
#include "catalogue/DwgData.h"
#include "catalogue/FolderScan.h"
#include "catalogue/Ombra3Doc.h"
#include "catalogue/Ordering.h"
#include "catalogue/StateFilePath.h"
#include "catalogue/TextCompare.h"
#include "CatalogueTestFolder.h"

#include <gtest/gtest.h>

#include <windows.h>

#include <mbstring.h>

#include <algorithm>
#include <cstdio>
#include <memory>
#include <string>
#include <vector>

namespace {
const char kDwg[] = ".dwg";

std::vector<std::string> CatalogueNames() {
  std::vector<std::string> names;
  for (int i = 0; i < g_pCatalogue->GetSize(); ++i) names.push_back((*g_pCatalogue)[i].m_strDwgName);
  return names;
}

// The folder's entries as the file system lists them, lowered, keeping only `wanted`.
std::vector<std::string> ListingOrderOf(const TestFolder &folder, std::vector<std::string> wanted) {
  std::vector<std::string> names;
  WIN32_FIND_DATAA entry;
  const HANDLE find = FindFirstFileA((folder / "*").c_str(), &entry);
  if (find == INVALID_HANDLE_VALUE) return names;
  do {
    std::string name = entry.cFileName;
    std::transform(name.begin(), name.end(), name.begin(), [](char c) { return c >= 'A' && c <= 'Z' ? char(c + 32) : c; });
    if (std::find(wanted.begin(), wanted.end(), name) != wanted.end()) names.push_back(name);
  } while (FindNextFileA(find, &entry));
  FindClose(find);
  return names;
}

std::string CurrentDirectory() {
  char path[MAX_PATH] = "";
  GetCurrentDirectoryA(MAX_PATH, path);
  return path;
}

const DwgData *Record(const std::string &name) {
  for (int i = 0; i < g_pCatalogue->GetSize(); ++i)
    if ((*g_pCatalogue)[i].m_strDwgName == name) return &(*g_pCatalogue)[i];
  return nullptr;
}

// The document writes its state file beside the test program; a scan test leaves none behind.
class WithDocument {
 public:
  ~WithDocument() {
    const std::string stateFile = m_document->m_iniFile.m_path;
    m_document.reset();
    std::remove(stateFile.c_str());
  }
  COmbra3Doc &Document() { return *m_document; }

 private:
  std::unique_ptr<COmbra3Doc> m_document = std::make_unique<COmbra3Doc>();
};

class CatalogueScan : public ::testing::Test {
 protected:
  void TearDown() override { EmptyCatalogue(); }
};

TEST_F(CatalogueScan, TakesDrawingsByNameInListingOrder) {
  TestFolder folder("filter");
  for (const char *name : {"A.DWG", "b.Dwg", "c.txt", "plan.dwg.old", "a.dwgx", "plandwg", "plan.dw"}) folder.AddFile(name);
  folder.AddFolder("old.dwg");
  folder.AddFolder(".dwg");

  ASSERT_TRUE(ScanFolder(folder.Path(), kDwg));
  EXPECT_EQ(CatalogueNames(), ListingOrderOf(folder, {"a.dwg", "b.dwg", "plan.dwg.old", "a.dwgx", ".dwg"}));
  EXPECT_EQ(g_pCatalogue->GetSize(), 5);
}

TEST_F(CatalogueScan, RecordsCarryTimeAndSizeOfTheListing) {
  TestFolder folder("fields");
  folder.AddFile("Small.dwg", 12, 946684800);      // 2000-01-01
  folder.AddFile("large.dwg", 70000, 4102444800);  // 2100-01-01, past 32-bit seconds
  ASSERT_TRUE(ScanFolder(folder.Path(), kDwg));

  const DwgData *small = Record("small.dwg");
  const DwgData *large = Record("large.dwg");
  ASSERT_TRUE(small && large);
  EXPECT_EQ(small->m_nFileSize, 12u);
  EXPECT_EQ(small->m_tLastWrite, 946684800);
  EXPECT_EQ(large->m_nFileSize, 70000u);
  EXPECT_EQ(large->m_tLastWrite, 4102444800);
  EXPECT_FALSE(small->IsSelected());

  // The orders the view asks for, on scanned records.
  SortRecords(*g_pCatalogue, kSortBySize);
  EXPECT_EQ(CatalogueNames(), (std::vector<std::string>{"small.dwg", "large.dwg"}));
  SortRecords(*g_pCatalogue, kSortByName);
  EXPECT_EQ(CatalogueNames(), (std::vector<std::string>{"large.dwg", "small.dwg"}));
}

TEST_F(CatalogueScan, ASecondScanGivesTheSameRecordsUnmarked) {
  TestFolder folder("rescan");
  for (int i = 0; i < 30; ++i) folder.AddFile("d" + std::to_string(i) + ".dwg", static_cast<DWORD>(i));
  ASSERT_TRUE(ScanFolder(folder.Path(), kDwg));
  std::vector<DwgData> first;
  for (int i = 0; i < g_pCatalogue->GetSize(); ++i) {
    first.push_back((*g_pCatalogue)[i]);
    (*g_pCatalogue)[i].Select();
  }

  ASSERT_TRUE(ScanFolder(folder.Path(), kDwg));
  ASSERT_EQ(g_pCatalogue->GetSize(), 30);
  for (int i = 0; i < 30; ++i) {
    const DwgData &record = (*g_pCatalogue)[i];
    EXPECT_EQ(record.m_strDwgName, first[i].m_strDwgName);
    EXPECT_EQ(record.m_tLastWrite, first[i].m_tLastWrite);
    EXPECT_EQ(record.m_nFileSize, first[i].m_nFileSize);
    EXPECT_FALSE(record.IsSelected()) << record.m_strDwgName;
  }
}

TEST_F(CatalogueScan, EmptyFolderIsListedWithNoRecord) {
  TestFolder drawings("drawings");
  drawings.AddFile("x.dwg");
  ASSERT_TRUE(ScanFolder(drawings.Path(), kDwg));
  TestFolder empty("empty");
  EXPECT_TRUE(ScanFolder(empty.Path(), kDwg));
  EXPECT_EQ(g_pCatalogue->GetSize(), 0);
}

TEST_F(CatalogueScan, FolderBecomesTheCurrentDirectoryAndTheShownFolder) {
  WithDocument document;
  TestFolder folder("current");
  EXPECT_TRUE(ScanFolder(folder.Path(), kDwg));
  EXPECT_EQ(CurrentDirectory(), folder.Path());
  EXPECT_EQ(document.Document().m_strPath, folder.Path());
}

TEST_F(CatalogueScan, UnlistableFolderLeavesAnEmptyCatalogue) {
  WithDocument document;
  TestFolder folder("unlistable");
  folder.AddFile("plan.dwg");

  ASSERT_TRUE(ScanFolder(folder.Path(), kDwg));
  ASSERT_EQ(g_pCatalogue->GetSize(), 1);
  const std::string missing = folder / "no such folder";
  EXPECT_FALSE(ScanFolder(missing, kDwg));
  EXPECT_EQ(g_pCatalogue->GetSize(), 0);
  EXPECT_EQ(document.Document().m_strPath, missing);
  EXPECT_EQ(CurrentDirectory(), folder.Path());  // a folder that is not there cannot become current

  ASSERT_TRUE(ScanFolder(folder.Path(), kDwg));
  const std::string file = folder / "plan.dwg";
  EXPECT_FALSE(ScanFolder(file, kDwg));
  EXPECT_EQ(g_pCatalogue->GetSize(), 0);
  EXPECT_EQ(document.Document().m_strPath, file);
}

TEST_F(CatalogueScan, DriveRootIsListedDespiteItsOwnSeparator) {
  EXPECT_TRUE(ScanFolder("C:\\", kDwg));
  EXPECT_EQ(CurrentDirectory(), "C:\\");
}

TEST_F(CatalogueScan, NamesSortInTheOrderOfTheirLowerCase) {
  // "_" lies between the capitals and the small letters: lowered names put it first.
  TestFolder folder("order");
  for (const char *name : {"B.dwg", "_x.dwg", "a.dwg"}) folder.AddFile(name);
  ASSERT_TRUE(ScanFolder(folder.Path(), kDwg));
  SortRecords(*g_pCatalogue, kSortByName);
  EXPECT_EQ(CatalogueNames(), (std::vector<std::string>{"_x.dwg", "a.dwg", "b.dwg"}));
  EXPECT_TRUE(CompareByName(DwgData("_x.dwg", 0, 0), DwgData("A.dwg", 0, 0)));
}

int Sign(int value) { return (value > 0) - (value < 0); }

TEST(CompareNoCase, AgreesWithTheRunTime) {
  // ASCII takes a quicker path than the run time's comparison: both must order alike,
  // also for the signs between "Z" and "a" and for bytes past ASCII.
  const char *texts[] = {"",
                         "a",
                         "A",
                         "b",
                         "_",
                         "[",
                         "^",
                         "`",
                         "{",
                         "~",
                         "plan",
                         "PLAN",
                         "plan-a",
                         "plan.dwg",
                         "plan2",
                         "Z",
                         "z",
                         "\xC4",
                         "\xE4",
                         "a\xC4",
                         "a\xE4"
                         "b",
                         "\xFF"};
  for (const char *a : texts)
    for (const char *b : texts)
      EXPECT_EQ(Sign(CompareNoCase(a, b)),
                Sign(_mbsicmp(reinterpret_cast<const unsigned char *>(a), reinterpret_cast<const unsigned char *>(b))))
          << '"' << a << "\" \"" << b << '"';
}
}  // namespace
