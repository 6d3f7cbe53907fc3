// A folder of its own under the Windows temp folder for one test, removed with everything in it.
#pragma once

#include <windows.h>

#include <filesystem>
#include <string>

class TestFolder {
 public:
  explicit TestFolder(const std::string &name) {
    char temp[MAX_PATH] = "";
    GetTempPathA(MAX_PATH, temp);
    m_path = std::string(temp) + "lumvex-" + name + "-" + std::to_string(GetCurrentProcessId());
    Remove();
    CreateDirectoryA(m_path.c_str(), nullptr);
  }
  ~TestFolder() {
    // A folder that is the current directory cannot be removed on Windows.
    SetCurrentDirectoryA("C:\\");
    Remove();
  }
  TestFolder(const TestFolder &) = delete;
  TestFolder &operator=(const TestFolder &) = delete;

  const std::string &Path() const { return m_path; }
  std::string operator/(const std::string &name) const { return m_path + "\\" + name; }

  void AddFolder(const std::string &name) const { CreateDirectoryA((*this / name).c_str(), nullptr); }

  // A file of `size` bytes last written at `unixSeconds`.
  void AddFile(const std::string &name, DWORD size = 0, long long unixSeconds = 1500000000) const {
    const HANDLE file =
        CreateFileA((*this / name).c_str(), GENERIC_WRITE, 0, nullptr, CREATE_ALWAYS, FILE_ATTRIBUTE_NORMAL, nullptr);
    if (file == INVALID_HANDLE_VALUE) return;
    const std::string content(size, 'x');
    DWORD written = 0;
    WriteFile(file, content.data(), size, &written, nullptr);
    const unsigned long long ticks = (static_cast<unsigned long long>(unixSeconds) + 11644473600ull) * 10000000ull;
    FILETIME time;
    time.dwLowDateTime = static_cast<DWORD>(ticks);
    time.dwHighDateTime = static_cast<DWORD>(ticks >> 32);
    SetFileTime(file, nullptr, nullptr, &time);
    CloseHandle(file);
  }

 private:
  void Remove() const {
    std::error_code ignored;
    std::filesystem::remove_all(m_path, ignored);
  }

  std::string m_path;
};
