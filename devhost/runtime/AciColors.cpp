#include "runtime/AciColors.h"

namespace devhost {
namespace {
constexpr Rgb kNamed[10] = {{0, 0, 0},   {255, 0, 0},   {255, 255, 0},   {0, 255, 0},     {0, 255, 255},
                            {0, 0, 255}, {255, 0, 255}, {255, 255, 255}, {128, 128, 128}, {192, 192, 192}};
constexpr uint8_t kGreys[6] = {51, 91, 132, 173, 214, 255};
// Brightness of the five shade pairs of a hue, in tenths.
constexpr int kShadeTenths[5] = {10, 8, 6, 5, 3};

// One channel of a hue on the 15-degree circle: 0, a quarter, ..., 1 of full strength, in
// quarters. Sectors of 60 degrees rise, hold and fall as in the usual hue wheel.
int HueQuarters(int hue, int offset) {
  const int h = (hue + offset) % 24;
  if (h < 4) return 4;
  if (h < 8) return 8 - h;
  if (h < 16) return 0;
  if (h < 20) return h - 16;
  return 4;
}

uint8_t Shade(int quarters, bool pale, int tenths) {
  // Exact arithmetic in 1/80ths of a unit, truncated once at the end as the host's table is.
  int value = quarters * 255 * 20;                   // full strength scaled by 80
  if (pale) value = value + (255 * 80 - value) / 2;  // halfway towards white
  return static_cast<uint8_t>(value * tenths / 10 / 80);
}
}  // namespace

Rgb AciColor(int index) {
  if (index < 1 || index > 255) return kNamed[0];
  if (index < 10) return kNamed[index];
  if (index >= 250) return Rgb{kGreys[index - 250], kGreys[index - 250], kGreys[index - 250]};
  const int hue = index / 10 - 1;
  const int shade = index % 10;
  const bool pale = shade % 2 == 1;
  const int tenths = kShadeTenths[shade / 2];
  // Red peaks at hue 0, green at 8 (120 degrees), blue at 16 (240 degrees).
  return Rgb{Shade(HueQuarters(hue, 0), pale, tenths), Shade(HueQuarters(hue, 16), pale, tenths),
             Shade(HueQuarters(hue, 8), pale, tenths)};
}

}  // namespace devhost
