// What a watcher of a browse call reads from the folder tree and does to it, from its own
// thread, as a person would.
#pragma once

#include "ExplorerHarness.h"

#include <algorithm>
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

// Chooses "&Folder settings" once the menu shows; returns after the menu has closed and its
// handler has run up to its dialog, if it opens one. False when no menu showed.
inline bool ChooseFromMenu() {
  HWND menu = WaitForPopupMenu();
  if (!menu) return false;
  PostMessageA(menu, WM_CHAR, 'f', 0);
  for (int i = 0; i < 250 && IsWindowVisible(menu); ++i) Sleep(20);
  return true;
}

// Right-clicks a row of the tree (the selected one by default) at `x` (by default the middle of
// its text) and chooses "&Folder settings", as ChooseFromMenu.
inline bool ChooseFolderSettings(HWND tree, HTREEITEM item = nullptr, int x = -1) {
  RECT rect{};
  if (!item) item = TreeNext(tree, nullptr, TVGN_CARET);
  SendMessageA(tree, TVM_ENSUREVISIBLE, 0, reinterpret_cast<LPARAM>(item));  // a person clicks what is shown
  std::memcpy(&rect, &item, sizeof item);  // TVM_GETITEMRECT takes the item in the rectangle
  SendMessageA(tree, TVM_GETITEMRECT, TRUE, reinterpret_cast<LPARAM>(&rect));
  RECT area{};
  GetClientRect(tree, &area);  // a person clicks inside the tree, even on a row wider than it
  POINT at{std::min<LONG>(x >= 0 ? x : (rect.left + rect.right) / 2, area.right - 1), (rect.top + rect.bottom) / 2};
  const LPARAM client = MAKELPARAM(at.x, at.y);
  ClientToScreen(tree, &at);
  SetCursorPos(at.x, at.y);  // where the click happens, as the tree reads it
  PostMessageA(tree, WM_RBUTTONDOWN, MK_RBUTTON, client);
  PostMessageA(tree, WM_RBUTTONUP, 0, client);
  return ChooseFromMenu();
}

// The folder settings dialog opened from the tree's menu, or null.
inline HWND OpenFolderSettings(HWND tree, HTREEITEM item = nullptr, int x = -1) {
  return ChooseFolderSettings(tree, item, x) ? WaitForWindow("#32770", "Folder settings", 5000) : nullptr;
}
