// Drawing previews per tile: decode and paint with the cache cold (the first paint of a drawing)
// and warm (every repaint after), for a 256 x 160 picture stored as an 8-bit bitmap and as a
// PNG; and the bytes read from the drawing file for one preview, against the picture's own size.
// Goals: a warm paint under 1 ms; at most the picture plus 4 KiB read.
#include "../tests/native/PreviewTestFiles.h"
#include "host/HostApi.h"
#include "preview/PreviewTestApi.h"

#include <windows.h>
#include <objidl.h>
#include <shlwapi.h>
#include <gdiplus.h>

#include <cstdio>
#include <memory>
#include <string>

using previewtest::Bytes;

namespace {

constexpr int kPictureWidth = 256, kPictureHeight = 160;
constexpr int kTileWidth = 192, kTileHeight = 144;  // a picture size the thumbnail view offers
constexpr int kColdRounds = 40, kWarmRounds = 400;

uint32_t picturePixel(int x, int y) { return previewtest::lineArt(x, y, kPictureWidth, kPictureHeight); }

Bytes paletteBitmap() {
  previewtest::DibSpec spec;
  spec.width = kPictureWidth;
  spec.height = kPictureHeight;
  spec.bitCount = 8;
  spec.colorsUsed = 256;
  for (uint32_t i = 0; i < 256; ++i) spec.palette.push_back(i == 1 ? 0xFFFFFF : i == 0 ? 0x202830 : i * 0x010101);
  Bytes rows(previewtest::dibStride(spec) * kPictureHeight, 0);
  for (int y = 0; y < kPictureHeight; ++y)
    for (int x = 0; x < kPictureWidth; ++x)
      rows[previewtest::dibStride(spec) * size_t(kPictureHeight - 1 - y) + x] = picturePixel(x, y) == 0xFFFFFF;
  return previewtest::buildDib(spec, rows);
}

// A PNG compressed as a CAD application writes one, by GDI+'s own encoder.
Bytes compressedPng() {
  Gdiplus::GdiplusStartupInput input;
  ULONG_PTR token = 0;
  Gdiplus::GdiplusStartup(&token, &input, nullptr);
  Bytes png;
  {
    Gdiplus::Bitmap bitmap(kPictureWidth, kPictureHeight, PixelFormat24bppRGB);
    for (int y = 0; y < kPictureHeight; ++y)
      for (int x = 0; x < kPictureWidth; ++x) bitmap.SetPixel(x, y, Gdiplus::Color(0xFF000000 | picturePixel(x, y)));
    IStream *stream = SHCreateMemStream(nullptr, 0);
    const CLSID pngEncoder = {0x557CF406, 0x1A04, 0x11D3, {0x9A, 0x73, 0x00, 0x00, 0xF8, 0x1E, 0xF3, 0x2E}};
    if (bitmap.Save(stream, &pngEncoder, nullptr) == Gdiplus::Ok) {
      STATSTG stat = {};
      stream->Stat(&stat, STATFLAG_NONAME);
      png.resize(size_t(stat.cbSize.QuadPart));
      const LARGE_INTEGER start = {};
      stream->Seek(start, STREAM_SEEK_SET, nullptr);
      ULONG got = 0;
      stream->Read(png.data(), ULONG(png.size()), &got);
    }
    stream->Release();
  }
  Gdiplus::GdiplusShutdown(token);
  return png;
}

std::wstring writeDrawing(const std::wstring &folder, const wchar_t *name, const Bytes &bytes) {
  const std::wstring path = folder + L"\\" + name;
  const HANDLE file = CreateFileW(path.c_str(), GENERIC_WRITE, 0, nullptr, CREATE_ALWAYS, 0, nullptr);
  DWORD written = 0;
  WriteFile(file, bytes.data(), DWORD(bytes.size()), &written, nullptr);
  CloseHandle(file);
  return path;
}

class Stopwatch {
 public:
  Stopwatch() {
    QueryPerformanceFrequency(&m_frequency);
    QueryPerformanceCounter(&m_start);
  }
  double milliseconds() const {
    LARGE_INTEGER now;
    QueryPerformanceCounter(&now);
    return double(now.QuadPart - m_start.QuadPart) * 1000.0 / double(m_frequency.QuadPart);
  }

 private:
  LARGE_INTEGER m_frequency, m_start;
};

void paint(const std::wstring &path, HWND tile) {
  const uint32_t background = 0;
  acdbDisplayPreviewFromDwg(path.c_str(), tile, &background);
  GdiFlush();
}

void measure(const char *kind, const std::wstring &path, size_t pictureSize, HWND tile) {
  paint(path, tile);  // the first paint also starts the decoders

  double cold = 0;
  for (int i = 0; i < kColdRounds; ++i) {
    devhostPreviewClearCache();
    const Stopwatch watch;
    paint(path, tile);
    cold += watch.milliseconds();
  }
  const Stopwatch watch;
  for (int i = 0; i < kWarmRounds; ++i) paint(path, tile);
  const double warm = watch.milliseconds() / kWarmRounds;

  devhostPreviewClearCache();
  const unsigned long long before = devhostPreviewBytesRead();
  paint(path, tile);
  const unsigned long long read = devhostPreviewBytesRead() - before;

  std::printf("preview_%s_cold_ms %.3f ms\n", kind, cold / kColdRounds);
  std::printf("preview_%s_warm_ms %.3f ms\n", kind, warm);
  std::printf("preview_bytes_read_%s %llu bytes\n", kind, read);
  std::printf("preview_bytes_over_picture_%s %lld bytes\n", kind, (long long)read - (long long)pictureSize);
}

}  // namespace

int main() {
  wchar_t temp[MAX_PATH];
  GetTempPathW(MAX_PATH, temp);
  const std::wstring folder = std::wstring(temp) + L"lumvex-preview-bench-" + std::to_wstring(GetCurrentProcessId());
  CreateDirectoryW(folder.c_str(), nullptr);

  const Bytes bitmap = paletteBitmap(), png = compressedPng();
  if (png.empty()) {
    std::fprintf(stderr, "bench_preview: GDI+ could not encode the PNG picture\n");
    return 1;
  }
  // Drawings of realistic size: the preview sits after the header sections, the drawing's
  // objects follow it.
  const std::wstring bitmapPath =
      writeDrawing(folder, L"Bitmap.dwg", previewtest::buildDrawing({previewtest::headerData(), {2, bitmap}}, 200000));
  const std::wstring pngPath =
      writeDrawing(folder, L"Png.dwg", previewtest::buildDrawing({previewtest::headerData(), {6, png}}, 200000));

  const HWND tile = CreateWindowExW(WS_EX_TOOLWINDOW | WS_EX_TOPMOST, L"STATIC", L"", WS_POPUP | WS_VISIBLE | WS_BORDER, 40, 40,
                                    kTileWidth + 2, kTileHeight + 2, nullptr, nullptr, nullptr, nullptr);
  MSG msg;
  while (PeekMessageW(&msg, nullptr, 0, 0, PM_REMOVE)) DispatchMessageW(&msg);

  measure("bitmap", bitmapPath, bitmap.size(), tile);
  measure("png", pngPath, png.size(), tile);

  DestroyWindow(tile);
  DeleteFileW(bitmapPath.c_str());
  DeleteFileW(pngPath.c_str());
  RemoveDirectoryW(folder.c_str());
  return 0;
}
