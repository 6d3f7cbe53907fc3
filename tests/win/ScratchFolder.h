// A folder of its own under the temp folder for one test, removed with everything in it.
#pragma once

#include <windows.h>

#include <filesystem>
#include <fstream>
#include <iterator>
#include <string>

class ScratchFolder {
 public:
  explicit ScratchFolder(const char *tag)
      : m_path(std::filesystem::temp_directory_path() / (std::string(tag) + "-" + std::to_string(GetTickCount64()))) {
    std::filesystem::create_directories(m_path);
  }
  ~ScratchFolder() {
    std::error_code ignored;
    std::filesystem::remove_all(m_path, ignored);
  }
  ScratchFolder(const ScratchFolder &) = delete;
  ScratchFolder &operator=(const ScratchFolder &) = delete;

  std::string Path() const { return m_path.string(); }
  // Narrow names are ANSI text, as the module's paths are: kept off std::filesystem's own
  // conversion.
  std::string File(const std::string &name, const char *content = nullptr) const {
    const std::string file = m_path.string() + "\\" + name;
    if (content) std::ofstream(file.c_str(), std::ios::binary) << content;
    return file;
  }

 private:
  std::filesystem::path m_path;
};

inline std::string Content(const std::string &path) {
  std::ifstream in(path.c_str(), std::ios::binary);
  return std::string(std::istreambuf_iterator<char>(in), std::istreambuf_iterator<char>());
}
