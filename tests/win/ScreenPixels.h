// What the screen shows over a rectangle, as a person sees it, read back as 0x00RRGGBB pixels
// row by row: painting of any process of this display and Wine server is there.
#pragma once

#include <windows.h>

#include <vector>

inline std::vector<DWORD> ScreenPixels(const RECT &rect) {
  const int width = rect.right - rect.left, height = rect.bottom - rect.top;
  std::vector<DWORD> pixels;
  if (width <= 0 || height <= 0) return pixels;
  BITMAPINFO info{};
  info.bmiHeader = {sizeof info.bmiHeader, width, -height, 1, 32, BI_RGB, 0, 0, 0, 0, 0};
  void *bits = nullptr;
  HDC screen = GetDC(nullptr);
  HDC memory = CreateCompatibleDC(screen);
  HBITMAP picture = CreateDIBSection(screen, &info, DIB_RGB_COLORS, &bits, nullptr, 0);
  if (memory && picture) {
    HGDIOBJ old = SelectObject(memory, picture);
    BitBlt(memory, 0, 0, width, height, screen, rect.left, rect.top, SRCCOPY);
    SelectObject(memory, old);
    const auto *first = static_cast<const DWORD *>(bits);
    pixels.assign(first, first + static_cast<size_t>(width) * height);
    for (DWORD &pixel : pixels) pixel &= 0xFFFFFF;
  }
  if (picture) DeleteObject(picture);
  if (memory) DeleteDC(memory);
  ReleaseDC(nullptr, screen);
  return pixels;
}
