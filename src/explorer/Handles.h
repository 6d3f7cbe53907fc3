// Owners of the Windows handles the explorer's tree makes: kernel handles, GDI objects and
// multimedia timers are closed when their owner is reset or goes.
#pragma once

#include <windows.h>
#include <commctrl.h>
#include <mmsystem.h>

template <class H, void (*Close)(H)>
class UniqueHandle {
 public:
  UniqueHandle() = default;
  explicit UniqueHandle(H handle) : m_handle(handle) {}
  ~UniqueHandle() { Reset(); }
  UniqueHandle(const UniqueHandle &) = delete;
  UniqueHandle &operator=(const UniqueHandle &) = delete;

  H Get() const { return m_handle; }
  explicit operator bool() const { return m_handle != H{}; }
  void Reset(H handle = H{}) {
    if (m_handle != H{}) Close(m_handle);
    m_handle = handle;
  }

 private:
  H m_handle{};
};

namespace handles {
inline void CloseKernel(HANDLE handle) { CloseHandle(handle); }
inline void DeleteBrush(HBRUSH brush) { DeleteObject(brush); }
inline void DeleteBitmap(HBITMAP bitmap) { DeleteObject(bitmap); }
inline void KillTimer(UINT id) { timeKillEvent(id); }
inline void DestroyCursorHandle(HCURSOR cursor) { DestroyCursor(cursor); }
}  // namespace handles

using KernelHandle = UniqueHandle<HANDLE, handles::CloseKernel>;
using BrushHandle = UniqueHandle<HBRUSH, handles::DeleteBrush>;
using BitmapHandle = UniqueHandle<HBITMAP, handles::DeleteBitmap>;
using TimerHandle = UniqueHandle<UINT, handles::KillTimer>;
using CursorHandle = UniqueHandle<HCURSOR, handles::DestroyCursorHandle>;

// A device context of a window's client area, released with the owner.
class ClientDeviceContext {
 public:
  explicit ClientDeviceContext(HWND hwnd) : m_hwnd(hwnd), m_dc(GetDC(hwnd)) {}
  ~ClientDeviceContext() {
    if (m_dc) ReleaseDC(m_hwnd, m_dc);
  }
  ClientDeviceContext(const ClientDeviceContext &) = delete;
  ClientDeviceContext &operator=(const ClientDeviceContext &) = delete;
  HDC Get() const { return m_dc; }

 private:
  HWND m_hwnd;
  HDC m_dc;
};
