#include "app/DrawingView.h"

#include <memory>
#include <type_traits>

namespace {
constexpr wchar_t kClassName[] = L"DevhostDrawingView";
constexpr COLORREF kModelSpace = RGB(33, 40, 48);
constexpr COLORREF kGrid = RGB(48, 58, 70);
constexpr int kGridStep = 40;

struct GdiObjectDelete {
  void operator()(HGDIOBJ object) const { DeleteObject(object); }
};
using GdiObject = std::unique_ptr<std::remove_pointer_t<HGDIOBJ>, GdiObjectDelete>;

class PaintScope {
 public:
  explicit PaintScope(HWND hwnd) : m_hwnd(hwnd), m_dc(BeginPaint(hwnd, &m_paint)) {}
  ~PaintScope() { EndPaint(m_hwnd, &m_paint); }
  PaintScope(const PaintScope &) = delete;
  PaintScope &operator=(const PaintScope &) = delete;
  HDC dc() const { return m_dc; }

 private:
  HWND m_hwnd;
  PAINTSTRUCT m_paint{};
  HDC m_dc;
};

class SelectedObject {
 public:
  SelectedObject(HDC dc, HGDIOBJ object) : m_dc(dc), m_previous(SelectObject(dc, object)) {}
  ~SelectedObject() { SelectObject(m_dc, m_previous); }
  SelectedObject(const SelectedObject &) = delete;
  SelectedObject &operator=(const SelectedObject &) = delete;

 private:
  HDC m_dc;
  HGDIOBJ m_previous;
};

void Paint(HWND hwnd) {
  PaintScope paint(hwnd);
  HDC dc = paint.dc();
  RECT client;
  GetClientRect(hwnd, &client);
  const GdiObject background(CreateSolidBrush(kModelSpace));
  FillRect(dc, &client, static_cast<HBRUSH>(background.get()));
  const GdiObject gridPen(CreatePen(PS_SOLID, 1, kGrid));
  {
    SelectedObject pen(dc, gridPen.get());
    for (int x = 0; x < client.right; x += kGridStep) MoveToEx(dc, x, 0, nullptr), LineTo(dc, x, client.bottom);
    for (int y = 0; y < client.bottom; y += kGridStep) MoveToEx(dc, 0, y, nullptr), LineTo(dc, client.right, y);
  }
  SetBkMode(dc, TRANSPARENT);
  SetTextColor(dc, RGB(160, 170, 180));
  TextOutW(dc, 8, 8, L"Drawing1.dwg", 12);
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
