#include "host/SplitPath.h"

namespace {
std::string::size_type NextIndex(const std::string &path, std::string::size_type index, CharacterStep next) {
  if (!next) return index + 1;
  const char *at = path.c_str() + index;
  const std::string::size_type step = static_cast<std::string::size_type>(next(at) - at);
  return index + (step ? step : 1);
}
}  // namespace

PathParts SplitPath(const std::string &path, CharacterStep next) {
  PathParts parts;
  std::string::size_type start = 0;
  if (path.size() >= 2 && path[1] == ':') {
    parts.drive = path.substr(0, 2);
    start = 2;
  }
  std::string::size_type lastSeparator = std::string::npos;
  std::string::size_type lastDot = std::string::npos;
  for (std::string::size_type i = 0; i < path.size(); i = NextIndex(path, i, next)) {
    if (path[i] == '\\' || path[i] == '/') lastSeparator = i;
    if (path[i] == '.') lastDot = i;
  }
  std::string::size_type nameStart = start;
  if (lastSeparator != std::string::npos && lastSeparator >= start) {
    parts.directory = path.substr(start, lastSeparator + 1 - start);
    nameStart = lastSeparator + 1;
  }
  if (lastDot != std::string::npos && lastDot >= nameStart) {
    parts.baseName = path.substr(nameStart, lastDot - nameStart);
    parts.extension = path.substr(lastDot);
  } else {
    parts.baseName = path.substr(nameStart);
  }
  return parts;
}
