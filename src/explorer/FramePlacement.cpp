#include "explorer/FramePlacement.h"

#include <algorithm>

FramePlacement PlaceFrame(const DialogRect &dialog, int width, int height) {
  FramePlacement placement;
  // The vertical term keeps the historical formula: remembered placements depend on it.
  placement.x = std::max((dialog.left + dialog.right) / 2 - width / 2, 0);
  placement.y = std::max((dialog.top + dialog.bottom) / 2 - (height - dialog.top + dialog.bottom) / 2, 0);
  placement.maximized = placement.x == 0 && placement.y == 0;
  placement.resized = !placement.maximized && width != 0 && height != 0;
  return placement;
}
