// The record attached to every item of the shell tree, owned by the item.
#pragma once

#include "explorer/ShellPidl.h"

// Enumeration flags of an item and its children.
constexpr UINT kListNonFolders = 0x1;
constexpr UINT kListHidden = 0x2;
constexpr UINT kInheritedFlags = 0xF;

struct ShellItemData {
  ShellItemData(IShellFolder *parent, LPITEMIDLIST absolute, UINT flags) : pParentFolder(parent), pidl(absolute), nFlags(flags) {
    if (pParentFolder) pParentFolder->AddRef();
  }
  ~ShellItemData() {
    if (pParentFolder) pParentFolder->Release();
  }
  ShellItemData(const ShellItemData &) = delete;
  ShellItemData &operator=(const ShellItemData &) = delete;

  // The item's own id within its parent folder.
  LPCITEMIDLIST ChildId() const { return pidl::Last(pidl.Get()); }

  IShellFolder *pParentFolder;  // the folder that contains the item
  CShellPidl pidl;              // absolute: the parent's list and the item's own id
  UINT nFlags;
};
