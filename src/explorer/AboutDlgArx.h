// The about box: icon, name and version of the module.
#pragma once

#include "fw/Dialog.h"

class CAboutDlgArx : public fw::CDialog {
 public:
  explicit CAboutDlgArx(fw::CWnd *parent = nullptr);
};
