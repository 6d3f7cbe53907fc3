// The tooltips of the tiles. A tooltip control is a top-level window and costs as much to make
// and destroy as a row of tiles, so the view has one control and every tile adds its own tool
// to it while it lives.
#pragma once

#include "catalogue/DwgData.h"
#include "fw/Wnd.h"

#include <string>

// The text a tile's tooltip shows: name, "Size=..." and the modification date, each padded to
// the longest of the three and joined by blanks; the control breaks the text at the blanks.
std::string TileTipText(const std::string &name, const DwgData &record);
// The widest of the three parts, in characters: the tooltip's maximum width in pixels, which
// is narrower than any word and so puts each part on a line of its own.
int TileTipWidth(const std::string &tipText);

class CViewToolTip : public fw::CWnd {
 public:
  BOOL Create(fw::CWnd *owner);
};

// One tile's tool in the view's tooltip; removed when the object goes or the tile is destroyed.
class CTileTool {
 public:
  CTileTool() = default;
  ~CTileTool() { Remove(); }
  CTileTool(const CTileTool &) = delete;
  CTileTool &operator=(const CTileTool &) = delete;

  void Add(HWND toolTip, HWND tile, const std::string &text);
  void Remove();
  void RelayEvent(const MSG *msg) const;

 private:
  HWND m_hToolTip = nullptr;
  HWND m_hTile = nullptr;
};
