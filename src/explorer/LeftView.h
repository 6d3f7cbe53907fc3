// The left pane of the explorer, home of the shell folder tree.
#pragma once

#include "fw/View.h"

class CLeftView : public fw::CView {
 public:
  CLeftView();
  ~CLeftView() override;

  // Scans the shown folder again and lets the thumbnail view show it (after a file command).
  void RefreshSelectedFolder();

  void OnInitialUpdate() override;
  LRESULT WindowProc(UINT message, WPARAM wParam, LPARAM lParam) override;
};

// The left pane while the explorer is open, or null.
extern CLeftView *g_pLeftView;
