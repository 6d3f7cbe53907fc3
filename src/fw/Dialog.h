// Dialogs from resource templates: their controls bound to member objects when they open, and
// the modal run with its own message loop (PreTranslateMessage from the target window up, idle
// updates of frames).
#pragma once

#include "fw/Wnd.h"

namespace fw {

class CDialog;

// The binding of a dialog's controls to its members, done when the dialog opens.
class CDataExchange {
 public:
  explicit CDataExchange(CDialog *dialog) : m_pDlgWnd(dialog) {}
  HWND Control(int id) const;

  CDialog *m_pDlgWnd;
};

// Attaches the control object to the dialog's control with that id.
void DDX_Control(CDataExchange *dx, int id, CWnd &control);

class CDialog : public CWnd {
 public:
  explicit CDialog(UINT templateId, CWnd *parent = nullptr) : m_nIDTemplate(templateId), m_pParentWnd(parent) {}

  // Runs the dialog modally; the value given to EndDialog, or -1 when it could not run.
  virtual INT_PTR DoModal();
  void EndDialog(int result);

  // The base binds the controls (DoDataExchange).
  virtual BOOL OnInitDialog();
  virtual void OnOK();
  virtual void OnCancel();
  virtual void DoDataExchange(CDataExchange *dx) { (void)dx; }

  BOOL PreTranslateMessage(MSG *msg) override;
  LRESULT WindowProc(UINT message, WPARAM wParam, LPARAM lParam) override;

 protected:
  UINT m_nIDTemplate;
  CWnd *m_pParentWnd;

 private:
  void RunModalLoop();

  bool m_bInModalLoop = false;
  INT_PTR m_nModalResult = -1;
};

// What the modal loop does with a message before dispatching it: PreTranslateMessage of each
// framework window from the target up to the top, then the application's main window.
BOOL AfxPreTranslateMessage(MSG *msg);
// Idle processing: every frame of the thread updates its bars.
void AfxIdleUpdate();

}  // namespace fw
