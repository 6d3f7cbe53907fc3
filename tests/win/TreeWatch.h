// What a watcher of a browse call reads from the folder tree and does to it, from its own
// thread, as a person would.
#pragma once

#include "ExplorerHarness.h"

#include <cstring>
#include <string>
#include <vector>

inline HWND FindTree(HWND frame) {
  HWND tree = nullptr;
  EnumChildWindows(
      frame,
      [](HWND child, LPARAM found) {
        char name[32] = "";
        GetClassNameA(child, name, sizeof name);
        if (std::string(name) != WC_TREEVIEWA) return TRUE;
        *reinterpret_cast<HWND *>(found) = child;
        return FALSE;
      },
      reinterpret_cast<LPARAM>(&tree));
  return tree;
}

inline HTREEITEM TreeNext(HWND tree, HTREEITEM item, UINT code) {
  return reinterpret_cast<HTREEITEM>(SendMessageA(tree, TVM_GETNEXTITEM, code, reinterpret_cast<LPARAM>(item)));
}

inline std::string ItemText(HWND tree, HTREEITEM item) {
  char text[MAX_PATH] = "";
  TVITEMA query{};
  query.mask = TVIF_TEXT;
  query.hItem = item;
  query.pszText = text;
  query.cchTextMax = MAX_PATH;
  SendMessageA(tree, TVM_GETITEMA, 0, reinterpret_cast<LPARAM>(&query));
  return text;
}

// The texts of the item's children (of the roots for null), in the tree's order.
inline std::vector<std::string> ChildTexts(HWND tree, HTREEITEM parent) {
  std::vector<std::string> texts;
  for (HTREEITEM item = TreeNext(tree, parent, parent ? TVGN_CHILD : TVGN_ROOT); item; item = TreeNext(tree, item, TVGN_NEXT))
    texts.push_back(ItemText(tree, item));
  return texts;
}

inline HTREEITEM ChildNamed(HWND tree, HTREEITEM parent, const std::string &text) {
  for (HTREEITEM item = TreeNext(tree, parent, TVGN_CHILD); item; item = TreeNext(tree, item, TVGN_NEXT))
    if (ItemText(tree, item) == text) return item;
  return nullptr;
}

// Right-clicks the selected folder and chooses "&Folder settings"; the dialog, or null.
inline HWND OpenFolderSettings(HWND tree) {
  RECT rect{};
  const HTREEITEM caret = TreeNext(tree, nullptr, TVGN_CARET);
  std::memcpy(&rect, &caret, sizeof caret);  // TVM_GETITEMRECT takes the item in the rectangle
  SendMessageA(tree, TVM_GETITEMRECT, TRUE, reinterpret_cast<LPARAM>(&rect));
  POINT centre{(rect.left + rect.right) / 2, (rect.top + rect.bottom) / 2};
  const LPARAM at = MAKELPARAM(centre.x, centre.y);
  ClientToScreen(tree, &centre);
  SetCursorPos(centre.x, centre.y);  // where the click happens, as the tree reads it
  PostMessageA(tree, WM_RBUTTONDOWN, MK_RBUTTON, at);
  PostMessageA(tree, WM_RBUTTONUP, 0, at);
  HWND menu = WaitForPopupMenu();
  if (!menu) return nullptr;
  PostMessageA(menu, WM_CHAR, 'f', 0);
  return WaitForWindow("#32770", "Folder settings", 5000);
}
