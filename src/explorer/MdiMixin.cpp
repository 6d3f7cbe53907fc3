#include "explorer/MdiMixin.h"

#include "catalogue/Ombra3Doc.h"
#include "explorer/FramePlacement.h"
#include "explorer/LeftView.h"
#include "explorer/MainFrame.h"
#include "fw/Dialog.h"
#include "fw/FrameWnd.h"
#include "host/HostApi.h"
#include "host/TextConvert.h"
#include "thumbs/Ombra3View.h"

bool CMdiMixin::SetFrameResource(UINT resourceId) {
  m_nFrameResource = resourceId;
  return true;
}

bool CMdiMixin::CreateExplorerFrame(fw::CDialog *dialog) {
  new COmbra3Doc;
  // The drawing of the last browse is not chosen in this one until the search finds it again.
  const std::string remembered = g_pDoc->m_strName;
  g_pDoc->m_strName.clear();
  auto *frame = new CMainFrame;
  HWND hostFrame = static_cast<HWND>(acedGetAcadFrame());
  if (hostFrame) ::EnableWindow(hostFrame, FALSE);
  if (!frame->LoadFrame(m_nFrameResource, WS_OVERLAPPEDWINDOW | fw::FWS_ADDTOTITLE, dialog)) {
    if (hostFrame) ::EnableWindow(hostFrame, TRUE);
    g_pDoc->m_strName = remembered;  // no browse took place: the next one looks for it again
    return false;
  }
  m_pMainWnd = dialog;

  // Placed and sized before it is first shown: the frame never flashes at its default place.
  RECT dialogRect;
  dialog->GetWindowRect(&dialogRect);
  const FramePlacement placement = PlaceFrame({dialogRect.left, dialogRect.top, dialogRect.right, dialogRect.bottom},
                                              g_pDoc->m_nWindowWidth, g_pDoc->m_nWindowHeight);
  if (placement.maximized) {
    frame->ShowWindow(SW_SHOWMAXIMIZED);
  } else {
    if (placement.resized)
      ::MoveWindow(frame->m_hWnd, placement.x, placement.y, g_pDoc->m_nWindowWidth, g_pDoc->m_nWindowHeight, FALSE);
    frame->ShowWindow(SW_SHOW);
  }

  // The start item becomes the first visible, the highlighted and the selected item: the
  // selection scans its folder and the view shows it.
  if (g_pThumbView && g_pLeftView) {
    CChildView &tree = g_pLeftView->GetTreeCtrl();
    if (HTREEITEM start = tree.GetStartItem()) {
      tree.Select(start, TVGN_FIRSTVISIBLE);
      tree.Select(start, TVGN_DROPHILITE);
      tree.Select(start, TVGN_CARET);
      tree.SetFocus();
    }
  }

  frame->UpdateWindow();
  frame->EnableAccept(false);
  // What the search finds is chosen: marked, named in the title, and what accept returns.
  if (!remembered.empty()) frame->SetSearchText(SplitAnsiPath(remembered).baseName);
  return true;
}

std::string CMdiMixin::GetFolderPath() const { return g_pDoc ? g_pDoc->m_strPath : std::string(); }

std::string CMdiMixin::GetFileName() const { return g_pDoc ? g_pDoc->m_strName : std::string(); }

std::string CMdiMixin::GetFullPath() const {
  if (!g_pDoc) return std::string();
  std::string &folder = g_pDoc->m_strPath;
  if (folder.empty() || folder.back() != '\\') folder += '\\';
  return folder + g_pDoc->m_strName;
}

void CMdiMixin::DeleteDocument() { delete g_pDoc; }
