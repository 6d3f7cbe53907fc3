// The host's index colours (ACI): 1 to 9 named, 10 to 249 in 24 hues of ten shades each,
// 250 to 255 greys. Portable, so the table is also checked natively.
#pragma once

#include <cstdint>

namespace devhost {

struct Rgb {
  uint8_t red, green, blue;
  bool operator==(const Rgb &other) const { return red == other.red && green == other.green && blue == other.blue; }
};

// The standard colour of index 1 to 255; black for anything else.
Rgb AciColor(int index);

}  // namespace devhost
