// The colour swatch of the folder settings dialog: shows one of the host's index colours and
// opens the host's colour dialog when clicked.
#pragma once

#include "fw/Controls.h"
#include "host/HostApi.h"

#include <string>

class CStaticColor : public fw::CStatic {
 public:
  // Shows the host's colour of `index`; the control is not redrawn.
  void SetColorIndex(int index);
  int GetColorIndex() const { return m_colorIndex; }
  // Whether the person chose a colour in the host's colour dialog.
  bool WasChosen() const { return m_bChosen; }

  // The colour of a layer of the host's current drawing; false when there is no such layer.
  static bool GetLayerColor(const std::string &layer, AcCmColor &color);
  // Shows the colour of a layer of the host's current drawing; no change without such a layer.
  void SetColorFromLayer(const std::string &layer);

  BOOL OnChildNotify(UINT message, WPARAM wParam, LPARAM lParam, LRESULT *result) override;
  LRESULT WindowProc(UINT message, WPARAM wParam, LPARAM lParam) override;

  COLORREF m_rgb = 0xFFFFFF;
  int m_colorIndex = 7;

 private:
  void FillClient(HDC dc) const;
  void ChooseColor();

  bool m_bChosen = false;
};
