// The caption box under a tile: shows the drawing's file name, read-only, and is where the user
// renames the drawing (double click or the tile menu's Rename, then Enter; Escape or leaving
// the box gives up). Its window is a child of the view, beside its tile.
#pragma once

#include "fw/Controls.h"

#include <string>

class CEditEx : public fw::CEdit {
 public:
  ~CEditEx() override;

  // A box made for another drawing: no rename under way, name the one it shows.
  void Reset(const std::string &name);
  void StartEditing();
  // Hands the rename from the saved name to the box's text to the view, which carries it out
  // once this key is done; false when no rename is under way.
  bool CommitRename();
  // The rename given up: the saved name shown again, read-only, the marks shown again.
  void EndEditing();

  // The whole text highlighted: the mark of the drawing (the box keeps it without the focus).
  void SelectCaption() const;
  // The name before the extension highlighted, as a rename starts.
  void SelectName() const;
  // The highlight removed (setting the same text again drops the selection). A rename under
  // way ends as Escape ends it: its text is never cleared.
  void UnselectCaption();
  void Redraw() const;

  BOOL OnChildNotify(UINT message, WPARAM wParam, LPARAM lParam, LRESULT *result) override;
  LRESULT WindowProc(UINT message, WPARAM wParam, LPARAM lParam) override;

  bool m_bEditing = false;
  std::string m_strSaved;

 private:
  LRESULT OnKeyDown(WPARAM key);
  void OnKillFocus();
  LRESULT OnLeftButtonDown();
};

// Sunken edge drawn along rect grown by dx and dy: the look of a box being typed into.
void DrawSunkenEdge(HWND box, HDC dc, int dx, int dy);
