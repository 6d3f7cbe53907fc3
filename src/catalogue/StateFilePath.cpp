#include "catalogue/StateFilePath.h"

#include "host/SplitPath.h"

std::string ComposeStateFilePath(const std::string &modulePath) {
  const PathParts parts = SplitPath(modulePath);
  return parts.drive + parts.directory + parts.baseName + ".ini";
}
