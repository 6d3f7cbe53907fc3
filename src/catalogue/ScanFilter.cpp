#include "catalogue/ScanFilter.h"

#include <cstring>

void LowerAsciiInPlace(char *text) {
  for (; *text; ++text)
    if (*text >= 'A' && *text <= 'Z') *text = static_cast<char>(*text - 'A' + 'a');
}

bool TakeListingEntry(char *name, bool isFolder, const char *extension) {
  if (isFolder && name[0] != '.') return false;
  LowerAsciiInPlace(name);
  return std::strstr(name, extension) != nullptr;
}
