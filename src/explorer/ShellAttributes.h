// What the shell says of an item in its folder: its attributes, and whether the tree shows a
// children button for it before its children are known.
#pragma once

#include <shlobj.h>

// The attributes of `wanted` that the item has; 0 when the folder cannot tell.
ULONG ShellAttributes(IShellFolder *parent, LPCITEMIDLIST child, ULONG wanted);

// 1 when the item shows a children button: a folder that reports sub-folders, or any folder on
// removable media or listed with its non-folder objects (`listNonFolders`); otherwise 0.
int ChildrenButton(IShellFolder *parent, LPCITEMIDLIST child, bool listNonFolders);
