// Any file loads without harm, and what the store saves loads back to the same content:
// sections and entries, their order, and the bytes of every name and value.
#include "settings/IniFile.h"

#include <unistd.h>

#include <cstdint>
#include <cstdio>
#include <filesystem>
#include <fstream>
#include <iterator>
#include <string>
#include <system_error>

namespace {
// Files of this process, removed when the fuzzer exits.
struct ScratchFiles {
  ScratchFiles() {
    // Every save waits for the disk; a memory-backed folder keeps each run cheap.
    std::error_code error;
    const std::filesystem::path folder = std::filesystem::is_directory("/dev/shm", error)
                                             ? std::filesystem::path("/dev/shm")
                                             : std::filesystem::temp_directory_path();
    const std::string stem = (folder / ("IniLoadFuzz-" + std::to_string(::getpid()) + "-")).string();
    input = stem + "input.ini";
    saved = stem + "saved.ini";
    resaved = stem + "resaved.ini";
  }
  ~ScratchFiles() {
    std::remove(input.c_str());
    std::remove(saved.c_str());
    std::remove(resaved.c_str());
  }
  std::string input;
  std::string saved;
  std::string resaved;
};

std::string ReadAll(const std::string &path) {
  std::ifstream in(path, std::ios::binary);
  return std::string(std::istreambuf_iterator<char>(in), std::istreambuf_iterator<char>());
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
  static const ScratchFiles files;
  {
    std::ofstream out(files.input, std::ios::binary | std::ios::trunc);
    out.write(reinterpret_cast<const char *>(data), static_cast<std::streamsize>(size));
  }

  CIniFile loaded;
  loaded.SetFilePath(files.input);
  Check(loaded.Load());
  Check(WellFormed(loaded));

  CIniFile loadedTwice = loaded;
  Check(loadedTwice.Load());
  Check(SameContent(loaded, loadedTwice));

  loaded.SetFilePath(files.saved);
  loaded.Save();
  CIniFile reloaded;
  reloaded.SetFilePath(files.saved);
  Check(reloaded.Load());
  Check(SameContent(loaded, reloaded));

  reloaded.SetFilePath(files.resaved);
  reloaded.Save();
  Check(ReadAll(files.saved) == ReadAll(files.resaved));
  return 0;
}
