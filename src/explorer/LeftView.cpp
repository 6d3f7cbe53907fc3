#include "explorer/LeftView.h"

#include "catalogue/FolderScan.h"
#include "catalogue/Ombra3Doc.h"
#include "fw/WinApp.h"
#include "thumbs/Ombra3View.h"

CLeftView *g_pLeftView = nullptr;

CLeftView::CLeftView() { g_pLeftView = this; }

CLeftView::~CLeftView() {
  if (g_pLeftView == this) g_pLeftView = nullptr;
}

void CLeftView::RefreshSelectedFolder() {
  if (!g_pDoc || g_pDoc->m_strPath.empty()) return;
  ScanFolder(g_pDoc->m_strPath, ".dwg");
  if (g_pThumbView) g_pThumbView->ReloadFolder();
}

LRESULT CLeftView::WindowProc(UINT message, WPARAM wParam, LPARAM lParam) {
  if (message == WM_KEYDOWN && wParam == VK_ESCAPE) {
    if (fw::CWinApp *app = fw::AfxGetApp(); app && app->m_pMainWnd) app->m_pMainWnd->PostMessage(WM_APP, 2);
    return 0;
  }
  return CView::WindowProc(message, wParam, lParam);
}
