#include "thumbs/CurrentFolder.h"

#include "filecmd/MarkedPaths.h"

#include <windows.h>

std::string CurrentDirectory() {
  const DWORD length = GetCurrentDirectoryA(0, nullptr);
  if (length == 0) return std::string();
  std::string directory(length, '\0');
  const DWORD written = GetCurrentDirectoryA(length, directory.data());
  directory.resize(written < length ? written : 0);
  return directory;
}

std::string PathInCurrentDirectory(const std::string &name) { return FolderWithSeparator(CurrentDirectory()) + name; }
