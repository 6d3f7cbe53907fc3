// The search box of the explorer's top tool bar.
#pragma once

#include "fw/Controls.h"

class CEditSearch : public fw::CEdit {
 public:
  CEditSearch();
  ~CEditSearch() override;
};

// The search box while the explorer is open, or null.
extern CEditSearch *g_pSearchBox;
