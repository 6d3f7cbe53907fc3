// The framework's shared memory file: a file written into movable, zero-initialised, shared
// global memory that grows in steps while it is written, and whose block can then be handed to
// the clipboard. Also the owners of global memory used with it.
#pragma once

#include <windows.h>

#include <cstddef>
#include <memory>

namespace fw {

struct GlobalFreeDeleter {
  void operator()(void *memory) const { GlobalFree(memory); }
};
// Owns an HGLOBAL (itself a pointer type) and frees it.
using CGlobalMemory = std::unique_ptr<void, GlobalFreeDeleter>;

// Locks a global block for the scope; Data() is null when the block could not be locked.
class CGlobalLock {
 public:
  explicit CGlobalLock(HGLOBAL memory)
      : m_hMemory(memory), m_pData(memory ? GlobalLock(memory) : nullptr), m_nSize(m_pData ? GlobalSize(memory) : 0) {}
  ~CGlobalLock() {
    if (m_pData) GlobalUnlock(m_hMemory);
  }
  CGlobalLock(const CGlobalLock &) = delete;
  CGlobalLock &operator=(const CGlobalLock &) = delete;

  void *Data() const { return m_pData; }
  size_t Size() const { return m_nSize; }

 private:
  HGLOBAL m_hMemory;
  void *m_pData;
  size_t m_nSize;
};

// A new movable, shared block with the same bytes; empty when it cannot be made.
CGlobalMemory CopyGlobalMemory(HGLOBAL source);

class CSharedFile {
 public:
  explicit CSharedFile(UINT allocFlags = GMEM_MOVEABLE | GMEM_ZEROINIT | GMEM_SHARE, size_t growBytes = 4096);
  CSharedFile(const CSharedFile &) = delete;
  CSharedFile &operator=(const CSharedFile &) = delete;

  // Appends the bytes; false, with nothing written, when the memory cannot grow.
  bool Write(const void *data, size_t count);
  size_t GetLength() const { return m_nLength; }
  // Hands the block over (its size is a whole number of growth steps, the rest zero); the
  // file is empty afterwards.
  CGlobalMemory Detach();

 private:
  UINT m_nAllocFlags;
  size_t m_nGrowBytes;
  CGlobalMemory m_hMemory;
  size_t m_nBufferSize = 0;
  size_t m_nLength = 0;
};

}  // namespace fw
