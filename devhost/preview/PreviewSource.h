// Where preview bytes come from: a file on disk in the host, a buffer in tests and fuzzing.
// Everything reads through seek-and-read so that a preview costs its header and its picture,
// never the whole drawing.
#pragma once

#include <cstddef>
#include <cstdint>
#include <cstring>

namespace devhost::preview {

class PreviewSource {
 public:
  virtual ~PreviewSource() = default;
  virtual uint64_t size() const = 0;
  // Reads exactly count bytes at offset; false when the range is not all there.
  virtual bool read(uint64_t offset, void *into, size_t count) = 0;
};

class MemorySource final : public PreviewSource {
 public:
  MemorySource(const uint8_t *data, size_t size) : m_data(data), m_size(size) {}
  uint64_t size() const override { return m_size; }
  bool read(uint64_t offset, void *into, size_t count) override {
    if (offset > m_size || count > m_size - offset) return false;
    if (count != 0) std::memcpy(into, m_data + offset, count);
    return true;
  }

 private:
  const uint8_t *m_data;
  size_t m_size;
};

}  // namespace devhost::preview
