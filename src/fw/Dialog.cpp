#include "fw/Dialog.h"

#include "fw/FrameWnd.h"
#include "fw/WinApp.h"

namespace fw {
namespace {
INT_PTR CALLBACK AfxDlgProc(HWND hwnd, UINT message, WPARAM, LPARAM) {
  if (message != WM_INITDIALOG) return FALSE;
  auto *dialog = dynamic_cast<CDialog *>(CWnd::FromHandlePermanent(hwnd));
  return dialog ? dialog->OnInitDialog() : TRUE;
}

BOOL CALLBACK UpdateFrame(HWND hwnd, LPARAM) {
  if (auto *frame = dynamic_cast<CFrameWnd *>(CWnd::FromHandlePermanent(hwnd))) frame->OnIdleUpdate();
  return TRUE;
}

bool CountsForIdle(const MSG &msg) {
  // Painting and the caret's blink do not end an idle period.
  return msg.message != WM_PAINT && msg.message != 0x0118;
}

struct DialogTemplate {
  HINSTANCE resources;
  LPCDLGTEMPLATEA data;
  HWND owner;
};
}  // namespace

HWND CDataExchange::Control(int id) const { return ::GetDlgItem(m_pDlgWnd->m_hWnd, id); }

void DDX_Control(CDataExchange *dx, int id, CWnd &control) {
  if (!control.m_hWnd) control.SubclassWindow(dx->Control(id));
}

BOOL CDialog::OnInitDialog() {
  CDataExchange dx(this);
  DoDataExchange(&dx);
  return TRUE;
}

void CDialog::OnOK() { EndDialog(IDOK); }

void CDialog::OnCancel() { EndDialog(IDCANCEL); }

void CDialog::EndDialog(int result) {
  m_nModalResult = result;
  if (m_bInModalLoop) {
    m_bInModalLoop = false;
    PostMessage(WM_NULL);  // wake the loop
  }
}

BOOL CDialog::PreTranslateMessage(MSG *msg) {
  const bool keyboard = msg->message >= WM_KEYFIRST && msg->message <= WM_KEYLAST;
  if (keyboard && m_hWnd && (msg->hwnd == m_hWnd || ::IsChild(m_hWnd, msg->hwnd))) return ::IsDialogMessageA(m_hWnd, msg);
  return FALSE;
}

LRESULT CDialog::WindowProc(UINT message, WPARAM wParam, LPARAM lParam) {
  if (message == WM_COMMAND && HIWORD(wParam) <= 1) {
    if (LOWORD(wParam) == IDOK) {
      OnOK();
      return 0;
    }
    if (LOWORD(wParam) == IDCANCEL) {
      OnCancel();
      return 0;
    }
  }
  return CWnd::WindowProc(message, wParam, lParam);
}

INT_PTR CDialog::DoModal() {
  HINSTANCE resources = AfxGetResourceHandle();
  HRSRC found = FindResourceA(resources, MAKEINTRESOURCEA(m_nIDTemplate), MAKEINTRESOURCEA(5));
  HGLOBAL loaded = found ? LoadResource(resources, found) : nullptr;
  auto templateData = static_cast<LPCDLGTEMPLATEA>(loaded ? LockResource(loaded) : nullptr);
  if (!templateData) return -1;

  // Without a parent the owner is the main window's last active pop-up (the explorer frame for
  // a dialog of the explorer), or else the active window, as the class library chooses it.
  HWND owner = m_pParentWnd ? m_pParentWnd->m_hWnd : nullptr;
  CWinApp *app = AfxGetApp();
  if (!owner && app && app->m_pMainWnd && app->m_pMainWnd->m_hWnd) owner = ::GetLastActivePopup(app->m_pMainWnd->m_hWnd);
  if (!owner) owner = ::GetActiveWindow();
  if (owner) owner = ::GetAncestor(owner, GA_ROOT);
  const bool disabledOwner = owner && ::IsWindowEnabled(owner);
  if (disabledOwner) ::EnableWindow(owner, FALSE);

  m_nModalResult = -1;
  m_bInModalLoop = true;
  DialogTemplate call{resources, templateData, owner};
  HWND dialog = CreateAttached(
      [](void *context) {
        auto *c = static_cast<DialogTemplate *>(context);
        return ::CreateDialogIndirectParamA(c->resources, c->data, c->owner, AfxDlgProc, 0);
      },
      &call);
  if (dialog && m_bInModalLoop) RunModalLoop();
  m_bInModalLoop = false;

  // The owner is enabled before the dialog goes, so that activation returns to it.
  if (disabledOwner) ::EnableWindow(owner, TRUE);
  if (dialog && ::IsWindow(dialog)) {
    ::SetWindowPos(dialog, nullptr, 0, 0, 0, 0, SWP_HIDEWINDOW | SWP_NOSIZE | SWP_NOMOVE | SWP_NOACTIVATE | SWP_NOZORDER);
    ::DestroyWindow(dialog);
  }
  return dialog ? m_nModalResult : -1;
}

void CDialog::RunModalLoop() {
  bool idle = true;
  bool shown = (::GetWindowLongA(m_hWnd, GWL_STYLE) & WS_VISIBLE) != 0;
  MSG msg;
  while (m_bInModalLoop) {
    while (idle && !::PeekMessageA(&msg, nullptr, 0, 0, PM_NOREMOVE)) {
      if (!shown) {
        ::ShowWindow(m_hWnd, SW_SHOWNORMAL);
        shown = true;
      }
      AfxIdleUpdate();
      idle = false;
    }
    if (!::GetMessageA(&msg, nullptr, 0, 0)) {
      ::PostQuitMessage(static_cast<int>(msg.wParam));  // leave the quit for the host's own loop
      m_nModalResult = -1;
      break;
    }
    if (!AfxPreTranslateMessage(&msg)) {
      ::TranslateMessage(&msg);
      ::DispatchMessageA(&msg);
    }
    if (CountsForIdle(msg)) idle = true;
  }
}

BOOL AfxPreTranslateMessage(MSG *msg) {
  CWinApp *app = AfxGetApp();
  CWnd *mainWnd = app ? app->m_pMainWnd : nullptr;
  for (HWND hwnd = msg->hwnd; hwnd; hwnd = ::GetParent(hwnd)) {
    CWnd *wnd = CWnd::FromHandlePermanent(hwnd);
    if (wnd && wnd->PreTranslateMessage(msg)) return TRUE;
    if (mainWnd && hwnd == mainWnd->m_hWnd) return FALSE;
  }
  return mainWnd && mainWnd->m_hWnd && mainWnd->PreTranslateMessage(msg);
}

void AfxIdleUpdate() { ::EnumThreadWindows(::GetCurrentThreadId(), UpdateFrame, 0); }

}  // namespace fw
