// Bars along a frame's edges (tool bars, the status bar). The frame lays them out: top bars
// from the top down in creation order, the status bar at the very bottom, other bottom bars
// just above it; the pane window (id AFX_IDW_PANE_FIRST) fills what is left.
#pragma once

#include "fw/FrameworkIds.h"
#include "fw/Wnd.h"

#include <string>

namespace fw {

// Bar styles, kept by the bar itself (not window styles).
constexpr DWORD CBRS_ALIGN_TOP = 0x2000;
constexpr DWORD CBRS_ALIGN_BOTTOM = 0x8000;
constexpr DWORD CBRS_BORDER_LEFT = 0x0100;
constexpr DWORD CBRS_BORDER_TOP = 0x0200;
constexpr DWORD CBRS_BORDER_RIGHT = 0x0400;
constexpr DWORD CBRS_BORDER_BOTTOM = 0x0800;
constexpr DWORD CBRS_TOOLTIPS = 0x0010;
constexpr DWORD CBRS_FLYBY = 0x0020;
constexpr DWORD CBRS_SIZE_DYNAMIC = 0x0004;
constexpr DWORD CBRS_GRIPPER = 0x00400000;
constexpr DWORD CBRS_TOP = CBRS_ALIGN_TOP | CBRS_BORDER_BOTTOM;
constexpr DWORD CBRS_BOTTOM = CBRS_ALIGN_BOTTOM | CBRS_BORDER_TOP;
constexpr DWORD CBRS_ALL = 0x0040FFFF;

class CControlBar : public CWnd {
 public:
  DWORD GetBarStyle() const { return m_dwStyle; }
  virtual bool IsStatusBar() const { return false; }
  // The status bar shows menu and button prompts in its message pane; other bars ignore them.
  virtual void SetMessagePaneText(const std::string &text) { (void)text; }

  // The bar's size along and across its edge for the given frame width (horizontal bars).
  virtual SIZE CalcFixedLayout(BOOL stretch, BOOL horizontal) = 0;
  // Idle-time update of the bar's items through the frame's command routing.
  virtual void OnUpdateCmdUI(CWnd *target) { (void)target; }

 protected:
  // Splits a Create style: window bits go to the window, CBRS_ bits stay with the bar.
  DWORD TakeBarStyle(DWORD style) {
    m_dwStyle = style & CBRS_ALL;
    return style & ~CBRS_ALL;
  }

  DWORD m_dwStyle = 0;
};

}  // namespace fw
