// The preview painter on real windows: every real drawing of the fixtures, generated drawings of
// each picture kind, hostile files, and the cache of decoded previews. Each case paints from the
// window's WM_PAINT, as a thumbnail tile does, and reads the pixels back.
#include "../native/PreviewTestFiles.h"
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

class TempFolder {
 public:
  TempFolder() {
    wchar_t base[MAX_PATH];
    GetTempPathW(MAX_PATH, base);
    m_path = std::wstring(base) + L"lumvex-preview-" + std::to_wstring(GetCurrentProcessId());
    CreateDirectoryW(m_path.c_str(), nullptr);
  }
  ~TempFolder() {
    for (const std::wstring &file : m_files) DeleteFileW(file.c_str());
    RemoveDirectoryW(m_path.c_str());
  }
  std::wstring write(const std::wstring &name, const Bytes &bytes) {
    const std::wstring path = m_path + L"\\" + name;
    const HANDLE file = CreateFileW(path.c_str(), GENERIC_WRITE, 0, nullptr, CREATE_ALWAYS, 0, nullptr);
    DWORD written = 0;
    WriteFile(file, bytes.data(), DWORD(bytes.size()), &written, nullptr);
    CloseHandle(file);
    m_files.push_back(path);
    return path;
  }
  const std::wstring &path() const { return m_path; }

 private:
  std::wstring m_path;
  std::vector<std::wstring> m_files;
};

// A bordered child window whose WM_PAINT asks the host for a preview, as a tile does, inside
// a top-most frame of its own so that no other window hides it.
class PreviewWindow {
 public:
  PreviewWindow(int width, int height) {
    static const ATOM windowClass = [] {
      WNDCLASSW wc = {};
      wc.lpfnWndProc = &PreviewWindow::procedure;
      wc.hInstance = GetModuleHandleW(nullptr);
      wc.lpszClassName = L"LumvexPreviewTest";
      return RegisterClassW(&wc);  // no background brush: only the painter paints
    }();
    static int nextLeft = 0;
    const int left = 10 + nextLeft % 800;
    nextLeft += width + 40;
    m_frame = CreateWindowExW(WS_EX_TOOLWINDOW | WS_EX_TOPMOST, reinterpret_cast<LPCWSTR>(uintptr_t(windowClass)), L"",
                              WS_POPUP | WS_VISIBLE, left, 10, width + 20, height + 20, nullptr, nullptr,
                              GetModuleHandleW(nullptr), nullptr);
    m_window = CreateWindowExW(0, reinterpret_cast<LPCWSTR>(uintptr_t(windowClass)), L"", WS_CHILD | WS_VISIBLE | WS_BORDER, 10,
                               10, width + 2, height + 2, m_frame, nullptr, GetModuleHandleW(nullptr), nullptr);
    SetWindowLongPtrW(m_window, GWLP_USERDATA, LONG_PTR(this));
    pumpMessages();
  }
  ~PreviewWindow() { DestroyWindow(m_frame); }
  PreviewWindow(const PreviewWindow &) = delete;
  PreviewWindow &operator=(const PreviewWindow &) = delete;

  // Paints the drawing through WM_PAINT; the painter's result.
  bool show(const std::wstring &path) {
    m_path = path;
    m_painted = false;
    InvalidateRect(m_window, nullptr, FALSE);
    UpdateWindow(m_window);
    EXPECT_TRUE(m_painted);
    return m_result;
  }

  // The client area as 0x00RRGGBB pixels, top row first.
  std::vector<uint32_t> pixels() const {
    RECT client;
    GetClientRect(m_window, &client);
    BITMAPINFO info = {};
    info.bmiHeader.biSize = sizeof info.bmiHeader;
    info.bmiHeader.biWidth = client.right;
    info.bmiHeader.biHeight = -client.bottom;
    info.bmiHeader.biPlanes = 1;
    info.bmiHeader.biBitCount = 32;
    void *bits = nullptr;
    const HDC windowDc = GetDC(m_window);
    const HDC memoryDc = CreateCompatibleDC(windowDc);
    const HBITMAP section = CreateDIBSection(windowDc, &info, DIB_RGB_COLORS, &bits, nullptr, 0);
    const HGDIOBJ old = SelectObject(memoryDc, section);
    BitBlt(memoryDc, 0, 0, client.right, client.bottom, windowDc, 0, 0, SRCCOPY);
    GdiFlush();
    std::vector<uint32_t> result(static_cast<uint32_t *>(bits),
                                 static_cast<uint32_t *>(bits) + size_t(client.right) * client.bottom);
    for (uint32_t &pixel : result) pixel &= 0xFFFFFF;
    SelectObject(memoryDc, old);
    DeleteObject(section);
    DeleteDC(memoryDc);
    ReleaseDC(m_window, windowDc);
    return result;
  }

  int width() const { return clientRect().right; }
  int height() const { return clientRect().bottom; }

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
    if (message == WM_ERASEBKGND) return 1;
    return DefWindowProcW(window, message, wParam, lParam);
  }

  static void pumpMessages() {
    MSG msg;
    while (PeekMessageW(&msg, nullptr, 0, 0, PM_REMOVE)) DispatchMessageW(&msg);
  }

  RECT clientRect() const {
    RECT client;
    GetClientRect(m_window, &client);
    return client;
  }

  HWND m_frame = nullptr;
  HWND m_window = nullptr;
  std::wstring m_path;
  bool m_painted = false;
  bool m_result = false;
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

// A metafile of a filled rectangle, recorded by GDI itself; width x height in logical units.
Bytes enhancedMetafile(int width, int height) {
  const HDC recorder = CreateEnhMetaFileW(nullptr, nullptr, nullptr, nullptr);
  const HBRUSH brush = CreateSolidBrush(RGB(0, 128, 0));
  const RECT whole = {0, 0, width, height};
  FillRect(recorder, &whole, brush);
  DeleteObject(brush);
  const HENHMETAFILE metafile = CloseEnhMetaFile(recorder);
  Bytes bytes(GetEnhMetaFileBits(metafile, 0, nullptr));
  GetEnhMetaFileBits(metafile, UINT(bytes.size()), bytes.data());
  DeleteEnhMetaFile(metafile);
  return bytes;
}

Bytes windowsMetafile(int width, int height) {
  const HDC recorder = CreateMetaFileW(nullptr);
  SetMapMode(recorder, MM_ANISOTROPIC);
  SetWindowExtEx(recorder, width, height, nullptr);
  const HBRUSH brush = CreateSolidBrush(RGB(0, 128, 0));
  const HGDIOBJ old = SelectObject(recorder, brush);
  SelectObject(recorder, GetStockObject(NULL_PEN));
  Rectangle(recorder, 0, 0, width + 1, height + 1);
  SelectObject(recorder, old);
  DeleteObject(brush);
  const HMETAFILE metafile = CloseMetaFile(recorder);
  Bytes bytes(GetMetaFileBitsEx(metafile, 0, nullptr));
  GetMetaFileBitsEx(metafile, UINT(bytes.size()), bytes.data());
  DeleteMetaFile(metafile);
  return bytes;
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

// Drawings added to the fixtures later are not in the table: each still shows a picture when
// the painter says so, and the background alone when it does not.
TEST(PreviewPainter, EveryOtherFileOfTheFixtureFolder) {
  const std::wstring folder = fixtureFolder();
  if (folder.empty() || !exists(folder)) GTEST_SKIP() << "no fixtures beside the repository";
  PreviewWindow window(200, 200);
  WIN32_FIND_DATAW found;
  const HANDLE search = FindFirstFileW((folder + L"\\*").c_str(), &found);
  ASSERT_NE(search, INVALID_HANDLE_VALUE);
  do {
    if (found.dwFileAttributes & FILE_ATTRIBUTE_DIRECTORY) continue;
    bool known = false;
    for (const FixturePicture &fixture : kFixtures) known = known || _wcsicmp(fixture.file, found.cFileName) == 0;
    if (known) continue;
    SCOPED_TRACE(std::string(found.cFileName, found.cFileName + wcslen(found.cFileName)));
    if (window.show(folder + L"\\" + found.cFileName)) {
      const auto pixels = window.pixels();
      EXPECT_GT(countPixels(pixels, 200, {0, 0, 200, 200}).other, 0u);
    } else {
      expectBackgroundOnly(window);
    }
  } while (FindNextFileW(search, &found));
  FindClose(search);
}

TEST(PreviewPainter, GeneratedPictureOfEachKind) {
  TempFolder temp;
  PreviewWindow window(300, 220);
  const auto drawing = [&](const wchar_t *name, uint8_t code, const Bytes &picture) {
    return temp.write(name, previewtest::buildDrawing({previewtest::headerData(), {code, picture}}));
  };
  EXPECT_TRUE(window.show(drawing(L"Plan-001.DWG", 6, lineArtPng(256, 160))));
  expectLetterbox(window, 256, 160);
  EXPECT_TRUE(window.show(drawing(L"door.dwg", 2, lineArtDib(120, 200))));
  expectLetterbox(window, 120, 200);
  EXPECT_TRUE(window.show(drawing(L"Stair Detail.Dwg", 3, enhancedMetafile(400, 100))));
  expectLetterbox(window, 4, 1);
  EXPECT_TRUE(window.show(drawing(L"grid.dwg", 3, windowsMetafile(100, 200))));
  expectLetterbox(window, 1, 2);

  // Half-transparent red over the magenta background.
  EXPECT_TRUE(window.show(drawing(L"glass.dwg", 6,
                                  previewtest::buildPng(
                                      30, 22, [](int, int) { return 0x80FF0000u; }, true))));
  const uint32_t blended = pixelAt(window, 150, 110);
  EXPECT_NEAR(int(blended >> 16), 255, 3);
  EXPECT_NEAR(int(blended & 0xFF), 127, 3);
  EXPECT_NEAR(int((blended >> 8) & 0xFF), 0, 3);
}

TEST(PreviewPainter, PreferenceAndFallback) {
  TempFolder temp;
  PreviewWindow window(100, 100);
  const auto colourShown = [&](const wchar_t *name, const std::vector<previewtest::Entry> &entries) {
    EXPECT_TRUE(window.show(temp.write(name, previewtest::buildDrawing(entries))));
    return pixelAt(window, 50, 50);
  };
  const uint32_t red = 0xFF0000, green = 0x00FF00, blue = 0x0000FF;
  EXPECT_EQ(colourShown(L"a.dwg", {previewtest::headerData(), {2, solidDib(green)}, {6, solidPng(red)}}), red)
      << "PNG before bitmap";
  EXPECT_EQ(colourShown(L"b.dwg", {{2, solidDib(green)}, {2, previewtest::buildDib24(64, 40, [=](int, int) { return blue; })}}),
            blue)
      << "the larger bitmap";
  Bytes brokenPng = solidPng(red);
  brokenPng.resize(brokenPng.size() / 2);
  EXPECT_EQ(colourShown(L"c.dwg", {previewtest::headerData(), {6, brokenPng}, {2, solidDib(green)}}), green)
      << "a picture that does not decode gives way to the next";
}

TEST(PreviewPainter, HostileOrMissingDrawingsLeaveTheBackground) {
  TempFolder temp;
  PreviewWindow window(200, 150);
  previewtest::DibSpec huge;
  huge.width = 100000;
  huge.height = 100000;
  Bytes pastEnd = previewtest::buildDrawing({previewtest::headerData(), {2, lineArtDib(40, 30)}});
  previewtest::set32(pastEnd, previewtest::kDirectoryAddress + 21 + 9 + 5, 0x7FFFFFFF);
  Bytes pngBomb = lineArtPng(40, 30);
  previewtest::set32(pngBomb, 16, 0x00A00000);  // width 40960 and a bad checksum
  const std::vector<std::pair<const wchar_t *, Bytes>> files = {
      {L"huge.dwg", previewtest::buildDrawing({{2, previewtest::buildDib(huge, Bytes(64, 0))}})},
      {L"past-end.dwg", pastEnd},
      {L"bomb.dwg", previewtest::buildDrawing({{6, pngBomb}})},
      {L"notes.txt", Bytes(500, 'x')},
      {L"empty.dwg", Bytes()},
  };
  for (const auto &file : files) {
    SCOPED_TRACE(std::string(file.first, file.first + wcslen(file.first)));
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
  const std::wstring picture = temp.write(L"Cached.DWG", previewtest::buildDrawing({{6, lineArtPng(64, 40)}}));
  const std::wstring none = temp.write(L"none.dwg", previewtest::buildDrawing({previewtest::headerData()}));
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
