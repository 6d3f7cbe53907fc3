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

UINT Count(LPCITEMIDLIST list) {
  UINT count = 0;
  for (LPCITEMIDLIST item = list && list->mkid.cb ? list : nullptr; item; item = Next(item)) ++count;
  return count;
}

LPCITEMIDLIST At(LPCITEMIDLIST list, UINT index) {
  LPCITEMIDLIST item = list && list->mkid.cb ? list : nullptr;
  for (; item && index; --index) item = Next(item);
  return item;
}

LPITEMIDLIST Head(LPCITEMIDLIST list, UINT count) {
  const LPCITEMIDLIST end = At(list, count);
  const UINT size = end ? static_cast<UINT>(reinterpret_cast<const BYTE *>(end) - reinterpret_cast<const BYTE *>(list))
                        : Size(list);
  const CShellMallocRef malloc;
  if (!malloc.Get()) return nullptr;
  auto *head = static_cast<BYTE *>(malloc.Get()->Alloc(size + sizeof(USHORT)));
  if (!head) return nullptr;
  if (size) std::memcpy(head, list, size);
  std::memset(head + size, 0, sizeof(USHORT));
  return reinterpret_cast<LPITEMIDLIST>(head);
}

}  // namespace pidl
