// acdbDisplayPreviewFromDwg: paints a drawing's stored preview into a window, scaled to fit with
// its aspect ratio kept and centred on the background colour. Tiles paint on the one
// user-interface thread, so the cache and the counters here take no locks.
#include "host/HostApi.h"
#include "preview/PreviewCache.h"
#include "preview/PreviewFit.h"
#include "preview/PreviewTestApi.h"
#include "preview/win/GdiHandles.h"
#include "preview/win/PreviewFile.h"
#include "preview/win/PreviewImage.h"
#include "preview/win/PreviewLoader.h"
#include "preview/win/RasterPaint.h"

#include <windows.h>

#include <memory>
#include <string>

using namespace devhost::preview;

namespace {

// A thumbnail view shows a few dozen tiles; this keeps a few screens of them.
constexpr size_t kCacheEntries = 64;
constexpr size_t kCacheBytes = 32u << 20;

unsigned long g_decodeCount = 0;

PreviewCache<PreviewImage> &previewCache() {
  static PreviewCache<PreviewImage> cache(kCacheEntries, kCacheBytes);
  return cache;
}

// The cache key of the drawing: its full path (tiles pass names relative to the current folder)
// in lower case, as file names are compared here, its size and its last-write time. False when
// the file is not there.
bool keyOf(const wchar_t *path, std::wstring &full, PreviewKey &key) {
  const DWORD length = GetFullPathNameW(path, 0, nullptr, nullptr);
  if (length == 0) return false;
  full.assign(length, L'\0');
  const DWORD written = GetFullPathNameW(path, length, &full[0], nullptr);
  if (written == 0 || written >= length) return false;
  full.resize(written);
  WIN32_FILE_ATTRIBUTE_DATA attributes;
  if (!GetFileAttributesExW(full.c_str(), GetFileExInfoStandard, &attributes) ||
      (attributes.dwFileAttributes & FILE_ATTRIBUTE_DIRECTORY))
    return false;
  key.path = full;
  CharLowerBuffW(&key.path[0], DWORD(key.path.size()));
  key.size = uint64_t(attributes.nFileSizeHigh) << 32 | attributes.nFileSizeLow;
  key.lastWrite = uint64_t(attributes.ftLastWriteTime.dwHighDateTime) << 32 | attributes.ftLastWriteTime.dwLowDateTime;
  return true;
}

std::shared_ptr<const PreviewImage> previewOf(const wchar_t *path) {
  std::wstring full;
  PreviewKey key;
  if (path == nullptr || !keyOf(path, full, key)) return nullptr;
  if (auto kept = previewCache().find(key)) return kept;
  ++g_decodeCount;
  // A file that exists but cannot be opened now (another program holds it) is tried again on
  // the next paint; a drawing without a picture is kept like any other, so that repainting it
  // does not read the file again.
  const auto file = PreviewFile::open(full.c_str());
  if (!file) return nullptr;
  auto image = std::make_shared<PreviewImage>(loadPreviewImage(*file));
  previewCache().store(key, image);
  return image;
}

void paint(HDC dc, const RECT &client, COLORREF background, const PreviewImage *image) {
  SavedDcState saved(dc);
  const GdiObject<HBRUSH> brush(CreateSolidBrush(background));
  const int32_t width = client.right - client.left, height = client.bottom - client.top;
  if (image == nullptr || !image->hasPicture()) {
    FillRect(dc, &client, brush.get());
    return;
  }
  FitRect fit;
  if (image->aspectWidth != 0)
    fit = fitCentred(image->aspectWidth, image->aspectHeight, width, height);
  else
    fit = FitRect{0, 0, width, height};
  fit.left += client.left;
  fit.top += client.top;
  const RECT picture = {fit.left, fit.top, fit.left + fit.width, fit.top + fit.height};

  // The margins are filled around the picture rather than under it, so a repaint does not flash.
  ExcludeClipRect(dc, picture.left, picture.top, picture.right, picture.bottom);
  FillRect(dc, &client, brush.get());
  SelectClipRgn(dc, nullptr);
  if (image->metafile.get()) {
    // A metafile draws only its strokes: its own background comes first.
    FillRect(dc, &picture, brush.get());
    PlayEnhMetaFile(dc, image->metafile.get(), &picture);
  } else {
    paintRaster(dc, fit, *image, background);
  }
}

}  // namespace

extern "C" bool acdbDisplayPreviewFromDwg(const ACHAR *path, void *window, const uint32_t *background) {
  try {
    const HWND target = static_cast<HWND>(window);
    if (target == nullptr || !IsWindow(target)) return false;
    // Only the colour: the top byte of a COLORREF would select palette colours instead.
    const COLORREF colour = background ? COLORREF(*background & 0x00FFFFFF) : RGB(0, 0, 0);
    const auto image = previewOf(path);
    WindowDc dc(target);
    if (dc.get() == nullptr) return false;
    RECT client;
    GetClientRect(target, &client);
    paint(dc.get(), client, colour, image.get());
    return image && image->hasPicture();
  } catch (...) {
    return false;  // out of memory: nothing painted, nothing thrown into the caller's paint handler
  }
}

extern "C" unsigned long devhostPreviewDecodeCount() { return g_decodeCount; }

extern "C" unsigned long long devhostPreviewBytesRead() { return PreviewFile::totalBytesRead(); }

extern "C" void devhostPreviewClearCache() { previewCache().clear(); }
