#include "preview/win/PngDecoder.h"

#include "preview/PngHeader.h"

#include <windows.h>
#include <objidl.h>
#include <shlwapi.h>
#include <gdiplus.h>

#include <memory>

namespace devhost::preview {

namespace {

// GDI+ starts on the first PNG and stays up for the life of the process: shutting it down from
// a static destructor would run under the loader lock while the DLL unloads, which GDI+ forbids.
bool gdiplusStarted() {
  static const bool started = [] {
    Gdiplus::GdiplusStartupInput input;
    ULONG_PTR token = 0;
    return Gdiplus::GdiplusStartup(&token, &input, nullptr) == Gdiplus::Ok;
  }();
  return started;
}

struct ReleaseStream {
  void operator()(IStream *stream) const { stream->Release(); }
};

}  // namespace

bool decodePng(const uint8_t *data, size_t size, DecodedPicture &out) {
  out = DecodedPicture();
  uint32_t width = 0, height = 0;
  if (!readPngSize(data, size, width, height) || size > UINT_MAX || !gdiplusStarted()) return false;
  std::unique_ptr<IStream, ReleaseStream> stream(SHCreateMemStream(data, UINT(size)));
  if (!stream) return false;
  std::unique_ptr<Gdiplus::Bitmap> bitmap(Gdiplus::Bitmap::FromStream(stream.get()));
  if (!bitmap || bitmap->GetLastStatus() != Gdiplus::Ok || bitmap->GetWidth() != width || bitmap->GetHeight() != height)
    return false;

  std::vector<uint32_t> pixels(size_t(width) * height);
  Gdiplus::BitmapData locked = {};
  locked.Width = width;
  locked.Height = height;
  locked.Stride = INT(width * 4);
  locked.PixelFormat = PixelFormat32bppARGB;
  locked.Scan0 = pixels.data();
  Gdiplus::Rect whole(0, 0, INT(width), INT(height));
  // The decoder writes straight into our buffer, already in the layout of a 32-bit DIB.
  if (bitmap->LockBits(&whole, Gdiplus::ImageLockModeRead | Gdiplus::ImageLockModeUserInputBuf, PixelFormat32bppARGB, &locked) !=
      Gdiplus::Ok)
    return false;
  bitmap->UnlockBits(&locked);

  out.width = width;
  out.height = height;
  out.pixels = std::move(pixels);
  for (uint32_t pixel : out.pixels)
    if ((pixel >> 24) != 0xFF) {
      out.hasAlpha = true;
      break;
    }
  return true;
}

}  // namespace devhost::preview
