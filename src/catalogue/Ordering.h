// The orders the thumbnail view shows the catalogue in, and the search's prefix match.
#pragma once

#include "catalogue/DwgData.h"

#include <string>

enum SortKey : int { kSortByName = 0, kSortByDate = 1, kSortBySize = 2 };

// Strict less-than tests: true when a goes before b.
bool CompareByName(const DwgData &a, const DwgData &b);  // names without regard to case
bool CompareByDate(const DwgData &a, const DwgData &b);  // oldest first
bool CompareBySize(const DwgData &a, const DwgData &b);  // smallest first

// Sorts the whole catalogue ascending by the key (not stable: equal keys end in any order).
// Any key other than name, date or size leaves the listing order. Records keep their marks.
void SortRecords(DwgCatalogue &catalogue, int sortKey);

// Index of the first record, in catalogue order, whose name begins with `text` (or is it)
// without regard to case; "*" and "?" are ordinary characters. -1 when the text is empty or no
// record matches.
int FindPrefixMatch(const DwgCatalogue &catalogue, const std::string &text);
