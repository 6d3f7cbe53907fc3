#include "preview/DibDecoder.h"

namespace devhost::preview {

namespace {

constexpr uint32_t kRgb = 0;
constexpr uint32_t kBitFields = 3;
constexpr uint32_t kInfoHeaderSize = 40;

uint32_t le16(const uint8_t *p) { return uint32_t(p[0]) | uint32_t(p[1]) << 8; }
uint32_t le32(const uint8_t *p) { return le16(p) | le16(p + 2) << 16; }

bool isKnownHeaderSize(uint32_t size) {
  // BITMAPINFOHEADER, its two Adobe extensions, BITMAPV4HEADER and BITMAPV5HEADER.
  return size == 40 || size == 52 || size == 56 || size == 108 || size == 124;
}

// One colour channel described by a mask, scaled to 8 bits.
class Channel {
 public:
  explicit Channel(uint32_t mask) : m_mask(mask) {
    if (mask == 0) return;
    while (((mask >> m_shift) & 1) == 0) ++m_shift;
    m_max = uint64_t(mask >> m_shift);
  }
  uint32_t extract(uint32_t pixel) const {
    if (m_max == 0) return 0;
    const uint64_t value = uint64_t((pixel & m_mask) >> m_shift);
    if (m_max == 255) return uint32_t(value);
    return uint32_t((value * 255 + m_max / 2) / m_max);
  }

 private:
  uint32_t m_mask;
  uint32_t m_shift = 0;
  uint64_t m_max = 0;
};

uint32_t opaque(uint32_t r, uint32_t g, uint32_t b) { return 0xFF000000u | r << 16 | g << 8 | b; }

}  // namespace

bool decodeDib(const uint8_t *data, size_t size, DecodedPicture &out) {
  out = DecodedPicture();
  if (data == nullptr || size < kInfoHeaderSize) return false;
  const uint32_t headerSize = le32(data);
  const int32_t rawWidth = int32_t(le32(data + 4));
  const int32_t rawHeight = int32_t(le32(data + 8));
  const uint32_t planes = le16(data + 12);
  const uint32_t bitCount = le16(data + 14);
  const uint32_t compression = le32(data + 16);
  const uint32_t colorsUsed = le32(data + 32);
  if (!isKnownHeaderSize(headerSize) || headerSize > size || planes != 1) return false;
  // Compare before negating: the most negative height has no positive counterpart.
  if (rawWidth <= 0 || uint32_t(rawWidth) > kMaxPictureSide || rawHeight == 0 || rawHeight < -int32_t(kMaxPictureSide) ||
      rawHeight > int32_t(kMaxPictureSide))
    return false;
  const uint32_t width = uint32_t(rawWidth);
  const bool topDown = rawHeight < 0;
  const uint32_t height = topDown ? uint32_t(-rawHeight) : uint32_t(rawHeight);

  const bool paletted = bitCount == 1 || bitCount == 4 || bitCount == 8;
  if (!paletted && bitCount != 16 && bitCount != 24 && bitCount != 32) return false;
  if (compression != kRgb && !(compression == kBitFields && (bitCount == 16 || bitCount == 32))) return false;

  // Masks: after a plain info header for bit fields; inside the longer headers.
  uint32_t masks[3] = {0x7C00, 0x03E0, 0x001F};  // 16-bit default is 5-5-5
  if (bitCount == 32) masks[0] = 0xFF0000, masks[1] = 0x00FF00, masks[2] = 0x0000FF;
  uint64_t offset = headerSize;
  if (compression == kBitFields) {
    const uint64_t maskOffset = kInfoHeaderSize;
    if (maskOffset + 12 > size) return false;
    for (int i = 0; i < 3; ++i) masks[i] = le32(data + maskOffset + 4 * i);
    if (headerSize == kInfoHeaderSize) offset += 12;
  }

  // The colour table: for paletted pictures it holds the colours; for the others an optional
  // table that only has to be skipped.
  const uint32_t fullPalette = paletted ? 1u << bitCount : 0;
  uint32_t paletteSize = colorsUsed;
  if (paletted && paletteSize == 0) paletteSize = fullPalette;
  if (paletted ? paletteSize > fullPalette : paletteSize > 256) return false;
  const uint64_t paletteOffset = offset;
  offset += uint64_t(paletteSize) * 4;

  const uint64_t stride = (uint64_t(width) * bitCount + 31) / 32 * 4;
  if (offset > size || stride * height > size - offset) return false;
  const uint8_t *palette = data + paletteOffset;
  const uint8_t *pixels = data + offset;

  uint32_t colours[256] = {};
  if (paletted)
    for (uint32_t i = 0; i < paletteSize; ++i) colours[i] = opaque(palette[4 * i + 2], palette[4 * i + 1], palette[4 * i]);
  // Indices past a short palette show black, as GDI shows them.
  for (uint32_t i = paletteSize; paletted && i < fullPalette; ++i) colours[i] = opaque(0, 0, 0);
  const Channel red(masks[0]), green(masks[1]), blue(masks[2]);

  out.width = width;
  out.height = height;
  out.pixels.resize(size_t(width) * height);
  for (uint32_t y = 0; y < height; ++y) {
    const uint8_t *row = pixels + stride * (topDown ? y : height - 1 - y);
    uint32_t *target = out.pixels.data() + size_t(y) * width;
    for (uint32_t x = 0; x < width; ++x) {
      switch (bitCount) {
        case 1: target[x] = colours[(row[x / 8] >> (7 - x % 8)) & 1]; break;
        case 4: target[x] = colours[(row[x / 2] >> (x % 2 ? 0 : 4)) & 0xF]; break;
        case 8: target[x] = colours[row[x]]; break;
        case 16: {
          const uint32_t value = le16(row + 2 * x);
          target[x] = opaque(red.extract(value), green.extract(value), blue.extract(value));
          break;
        }
        case 24: target[x] = opaque(row[3 * x + 2], row[3 * x + 1], row[3 * x]); break;
        default: {
          const uint32_t value = le32(row + 4 * x);
          target[x] = opaque(red.extract(value), green.extract(value), blue.extract(value));
          break;
        }
      }
    }
  }
  return true;
}

}  // namespace devhost::preview
