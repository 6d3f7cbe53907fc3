#include "fw/FrameWnd.h"

#include "fw/CmdUI.h"
#include "fw/View.h"
#include "fw/WinApp.h"

#include <algorithm>

namespace fw {
namespace {
constexpr char kIdleFallback[] = "Ready";

// The frame class of a resource id, registered on this module the first time it is asked for.
std::string FrameClassName(UINT resourceId, HINSTANCE resources) {
  const std::string name = "FwFrame" + std::to_string(resourceId);
  WNDCLASSEXA wc{};
  wc.cbSize = sizeof wc;
  if (GetClassInfoExA(AfxGetInstanceHandle(), name.c_str(), &wc)) return name;
  wc.style = CS_DBLCLKS;
  wc.lpfnWndProc = ::DefWindowProcA;
  wc.hInstance = AfxGetInstanceHandle();
  wc.hCursor = LoadCursor(nullptr, IDC_ARROW);
  wc.hbrBackground = reinterpret_cast<HBRUSH>(COLOR_BTNFACE + 1);
  wc.hIcon = static_cast<HICON>(LoadImageA(resources, MAKEINTRESOURCEA(resourceId), IMAGE_ICON, GetSystemMetrics(SM_CXICON),
                                           GetSystemMetrics(SM_CYICON), LR_SHARED));
  wc.hIconSm = static_cast<HICON>(LoadImageA(resources, MAKEINTRESOURCEA(resourceId), IMAGE_ICON, GetSystemMetrics(SM_CXSMICON),
                                             GetSystemMetrics(SM_CYSMICON), LR_SHARED));
  wc.lpszClassName = name.c_str();
  RegisterClassExA(&wc);
  return name;
}

std::string FirstPart(const std::string &text) { return text.substr(0, text.find('\n')); }
}  // namespace

BOOL CFrameWnd::PreCreateWindow(CREATESTRUCTA &) { return TRUE; }

BOOL CFrameWnd::LoadFrame(UINT resourceId, DWORD style, CWnd *owner) {
  HINSTANCE resources = AfxGetResourceHandle();
  m_nIDResource = resourceId;
  m_strTitle = FirstPart(AfxLoadString(resourceId));
  m_hAccelTable = LoadAcceleratorsA(resources, MAKEINTRESOURCEA(resourceId));

  const std::string className = FrameClassName(resourceId, resources);
  CREATESTRUCTA cs{};
  cs.lpszClass = className.c_str();
  cs.lpszName = m_strTitle.c_str();
  cs.style = static_cast<LONG>(style & ~FWS_ADDTOTITLE);
  cs.x = cs.y = cs.cx = cs.cy = CW_USEDEFAULT;
  cs.hwndParent = owner ? owner->m_hWnd : nullptr;
  cs.hMenu = LoadMenuA(resources, MAKEINTRESOURCEA(resourceId));
  if (!PreCreateWindow(cs)) {
    if (cs.hMenu) DestroyMenu(cs.hMenu);
    return FALSE;
  }
  HMENU menu = cs.hMenu;
  if (!CreateFromStruct(cs)) {
    // A window that existed took its menu and, through PostNcDestroy, this object with it.
    if (menu && IsMenu(menu)) DestroyMenu(menu);
    return FALSE;
  }
  SetMessageText(AFX_IDS_IDLEMESSAGE);
  SendInitialUpdate();
  return TRUE;
}

int CFrameWnd::OnCreate(CREATESTRUCTA *cs) { return OnCreateClient(cs) ? 0 : -1; }

BOOL CFrameWnd::OnCreateClient(CREATESTRUCTA *) { return TRUE; }

void CFrameWnd::OnDestroy() {}

void CFrameWnd::PostNcDestroy() { delete this; }

void CFrameWnd::SetActiveView(CWnd *view) {
  if (view == m_pActiveView) return;
  auto *previous = dynamic_cast<CView *>(m_pActiveView);
  auto *next = dynamic_cast<CView *>(view);
  m_pActiveView = view;
  if (previous) previous->OnActivateView(FALSE, next, previous);
  if (next) next->OnActivateView(TRUE, next, previous);
}

void CFrameWnd::SendInitialUpdate() {
  HWND pane = ::GetDlgItem(m_hWnd, AFX_IDW_PANE_FIRST);
  if (!pane) return;
  ::SendMessageA(pane, WM_INITIALUPDATE, 0, 0);
  for (HWND child = ::GetWindow(pane, GW_CHILD); child; child = ::GetWindow(child, GW_HWNDNEXT))
    ::SendMessageA(child, WM_INITIALUPDATE, 0, 0);
}

void CFrameWnd::DockControlBar(CControlBar *bar) {
  if (!bar || std::find(m_dockedBars.begin(), m_dockedBars.end(), bar) != m_dockedBars.end()) return;
  m_dockedBars.push_back(bar);
  RecalcLayout();
}

CControlBar *CFrameWnd::GetMessageBar() const {
  auto *bar = dynamic_cast<CControlBar *>(FromHandlePermanent(::GetDlgItem(m_hWnd, AFX_IDW_STATUS_BAR)));
  return bar && bar->IsStatusBar() ? bar : nullptr;
}

CControlBar *CFrameWnd::GetControlBar(UINT id) const {
  for (CControlBar *bar : m_dockedBars)
    if (static_cast<UINT>(bar->GetDlgCtrlID()) == id) return bar;
  return id == AFX_IDW_STATUS_BAR ? GetMessageBar() : nullptr;
}

void CFrameWnd::ShowControlBar(CControlBar *bar, BOOL show) {
  if (!bar) return;
  bar->ShowWindow(show ? SW_SHOWNA : SW_HIDE);
  RecalcLayout();
}

namespace {
// A bar squeezed out of the frame and given room again repaints nothing by itself, nor do the
// windows it holds (labels, captions, the search box): all of it is painted anew.
void RepaintWhole(HWND bar) { RedrawWindow(bar, nullptr, nullptr, RDW_INVALIDATE | RDW_ERASE | RDW_ALLCHILDREN); }
}  // namespace

void CFrameWnd::RecalcLayout() {
  if (!m_hWnd) return;
  RECT client;
  GetClientRect(&client);
  const int width = client.right - client.left;
  int top = client.top;
  int bottom = client.bottom;
  auto place = [&](CControlBar *bar, bool atBottom) {
    if (!bar || !bar->m_hWnd || !bar->IsWindowVisible()) return;
    const SIZE size = bar->CalcFixedLayout(TRUE, TRUE);
    if (atBottom) {
      bottom -= size.cy;
      bar->MoveWindow(RECT{client.left, bottom, client.left + width, bottom + size.cy});
    } else {
      bar->MoveWindow(RECT{client.left, top, client.left + width, top + size.cy});
      top += size.cy;
    }
  };
  place(GetMessageBar(), true);
  for (auto bar = m_dockedBars.rbegin(); bar != m_dockedBars.rend(); ++bar)
    if ((*bar)->GetBarStyle() & CBRS_ALIGN_BOTTOM) place(*bar, true);
  for (CControlBar *bar : m_dockedBars)
    if (!((*bar).GetBarStyle() & CBRS_ALIGN_BOTTOM)) place(bar, false);
  if (HWND pane = ::GetDlgItem(m_hWnd, AFX_IDW_PANE_FIRST))
    ::MoveWindow(pane, client.left, top, width, std::max(0, bottom - top), TRUE);
  for (CControlBar *bar : m_dockedBars)
    if (bar->m_hWnd) RepaintWhole(bar->m_hWnd);
}

void CFrameWnd::SetMessageText(const std::string &text) {
  if (CControlBar *bar = GetMessageBar()) bar->SetMessagePaneText(text);
}

void CFrameWnd::SetMessageText(UINT stringId) {
  std::string prompt = FirstPart(AfxLoadString(stringId));
  if (prompt.empty() && stringId == AFX_IDS_IDLEMESSAGE) prompt = kIdleFallback;
  SetMessageText(prompt);
}

void CFrameWnd::OnIdleUpdate() {
  for (CControlBar *bar : m_dockedBars)
    if (bar->m_hWnd && bar->IsWindowVisible()) bar->OnUpdateCmdUI(this);
  if (CControlBar *status = GetMessageBar()) status->OnUpdateCmdUI(this);
}

BOOL CFrameWnd::PreTranslateMessage(MSG *msg) {
  if (msg->message >= WM_KEYFIRST && msg->message <= WM_KEYLAST && m_hAccelTable)
    return TranslateAcceleratorA(m_hWnd, m_hAccelTable, msg);
  return FALSE;
}

BOOL CFrameWnd::OnCmdMsg(UINT id, int code, CCmdUI *cmdUI) {
  if (m_pActiveView && m_pActiveView->OnCmdMsg(id, code, cmdUI)) return TRUE;
  return OnFrameCommand(id, code, cmdUI);
}

BOOL CFrameWnd::OnFrameCommand(UINT id, int code, CCmdUI *cmdUI) {
  const bool update = code == CN_UPDATE_COMMAND_UI;
  if (!update && code != CN_COMMAND) return FALSE;
  switch (id) {
    case ID_VIEW_TOOLBAR:
    case ID_VIEW_STATUS_BAR: {
      CControlBar *bar = GetControlBar(id == ID_VIEW_TOOLBAR ? AFX_IDW_TOOLBAR : AFX_IDW_STATUS_BAR);
      if (!bar) return FALSE;
      if (update)
        cmdUI->SetCheck(bar->IsWindowVisible() ? 1 : 0);
      else
        ShowControlBar(bar, !bar->IsWindowVisible());
      return TRUE;
    }
    case ID_APP_EXIT:
      if (!update) {
        CWinApp *app = AfxGetApp();
        if (app && app->m_pMainWnd) app->m_pMainWnd->PostMessage(WM_CLOSE);
      }
      return TRUE;
    case ID_NEXT_PANE:
    case ID_PREV_PANE:
      if (!update) ActivateNextPane(id == ID_PREV_PANE);
      return TRUE;
    default: return FALSE;
  }
}

void CFrameWnd::ActivateNextPane(bool previous) {
  HWND splitter = ::GetDlgItem(m_hWnd, AFX_IDW_PANE_FIRST);
  if (!splitter) return;
  std::vector<CWnd *> panes;
  for (HWND child = ::GetWindow(splitter, GW_CHILD); child; child = ::GetWindow(child, GW_HWNDNEXT)) {
    const int id = ::GetDlgCtrlID(child);
    if (id >= static_cast<int>(AFX_IDW_PANE_FIRST) && id <= static_cast<int>(AFX_IDW_PANE_FIRST) + 0xFF)
      if (CWnd *pane = FromHandlePermanent(child)) panes.push_back(pane);
  }
  if (panes.empty()) return;
  std::sort(panes.begin(), panes.end(), [](CWnd *a, CWnd *b) { return a->GetDlgCtrlID() < b->GetDlgCtrlID(); });
  auto current = std::find(panes.begin(), panes.end(), m_pActiveView);
  size_t index = current == panes.end() ? 0 : static_cast<size_t>(current - panes.begin());
  index = previous ? (index + panes.size() - 1) % panes.size() : (index + 1) % panes.size();
  SetActiveView(panes[index]);
  panes[index]->SetFocus();
}

void CFrameWnd::OnInitMenuPopup(HMENU popup) {
  const int count = GetMenuItemCount(popup);
  for (int i = 0; i < count; ++i) {
    const UINT id = GetMenuItemID(popup, i);
    if (id == 0 || id == static_cast<UINT>(-1)) continue;  // separators and sub-menus
    CMenuCmdUI item(popup, static_cast<UINT>(i), id);
    OnCmdMsg(id, CN_UPDATE_COMMAND_UI, &item);
  }
}

void CFrameWnd::OnMenuSelect(UINT id, UINT flags, HMENU menu) {
  if (flags == 0xFFFF && !menu)
    SetMessageText(AFX_IDS_IDLEMESSAGE);
  else if (flags & (MF_POPUP | MF_SEPARATOR))
    SetMessageText(std::string());
  else
    SetMessageText(id);
}

LRESULT CFrameWnd::WindowProc(UINT message, WPARAM wParam, LPARAM lParam) {
  switch (message) {
    case WM_CREATE: return OnCreate(reinterpret_cast<CREATESTRUCTA *>(lParam));
    case WM_SIZE:
      if (wParam != SIZE_MINIMIZED) RecalcLayout();
      return 0;
    case WM_SETFOCUS:
      if (m_pActiveView && m_pActiveView->m_hWnd) {
        m_pActiveView->SetFocus();
        return 0;
      }
      break;
    case WM_CLOSE: DestroyWindow(); return 0;
    case WM_DESTROY: OnDestroy(); break;
    case WM_INITMENUPOPUP:
      if (!HIWORD(lParam)) OnInitMenuPopup(reinterpret_cast<HMENU>(wParam));
      return 0;
    case WM_MENUSELECT: OnMenuSelect(LOWORD(wParam), HIWORD(wParam), reinterpret_cast<HMENU>(lParam)); return 0;
    case WM_EXITMENULOOP: SetMessageText(AFX_IDS_IDLEMESSAGE); break;
    case WM_SETMESSAGESTRING:
      if (wParam)
        SetMessageText(static_cast<UINT>(wParam));
      else
        SetMessageText(std::string(lParam ? reinterpret_cast<const char *>(lParam) : ""));
      return 0;
    case WM_IDLEUPDATECMDUI: OnIdleUpdate(); return 0;
    default: break;
  }
  return CWnd::WindowProc(message, wParam, lParam);
}

}  // namespace fw
