// Any file loads without harm, and what the store saves loads back to the same content:
// sections and entries, their order, and the bytes of every name and value. The bytes are read
// through a stream over memory, as Load reads its file, so that no input waits for a disk.
#include "settings/IniFile.h"

#include <cstdint>
#include <cstdio>
#include <memory>
#include <string>

namespace {
struct FileCloser {
  void operator()(std::FILE *file) const { std::fclose(file); }
};

// Loads `size` bytes at `data` into the store over what it holds.
void LoadBytes(CIniFile &ini, const void *data, std::size_t size) {
  // A stream over no bytes cannot be opened: an empty file has nothing to load anyway.
  if (size == 0) return;
  const std::unique_ptr<std::FILE, FileCloser> file(fmemopen(const_cast<void *>(data), size, "rb"));
  if (!file) __builtin_trap();
  ini.LoadFrom(file.get());
}

bool SameContent(const CIniFile &a, const CIniFile &b) {
  if (a.m_names != b.m_names || a.m_keys.size() != b.m_keys.size()) return false;
  for (std::size_t i = 0; i < a.m_keys.size(); ++i) {
    if (a.m_keys[i].names != b.m_keys[i].names || a.m_keys[i].values != b.m_keys[i].values) return false;
  }
  return true;
}

bool WellFormed(const CIniFile &ini) {
  if (ini.m_names.size() != ini.m_keys.size()) return false;
  for (const CIniFile::key &section : ini.m_keys) {
    // Loading creates a section only for an entry, so none is empty.
    if (section.names.empty() || section.names.size() != section.values.size()) return false;
  }
  return true;
}

void Check(bool holds) {
  if (!holds) __builtin_trap();
}
}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t *data, std::size_t size) {
  CIniFile loaded;
  LoadBytes(loaded, data, size);
  Check(WellFormed(loaded));

  CIniFile loadedTwice = loaded;
  LoadBytes(loadedTwice, data, size);
  Check(SameContent(loaded, loadedTwice));

  const std::string saved = loaded.Serialize();
  CIniFile reloaded;
  LoadBytes(reloaded, saved.data(), saved.size());
  Check(SameContent(loaded, reloaded));
  Check(reloaded.Serialize() == saved);
  return 0;
}
