// The tree's side of navigation: item paths, the folder scan of an item, the walk along a path.
#include "catalogue/FolderScan.h"
#include "catalogue/Ombra3Doc.h"
#include "explorer/ShellItemData.h"
#include "explorer/WaitingTreeCtrl.h"
#include "thumbs/Ombra3View.h"

#include <vector>

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

namespace {
// The components of a path of display names, split at "\" characters: stepping by characters,
// not bytes, so that the second byte of a double-byte character is never taken for one.
std::vector<std::string> PathComponents(const std::string &path) {
  std::vector<std::string> components;
  const char *start = path.c_str();
  for (const char *at = start;; at = CharNextA(at)) {
    if (*at != '\\' && *at != '\0') continue;
    components.emplace_back(start, at);
    if (*at == '\0') break;
    start = at + 1;
  }
  return components;
}

// Labels are equal as the system compares them without regard to case, in any language.
bool SameLabel(const std::string &first, const std::string &second) {
  return CompareStringA(LOCALE_USER_DEFAULT, NORM_IGNORECASE, first.c_str(), -1, second.c_str(), -1) == CSTR_EQUAL;
}
}  // namespace

void CWaitingTreeCtrl::ExpandToPath(const std::string &path) {
  HTREEITEM matched = nullptr;
  for (const std::string &component : PathComponents(path)) {
    if (component.empty()) break;  // an empty component ends the walk
    HTREEITEM found = nullptr;
    for (HTREEITEM child = matched ? GetChildItem(matched) : GetRootItem(); child && !found; child = GetNextSiblingItem(child))
      if (SameLabel(GetItemText(child), component)) found = child;
    if (!found) return;
    Expand(found, TVE_EXPAND);
    matched = found;
  }
  m_hStartItem = matched;
}
