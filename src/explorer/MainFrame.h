// The explorer frame: menu, a top tool bar with the search box and the layer label, a bottom
// tool bar with the accept and cancel buttons, the status bar and the two-pane splitter.
#pragma once

#include "fw/Controls.h"
#include "fw/FrameWnd.h"
#include "fw/SplitterWnd.h"
#include "fw/StatusBar.h"
#include "fw/ToolBar.h"
#include "thumbs/EditSearch.h"

#include <string>

class CMainFrame : public fw::CFrameWnd {
 public:
  CMainFrame();
  ~CMainFrame() override;

  void EnableAccept(bool enable);
  // " Layer name: " and the shown folder's layer from its "datains.ini", or "Current".
  void UpdateLayerLabel();
  void SetSearchText(const std::string &text);
  // A freshly scanned folder: nothing chosen, its layer, and how many of its drawings were left
  // out of the catalogue, which the status bar says while the folder is shown.
  void ShowScannedFolder();
  // The drawing chosen in the view or found by the search: its name in the document, its path
  // in the title. Accept follows the caller's action.
  void ShowChosen(const std::string &name);
  // No drawing chosen: the document's name empty, the shown folder in the title (the tree's path
  // of an item without one), accept disabled.
  void ShowNothingChosen();

  fw::CSplitterWnd m_wndSplitter;
  int m_nSortKey;
  CEditSearch m_wndSearch;
  fw::CStatic m_wndSearchLabel;
  fw::CStatic m_wndLayerLabel;
  fw::CStatic m_wndAcceptCaption;
  fw::CStatic m_wndCancelCaption;
  fw::CStatusBar m_wndStatusBar;
  fw::CToolBar m_wndToolBar;
  fw::CToolBar m_wndToolBarBottom;

 protected:
  int OnCreate(CREATESTRUCTA *cs) override;
  BOOL OnCreateClient(CREATESTRUCTA *cs) override;
  void OnDestroy() override;
  BOOL OnFrameCommand(UINT id, int code, fw::CCmdUI *cmdUI) override;
  BOOL PreTranslateMessage(MSG *msg) override;
  LRESULT WindowProc(UINT message, WPARAM wParam, LPARAM lParam) override;

 private:
  bool CreateTopBar();
  bool CreateBottomBar();
  bool CreateLabel(fw::CStatic &label, fw::CToolBar &bar, UINT slotId, const std::string &text, int extraWidth);
  bool CreateCaption(fw::CStatic &caption, UINT buttonId, const char *text);
  bool CreateSearchBox();
  SIZE TextExtent(const std::string &text) const;
  bool OnSortCommand(int key, bool update, fw::CCmdUI *cmdUI);
  void EndBrowse(int code) const;
  void OpenHelp() const;

  // Set once every window of the frame exists: a half-made frame leaves the document alone.
  bool m_bComplete = false;
  // What the status bar says in place of its idle message while the shown folder needs it.
  std::string m_strFolderNote;
};

// The explorer frame while the explorer is open, or null.
extern CMainFrame *g_pMainFrame;
