// The search box of the explorer's top tool bar: every change of its text finds the first
// drawing whose name begins with it, marks it, scrolls to it and makes it the chosen drawing.
#pragma once

#include "fw/Controls.h"

class CEditSearch : public fw::CEdit {
 public:
  CEditSearch();
  ~CEditSearch() override;

  void FindByPrefix();

  BOOL PreTranslateMessage(MSG *msg) override;
  BOOL OnChildNotify(UINT message, WPARAM wParam, LPARAM lParam, LRESULT *result) override;
  LRESULT WindowProc(UINT message, WPARAM wParam, LPARAM lParam) override;
};

// The search box while the explorer is open, or null.
extern CEditSearch *g_pSearchBox;
