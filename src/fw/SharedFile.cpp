#include "fw/SharedFile.h"

#include <cstring>

namespace fw {

CGlobalMemory CopyGlobalMemory(HGLOBAL source) {
  CGlobalLock from(source);
  if (!from.Data()) return nullptr;
  CGlobalMemory copy(GlobalAlloc(GMEM_MOVEABLE | GMEM_SHARE, from.Size()));
  if (!copy) return nullptr;
  CGlobalLock to(copy.get());
  if (!to.Data()) return nullptr;
  std::memcpy(to.Data(), from.Data(), from.Size());
  return copy;
}

CSharedFile::CSharedFile(UINT allocFlags, size_t growBytes)
    : m_nAllocFlags(allocFlags), m_nGrowBytes(growBytes ? growBytes : 1) {}

bool CSharedFile::Write(const void *data, size_t count) {
  if (count == 0) return true;
  if (!data || count > SIZE_MAX - m_nLength) return false;
  const size_t end = m_nLength + count;
  if (end > m_nBufferSize) {
    const size_t steps = end / m_nGrowBytes + (end % m_nGrowBytes ? 1 : 0);
    if (steps > SIZE_MAX / m_nGrowBytes) return false;
    const size_t size = steps * m_nGrowBytes;
    HGLOBAL grown = m_hMemory ? GlobalReAlloc(m_hMemory.get(), size, m_nAllocFlags & (GMEM_MOVEABLE | GMEM_ZEROINIT))
                              : GlobalAlloc(m_nAllocFlags, size);
    if (!grown) return false;
    m_hMemory.release();
    m_hMemory.reset(grown);
    m_nBufferSize = size;
  }
  CGlobalLock lock(m_hMemory.get());
  if (!lock.Data()) return false;
  std::memcpy(static_cast<char *>(lock.Data()) + m_nLength, data, count);
  m_nLength = end;
  return true;
}

CGlobalMemory CSharedFile::Detach() {
  m_nBufferSize = 0;
  m_nLength = 0;
  return std::move(m_hMemory);
}

}  // namespace fw
