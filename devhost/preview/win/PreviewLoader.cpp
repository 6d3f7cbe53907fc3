#include "preview/win/PreviewLoader.h"

#include "preview/DibDecoder.h"
#include "preview/MetafileLayout.h"
#include "preview/PreviewDirectory.h"
#include "preview/win/PngDecoder.h"

#include <vector>

namespace devhost::preview {

namespace {

bool loadMetafile(const std::vector<uint8_t> &bytes, PreviewImage &image) {
  const auto layout = inspectMetafile(bytes.data(), bytes.size());
  if (!layout) return false;
  const BYTE *start = bytes.data() + layout->offset;
  // A Windows metafile becomes an enhanced one so that both play the same way; without a
  // picture description GDI maps its window onto the whole frame, which is then fitted.
  const HENHMETAFILE handle = layout->kind == MetafileKind::Enhanced
                                  ? SetEnhMetaFileBits(UINT(layout->size), start)
                                  : SetWinMetaFileBits(UINT(layout->size), start, nullptr, nullptr);
  if (handle == nullptr) return false;
  image.metafile = EnhancedMetafile(handle);
  image.metafileBytes = layout->size;
  image.aspectWidth = layout->aspectWidth;
  image.aspectHeight = layout->aspectHeight;
  return true;
}

bool loadPicture(const PreviewEntry &entry, const std::vector<uint8_t> &bytes, PreviewImage &image) {
  switch (entry.code) {
    case kPng:
      if (!decodePng(bytes.data(), bytes.size(), image.raster)) return false;
      break;
    case kBitmap:
      if (!decodeDib(bytes.data(), bytes.size(), image.raster)) return false;
      break;
    default: return loadMetafile(bytes, image);
  }
  image.aspectWidth = image.raster.width;
  image.aspectHeight = image.raster.height;
  return true;
}

}  // namespace

PreviewImage loadPreviewImage(PreviewSource &source) {
  PreviewImage image;
  const auto directory = readPreviewDirectory(source);
  if (!directory) return image;
  std::vector<uint8_t> bytes;
  for (const PreviewEntry &entry : picturesByPreference(*directory)) {
    if (readEntryBytes(source, entry, bytes) && loadPicture(entry, bytes, image)) return image;
    image = PreviewImage();
  }
  return image;
}

}  // namespace devhost::preview
