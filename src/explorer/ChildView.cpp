#include "explorer/ChildView.h"

#include "fw/WinApp.h"
#include "res/resource.h"

namespace {
constexpr UINT kTickMilliseconds = 125;
}  // namespace

CChildView::CChildView() {
  SetTickPeriod(kTickMilliseconds);
  m_bEraseIcon = 1;
  m_hCursor.Reset(static_cast<HCURSOR>(
      LoadImageA(fw::AfxGetResourceHandle(), MAKEINTRESOURCEA(IDR_LOADING_CURSOR), IMAGE_CURSOR, 0, 0, LR_DEFAULTCOLOR)));
}

BOOL CChildView::PreTranslateMessage(MSG *msg) {
  if (msg->message == WM_KEYDOWN && msg->hwnd == m_hWnd) {
    if (msg->wParam == VK_ESCAPE) {
      if (fw::CWinApp *app = fw::AfxGetApp(); app && app->m_pMainWnd) app->m_pMainWnd->PostMessage(WM_APP, 2);
      return TRUE;
    }
  }
  return CHourglassFX::PreTranslateMessage(msg);
}
