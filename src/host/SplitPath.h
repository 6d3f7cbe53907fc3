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

// Steps from a character of narrow text to the next one. Null steps one byte, which is right
// for single-byte code pages; a double-byte one needs the system's step, or the second byte
// of a character can be taken for a "\".
using CharacterStep = const char *(*)(const char *);

PathParts SplitPath(const std::string &path, CharacterStep next = nullptr);
