#include "catalogue/Ordering.h"

#include "catalogue/TextCompare.h"

#include <algorithm>

bool CompareByName(const DwgData &a, const DwgData &b) {
  return CompareNoCase(a.m_strDwgName.c_str(), b.m_strDwgName.c_str()) < 0;
}

bool CompareByDate(const DwgData &a, const DwgData &b) { return a.m_tLastWrite < b.m_tLastWrite; }

bool CompareBySize(const DwgData &a, const DwgData &b) { return a.m_nFileSize < b.m_nFileSize; }

void SortRecords(DwgCatalogue &catalogue, int sortKey) {
  const int count = catalogue.GetSize();
  if (count == 0) return;

  bool (*compare)(const DwgData &, const DwgData &) = nullptr;
  switch (sortKey) {
  case kSortByName: compare = CompareByName; break;
  case kSortByDate: compare = CompareByDate; break;
  case kSortBySize: compare = CompareBySize; break;
  default: return;
  }
  DwgData *first = catalogue.GetData();
  std::sort(first, first + count, compare);
}

int FindPrefixMatch(const DwgCatalogue &catalogue, const std::string &text) {
  if (text.empty()) return -1;
  const int count = catalogue.GetSize();
  for (int index = 0; index < count; ++index) {
    const std::string &name = catalogue[index].m_strDwgName;
    if (name.size() > text.size() && CompareNoCase(name.substr(0, text.size()).c_str(), text.c_str()) == 0)
      return index;
  }
  return -1;
}
