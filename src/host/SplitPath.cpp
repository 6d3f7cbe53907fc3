#include "host/SplitPath.h"

PathParts SplitPath(const std::string &path) {
  PathParts parts;
  std::string::size_type start = 0;
  if (path.size() >= 2 && path[1] == ':') {
    parts.drive = path.substr(0, 2);
    start = 2;
  }
  const std::string::size_type lastSeparator = path.find_last_of("\\/");
  std::string::size_type nameStart = start;
  if (lastSeparator != std::string::npos && lastSeparator >= start) {
    parts.directory = path.substr(start, lastSeparator + 1 - start);
    nameStart = lastSeparator + 1;
  }
  const std::string::size_type dot = path.find_last_of('.');
  if (dot != std::string::npos && dot >= nameStart) {
    parts.baseName = path.substr(nameStart, dot - nameStart);
    parts.extension = path.substr(dot);
  } else {
    parts.baseName = path.substr(nameStart);
  }
  return parts;
}
