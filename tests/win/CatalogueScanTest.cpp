// Scanning real folders into the catalogue.
#include "ScratchFolder.h"
#include "catalogue/DwgData.h"
#include "catalogue/FolderScan.h"
#include "catalogue/Ombra3Doc.h"
#include "catalogue/TextCompare.h"

#include <gtest/gtest.h>

#include <windows.h>

#include <mbstring.h>

#include <algorithm>
#include <cstdio>
#include <filesystem>
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
std::vector<std::string> ListingOrderOf(const ScratchFolder &folder, std::vector<std::string> wanted) {
  std::vector<std::string> names;
  WIN32_FIND_DATAA entry;
  const HANDLE find = FindFirstFileA(folder.File("*").c_str(), &entry);
  for (bool more = find != INVALID_HANDLE_VALUE; more; more = FindNextFileA(find, &entry)) {
    std::string name = entry.cFileName;
    std::transform(name.begin(), name.end(), name.begin(), [](char c) { return c >= 'A' && c <= 'Z' ? char(c + 32) : c; });
    if (std::find(wanted.begin(), wanted.end(), name) != wanted.end()) names.push_back(name);
  }
  FindClose(find);
  return names;
}

// Sets a file's or a folder's last write to `unixSeconds`.
void SetLastWrite(const std::string &path, long long unixSeconds) {
  const HANDLE file = CreateFileA(path.c_str(), FILE_WRITE_ATTRIBUTES, 0, nullptr, OPEN_EXISTING, FILE_FLAG_BACKUP_SEMANTICS, nullptr);
  const unsigned long long ticks = (static_cast<unsigned long long>(unixSeconds) + 11644473600ull) * 10000000ull;
  const FILETIME time{static_cast<DWORD>(ticks), static_cast<DWORD>(ticks >> 32)};
  SetFileTime(file, nullptr, nullptr, &time);
  CloseHandle(file);
}

// A file of `size` bytes last written at `unixSeconds`.
void AddFile(const ScratchFolder &folder, const std::string &name, size_t size = 0, long long unixSeconds = 1500000000) {
  SetLastWrite(folder.File(name, std::string(size, 'x').c_str()), unixSeconds);
}

class CatalogueScan : public ::testing::Test {
 protected:
  void TearDown() override {
    EmptyCatalogue();
    const std::string stateFile = m_document->m_iniFile.m_path;
    m_document.reset();
    std::remove(stateFile.c_str());  // the document writes one beside the test program
  }
  std::unique_ptr<COmbra3Doc> m_document = std::make_unique<COmbra3Doc>();
};

TEST_F(CatalogueScan, TakesDrawingsInListingOrderWithTheirTimeAndSizeUnmarked) {
  ScratchFolder folder("scan");
  AddFile(folder, "Small.dwg", 12, 946684800);      // 2000-01-01
  AddFile(folder, "large.dwg", 70000, 4102444800);  // 2100-01-01, past 32-bit seconds
  AddFile(folder, "c.txt");
  CreateDirectoryA(folder.File("old.dwg").c_str(), nullptr);
  CreateDirectoryA(folder.File(".dwg").c_str(), nullptr);
  SetLastWrite(folder.File(".dwg"), 1234567890);  // 2009-02-13
  for (int scan = 0; scan < 2; ++scan) {
    ASSERT_TRUE(ScanFolder(folder.Path(), kDwg));
    EXPECT_EQ(CatalogueNames(), ListingOrderOf(folder, {"small.dwg", "large.dwg", ".dwg"}));
    for (int i = 0; i < g_pCatalogue->GetSize(); ++i) {
      DwgData &record = (*g_pCatalogue)[i];
      EXPECT_FALSE(record.IsSelected()) << "scan " << scan;
      const auto expected = record.m_strDwgName == "small.dwg"   ? std::make_pair(946684800LL, 12u)
                            : record.m_strDwgName == "large.dwg" ? std::make_pair(4102444800LL, 70000u)
                                                                 : std::make_pair(1234567890LL, 0u);
      EXPECT_EQ(std::make_pair(record.m_tLastWrite, record.m_nFileSize), expected) << record.m_strDwgName;
      record.Select();  // a second scan gives them unmarked
    }
  }
  EXPECT_EQ(std::filesystem::current_path().string(), folder.Path()) << "the scanned folder becomes the current directory";
  EXPECT_EQ(m_document->m_strPath, folder.Path()) << "and the shown folder";
}

TEST_F(CatalogueScan, EmptyUnlistableOrMissingFoldersLeaveAnEmptyCatalogue) {
  ScratchFolder folder("unlistable"), empty("empty");
  AddFile(folder, "plan.dwg");
  for (const std::string &path : {empty.Path(), folder.File("no such folder"), folder.File("plan.dwg")}) {
    ASSERT_TRUE(ScanFolder(folder.Path(), kDwg));
    ASSERT_EQ(g_pCatalogue->GetSize(), 1);
    EXPECT_EQ(ScanFolder(path, kDwg), path == empty.Path()) << path;
    EXPECT_EQ(g_pCatalogue->GetSize(), 0) << path;
    EXPECT_EQ(m_document->m_strPath, path);
  }
  EXPECT_EQ(std::filesystem::current_path().string(), folder.Path()) << "a folder that is not there cannot become current";
  EXPECT_TRUE(ScanFolder("C:\\", kDwg)) << "a drive root despite its own separator";
  EXPECT_EQ(std::filesystem::current_path().string(), "C:\\");
}

int Sign(int value) { return (value > 0) - (value < 0); }

TEST(CompareNoCase, AgreesWithTheRunTime) {
  // ASCII takes a quicker path than the run time's comparison: both must order alike, also for
  // the signs between "Z" and "a" and for bytes past ASCII.
  const char *texts[] = {"",     "a",      "A",        "b",     "_", "[", "^",      "`",       "{",        "~",    "plan",
                         "PLAN", "plan-a", "plan.dwg", "plan2", "Z", "z", "\xC4", "\xE4", "a\xC4", "a\xE4", "b", "\xFF"};
  for (const char *a : texts)
    for (const char *b : texts)
      EXPECT_EQ(Sign(CompareNoCase(a, b)),
                Sign(_mbsicmp(reinterpret_cast<const unsigned char *>(a), reinterpret_cast<const unsigned char *>(b))))
          << '"' << a << "\" \"" << b << '"';
}
}  // namespace
