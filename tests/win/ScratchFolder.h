// A folder of its own under the temp folder for one test, removed with everything in it; and
// the trash the shell moves deleted files to.
#pragma once

#include <windows.h>

#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <iterator>
#include <string>

class ScratchFolder {
 public:
  explicit ScratchFolder(const char *tag)
      : m_path((std::filesystem::temp_directory_path() /
                (std::string("lumvex-") + tag + "-" + std::to_string(GetCurrentProcessId()) + "-" +
                 std::to_string(GetTickCount64())))
                   .string()) {
    std::filesystem::create_directories(m_path);
  }
  ~ScratchFolder() {
    // A folder scan makes the folder current, and the current folder cannot be removed.
    char current[MAX_PATH] = "";
    GetCurrentDirectoryA(MAX_PATH, current);
    if (m_path == current) SetCurrentDirectoryA("C:\\");
    std::error_code ignored;
    std::filesystem::remove_all(m_path, ignored);
  }
  ScratchFolder(const ScratchFolder &) = delete;
  ScratchFolder &operator=(const ScratchFolder &) = delete;

  const std::string &Path() const { return m_path; }
  // The path of a file in the folder, written first when there is content. Narrow names are
  // ANSI text, as the module's paths are: kept off std::filesystem's own conversion.
  std::string File(const std::string &name, const char *content = nullptr) const {
    const std::string file = m_path + "\\" + name;
    if (content) std::ofstream(file.c_str(), std::ios::binary) << content;
    return file;
  }

 private:
  std::string m_path;
};

inline std::string Content(const std::string &path) {
  std::ifstream in(path.c_str(), std::ios::binary);
  return std::string(std::istreambuf_iterator<char>(in), std::istreambuf_iterator<char>());
}

// The XDG trash the shell moves deleted files to, seen through drive Z:.
inline std::filesystem::path TrashFiles() {
  std::string data;
  if (const char *xdg = std::getenv("XDG_DATA_HOME"); xdg && *xdg) {
    data = std::string("Z:") + xdg;
  } else {
    std::string home = std::getenv("WINEHOMEDIR") ? std::getenv("WINEHOMEDIR") : "";
    if (home.rfind("\\??\\", 0) == 0) home.erase(0, 4);
    data = home + "\\.local\\share";
  }
  for (char &c : data) c = c == '/' ? '\\' : c;
  return std::filesystem::path(data) / "Trash" / "files";
}

inline void RemoveFromTrash(const std::string &name) {
  std::error_code ignored;
  std::filesystem::remove(TrashFiles() / name, ignored);
  std::filesystem::remove(TrashFiles().parent_path() / "info" / (name + ".trashinfo"), ignored);
}
