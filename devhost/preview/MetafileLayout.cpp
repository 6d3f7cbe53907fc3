#include "preview/MetafileLayout.h"

namespace devhost::preview {

namespace {

uint32_t le16(const uint8_t *p) { return uint32_t(p[0]) | uint32_t(p[1]) << 8; }
uint32_t le32(const uint8_t *p) { return le16(p) | le16(p + 2) << 16; }
int32_t s16(const uint8_t *p) { return int16_t(uint16_t(le16(p))); }

constexpr uint32_t kEmrHeader = 1;
constexpr uint32_t kEmfSignature = 0x464D4520;  // " EMF"
constexpr size_t kEnhHeaderMin = 88;
constexpr uint32_t kPlaceableKey = 0x9AC6CDD7;
constexpr size_t kPlaceableSize = 22;
constexpr size_t kWmfHeaderSize = 18;
constexpr uint32_t kMetaSetWindowExt = 0x020C;
// Enough records to reach the window extent, which writers put at the start.
constexpr int kRecordsToScan = 64;

void setAspect(MetafileLayout &layout, int64_t width, int64_t height) {
  if (width > 0 && height > 0 && width <= INT32_MAX && height <= INT32_MAX) {
    layout.aspectWidth = uint32_t(width);
    layout.aspectHeight = uint32_t(height);
  }
}

std::optional<MetafileLayout> inspectEnhanced(const uint8_t *data, size_t size) {
  const uint32_t headerSize = le32(data + 4);
  const uint32_t totalSize = le32(data + 48);
  if (headerSize < kEnhHeaderMin || headerSize > totalSize || totalSize > size) return std::nullopt;
  MetafileLayout layout;
  layout.kind = MetafileKind::Enhanced;
  layout.size = totalSize;
  // The frame, in hundredths of a millimetre, is the picture's intended size.
  const int64_t left = int32_t(le32(data + 24)), top = int32_t(le32(data + 28));
  const int64_t right = int32_t(le32(data + 32)), bottom = int32_t(le32(data + 36));
  setAspect(layout, right - left, bottom - top);
  return layout;
}

std::optional<MetafileLayout> inspectWindows(const uint8_t *data, size_t size, size_t offset) {
  if (offset > size || size - offset < kWmfHeaderSize) return std::nullopt;
  const uint8_t *header = data + offset;
  const uint32_t type = le16(header);
  const uint32_t headerWords = le16(header + 2);
  const uint64_t totalBytes = uint64_t(le32(header + 6)) * 2;
  if ((type != 1 && type != 2) || headerWords != kWmfHeaderSize / 2 || totalBytes < kWmfHeaderSize || totalBytes > size - offset)
    return std::nullopt;
  MetafileLayout layout;
  layout.kind = MetafileKind::Windows;
  layout.offset = offset;
  layout.size = size_t(totalBytes);
  return layout;
}

// The window extent record of a Windows metafile tells its aspect ratio when no placeable
// header does.
void findWindowExtent(const uint8_t *data, MetafileLayout &layout) {
  size_t at = layout.offset + kWmfHeaderSize;
  const size_t end = layout.offset + layout.size;
  for (int i = 0; i < kRecordsToScan && end - at >= 6; ++i) {
    const uint64_t recordBytes = uint64_t(le32(data + at)) * 2;
    if (recordBytes < 6 || recordBytes > end - at) return;
    if (le16(data + at + 4) == kMetaSetWindowExt && recordBytes >= 10) {
      setAspect(layout, s16(data + at + 8), s16(data + at + 6));
      return;
    }
    at += size_t(recordBytes);
  }
}

}  // namespace

std::optional<MetafileLayout> inspectMetafile(const uint8_t *data, size_t size) {
  if (data == nullptr || size < kWmfHeaderSize) return std::nullopt;
  if (size >= kEnhHeaderMin && le32(data) == kEmrHeader && le32(data + 40) == kEmfSignature) return inspectEnhanced(data, size);
  if (le32(data) == kPlaceableKey) {
    auto layout = inspectWindows(data, size, kPlaceableSize);
    if (layout) setAspect(*layout, int64_t(s16(data + 10)) - s16(data + 6), int64_t(s16(data + 12)) - s16(data + 8));
    return layout;
  }
  auto layout = inspectWindows(data, size, 0);
  if (layout) findWindowExtent(data, *layout);
  return layout;
}

}  // namespace devhost::preview
