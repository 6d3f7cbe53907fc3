#include "filecmd/DwgPath.h"

#include "host/SplitPath.h"

namespace {
char LowerAscii(char c) { return c >= 'A' && c <= 'Z' ? static_cast<char>(c - 'A' + 'a') : c; }
}  // namespace

bool IsDwgPath(const std::string &path) {
  const std::string extension = SplitPath(path).extension;
  static const std::string dwg = ".dwg";
  if (extension.size() != dwg.size()) return false;
  for (size_t i = 0; i < dwg.size(); ++i) {
    if (LowerAscii(extension[i]) != dwg[i]) return false;
  }
  return true;
}
