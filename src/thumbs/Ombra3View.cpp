#include "thumbs/Ombra3View.h"

#include "catalogue/DwgData.h"
#include "catalogue/Ombra3Doc.h"
#include "catalogue/Ordering.h"
#include "explorer/MainFrame.h"
#include "filecmd/ForFileCommands.h"
#include "filecmd/SelectionCommands.h"
#include "fw/WinApp.h"
#include "res/resource.h"

COmbra3View *g_pThumbView = nullptr;

COmbra3View::COmbra3View() {
  g_pThumbView = this;
  if (g_pDoc && g_pDoc->m_nPictureWidth != 0 && g_pDoc->m_nPictureHeight != 0) {
    m_nPictureWidth = g_pDoc->m_nPictureWidth;
    m_nPictureHeight = g_pDoc->m_nPictureHeight;
  }
}

COmbra3View::~COmbra3View() {
  g_pCatalogue->RemoveAll();
  if (g_pThumbView == this) g_pThumbView = nullptr;
}

void COmbra3View::GetPictureSize(int &width, int &height) const {
  width = m_nPictureWidth;
  height = m_nPictureHeight;
}

void COmbra3View::ReloadFolder() {
  if (g_pMainFrame && g_pDoc) {
    g_pMainFrame->SetWindowText(g_pDoc->m_strPath);
    g_pMainFrame->UpdateLayerLabel();
  }
  ResetAndBuild(TRUE);
}

void COmbra3View::ResetAndBuild(BOOL sort) {
  if (sort && g_pMainFrame) SortRecords(*g_pCatalogue, g_pMainFrame->m_nSortKey);
  ScrollToPosition(POINT{0, 0});
  Invalidate();
}

void COmbra3View::SelectAll() {
  for (int i = 0; i < g_pCatalogue->GetSize(); ++i) (*g_pCatalogue)[i].Select();
  Invalidate();
}

void COmbra3View::CopySelected() {
  if (g_pDoc) ::CopySelected(*g_pCatalogue, g_pDoc->m_strPath);
}

bool COmbra3View::PasteFiles() { return ::PasteFiles(); }

BOOL COmbra3View::OnCmdMsg(UINT id, int code, fw::CCmdUI *cmdUI) {
  if (code == fw::CN_COMMAND && id == ID_VIEW_BEGIN) {
    ResetAndBuild(TRUE);
    return TRUE;
  }
  return CScrollView::OnCmdMsg(id, code, cmdUI);
}

LRESULT COmbra3View::WindowProc(UINT message, WPARAM wParam, LPARAM lParam) {
  if (message == WM_KEYDOWN && wParam == VK_ESCAPE) {
    if (fw::CWinApp *app = fw::AfxGetApp(); app && app->m_pMainWnd) app->m_pMainWnd->PostMessage(WM_APP, 2);
    return 0;
  }
  return CScrollView::WindowProc(message, wParam, lParam);
}
