// A drawing file opened for reading its preview: seek-and-read through the Win32 file API.
#pragma once

#include "preview/PreviewSource.h"

#include <windows.h>

#include <cstdint>
#include <memory>

namespace devhost::preview {

class PreviewFile final : public PreviewSource {
 public:
  // Null when the file cannot be opened.
  static std::unique_ptr<PreviewFile> open(const wchar_t *path);
  ~PreviewFile() override;
  PreviewFile(const PreviewFile &) = delete;
  PreviewFile &operator=(const PreviewFile &) = delete;

  uint64_t size() const override { return m_size; }
  bool read(uint64_t offset, void *into, size_t count) override;

  // Every byte read from any drawing since the process started: what a preview costs in I/O.
  static uint64_t totalBytesRead();

 private:
  PreviewFile(HANDLE handle, uint64_t size) : m_handle(handle), m_size(size) {}
  HANDLE m_handle;
  uint64_t m_size;
};

}  // namespace devhost::preview
