// Where the explorer state file lies: beside the module, named after it, extension "ini".
#pragma once

#include <string>

struct PathParts {
  std::string drive;      // "C:" or empty
  std::string directory;  // up to and including the last "\" or "/"
  std::string baseName;   // the file name up to its last "."
  std::string extension;  // from the last "." on, or empty
};

// Splits a path as _splitpath does.
PathParts SplitPath(const std::string &path);

// Lumvex1.arx -> Lumvex1.ini in the same folder.
std::string ComposeStateFilePath(const std::string &modulePath);
