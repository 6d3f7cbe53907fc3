// The thumbnail view: the right pane of the explorer, the drawings of the shown folder as a grid
// of tiles in catalogue order. Only a ring of the visible rows plus two has tiles; scrolling by a
// row destroys the row that leaves the ring and creates the one that enters it in the same slots,
// so any folder costs a few rows of windows. The scroll range is capped; the view keeps its own
// top row and wraps the scroll bar near the ends of the range.
#pragma once

#include "fw/View.h"
#include "thumbs/DwgThumbnail.h"
#include "thumbs/TileToolTip.h"

#include <memory>
#include <optional>
#include <string>

// A rename asked for in a caption box: the box's window, the folder, the old and the new name.
struct CaptionRename {
  HWND caption = nullptr;
  std::string folder;
  std::string oldName;
  std::string newName;
};

class COmbra3View : public fw::CScrollView {
 public:
  COmbra3View();
  ~COmbra3View() override;

  void GetPictureSize(int &width, int &height) const;
  // Shows a freshly scanned catalogue from its first row, the folder in the frame's title.
  void ReloadFolder();
  // Columns from the width, optionally sorted by the frame's key, first row, tiles built.
  void ResetAndBuild(BOOL sort);
  // The row of the record at the top.
  void ScrollToRecord(int index);
  void UnselectAll();
  void SelectAll();
  void CopySelected();
  void DeleteSelected();
  // The clipboard's files into the shown folder; false, and nothing pasted, without one.
  bool PasteFiles();
  // The marks of the records shown again on every caption of the ring.
  void ShowMarks();
  // Renames once the current message is done: the rename may refuse the name with a message,
  // or succeed and scan the folder again, and both may destroy the caption box that asked.
  void PostRename(CaptionRename rename);
  bool CanPasteHere() const;
  HWND ToolTipWindow() const { return m_toolTip.m_hWnd; }
  // The record the keyboard is on, whose tile shows a focus frame; -1 before any. A click puts
  // it on the tile clicked.
  int KeyRecord() const { return m_nKeyRecord; }
  void SetKeyRecord(int record);

  BOOL PreCreateWindow(CREATESTRUCTA &cs) override;
  BOOL PreTranslateMessage(MSG *msg) override;
  BOOL OnScroll(UINT scrollCode, UINT pos, BOOL doScroll = TRUE) override;
  void OnInitialUpdate() override;
  void OnActivateView(BOOL activate, fw::CView *activateView, fw::CView *deactiveView) override;
  BOOL OnCmdMsg(UINT id, int code, fw::CCmdUI *cmdUI) override;
  LRESULT WindowProc(UINT message, WPARAM wParam, LPARAM lParam) override;

  int m_nPictureHeight = 143;
  int m_nPictureWidth = 173;
  int m_nGap = 5;
  int m_nRingRows = 11;
  int m_nTopRow = 0;
  int m_nColumns = 60;
  int m_nLayoutColumns = 60;
  int m_nRecordCount = 0;
  int m_nTotalRows = 0;
  int m_nVisibleRows = 0;
  BOOL m_bInRelayout = FALSE;

 private:
  int ColStep() const { return m_nPictureWidth + m_nGap; }
  int RowStep() const;
  RECT PictureRect(int ringRow) const;
  int ClientHeight() const;

  void UpdateScrollSizes();
  void DestroyTileWindows();
  void BuildTiles();
  void CreateRow(int row, RECT r);
  void RebuildAtTopRow();
  void Relayout(BOOL fitFrame);
  void ChangePictureSize(bool larger);
  BOOL LineDown(int x, int y, int totalHeight);
  BOOL LineUp(int x, int y, int totalHeight);
  // The thumb's place in its track as a row among all rows; a jump there when it is let go.
  int RowAtThumb(int position) const;
  void ShowThumbRow(int position) const;
  void JumpToThumb(int position);
  void OnKey(WPARAM key);
  // Moves the keyboard to the record, scrolling it into view, and chooses it as a click does.
  void MoveKeyMark(int record);
  exCDwgThumbnail *TileOf(int record) const;
  // The record in the same column on the nearest row in view.
  int InView(int record) const;
  void OnMouseWheel(short delta);
  void OnBackgroundMenu(LPARAM point);
  void OnPaint();
  void OnRename();
  // A key of a caption box being renamed (the caret keys, Enter that commits, F2): the box's,
  // not the view's.
  static bool BelongsToRename(const MSG *msg);

  // The tile ring, held by value; its column count and size as captured when it was built.
  std::unique_ptr<exCDwgThumbnail[]> m_tiles;
  int m_nRingColumns = 0;
  int m_nRingSize = 0;
  CViewToolTip m_toolTip;
  int m_nWheelDelta = 0;
  bool m_bBuilding = false;
  bool m_bSizePending = false;
  bool m_bDestroyingTiles = false;
  std::optional<CaptionRename> m_pendingRename;
  int m_nKeyRecord = -1;
};

// The thumbnail view while the explorer is open, or null.
extern COmbra3View *g_pThumbView;
// Height of the caption band under each picture: screen text height + 2 + the edge height.
extern int g_nCaptionHeight;
