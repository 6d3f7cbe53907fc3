// The size a PNG claims, read before anything decodes it: a small file can announce a huge
// picture, and the decoder would allocate for it.
#pragma once

#include <cstddef>
#include <cstdint>

namespace devhost::preview {

// True when the bytes start with the PNG signature and an image header of a size between 1 and
// kMaxPictureSide on each side.
bool readPngSize(const uint8_t *data, size_t size, uint32_t &width, uint32_t &height);

}  // namespace devhost::preview
