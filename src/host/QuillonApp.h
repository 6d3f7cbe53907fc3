// The framework's application object inside the module.
#pragma once

#include "explorer/MdiMixin.h"

class CQuillonApp : public CMdiMixin {
 public:
  BOOL InitInstance() override;
};
