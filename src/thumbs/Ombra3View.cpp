#include "thumbs/Ombra3View.h"

#include "catalogue/DwgData.h"
#include "catalogue/Ombra3Doc.h"
#include "catalogue/Ordering.h"
#include "explorer/Handles.h"
#include "explorer/LeftView.h"
#include "explorer/MainFrame.h"
#include "filecmd/ForFileCommands.h"
#include "filecmd/SelectionCommands.h"
#include "fw/FrameworkIds.h"
#include "fw/Menu.h"
#include "fw/WinApp.h"
#include "res/resource.h"
#include "thumbs/EditSearch.h"
#include "thumbs/RingLayout.h"

#include <windowsx.h>

#include <algorithm>
#include <cstdlib>

COmbra3View *g_pThumbView = nullptr;
int g_nCaptionHeight = 0;

namespace {
constexpr UINT kRedrawAll = RDW_INVALIDATE | RDW_ERASE | RDW_FRAME;
// Posted to the view: carry out the rename a caption box asked for, once its key is done.
constexpr UINT kRenameMessage = WM_APP + 0x10;
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
  // A caption box being renamed ends its rename as it goes; the records may already be those of
  // another folder, so the marks are not shown on tiles that are going.
  m_bDestroyingTiles = true;
  for (int i = 0; i < m_nRingSize; ++i) m_tiles[i].DestroyWindow();
  m_bDestroyingTiles = false;
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
    m_nTotalRows = RowsFor(m_nRecordCount, m_nColumns);
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
  // Keys go on to the view, unless the user is typing a search.
  if (!g_pSearchBox || ::GetFocus() != g_pSearchBox->m_hWnd) SetFocus();
}

void COmbra3View::RebuildAtTopRow() {
  if (m_nColumns == 0) return;
  // Redraw off rather than hidden: hiding would flicker and take the focus from the search box.
  SendMessage(WM_SETREDRAW, FALSE);
  DestroyTileWindows();
  const int rowStep = RowStep();
  const int height = ClientHeight();
  int newTop = TopRowForColumns(m_nTopRow, m_nLayoutColumns, m_nColumns, m_nRecordCount);
  m_nLayoutColumns = m_nColumns;
  // The range of the new column count first: the position is set within it, not the old one.
  m_nTotalRows = RowsFor(m_nRecordCount, m_nColumns);
  const int visibleRows = std::min(height / rowStep, m_nTotalRows);
  // Where every row fits there is no scroll bar to reach rows above the top one: show them all.
  if (m_nTotalRows <= height / rowStep) newTop = 0;
  m_bBuilding = true;
  UpdateScrollSizes();
  ScrollToPosition(POINT{0, ScrollPositionForTopRow(newTop, rowStep, visibleRows, m_nTotalRows, height % rowStep)});
  m_nTopRow = newTop;
  BuildTiles();
  SendMessage(WM_SETREDRAW, TRUE);
  ::RedrawWindow(m_hWnd, nullptr, nullptr, kRedrawAll | RDW_ALLCHILDREN);
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
  if (sort) m_nKeyRecord = -1;  // the records move: the keyboard starts again
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
  if (!m_hWnd) return;
  // The layout a fresh build from the first row would find, then the one build at the record's row.
  RECT client;
  GetClientRect(&client);
  m_nColumns = ColumnsThatFit(client.right, m_nGap, ColStep());
  m_nLayoutColumns = m_nColumns;
  m_nRecordCount = g_pCatalogue->GetSize();
  ::SetScrollPos(m_hWnd, SB_HORZ, 0, TRUE);
  // The scroll range must hold the record's row before the rebuild scrolls there.
  if (const int rows = (m_nRecordCount + m_nColumns - 1) / m_nColumns; rows != m_nTotalRows) {
    m_nTotalRows = rows;
    UpdateScrollSizes();
  }
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
  // Unselecting a caption rewrites its text and repaints it: only the highlighted ones need it
  // (a search keystroke otherwise spends as long on this as on a tenth of the rebuild).
  for (int i = 0; i < m_nRingSize; ++i) {
    int start = 0, end = 0;
    if (m_tiles[i].m_editCaption.m_hWnd) m_tiles[i].m_editCaption.GetSel(start, end);
    if (end > start) m_tiles[i].UnselectTile();
  }
}

void COmbra3View::SelectAll() {
  for (int i = 0; i < g_pCatalogue->GetSize(); ++i) (*g_pCatalogue)[i].Select();
  ShowMarks();
}

void COmbra3View::ShowMarks() {
  if (m_bDestroyingTiles) return;
  for (int i = 0; i < m_nRingSize; ++i) m_tiles[i].ShowMark();
}

void COmbra3View::CopySelected() {
  if (g_pDoc) ::CopySelected(*g_pCatalogue, g_pDoc->m_strPath);
}

void COmbra3View::DeleteSelected() {
  if (g_pDoc) ::DeleteSelected(*g_pCatalogue, g_pDoc->m_strPath);
}

bool COmbra3View::CanPasteHere() const { return g_pDoc && g_pDoc->m_bFolderShown && ForFileCommands().CanPaste(); }

bool COmbra3View::PasteFiles() { return g_pDoc && g_pDoc->m_bFolderShown && ::PasteFiles(g_pDoc->m_strPath); }

void COmbra3View::PostRename(CaptionRename rename) {
  m_pendingRename = std::move(rename);
  PostMessage(kRenameMessage);
}

void COmbra3View::OnRename() {
  if (!m_pendingRename) return;
  const CaptionRename rename = std::move(*m_pendingRename);
  m_pendingRename.reset();
  fw::CFrameWnd *frame = GetParentFrame();
  // The refusal's message box and the shell run message loops of their own, in which the
  // folder may be shown anew: the caption box is looked up by its window afterwards.
  if (ForFileCommands().RenameInFolder(rename.folder, rename.oldName, rename.newName, frame ? frame->m_hWnd : m_hWnd) == 0) {
    RefreshFolder();
  } else if (auto *caption = dynamic_cast<CEditEx *>(fw::CWnd::FromHandlePermanent(rename.caption))) {
    caption->EndEditing();
  }
}

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

int COmbra3View::RowAtThumb(int position) const {
  SCROLLINFO info{sizeof(info), SIF_RANGE | SIF_PAGE, 0, 0, 0, 0, 0};
  ::GetScrollInfo(m_hWnd, SB_VERT, &info);
  const long long limit = static_cast<long long>(info.nMax) - info.nMin + 1 - info.nPage;
  const int lastTop = std::max(0, m_nTotalRows - m_nVisibleRows);
  if (limit <= 0) return 0;
  return static_cast<int>(std::clamp(position * static_cast<long long>(lastTop) / limit, 0LL, static_cast<long long>(lastTop)));
}

void COmbra3View::ShowThumbRow(int position) const {
  const long long first = static_cast<long long>(RowAtThumb(position)) * m_nColumns;
  if (g_pMainFrame && first < g_pCatalogue->GetSize())
    g_pMainFrame->SetMessageText((*g_pCatalogue)[static_cast<int>(first)].m_strDwgName);
}

void COmbra3View::JumpToThumb(int position) {
  if (m_nColumns == 0) return;
  m_nTopRow = RowAtThumb(position);
  RebuildAtTopRow();
  // Past the capped range the rebuild puts the thumb where the wrap leaves it; keep it where the
  // user let it go instead, on a whole row and low enough for a line step down to wrap.
  const int rowStep = RowStep();
  const int remainder = ClientHeight() % rowStep;
  const int total = CappedTotalHeight(rowStep, m_nTotalRows, remainder);
  if (total < static_cast<long long>(rowStep) * m_nTotalRows + remainder) {
    const int y = std::max(0, std::min(position - position % rowStep, total - rowStep * (m_nVisibleRows + 1)));
    ::SetScrollPos(m_hWnd, SB_VERT, m_nTopRow == 0 ? 0 : y, TRUE);
  }
  if (g_pMainFrame) g_pMainFrame->SetMessageText(AFX_IDS_IDLEMESSAGE);
}

BOOL COmbra3View::OnScroll(UINT scrollCode, UINT pos, BOOL doScroll) {
  const POINT position = GetScrollPosition();
  int mapMode = 0;
  SIZE total, page, line;
  GetDeviceScrollSizes(mapMode, total, page, line);
  switch (HIBYTE(scrollCode)) {
    case SB_LINEDOWN:
      if (!LineDown(position.x, position.y, total.cy)) return FALSE;
      break;
    case SB_LINEUP:
      if (!LineUp(position.x, position.y, total.cy)) return FALSE;
      break;
    // A click in the trough pages as the keys do.
    case SB_PAGEDOWN: OnKey(VK_NEXT); return TRUE;
    case SB_PAGEUP: OnKey(VK_PRIOR); return TRUE;
    // Moving the tiles row by row behind the thumb cannot follow it through a large folder:
    // the drag names the row it points at, and the rows are built there once it is let go.
    case SB_THUMBTRACK: ShowThumbRow(static_cast<int>(pos)); return TRUE;
    case SB_THUMBPOSITION: JumpToThumb(static_cast<int>(pos)); return TRUE;
    case SB_TOP: OnKey(VK_HOME); return TRUE;
    case SB_BOTTOM: OnKey(VK_END); return TRUE;
    case SB_ENDSCROLL:
    case 0xFF: break;
    default: return FALSE;
  }
  return CScrollView::OnScroll(scrollCode, pos, doScroll);
}

void COmbra3View::OnKey(WPARAM key) {
  const int page = m_nVisibleRows * m_nColumns;
  // Before any mark, the first arrow marks the first tile in view.
  const bool marked = m_nKeyRecord >= 0 && m_nKeyRecord < m_nRecordCount;
  const int current = marked ? m_nKeyRecord : m_nTopRow * m_nColumns;
  switch (key) {
    case VK_PRIOR:
      m_nTopRow = m_nTopRow > m_nVisibleRows ? m_nTopRow - m_nVisibleRows : 0;
      RebuildAtTopRow();
      MoveKeyMark(InView(std::max(0, current - page)));
      break;
    case VK_NEXT:
      m_nTopRow += m_nVisibleRows;
      if (m_nTopRow + m_nVisibleRows > m_nTotalRows) m_nTopRow = m_nTotalRows - m_nVisibleRows;
      RebuildAtTopRow();
      MoveKeyMark(InView(std::min(m_nRecordCount - 1, current + page)));
      break;
    case VK_END:
      m_nTopRow = m_nTotalRows - m_nVisibleRows;
      RebuildAtTopRow();
      MoveKeyMark(m_nRecordCount - 1);
      break;
    case VK_HOME:
      ResetAndBuild(FALSE);
      MoveKeyMark(0);
      break;
    case VK_LEFT: MoveKeyMark(marked ? std::max(0, current - 1) : current); break;
    case VK_RIGHT: MoveKeyMark(marked ? std::min(m_nRecordCount - 1, current + 1) : current); break;
    case VK_UP: MoveKeyMark(marked && current >= m_nColumns ? current - m_nColumns : current); break;
    case VK_DOWN:
      MoveKeyMark(marked && current + m_nColumns < m_nRecordCount ? current + m_nColumns : current);
      break;
    case VK_RETURN:
      if (exCDwgThumbnail *tile = marked ? TileOf(m_nKeyRecord) : nullptr) tile->Accept();
      break;
    case VK_F2:
      if (exCDwgThumbnail *tile = marked ? TileOf(m_nKeyRecord) : nullptr) tile->StartRename();
      break;
    default: break;
  }
}

int COmbra3View::InView(int record) const {
  if (m_nColumns == 0) return record;
  const int lastRow = std::max(m_nTopRow, m_nTopRow + m_nVisibleRows - 1);
  const int row = std::max(m_nTopRow, std::min(record / m_nColumns, lastRow));
  return std::min(row * m_nColumns + record % m_nColumns, m_nRecordCount - 1);
}

exCDwgThumbnail *COmbra3View::TileOf(int record) const {
  if (record < 0) return nullptr;
  for (int i = 0; i < m_nRingSize; ++i)
    if (m_tiles[i].m_hWnd && m_tiles[i].m_nIndex == record) return &m_tiles[i];
  return nullptr;
}

void COmbra3View::SetKeyRecord(int record) {
  if (record == m_nKeyRecord) return;
  const int previous = m_nKeyRecord;
  m_nKeyRecord = record;
  for (int shown : {previous, record})
    if (exCDwgThumbnail *tile = TileOf(shown)) ::InvalidateRect(tile->m_hWnd, nullptr, TRUE);
}

void COmbra3View::MoveKeyMark(int record) {
  if (m_nRecordCount == 0 || m_nColumns == 0 || record < 0 || record >= m_nRecordCount) return;
  const int row = record / m_nColumns;
  // A row next to those in view comes with a line step, as the wheel brings it; a row further
  // away has the ring built there, as the page keys do.
  if (row == m_nTopRow - 1) {
    OnScroll(0x00FF, 0, TRUE);
  } else if (row == m_nTopRow + m_nVisibleRows) {
    OnScroll(0x01FF, 0, TRUE);
  } else if (row < m_nTopRow || row >= m_nTopRow + m_nVisibleRows) {
    m_nTopRow = std::max(0, std::min(row, m_nTotalRows - m_nVisibleRows));
    RebuildAtTopRow();
  }
  if (exCDwgThumbnail *tile = TileOf(record)) tile->Click();
  SetKeyRecord(record);
}

BOOL COmbra3View::PreTranslateMessage(MSG *msg) {
  if (msg->message == WM_KEYDOWN && m_hWnd && (msg->hwnd == m_hWnd || ::IsChild(m_hWnd, msg->hwnd)) && !BelongsToRename(msg))
    OnKey(msg->wParam);
  return CScrollView::PreTranslateMessage(msg);
}

bool COmbra3View::BelongsToRename(const MSG *msg) {
  const auto *caption = dynamic_cast<const CEditEx *>(fw::CWnd::FromHandlePermanent(msg->hwnd));
  if (!caption || !caption->m_bEditing) return false;
  switch (msg->wParam) {
    case VK_HOME:
    case VK_END:
    case VK_LEFT:
    case VK_RIGHT:
    case VK_RETURN:
    case VK_F2: return true;
    default: return false;
  }
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
    case kRenameMessage: OnRename(); return 0;
    default: return CScrollView::WindowProc(message, wParam, lParam);
  }
}
