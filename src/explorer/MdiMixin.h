// The application's side of the explorer: which frame resource it opens.
#pragma once

#include "fw/WinApp.h"

class CMdiMixin : public fw::CWinApp {
public:
  bool SetFrameResource(UINT resourceId);

private:
  UINT m_nFrameResource = 0;
};
