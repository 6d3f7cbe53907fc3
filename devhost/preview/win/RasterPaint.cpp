#include "preview/win/RasterPaint.h"

#include "preview/win/GdiHandles.h"

#include <vector>

namespace devhost::preview {

namespace {

// StretchDIBits copies; transparency has to be resolved against the background first.
std::vector<uint32_t> blendOver(const DecodedPicture &picture, COLORREF background) {
  const uint32_t backRed = GetRValue(background), backGreen = GetGValue(background), backBlue = GetBValue(background);
  std::vector<uint32_t> blended(picture.pixels.size());
  for (size_t i = 0; i < blended.size(); ++i) {
    const uint32_t pixel = picture.pixels[i];
    const uint32_t alpha = pixel >> 24;
    auto mix = [alpha](uint32_t front, uint32_t back) { return (front * alpha + back * (255 - alpha) + 127) / 255; };
    blended[i] = 0xFF000000u | mix((pixel >> 16) & 0xFF, backRed) << 16 | mix((pixel >> 8) & 0xFF, backGreen) << 8 |
                 mix(pixel & 0xFF, backBlue);
  }
  return blended;
}

void stretchInto(HDC dc, const FitRect &to, const uint32_t *pixels, uint32_t width, uint32_t height) {
  SetStretchBltMode(dc, HALFTONE);
  SetBrushOrgEx(dc, 0, 0, nullptr);
  const BITMAPINFO info = topDownInfo(int(width), int(height));
  StretchDIBits(dc, to.left, to.top, to.width, to.height, 0, 0, int(width), int(height), pixels, &info, DIB_RGB_COLORS, SRCCOPY);
}

bool stretchToBuffer(const uint32_t *pixels, uint32_t width, uint32_t height, const FitRect &fit, std::vector<uint32_t> &scaled) {
  const BITMAPINFO info = topDownInfo(fit.width, fit.height);
  void *bits = nullptr;
  const GdiObject<HBITMAP> section(CreateDIBSection(nullptr, &info, DIB_RGB_COLORS, &bits, nullptr, 0));
  if (section.get() == nullptr || bits == nullptr) return false;
  const MemoryDc dc(section.get());
  if (dc.get() == nullptr) return false;
  stretchInto(dc.get(), FitRect{0, 0, fit.width, fit.height}, pixels, width, height);
  GdiFlush();
  const auto *first = static_cast<const uint32_t *>(bits);
  scaled.assign(first, first + size_t(fit.width) * size_t(fit.height));
  return true;
}

}  // namespace

void paintRaster(HDC dc, const FitRect &fit, const PreviewImage &image, COLORREF background) {
  const DecodedPicture &picture = image.raster;
  ScaledRaster &scaled = image.scaled;
  const bool reusable = !scaled.pixels.empty() && scaled.width == fit.width && scaled.height == fit.height &&
                        (!picture.hasAlpha || scaled.background == background);
  if (!reusable) {
    scaled = ScaledRaster();
    std::vector<uint32_t> blended;
    const uint32_t *source = picture.pixels.data();
    if (picture.hasAlpha) {
      blended = blendOver(picture, background);
      source = blended.data();
    }
    // A copy larger than the picture itself is not kept: the cache's budget has no room for it.
    const bool keep = uint64_t(fit.width) * uint64_t(fit.height) <= picture.pixels.size();
    if (!keep || !stretchToBuffer(source, picture.width, picture.height, fit, scaled.pixels)) {
      stretchInto(dc, fit, source, picture.width, picture.height);
      return;
    }
    scaled.width = fit.width;
    scaled.height = fit.height;
    scaled.background = background;
  }
  const BITMAPINFO info = topDownInfo(scaled.width, scaled.height);
  SetDIBitsToDevice(dc, fit.left, fit.top, DWORD(scaled.width), DWORD(scaled.height), 0, 0, 0, UINT(scaled.height),
                    scaled.pixels.data(), &info, DIB_RGB_COLORS);
}

}  // namespace devhost::preview
