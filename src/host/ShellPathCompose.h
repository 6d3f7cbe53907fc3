// Composing the shell's display path of a start folder: the labels the folder tree shows from
// its root down to the folder, joined by "\".
#pragma once

#include <string>

struct FolderPathParts {
  std::string drive;      // "C:" or empty
  std::string directory;  // everything after the drive up to and including the last separator
};

// Splits as _splitpath does; the file name and extension are dropped.
FolderPathParts SplitFolderPath(const std::string &path);

// The file name without folder and extension, as _splitpath gives it ("plan" of "plan.dwg").
std::string FileBaseName(const std::string &path);

struct ShellFolderNames {
  std::string desktop;
  std::string drives;
  std::string network;
};

// driveDisplayName is the shell's name of the drive's root, empty for a path without a drive.
std::string ComposeStartShellPath(const ShellFolderNames &names, const std::string &driveDisplayName,
                                  const std::string &directory);
