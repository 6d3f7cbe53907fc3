#include "fw/SplitterWnd.h"

#include <algorithm>
#include <climits>
#include <stdexcept>

namespace fw {
namespace {
bool Contains(const RECT &rect, POINT pt) { return ::PtInRect(&rect, pt) != FALSE; }

// The grey of a dragged bar: every other pixel inverted, as window systems draw resize tracks.
class HalftoneBrush {
 public:
  HalftoneBrush() {
    const WORD pattern[8] = {0x5555, 0xAAAA, 0x5555, 0xAAAA, 0x5555, 0xAAAA, 0x5555, 0xAAAA};
    m_bitmap = ::CreateBitmap(8, 8, 1, 1, pattern);
    m_brush = m_bitmap ? ::CreatePatternBrush(m_bitmap) : nullptr;
  }
  ~HalftoneBrush() {
    if (m_brush) ::DeleteObject(m_brush);
    if (m_bitmap) ::DeleteObject(m_bitmap);
  }
  HalftoneBrush(const HalftoneBrush &) = delete;
  HalftoneBrush &operator=(const HalftoneBrush &) = delete;
  HBRUSH get() const { return m_brush; }

 private:
  HBITMAP m_bitmap = nullptr;
  HBRUSH m_brush = nullptr;
};
}  // namespace

BOOL CSplitterWnd::CreateStatic(CWnd *parent, int rows, int cols, DWORD style, UINT id) {
  if (rows < 1 || cols < 1 || rows > 16 || cols > 16) throw std::out_of_range("CSplitterWnd: 1 to 16 rows and columns");
  if (m_hWnd) return FALSE;
  m_rows.assign(static_cast<size_t>(rows), RowColInfo{});
  m_cols.assign(static_cast<size_t>(cols), RowColInfo{});
  m_views.clear();
  m_views.resize(static_cast<size_t>(rows * cols));
  const RECT empty{0, 0, 0, 0};
  return CreateEx(0, nullptr, nullptr, style | WS_CHILD | WS_CLIPCHILDREN, empty, parent, id);
}

BOOL CSplitterWnd::CreateView(int row, int col, std::unique_ptr<CView> view, SIZE initialSize) {
  RowColInfo &rowInfo = Row(row);
  RowColInfo &colInfo = Column(col);
  const size_t slot = static_cast<size_t>(row * GetColumnCount() + col);
  if (!m_hWnd || !view || m_views[slot]) return FALSE;
  colInfo.idealSize = initialSize.cx;
  rowInfo.idealSize = initialSize.cy;
  const RECT rect{0, 0, initialSize.cx, initialSize.cy};
  if (!view->Create(nullptr, nullptr, WS_CHILD | WS_VISIBLE, rect, this, static_cast<UINT>(IdFromRowCol(row, col)))) return FALSE;
  m_views[slot] = std::move(view);
  return TRUE;
}

CWnd *CSplitterWnd::GetPane(int row, int col) const {
  Row(row);  // both throw for an index out of range
  Column(col);
  if (CView *view = m_views[static_cast<size_t>(row * GetColumnCount() + col)].get()) return view;
  return FromHandlePermanent(::GetDlgItem(m_hWnd, IdFromRowCol(row, col)));
}

const CSplitterWnd::RowColInfo &CSplitterWnd::Column(int col) const {
  if (col < 0 || col >= GetColumnCount()) throw std::out_of_range("CSplitterWnd: column out of range");
  return m_cols[static_cast<size_t>(col)];
}

const CSplitterWnd::RowColInfo &CSplitterWnd::Row(int row) const {
  if (row < 0 || row >= GetRowCount()) throw std::out_of_range("CSplitterWnd: row out of range");
  return m_rows[static_cast<size_t>(row)];
}

void CSplitterWnd::GetColumnInfo(int col, int &cur, int &min) const {
  const RowColInfo &info = Column(col);
  cur = info.curSize;
  min = info.minSize;
}

void CSplitterWnd::SetColumnInfo(int col, int ideal, int min) {
  RowColInfo &info = Column(col);
  info.idealSize = ideal;
  info.minSize = min;
}

void CSplitterWnd::GetRowInfo(int row, int &cur, int &min) const {
  const RowColInfo &info = Row(row);
  cur = info.curSize;
  min = info.minSize;
}

void CSplitterWnd::SetRowInfo(int row, int ideal, int min) {
  RowColInfo &info = Row(row);
  info.idealSize = ideal;
  info.minSize = min;
}

void CSplitterWnd::LayoutRowCol(std::vector<RowColInfo> &infos, int size) {
  size = std::max(size, 0);
  for (RowColInfo &info : infos) {
    if (info.idealSize < info.minSize) info.idealSize = 0;  // too small to be worth showing
    info.curSize = info.idealSize;
  }
  infos.back().curSize = INT_MAX;  // the last one takes what is left
  for (size_t i = 0; i < infos.size(); ++i) {
    RowColInfo &info = infos[i];
    if (size == 0) {
      info.curSize = 0;
      continue;
    }
    if (i != 0 && size < info.minSize) {
      // Not enough room for this pane: it is hidden and the one before takes its room.
      infos[i - 1].curSize += size + kSplitterGap;
      info.curSize = 0;
      size = 0;
      continue;
    }
    info.curSize = std::min(info.curSize, size);
    size = std::max(0, size - info.curSize - kSplitterGap);
  }
}

void CSplitterWnd::RecalcLayout() {
  if (!m_hWnd || m_cols.empty()) return;
  RECT client;
  GetClientRect(&client);
  LayoutRowCol(m_cols, client.right - 2 * kBorder);
  LayoutRowCol(m_rows, client.bottom - 2 * kBorder);

  int x = kBorder;
  for (int col = 0; col < GetColumnCount(); ++col) {
    const int cx = m_cols[static_cast<size_t>(col)].curSize;
    int y = kBorder;
    for (int row = 0; row < GetRowCount(); ++row) {
      const int cy = m_rows[static_cast<size_t>(row)].curSize;
      if (HWND pane = ::GetDlgItem(m_hWnd, IdFromRowCol(row, col))) {
        const UINT show = cx > 0 && cy > 0 ? SWP_SHOWWINDOW : SWP_HIDEWINDOW;
        ::SetWindowPos(pane, nullptr, x, y, cx, cy, SWP_NOZORDER | SWP_NOACTIVATE | show);
      }
      y += cy + kSplitterGap;
    }
    x += cx + kSplitterGap;
  }
  Invalidate();
}

CSplitterWnd::Hit CSplitterWnd::HitTest(POINT pt) const {
  for (int col = 0; col + 1 < GetColumnCount(); ++col) {
    const Hit hit{true, col};
    if (Contains(BarRect(hit), pt)) return hit;
  }
  for (int row = 0; row + 1 < GetRowCount(); ++row) {
    const Hit hit{false, row};
    if (Contains(BarRect(hit), pt)) return hit;
  }
  return {};
}

RECT CSplitterWnd::BarRect(const Hit &hit) const {
  RECT client;
  GetClientRect(&client);
  const auto &infos = hit.vertical ? m_cols : m_rows;
  int start = kBorder;
  for (int i = 0; i <= hit.index; ++i) start += infos[static_cast<size_t>(i)].curSize;
  start += hit.index * kSplitterGap;
  if (hit.vertical) return RECT{start, kBorder, start + kSplitterGap, client.bottom - kBorder};
  return RECT{kBorder, start, client.right - kBorder, start + kSplitterGap};
}

void CSplitterWnd::OnPaint() {
  PAINTSTRUCT paint;
  HDC dc = ::BeginPaint(m_hWnd, &paint);
  RECT client;
  GetClientRect(&client);
  ::FillRect(dc, &client, ::GetSysColorBrush(COLOR_3DFACE));
  // A sunken edge around every pane shown, in the border the layout leaves around it.
  for (int row = 0; row < GetRowCount(); ++row) {
    for (int col = 0; col < GetColumnCount(); ++col) {
      HWND pane = ::GetDlgItem(m_hWnd, IdFromRowCol(row, col));
      if (!pane || !::IsWindowVisible(pane)) continue;
      RECT rect;
      ::GetWindowRect(pane, &rect);
      ::MapWindowPoints(nullptr, m_hWnd, reinterpret_cast<POINT *>(&rect), 2);
      ::InflateRect(&rect, kBorder, kBorder);
      ::DrawEdge(dc, &rect, EDGE_SUNKEN, BF_RECT);
    }
  }
  ::EndPaint(m_hWnd, &paint);
}

void CSplitterWnd::InvertTracker() const {
  // Drawn over the panes too, so not clipped by the children.
  HDC dc = ::GetDCEx(m_hWnd, nullptr, DCX_CACHE);
  if (!dc) return;
  const HalftoneBrush brush;
  HGDIOBJ previous = ::SelectObject(dc, brush.get());
  ::PatBlt(dc, m_rectTracker.left, m_rectTracker.top, m_rectTracker.right - m_rectTracker.left,
           m_rectTracker.bottom - m_rectTracker.top, PATINVERT);
  ::SelectObject(dc, previous);
  ::ReleaseDC(m_hWnd, dc);
}

void CSplitterWnd::StartTracking(const Hit &hit, POINT pt) {
  m_bTracking = true;
  m_tracked = hit;
  m_rectTracker = BarRect(hit);
  m_trackOffset = POINT{pt.x - m_rectTracker.left, pt.y - m_rectTracker.top};
  // The bar may move from the start of the pane before it to the end of the pane after it.
  const auto &infos = hit.vertical ? m_cols : m_rows;
  const int barStart = hit.vertical ? m_rectTracker.left : m_rectTracker.top;
  const int low = barStart - infos[static_cast<size_t>(hit.index)].curSize;
  const int high = barStart + infos[static_cast<size_t>(hit.index) + 1].curSize;
  m_rectLimit = hit.vertical ? RECT{low, m_rectTracker.top, high, m_rectTracker.bottom}
                             : RECT{m_rectTracker.left, low, m_rectTracker.right, high};
  m_hWndFocusBefore = ::GetFocus();
  ::SetCapture(m_hWnd);
  SetFocus();  // for Escape
  InvertTracker();
}

void CSplitterWnd::MoveTracker(POINT pt) {
  RECT moved = m_rectTracker;
  if (m_tracked.vertical) {
    const int left = std::max<int>(m_rectLimit.left, std::min<int>(pt.x - m_trackOffset.x, m_rectLimit.right));
    ::OffsetRect(&moved, left - moved.left, 0);
  } else {
    const int top = std::max<int>(m_rectLimit.top, std::min<int>(pt.y - m_trackOffset.y, m_rectLimit.bottom));
    ::OffsetRect(&moved, 0, top - moved.top);
  }
  if (::EqualRect(&moved, &m_rectTracker)) return;
  InvertTracker();
  m_rectTracker = moved;
  InvertTracker();
}

void CSplitterWnd::StopTracking(bool accept) {
  if (!m_bTracking) return;
  m_bTracking = false;  // before releasing the capture, which comes back here
  InvertTracker();
  if (::GetCapture() == m_hWnd) ::ReleaseCapture();
  if (m_hWndFocusBefore && ::IsWindow(m_hWndFocusBefore)) ::SetFocus(m_hWndFocusBefore);
  m_hWndFocusBefore = nullptr;
  if (!accept) return;
  RowColInfo &info = m_tracked.vertical ? Column(m_tracked.index) : Row(m_tracked.index);
  const int paneStart = m_tracked.vertical ? m_rectLimit.left : m_rectLimit.top;
  const int size = (m_tracked.vertical ? m_rectTracker.left : m_rectTracker.top) - paneStart;
  info.idealSize = size < info.minSize ? 0 : size;
  RecalcLayout();
}

LRESULT CSplitterWnd::WindowProc(UINT message, WPARAM wParam, LPARAM lParam) {
  const POINT pt{static_cast<short>(LOWORD(lParam)), static_cast<short>(HIWORD(lParam))};
  switch (message) {
    case WM_SIZE:
      if (wParam != SIZE_MINIMIZED) RecalcLayout();
      break;
    case WM_PAINT: OnPaint(); return 0;
    case WM_SETCURSOR:
      if (reinterpret_cast<HWND>(wParam) == m_hWnd && LOWORD(lParam) == HTCLIENT) {
        POINT cursor;
        ::GetCursorPos(&cursor);
        ::ScreenToClient(m_hWnd, &cursor);
        const Hit hit = HitTest(cursor);
        if (hit.index >= 0) {
          ::SetCursor(::LoadCursor(nullptr, hit.vertical ? IDC_SIZEWE : IDC_SIZENS));
          return TRUE;
        }
      }
      break;
    case WM_LBUTTONDOWN:
      if (const Hit hit = HitTest(pt); !m_bTracking && hit.index >= 0) {
        StartTracking(hit, pt);
        return 0;
      }
      break;
    case WM_MOUSEMOVE:
      if (m_bTracking) {
        MoveTracker(pt);
        return 0;
      }
      break;
    case WM_LBUTTONUP:
      if (m_bTracking) {
        StopTracking(true);
        return 0;
      }
      break;
    case WM_KEYDOWN:
      if (m_bTracking && wParam == VK_ESCAPE) {
        StopTracking(false);
        return 0;
      }
      break;
    case WM_CANCELMODE: StopTracking(false); break;
    case WM_CAPTURECHANGED:
      if (reinterpret_cast<HWND>(lParam) != m_hWnd) StopTracking(false);
      break;
    default: break;
  }
  return CWnd::WindowProc(message, wParam, lParam);
}

BOOL CSplitterWnd::OnCommand(WPARAM wParam, LPARAM lParam) {
  if (CWnd::OnCommand(wParam, lParam)) return TRUE;
  // The panes' commands belong to the frame.
  ::SendMessageA(::GetParent(m_hWnd), WM_COMMAND, wParam, lParam);
  return TRUE;
}

BOOL CSplitterWnd::OnNotify(WPARAM wParam, LPARAM lParam, LRESULT *result) {
  if (CWnd::OnNotify(wParam, lParam, result)) return TRUE;
  *result = ::SendMessageA(::GetParent(m_hWnd), WM_NOTIFY, wParam, lParam);
  return TRUE;
}

}  // namespace fw
