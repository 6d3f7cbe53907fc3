#include "explorer/ShellTreeCtrl.h"

#include "catalogue/Ombra3Doc.h"
#include "explorer/MainFrame.h"
#include "explorer/ShellAttributes.h"
#include "explorer/ShellString.h"
#include "fw/Menu.h"
#include "host/HostApi.h"
#include "host/TextConvert.h"
#include "settings/DialogSetLa.h"
#include "thumbs/Ombra3View.h"

#include <shellapi.h>

#include <cstring>

namespace {
constexpr UINT kFolderSettingsCommand = 1;
constexpr size_t kTextCapacity = 260;

HIMAGELIST SystemSmallIcons() {
  const CShellPidl desktop([] {
    LPITEMIDLIST list = nullptr;
    SHGetSpecialFolderLocation(nullptr, CSIDL_DESKTOP, &list);
    return list;
  }());
  SHFILEINFOA info{};
  return reinterpret_cast<HIMAGELIST>(SHGetFileInfoA(reinterpret_cast<LPCSTR>(desktop.Get()), 0, &info, sizeof info,
                                                     SHGFI_PIDL | SHGFI_SYSICONINDEX | SHGFI_SMALLICON));
}

int SystemIconIndex(LPCITEMIDLIST absolute, UINT extra) {
  SHFILEINFOA info{};
  SHGetFileInfoA(reinterpret_cast<LPCSTR>(absolute), 0, &info, sizeof info,
                 SHGFI_PIDL | SHGFI_SYSICONINDEX | SHGFI_SMALLICON | extra);
  return info.iIcon;
}

ULONG Attributes(const ShellItemData &data, ULONG wanted) { return ShellAttributes(data.pParentFolder, data.ChildId(), wanted); }

int CALLBACK CompareItems(LPARAM first, LPARAM second, LPARAM) {
  return CShellTreeCtrl::CompareSiblings(*reinterpret_cast<const ShellItemData *>(first),
                                         *reinterpret_cast<const ShellItemData *>(second));
}

bool FolderPath(const ShellItemData *data, char (&path)[MAX_PATH]) {
  return data && SHGetPathFromIDListA(data->pidl.Get(), path);
}

// Whether two absolute lists name the same object, as the Desktop compares them.
bool SameIds(IShellFolder *desktop, LPCITEMIDLIST first, LPCITEMIDLIST second) {
  const HRESULT hr = desktop ? desktop->CompareIDs(0, first, second) : E_FAIL;
  return SUCCEEDED(hr) && static_cast<short>(HRESULT_CODE(hr)) == 0;
}
}  // namespace

CShellTreeCtrl::~CShellTreeCtrl() {
  // The records go with their items while this object still knows how to free them.
  if (m_hWnd) DestroyWindow();
}

BOOL CShellTreeCtrl::Create(DWORD style, const RECT &rect, fw::CWnd *parent, UINT id) {
  if (!CTreeCtrl::Create(style, rect, parent, id)) return FALSE;
  SetImageList(SystemSmallIcons(), TVSIL_NORMAL);
  return TRUE;
}

void CShellTreeCtrl::InsertRootItem() {
  LPITEMIDLIST desktop = nullptr;
  if (FAILED(SHGetSpecialFolderLocation(m_hWnd, CSIDL_DESKTOP, &desktop)) || !desktop) return;
  const CShellPidl owned(desktop);
  InsertShellItem(TVI_ROOT, m_desktop.Get(), nullptr, owned.Get(), 0);
}

HTREEITEM CShellTreeCtrl::InsertShellItem(HTREEITEM parent, IShellFolder *parentFolder, LPCITEMIDLIST parentPidl,
                                          LPCITEMIDLIST childId, UINT flags) {
  auto *data = new ShellItemData(parentFolder, pidl::Combine(parentPidl, childId), flags);
  char text[kTextCapacity] = "";
  TVINSERTSTRUCTA insert{};
  insert.hParent = parent;
  insert.hInsertAfter = TVI_LAST;
  insert.item.mask = TVIF_TEXT | TVIF_CHILDREN | TVIF_STATE | TVIF_PARAM;
  insert.item.pszText = text;
  insert.item.cchTextMax = kTextCapacity;
  insert.item.lParam = reinterpret_cast<LPARAM>(data);
  FillItemDisplay(insert.item, *data);
  // The shell takes milliseconds to find an item's icon: the tree asks for it when it first
  // draws the item, so a folder of thousands opens at the cost of the few it shows.
  insert.item.mask |= TVIF_IMAGE | TVIF_SELECTEDIMAGE;
  insert.item.iImage = I_IMAGECALLBACK;
  insert.item.iSelectedImage = I_IMAGECALLBACK;
  HTREEITEM item = InsertItem(insert);
  if (!item) delete data;
  return item;
}

void CShellTreeCtrl::FillItemDisplay(TVITEMA &item, const ShellItemData &data) const {
  LPCITEMIDLIST child = data.ChildId();
  if (item.mask & TVIF_TEXT) {
    CShellString name;
    const std::string text = name.GetDisplayNameOf(data.pParentFolder, child, SHGDN_INFOLDER) ? name.ToString() : std::string();
    const size_t length = std::min(text.size(), static_cast<size_t>(item.cchTextMax > 0 ? item.cchTextMax - 1 : 0));
    if (item.pszText && item.cchTextMax > 0) {
      std::memcpy(item.pszText, text.data(), length);
      item.pszText[length] = '\0';
    }
  }
  if (item.mask & TVIF_STATE) {
    const ULONG attributes = Attributes(data, SFGAO_GHOSTED | SFGAO_LINK | SFGAO_SHARE);
    if (attributes & SFGAO_GHOSTED) {
      item.state |= TVIS_CUT;
      item.stateMask |= TVIS_CUT;
    }
    if (attributes & SFGAO_SHARE) {
      item.state |= INDEXTOOVERLAYMASK(1);
      item.stateMask |= TVIS_OVERLAYMASK;
    } else if (attributes & SFGAO_LINK) {
      item.state |= INDEXTOOVERLAYMASK(2);
      item.stateMask |= TVIS_OVERLAYMASK;
    }
  }
  if (item.mask & TVIF_IMAGE) item.iImage = SystemIconIndex(data.pidl.Get(), 0);
  if (item.mask & TVIF_SELECTEDIMAGE) {
    const bool folder = Attributes(data, SFGAO_FOLDER) & SFGAO_FOLDER;
    item.iSelectedImage = SystemIconIndex(data.pidl.Get(), folder ? SHGFI_OPENICON : 0);
  }
  if (item.mask & TVIF_CHILDREN) item.cChildren = ChildrenButton(data.pParentFolder, child, data.nFlags & kListNonFolders);
}

IShellFolder *CShellTreeCtrl::BindFolder(LPCITEMIDLIST absolute) const {
  IShellFolder *folder = nullptr;
  if (pidl::Size(absolute) == 0) {
    folder = m_desktop.Get();
    if (folder) folder->AddRef();
  } else if (m_desktop.Get()) {
    m_desktop.Get()->BindToObject(absolute, nullptr, IID_IShellFolder, reinterpret_cast<void **>(&folder));
  }
  return folder;
}

bool CShellTreeCtrl::FillChildren(HTREEITEM parent, LPCITEMIDLIST parentPidl, UINT flags) {
  IShellFolder *folder = BindFolder(parentPidl);
  if (!folder) return false;

  SHCONTF listing = SHCONTF_FOLDERS;
  if (flags & kListNonFolders) listing |= SHCONTF_NONFOLDERS;
  if (flags & kListHidden) listing |= SHCONTF_INCLUDEHIDDEN;
  IEnumIDList *enumerator = nullptr;
  if (folder->EnumObjects(m_hWnd, listing, &enumerator) == S_OK && enumerator) {
    SetProgress(0, 0);
    LPITEMIDLIST id = nullptr;
    while (enumerator->Next(1, &id, nullptr) == S_OK) {
      const CShellPidl owned(id);
      InsertShellItem(parent, folder, parentPidl, owned.Get(), flags & kInheritedFlags);
      StepProgress(1);
    }
    enumerator->Release();
    if (GetProgress() > 0) {
      TVSORTCB sort{parent, CompareItems, 0};
      SortChildrenCB(sort);
    }
  }
  folder->Release();
  SetProgress(1, 1);
  return true;
}

int CShellTreeCtrl::CompareSiblings(const ShellItemData &first, const ShellItemData &second) {
  if (!first.pParentFolder) return 0;
  const HRESULT hr = first.pParentFolder->CompareIDs(0, first.ChildId(), second.ChildId());
  if (FAILED(hr)) return 0;
  const short order = static_cast<short>(HRESULT_CODE(hr));
  return order < 0 ? -1 : order > 0 ? 1 : 0;
}

bool CShellTreeCtrl::ExpandToFolder(const std::string &folder) {
  IShellFolder *desktop = m_desktop.Get();
  std::wstring name = ToWide(folder.c_str());
  LPITEMIDLIST parsed = nullptr;
  if (!desktop || folder.empty() ||
      FAILED(desktop->ParseDisplayName(m_hWnd, nullptr, name.data(), nullptr, &parsed, nullptr)) || !parsed)
    return false;
  const CShellPidl target(parsed);
  const UINT depth = pidl::Count(target.Get());
  // The root is the Desktop, whose list is empty: every parsed folder lies below it.
  HTREEITEM item = GetRootItem();
  for (UINT level = 0; item && level < depth; ++level) {
    Expand(item, TVE_EXPAND);
    item = ChildToward(item, target.Get(), level);
  }
  if (!item) return false;
  Expand(item, TVE_EXPAND);
  m_hStartItem = item;
  return true;
}

// The child of `item` (whose list has `level` items) on the way to `target`: the listed child
// with the same ids as the target's first level + 1 items, or else that item of the target
// added as a child, as a folder the tree does not list (a hidden one) is.
HTREEITEM CShellTreeCtrl::ChildToward(HTREEITEM item, LPCITEMIDLIST target, UINT level) {
  const auto *parent = reinterpret_cast<const ShellItemData *>(GetItemData(item));
  const CShellPidl way(pidl::Head(target, level + 1));
  if (!parent || !way.Get()) return nullptr;
  for (HTREEITEM child = GetChildItem(item); child; child = GetNextSiblingItem(child)) {
    const auto *data = reinterpret_cast<const ShellItemData *>(GetItemData(child));
    if (data && SameIds(m_desktop.Get(), data->pidl.Get(), way.Get())) return child;
  }
  IShellFolder *folder = BindFolder(parent->pidl.Get());
  if (!folder) return nullptr;
  const CShellPidl id(pidl::Head(pidl::At(target, level), 1));
  HTREEITEM added = id.Get() ? InsertShellItem(item, folder, parent->pidl.Get(), id.Get(), parent->nFlags & kInheritedFlags) : nullptr;
  folder->Release();
  return added;
}

bool CShellTreeCtrl::FillItemChildren(HTREEITEM item) {
  const auto *data = item == TVI_ROOT ? nullptr : reinterpret_cast<const ShellItemData *>(GetItemData(item));
  if (!data) return true;
  if (!FillChildren(item, data->pidl.Get(), data->nFlags)) return true;
  char path[MAX_PATH] = "";
  if (!FolderPath(data, path)) return true;
  path[3] = '\0';  // the drive root, such as C:\ .
  return GetDriveTypeA(path) == DRIVE_FIXED;
}

BOOL CShellTreeCtrl::OnChildNotify(UINT message, WPARAM wParam, LPARAM lParam, LRESULT *result) {
  if (message == WM_NOTIFY) {
    const auto *header = reinterpret_cast<const NMHDR *>(lParam);
    const auto *tree = reinterpret_cast<const NMTREEVIEWA *>(lParam);
    switch (header->code) {
      case TVN_GETDISPINFOA:
      case TVN_GETDISPINFOW: OnGetDispInfo(reinterpret_cast<NMTVDISPINFOA *>(lParam)->item); break;
      case TVN_SELCHANGEDA:
      case TVN_SELCHANGEDW: OnSelChanged(tree->itemNew.hItem); break;
      case NM_RCLICK:
        ShowFolderSettingsMenu();
        *result = 1;  // handled: the tree sends no context menu message after it
        return TRUE;
      case TVN_DELETEITEMA:
      case TVN_DELETEITEMW: delete reinterpret_cast<ShellItemData *>(tree->itemOld.lParam); break;
      case TVN_SELCHANGINGA:
      case TVN_SELCHANGINGW:
        // Given the focus with nothing selected, the tree selects its first item by itself: no
        // folder is scanned until the person, or the start path, chooses one.
        *result = tree->action == TVC_UNKNOWN && !tree->itemOld.hItem && tree->itemNew.hItem != GetStartItem();
        // The highlight marks the folder shown even when the tree has no focus. It moves now:
        // Wine's tree ignores a highlight asked for the item once it is selected.
        if (!*result) Select(tree->itemNew.hItem, TVGN_DROPHILITE);
        return TRUE;
      case TVN_KEYDOWN:
      case NM_SETFOCUS:
      case NM_KILLFOCUS: break;
      default: return CWaitingTreeCtrl::OnChildNotify(message, wParam, lParam, result);
    }
    *result = 0;
    return TRUE;
  }
  return CWaitingTreeCtrl::OnChildNotify(message, wParam, lParam, result);
}

void CShellTreeCtrl::OnGetDispInfo(TVITEMA &item) const {
  const auto *data = reinterpret_cast<const ShellItemData *>(item.lParam);
  item.mask &= TVIF_IMAGE | TVIF_SELECTEDIMAGE;
  // Only the selected item shows its selected picture: the others leave it to be asked for when
  // they are selected, which halves the shell's icon lookups (milliseconds each) on a first paint.
  if (!(item.state & TVIS_SELECTED) && (item.mask & TVIF_SELECTEDIMAGE)) {
    item.mask &= ~TVIF_SELECTEDIMAGE;
    item.iSelectedImage = I_IMAGECALLBACK;
  }
  if (!data || !item.mask) return;
  FillItemDisplay(item, *data);
  item.mask |= TVIF_DI_SETITEM;  // found once, kept by the tree
}

void CShellTreeCtrl::OnSelChanged(HTREEITEM item) {
  if (g_pMainFrame) g_pMainFrame->EnableAccept(false);
  LoadFolder(item, ".dwg");
  if (g_pThumbView) g_pThumbView->ReloadFolder();
  SetFocus();
}

LRESULT CShellTreeCtrl::WindowProc(UINT message, WPARAM wParam, LPARAM lParam) {
  if (message == WM_RBUTTONDOWN) m_ptRightClick = POINT{static_cast<short>(LOWORD(lParam)), static_cast<short>(HIWORD(lParam))};
  // From the keyboard (the context-menu key, Shift+F10) the menu is for the row with the caret.
  const bool fromKeyboard = message == WM_CONTEXTMENU && LOWORD(lParam) == 0xFFFF && HIWORD(lParam) == 0xFFFF;
  const bool shiftF10 = message == WM_SYSKEYDOWN && wParam == VK_F10 && GetKeyState(VK_SHIFT) < 0;
  if (fromKeyboard || shiftF10) {
    RunFolderSettingsMenu(GetSelectedItem());
    return 0;
  }
  return CWaitingTreeCtrl::WindowProc(message, wParam, lParam);
}

void CShellTreeCtrl::ShowFolderSettingsMenu() {
  // The menu is for the row where the right button went down, wherever on the row: its indent,
  // its button, its picture, its text or right of it. The drop highlight cannot tell: some tree
  // controls leave it where it was during a right click, and it stays on the folder shown, as
  // Wine's tree would not give it back to that folder.
  constexpr UINT kOnRow = TVHT_ONITEM | TVHT_ONITEMINDENT | TVHT_ONITEMBUTTON | TVHT_ONITEMRIGHT;
  TVHITTESTINFO hit{};
  hit.pt = m_ptRightClick;
  const HTREEITEM clicked = HitTest(&hit);
  if (clicked && (hit.flags & kOnRow)) RunFolderSettingsMenu(clicked);
}

void CShellTreeCtrl::RunFolderSettingsMenu(HTREEITEM item) {
  char path[MAX_PATH] = "";
  if (!item || !FolderPath(reinterpret_cast<const ShellItemData *>(GetItemData(item)), path)) return;
  RECT text{};
  GetItemRect(item, &text, TRUE);
  POINT corner{text.right, text.bottom};
  ClientToScreen(m_hWnd, &corner);
  fw::CMenu menu;
  if (!menu.CreatePopupMenu() || !menu.AppendMenu(MF_STRING, kFolderSettingsCommand, "&Folder settings")) return;
  const UINT chosen = menu.TrackPopupMenu(TPM_RETURNCMD | TPM_RIGHTBUTTON | TPM_NONOTIFY, corner.x, corner.y, m_hWnd);
  if (chosen == kFolderSettingsCommand) {
    CDialogSetLa dialog(this);
    if (dialog.SetFolder(path))
      dialog.DoModal();
    else
      acedAlert(L"The folder's path is too long for its settings file");
    SetFocus();
  }
}
