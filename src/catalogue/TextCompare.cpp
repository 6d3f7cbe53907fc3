#include "catalogue/TextCompare.h"

#ifdef _WIN32
#include <mbstring.h>

int CompareNoCase(const char *a, const char *b) {
  return _mbsicmp(reinterpret_cast<const unsigned char *>(a), reinterpret_cast<const unsigned char *>(b));
}
#else
namespace {
int LowerAscii(unsigned char c) { return c >= 'A' && c <= 'Z' ? c - 'A' + 'a' : c; }
}  // namespace

int CompareNoCase(const char *a, const char *b) {
  for (;; ++a, ++b) {
    const int difference = LowerAscii(static_cast<unsigned char>(*a)) - LowerAscii(static_cast<unsigned char>(*b));
    if (difference != 0 || *a == '\0') return difference;
  }
}
#endif
