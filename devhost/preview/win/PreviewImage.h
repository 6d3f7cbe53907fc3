// What one drawing shows in its tile, decoded once and kept by the cache: pixels for a bitmap or
// PNG, an enhanced metafile for a metafile, or nothing at all.
#pragma once

#include "preview/DecodedPicture.h"

#include <windows.h>

#include <cstddef>
#include <cstdint>
#include <utility>
#include <vector>

namespace devhost::preview {

class EnhancedMetafile {
 public:
  EnhancedMetafile() = default;
  explicit EnhancedMetafile(HENHMETAFILE handle) : m_handle(handle) {}
  EnhancedMetafile(EnhancedMetafile &&other) noexcept : m_handle(other.m_handle) { other.m_handle = nullptr; }
  EnhancedMetafile &operator=(EnhancedMetafile &&other) noexcept {
    std::swap(m_handle, other.m_handle);
    return *this;
  }
  EnhancedMetafile(const EnhancedMetafile &) = delete;
  EnhancedMetafile &operator=(const EnhancedMetafile &) = delete;
  ~EnhancedMetafile() {
    if (m_handle) DeleteEnhMetaFile(m_handle);
  }
  HENHMETAFILE get() const { return m_handle; }

 private:
  HENHMETAFILE m_handle = nullptr;
};

// The picture as last shown: blended over that background and stretched to that size, so that a
// repaint at the same size is a plain copy (the halftone stretch is the slow part of a paint).
struct ScaledRaster {
  int32_t width = 0;
  int32_t height = 0;
  COLORREF background = 0;
  std::vector<uint32_t> pixels;
};

struct PreviewImage {
  DecodedPicture raster;
  EnhancedMetafile metafile;
  // The shape to keep when the picture is scaled; zero for a metafile that does not say, which
  // then fills the window.
  uint32_t aspectWidth = 0;
  uint32_t aspectHeight = 0;
  size_t metafileBytes = 0;
  // Made by the painter on the thread that paints tiles; never larger than the raster.
  mutable ScaledRaster scaled;

  bool hasPicture() const { return !raster.pixels.empty() || metafile.get() != nullptr; }
  // What keeping it costs, for the cache's budget, with room for the scaled copy.
  size_t cost() const { return sizeof(PreviewImage) + 2 * raster.pixels.size() * sizeof(uint32_t) + metafileBytes; }
};

}  // namespace devhost::preview
