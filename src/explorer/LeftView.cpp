#include "explorer/LeftView.h"

#include "catalogue/FolderScan.h"
#include "catalogue/Ombra3Doc.h"
#include "fw/WinApp.h"
#include "host/ModuleGlobals.h"
#include "thumbs/Ombra3View.h"

CLeftView *g_pLeftView = nullptr;

CLeftView::CLeftView() { g_pLeftView = this; }

CLeftView::~CLeftView() {
  if (g_pLeftView == this) g_pLeftView = nullptr;
}

namespace {
// Until the folder tree selects folders, the explorer shows the call's start folder: the drive of
// the label " (Z:)" in the start shell path and what follows it.
std::string StartFolder() {
  const std::string shellPath = g_szStartShellPath;
  const size_t drive = shellPath.find(":)");
  if (drive == std::string::npos || drive < 2 || shellPath[drive - 2] != '(') return std::string();
  const size_t rest = shellPath.find('\\', drive);
  return shellPath.substr(drive - 1, 2) + (rest == std::string::npos ? "\\" : shellPath.substr(rest));
}
}  // namespace

void CLeftView::OnInitialUpdate() {
  CView::OnInitialUpdate();
  const std::string folder = StartFolder();
  if (!folder.empty() && ScanFolder(folder, ".dwg") && g_pThumbView) g_pThumbView->ReloadFolder();
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
