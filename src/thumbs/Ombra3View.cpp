#include "thumbs/Ombra3View.h"

#include "catalogue/DwgData.h"
#include "catalogue/Ombra3Doc.h"
#include "catalogue/Ordering.h"
#include "explorer/Handles.h"
#include "explorer/LeftView.h"
#include "explorer/MainFrame.h"
#include "filecmd/ForFileCommands.h"
#include "filecmd/SelectionCommands.h"
#include "fw/Menu.h"
#include "fw/WinApp.h"
#include "res/resource.h"
#include "thumbs/RingLayout.h"

#include <windowsx.h>

#include <cstdlib>

COmbra3View *g_pThumbView = nullptr;
int g_nCaptionHeight = 0;

namespace {
constexpr UINT kRedrawAll = RDW_INVALIDATE | RDW_ERASE | RDW_FRAME;
// Posted to the view: scan the folder again once the message that asked for it is done.
constexpr UINT kRefreshFolderMessage = WM_APP + 0x10;
// Ids of the background menu.
enum : UINT { kMenuCopy = 1, kMenuPaste = 2, kMenuDelete = 3, kMenuRename = 4 };

int MeasureCaptionHeight() {
  const ClientDeviceContext screen(nullptr);
  TEXTMETRICA metrics{};
  ::GetTextMetricsA(screen.Get(), &metrics);
  return metrics.tmHeight + 2 + ::GetSystemMetrics(SM_CYEDGE);
}

bool AnyMarked() {
  for (int i = 0; i < g_pCatalogue->GetSize(); ++i)
    if ((*g_pCatalogue)[i].IsSelected()) return true;
  return false;
}

void RefreshFolder() {
  if (g_pLeftView) g_pLeftView->RefreshSelectedFolder();
}
}  // namespace

COmbra3View::COmbra3View() {
  if (g_pDoc && g_pDoc->m_nPictureWidth != 0 && g_pDoc->m_nPictureHeight != 0) {
    m_nPictureWidth = g_pDoc->m_nPictureWidth;
    m_nPictureHeight = g_pDoc->m_nPictureHeight;
  }
  g_pThumbView = this;
  g_nCaptionHeight = MeasureCaptionHeight();
}

COmbra3View::~COmbra3View() {
  DestroyTileWindows();
  g_pCatalogue->RemoveAll();
  m_tiles.reset();
  if (g_pThumbView == this) g_pThumbView = nullptr;
}

void COmbra3View::GetPictureSize(int &width, int &height) const {
  width = m_nPictureWidth;
  height = m_nPictureHeight;
}

int COmbra3View::RowStep() const { return m_nPictureHeight + g_nCaptionHeight; }

RECT COmbra3View::PictureRect(int ringRow) const {
  const int top = ringRow * RowStep();
  return RECT{0, top, m_nPictureWidth, top + m_nPictureHeight};
}

int COmbra3View::ClientHeight() const {
  RECT client;
  GetClientRect(&client);
  return client.bottom;
}

void COmbra3View::UpdateScrollSizes() {
  const int rowStep = RowStep();
  const int height = ClientHeight();
  m_nVisibleRows = height / rowStep;
  const int total = CappedTotalHeight(rowStep, m_nTotalRows, height % rowStep);
  const SIZE step{ColStep(), rowStep};
  SetScrollSizes(MM_TEXT, SIZE{m_nColumns * ColStep() - m_nGap, total}, step, step);
}

void COmbra3View::DestroyTileWindows() {
  for (int i = 0; i < m_nRingSize; ++i) m_tiles[i].DestroyWindow();
}

void COmbra3View::BuildTiles() {
  DestroyTileWindows();
  m_tiles.reset();
  m_nRingSize = 0;
  m_bBuilding = true;
  m_nRecordCount = g_pCatalogue->GetSize();
  if (m_nRecordCount == 0) {
    m_nTotalRows = 0;
    m_nRingRows = 0;
    UpdateScrollSizes();
  } else {
    m_nTotalRows = (m_nRecordCount + m_nColumns - 1) / m_nColumns;
    UpdateScrollSizes();
    if (m_nVisibleRows > m_nTotalRows) m_nVisibleRows = m_nTotalRows;
    m_nRingRows = m_nVisibleRows + 2;
    m_nRingColumns = m_nColumns;
    m_nRingSize = m_nRingRows * m_nColumns;
    m_tiles = std::make_unique<exCDwgThumbnail[]>(static_cast<size_t>(m_nRingSize));
    for (int k = 0; k < m_nRingRows; ++k) CreateRow(m_nTopRow + k, PictureRect(k));
  }
  m_bBuilding = false;
  // Our own scroll bar appearing or going narrowed the client while we built: fit the columns.
  if (m_bSizePending && !m_bInRelayout) {
    m_bSizePending = false;
    Relayout(FALSE);
  }
}

void COmbra3View::CreateRow(int row, RECT r) {
  if (m_nRingSize == 0) return;
  for (int c = 0; c < m_nColumns; ++c) {
    const long long index = static_cast<long long>(row) * m_nRingColumns + c;
    exCDwgThumbnail &tile = m_tiles[static_cast<size_t>(index % m_nRingSize)];
    if (tile.m_hWnd) tile.DestroyWindow();
    if (index < m_nRecordCount) {
      const int i = static_cast<int>(index);
      tile.CreateTile((*g_pCatalogue)[i].m_strDwgName, i, WS_CHILD, r, this, 0);
    }
    ::OffsetRect(&r, ColStep(), 0);
  }
  SetFocus();
}

void COmbra3View::RebuildAtTopRow() {
  if (m_nColumns == 0) return;
  ShowWindow(SW_HIDE);
  DestroyTileWindows();
  const int rowStep = RowStep();
  const long long range = CappedTotalHeight(rowStep, m_nTotalRows, ClientHeight() % rowStep);
  int newTop = TopRowForColumns(m_nTopRow, m_nLayoutColumns, m_nColumns, m_nRecordCount);
  // Where every row fits there is no scroll bar to reach rows above the top one: show them all.
  if ((m_nRecordCount + m_nColumns - 1) / m_nColumns <= ClientHeight() / rowStep) newTop = 0;
  m_nLayoutColumns = m_nColumns;
  long long y = static_cast<long long>(rowStep) * newTop;
  if (range > 0 && y > range) y = (y - 1) % range + 1;  // the wrap: what subtracting the range until y <= range gives
  ScrollToPosition(POINT{0, static_cast<LONG>(y)});
  m_nTopRow = newTop;
  BuildTiles();
  ShowWindow(SW_SHOW);
}

void COmbra3View::Relayout(BOOL fitFrame) {
  m_bInRelayout = TRUE;
  if (m_nTotalRows != 0) {
    RECT frame{0, 0, 0, 0};
    fw::CFrameWnd *parentFrame = GetParentFrame();
    if (parentFrame) parentFrame->GetWindowRect(&frame);
    RECT client;
    GetClientRect(&client);
    m_nColumns = ColumnsThatFit(client.right, m_nGap, ColStep());
    const int width = m_nColumns * ColStep() - m_nGap;
    const int remainder = client.bottom % RowStep();
    const int frameHeight = frame.bottom - frame.top;
    const int newHeight = client.bottom == remainder ? frameHeight : frameHeight - remainder;
    if (fitFrame && parentFrame)
      ::MoveWindow(parentFrame->m_hWnd, frame.left, frame.top, frame.right - frame.left + width - client.right, newHeight, TRUE);
    RebuildAtTopRow();
  }
  m_bInRelayout = FALSE;
}

void COmbra3View::ResetAndBuild(BOOL sort) {
  if (!m_hWnd) return;
  RECT client;
  GetClientRect(&client);
  m_nColumns = ColumnsThatFit(client.right, m_nGap, ColStep());
  m_nLayoutColumns = m_nColumns;
  if (sort && g_pMainFrame) SortRecords(*g_pCatalogue, g_pMainFrame->m_nSortKey);
  m_nTopRow = 0;
  ::SetScrollPos(m_hWnd, SB_VERT, 0, TRUE);
  ::SetScrollPos(m_hWnd, SB_HORZ, 0, TRUE);
  BuildTiles();
}

void COmbra3View::ReloadFolder() {
  if (g_pMainFrame) g_pMainFrame->ShowScannedFolder();
  ResetAndBuild(TRUE);
}

void COmbra3View::ScrollToRecord(int index) {
  ResetAndBuild(FALSE);
  m_nTopRow = index / m_nColumns;
  RebuildAtTopRow();
}

void COmbra3View::ChangePictureSize(bool larger) {
  const PictureSize current{m_nPictureWidth, m_nPictureHeight};
  if (larger) {
    const PictureSize next = LargerPicture(current);
    if (ClientHeight() <= next.height) return;
    m_nLayoutColumns = m_nColumns;
    m_nPictureWidth = next.width;
    m_nPictureHeight = next.height;
  } else {
    if (m_nPictureHeight < 20 || m_nPictureWidth < 20) return;
    const PictureSize next = SmallerPicture(current);
    m_nPictureWidth = next.width;
    m_nPictureHeight = next.height;
    m_nLayoutColumns = m_nColumns;
  }
  Relayout(FALSE);
}

void COmbra3View::UnselectAll() {
  for (int i = 0; i < g_pCatalogue->GetSize(); ++i) (*g_pCatalogue)[i].Deselect();
  for (int i = 0; i < m_nRingSize; ++i) m_tiles[i].UnselectTile();
}

void COmbra3View::SelectAll() {
  for (int i = 0; i < g_pCatalogue->GetSize(); ++i) (*g_pCatalogue)[i].Select();
}

void COmbra3View::CopySelected() {
  if (g_pDoc) ::CopySelected(*g_pCatalogue, g_pDoc->m_strPath);
}

void COmbra3View::DeleteSelected() {
  if (g_pDoc) ::DeleteSelected(*g_pCatalogue, g_pDoc->m_strPath);
}

bool COmbra3View::CanPasteHere() const { return g_pDoc && g_pDoc->m_bFolderShown && ForFileCommands().CanPaste(); }

bool COmbra3View::PasteFiles() { return g_pDoc && g_pDoc->m_bFolderShown && ::PasteFiles(g_pDoc->m_strPath); }

void COmbra3View::PostRefreshFolder() const { PostMessage(kRefreshFolderMessage); }

BOOL COmbra3View::LineDown(int x, int y, int totalHeight) {
  const int rowStep = RowStep();
  const int visible = m_nVisibleRows;
  if (m_nTopRow + visible >= m_nTotalRows) return FALSE;
  if (x > 0) ScrollToPosition(POINT{0, y});
  const bool rowBelow = m_nTopRow + 1 + visible < m_nTotalRows;
  if (rowBelow && y + rowStep * (visible + 1) == totalHeight) ::SetScrollPos(m_hWnd, SB_VERT, 0, TRUE);
  if (rowBelow) CreateRow(m_nTopRow + 1 + visible, PictureRect(visible + 1));
  ++m_nTopRow;
  return TRUE;
}

BOOL COmbra3View::LineUp(int x, int y, int totalHeight) {
  if (x > 0 && y > 0) ScrollToPosition(POINT{0, y});
  if (y == 0 && m_nTopRow > 0) ::SetScrollPos(m_hWnd, SB_VERT, totalHeight - RowStep() * (m_nVisibleRows + 1), TRUE);
  if (m_nTopRow == 0) return FALSE;
  --m_nTopRow;
  CreateRow(m_nTopRow, PictureRect(-1));
  return TRUE;
}

BOOL COmbra3View::OnScroll(UINT scrollCode, UINT pos, BOOL doScroll) {
  const POINT position = GetScrollPosition();
  int mapMode = 0;
  SIZE total, page, line;
  GetDeviceScrollSizes(mapMode, total, page, line);
  const int rowStep = RowStep();
  BYTE vertical = HIBYTE(scrollCode);
  if (vertical == SB_THUMBTRACK) {
    const long long d = static_cast<long long>(pos - pos % static_cast<UINT>(rowStep)) - position.y;
    if (std::llabs(d) < rowStep) return FALSE;
    // The thumb moves the rows one row per message, exactly as a line step (also across a wrap).
    vertical = d > 0 ? SB_LINEDOWN : SB_LINEUP;
    scrollCode = MAKEWORD(LOBYTE(scrollCode), vertical);
  }
  switch (vertical) {
    case SB_LINEDOWN:
    case SB_PAGEDOWN:
      if (!LineDown(position.x, position.y, total.cy)) return FALSE;
      break;
    case SB_LINEUP:
    case SB_PAGEUP:
      if (!LineUp(position.x, position.y, total.cy)) return FALSE;
      break;
    case SB_TOP: OnKey(VK_HOME); return TRUE;
    case SB_BOTTOM: OnKey(VK_END); return TRUE;
    case SB_THUMBPOSITION: return FALSE;
    case SB_ENDSCROLL:
    case 0xFF: break;
    default: return FALSE;
  }
  return CScrollView::OnScroll(scrollCode, pos, doScroll);
}

void COmbra3View::OnKey(WPARAM key) {
  switch (key) {
    case VK_TAB:
      if (g_pLeftView) g_pLeftView->SetFocus();
      break;
    case VK_PRIOR:
      m_nTopRow = m_nTopRow > m_nVisibleRows ? m_nTopRow - m_nVisibleRows : 0;
      RebuildAtTopRow();
      break;
    case VK_NEXT:
      m_nTopRow += m_nVisibleRows;
      if (m_nTopRow + m_nVisibleRows > m_nTotalRows) m_nTopRow = m_nTotalRows - m_nVisibleRows;
      RebuildAtTopRow();
      break;
    case VK_END:
      m_nTopRow = m_nTotalRows - m_nVisibleRows;
      RebuildAtTopRow();
      break;
    case VK_HOME: ResetAndBuild(FALSE); break;
    case VK_UP: OnScroll(0x00FF, 0, TRUE); break;
    case VK_DOWN: OnScroll(0x01FF, 0, TRUE); break;
    default: break;
  }
}

BOOL COmbra3View::PreTranslateMessage(MSG *msg) {
  if (msg->message == WM_KEYDOWN && m_hWnd && (msg->hwnd == m_hWnd || ::IsChild(m_hWnd, msg->hwnd))) OnKey(msg->wParam);
  return CScrollView::PreTranslateMessage(msg);
}

void COmbra3View::OnMouseWheel(short delta) {
  // A notch is the system's wheel lines, each a line step, so rows coming into view get tiles.
  m_nWheelDelta += delta;
  const int notches = m_nWheelDelta / WHEEL_DELTA;
  m_nWheelDelta %= WHEEL_DELTA;
  UINT lines = 3;
  ::SystemParametersInfoA(SPI_GETWHEELSCROLLLINES, 0, &lines, 0);
  const int perNotch = lines == WHEEL_PAGESCROLL ? m_nVisibleRows : static_cast<int>(lines);
  const int steps = std::abs(notches) * std::max(1, std::min(perNotch, std::max(1, m_nVisibleRows)));
  for (int i = 0; i < steps; ++i)
    if (!OnScroll(notches > 0 ? 0x00FF : 0x01FF, 0, TRUE)) break;
}

void COmbra3View::OnBackgroundMenu(LPARAM point) {
  const UINT marked = AnyMarked() ? MF_ENABLED : MF_GRAYED;
  fw::CMenu menu;
  if (menu.CreatePopupMenu()) {
    menu.AppendMenu(MF_STRING | marked, kMenuCopy, "&Copy");
    menu.AppendMenu(MF_STRING | marked, kMenuDelete, "&Delete");
    menu.AppendMenu(MF_STRING | (CanPasteHere() ? MF_ENABLED : MF_GRAYED), kMenuPaste, "&Paste");
    menu.AppendMenu(MF_STRING | MF_GRAYED, kMenuRename, "&Rename");
    POINT screen{GET_X_LPARAM(point), GET_Y_LPARAM(point)};
    ::ClientToScreen(m_hWnd, &screen);
    const UINT chosen = menu.TrackPopupMenu(TPM_RETURNCMD | TPM_RIGHTBUTTON | TPM_NONOTIFY, screen.x, screen.y, m_hWnd);
    menu.DestroyMenu();
    switch (chosen) {
      case kMenuCopy: CopySelected(); break;
      case kMenuPaste:
        if (PasteFiles()) RefreshFolder();
        break;
      case kMenuDelete:
        DeleteSelected();
        RefreshFolder();
        break;
      default: break;
    }
  }
  Default();
}

void COmbra3View::OnPaint() {
  PAINTSTRUCT paint;
  HDC dc = ::BeginPaint(m_hWnd, &paint);
  RECT client;
  GetClientRect(&client);
  ::IntersectClipRect(dc, client.left, client.top, client.right, client.bottom);
  ::FillRect(dc, &client, ::GetSysColorBrush(COLOR_SCROLLBAR));
  ::EndPaint(m_hWnd, &paint);
}

BOOL COmbra3View::PreCreateWindow(CREATESTRUCTA &cs) {
  if (!CScrollView::PreCreateWindow(cs)) return FALSE;
  // The view's class again with a light grey background; the view fills its client area itself
  // in any case. Tiles are children: the fill must not paint over them.
  WNDCLASSA wc{};
  if (::GetClassInfoA(cs.hInstance, cs.lpszClass, &wc)) {
    ::UnregisterClassA(cs.lpszClass, cs.hInstance);
    wc.lpszClassName = cs.lpszClass;
    wc.hbrBackground = static_cast<HBRUSH>(::GetStockObject(LTGRAY_BRUSH));
    ::RegisterClassA(&wc);
  }
  cs.style |= WS_CLIPCHILDREN;
  return TRUE;
}

void COmbra3View::OnInitialUpdate() {
  // The folder pane may have shown a folder before this view was told: keep its layout then.
  if (m_nRingSize == 0)
    SetScrollSizes(MM_TEXT, SIZE{100, 100});
  else
    UpdateScrollSizes();
}

void COmbra3View::OnActivateView(BOOL activate, fw::CView *activateView, fw::CView *deactiveView) {
  ::RedrawWindow(m_hWnd, nullptr, nullptr, kRedrawAll);
  CScrollView::OnActivateView(activate, activateView, deactiveView);
}

BOOL COmbra3View::OnCmdMsg(UINT id, int code, fw::CCmdUI *cmdUI) {
  if (code == fw::CN_COMMAND) {
    switch (id) {
      case ID_VIEW_BEGIN: ResetAndBuild(TRUE); return TRUE;
      case ID_VIEW_INCREASE: ChangePictureSize(true); return TRUE;
      case ID_VIEW_DECREASE: ChangePictureSize(false); return TRUE;
      case ID_VIEW_ALIGNE: Relayout(TRUE); return TRUE;
      default: break;
    }
  }
  return CScrollView::OnCmdMsg(id, code, cmdUI);
}

LRESULT COmbra3View::WindowProc(UINT message, WPARAM wParam, LPARAM lParam) {
  switch (message) {
    case WM_CREATE: {
      const LRESULT result = CScrollView::WindowProc(message, wParam, lParam);
      if (result != -1 && m_toolTip.Create(this)) m_toolTip.SendMessage(TTM_ACTIVATE, TRUE);
      return result;
    }
    case WM_SIZE: {
      const LRESULT result = CScrollView::WindowProc(message, wParam, lParam);
      if (!m_bInRelayout) {
        if (m_bBuilding)
          m_bSizePending = true;
        else
          Relayout(FALSE);
      }
      ::RedrawWindow(m_hWnd, nullptr, nullptr, kRedrawAll);
      return result;
    }
    case WM_KEYDOWN:
      if (wParam == VK_ESCAPE) {
        if (fw::CWinApp *app = fw::AfxGetApp(); app && app->m_pMainWnd) app->m_pMainWnd->PostMessage(WM_APP, 2, 0);
      }
      return Default();
    case WM_RBUTTONDOWN: OnBackgroundMenu(lParam); return 0;
    case WM_PAINT: OnPaint(); return 0;
    case WM_SETFOCUS: {
      const LRESULT result = CScrollView::WindowProc(message, wParam, lParam);
      RECT client;
      GetClientRect(&client);
      ::DrawFocusRect(ClientDeviceContext(m_hWnd).Get(), &client);
      return result;
    }
    case WM_KILLFOCUS: {
      const LRESULT result = Default();
      RECT client;
      GetClientRect(&client);
      ::FrameRect(ClientDeviceContext(m_hWnd).Get(), &client, ::GetSysColorBrush(COLOR_SCROLLBAR));
      return result;
    }
    case WM_MOUSEWHEEL: OnMouseWheel(GET_WHEEL_DELTA_WPARAM(wParam)); return 0;
    case kRefreshFolderMessage: RefreshFolder(); return 0;
    default: return CScrollView::WindowProc(message, wParam, lParam);
  }
}
