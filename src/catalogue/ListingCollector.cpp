#include "catalogue/ListingCollector.h"

#include <cstring>

void ListingCollector::Add(const char *lowerName, int64_t lastWrite, uint32_t fileSize) {
  const std::size_t length = std::strlen(lowerName);
  m_entries.push_back(Entry{m_names.size(), length, lastWrite, fileSize});
  m_names.append(lowerName, length);
}

void ListingCollector::MoveInto(DwgCatalogue &catalogue, int growBy) const {
  const int count = static_cast<int>(m_entries.size());
  // A growth step of the whole count makes the first Add allocate the array once, exactly.
  catalogue.SetSize(0, count > 0 ? count : growBy);
  DwgData record;
  for (const Entry &entry : m_entries) {
    record.m_strDwgName.assign(m_names, entry.nameOffset, entry.nameLength);
    record.m_tLastWrite = entry.lastWrite;
    record.m_nFileSize = entry.fileSize;
    catalogue.Add(record);
  }
  catalogue.SetSize(count, growBy);
}
