// Item id lists, the shell's paths to its objects: a run of items, each led by its 16-bit byte
// count (the count included), ended by a zero count. The empty list is the Desktop.
#pragma once

#include "explorer/ShellShared.h"

namespace pidl {
// Bytes of all items, without the terminating zero count; 0 for null.
UINT Size(LPCITEMIDLIST list);
// The item after `item`, or null at the terminator.
LPCITEMIDLIST Next(LPCITEMIDLIST item);
// The item before the terminator; the list itself when it has one item or none.
LPCITEMIDLIST Last(LPCITEMIDLIST list);
// A new list with the items of `first`, then those of `second` (either may be null), from the
// shell's allocator; null when it cannot allocate.
LPITEMIDLIST Combine(LPCITEMIDLIST first, LPCITEMIDLIST second);
// A copy of the items of `list` and its terminator; null for null.
LPITEMIDLIST Copy(LPCITEMIDLIST list);
// The number of items; 0 for null.
UINT Count(LPCITEMIDLIST list);
// The item at `index` (0 is the first), or null when the list has no such item.
LPCITEMIDLIST At(LPCITEMIDLIST list, UINT index);
// A new list of the first `count` items of `list` (fewer when it has fewer), from the shell's
// allocator; null when it cannot allocate.
LPITEMIDLIST Head(LPCITEMIDLIST list, UINT count);
}  // namespace pidl

// Owns a pointer to a shared-allocator object, freed when replaced or destroyed.
template <class T>
class TSharedObject {
 public:
  TSharedObject() = default;
  explicit TSharedObject(T *object) : m_pObject(object) {}
  ~TSharedObject() { Reset(nullptr); }
  TSharedObject(const TSharedObject &) = delete;
  TSharedObject &operator=(const TSharedObject &) = delete;

  T *Get() const { return m_pObject; }
  void Reset(T *object) {
    if (m_pObject && m_pObject != object && m_malloc.Get()) m_malloc.Get()->Free(m_pObject);
    m_pObject = object;
  }

 private:
  CShellMallocRef m_malloc;
  T *m_pObject = nullptr;
};

class CShellPidl : public TSharedObject<ITEMIDLIST> {
 public:
  CShellPidl() = default;
  explicit CShellPidl(LPITEMIDLIST list) : TSharedObject(list) {}
};
