// The shell's allocator and the Desktop folder, shared by everything in the module that works
// with item id lists: whoever needs one takes a reference (the object is obtained when the
// pointer is null), and the last release clears the pointer again.
#pragma once

#include <shlobj.h>

extern IMalloc *g_pShellMalloc;
extern IShellFolder *g_pDesktopFolder;

// One reference to a shared shell object for the holder's lifetime; Get() is null when the
// shell could not supply it.
class CShellMallocRef {
 public:
  CShellMallocRef();
  ~CShellMallocRef();
  CShellMallocRef(const CShellMallocRef &) = delete;
  CShellMallocRef &operator=(const CShellMallocRef &) = delete;
  IMalloc *Get() const { return g_pShellMalloc; }
};

class CDesktopFolderRef {
 public:
  CDesktopFolderRef();
  ~CDesktopFolderRef();
  CDesktopFolderRef(const CDesktopFolderRef &) = delete;
  CDesktopFolderRef &operator=(const CDesktopFolderRef &) = delete;
  IShellFolder *Get() const { return g_pDesktopFolder; }
};
