// The caption box under a tile: shows the drawing's file name, read-only, and is where the user
// renames the drawing (double click or the tile menu's Rename, then Enter; Escape or leaving
// the box gives up). Its window is a child of the view, beside its tile.
#pragma once

#include "fw/Controls.h"

#include <string>

class CEditEx : public fw::CEdit {
 public:
  ~CEditEx() override;

  void StartEditing();
  // Renames the drawing from the saved name to the box's text; true when the shell did it.
  bool CommitRename();

  // The whole text highlighted: the mark of the drawing (the box keeps it without the focus).
  void SelectCaption() const;
  // The highlight removed (a clear changes nothing in a read-only box; setting the same text
  // again drops the selection).
  void UnselectCaption() const;
  void Redraw() const;

  BOOL OnChildNotify(UINT message, WPARAM wParam, LPARAM lParam, LRESULT *result) override;
  LRESULT WindowProc(UINT message, WPARAM wParam, LPARAM lParam) override;

  bool m_bEditing = false;
  std::string m_strSaved;

 private:
  LRESULT OnKeyDown(WPARAM key);
  void OnKillFocus();
};

// Sunken edge drawn along rect grown by dx and dy: the look of a box being typed into.
void DrawSunkenEdge(HWND box, HDC dc, int dx, int dy);
