#include "host/ShellPathCompose.h"

FolderPathParts SplitFolderPath(const std::string &path) {
  FolderPathParts parts;
  std::string rest = path;
  if (rest.size() >= 2 && rest[1] == ':') {
    parts.drive = rest.substr(0, 2);
    rest.erase(0, 2);
  }
  const size_t lastSeparator = rest.find_last_of("\\/");
  if (lastSeparator != std::string::npos) parts.directory = rest.substr(0, lastSeparator + 1);
  return parts;
}

std::string FileBaseName(const std::string &path) {
  const size_t lastSeparator = path.find_last_of("\\/:");
  std::string name = lastSeparator == std::string::npos ? path : path.substr(lastSeparator + 1);
  const size_t dot = name.find_last_of('.');
  if (dot != std::string::npos) name.erase(dot);
  return name;
}

std::string ComposeStartShellPath(const ShellFolderNames &names, const std::string &driveDisplayName,
                                  const std::string &directory) {
  std::string path = names.desktop + "\\";
  if (!driveDisplayName.empty())
    path += names.drives + "\\" + driveDisplayName;
  else
    path += names.network;
  return path + directory;
}
