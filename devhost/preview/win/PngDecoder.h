// PNG previews, decoded by GDI+.
#pragma once

#include "preview/DecodedPicture.h"

#include <cstddef>
#include <cstdint>

namespace devhost::preview {

// False, with out empty, for anything GDI+ cannot decode or that is larger than a preview may be.
bool decodePng(const uint8_t *data, size_t size, DecodedPicture &out);

}  // namespace devhost::preview
