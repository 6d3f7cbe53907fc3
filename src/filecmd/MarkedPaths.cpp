#include "filecmd/MarkedPaths.h"

std::string FolderWithSeparator(std::string folder) {
  if (folder.empty() || folder.back() != '\\') folder.push_back('\\');
  return folder;
}

std::vector<std::string> MarkedPaths(const DwgCatalogue &catalogue, const std::string &folder) {
  const std::string prefix = FolderWithSeparator(folder);
  std::vector<std::string> paths;
  for (int i = 0; i < catalogue.GetSize(); ++i) {
    if (catalogue[i].IsSelected()) paths.push_back(prefix + catalogue[i].m_strDwgName);
  }
  return paths;
}
