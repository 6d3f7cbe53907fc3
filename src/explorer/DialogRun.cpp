#include "explorer/DialogRun.h"

#include "explorer/MdiMixin.h"
#include "res/resource.h"

namespace {
constexpr UINT kDoubleClickMilliseconds = 300;
}

CDialogRun::CDialogRun() : CDialog(IDD_DIALOG_RUN) {}

CDialogRun::~CDialogRun() {
  // The dialog was the application's main window for the run; it must not outlive it there.
  fw::CWinApp *app = fw::AfxGetApp();
  if (app && app->m_pMainWnd == this) app->m_pMainWnd = nullptr;
}

BOOL CDialogRun::OnInitDialog() {
  CDialog::OnInitDialog();
  if (auto *app = dynamic_cast<CMdiMixin *>(fw::AfxGetApp())) app->CreateExplorerFrame(this);
  // The modal loop shows the dialog; at no size and at the corner nobody sees it.
  ::MoveWindow(m_hWnd, 0, 0, 0, 0, FALSE);
  SetDoubleClickTime(kDoubleClickMilliseconds);
  return TRUE;
}

BOOL CDialogRun::PreTranslateMessage(MSG *msg) {
  if (msg->message == WM_APP) EndDialog(static_cast<int>(msg->wParam));
  return CDialog::PreTranslateMessage(msg);
}
