// The explorer's folder tree: the shell tree with the progress bar and the hourglass while
// children load, and the keys that leave it (Tab to the thumbnail view, Escape to cancel).
#pragma once

#include "explorer/HourglassFX.h"
#include "explorer/ProgressFX.h"
#include "explorer/ShellTreeCtrl.h"

class CChildView : public CHourglassFX<CProgressFX<CShellTreeCtrl>> {
 public:
  CChildView();

  BOOL PreTranslateMessage(MSG *msg) override;
};
