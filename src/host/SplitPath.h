// Splitting a path into drive, folder, base name and extension, as the C run time's
// _splitpath does, without its fixed-size buffers.
#pragma once

#include <string>

struct PathParts {
  std::string drive;      // "C:" or empty
  std::string directory;  // up to and including the last "\" or "/"
  std::string baseName;   // the file name up to its last "."
  std::string extension;  // from the last "." on, or empty
};

PathParts SplitPath(const std::string &path);
