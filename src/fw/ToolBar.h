// A tool bar over the common tool bar control, placed by its frame like any control bar. Its
// buttons come from a tool bar resource (WORD version 1, image width, image height, item
// count, one WORD command id per item, 0 for a separator) and the bitmap of the same id, whose
// light grey (192, 192, 192) shows as the button face. Tool tips and the status bar prompt of
// a button come from the string table entry of its command: "prompt\ntip".
#pragma once

#include "fw/CmdUI.h"
#include "fw/ControlBar.h"

#include <commctrl.h>

#include <string>
#include <vector>

namespace fw {

constexpr UINT TBBS_BUTTON = TBSTYLE_BUTTON;
constexpr UINT TBBS_SEPARATOR = TBSTYLE_SEP;

class CToolBar : public CControlBar {
 public:
  CToolBar() = default;
  ~CToolBar() override;

  // ctrlStyle: tool bar control styles (TBSTYLE_FLAT); style: window styles and CBRS_ bar
  // styles; borders: extra space around the buttons inside the bar.
  BOOL CreateEx(CWnd *parent, DWORD ctrlStyle = TBSTYLE_FLAT, DWORD style = WS_CHILD | WS_VISIBLE | CBRS_ALIGN_TOP,
                RECT borders = RECT{0, 0, 0, 0}, UINT id = AFX_IDW_TOOLBAR);
  // Buttons and pictures of tool bar resource `resourceId` of the current resource module.
  BOOL LoadToolBar(UINT resourceId);
  // The same from data already read: image size, ids (0 = separator), and the strip of images.
  BOOL LoadToolBar(SIZE imageSize, const std::vector<UINT> &ids, HBITMAP images);

  int GetCount() const { return static_cast<int>(SendMessage(TB_BUTTONCOUNT)); }
  // Index of the item with command id, or -1.
  int CommandToIndex(UINT id) const { return static_cast<int>(SendMessage(TB_COMMANDTOINDEX, id)); }
  UINT GetItemID(int index) const;
  // The item's rectangle in the bar's client coordinates, where a control placed on a
  // separator goes.
  void GetItemRect(int index, RECT *rect) const;
  // style TBBS_SEPARATOR turns the item into a gap `imageOrWidth` pixels wide; otherwise
  // imageOrWidth is the index of the item's picture.
  void SetButtonInfo(int index, UINT id, UINT style, int imageOrWidth);
  void GetButtonInfo(int index, UINT &id, UINT &style, int &imageOrWidth) const;

  BOOL EnableButton(UINT id, BOOL enable = TRUE) const {
    return static_cast<BOOL>(SendMessage(TB_ENABLEBUTTON, id, MAKELPARAM(enable ? TRUE : FALSE, 0)));
  }
  BOOL IsButtonEnabled(UINT id) const { return static_cast<BOOL>(SendMessage(TB_ISBUTTONENABLED, id)); }
  HWND GetToolTips() const { return reinterpret_cast<HWND>(SendMessage(TB_GETTOOLTIPS)); }

  SIZE CalcFixedLayout(BOOL stretch, BOOL horizontal) override;
  void OnUpdateCmdUI(CWnd *target) override;
  LRESULT WindowProc(UINT message, WPARAM wParam, LPARAM lParam) override;

 private:
  // Space the bar keeps around the control's buttons: borders, edges and the gripper.
  RECT NonClientInsets() const;
  void OnNcPaint();
  BOOL OnToolTipText(NMHDR *header);
  void OnFlyBy(int index);

  RECT m_borders{};
  HIMAGELIST m_hImages = nullptr;
  UINT m_nFlyByID = 0;  // the command whose prompt shows, 0 for none
};

}  // namespace fw
