// The about box: icon and name of the module.
#pragma once

#include "fw/Dialog.h"

class CAboutDlgArx : public fw::CDialog {
 public:
  explicit CAboutDlgArx(fw::CWnd *parent = nullptr);
};
