#include "fw/Menu.h"

#include "fw/WinApp.h"

namespace fw {

CMenu &CMenu::operator=(CMenu &&other) noexcept {
  if (this != &other) {
    DestroyMenu();
    m_hMenu = other.Detach();
  }
  return *this;
}

BOOL CMenu::LoadMenu(UINT id) {
  DestroyMenu();
  m_hMenu = ::LoadMenuA(AfxGetResourceHandle(), MAKEINTRESOURCEA(id));
  return m_hMenu != nullptr;
}

BOOL CMenu::CreatePopupMenu() {
  DestroyMenu();
  m_hMenu = ::CreatePopupMenu();
  return m_hMenu != nullptr;
}

BOOL CMenu::DestroyMenu() {
  if (!m_hMenu) return FALSE;
  const BOOL destroyed = ::DestroyMenu(m_hMenu);
  m_hMenu = nullptr;
  return destroyed;
}

HMENU CMenu::Detach() {
  HMENU menu = m_hMenu;
  m_hMenu = nullptr;
  return menu;
}

UINT CMenu::TrackPopup(HMENU menu, UINT flags, int x, int y, HWND owner) {
  if (!menu) return 0;
  const BOOL chosen = ::TrackPopupMenu(menu, flags | TPM_RETURNCMD | TPM_NONOTIFY | TPM_RIGHTBUTTON, x, y, 0, owner, nullptr);
  return chosen > 0 ? static_cast<UINT>(chosen) : 0;
}

}  // namespace fw
