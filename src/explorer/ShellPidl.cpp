#include "explorer/ShellPidl.h"

#include <cstring>

namespace pidl {

UINT Size(LPCITEMIDLIST list) {
  UINT size = 0;
  for (LPCITEMIDLIST item = list; item && item->mkid.cb; item = Next(item)) size += item->mkid.cb;
  return size;
}

LPCITEMIDLIST Next(LPCITEMIDLIST item) {
  if (!item || !item->mkid.cb) return nullptr;
  auto next = reinterpret_cast<LPCITEMIDLIST>(reinterpret_cast<const BYTE *>(item) + item->mkid.cb);
  return next->mkid.cb ? next : nullptr;
}

LPCITEMIDLIST Last(LPCITEMIDLIST list) {
  LPCITEMIDLIST last = list;
  for (LPCITEMIDLIST item = list; item; item = Next(item)) last = item;
  return last;
}

LPITEMIDLIST Combine(LPCITEMIDLIST first, LPCITEMIDLIST second) {
  const CShellMallocRef malloc;
  if (!malloc.Get()) return nullptr;
  const UINT firstSize = Size(first);
  const UINT secondSize = Size(second);
  auto *list = static_cast<BYTE *>(malloc.Get()->Alloc(firstSize + secondSize + sizeof(USHORT)));
  if (!list) return nullptr;
  if (firstSize) std::memcpy(list, first, firstSize);
  if (secondSize) std::memcpy(list + firstSize, second, secondSize);
  std::memset(list + firstSize + secondSize, 0, sizeof(USHORT));
  return reinterpret_cast<LPITEMIDLIST>(list);
}

LPITEMIDLIST Copy(LPCITEMIDLIST list) {
  // Measured by its items, not by the allocator: a child's id often points into the middle of
  // its parent's block, where the allocator knows no size at all.
  return list ? Combine(list, nullptr) : nullptr;
}

}  // namespace pidl
