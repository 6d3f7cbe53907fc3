// The status bar over the common status control: a row of panes given by indicator ids. The
// pane of ID_SEPARATOR (the first, by convention) stretches and carries messages; the others
// show the string of their id, and only while their update handler enables them.
#pragma once

#include "fw/CmdUI.h"
#include "fw/ControlBar.h"
#include "fw/FrameworkIds.h"

#include <string>
#include <vector>

namespace fw {

// Pane styles.
constexpr UINT SBPS_NORMAL = 0x0000;
constexpr UINT SBPS_NOBORDERS = 0x0100;  // SBT_NOBORDERS
constexpr UINT SBPS_POPOUT = 0x0200;     // SBT_POPOUT
constexpr UINT SBPS_DISABLED = 0x04000000;
constexpr UINT SBPS_STRETCH = 0x08000000;

class CStatusBar : public CControlBar {
 public:
  BOOL Create(CWnd *parent, DWORD style = WS_CHILD | WS_VISIBLE | CBRS_BOTTOM, UINT id = AFX_IDW_STATUS_BAR);
  // One pane per id. An indicator's text is its string; CAP, NUM and SCRL default to those words.
  BOOL SetIndicators(const UINT *ids, int count);

  int GetCount() const { return static_cast<int>(m_panes.size()); }
  UINT GetItemID(int index) const { return Pane(index).id; }
  int CommandToIndex(UINT id) const;
  BOOL SetPaneText(int index, const std::string &text);
  std::string GetPaneText(int index) const { return Pane(index).text; }
  UINT GetPaneStyle(int index) const { return Pane(index).style; }
  void SetPaneStyle(int index, UINT style);

  bool IsStatusBar() const override { return true; }
  // Prompts and the idle message go to the pane of ID_SEPARATOR.
  void SetMessagePaneText(const std::string &text) override;
  SIZE CalcFixedLayout(BOOL stretch, BOOL horizontal) override;
  // Each pane's update handler runs through target; the key indicators without one show while
  // their key is toggled on.
  void OnUpdateCmdUI(CWnd *target) override;
  LRESULT WindowProc(UINT message, WPARAM wParam, LPARAM lParam) override;

 private:
  struct PaneInfo {
    UINT id = 0;
    UINT style = SBPS_NORMAL;
    int textWidth = 0;
    std::string text;
  };

  const PaneInfo &Pane(int index) const;
  PaneInfo &Pane(int index) { return const_cast<PaneInfo &>(static_cast<const CStatusBar *>(this)->Pane(index)); }
  int MeasureText(const std::string &text) const;
  void ShowPane(int index) const;
  void UpdatePaneLayout() const;

  std::vector<PaneInfo> m_panes;
};

}  // namespace fw
