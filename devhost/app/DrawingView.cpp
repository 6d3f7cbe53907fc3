#include "app/DrawingView.h"

namespace {
constexpr wchar_t kClassName[] = L"DevhostDrawingView";
constexpr COLORREF kModelSpace = RGB(33, 40, 48);
constexpr COLORREF kGrid = RGB(48, 58, 70);
constexpr int kGridStep = 40;

void Paint(HWND hwnd) {
  PAINTSTRUCT paint;
  HDC dc = BeginPaint(hwnd, &paint);
  RECT client;
  GetClientRect(hwnd, &client);
  HBRUSH background = CreateSolidBrush(kModelSpace);
  FillRect(dc, &client, background);
  DeleteObject(background);
  HPEN gridPen = CreatePen(PS_SOLID, 1, kGrid);
  HGDIOBJ oldPen = SelectObject(dc, gridPen);
  for (int x = 0; x < client.right; x += kGridStep) MoveToEx(dc, x, 0, nullptr), LineTo(dc, x, client.bottom);
  for (int y = 0; y < client.bottom; y += kGridStep) MoveToEx(dc, 0, y, nullptr), LineTo(dc, client.right, y);
  SelectObject(dc, oldPen);
  DeleteObject(gridPen);
  SetBkMode(dc, TRANSPARENT);
  SetTextColor(dc, RGB(160, 170, 180));
  TextOutW(dc, 8, 8, L"Drawing1.dwg", 12);
  EndPaint(hwnd, &paint);
}

LRESULT CALLBACK ViewProc(HWND hwnd, UINT message, WPARAM wParam, LPARAM lParam) {
  switch (message) {
  case WM_PAINT: Paint(hwnd); return 0;
  case WM_ERASEBKGND: return 1;
  case WM_LBUTTONDOWN: SetFocus(hwnd); return 0;
  default: return DefWindowProcW(hwnd, message, wParam, lParam);
  }
}
}  // namespace

HWND CreateDrawingView(HWND parent, int id) {
  static const ATOM registered = [] {
    WNDCLASSW wc{};
    wc.lpfnWndProc = ViewProc;
    wc.hInstance = GetModuleHandleW(nullptr);
    wc.hCursor = LoadCursorW(nullptr, IDC_CROSS);
    wc.lpszClassName = kClassName;
    return RegisterClassW(&wc);
  }();
  if (!registered) return nullptr;
  return CreateWindowExW(0, kClassName, L"", WS_CHILD | WS_VISIBLE | WS_CLIPSIBLINGS, 0, 0, 10, 10, parent,
                         reinterpret_cast<HMENU>(static_cast<INT_PTR>(id)), GetModuleHandleW(nullptr), nullptr);
}
