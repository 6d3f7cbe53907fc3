#include "filecmd/DrawingExtension.h"

#include "filecmd/PlainFileName.h"

#include <cctype>

std::size_t NameLengthBeforeExtension(const std::string &fileName) {
  const std::size_t dot = fileName.rfind('.');
  return dot == std::string::npos || dot == 0 ? fileName.size() : dot;
}

std::string KeepingExtension(const std::string &newName, const std::string &oldName) {
  if (CheckPlainFileName(newName) != NameRule::Plain) return newName;
  const std::string extension = oldName.substr(NameLengthBeforeExtension(oldName));
  if (extension.empty() || newName.size() < extension.size()) return newName + extension;
  const std::string tail = newName.substr(newName.size() - extension.size());
  for (std::size_t i = 0; i < extension.size(); ++i)
    if (std::tolower(static_cast<unsigned char>(tail[i])) != std::tolower(static_cast<unsigned char>(extension[i])))
      return newName + extension;
  return newName;
}
