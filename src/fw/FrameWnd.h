// A frame window loaded from one resource id (menu, accelerators, title string, icon) that lays
// out its bars and its pane window, routes commands to the active view first, runs update
// handlers when a menu opens and keeps the status bar's message pane.
#pragma once

#include "fw/ControlBar.h"
#include "fw/FrameworkIds.h"
#include "fw/WinApp.h"
#include "fw/Wnd.h"

#include <string>
#include <vector>

namespace fw {

class CCmdUI;

constexpr DWORD FWS_ADDTOTITLE = 0x00008000;

// Frame messages of the class library.
constexpr UINT WM_SETMESSAGESTRING = 0x0362;  // wParam: string id, or lParam: the text
constexpr UINT WM_IDLEUPDATECMDUI = 0x0363;

class CFrameWnd : public CWnd {
 public:
  CFrameWnd() = default;

  // Creates the frame from resource id with the given style, owned by owner.
  virtual BOOL LoadFrame(UINT resourceId, DWORD style, CWnd *owner);
  virtual BOOL PreCreateWindow(CREATESTRUCTA &cs);

  void RecalcLayout();
  CWnd *GetActiveView() const { return m_pActiveView; }
  void SetActiveView(CWnd *view);
  // The title string's first part ("ombra3" of "ombra3\n..."), the frame's caption at start.
  const std::string &GetTitle() const { return m_strTitle; }

  void SetMessageText(const std::string &text);
  void SetMessageText(UINT stringId);
  // The status bar (the bar with id AFX_IDW_STATUS_BAR), or null.
  CControlBar *GetMessageBar() const;
  // The first docked bar with that child id, or the status bar for AFX_IDW_STATUS_BAR.
  CControlBar *GetControlBar(UINT id) const;
  void ShowControlBar(CControlBar *bar, BOOL show);
  // Takes the bar into the layout, along the edge its style names.
  void DockControlBar(CControlBar *bar);

  // Idle processing: update handlers of the bars' items, "Ready" when no prompt is showing.
  void OnIdleUpdate();

  BOOL PreTranslateMessage(MSG *msg) override;
  BOOL OnCmdMsg(UINT id, int code, CCmdUI *cmdUI) override;
  LRESULT WindowProc(UINT message, WPARAM wParam, LPARAM lParam) override;

 protected:
  virtual int OnCreate(CREATESTRUCTA *cs);
  // Creates the pane window; the base makes none.
  virtual BOOL OnCreateClient(CREATESTRUCTA *cs);
  virtual void OnDestroy();
  // The frame's own commands, after the active view had its chance.
  virtual BOOL OnFrameCommand(UINT id, int code, CCmdUI *cmdUI);
  void PostNcDestroy() override;

  HACCEL m_hAccelTable = nullptr;
  UINT m_nIDResource = 0;

 private:
  // The views learn that their frame is complete, as a document template would tell them.
  void SendInitialUpdate();
  void OnInitMenuPopup(HMENU popup);
  void OnMenuSelect(UINT id, UINT flags, HMENU menu);
  void ActivateNextPane(bool previous);

  CWnd *m_pActiveView = nullptr;
  std::vector<CControlBar *> m_dockedBars;  // in docking order
  std::string m_strTitle;
};

}  // namespace fw
