// An update request for one command's user-interface item (a menu item, a tool bar button or
// a status pane): handlers set its check mark, enabling or text.
#pragma once

#include <windows.h>

#include <string>

namespace fw {

class CCmdUI {
 public:
  virtual ~CCmdUI() = default;
  virtual void Enable(BOOL on = TRUE) = 0;
  virtual void SetCheck(int check = 1) = 0;
  virtual void SetText(const std::string &text) { (void)text; }

  UINT m_nID = 0;
  UINT m_nIndex = 0;
  bool m_bHandled = false;  // set by whoever routed the request to a handler
};

// The update request for an item of a pop-up menu that is about to open.
class CMenuCmdUI : public CCmdUI {
 public:
  CMenuCmdUI(HMENU menu, UINT index, UINT id) : m_hMenu(menu) {
    m_nIndex = index;
    m_nID = id;
  }
  void Enable(BOOL on = TRUE) override {
    EnableMenuItem(m_hMenu, m_nIndex, MF_BYPOSITION | (on ? MF_ENABLED : MF_DISABLED | MF_GRAYED));
  }
  void SetCheck(int check = 1) override { CheckMenuItem(m_hMenu, m_nIndex, MF_BYPOSITION | (check ? MF_CHECKED : MF_UNCHECKED)); }

 private:
  HMENU m_hMenu;
};

}  // namespace fw
