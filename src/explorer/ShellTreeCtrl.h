// The shell namespace as a tree of folders, rooted at the Desktop: every item carries a
// ShellItemData record, children are filled on first expansion and sorted in the shell's own
// order; selecting a folder shows its drawings, and a right click offers its folder settings.
#pragma once

#include "explorer/ShellItemData.h"
#include "explorer/WaitingTreeCtrl.h"

#include <string>

class CShellTreeCtrl : public CWaitingTreeCtrl {
 public:
  CShellTreeCtrl() = default;
  ~CShellTreeCtrl() override;

  // Creates the control window and gives it the system's small-icon image list.
  BOOL Create(DWORD style, const RECT &rect, fw::CWnd *parent, UINT id);

  // The Desktop as the single root item, with flags 0: folders only, hidden ones left out.
  void InsertRootItem();
  HTREEITEM InsertShellItem(HTREEITEM parent, IShellFolder *parentFolder, LPCITEMIDLIST parentPidl, LPCITEMIDLIST childId,
                            UINT flags);
  // Fills the requested fields of `item` (text, images, state, children button) from the record.
  void FillItemDisplay(TVITEMA &item, const ShellItemData &data) const;
  bool FillChildren(HTREEITEM parent, LPCITEMIDLIST parentPidl, UINT flags);
  static int CompareSiblings(const ShellItemData &first, const ShellItemData &second);
  // Opens the tree down to a file-system folder by the shell's item ids, where the walk along
  // labels cannot (labels that are not the folders' names, hidden folders); the folder becomes
  // the start item. False when the shell cannot parse the folder.
  bool ExpandToFolder(const std::string &folder);

  BOOL OnChildNotify(UINT message, WPARAM wParam, LPARAM lParam, LRESULT *result) override;
  LRESULT WindowProc(UINT message, WPARAM wParam, LPARAM lParam) override;

 protected:
  bool FillItemChildren(HTREEITEM item) override;

 private:
  // The folder of an absolute list, with a reference for the caller; null when it has none.
  IShellFolder *BindFolder(LPCITEMIDLIST absolute) const;
  HTREEITEM ChildToward(HTREEITEM item, LPCITEMIDLIST target, UINT level);
  void OnGetDispInfo(TVITEMA &item) const;
  void OnSelChanged(HTREEITEM item);
  void ShowFolderSettingsMenu();
  void RunFolderSettingsMenu(HTREEITEM item);

  CDesktopFolderRef m_desktop;
  POINT m_ptRightClick{};  // where the right button last went down, in client coordinates
};
