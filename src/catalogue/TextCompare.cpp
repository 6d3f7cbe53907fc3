#include "catalogue/TextCompare.h"

#ifdef _WIN32
#include <mbstring.h>
#endif

namespace {
int LowerAscii(unsigned char c) { return c >= 'A' && c <= 'Z' ? c - 'A' + 'a' : c; }
}  // namespace

#ifdef _WIN32
// _mbsicmp asks the code page about every character, which made sorting by name twice as slow
// as by date. Up to the first byte outside ASCII every byte is a character of its own (a
// double-byte character starts with a byte of 0x80 or more) that it lowers like A-Z, so the
// two agree there; from such a byte on the run time decides.
int CompareNoCase(const char *a, const char *b) {
  for (const char *x = a, *y = b;; ++x, ++y) {
    const unsigned char cx = static_cast<unsigned char>(*x), cy = static_cast<unsigned char>(*y);
    if (cx >= 0x80 || cy >= 0x80) break;
    const int difference = LowerAscii(cx) - LowerAscii(cy);
    if (difference != 0 || cx == '\0') return difference;
  }
  return _mbsicmp(reinterpret_cast<const unsigned char *>(a), reinterpret_cast<const unsigned char *>(b));
}
#else
int CompareNoCase(const char *a, const char *b) {
  for (;; ++a, ++b) {
    const int difference = LowerAscii(static_cast<unsigned char>(*a)) - LowerAscii(static_cast<unsigned char>(*b));
    if (difference != 0 || *a == '\0') return difference;
  }
}
#endif
