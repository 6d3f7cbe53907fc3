// The preview painter on real windows: every real drawing of the fixtures, generated drawings of
// each picture kind, hostile files, and the cache of decoded previews. Each case paints from the
// window's WM_PAINT, as a thumbnail tile does, and reads the pixels back.
#include "../native/PreviewTestFiles.h"
#include "ScratchFolder.h"
#include "host/HostApi.h"
#include "preview/PreviewTestApi.h"

#include <windows.h>

#include <gtest/gtest.h>

#include <string>
#include <vector>

using previewtest::Bytes;

namespace {

constexpr COLORREF kBackground = RGB(255, 0, 255);  // in no picture of these tests
constexpr uint32_t kBackgroundPixel = 0xFF00FF;     // the same colour as read from a 32-bit DIB

std::wstring folderOf(const std::wstring &path) { return path.substr(0, path.find_last_of(L"\\/")); }

bool exists(const std::wstring &path) { return GetFileAttributesW(path.c_str()) != INVALID_FILE_ATTRIBUTES; }

// The fixtures lie beside the repository: walk up from this program to the folder holding
// CMakePresets.json, then to ../shared/fixtures/dwg.
std::wstring fixtureFolder() {
  wchar_t self[MAX_PATH];
  GetModuleFileNameW(nullptr, self, MAX_PATH);
  for (std::wstring folder = folderOf(self); folder.size() > 3; folder = folderOf(folder))
    if (exists(folder + L"\\CMakePresets.json")) return folder + L"\\..\\shared\\fixtures\\dwg";
  return L"";
}

std::wstring Wide(const std::string &ascii) { return std::wstring(ascii.begin(), ascii.end()); }

// Drawings written into a folder of their own.
class TempFolder : public ScratchFolder {
 public:
  TempFolder() : ScratchFolder("preview") {}
  std::wstring write(const std::string &name, const Bytes &bytes) const {
    std::ofstream(File(name).c_str(), std::ios::binary)
        .write(reinterpret_cast<const char *>(bytes.data()), std::streamsize(bytes.size()));
    return Wide(File(name));
  }
  std::wstring path() const { return Wide(Path()); }
};

// A top-most window whose WM_PAINT asks the host for a preview, as a tile does.
class PreviewWindow {
 public:
  PreviewWindow(int width, int height) : m_width(width), m_height(height) {
    static const ATOM windowClass = [] {
      WNDCLASSW wc = {};
      wc.lpfnWndProc = &PreviewWindow::procedure;
      wc.hInstance = GetModuleHandleW(nullptr);
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
    info.bmiHeader = {sizeof info.bmiHeader, m_width, -m_height, 1, 32};
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
  int width() const { return m_width; }
  int height() const { return m_height; }

 private:
  static LRESULT CALLBACK procedure(HWND window, UINT message, WPARAM wParam, LPARAM lParam) {
    auto *self = reinterpret_cast<PreviewWindow *>(GetWindowLongPtrW(window, GWLP_USERDATA));
    if (message == WM_PAINT && self) {
      PAINTSTRUCT paint;
      BeginPaint(window, &paint);
      const uint32_t background = kBackground;
      self->m_result = acdbDisplayPreviewFromDwg(self->m_path.c_str(), window, &background);
      self->m_painted = true;
      EndPaint(window, &paint);
      return 0;
    }
    return message == WM_ERASEBKGND ? 1 : DefWindowProcW(window, message, wParam, lParam);
  }

  int m_width, m_height;
  HWND m_window = nullptr;
  std::wstring m_path;
  bool m_painted = false, m_result = false;
};

struct Box {
  int left, top, right, bottom;
};

// Where a width x height picture should land in the window, worked out independently of the painter.
Box expectedPlace(int pictureWidth, int pictureHeight, int windowWidth, int windowHeight) {
  const double scale = std::min(double(windowWidth) / pictureWidth, double(windowHeight) / pictureHeight);
  const int w = int(pictureWidth * scale + 0.5), h = int(pictureHeight * scale + 0.5);
  const int left = (windowWidth - w) / 2, top = (windowHeight - h) / 2;
  return {left, top, left + w, top + h};
}

struct PixelCount {
  size_t background = 0;
  size_t other = 0;
};

PixelCount countPixels(const std::vector<uint32_t> &pixels, int width, const Box &box) {
  PixelCount count;
  for (int y = box.top; y < box.bottom; ++y)
    for (int x = box.left; x < box.right; ++x)
      ++(pixels[size_t(y) * width + x] == kBackgroundPixel ? count.background : count.other);
  return count;
}

// The picture fills its place and the margins around it show the background alone. Two pixels
// at each edge are left out: the halftone stretch blends them.
void expectLetterbox(PreviewWindow &window, int pictureWidth, int pictureHeight) {
  const int w = window.width(), h = window.height();
  const Box place = expectedPlace(pictureWidth, pictureHeight, w, h);
  const auto pixels = window.pixels();
  const Box inside = {place.left + 2, place.top + 2, place.right - 2, place.bottom - 2};
  const PixelCount picture = countPixels(pixels, w, inside);
  EXPECT_GT(picture.other, 0u);
  EXPECT_LE(picture.background * 100, picture.other) << "the picture is not where it should be";
  for (const Box &margin :
       {Box{0, 0, w, place.top - 2}, Box{0, place.bottom + 2, w, h}, Box{0, 0, place.left - 2, h}, Box{place.right + 2, 0, w, h}})
    EXPECT_EQ(countPixels(pixels, w, margin).other, 0u)
        << "margin " << margin.left << "," << margin.top << "-" << margin.right << "," << margin.bottom;
}

void expectBackgroundOnly(PreviewWindow &window) {
  const auto pixels = window.pixels();
  const PixelCount all = countPixels(pixels, window.width(), {0, 0, window.width(), window.height()});
  EXPECT_EQ(all.other, 0u);
  EXPECT_GT(all.background, 0u);
}

uint32_t pixelAt(PreviewWindow &window, int x, int y) { return window.pixels()[size_t(y) * window.width() + x]; }

Bytes lineArtPng(int width, int height) {
  return previewtest::buildPng(width, height, [=](int x, int y) { return previewtest::lineArt(x, y, width, height); });
}

Bytes lineArtDib(int width, int height) {
  return previewtest::buildDib24(width, height, [=](int x, int y) { return previewtest::lineArt(x, y, width, height); });
}

Bytes solidPng(uint32_t colour) {
  return previewtest::buildPng(32, 20, [=](int, int) { return colour; });
}

Bytes solidDib(uint32_t colour) {
  return previewtest::buildDib24(32, 20, [=](int, int) { return colour; });
}

struct FixturePicture {
  const wchar_t *file;
  int width, height;  // 0: the drawing shows no picture
};

const FixturePicture kFixtures[] = {
    {L"r14-example.dwg", 216, 140},       {L"r2000-arc.dwg", 256, 102},     {L"r2004-hatch.dwg", 184, 113},
    {L"r2007-two-bitmaps.dwg", 256, 160}, {L"r2010-line.dwg", 256, 102},    {L"r2013-arc-png.dwg", 256, 102},
    {L"r2013-leader-png.dwg", 591, 448},  {L"r2018-header-only.dwg", 0, 0}, {L"r2018-no-images.dwg", 0, 0},
    {L"r11-no-preview.dwg", 0, 0},
};

}  // namespace

TEST(PreviewPainter, EveryFixtureInWideAndTallWindows) {
  const std::wstring folder = fixtureFolder();
  if (folder.empty() || !exists(folder)) GTEST_SKIP() << "no fixtures beside the repository";
  PreviewWindow wide(360, 160), tall(150, 260);
  for (const FixturePicture &fixture : kFixtures) {
    SCOPED_TRACE(std::string(fixture.file, fixture.file + wcslen(fixture.file)));
    const std::wstring path = folder + L"\\" + fixture.file;
    ASSERT_TRUE(exists(path));
    for (PreviewWindow *window : {&wide, &tall}) {
      const bool painted = window->show(path);
      if (fixture.width == 0) {
        EXPECT_FALSE(painted);
        expectBackgroundOnly(*window);
      } else {
        EXPECT_TRUE(painted);
        expectLetterbox(*window, fixture.width, fixture.height);
      }
    }
  }
}

TEST(PreviewPainter, APictureThatDoesNotDecodeGivesWayToTheNext) {
  TempFolder temp;
  PreviewWindow window(100, 100);
  const auto colourShown = [&](const char *name, const std::vector<previewtest::Entry> &entries) {
    EXPECT_TRUE(window.show(temp.write(name, previewtest::buildDrawing(entries))));
    return pixelAt(window, 50, 50);
  };
  const uint32_t red = 0xFF0000, green = 0x00FF00;
  Bytes brokenPng = solidPng(red);
  brokenPng.resize(brokenPng.size() / 2);
  EXPECT_EQ(colourShown("a.dwg", {previewtest::headerData(), {2, solidDib(green)}, {6, solidPng(red)}}), red) << "PNG first";
  EXPECT_EQ(colourShown("c.dwg", {previewtest::headerData(), {6, brokenPng}, {2, solidDib(green)}}), green);
}

TEST(PreviewPainter, HostileOrMissingDrawingsLeaveTheBackground) {
  TempFolder temp;
  PreviewWindow window(200, 150);
  Bytes pastEnd = previewtest::buildDrawing({previewtest::headerData(), {2, lineArtDib(40, 30)}});
  previewtest::set32(pastEnd, previewtest::kDirectoryAddress + 21 + 9 + 5, 0x7FFFFFFF);
  Bytes pngBomb = lineArtPng(40, 30);
  previewtest::set32(pngBomb, 16, 0x00A00000);  // width 40960 and a bad checksum
  const std::vector<std::pair<const char *, Bytes>> files = {
      {"past-end.dwg", pastEnd},
      {"bomb.dwg", previewtest::buildDrawing({{6, pngBomb}})},
      {"empty.dwg", Bytes()},
  };
  for (const auto &file : files) {
    SCOPED_TRACE(file.first);
    EXPECT_FALSE(window.show(temp.write(file.first, file.second)));
    expectBackgroundOnly(window);
  }
  EXPECT_FALSE(window.show(temp.path() + L"\\missing.dwg"));
  expectBackgroundOnly(window);
  EXPECT_FALSE(acdbDisplayPreviewFromDwg(L"missing.dwg", nullptr, nullptr));
}

TEST(PreviewPainter, RepaintsComeFromTheCacheUntilTheFileChanges) {
  TempFolder temp;
  PreviewWindow window(200, 150), other(120, 120);
  const std::wstring picture = temp.write("Cached.DWG", previewtest::buildDrawing({{6, lineArtPng(64, 40)}}));
  const std::wstring none = temp.write("none.dwg", previewtest::buildDrawing({previewtest::headerData()}));
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
  SetCurrentDirectoryW(temp.path().c_str());
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
