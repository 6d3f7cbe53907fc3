#include "fw/Controls.h"

#include <vector>

namespace fw {
namespace {
void EnsureCommonControls(DWORD classes) {
  INITCOMMONCONTROLSEX init{sizeof(init), classes};
  ::InitCommonControlsEx(&init);
}
}  // namespace

BOOL CEdit::Create(DWORD style, const RECT &rect, CWnd *parent, UINT id) {
  return CreateEx(0, "EDIT", nullptr, style, rect, parent, id);
}

void CEdit::SetSel(int start, int end, BOOL noScroll) const {
  SendMessage(EM_SETSEL, static_cast<WPARAM>(start), end);
  if (!noScroll) SendMessage(EM_SCROLLCARET);
}

void CEdit::GetSel(int &start, int &end) const {
  DWORD first = 0, last = 0;
  SendMessage(EM_GETSEL, reinterpret_cast<WPARAM>(&first), reinterpret_cast<LPARAM>(&last));
  start = static_cast<int>(first);
  end = static_cast<int>(last);
}

void CEdit::ReplaceSel(const std::string &text, BOOL canUndo) const {
  SendMessage(EM_REPLACESEL, canUndo, reinterpret_cast<LPARAM>(text.c_str()));
}

BOOL CStatic::Create(const std::string &text, DWORD style, const RECT &rect, CWnd *parent, UINT id) {
  return CreateEx(0, "STATIC", text.c_str(), style, rect, parent, id);
}

BOOL CTreeCtrl::Create(DWORD style, const RECT &rect, CWnd *parent, UINT id) {
  EnsureCommonControls(ICC_TREEVIEW_CLASSES);
  return CreateEx(0, WC_TREEVIEWA, nullptr, style, rect, parent, id);
}

HTREEITEM CTreeCtrl::InsertItem(const TVINSERTSTRUCTA &insert) const {
  return reinterpret_cast<HTREEITEM>(SendMessage(TVM_INSERTITEMA, 0, Param(&insert)));
}

HTREEITEM CTreeCtrl::InsertItem(const std::string &text, HTREEITEM parent, HTREEITEM after) const {
  TVINSERTSTRUCTA insert{};
  insert.hParent = parent;
  insert.hInsertAfter = after;
  insert.item.mask = TVIF_TEXT;
  insert.item.pszText = const_cast<LPSTR>(text.c_str());
  return InsertItem(insert);
}

HTREEITEM CTreeCtrl::InsertItem(const std::string &text, int image, int selectedImage, HTREEITEM parent, HTREEITEM after) const {
  TVINSERTSTRUCTA insert{};
  insert.hParent = parent;
  insert.hInsertAfter = after;
  insert.item.mask = TVIF_TEXT | TVIF_IMAGE | TVIF_SELECTEDIMAGE;
  insert.item.pszText = const_cast<LPSTR>(text.c_str());
  insert.item.iImage = image;
  insert.item.iSelectedImage = selectedImage;
  return InsertItem(insert);
}

std::string CTreeCtrl::GetItemText(HTREEITEM item) const {
  // Item texts are at most MAX_PATH long where this tree is used; a longer one is cut.
  std::vector<char> buffer(1024, '\0');
  TVITEMA query{};
  query.mask = TVIF_TEXT;
  query.hItem = item;
  query.pszText = buffer.data();
  query.cchTextMax = static_cast<int>(buffer.size());
  if (!GetItem(&query)) return {};
  return query.pszText ? std::string(query.pszText) : std::string();
}

BOOL CTreeCtrl::SetItemText(HTREEITEM item, const std::string &text) const {
  TVITEMA change{};
  change.mask = TVIF_TEXT;
  change.hItem = item;
  change.pszText = const_cast<LPSTR>(text.c_str());
  return SetItem(&change);
}

DWORD_PTR CTreeCtrl::GetItemData(HTREEITEM item) const {
  TVITEMA query{};
  query.mask = TVIF_PARAM;
  query.hItem = item;
  return GetItem(&query) ? static_cast<DWORD_PTR>(query.lParam) : 0;
}

BOOL CTreeCtrl::SetItemData(HTREEITEM item, DWORD_PTR data) const {
  TVITEMA change{};
  change.mask = TVIF_PARAM;
  change.hItem = item;
  change.lParam = static_cast<LPARAM>(data);
  return SetItem(&change);
}

BOOL CTreeCtrl::SetItemState(HTREEITEM item, UINT state, UINT mask) const {
  TVITEMA change{};
  change.mask = TVIF_STATE;
  change.hItem = item;
  change.state = state;
  change.stateMask = mask;
  return SetItem(&change);
}

BOOL CTreeCtrl::GetItemRect(HTREEITEM item, RECT *rect, BOOL textOnly) const {
  // TVM_GETITEMRECT takes the item handle in the rectangle it fills.
  *reinterpret_cast<HTREEITEM *>(rect) = item;
  return static_cast<BOOL>(SendMessage(TVM_GETITEMRECT, textOnly, Param(rect)));
}

}  // namespace fw
