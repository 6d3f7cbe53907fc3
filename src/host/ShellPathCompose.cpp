#include "host/ShellPathCompose.h"

std::string ComposeStartShellPath(const ShellFolderNames &names, const std::string &driveDisplayName,
                                  const std::string &directory) {
  std::string path = names.desktop + "\\";
  if (!driveDisplayName.empty())
    path += names.drives + "\\" + driveDisplayName;
  else
    path += names.network;
  return path + directory;
}
