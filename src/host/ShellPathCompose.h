// Composing the shell's display path of a start folder: the labels the folder tree shows from
// its root down to the folder, joined by "\".
#pragma once

#include <string>

struct ShellFolderNames {
  std::string desktop;
  std::string drives;
  std::string network;
};

// driveDisplayName is the shell's name of the drive's root, empty for a path without a drive.
std::string ComposeStartShellPath(const ShellFolderNames &names, const std::string &driveDisplayName,
                                  const std::string &directory);
