#include "explorer/LeftView.h"

#include "catalogue/Ombra3Doc.h"
#include "fw/FrameworkIds.h"
#include "host/ModuleGlobals.h"
#include "host/TextConvert.h"

CLeftView *g_pLeftView = nullptr;

namespace {
constexpr DWORD kTreeStyle = WS_CHILD | WS_VISIBLE | TVS_HASBUTTONS | TVS_HASLINES | TVS_LINESATROOT;
}  // namespace

CLeftView::CLeftView() { g_pLeftView = this; }

CLeftView::~CLeftView() {
  if (g_pLeftView == this) g_pLeftView = nullptr;
}

BOOL CLeftView::Create(LPCSTR className, LPCSTR windowName, DWORD style, const RECT &rect, fw::CWnd *parent, UINT id) {
  const BOOL created = CView::Create(className, windowName, style, rect, parent, id);
  if (!created) return FALSE;
  if (!m_wndTree.Create(kTreeStyle, RECT{0, 0, 0, 0}, this, AFX_IDW_PANE_FIRST)) return FALSE;
  m_wndTree.InsertRootItem();
  if (g_pDoc) {
    // The folder itself, for where the walk along labels stops short: the start folder's
    // drive and directory, or the folder shown last.
    std::string folder = g_pDoc->m_strPath;
    if (g_szStartFolder[0]) {
      const PathParts start = SplitAnsiPath(g_szStartFolder);
      folder = start.drive + start.directory;
      g_pDoc->m_strShellPath = g_szStartShellPath;
    }
    m_wndTree.ExpandToPath(g_pDoc->m_strShellPath);
    if (!m_wndTree.GetStartItem()) m_wndTree.ExpandToFolder(folder);
  }
  return created;
}

LRESULT CLeftView::WindowProc(UINT message, WPARAM wParam, LPARAM lParam) {
  switch (message) {
    case WM_SETFOCUS: {
      const LRESULT result = CView::WindowProc(message, wParam, lParam);
      if (m_wndTree.m_hWnd) m_wndTree.SetFocus();
      return result;
    }
    case WM_SIZE: {
      const LRESULT result = CView::WindowProc(message, wParam, lParam);
      // The tree keeps where the person scrolled it: a drag of the splitter does not move it.
      if (m_wndTree.m_hWnd)
        ::SetWindowPos(m_wndTree.m_hWnd, nullptr, 0, 0, LOWORD(lParam), HIWORD(lParam), SWP_NOMOVE | SWP_NOZORDER);
      return result;
    }
    default: return CView::WindowProc(message, wParam, lParam);
  }
}
