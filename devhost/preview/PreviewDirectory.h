// The preview directory of a drawing: found through the address at offset 0x0D, it lists the
// header data and the pictures (bitmap, metafile, PNG) that the drawing stores.
#pragma once

#include "preview/PreviewSource.h"

#include <cstdint>
#include <optional>
#include <vector>

namespace devhost::preview {

enum PreviewCode : uint8_t {
  kHeaderData = 1,
  kBitmap = 2,  // device-independent bitmap without a file header
  kMetafile = 3,
  kPng = 6,
};

constexpr uint64_t kPreviewAddressOffset = 0x0D;
// No preview is this large; a bigger entry is damage, and reading it would cost memory for nothing.
constexpr uint32_t kMaxPictureBytes = 64u << 20;

struct PreviewEntry {
  uint8_t code = 0;
  uint32_t start = 0;
  uint32_t size = 0;
};

struct PreviewDirectory {
  // Only entries whose bytes lie wholly inside the file are kept.
  std::vector<PreviewEntry> entries;
};

// The drawing's preview directory, or nothing when it has none or it cannot be trusted.
std::optional<PreviewDirectory> readPreviewDirectory(PreviewSource &source);

// The pictures in the order a painter tries them: PNG first (lossless and written by the newest
// releases at the highest resolution), then bitmaps from the largest (exact pixels), metafiles
// last (their extents and the GDI records inside vary most between writers).
std::vector<PreviewEntry> picturesByPreference(const PreviewDirectory &directory);

// The bytes of one entry; false when it is too large or cannot be read.
bool readEntryBytes(PreviewSource &source, const PreviewEntry &entry, std::vector<uint8_t> &bytes);

}  // namespace devhost::preview
