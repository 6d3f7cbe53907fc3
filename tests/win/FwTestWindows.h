// Shared pieces of the framework's window tests: a top-level window to host controls, message
// pumping, and mouse input that the window system delivers as a person's would.
#pragma once

#include "CaseTimeLimit.h"
#include "fw/Wnd.h"

#include <gtest/gtest.h>
#include <windows.h>

#include <cstdlib>
#include <string>
#include <vector>

namespace fwtest {

using Log = std::vector<std::string>;

// Dispatches this thread's messages for about `milliseconds`.
inline void Pump(DWORD milliseconds = 50) {
  const DWORD start = GetTickCount();
  MSG msg;
  do {
    while (PeekMessageA(&msg, nullptr, 0, 0, PM_REMOVE)) {
      TranslateMessage(&msg);
      DispatchMessageA(&msg);
    }
    Sleep(5);
  } while (GetTickCount() - start < milliseconds);
}

// Pumps messages until `done` holds; input reaches the window system's queue at its own pace on
// a busy machine, but a condition that has not come after five seconds fails the case.
template <class Condition>
void PumpUntil(const char *what, Condition done) {
  const WaitingFor waiting(what);
  const DWORD start = GetTickCount();
  while (!done()) {
    if (GetTickCount() - start > 5000) {
      ADD_FAILURE() << "gave up waiting for " << what;
      return;
    }
    Pump(10);
  }
}

inline POINT CursorPosition() {
  POINT pt{};
  GetCursorPos(&pt);
  return pt;
}

// The top-level window the test's input is meant for. Other programs' windows may show up on
// the same display at any time, so it is raised above them before every input.
inline HWND &InputWindow() {
  static HWND window = nullptr;
  return window;
}

inline void RaiseInputWindow() {
  if (!IsWindow(InputWindow())) return;
  SetWindowPos(InputWindow(), HWND_TOPMOST, 0, 0, 0, 0, SWP_NOMOVE | SWP_NOSIZE | SWP_NOACTIVATE);
  if (GetForegroundWindow() != InputWindow()) SetForegroundWindow(InputWindow());
}

// Moves the pointer to a screen point through the input queue, as a mouse would.
inline void MouseTo(POINT screen) {
  RaiseInputWindow();
  INPUT input{};
  input.type = INPUT_MOUSE;
  input.mi.dx = (screen.x * 65536 + GetSystemMetrics(SM_CXSCREEN) / 2) / GetSystemMetrics(SM_CXSCREEN);
  input.mi.dy = (screen.y * 65536 + GetSystemMetrics(SM_CYSCREEN) / 2) / GetSystemMetrics(SM_CYSCREEN);
  input.mi.dwFlags = MOUSEEVENTF_MOVE | MOUSEEVENTF_ABSOLUTE;
  SendInput(1, &input, sizeof(input));
  PumpUntil("the pointer to reach its point", [&] {
    const POINT now = CursorPosition();
    return abs(now.x - screen.x) <= 1 && abs(now.y - screen.y) <= 1;
  });
  Pump();
}

// Presses or releases the left button where the pointer is; done once this thread has seen it.
inline void MouseButton(bool down) {
  RaiseInputWindow();
  INPUT input{};
  input.type = INPUT_MOUSE;
  input.mi.dwFlags = down ? MOUSEEVENTF_LEFTDOWN : MOUSEEVENTF_LEFTUP;
  SendInput(1, &input, sizeof(input));
  PumpUntil(down ? "the left button to be down" : "the left button to be up",
            [&] { return (GetKeyState(VK_LBUTTON) < 0) == down; });
  Pump();
}

inline POINT ScreenPoint(HWND window, int x, int y) {
  POINT pt{x, y};
  ClientToScreen(window, &pt);
  return pt;
}

// A visible top-level window of the framework's own class at a fixed place on the screen that
// receives the test's input.
class TopWindow : public fw::CWnd {
 public:
  BOOL Create(int width = 600, int height = 400) {
    const RECT place{40, 40, 40 + width, 40 + height};
    if (!CreateEx(0, nullptr, "fw test", WS_POPUP | WS_VISIBLE | WS_CLIPCHILDREN, place, static_cast<HWND>(nullptr), 0))
      return FALSE;
    InputWindow() = m_hWnd;
    RaiseInputWindow();
    return TRUE;
  }
};

}  // namespace fwtest
