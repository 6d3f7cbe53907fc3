#include "thumbs/EditSearch.h"

#include "catalogue/DwgData.h"
#include "catalogue/Ordering.h"
#include "explorer/MainFrame.h"
#include "fw/WinApp.h"
#include "res/resource.h"
#include "thumbs/EditEx.h"
#include "thumbs/Ombra3View.h"

CEditSearch *g_pSearchBox = nullptr;

CEditSearch::CEditSearch() { g_pSearchBox = this; }

CEditSearch::~CEditSearch() {
  if (g_pSearchBox == this) g_pSearchBox = nullptr;
}

void CEditSearch::FindByPrefix() {
  const std::string text = GetWindowText();
  if (text.empty() || g_pCatalogue->IsEmpty()) return;
  if (g_pThumbView) g_pThumbView->UnselectAll();
  const int found = FindPrefixMatch(*g_pCatalogue, text);
  // Without a match nothing is chosen: accept must not return a drawing nobody saw marked.
  if (found < 0) {
    if (g_pMainFrame) g_pMainFrame->ShowNothingChosen();
    return;
  }
  (*g_pCatalogue)[found].Select();
  if (g_pThumbView) g_pThumbView->ScrollToRecord(found);
  SetFocus();  // building the tiles gave the focus to the view; typing goes on here
  if (g_pMainFrame) {
    g_pMainFrame->ShowChosen((*g_pCatalogue)[found].m_strDwgName);
    g_pMainFrame->EnableAccept(true);
  }
}

BOOL CEditSearch::PreTranslateMessage(MSG *msg) {
  if (msg->message == WM_KEYDOWN && msg->wParam == VK_ESCAPE) {
    if (fw::CWinApp *app = fw::AfxGetApp(); app && app->m_pMainWnd) app->m_pMainWnd->PostMessage(WM_APP, 2);
  }
  return CEdit::PreTranslateMessage(msg);
}

BOOL CEditSearch::OnChildNotify(UINT message, WPARAM wParam, LPARAM, LRESULT *) {
  if (message == WM_COMMAND && HIWORD(wParam) == EN_CHANGE) {
    FindByPrefix();
    return TRUE;
  }
  if (message == WM_CTLCOLOREDIT || message == WM_CTLCOLORSTATIC)
    DrawSunkenEdge(m_hWnd, reinterpret_cast<HDC>(wParam), GetSystemMetrics(SM_CXEDGE), GetSystemMetrics(SM_CYEDGE));
  return FALSE;
}

LRESULT CEditSearch::WindowProc(UINT message, WPARAM wParam, LPARAM lParam) {
  if (message == WM_LBUTTONDOWN) {
    SetReadOnly(FALSE);
    SetWindowText("");
    return Default();
  }
  return CEdit::WindowProc(message, wParam, lParam);
}
