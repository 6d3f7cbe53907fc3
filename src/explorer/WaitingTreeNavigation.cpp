// The tree's side of navigation: item paths, the folder scan of an item, the walk along a path.
#include "catalogue/FolderScan.h"
#include "catalogue/Ombra3Doc.h"
#include "explorer/ShellItemData.h"
#include "explorer/WaitingTreeCtrl.h"
#include "thumbs/Ombra3View.h"

#include <cstring>

std::string CWaitingTreeCtrl::GetItemPath(HTREEITEM item) const {
  std::string path = GetItemText(item);
  for (HTREEITEM parent = GetParentItem(item); parent; parent = GetParentItem(parent)) path = GetItemText(parent) + "\\" + path;
  return path;
}

bool CWaitingTreeCtrl::LoadFolder(HTREEITEM item, const char *extension) {
  if (g_pDoc) g_pDoc->m_strShellPath = GetItemPath(item);
  EmptyCatalogue();
  const auto *data = reinterpret_cast<const ShellItemData *>(GetItemData(item));
  if (!data) return false;
  char path[MAX_PATH] = "";
  if (!SHGetPathFromIDListA(data->pidl.Get(), path)) return false;
  return ScanFolder(path, extension);
}

void CWaitingTreeCtrl::RefreshSelectedFolder() {
  LoadFolder(GetSelectedItem(), ".dwg");
  if (g_pThumbView) g_pThumbView->ReloadFolder();
}

void CWaitingTreeCtrl::ExpandToPath(const std::string &path) {
  HTREEITEM matched = nullptr;
  size_t start = 0;
  while (start < path.size()) {
    size_t end = path.find('\\', start);
    if (end == std::string::npos) end = path.size();
    if (end == start) break;  // an empty component ends the walk
    const std::string component = path.substr(start, end - start);
    HTREEITEM found = nullptr;
    for (HTREEITEM child = matched ? GetChildItem(matched) : GetRootItem(); child && !found; child = GetNextSiblingItem(child))
      if (_stricmp(GetItemText(child).c_str(), component.c_str()) == 0) found = child;
    if (!found) return;
    Expand(found, TVE_EXPAND);
    matched = found;
    start = end + 1;
  }
  m_hStartItem = matched;
}
