// The preview painter on real windows: every real drawing of the fixtures, generated drawings of
// each picture kind, hostile files, and the cache of decoded previews. Each case paints from the
// window's WM_PAINT, as a thumbnail tile does, and reads the pixels back.
#include "../native/PreviewTestFiles.h"
#include "ScratchFolder.h"
#include "host/HostApi.h"
#include "preview/PreviewTestApi.h"

#include <windows.h>

#include <gtest/gtest.h>

#include <filesystem>
#include <string>
#include <vector>

using previewtest::Bytes;

namespace {

constexpr uint32_t kBackground = 0xFF00FF;  // in no picture of these tests; the same in RGB() and in a DIB

std::wstring Write(const ScratchFolder &folder, const std::string &name, const Bytes &bytes) {
  std::ofstream(folder.File(name).c_str(), std::ios::binary)
      .write(reinterpret_cast<const char *>(bytes.data()), std::streamsize(bytes.size()));
  return std::filesystem::path(folder.File(name)).wstring();
}

// A top-most window whose WM_PAINT asks the host for a preview, as a tile does.
class PreviewWindow {
 public:
  PreviewWindow(int width, int height) : m_width(width), m_height(height) {
    static const ATOM windowClass = [] {
      WNDCLASSW wc = {};
      wc.lpfnWndProc = &PreviewWindow::procedure;
      wc.lpszClassName = L"LumvexPreviewTest";
      return RegisterClassW(&wc);  // no background brush: only the painter paints
    }();
    static int nextLeft = 10;
    m_window = CreateWindowExW(WS_EX_TOOLWINDOW | WS_EX_TOPMOST, reinterpret_cast<LPCWSTR>(uintptr_t(windowClass)), L"",
                               WS_POPUP | WS_VISIBLE, nextLeft % 800, 10, width, height, nullptr, nullptr, nullptr, nullptr);
    nextLeft += width + 20;
    SetWindowLongPtrW(m_window, GWLP_USERDATA, LONG_PTR(this));
    MSG msg;
    while (PeekMessageW(&msg, nullptr, 0, 0, PM_REMOVE)) DispatchMessageW(&msg);
  }
  ~PreviewWindow() { DestroyWindow(m_window); }

  // Paints the drawing through WM_PAINT; the painter's result.
  bool show(const std::wstring &path) {
    m_path = path;
    m_painted = false;
    InvalidateRect(m_window, nullptr, FALSE);
    UpdateWindow(m_window);
    EXPECT_TRUE(m_painted);
    return m_result;
  }

  // The window as 0x00RRGGBB pixels, top row first.
  std::vector<uint32_t> pixels() const {
    BITMAPINFO info = {};
    info.bmiHeader.biSize = sizeof info.bmiHeader;
    info.bmiHeader.biWidth = m_width;
    info.bmiHeader.biHeight = -m_height;
    info.bmiHeader.biPlanes = 1;
    info.bmiHeader.biBitCount = 32;
    void *bits = nullptr;
    const HDC windowDc = GetDC(m_window), memoryDc = CreateCompatibleDC(windowDc);
    const HBITMAP section = CreateDIBSection(windowDc, &info, DIB_RGB_COLORS, &bits, nullptr, 0);
    const HGDIOBJ old = SelectObject(memoryDc, section);
    BitBlt(memoryDc, 0, 0, m_width, m_height, windowDc, 0, 0, SRCCOPY);
    GdiFlush();
    std::vector<uint32_t> result(static_cast<uint32_t *>(bits), static_cast<uint32_t *>(bits) + size_t(m_width) * m_height);
    for (uint32_t &pixel : result) pixel &= 0xFFFFFF;
    SelectObject(memoryDc, old);
    DeleteObject(section);
    DeleteDC(memoryDc);
    ReleaseDC(m_window, windowDc);
    return result;
  }
  const int m_width, m_height;

 private:
  static LRESULT CALLBACK procedure(HWND window, UINT message, WPARAM wParam, LPARAM lParam) {
    auto *self = reinterpret_cast<PreviewWindow *>(GetWindowLongPtrW(window, GWLP_USERDATA));
    if (message == WM_PAINT && self) {
      PAINTSTRUCT paint;
      BeginPaint(window, &paint);
      self->m_result = acdbDisplayPreviewFromDwg(self->m_path.c_str(), window, &kBackground);
      self->m_painted = true;
      EndPaint(window, &paint);
      return 0;
    }
    return message == WM_ERASEBKGND ? 1 : DefWindowProcW(window, message, wParam, lParam);
  }

  HWND m_window = nullptr;
  std::wstring m_path;
  bool m_painted = false, m_result = false;
};

struct Box {
  int left, top, right, bottom;
};

// Pixels of the box that are not the background, and those that are.
std::pair<size_t, size_t> countPixels(const std::vector<uint32_t> &pixels, int width, const Box &box) {
  std::pair<size_t, size_t> count;
  for (int y = box.top; y < box.bottom; ++y)
    for (int x = box.left; x < box.right; ++x) ++(pixels[size_t(y) * width + x] == kBackground ? count.second : count.first);
  return count;
}

// The picture, scaled to fit and centred (worked out here independently of the painter), fills
// its place and the margins show the background alone. Two pixels at each edge are left out:
// the halftone stretch blends them. A picture of no size: the background alone.
void expectLetterbox(PreviewWindow &window, int pictureWidth, int pictureHeight) {
  const int w = window.m_width, h = window.m_height;
  const auto pixels = window.pixels();
  if (pictureWidth == 0) {
    EXPECT_EQ(countPixels(pixels, w, {0, 0, w, h}).first, 0u);
    return;
  }
  const double scale = std::min(double(w) / pictureWidth, double(h) / pictureHeight);
  const int pw = int(pictureWidth * scale + 0.5), ph = int(pictureHeight * scale + 0.5);
  const Box place = {(w - pw) / 2, (h - ph) / 2, (w - pw) / 2 + pw, (h - ph) / 2 + ph};
  const auto picture = countPixels(pixels, w, {place.left + 2, place.top + 2, place.right - 2, place.bottom - 2});
  EXPECT_GT(picture.first, 0u);
  EXPECT_LE(picture.second * 100, picture.first) << "the picture is not where it should be";
  for (const Box &margin :
       {Box{0, 0, w, place.top - 2}, Box{0, place.bottom + 2, w, h}, Box{0, 0, place.left - 2, h}, Box{place.right + 2, 0, w, h}})
    EXPECT_EQ(countPixels(pixels, w, margin).first, 0u)
        << "margin " << margin.left << "," << margin.top << "-" << margin.right << "," << margin.bottom;
}

Bytes lineArt(bool png, int width, int height) {
  const auto art = [=](int x, int y) { return previewtest::lineArt(x, y, width, height); };
  return png ? previewtest::buildPng(width, height, art) : previewtest::buildDib24(width, height, art);
}

Bytes solid(bool png, uint32_t colour) {
  const auto fill = [=](int, int) { return colour; };
  return png ? previewtest::buildPng(32, 20, fill) : previewtest::buildDib24(32, 20, fill);
}

}  // namespace

TEST(PreviewPainter, EveryFixtureInWideAndTallWindows) {
  const std::filesystem::path folder = std::filesystem::path(L"Z:" LUMVEX_FIXTURES_DIR) / "dwg";
  if (!std::filesystem::is_directory(folder)) GTEST_SKIP() << "no fixtures beside the repository";
  const struct {
    const char *file;
    int width, height;  // 0: the drawing shows no picture
  } fixtures[] = {
      {"r14-example.dwg", 216, 140},       {"r2000-arc.dwg", 256, 102},     {"r2004-hatch.dwg", 184, 113},
      {"r2007-two-bitmaps.dwg", 256, 160}, {"r2010-line.dwg", 256, 102},    {"r2013-arc-png.dwg", 256, 102},
      {"r2013-leader-png.dwg", 591, 448},  {"r2018-header-only.dwg", 0, 0}, {"r2018-no-images.dwg", 0, 0},
      {"r11-no-preview.dwg", 0, 0},
  };
  PreviewWindow wide(360, 160), tall(150, 260);
  for (const auto &fixture : fixtures) {
    SCOPED_TRACE(fixture.file);
    ASSERT_TRUE(std::filesystem::exists(folder / fixture.file));
    for (PreviewWindow *window : {&wide, &tall}) {
      EXPECT_EQ(window->show((folder / fixture.file).wstring()), fixture.width != 0);
      expectLetterbox(*window, fixture.width, fixture.height);
    }
  }
}

TEST(PreviewPainter, APictureThatDoesNotDecodeGivesWayToTheNext) {
  ScratchFolder temp("preview");
  PreviewWindow window(100, 100);
  const auto colourShown = [&](const char *name, const std::vector<previewtest::Entry> &entries) {
    EXPECT_TRUE(window.show(Write(temp, name, previewtest::buildDrawing(entries))));
    return window.pixels()[50 * 100 + 50];
  };
  const uint32_t red = 0xFF0000, green = 0x00FF00;
  Bytes brokenPng = solid(true, red);
  brokenPng.resize(brokenPng.size() / 2);
  EXPECT_EQ(colourShown("a.dwg", {previewtest::headerData(), {2, solid(false, green)}, {6, solid(true, red)}}), red)
      << "PNG first";
  EXPECT_EQ(colourShown("c.dwg", {previewtest::headerData(), {6, brokenPng}, {2, solid(false, green)}}), green);
}

TEST(PreviewPainter, HostileOrMissingDrawingsLeaveTheBackground) {
  ScratchFolder temp("preview");
  PreviewWindow window(200, 150);
  Bytes pastEnd = previewtest::buildDrawing({previewtest::headerData(), {2, lineArt(false, 40, 30)}});
  previewtest::set32(pastEnd, previewtest::kDirectoryAddress + 21 + 9 + 5, 0x7FFFFFFF);
  Bytes pngBomb = lineArt(true, 40, 30);
  previewtest::set32(pngBomb, 16, 0x00A00000);  // width 40960 and a bad checksum
  for (const std::wstring &path : {Write(temp, "past-end.dwg", pastEnd),
                                   Write(temp, "bomb.dwg", previewtest::buildDrawing({{6, pngBomb}})),
                                   Write(temp, "empty.dwg", Bytes()), std::filesystem::path(temp.File("missing.dwg")).wstring()}) {
    EXPECT_FALSE(window.show(path));
    expectLetterbox(window, 0, 0);
  }
  EXPECT_FALSE(acdbDisplayPreviewFromDwg(L"missing.dwg", nullptr, nullptr));
}

TEST(PreviewPainter, RepaintsComeFromTheCacheUntilTheFileChanges) {
  ScratchFolder temp("preview");
  PreviewWindow window(200, 150), other(120, 120);
  const std::wstring picture = Write(temp, "Cached.DWG", previewtest::buildDrawing({{6, lineArt(true, 64, 40)}}));
  const std::wstring none = Write(temp, "none.dwg", previewtest::buildDrawing({previewtest::headerData()}));
  devhostPreviewClearCache();

  const unsigned long start = devhostPreviewDecodeCount();
  const unsigned long long bytesBefore = devhostPreviewBytesRead();
  EXPECT_TRUE(window.show(picture));
  EXPECT_FALSE(window.show(none));
  EXPECT_EQ(devhostPreviewDecodeCount(), start + 2);
  EXPECT_GT(devhostPreviewBytesRead(), bytesBefore);

  const unsigned long long bytesAfterFirst = devhostPreviewBytesRead();
  EXPECT_TRUE(window.show(picture));
  EXPECT_TRUE(other.show(picture));
  EXPECT_FALSE(window.show(none));
  expectLetterbox(other, 64, 40);
  // The tile passes a name relative to the scanned folder, which is the current directory.
  wchar_t previous[MAX_PATH];
  GetCurrentDirectoryW(MAX_PATH, previous);
  SetCurrentDirectoryA(temp.Path().c_str());
  EXPECT_TRUE(window.show(L"cached.dwg"));
  SetCurrentDirectoryW(previous);
  EXPECT_EQ(devhostPreviewDecodeCount(), start + 2);
  EXPECT_EQ(devhostPreviewBytesRead(), bytesAfterFirst);

  // A new last-write time means a new drawing.
  const HANDLE file = CreateFileW(picture.c_str(), FILE_WRITE_ATTRIBUTES, 0, nullptr, OPEN_EXISTING, 0, nullptr);
  FILETIME stamp = {0x12345678, 0x01D00000};
  SetFileTime(file, nullptr, nullptr, &stamp);
  CloseHandle(file);
  EXPECT_TRUE(window.show(picture));
  EXPECT_EQ(devhostPreviewDecodeCount(), start + 3);
}
