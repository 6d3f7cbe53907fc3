// A tile: one drawing of the shown folder, a child window of the thumbnail view in which the host
// draws the drawing's stored preview, with its caption box beneath. The mark of the drawing lives
// in its record; the tile shows it by highlighting the caption.
#pragma once

#include "fw/Wnd.h"
#include "thumbs/EditEx.h"
#include "thumbs/TileToolTip.h"

#include <string>

class DwgData;

class CDwgThumbnail : public fw::CWnd {
 public:
  std::string m_strFileName;
};

class exCDwgThumbnail : public CDwgThumbnail {
 public:
  // A visible bordered tile at rect (the picture, in the view's client coordinates) with its
  // caption in the band beneath; nonzero on success.
  BOOL CreateTile(const std::string &fileName, int index, DWORD style, const RECT &rect, fw::CWnd *parent, UINT id);
  void CreateCaption(const RECT &rect, fw::CWnd *parent);
  // Destroys the caption box, the tile's tool and the tile window; harmless without a window.
  BOOL DestroyWindow();
  void UnselectTile();
  // The caption highlighted exactly when the record is marked (a caption being renamed keeps
  // its own selection).
  void ShowMark();

  BOOL PreTranslateMessage(MSG *msg) override;
  LRESULT WindowProc(UINT message, WPARAM wParam, LPARAM lParam) override;

  // What a plain click does: the drawing alone marked and chosen.
  void Click();
  // What a double click does: the drawing accepted.
  void Accept() const;
  // The caption box opened for a new name, as the tile menu's Rename does.
  void StartRename();

  CEditEx m_editCaption;
  int m_nIndex = 0;
  CTileTool m_toolTip;

 private:
  DwgData &Record() const;
  void ShowChosen(bool chosen) const;
  void ControlClick();
  // Delete and Paste rebuild every tile, this one among them: nothing may touch the tile after.
  void RunMenuCommand(UINT command);
  UINT TrackMenu(POINT screen) const;
  void ShowProperties() const;
};
