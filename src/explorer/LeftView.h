// The left pane of the explorer: a view that holds the folder tree and keeps it at its size.
#pragma once

#include "explorer/ChildView.h"
#include "fw/View.h"

class CLeftView : public fw::CView {
 public:
  CLeftView();
  ~CLeftView() override;

  // Creates the view, its tree with the Desktop as root, and expands the tree along the start
  // folder of the browse call or else along the remembered tree path.
  BOOL Create(LPCSTR className, LPCSTR windowName, DWORD style, const RECT &rect, fw::CWnd *parent, UINT id) override;

  CChildView &GetTreeCtrl() { return m_wndTree; }
  // Scans the tree's selected folder again and lets the thumbnail view show it.
  void RefreshSelectedFolder() { m_wndTree.RefreshSelectedFolder(); }

  LRESULT WindowProc(UINT message, WPARAM wParam, LPARAM lParam) override;

 private:
  CChildView m_wndTree;
};

// The left pane while the explorer is open, or null.
extern CLeftView *g_pLeftView;
