// Gathers the records of one folder scan before they enter the catalogue.
//
// The catalogue grows 100 records at a time, so adding a large folder's records one by one
// moves the whole array again at every step, and each record holds a name of its own on the
// heap. The collector keeps the entries in a compact form instead (all names in one string)
// and hands them over with the array sized once.
#pragma once

#include "catalogue/DwgData.h"

#include <cstdint>
#include <string>
#include <vector>

class ListingCollector {
 public:
  void Add(const char *lowerName, int64_t lastWrite, uint32_t fileSize);

  // Replaces the catalogue's content with the gathered records, in the order they were added,
  // every one unmarked, and leaves the catalogue's growth step at `growBy`.
  void MoveInto(DwgCatalogue &catalogue, int growBy) const;

 private:
  struct Entry {
    std::size_t nameOffset;
    std::size_t nameLength;
    int64_t lastWrite;
    uint32_t fileSize;
  };

  std::string m_names;  // every name, one after the other
  std::vector<Entry> m_entries;
};
