#include "catalogue/Ordering.h"

#include "catalogue/TextCompare.h"

#include <algorithm>
#include <numeric>
#include <utility>
#include <vector>

namespace {
void SwapRecords(DwgData &a, DwgData &b) {
  std::swap(a.m_bSelected, b.m_bSelected);
  a.m_strDwgName.swap(b.m_strDwgName);
  std::swap(a.m_tLastWrite, b.m_tLastWrite);
  std::swap(a.m_nFileSize, b.m_nFileSize);
}

// order[i] is the index of the record that belongs at i. Each cycle of the permutation is
// walked once, so every record is swapped into place without copying its name.
void ApplyOrder(DwgData *records, std::vector<int> &order) {
  const int count = static_cast<int>(order.size());
  for (int start = 0; start < count; ++start) {
    int at = start;
    while (order[at] != start) {
      const int from = order[at];
      SwapRecords(records[at], records[from]);
      order[at] = at;
      at = from;
    }
    order[at] = at;
  }
}
}  // namespace

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
  // A record is copied, name and all, each time the sort moves it; the sort orders indices
  // instead and the records are then swapped into place.
  const DwgData *records = catalogue.GetData();
  std::vector<int> order(static_cast<size_t>(count));
  std::iota(order.begin(), order.end(), 0);
  std::sort(order.begin(), order.end(), [&](int a, int b) { return compare(records[a], records[b]); });
  ApplyOrder(catalogue.GetData(), order);
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
