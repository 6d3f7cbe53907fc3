#include "fw/View.h"

#include "fw/FrameWnd.h"
#include "fw/WinApp.h"

#include <algorithm>
#include <climits>
#include <stdexcept>

namespace fw {
namespace {
constexpr const char *kViewClassName = "FwView";

// The class of views, registered again whenever it is missing: a view may unregister it to
// register it anew with its own background.
LPCSTR ViewClassName(HINSTANCE instance) {
  WNDCLASSA existing{};
  if (!::GetClassInfoA(instance, kViewClassName, &existing)) {
    WNDCLASSA wc{};
    wc.style = CS_DBLCLKS | CS_HREDRAW | CS_VREDRAW;
    wc.lpfnWndProc = ::DefWindowProcA;
    wc.hInstance = instance;
    wc.hCursor = ::LoadCursor(nullptr, IDC_ARROW);
    wc.hbrBackground = reinterpret_cast<HBRUSH>(COLOR_WINDOW + 1);
    wc.lpszClassName = kViewClassName;
    ::RegisterClassA(&wc);
  }
  return kViewClassName;
}

int Clamp(int value, int low, int high) { return std::max(low, std::min(value, high)); }
}  // namespace

BOOL CView::Create(LPCSTR className, LPCSTR windowName, DWORD style, const RECT &rect, CWnd *parent, UINT id) {
  CREATESTRUCTA cs{};
  cs.lpszClass = className;
  cs.lpszName = windowName;
  cs.style = static_cast<LONG>(style | WS_CHILD);
  cs.x = rect.left;
  cs.y = rect.top;
  cs.cx = rect.right - rect.left;
  cs.cy = rect.bottom - rect.top;
  cs.hwndParent = parent ? parent->m_hWnd : nullptr;
  cs.hMenu = reinterpret_cast<HMENU>(static_cast<UINT_PTR>(id));
  cs.hInstance = AfxGetInstanceHandle();
  if (!PreCreateWindow(cs)) return FALSE;
  return CreateFromStruct(cs);
}

BOOL CView::PreCreateWindow(CREATESTRUCTA &cs) {
  if (!cs.lpszClass) cs.lpszClass = ViewClassName(cs.hInstance);
  if (cs.style & WS_BORDER) {
    cs.dwExStyle |= WS_EX_CLIENTEDGE;
    cs.style &= ~WS_BORDER;
  }
  return TRUE;
}

void CView::OnActivateView(BOOL activate, CView *activateView, CView *) {
  if (activate && activateView == this && ::GetActiveWindow() == ::GetAncestor(m_hWnd, GA_ROOT)) SetFocus();
}

CFrameWnd *CView::GetParentFrame() const {
  HWND window = m_hWnd;
  while (window && (::GetWindowLongA(window, GWL_STYLE) & WS_CHILD)) {
    window = ::GetParent(window);
    if (auto *frame = dynamic_cast<CFrameWnd *>(FromHandlePermanent(window))) return frame;
  }
  return nullptr;
}

LRESULT CView::OnMouseActivate() {
  const LRESULT result = Default();
  if (result == MA_NOACTIVATE || result == MA_NOACTIVATEANDEAT) return result;
  CFrameWnd *frame = GetParentFrame();
  if (!frame) return result;
  const HWND focus = ::GetFocus();
  if (frame->GetActiveView() == this && focus != m_hWnd && !::IsChild(m_hWnd, focus))
    OnActivateView(TRUE, this, this);  // the active view lost the focus inside the frame: take it back
  else
    frame->SetActiveView(this);
  return result;
}

LRESULT CView::WindowProc(UINT message, WPARAM wParam, LPARAM lParam) {
  switch (message) {
    case WM_PAINT: {
      PAINTSTRUCT paint;
      HDC dc = ::BeginPaint(m_hWnd, &paint);
      OnPrepareDC(dc);
      OnDraw(dc);
      ::EndPaint(m_hWnd, &paint);
      return 0;
    }
    case WM_MOUSEACTIVATE: return OnMouseActivate();
    case WM_INITIALUPDATE: OnInitialUpdate(); return 0;
    case WM_DESTROY:
      // The frame must not keep routing commands to a view that is going away.
      if (CFrameWnd *frame = GetParentFrame(); frame && frame->GetActiveView() == this) frame->SetActiveView(nullptr);
      break;
    default: break;
  }
  return CWnd::WindowProc(message, wParam, lParam);
}

void CScrollView::SetScrollSizes(int mapMode, SIZE total, const SIZE &page, const SIZE &line) {
  if (mapMode != MM_TEXT) throw std::invalid_argument("CScrollView: only MM_TEXT scroll sizes are supported");
  m_nMapMode = mapMode;
  m_totalLog = SIZE{std::max(0L, total.cx), std::max(0L, total.cy)};
  m_totalDev = m_totalLog;
  m_pageDev = page;
  m_lineDev = line;
  if (m_pageDev.cx == 0) m_pageDev.cx = m_totalDev.cx / 10;
  if (m_pageDev.cy == 0) m_pageDev.cy = m_totalDev.cy / 10;
  if (m_lineDev.cx == 0) m_lineDev.cx = m_pageDev.cx / 10;
  if (m_lineDev.cy == 0) m_lineDev.cy = m_pageDev.cy / 10;
  if (m_hWnd) UpdateBars();
}

void CScrollView::GetDeviceScrollSizes(int &mapMode, SIZE &total, SIZE &page, SIZE &line) const {
  mapMode = m_nMapMode;
  total = m_totalDev;
  page = m_pageDev;
  line = m_lineDev;
}

POINT CScrollView::GetDeviceScrollPosition() const {
  return POINT{::GetScrollPos(m_hWnd, SB_HORZ), ::GetScrollPos(m_hWnd, SB_VERT)};
}

int CScrollView::ScrollLimit(int bar) const {
  const DWORD needed = bar == SB_VERT ? WS_VSCROLL : WS_HSCROLL;
  if (!(::GetWindowLongA(m_hWnd, GWL_STYLE) & needed)) return 0;
  SCROLLINFO info{sizeof(info), SIF_RANGE | SIF_PAGE, 0, 0, 0, 0, 0};
  if (!::GetScrollInfo(m_hWnd, bar, &info)) return 0;
  const int page = static_cast<int>(info.nPage);
  return std::max(0, info.nMax - std::max(page - 1, 0) - info.nMin);
}

void CScrollView::ScrollToPosition(POINT pt) {
  pt.x = Clamp(pt.x, 0, ScrollLimit(SB_HORZ));
  pt.y = Clamp(pt.y, 0, ScrollLimit(SB_VERT));
  ScrollToDevicePosition(pt);
}

void CScrollView::ScrollToDevicePosition(POINT pt) {
  const POINT from = GetDeviceScrollPosition();
  ::SetScrollPos(m_hWnd, SB_HORZ, pt.x, TRUE);
  ::SetScrollPos(m_hWnd, SB_VERT, pt.y, TRUE);
  // The bars may have limited the position; the content follows where they really are.
  const POINT to = GetDeviceScrollPosition();
  if (to.x != from.x || to.y != from.y) ::ScrollWindow(m_hWnd, from.x - to.x, from.y - to.y, nullptr, nullptr);
}

void CScrollView::UpdateBars() {
  if (m_bInsideUpdate || !m_hWnd) return;
  m_bInsideUpdate = true;  // showing or hiding a bar resizes the client area and comes back here

  // The client area as it would be without bars.
  RECT client;
  ::GetClientRect(m_hWnd, &client);
  const DWORD style = ::GetWindowLongA(m_hWnd, GWL_STYLE);
  const SIZE bar{::GetSystemMetrics(SM_CXVSCROLL), ::GetSystemMetrics(SM_CYHSCROLL)};
  SIZE size{client.right, client.bottom};
  if (style & WS_VSCROLL) size.cx += bar.cx;
  if (style & WS_HSCROLL) size.cy += bar.cy;

  SIZE range{m_totalDev.cx - size.cx, m_totalDev.cy - size.cy};
  bool needHorz = range.cx > 0;
  bool needVert = range.cy > 0;
  // One bar takes room from the other direction and may make that one needed too.
  if (needVert && !needHorz && range.cx + bar.cx > 0) needHorz = true;
  if (needHorz && !needVert && range.cy + bar.cy > 0) needVert = true;
  if (needHorz) {
    range.cy += bar.cy;
    size.cy -= bar.cy;
  }
  if (needVert) {
    range.cx += bar.cx;
    size.cx -= bar.cx;
  }

  const POINT position = GetDeviceScrollPosition();
  const POINT limited{needHorz ? Clamp(position.x, 0, range.cx) : 0, needVert ? Clamp(position.y, 0, range.cy) : 0};
  if (limited.x != position.x || limited.y != position.y) ScrollToDevicePosition(limited);

  ::ShowScrollBar(m_hWnd, SB_HORZ, needHorz);
  if (needHorz) {
    SCROLLINFO info{sizeof(info),
                    SIF_RANGE | SIF_PAGE,
                    0,
                    static_cast<int>(m_totalDev.cx - 1),
                    static_cast<UINT>(std::max(0L, size.cx)),
                    0,
                    0};
    ::SetScrollInfo(m_hWnd, SB_HORZ, &info, TRUE);
  }
  ::ShowScrollBar(m_hWnd, SB_VERT, needVert);
  if (needVert) {
    SCROLLINFO info{sizeof(info),
                    SIF_RANGE | SIF_PAGE,
                    0,
                    static_cast<int>(m_totalDev.cy - 1),
                    static_cast<UINT>(std::max(0L, size.cy)),
                    0,
                    0};
    ::SetScrollInfo(m_hWnd, SB_VERT, &info, TRUE);
  }
  m_bInsideUpdate = false;
}

BOOL CScrollView::OnScroll(UINT scrollCode, UINT pos, BOOL doScroll) {
  const auto target = [&](BYTE code, int current, int page, int line) {
    switch (code) {
      case SB_TOP: return 0;
      case SB_BOTTOM: return INT_MAX;
      case SB_LINEUP: return current - line;
      case SB_LINEDOWN: return current + line;
      case SB_PAGEUP: return current - page;
      case SB_PAGEDOWN: return current + page;
      case SB_THUMBTRACK: return static_cast<int>(pos);
      default: return current;
    }
  };
  const POINT from = GetDeviceScrollPosition();
  const int x = target(LOBYTE(scrollCode), from.x, m_pageDev.cx, m_lineDev.cx);
  const int y = target(HIBYTE(scrollCode), from.y, m_pageDev.cy, m_lineDev.cy);
  const BOOL scrolled = OnScrollBy(SIZE{x - from.x, y - from.y}, doScroll);
  if (scrolled && doScroll) UpdateWindow();
  return scrolled;
}

BOOL CScrollView::OnScrollBy(SIZE sizeScroll, BOOL doScroll) {
  // No bar in a direction means there is nothing to scroll in it.
  const DWORD style = ::GetWindowLongA(m_hWnd, GWL_STYLE);
  if (!(style & WS_VSCROLL)) sizeScroll.cy = 0;
  if (!(style & WS_HSCROLL)) sizeScroll.cx = 0;

  const POINT from = GetDeviceScrollPosition();
  const int x = Clamp(static_cast<int>(std::min<long long>(INT_MAX, 0LL + from.x + sizeScroll.cx)), 0, ScrollLimit(SB_HORZ));
  const int y = Clamp(static_cast<int>(std::min<long long>(INT_MAX, 0LL + from.y + sizeScroll.cy)), 0, ScrollLimit(SB_VERT));
  if (x == from.x && y == from.y) return FALSE;
  if (doScroll) {
    ::ScrollWindow(m_hWnd, from.x - x, from.y - y, nullptr, nullptr);
    if (x != from.x) ::SetScrollPos(m_hWnd, SB_HORZ, x, TRUE);
    if (y != from.y) ::SetScrollPos(m_hWnd, SB_VERT, y, TRUE);
  }
  return TRUE;
}

BOOL CScrollView::OnMouseWheel(short delta) {
  const DWORD style = ::GetWindowLongA(m_hWnd, GWL_STYLE);
  const bool vertical = style & WS_VSCROLL;
  if (!vertical && !(style & WS_HSCROLL)) return FALSE;
  UINT lines = 3;
  ::SystemParametersInfoA(SPI_GETWHEELSCROLLLINES, 0, &lines, 0);
  const int page = vertical ? m_pageDev.cy : m_pageDev.cx;
  const int line = vertical ? m_lineDev.cy : m_lineDev.cx;
  int distance;
  if (lines == WHEEL_PAGESCROLL) {
    distance = delta > 0 ? -page : page;
  } else {
    distance = ::MulDiv(-delta, static_cast<int>(lines), WHEEL_DELTA) * line;
    distance = Clamp(distance, -page, page);  // never more than a page per notch
  }
  const BOOL scrolled = OnScrollBy(vertical ? SIZE{0, distance} : SIZE{distance, 0}, TRUE);
  if (scrolled) UpdateWindow();
  return scrolled;
}

void CScrollView::OnPrepareDC(HDC dc) {
  const POINT position = GetDeviceScrollPosition();
  ::SetMapMode(dc, MM_TEXT);
  ::SetViewportOrgEx(dc, -position.x, -position.y, nullptr);
}

LRESULT CScrollView::WindowProc(UINT message, WPARAM wParam, LPARAM lParam) {
  switch (message) {
    case WM_HSCROLL:
    case WM_VSCROLL:
      // A scroll bar control's message goes to that control (reflection); the view's own bars scroll it.
      if (lParam) break;
      if (message == WM_VSCROLL)
        OnScroll(MAKEWORD(0xFF, LOWORD(wParam)), HIWORD(wParam));
      else
        OnScroll(MAKEWORD(LOWORD(wParam), 0xFF), HIWORD(wParam));
      return 0;
    case WM_MOUSEWHEEL:
      if (OnMouseWheel(GET_WHEEL_DELTA_WPARAM(wParam))) return 0;
      break;
    case WM_SIZE: {
      const LRESULT result = CView::WindowProc(message, wParam, lParam);
      if (m_nMapMode) UpdateBars();
      return result;
    }
    default: break;
  }
  return CView::WindowProc(message, wParam, lParam);
}

}  // namespace fw
