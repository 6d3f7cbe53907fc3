#include "explorer/MainFrame.h"

#include "catalogue/Ombra3Doc.h"
#include "explorer/AboutDlgArx.h"
#include "explorer/FocusRing.h"
#include "explorer/LeftView.h"
#include "filecmd/MarkedPaths.h"
#include "fw/CmdUI.h"
#include "fw/WinApp.h"
#include "host/ModuleGlobals.h"
#include "host/SplitPath.h"
#include "res/resource.h"
#include "settings/IniFile.h"
#include "thumbs/FocusedEdit.h"
#include "thumbs/Ombra3View.h"

#include <shellapi.h>

CMainFrame *g_pMainFrame = nullptr;

namespace {
constexpr int kSearchBoxWidth = 125;
constexpr int kLayerLabelExtra = 1000;
constexpr int kInitialPaneHeight = 100;
constexpr UINT kIndicators[] = {ID_SEPARATOR, ID_INDICATOR_CAPS, ID_INDICATOR_NUM, ID_INDICATOR_SCRL};

class ClientDC {
 public:
  explicit ClientDC(HWND hwnd) : m_hwnd(hwnd), m_dc(GetDC(hwnd)) {}
  ~ClientDC() { ReleaseDC(m_hwnd, m_dc); }
  ClientDC(const ClientDC &) = delete;
  ClientDC &operator=(const ClientDC &) = delete;
  HDC get() const { return m_dc; }

 private:
  HWND m_hwnd;
  HDC m_dc;
};

// Shrinks rect to size, centred both ways: each side moves in by half the difference.
RECT CentreIn(RECT rect, SIZE size) {
  const int dx = (rect.right - rect.left - size.cx) / 2;
  const int dy = (rect.bottom - rect.top - size.cy) / 2;
  return RECT{rect.left + dx, rect.top + dy, rect.right - dx, rect.bottom - dy};
}
}  // namespace

CMainFrame::CMainFrame() : m_nSortKey(g_pDoc ? g_pDoc->m_nSort : 0) { g_pMainFrame = this; }

CMainFrame::~CMainFrame() {
  if (g_pDoc) g_pDoc->m_nSort = m_nSortKey;
  if (g_pMainFrame == this) g_pMainFrame = nullptr;
}

SIZE CMainFrame::TextExtent(const std::string &text) const {
  ClientDC dc(m_hWnd);
  SIZE size{0, 0};
  GetTextExtentPoint32A(dc.get(), text.c_str(), static_cast<int>(text.size()), &size);
  return size;
}

int CMainFrame::OnCreate(CREATESTRUCTA *cs) {
  if (CFrameWnd::OnCreate(cs) == -1) return -1;
  if (!CreateTopBar() || !CreateBottomBar()) return -1;
  if (!m_wndStatusBar.Create(this, WS_CHILD | WS_VISIBLE | fw::CBRS_BOTTOM, AFX_IDW_STATUS_BAR) ||
      !m_wndStatusBar.SetIndicators(kIndicators, static_cast<int>(sizeof kIndicators / sizeof kIndicators[0])))
    return -1;
  DockControlBar(&m_wndToolBar);
  DockControlBar(&m_wndToolBarBottom);
  m_bComplete = true;
  return 0;
}

bool CMainFrame::CreateTopBar() {
  const DWORD style = WS_CHILD | WS_VISIBLE | fw::CBRS_TOP | fw::CBRS_GRIPPER | fw::CBRS_TOOLTIPS | fw::CBRS_FLYBY;
  if (!m_wndToolBar.CreateEx(this, TBSTYLE_FLAT, style, RECT{0, 0, 0, 0}, AFX_IDW_TOOLBAR) ||
      !m_wndToolBar.LoadToolBar(IDR_MAINFRAME))
    return false;
  return CreateLabel(m_wndSearchLabel, m_wndToolBar, ID_SEARCH_LABEL, "Search:", 1) && CreateSearchBox() &&
         CreateLabel(m_wndLayerLabel, m_wndToolBar, ID_LAYER_LABEL, " Layer name:", kLayerLabelExtra);
}

bool CMainFrame::CreateLabel(fw::CStatic &label, fw::CToolBar &bar, UINT slotId, const std::string &text, int extraWidth) {
  const int index = bar.CommandToIndex(slotId);
  if (index < 0) return false;
  bar.SetButtonInfo(index, slotId, fw::TBBS_SEPARATOR, TextExtent(text).cx + extraWidth);
  RECT rect;
  bar.GetItemRect(index, &rect);
  if (!label.Create(text, WS_CHILD | SS_CENTERIMAGE, rect, &bar)) return false;
  label.ShowWindow(SW_SHOW);
  return true;
}

bool CMainFrame::CreateSearchBox() {
  const int index = m_wndToolBar.CommandToIndex(ID_SEARCH_BOX);
  if (index < 0) return false;
  m_wndToolBar.SetButtonInfo(index, ID_SEARCH_BOX, fw::TBBS_SEPARATOR, kSearchBoxWidth);
  RECT rect;
  m_wndToolBar.GetItemRect(index, &rect);
  const int textHeight = TextExtent("L").cy;
  const int d = (rect.bottom - rect.top - textHeight) / 2;
  rect.top += d;
  rect.bottom -= d;
  const int edge = GetSystemMetrics(SM_CXEDGE);
  rect.left += edge;
  rect.right -= edge;
  if (!m_wndSearch.Create(WS_CHILD | ES_AUTOHSCROLL | ES_NOHIDESEL, rect, &m_wndToolBar, ID_SEARCH_BOX)) return false;
  m_wndSearch.ShowWindow(SW_SHOW);
  return true;
}

bool CMainFrame::CreateBottomBar() {
  const DWORD style = WS_CHILD | WS_VISIBLE | fw::CBRS_BOTTOM | fw::CBRS_TOOLTIPS | fw::CBRS_FLYBY | fw::CBRS_SIZE_DYNAMIC;
  if (!m_wndToolBarBottom.CreateEx(this, TBSTYLE_FLAT, style, RECT{0, 0, 0, 0}, AFX_IDW_TOOLBAR) ||
      !m_wndToolBarBottom.LoadToolBar(IDR_TOOLBAR_BOTTOM))
    return false;
  return CreateCaption(m_wndAcceptCaption, ID_BROWSE_ACCEPT, g_szAcceptCaption) &&
         CreateCaption(m_wndCancelCaption, ID_BROWSE_CANCEL, g_szCancelCaption);
}

bool CMainFrame::CreateCaption(fw::CStatic &caption, UINT buttonId, const char *text) {
  const int index = m_wndToolBarBottom.CommandToIndex(buttonId);
  if (index < 0) return false;
  RECT rect;
  m_wndToolBarBottom.GetItemRect(index, &rect);
  rect = CentreIn(rect, TextExtent(text));
  if (!caption.Create(text, WS_CHILD | SS_CENTER | SS_CENTERIMAGE, rect, &m_wndToolBarBottom)) return false;
  caption.ShowWindow(SW_SHOW);
  return true;
}

BOOL CMainFrame::OnCreateClient(CREATESTRUCTA *) {
  if (!m_wndSplitter.CreateStatic(this, 1, 2, WS_CHILD | WS_VISIBLE, AFX_IDW_PANE_FIRST)) return FALSE;
  const int leftWidth = g_pDoc ? g_pDoc->m_nSplitterSize : 100;
  if (!m_wndSplitter.CreateView<CLeftView>(0, 0, SIZE{leftWidth, kInitialPaneHeight}) ||
      !m_wndSplitter.CreateView<COmbra3View>(0, 1, SIZE{100, kInitialPaneHeight})) {
    m_wndSplitter.DestroyWindow();
    return FALSE;
  }
  SetActiveView(m_wndSplitter.GetPane(0, 0));
  return TRUE;
}

void CMainFrame::OnDestroy() {
  if (g_pDoc && m_bComplete) {
    // A minimised frame is remembered at the size it is restored to, not as its icon.
    RECT window;
    WINDOWPLACEMENT placement{};
    placement.length = sizeof placement;
    if (IsIconic(m_hWnd) && GetWindowPlacement(m_hWnd, &placement))
      window = placement.rcNormalPosition;
    else
      GetWindowRect(&window);
    g_pDoc->m_nWindowWidth = window.right - window.left;
    g_pDoc->m_nWindowHeight = window.bottom - window.top;
    if (m_wndSplitter.m_hWnd) {
      int current = 0;
      int minimum = 0;
      m_wndSplitter.GetColumnInfo(0, current, minimum);
      g_pDoc->m_nSplitterSize = current;
    }
    if (g_pThumbView) g_pThumbView->GetPictureSize(g_pDoc->m_nPictureWidth, g_pDoc->m_nPictureHeight);
  }
  CFrameWnd::OnDestroy();
  EndBrowse(2);
}

void CMainFrame::EndBrowse(int code) const {
  fw::CWinApp *app = fw::AfxGetApp();
  if (app && app->m_pMainWnd) app->m_pMainWnd->PostMessage(WM_APP, static_cast<WPARAM>(code));
}

BOOL CMainFrame::PreTranslateMessage(MSG *msg) {
  if (HandleFocusKey(*this, *msg)) return TRUE;
  return CFrameWnd::PreTranslateMessage(msg);
}

void CMainFrame::EnableAccept(bool enable) {
  m_wndToolBarBottom.SendMessage(TB_ENABLEBUTTON, ID_BROWSE_ACCEPT, MAKELONG(enable ? 1 : 0, 0));
  m_wndAcceptCaption.EnableWindow(enable);
}

void CMainFrame::UpdateLayerLabel() {
  std::string layer;
  if (g_pDoc && g_pDoc->m_bFolderShown) {
    CIniFile settings;
    settings.SetFilePath(g_pDoc->m_strPath + "\\datains.ini");
    if (settings.Load()) layer = settings.GetString("Default Parameters", "Layer");
  }
  if (layer.empty()) layer = "Current";
  m_wndLayerLabel.SetWindowText(" Layer name: " + layer);
}

void CMainFrame::SetSearchText(const std::string &text) {
  if (m_wndSearch.m_hWnd) m_wndSearch.SetWindowText(text);
}

void CMainFrame::ShowScannedFolder() {
  // What was chosen before the scan may be gone or renamed: the user chooses again.
  ShowNothingChosen();
  UpdateLayerLabel();
  const int leftOut = g_pDoc ? g_pDoc->m_nDrawingsLeftOut : 0;
  m_strFolderNote.clear();
  if (leftOut == 1)
    m_strFolderNote = "1 drawing is not shown: its name has characters that this system's code page cannot hold";
  else if (leftOut > 1)
    m_strFolderNote = std::to_string(leftOut) +
                      " drawings are not shown: their names have characters that this system's code page cannot hold";
  if (m_strFolderNote.empty())
    SetMessageText(AFX_IDS_IDLEMESSAGE);
  else
    SetMessageText(m_strFolderNote);
}

void CMainFrame::ShowChosen(const std::string &name) {
  if (!g_pDoc) return;
  g_pDoc->m_strName = name;
  SetWindowText(FolderWithSeparator(g_pDoc->m_strPath) + name);
}

void CMainFrame::ShowNothingChosen() {
  if (g_pDoc) {
    g_pDoc->m_strName.clear();
    SetWindowText(g_pDoc->m_bFolderShown ? g_pDoc->m_strPath : g_pDoc->m_strShellPath);
  }
  EnableAccept(false);
}

void CMainFrame::OpenHelp() const {
  char modulePath[MAX_PATH] = "";
  GetModuleFileNameA(g_hModule, modulePath, MAX_PATH);
  const PathParts parts = SplitPath(modulePath);
  const std::string helpPath = parts.drive + parts.directory + parts.baseName + ".hlp";
  ShellExecuteA(m_hWnd, "open", helpPath.c_str(), nullptr, nullptr, SW_SHOWMAXIMIZED);
}

bool CMainFrame::OnSortCommand(int key, bool update, fw::CCmdUI *cmdUI) {
  if (update) {
    cmdUI->SetCheck(m_nSortKey == key ? 1 : 0);
  } else if (g_pThumbView) {
    m_nSortKey = key;
    g_pThumbView->ResetAndBuild(TRUE);
  }
  return true;
}

BOOL CMainFrame::OnFrameCommand(UINT id, int code, fw::CCmdUI *cmdUI) {
  const bool update = code == fw::CN_UPDATE_COMMAND_UI;
  if (!update && code != fw::CN_COMMAND) return CFrameWnd::OnFrameCommand(id, code, cmdUI);
  switch (id) {
    case ID_SORT_BY_NAME: return OnSortCommand(0, update, cmdUI);
    case ID_SORT_BY_DATE: return OnSortCommand(1, update, cmdUI);
    case ID_SORT_BY_SIZE: return OnSortCommand(2, update, cmdUI);
    default: break;
  }
  if (update) return CFrameWnd::OnFrameCommand(id, code, cmdUI);
  switch (id) {
    case ID_VIEW_BEGIN:
    case ID_VIEW_INCREASE:
    case ID_VIEW_DECREASE:
    case ID_VIEW_ALIGNE:
    case ID_FILE_OPEN:
      if (g_pThumbView) g_pThumbView->SendMessage(WM_COMMAND, id);
      return TRUE;
    case ID_EDIT_COPY:
      if (g_pThumbView) g_pThumbView->CopySelected();
      return TRUE;
    case ID_EDIT_PASTE:
      if (g_pThumbView && g_pThumbView->PasteFiles() && g_pLeftView) g_pLeftView->RefreshSelectedFolder();
      return TRUE;
    case ID_EDIT_CUT: return TRUE;
    case ID_MARK_ALL:
      if (g_pThumbView) g_pThumbView->SelectAll();
      return TRUE;
    case ID_CLEAR_FOCUSED_EDIT:
      if (g_pFocusedEdit) g_pFocusedEdit->SendMessage(WM_CLEAR);
      return TRUE;
    case ID_BROWSE_ACCEPT: EndBrowse(1); return TRUE;
    case ID_BROWSE_CANCEL: EndBrowse(2); return TRUE;
    case ID_APP_ABOUT: {
      CAboutDlgArx about(this);
      about.DoModal();
      return TRUE;
    }
    case ID_HELP: OpenHelp(); return TRUE;
    default: return CFrameWnd::OnFrameCommand(id, code, cmdUI);
  }
}

LRESULT CMainFrame::WindowProc(UINT message, WPARAM wParam, LPARAM lParam) {
  const LRESULT result = CFrameWnd::WindowProc(message, wParam, lParam);
  // Menus and tool tips put the idle message back when they are done: the folder's note stands
  // in its place.
  const bool idleAgain = message == WM_EXITMENULOOP || (message == WM_MENUSELECT && HIWORD(wParam) == 0xFFFF) ||
                         (message == fw::WM_SETMESSAGESTRING && wParam == AFX_IDS_IDLEMESSAGE);
  if (idleAgain && !m_strFolderNote.empty() && m_wndStatusBar.m_hWnd) SetMessageText(m_strFolderNote);
  return result;
}
