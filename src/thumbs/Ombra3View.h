// The thumbnail view: the right pane of the explorer, showing the catalogue of the shown folder.
#pragma once

#include "fw/View.h"

class COmbra3View : public fw::CScrollView {
 public:
  COmbra3View();
  ~COmbra3View() override;

  // Picture size of the tiles: the remembered one when both values are non-zero.
  void GetPictureSize(int &width, int &height) const;
  // Shows a freshly scanned catalogue: the folder in the frame's title, its layer in the frame's
  // label, then sorted and laid out from the first row.
  void ReloadFolder();
  // Lays out from the first row, sorting the catalogue by the frame's key first when asked.
  void ResetAndBuild(BOOL sort);
  void SelectAll();
  void CopySelected();
  bool PasteFiles();

  BOOL OnCmdMsg(UINT id, int code, fw::CCmdUI *cmdUI) override;
  LRESULT WindowProc(UINT message, WPARAM wParam, LPARAM lParam) override;

 private:
  int m_nPictureWidth = 173;
  int m_nPictureHeight = 143;
};

// The thumbnail view while the explorer is open, or null.
extern COmbra3View *g_pThumbView;
