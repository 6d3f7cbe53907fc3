// The hidden modal dialog of a browse call: it creates the explorer and ends its modal run when
// the explorer posts WM_APP to it (first parameter 1 accept, 2 cancel).
#pragma once

#include "fw/Dialog.h"

class CDialogRun : public fw::CDialog {
 public:
  CDialogRun();
  ~CDialogRun() override;

  BOOL OnInitDialog() override;
  BOOL PreTranslateMessage(MSG *msg) override;
  LRESULT WindowProc(UINT message, WPARAM wParam, LPARAM lParam) override;
};
