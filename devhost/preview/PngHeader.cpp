#include "preview/PngHeader.h"

#include "preview/DecodedPicture.h"

#include <cstring>

namespace devhost::preview {

namespace {

constexpr uint8_t kSignature[8] = {0x89, 'P', 'N', 'G', '\r', '\n', 0x1A, '\n'};
constexpr size_t kHeaderEnd = 8 + 4 + 4 + 8;  // signature, chunk length, "IHDR", width, height

uint32_t be32(const uint8_t *p) { return uint32_t(p[0]) << 24 | uint32_t(p[1]) << 16 | uint32_t(p[2]) << 8 | p[3]; }

}  // namespace

bool readPngSize(const uint8_t *data, size_t size, uint32_t &width, uint32_t &height) {
  width = height = 0;
  if (data == nullptr || size < kHeaderEnd || std::memcmp(data, kSignature, 8) != 0 || be32(data + 8) != 13 ||
      std::memcmp(data + 12, "IHDR", 4) != 0)
    return false;
  const uint32_t w = be32(data + 16), h = be32(data + 20);
  if (w == 0 || h == 0 || w > kMaxPictureSide || h > kMaxPictureSide) return false;
  width = w;
  height = h;
  return true;
}

}  // namespace devhost::preview
