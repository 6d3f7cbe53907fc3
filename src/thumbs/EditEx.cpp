#include "thumbs/EditEx.h"

#include "catalogue/Ombra3Doc.h"
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

void CEditEx::StartEditing() {
  m_bEditing = true;
  m_strSaved = GetWindowText();
}

void CEditEx::SelectCaption() const { SetSel(0, LineLength(-1)); }

void CEditEx::UnselectCaption() const {
  SendMessage(WM_CLEAR);
  SetWindowText(GetWindowText());
}

void CEditEx::Redraw() const { ::RedrawWindow(m_hWnd, nullptr, nullptr, kRedrawAll); }

bool CEditEx::CommitRename() {
  if (!m_bEditing || !g_pDoc) return false;
  const std::string folder = FolderWithSeparator(g_pDoc->m_strPath);
  const std::string from = folder + m_strSaved;
  const std::string to = folder + GetWindowText();
  if (ForFileCommands().RenameFile(from.c_str(), to.c_str(), m_hWnd) != 0) {
    SetWindowText(m_strSaved);
    return false;
  }
  // The rescan rebuilds every tile, this box among them: it runs once this message is done.
  if (g_pThumbView) g_pThumbView->PostRefreshFolder();
  return true;
}

LRESULT CEditEx::OnKeyDown(WPARAM key) {
  switch (key) {
    case VK_RETURN:
      if (m_bEditing && CommitRename()) return 0;
      m_strSaved = GetWindowText();
      SetReadOnly(TRUE);
      return Default();
    case VK_ESCAPE:
      m_bEditing = false;
      SetWindowText(m_strSaved);
      Redraw();
      return Default();
    default: return Default();
  }
}

void CEditEx::OnKillFocus() {
  g_pFocusedEdit = nullptr;
  Default();
  m_bEditing = false;
  if (!m_strSaved.empty()) SetWindowText(m_strSaved);
  SetReadOnly(TRUE);
  Redraw();
  if (g_pThumbView && g_pThumbView->m_hWnd) ::RedrawWindow(g_pThumbView->m_hWnd, nullptr, nullptr, kRedrawAll);
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
      SelectCaption();
      return result;
    }
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
