// Where a picture lands in a window: as large as fits with its aspect ratio kept, centred.
#pragma once

#include <cstdint>

namespace devhost::preview {

struct FitRect {
  int32_t left = 0;
  int32_t top = 0;
  int32_t width = 0;
  int32_t height = 0;
};

// Empty (zero width and height) when either the picture or the area is empty.
FitRect fitCentred(uint32_t pictureWidth, uint32_t pictureHeight, int32_t areaWidth, int32_t areaHeight);

}  // namespace devhost::preview
