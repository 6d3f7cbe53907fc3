// Thin wrappers of the standard controls the explorer uses. Each object is attached to its
// control from the control's first message on, so a derived class sees every message in
// WindowProc before the control's own procedure, and receives its notifications back from the
// parent through OnChildNotify (EN_CHANGE and STN_CLICKED as WM_COMMAND, TVN_* as WM_NOTIFY,
// WM_CTLCOLOR* with its HDC: answer with a brush to colour the control).
#pragma once

#include "fw/Wnd.h"

#include <commctrl.h>

#include <string>

namespace fw {

class CEdit : public CWnd {
 public:
  BOOL Create(DWORD style, const RECT &rect, CWnd *parent, UINT id);

  void SetSel(int start, int end, BOOL noScroll = FALSE) const;
  void GetSel(int &start, int &end) const;
  void ReplaceSel(const std::string &text, BOOL canUndo = FALSE) const;
  void SetLimitText(UINT maximum) const { SendMessage(EM_SETLIMITTEXT, maximum); }
  UINT GetLimitText() const { return static_cast<UINT>(SendMessage(EM_GETLIMITTEXT)); }
  BOOL SetReadOnly(BOOL readOnly = TRUE) const { return static_cast<BOOL>(SendMessage(EM_SETREADONLY, readOnly)); }
  int LineLength(int line = -1) const { return static_cast<int>(SendMessage(EM_LINELENGTH, line)); }
  void Clear() const { SendMessage(WM_CLEAR); }
};

class CStatic : public CWnd {
 public:
  BOOL Create(const std::string &text, DWORD style, const RECT &rect, CWnd *parent, UINT id = 0xFFFF);
};

class CTreeCtrl : public CWnd {
 public:
  BOOL Create(DWORD style, const RECT &rect, CWnd *parent, UINT id);

  HTREEITEM InsertItem(const TVINSERTSTRUCTA &insert) const;
  HTREEITEM InsertItem(const std::string &text, HTREEITEM parent = TVI_ROOT, HTREEITEM after = TVI_LAST) const;
  HTREEITEM InsertItem(const std::string &text, int image, int selectedImage, HTREEITEM parent = TVI_ROOT,
                       HTREEITEM after = TVI_LAST) const;
  BOOL DeleteItem(HTREEITEM item) const { return static_cast<BOOL>(SendMessage(TVM_DELETEITEM, 0, Param(item))); }
  BOOL DeleteAllItems() const { return DeleteItem(TVI_ROOT); }

  BOOL GetItem(TVITEMA *item) const { return static_cast<BOOL>(SendMessage(TVM_GETITEMA, 0, Param(item))); }
  BOOL SetItem(TVITEMA *item) const { return static_cast<BOOL>(SendMessage(TVM_SETITEMA, 0, Param(item))); }
  std::string GetItemText(HTREEITEM item) const;
  BOOL SetItemText(HTREEITEM item, const std::string &text) const;
  DWORD_PTR GetItemData(HTREEITEM item) const;
  BOOL SetItemData(HTREEITEM item, DWORD_PTR data) const;
  UINT GetItemState(HTREEITEM item, UINT mask) const {
    return static_cast<UINT>(SendMessage(TVM_GETITEMSTATE, Param(item), mask));
  }
  BOOL SetItemState(HTREEITEM item, UINT state, UINT mask) const;
  BOOL ItemHasChildren(HTREEITEM item) const { return GetChildItem(item) != nullptr; }
  // The item's rectangle in client coordinates; textOnly narrows it to the item's text.
  BOOL GetItemRect(HTREEITEM item, RECT *rect, BOOL textOnly) const;

  HTREEITEM GetNextItem(HTREEITEM item, UINT code) const {
    return reinterpret_cast<HTREEITEM>(SendMessage(TVM_GETNEXTITEM, code, Param(item)));
  }
  HTREEITEM GetRootItem() const { return GetNextItem(nullptr, TVGN_ROOT); }
  HTREEITEM GetChildItem(HTREEITEM item) const { return GetNextItem(item, TVGN_CHILD); }
  HTREEITEM GetNextSiblingItem(HTREEITEM item) const { return GetNextItem(item, TVGN_NEXT); }
  HTREEITEM GetParentItem(HTREEITEM item) const { return GetNextItem(item, TVGN_PARENT); }
  HTREEITEM GetSelectedItem() const { return GetNextItem(nullptr, TVGN_CARET); }
  HTREEITEM GetDropHilightItem() const { return GetNextItem(nullptr, TVGN_DROPHILITE); }

  BOOL Expand(HTREEITEM item, UINT code) const { return static_cast<BOOL>(SendMessage(TVM_EXPAND, code, Param(item))); }
  // Selects item as the caret, the drop target or the first visible item (TVGN_*).
  BOOL Select(HTREEITEM item, UINT code) const { return static_cast<BOOL>(SendMessage(TVM_SELECTITEM, code, Param(item))); }
  BOOL SelectItem(HTREEITEM item) const { return Select(item, TVGN_CARET); }
  BOOL SortChildrenCB(const TVSORTCB &sort) const { return static_cast<BOOL>(SendMessage(TVM_SORTCHILDRENCB, 0, Param(&sort))); }
  HTREEITEM HitTest(TVHITTESTINFO *info) const { return reinterpret_cast<HTREEITEM>(SendMessage(TVM_HITTEST, 0, Param(info))); }
  // The tree does not own the list: its creator destroys it after the tree.
  HIMAGELIST SetImageList(HIMAGELIST list, int type) const {
    return reinterpret_cast<HIMAGELIST>(SendMessage(TVM_SETIMAGELIST, type, Param(list)));
  }
  HIMAGELIST GetImageList(int type) const { return reinterpret_cast<HIMAGELIST>(SendMessage(TVM_GETIMAGELIST, type)); }
  COLORREF GetBkColor() const { return static_cast<COLORREF>(SendMessage(TVM_GETBKCOLOR)); }

 private:
  template <class T>
  static LPARAM Param(T *pointer) {
    return reinterpret_cast<LPARAM>(pointer);
  }
};

}  // namespace fw
