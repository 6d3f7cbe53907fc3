// Owners of the GDI handles the painter uses, so that every exit path gives them back.
#pragma once

#include <windows.h>

namespace devhost::preview {

class WindowDc {
 public:
  explicit WindowDc(HWND window) : m_window(window), m_dc(GetDC(window)) {}
  ~WindowDc() {
    if (m_dc) ReleaseDC(m_window, m_dc);
  }
  WindowDc(const WindowDc &) = delete;
  WindowDc &operator=(const WindowDc &) = delete;
  HDC get() const { return m_dc; }

 private:
  HWND m_window;
  HDC m_dc;
};

// The painter changes clipping and the stretch mode; a window with its own DC would keep them.
class SavedDcState {
 public:
  explicit SavedDcState(HDC dc) : m_dc(dc), m_saved(SaveDC(dc)) {}
  ~SavedDcState() {
    if (m_saved) RestoreDC(m_dc, m_saved);
  }
  SavedDcState(const SavedDcState &) = delete;
  SavedDcState &operator=(const SavedDcState &) = delete;

 private:
  HDC m_dc;
  int m_saved;
};

template <class Handle>
class GdiObject {
 public:
  explicit GdiObject(Handle handle) : m_handle(handle) {}
  ~GdiObject() {
    if (m_handle) DeleteObject(m_handle);
  }
  GdiObject(const GdiObject &) = delete;
  GdiObject &operator=(const GdiObject &) = delete;
  Handle get() const { return m_handle; }

 private:
  Handle m_handle;
};

// A memory DC with one bitmap selected into it until the end.
class MemoryDc {
 public:
  explicit MemoryDc(HBITMAP bitmap) : m_dc(CreateCompatibleDC(nullptr)) {
    if (m_dc) m_previous = SelectObject(m_dc, bitmap);
  }
  ~MemoryDc() {
    if (m_dc) {
      SelectObject(m_dc, m_previous);
      DeleteDC(m_dc);
    }
  }
  MemoryDc(const MemoryDc &) = delete;
  MemoryDc &operator=(const MemoryDc &) = delete;
  HDC get() const { return m_dc; }

 private:
  HDC m_dc;
  HGDIOBJ m_previous = nullptr;
};

// The header of a 32-bit picture, top row first: how every raster here is laid out.
inline BITMAPINFO topDownInfo(int width, int height) {
  BITMAPINFO info = {};
  info.bmiHeader.biSize = sizeof info.bmiHeader;
  info.bmiHeader.biWidth = width;
  info.bmiHeader.biHeight = -height;
  info.bmiHeader.biPlanes = 1;
  info.bmiHeader.biBitCount = 32;
  info.bmiHeader.biCompression = BI_RGB;
  return info;
}

}  // namespace devhost::preview
