#include "filecmd/DwgPath.h"

namespace {
std::string ExtensionOf(const std::string &path) {
  const size_t driveEnd = path.size() >= 2 && path[1] == ':' ? 2 : 0;
  const size_t lastSeparator = path.find_last_of("\\/");
  const size_t nameStart = lastSeparator == std::string::npos || lastSeparator < driveEnd ? driveEnd : lastSeparator + 1;
  const size_t dot = path.rfind('.');
  return dot == std::string::npos || dot < nameStart ? std::string() : path.substr(dot);
}

char LowerAscii(char c) { return c >= 'A' && c <= 'Z' ? static_cast<char>(c - 'A' + 'a') : c; }
}  // namespace

bool IsDwgPath(const std::string &path) {
  const std::string extension = ExtensionOf(path);
  static const std::string dwg = ".dwg";
  if (extension.size() != dwg.size()) return false;
  for (size_t i = 0; i < dwg.size(); ++i) {
    if (LowerAscii(extension[i]) != dwg[i]) return false;
  }
  return true;
}
