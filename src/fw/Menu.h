// A menu handle that the object owns: loaded from the module's resources or built as a pop-up,
// and destroyed with the object.
#pragma once

#include <windows.h>

namespace fw {

class CMenu {
 public:
  CMenu() = default;
  ~CMenu() { DestroyMenu(); }
  CMenu(const CMenu &) = delete;
  CMenu &operator=(const CMenu &) = delete;
  CMenu(CMenu &&other) noexcept : m_hMenu(other.Detach()) {}
  CMenu &operator=(CMenu &&other) noexcept;

  // Menu resource `id` of the current resource module.
  BOOL LoadMenu(UINT id);
  BOOL CreatePopupMenu();
  BOOL DestroyMenu();
  HMENU Detach();
  HMENU GetSafeHmenu() const { return m_hMenu; }
  operator HMENU() const { return m_hMenu; }

  BOOL AppendMenu(UINT flags, UINT_PTR id = 0, LPCSTR text = nullptr) const { return ::AppendMenuA(m_hMenu, flags, id, text); }
  // The pop-up at `position`; it stays owned by this menu.
  HMENU GetSubMenu(int position) const { return ::GetSubMenu(m_hMenu, position); }
  int GetMenuItemCount() const { return ::GetMenuItemCount(m_hMenu); }
  UINT GetMenuItemID(int position) const { return ::GetMenuItemID(m_hMenu, position); }
  UINT EnableMenuItem(UINT item, UINT enable) const { return ::EnableMenuItem(m_hMenu, item, enable); }
  DWORD CheckMenuItem(UINT item, UINT check) const { return ::CheckMenuItem(m_hMenu, item, check); }

  // Shows the pop-up at a screen point and returns the chosen command id, 0 when the menu was
  // dismissed. The choice is returned, not sent: the owner receives no WM_COMMAND.
  UINT TrackPopupMenu(UINT flags, int x, int y, HWND owner) const { return TrackPopup(m_hMenu, flags, x, y, owner); }
  static UINT TrackPopup(HMENU menu, UINT flags, int x, int y, HWND owner);

  HMENU m_hMenu = nullptr;
};

}  // namespace fw
