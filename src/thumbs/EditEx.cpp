#include "thumbs/EditEx.h"

#include "catalogue/Ombra3Doc.h"
#include "filecmd/DrawingExtension.h"
#include "filecmd/ForFileCommands.h"
#include "filecmd/MarkedPaths.h"
#include "thumbs/FocusedEdit.h"
#include "thumbs/Ombra3View.h"

namespace {
constexpr UINT kRedrawAll = RDW_INVALIDATE | RDW_ERASE | RDW_FRAME;
}

void DrawSunkenEdge(HWND box, HDC dc, int dx, int dy) {
  RECT rect;
  ::GetClientRect(box, &rect);
  ::InflateRect(&rect, dx, dy);
  ::DrawEdge(dc, &rect, EDGE_SUNKEN, BF_RECT);
}

CEditEx::~CEditEx() { g_pFocusedEdit = nullptr; }

void CEditEx::Reset(const std::string &name) {
  m_bEditing = false;
  m_strSaved = name;
}

void CEditEx::StartEditing() {
  m_bEditing = true;
  SetWindowText(m_strSaved);
  SelectName();
}

// As the shell does: the name is selected, not its extension, so that typing keeps the drawing
// a drawing.
void CEditEx::SelectName() const { SetSel(0, static_cast<int>(NameLengthBeforeExtension(GetWindowText()))); }

void CEditEx::SelectCaption() const { SetSel(0, LineLength(-1)); }

void CEditEx::UnselectCaption() {
  if (m_bEditing) EndEditing();
  SetWindowText(GetWindowText());
}

void CEditEx::Redraw() const { ::RedrawWindow(m_hWnd, nullptr, nullptr, kRedrawAll); }

bool CEditEx::CommitRename() {
  if (!m_bEditing || !g_pDoc || !g_pThumbView) return false;
  g_pThumbView->PostRename(CaptionRename{m_hWnd, g_pDoc->m_strPath, m_strSaved, KeepingExtension(GetWindowText(), m_strSaved)});
  m_bEditing = false;
  SetReadOnly(TRUE);
  Redraw();
  return true;
}

void CEditEx::EndEditing() {
  m_bEditing = false;
  if (!m_strSaved.empty()) SetWindowText(m_strSaved);
  SetReadOnly(TRUE);
  Redraw();
  if (g_pThumbView) g_pThumbView->ShowMarks();
}

LRESULT CEditEx::OnKeyDown(WPARAM key) {
  switch (key) {
    case VK_RETURN:
      if (CommitRename()) return 0;
      return Default();
    case VK_ESCAPE: EndEditing(); return Default();
    default: return Default();
  }
}

void CEditEx::OnKillFocus() {
  g_pFocusedEdit = nullptr;
  Default();
  if (m_bEditing) EndEditing();
  if (g_pThumbView && g_pThumbView->m_hWnd) ::RedrawWindow(g_pThumbView->m_hWnd, nullptr, nullptr, kRedrawAll);
}

// Outside a rename a click only takes the focus: the edit's own handling would move the caret
// and take away the highlight that shows the drawing's mark.
LRESULT CEditEx::OnLeftButtonDown() {
  if (m_bEditing) return Default();
  SetFocus();
  return 0;
}

BOOL CEditEx::OnChildNotify(UINT message, WPARAM wParam, LPARAM, LRESULT *) {
  if (message != WM_CTLCOLOREDIT && message != WM_CTLCOLORSTATIC) return FALSE;
  if (m_bEditing) DrawSunkenEdge(m_hWnd, reinterpret_cast<HDC>(wParam), 2, 2);
  return FALSE;  // no brush of our own: the parent's default colours apply
}

LRESULT CEditEx::WindowProc(UINT message, WPARAM wParam, LPARAM lParam) {
  switch (message) {
    case WM_LBUTTONDBLCLK: {
      SetReadOnly(FALSE);
      StartEditing();
      const LRESULT result = Default();
      SelectName();
      return result;
    }
    case WM_LBUTTONDOWN: return OnLeftButtonDown();
    case WM_KEYDOWN: return OnKeyDown(wParam);
    case WM_SETFOCUS: {
      const LRESULT result = Default();
      g_pFocusedEdit = this;
      return result;
    }
    case WM_KILLFOCUS: OnKillFocus(); return 0;
    default: return CEdit::WindowProc(message, wParam, lParam);
  }
}
