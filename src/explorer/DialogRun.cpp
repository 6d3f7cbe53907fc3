#include "explorer/DialogRun.h"

#include "explorer/MainFrame.h"
#include "explorer/MdiMixin.h"
#include "res/resource.h"

namespace {
constexpr UINT kDoubleClickMilliseconds = 300;
// Sent to itself once the modal loop has shown the (invisible) dialog.
constexpr UINT kActivateExplorer = WM_APP + 1;
}  // namespace

CDialogRun::CDialogRun() : CDialog(IDD_DIALOG_RUN) {}

CDialogRun::~CDialogRun() {
  // The dialog was the application's main window for the run; it must not outlive it there.
  fw::CWinApp *app = fw::AfxGetApp();
  if (app && app->m_pMainWnd == this) app->m_pMainWnd = nullptr;
}

BOOL CDialogRun::OnInitDialog() {
  CDialog::OnInitDialog();
  auto *app = dynamic_cast<CMdiMixin *>(fw::AfxGetApp());
  if (!app || !app->CreateExplorerFrame(this)) {
    // No explorer to end the run later: the browse ends here, as cancelled.
    EndDialog(2);
    return TRUE;
  }
  // The modal loop shows the dialog; at no size and at the corner nobody sees it.
  ::MoveWindow(m_hWnd, 0, 0, 0, 0, FALSE);
  SetDoubleClickTime(kDoubleClickMilliseconds);
  return TRUE;
}

BOOL CDialogRun::PreTranslateMessage(MSG *msg) {
  // The explorer's end request is posted to this dialog; WM_APP reaching the loop for another
  // window, or for the thread, is someone else's message.
  if (msg->message == WM_APP && m_hWnd && msg->hwnd == m_hWnd) EndDialog(static_cast<int>(msg->wParam));
  return CDialog::PreTranslateMessage(msg);
}

LRESULT CDialogRun::WindowProc(UINT message, WPARAM wParam, LPARAM lParam) {
  switch (message) {
    case WM_SHOWWINDOW:
      // Showing the dialog would leave the keyboard with an invisible window: the explorer
      // takes the activation back as soon as the show is done.
      if (wParam) PostMessage(kActivateExplorer);
      break;
    case kActivateExplorer:
      if (g_pMainFrame && g_pMainFrame->m_hWnd) ::SetActiveWindow(g_pMainFrame->m_hWnd);
      return 0;
    default: break;
  }
  return CDialog::WindowProc(message, wParam, lParam);
}
