// The host's colour dialog, "Select Color": a grid of the 255 index colours (24 hues of ten
// shades, the nine named colours, six greys), the chosen index in an edit box, OK and Cancel.
// A click picks a colour, a double click picks it and accepts, and an index typed in the box
// picks that colour.
#include "runtime/AciColors.h"
#include "runtime/HostState.h"

#include <algorithm>
#include <cwchar>
#include <string>

namespace {
constexpr int kIndexEdit = 100;
constexpr int kCell = 12;
constexpr int kPitch = 14;
constexpr int kBigCell = 16;
constexpr int kBigPitch = 18;
constexpr int kMargin = 10;
constexpr int kLowerRowTop = kMargin + 10 * kPitch + 10;
constexpr int kGreysLeft = kMargin + 9 * kBigPitch + 20;
constexpr int kGridWidth = 2 * kMargin + 24 * kPitch;
constexpr int kGridHeight = kLowerRowTop + kBigCell + kMargin;
const wchar_t *const kDialogClass = L"DevhostSelectColor";
const wchar_t *const kGridClass = L"DevhostAciGrid";

// Where index `index` is drawn in the grid.
RECT CellRect(int index) {
  int left, top, size;
  if (index >= 10 && index < 250) {
    left = kMargin + (index / 10 - 1) * kPitch;
    top = kMargin + (index % 10) * kPitch;
    size = kCell;
  } else {
    left = index < 10 ? kMargin + (index - 1) * kBigPitch : kGreysLeft + (index - 250) * kBigPitch;
    top = kLowerRowTop;
    size = kBigCell;
  }
  return RECT{left, top, left + size, top + size};
}

int IndexAt(POINT point) {
  for (int index = 1; index <= 255; ++index) {
    const RECT cell = CellRect(index);
    if (PtInRect(&cell, point)) return index;
  }
  return 0;
}

COLORREF ColorOf(int index) {
  const devhost::Rgb rgb = devhost::AciColor(index);
  return RGB(rgb.red, rgb.green, rgb.blue);
}

struct DialogState {
  int index;
  bool done = false;
  bool accepted = false;
  HWND dialog = nullptr;
  HWND grid = nullptr;
  HWND edit = nullptr;
  bool settingText = false;
};

void FillRectWith(HDC dc, const RECT &rect, COLORREF color) {
  HBRUSH brush = CreateSolidBrush(color);
  FillRect(dc, &rect, brush);
  DeleteObject(brush);
}

void PaintGrid(HWND grid, const DialogState &state) {
  PAINTSTRUCT paint;
  HDC dc = BeginPaint(grid, &paint);
  RECT client;
  GetClientRect(grid, &client);
  FillRect(dc, &client, GetSysColorBrush(COLOR_BTNFACE));
  for (int index = 1; index <= 255; ++index) {
    const RECT cell = CellRect(index);
    FillRectWith(dc, cell, ColorOf(index));
    FrameRect(dc, &cell, static_cast<HBRUSH>(GetStockObject(GRAY_BRUSH)));
  }
  if (state.index >= 1 && state.index <= 255) {
    RECT mark = CellRect(state.index);
    InflateRect(&mark, 2, 2);
    FrameRect(dc, &mark, static_cast<HBRUSH>(GetStockObject(BLACK_BRUSH)));
    InflateRect(&mark, -1, -1);
    FrameRect(dc, &mark, static_cast<HBRUSH>(GetStockObject(WHITE_BRUSH)));
  }
  EndPaint(grid, &paint);
}

void Select(DialogState &state, int index, bool updateText) {
  state.index = index;
  if (updateText) {
    state.settingText = true;
    SetWindowTextW(state.edit, std::to_wstring(index).c_str());
    state.settingText = false;
  }
  InvalidateRect(state.grid, nullptr, FALSE);
}

int TypedIndex(HWND edit) {
  wchar_t text[16] = L"";
  GetWindowTextW(edit, text, 16);
  wchar_t *end = nullptr;
  const long value = std::wcstol(text, &end, 10);
  return end != text && *end == L'\0' && value >= 1 && value <= 255 ? static_cast<int>(value) : 0;
}

void Accept(DialogState &state) {
  const int typed = TypedIndex(state.edit);
  if (!typed) {
    MessageBeep(MB_ICONWARNING);
    SetFocus(state.edit);
    return;
  }
  state.index = typed;
  state.accepted = true;
  state.done = true;
  PostMessageW(state.dialog, WM_NULL, 0, 0);  // the loop looks at `done` once a message arrives
}

// The dialog's state for its windows: handed over at creation, kept in the window's user data.
DialogState *StateOf(HWND hwnd, UINT message, LPARAM lParam) {
  if (message == WM_NCCREATE)
    SetWindowLongPtrW(hwnd, GWLP_USERDATA,
                      reinterpret_cast<LONG_PTR>(reinterpret_cast<CREATESTRUCTW *>(lParam)->lpCreateParams));
  return reinterpret_cast<DialogState *>(GetWindowLongPtrW(hwnd, GWLP_USERDATA));
}

LRESULT CALLBACK GridProc(HWND hwnd, UINT message, WPARAM wParam, LPARAM lParam) {
  DialogState *state = StateOf(hwnd, message, lParam);
  switch (message) {
    case WM_PAINT:
      if (state) PaintGrid(hwnd, *state);
      return 0;
    case WM_LBUTTONDOWN:
    case WM_LBUTTONDBLCLK:
      if (state) {
        const int index = IndexAt(POINT{static_cast<short>(LOWORD(lParam)), static_cast<short>(HIWORD(lParam))});
        if (index) {
          Select(*state, index, true);
          if (message == WM_LBUTTONDBLCLK) Accept(*state);
        }
      }
      return 0;
    default: break;
  }
  return DefWindowProcW(hwnd, message, wParam, lParam);
}

LRESULT CALLBACK DialogProc(HWND hwnd, UINT message, WPARAM wParam, LPARAM lParam) {
  DialogState *state = StateOf(hwnd, message, lParam);
  switch (message) {
    case DM_GETDEFID: return MAKELONG(IDOK, DC_HASDEFID);
    case WM_COMMAND:
      if (!state) break;
      if (LOWORD(wParam) == IDOK) {
        Accept(*state);
      } else if (LOWORD(wParam) == IDCANCEL) {
        state->done = true;
        PostMessageW(hwnd, WM_NULL, 0, 0);
      } else if (LOWORD(wParam) == kIndexEdit && HIWORD(wParam) == EN_CHANGE && !state->settingText) {
        if (const int typed = TypedIndex(state->edit)) Select(*state, typed, false);
      }
      return 0;
    case WM_CLOSE:
      if (state) state->done = true;
      PostMessageW(hwnd, WM_NULL, 0, 0);
      return 0;
    default: break;
  }
  return DefWindowProcW(hwnd, message, wParam, lParam);
}

void RegisterClasses(HINSTANCE instance) {
  WNDCLASSW wc{};
  wc.hInstance = instance;
  wc.hCursor = LoadCursor(nullptr, IDC_ARROW);
  if (!GetClassInfoW(instance, kDialogClass, &wc)) {
    wc.lpfnWndProc = DialogProc;
    wc.hbrBackground = GetSysColorBrush(COLOR_BTNFACE);
    wc.lpszClassName = kDialogClass;
    RegisterClassW(&wc);
  }
  if (!GetClassInfoW(instance, kGridClass, &wc)) {
    wc.style = CS_DBLCLKS;
    wc.lpfnWndProc = GridProc;
    wc.lpszClassName = kGridClass;
    RegisterClassW(&wc);
  }
}

HWND Child(const wchar_t *cls, const wchar_t *text, DWORD style, int x, int y, int w, int h, HWND parent, int id,
           void *param = nullptr) {
  HWND child = CreateWindowExW(0, cls, text, WS_CHILD | WS_VISIBLE | style, x, y, w, h, parent,
                               reinterpret_cast<HMENU>(static_cast<INT_PTR>(id)), GetModuleHandleW(nullptr), param);
  SendMessageW(child, WM_SETFONT, reinterpret_cast<WPARAM>(GetStockObject(DEFAULT_GUI_FONT)), FALSE);
  return child;
}

// Centred on its owner, then moved as little as it takes to lie inside the work area of the
// owner's monitor, so that its title bar can always be reached.
POINT PlaceNear(HWND owner, int width, int height) {
  RECT ownerRect{0, 0, GetSystemMetrics(SM_CXSCREEN), GetSystemMetrics(SM_CYSCREEN)};
  if (owner) GetWindowRect(owner, &ownerRect);
  MONITORINFO monitor{};
  monitor.cbSize = sizeof monitor;
  RECT work = ownerRect;
  if (GetMonitorInfoW(MonitorFromRect(&ownerRect, MONITOR_DEFAULTTONEAREST), &monitor)) work = monitor.rcWork;
  POINT at{(ownerRect.left + ownerRect.right - width) / 2, (ownerRect.top + ownerRect.bottom - height) / 2};
  at.x = std::max(work.left, std::min(at.x, work.right - static_cast<LONG>(width)));
  at.y = std::max(work.top, std::min(at.y, work.bottom - static_cast<LONG>(height)));
  return at;
}

bool RunColorDialog(int &color) {
  HINSTANCE instance = GetModuleHandleW(nullptr);
  RegisterClasses(instance);
  DialogState state{color >= 1 && color <= 255 ? color : 7};

  HWND owner = GetActiveWindow();
  const DWORD style = WS_POPUP | WS_CAPTION | WS_SYSMENU | DS_MODALFRAME;
  RECT frame{0, 0, kGridWidth, kGridHeight + 70};
  AdjustWindowRectEx(&frame, style, FALSE, WS_EX_DLGMODALFRAME | WS_EX_CONTROLPARENT);
  const int width = frame.right - frame.left, height = frame.bottom - frame.top;
  const POINT at = PlaceNear(owner, width, height);
  state.dialog = CreateWindowExW(WS_EX_DLGMODALFRAME | WS_EX_CONTROLPARENT, kDialogClass, L"Select Color", style, at.x, at.y,
                                 width, height, owner, nullptr, instance, &state);
  if (!state.dialog) return false;
  state.grid = Child(kGridClass, nullptr, 0, 0, 0, kGridWidth, kGridHeight, state.dialog, 0, &state);
  const int row = kGridHeight + 8;
  Child(L"STATIC", L"Index color:", SS_LEFT, kMargin, row + 3, 70, 16, state.dialog, -1);
  state.edit = Child(L"EDIT", nullptr, WS_BORDER | WS_TABSTOP | ES_NUMBER | ES_AUTOHSCROLL, kMargin + 75, row, 50, 20,
                     state.dialog, kIndexEdit);
  Child(L"BUTTON", L"OK", WS_TABSTOP | BS_DEFPUSHBUTTON, kGridWidth - 2 * (75 + kMargin), row + 30, 75, 24, state.dialog, IDOK);
  Child(L"BUTTON", L"Cancel", WS_TABSTOP | BS_PUSHBUTTON, kGridWidth - (75 + kMargin), row + 30, 75, 24, state.dialog, IDCANCEL);
  Select(state, state.index, true);

  const bool ownerEnabled = owner && IsWindowEnabled(owner);
  if (ownerEnabled) EnableWindow(owner, FALSE);
  ShowWindow(state.dialog, SW_SHOW);
  SetFocus(state.edit);
  SendMessageW(state.edit, EM_SETSEL, 0, -1);
  MSG msg;
  while (!state.done) {
    const BOOL got = GetMessageW(&msg, nullptr, 0, 0);
    if (got <= 0) {
      if (got == 0) PostQuitMessage(static_cast<int>(msg.wParam));  // the caller's loop ends too
      break;
    }
    if (!IsDialogMessageW(state.dialog, &msg)) {
      TranslateMessage(&msg);
      DispatchMessageW(&msg);
    }
  }
  // The owner is enabled before the dialog goes, so that activation returns to it.
  if (ownerEnabled) EnableWindow(owner, TRUE);
  DestroyWindow(state.dialog);
  if (state.accepted) color = state.index;
  return state.accepted;
}
}  // namespace

extern "C" {
uint32_t acedGetRGB(int color) { return ColorOf(color); }

bool acedSetColorDialog(int &color, bool, int) { return RunColorDialog(color); }
}
