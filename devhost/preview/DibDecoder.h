// Decodes the bitmap a drawing stores: a BITMAPINFOHEADER (or a later, longer header), its colour
// table or masks, and the pixel rows, with no file header before it.
#pragma once

#include "preview/DecodedPicture.h"

#include <cstddef>
#include <cstdint>

namespace devhost::preview {

// 1, 4 and 8 bits per pixel with a palette; 16 bits 5-5-5 or with masks; 24; 32 with or without
// masks; rows bottom-up (positive height) or top-down (negative height). False for anything
// else or anything that does not fit in size bytes; out is then empty.
bool decodeDib(const uint8_t *data, size_t size, DecodedPicture &out);

}  // namespace devhost::preview
