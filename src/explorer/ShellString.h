// A display name as the shell returns it (STRRET), kept together with a copy of the item id
// list it was obtained for, since an offset-type name points into that list.
#pragma once

#include "explorer/ShellPidl.h"

#include <string>

class CShellString {
 public:
  CShellString() = default;
  ~CShellString() { Reset(); }
  CShellString(const CShellString &) = delete;
  CShellString &operator=(const CShellString &) = delete;

  // Asks `folder` for the display name of its child `item` with `flags`; false on failure.
  bool GetDisplayNameOf(IShellFolder *folder, LPCITEMIDLIST item, SHGDNF flags);
  // The name as ANSI text.
  std::string ToString() const;
  // Frees a wide name with the shell allocator and clears the record.
  void Reset();

 private:
  STRRET m_strRet{};
  CShellPidl m_pidl;
  CShellMallocRef m_malloc;
};
