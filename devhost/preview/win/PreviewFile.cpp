#include "preview/win/PreviewFile.h"

#include <algorithm>

namespace devhost::preview {

namespace {
uint64_t g_bytesRead = 0;  // previews are read on the one user-interface thread
}

std::unique_ptr<PreviewFile> PreviewFile::open(const wchar_t *path) {
  // Other programs may be writing, renaming or deleting the drawing meanwhile; do not stop them.
  const HANDLE handle = CreateFileW(path, GENERIC_READ, FILE_SHARE_READ | FILE_SHARE_WRITE | FILE_SHARE_DELETE, nullptr,
                                    OPEN_EXISTING, FILE_ATTRIBUTE_NORMAL, nullptr);
  if (handle == INVALID_HANDLE_VALUE) return nullptr;
  LARGE_INTEGER size;
  if (!GetFileSizeEx(handle, &size) || size.QuadPart < 0) {
    CloseHandle(handle);
    return nullptr;
  }
  return std::unique_ptr<PreviewFile>(new PreviewFile(handle, uint64_t(size.QuadPart)));
}

PreviewFile::~PreviewFile() { CloseHandle(m_handle); }

bool PreviewFile::read(uint64_t offset, void *into, size_t count) {
  if (offset > m_size || count > m_size - offset) return false;
  auto *target = static_cast<uint8_t *>(into);
  while (count != 0) {
    OVERLAPPED at = {};
    at.Offset = DWORD(offset);
    at.OffsetHigh = DWORD(offset >> 32);
    const DWORD chunk = DWORD(std::min<size_t>(count, 1u << 30));
    DWORD got = 0;
    if (!ReadFile(m_handle, target, chunk, &got, &at) || got == 0) return false;
    g_bytesRead += got;
    target += got;
    offset += got;
    count -= got;
  }
  return true;
}

uint64_t PreviewFile::totalBytesRead() { return g_bytesRead; }

}  // namespace devhost::preview
