#include "host/StartShellPath.h"

#include "host/HostApi.h"
#include "host/ShellPathCompose.h"
#include "host/SplitPath.h"
#include "host/TextConvert.h"

#include <windows.h>
#include <shellapi.h>
#include <shlobj.h>
#include <shlwapi.h>

#include <algorithm>
#include <cstring>
#include <memory>

namespace {
constexpr size_t kMaxDisplayName = 259;

struct ItemIdListFree {
  void operator()(ITEMIDLIST *list) const { CoTaskMemFree(list); }
};
using ItemIdList = std::unique_ptr<ITEMIDLIST, ItemIdListFree>;

struct ShellFolderRelease {
  void operator()(IShellFolder *folder) const { folder->Release(); }
};

std::string Cut(std::string name) {
  if (name.size() > kMaxDisplayName) name.resize(kMaxDisplayName);
  return name;
}

std::string SpecialFolderName(HWND owner, IShellFolder *desktop, int csidl) {
  ITEMIDLIST *raw = nullptr;
  if (FAILED(SHGetSpecialFolderLocation(owner, csidl, &raw)) || !raw) return std::string();
  ItemIdList list(raw);
  STRRET name{};
  if (FAILED(desktop->GetDisplayNameOf(list.get(), SHGDN_NORMAL, &name))) return std::string();
  wchar_t text[MAX_PATH] = L"";
  if (FAILED(StrRetToBufW(&name, list.get(), text, MAX_PATH))) return std::string();
  return Cut(ToAnsi(text));
}

std::string DriveRootDisplayName(const std::string &drive) {
  char root[MAX_PATH] = "";
  CopyAnsiCut(drive, root, sizeof root - 1);
  PathAddBackslashA(root);
  SHFILEINFOA info;
  std::memset(&info, 0, sizeof info);
  if (!SHGetFileInfoA(root, 0, &info, sizeof info, SHGFI_DISPLAYNAME)) return std::string();
  return Cut(info.szDisplayName);
}
}  // namespace

void MakeStartShellPath(const char *folder, char *out, size_t capacity) {
  if (!out || capacity == 0) return;
  out[0] = '\0';
  CWinAppHost *hostApp = acedGetAcadWinApp();
  HWND owner = hostApp ? static_cast<HWND>(hostApp->mainWindow()) : nullptr;

  IShellFolder *rawDesktop = nullptr;
  if (FAILED(SHGetDesktopFolder(&rawDesktop)) || !rawDesktop) return;
  std::unique_ptr<IShellFolder, ShellFolderRelease> desktop(rawDesktop);

  ShellFolderNames names;
  names.desktop = SpecialFolderName(owner, desktop.get(), CSIDL_DESKTOP);
  names.drives = SpecialFolderName(owner, desktop.get(), CSIDL_DRIVES);
  names.network = SpecialFolderName(owner, desktop.get(), CSIDL_NETWORK);

  // LISP programs write paths with "/": the tree's labels are joined by "\".
  std::string path = folder ? folder : "";
  std::replace(path.begin(), path.end(), '/', '\\');
  const PathParts parts = SplitAnsiPath(path);
  const std::string driveName = parts.drive.empty() ? std::string() : DriveRootDisplayName(parts.drive);
  const std::string shellPath = ComposeStartShellPath(names, driveName, parts.directory);
  if (shellPath.size() < capacity) shellPath.copy(out, shellPath.size()), out[shellPath.size()] = '\0';
}
