// A file-list block from the clipboard is written by any program: reading it must stay inside
// the block whatever its header says.
#include "filecmd/FileListBlock.h"

#include <cstddef>
#include <cstdint>
#include <string>
#include <vector>

extern "C" int LLVMFuzzerTestOneInput(const uint8_t *data, size_t size) {
  // An exact-size copy lets the sanitizer catch any read past the block.
  const std::vector<uint8_t> block(data, data + size);
  FileListReader reader(block.data(), block.size());
  size_t total = 0;
  if (reader.IsWide()) {
    std::u16string path;
    while (reader.NextWide(path)) {
      if (path.empty()) __builtin_trap();
      total += path.size() * 2 + 2;
    }
  } else {
    std::string path;
    while (reader.NextNarrow(path)) {
      if (path.empty()) __builtin_trap();
      total += path.size() + 1;
    }
  }
  if (total > size) __builtin_trap();
  return 0;
}
