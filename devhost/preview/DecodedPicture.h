// A picture ready to paint: 32-bit pixels 0xAARRGGBB (the byte order of a 32-bit DIB), top row first.
#pragma once

#include <cstdint>
#include <vector>

namespace devhost::preview {

// Previews are thumbnails; anything larger than this is damage or an attack on memory.
constexpr uint32_t kMaxPictureSide = 4096;

struct DecodedPicture {
  uint32_t width = 0;
  uint32_t height = 0;
  std::vector<uint32_t> pixels;
  // True when some pixel is not fully opaque, so the painter must blend it over the background.
  bool hasAlpha = false;
};

}  // namespace devhost::preview
