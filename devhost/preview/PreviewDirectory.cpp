#include "preview/PreviewDirectory.h"

#include <algorithm>
#include <cstring>

namespace devhost::preview {

namespace {

constexpr uint8_t kSentinel[16] = {0x1F, 0x25, 0x6D, 0x07, 0xD4, 0x36, 0x28, 0x28,
                                   0x9D, 0x57, 0xCA, 0x3F, 0x9D, 0x44, 0x10, 0x2B};
constexpr size_t kFixedPartSize = sizeof(kSentinel) + 4 + 1;  // sentinel, overall size, count
constexpr size_t kEntrySize = 1 + 4 + 4;

uint32_t readLe32(const uint8_t *p) { return uint32_t(p[0]) | uint32_t(p[1]) << 8 | uint32_t(p[2]) << 16 | uint32_t(p[3]) << 24; }

bool isPicture(uint8_t code) { return code == kBitmap || code == kMetafile || code == kPng; }

}  // namespace

std::optional<PreviewDirectory> readPreviewDirectory(PreviewSource &source) {
  const uint64_t fileSize = source.size();
  uint8_t addressBytes[4];
  if (!source.read(kPreviewAddressOffset, addressBytes, sizeof addressBytes)) return std::nullopt;
  const uint64_t address = readLe32(addressBytes);

  // Older drawings keep something else at 0x0D; the sentinel tells a directory from chance.
  uint8_t fixed[kFixedPartSize];
  if (address < kPreviewAddressOffset + 4 || !source.read(address, fixed, sizeof fixed)) return std::nullopt;
  if (std::memcmp(fixed, kSentinel, sizeof kSentinel) != 0) return std::nullopt;
  // The overall size is not needed to find anything, and writers differ in what they count,
  // so it is not held against the file.
  const size_t count = fixed[kFixedPartSize - 1];

  uint8_t table[255 * kEntrySize];
  if (!source.read(address + kFixedPartSize, table, count * kEntrySize)) return std::nullopt;

  PreviewDirectory directory;
  for (size_t i = 0; i < count; ++i) {
    const uint8_t *raw = table + i * kEntrySize;
    PreviewEntry entry;
    entry.code = raw[0];
    entry.start = readLe32(raw + 1);
    entry.size = readLe32(raw + 5);
    if (uint64_t(entry.start) + entry.size > fileSize) continue;
    directory.entries.push_back(entry);
  }
  return directory;
}

std::vector<PreviewEntry> picturesByPreference(const PreviewDirectory &directory) {
  std::vector<PreviewEntry> pictures;
  for (const PreviewEntry &entry : directory.entries)
    if (isPicture(entry.code) && entry.size != 0 && entry.size <= kMaxPictureBytes) pictures.push_back(entry);
  auto rank = [](uint8_t code) { return code == kPng ? 0 : code == kBitmap ? 1 : 2; };
  std::stable_sort(pictures.begin(), pictures.end(), [&](const PreviewEntry &a, const PreviewEntry &b) {
    if (rank(a.code) != rank(b.code)) return rank(a.code) < rank(b.code);
    return a.size > b.size;
  });
  return pictures;
}

bool readEntryBytes(PreviewSource &source, const PreviewEntry &entry, std::vector<uint8_t> &bytes) {
  bytes.clear();
  if (entry.size > kMaxPictureBytes || uint64_t(entry.start) + entry.size > source.size()) return false;
  bytes.resize(entry.size);
  if (!source.read(entry.start, bytes.data(), bytes.size())) {
    bytes.clear();
    return false;
  }
  return true;
}

}  // namespace devhost::preview
