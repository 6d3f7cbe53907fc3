#include "thumbs/DwgThumbnail.h"

#include "catalogue/DwgData.h"
#include "catalogue/Ombra3Doc.h"
#include "explorer/Handles.h"
#include "explorer/LeftView.h"
#include "explorer/MainFrame.h"
#include "filecmd/ForFileCommands.h"
#include "fw/Menu.h"
#include "fw/WinApp.h"
#include "host/HostApi.h"
#include "host/TextConvert.h"
#include "res/resource.h"
#include "thumbs/CurrentFolder.h"
#include "thumbs/Ombra3View.h"

#include <shellapi.h>

#include <stdexcept>

extern int g_nCaptionHeight;

namespace {
constexpr UINT kRedrawAll = RDW_INVALIDATE | RDW_ERASE | RDW_FRAME;

UINT SortCommand(int sortKey) {
  switch (sortKey) {
    case 0: return ID_SORT_BY_NAME;
    case 1: return ID_SORT_BY_DATE;
    case 2: return ID_SORT_BY_SIZE;
    default: return 0;
  }
}
}  // namespace

BOOL exCDwgThumbnail::CreateTile(const std::string &fileName, int index, DWORD style, const RECT &rect, fw::CWnd *parent,
                                 UINT id) {
  const BOOL created = CreateEx(0, fw::AfxWndClassName(), "", style | WS_VISIBLE | WS_BORDER, rect, parent, id);
  m_nIndex = index;
  ShowWindow(SW_SHOW);
  m_strFileName = fileName;
  if (created && g_pThumbView) m_toolTip.Add(g_pThumbView->ToolTipWindow(), m_hWnd, TileTipText(m_strFileName, Record()));
  if (created) CreateCaption(rect, parent);
  return created;
}

void exCDwgThumbnail::CreateCaption(const RECT &rect, fw::CWnd *parent) {
  const int edgeX = GetSystemMetrics(SM_CXEDGE);
  const int edgeY = GetSystemMetrics(SM_CYEDGE);
  const RECT caption{rect.left + edgeX, rect.bottom + edgeY, rect.right - edgeX, rect.bottom + g_nCaptionHeight - edgeY};
  // The slot's object may have served another drawing: its box starts clean.
  m_editCaption.Reset(m_strFileName);
  if (!m_editCaption.Create(WS_CHILD | ES_READONLY | ES_NOHIDESEL | ES_AUTOHSCROLL, caption, parent, 0)) return;
  m_editCaption.SetWindowText(m_strFileName);
  if (Record().IsSelected()) m_editCaption.SelectCaption();
  m_editCaption.ShowWindow(SW_SHOW);
  m_editCaption.Redraw();
}

BOOL exCDwgThumbnail::DestroyWindow() {
  m_editCaption.DestroyWindow();
  m_toolTip.Remove();
  return CDwgThumbnail::DestroyWindow();
}

void exCDwgThumbnail::UnselectTile() {
  if (!m_editCaption.m_hWnd) return;
  m_editCaption.UnselectCaption();
  Record().Deselect();
}

void exCDwgThumbnail::ShowMark() {
  if (!m_editCaption.m_hWnd || m_editCaption.m_bEditing) return;
  if (Record().IsSelected())
    m_editCaption.SelectCaption();
  else
    m_editCaption.UnselectCaption();
}

DwgData &exCDwgThumbnail::Record() const { return (*g_pCatalogue)[m_nIndex]; }

void exCDwgThumbnail::ShowChosen(bool chosen) const {
  if (!g_pMainFrame) return;
  if (chosen)
    g_pMainFrame->ShowChosen(Record().m_strDwgName);
  else
    g_pMainFrame->ShowNothingChosen();
}

void exCDwgThumbnail::Click() {
  if (g_pThumbView) g_pThumbView->UnselectAll();
  m_editCaption.SelectCaption();
  Record().Select();
  ShowChosen(true);
  if (g_pMainFrame) g_pMainFrame->EnableAccept(true);
  if (g_pThumbView) g_pThumbView->SetKeyRecord(m_nIndex);
  ::RedrawWindow(m_hWnd, nullptr, nullptr, kRedrawAll);
}

void exCDwgThumbnail::ControlClick() {
  SetFocus();
  const bool mark = !Record().IsSelected();
  if (mark) {
    m_editCaption.SelectCaption();
    Record().Select();
  } else {
    m_editCaption.UnselectCaption();
    Record().Deselect();
  }
  if (g_pMainFrame) g_pMainFrame->EnableAccept(mark);
  ShowChosen(mark);
}

void exCDwgThumbnail::Accept() const {
  // The shown folder, as the title names the drawing: the browse call joins it to the name.
  if (g_pDoc) g_pDoc->m_strName = Record().m_strDwgName;
  if (fw::CWinApp *app = fw::AfxGetApp(); app && app->m_pMainWnd) app->m_pMainWnd->PostMessage(WM_APP, 1, 0);
}

UINT exCDwgThumbnail::TrackMenu(POINT screen) const {
  fw::CMenu menu;
  if (!menu.LoadMenu(IDR_TILE_MENU)) return 0;
  HMENU popup = menu.GetSubMenu(0);
  if (!ForFileCommands().CanPaste()) ::EnableMenuItem(popup, ID_TILE_PASTE, MF_BYCOMMAND | MF_GRAYED);
  if (const UINT sort = SortCommand(g_pMainFrame ? g_pMainFrame->m_nSortKey : -1))
    ::CheckMenuItem(popup, sort, MF_BYCOMMAND | MF_CHECKED);
  return fw::CMenu::TrackPopup(popup, TPM_RETURNCMD | TPM_RIGHTBUTTON | TPM_NONOTIFY, screen.x, screen.y, m_hWnd);
}

void exCDwgThumbnail::RunMenuCommand(UINT command) {
  switch (command) {
    case ID_TILE_COPY:
      if (g_pThumbView) g_pThumbView->CopySelected();
      return;
    case ID_TILE_DELETE:
    case ID_TILE_PASTE:
      // The refresh runs whatever the command reported, and rebuilds every tile.
      if (g_pThumbView && command == ID_TILE_DELETE) g_pThumbView->DeleteSelected();
      if (g_pThumbView && command == ID_TILE_PASTE) g_pThumbView->PasteFiles();
      if (g_pLeftView) g_pLeftView->RefreshSelectedFolder();
      return;
    case ID_TILE_RENAME: StartRename(); return;
    case ID_SORT_BY_NAME:
    case ID_SORT_BY_DATE:
    case ID_SORT_BY_SIZE:
      if (g_pMainFrame) g_pMainFrame->PostMessage(WM_COMMAND, command, 0);
      return;
    case ID_TILE_PROPERTY: ShowProperties(); return;
    default: return;
  }
}

void exCDwgThumbnail::StartRename() {
  m_editCaption.SetFocus();
  m_editCaption.Redraw();
  m_editCaption.SetReadOnly(FALSE);
  m_editCaption.StartEditing();
}

void exCDwgThumbnail::ShowProperties() const {
  const std::string path = PathInCurrentDirectory(m_strFileName);
  SHELLEXECUTEINFOA info{};
  info.cbSize = sizeof info;
  info.fMask = SEE_MASK_INVOKEIDLIST;
  info.lpVerb = "properties";
  info.lpFile = path.c_str();
  info.nShow = SW_SHOW;
  ShellExecuteExA(&info);
}

BOOL exCDwgThumbnail::PreTranslateMessage(MSG *msg) {
  try {
    switch (msg->message) {
      case WM_KEYDOWN:
        if (fw::CWnd *view = GetParent()) {
          view->SetFocus();
          view->PostMessage(WM_KEYDOWN, msg->wParam, msg->lParam);
        }
        return TRUE;
      case WM_LBUTTONDOWN:
        if (msg->wParam == MK_LBUTTON)
          Click();
        else if (msg->wParam == (MK_LBUTTON | MK_CONTROL))
          ControlClick();
        break;
      case WM_LBUTTONDBLCLK: Accept(); return TRUE;
      case WM_RBUTTONDOWN: {
        m_editCaption.SelectCaption();
        Record().Select();
        ShowChosen(true);
        RunMenuCommand(TrackMenu(msg->pt));
        return TRUE;
      }
      default: break;
    }
  } catch (const std::invalid_argument &) {
    return TRUE;  // a record index outside the catalogue: the operation stops here
  }
  if (msg->message == WM_MOUSEMOVE || msg->message == WM_LBUTTONDOWN || msg->message == WM_LBUTTONUP) m_toolTip.RelayEvent(msg);
  return CDwgThumbnail::PreTranslateMessage(msg);
}

LRESULT exCDwgThumbnail::WindowProc(UINT message, WPARAM wParam, LPARAM lParam) {
  if (message != WM_PAINT) return CDwgThumbnail::WindowProc(message, wParam, lParam);
  PAINTSTRUCT paint;
  ::BeginPaint(m_hWnd, &paint);
  const uint32_t background = 0;
  acdbDisplayPreviewFromDwg(ToWide(m_strFileName.c_str()).c_str(), m_hWnd, &background);
  ::EndPaint(m_hWnd, &paint);
  // The tile the keyboard is on shows a focus frame over its picture.
  if (g_pThumbView && g_pThumbView->KeyRecord() == m_nIndex) {
    RECT frame;
    GetClientRect(&frame);
    ::InflateRect(&frame, -2, -2);
    ::DrawFocusRect(ClientDeviceContext(m_hWnd).Get(), &frame);
  }
  return 0;
}
