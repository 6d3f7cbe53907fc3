// What one drawing shows in its tile, decoded once and kept by the cache: pixels for a bitmap or
// PNG, an enhanced metafile for a metafile, or nothing at all.
#pragma once

#include "preview/DecodedPicture.h"

#include <windows.h>

#include <cstddef>
#include <cstdint>
#include <utility>

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
    if (m_handle)
      DeleteEnhMetaFile(m_handle);
  }
  HENHMETAFILE get() const { return m_handle; }

private:
  HENHMETAFILE m_handle = nullptr;
};

struct PreviewImage {
  DecodedPicture raster;
  EnhancedMetafile metafile;
  // The shape to keep when the picture is scaled; zero for a metafile that does not say, which
  // then fills the window.
  uint32_t aspectWidth = 0;
  uint32_t aspectHeight = 0;
  size_t metafileBytes = 0;

  bool hasPicture() const { return !raster.pixels.empty() || metafile.get() != nullptr; }
  // What keeping it costs, for the cache's budget.
  size_t cost() const { return sizeof(PreviewImage) + raster.pixels.size() * sizeof(uint32_t) + metafileBytes; }
};

} // namespace devhost::preview
