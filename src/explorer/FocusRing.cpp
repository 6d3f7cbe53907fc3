#include "explorer/FocusRing.h"

#include "explorer/LeftView.h"
#include "explorer/MainFrame.h"
#include "res/resource.h"
#include "thumbs/Ombra3View.h"

namespace {
enum Place { kTree, kDrawings, kSearch, kAccept, kCancel, kPlaces };

bool Within(HWND window, HWND focus) { return window && focus && (focus == window || ::IsChild(window, focus)); }

int ButtonIndex(CMainFrame &frame, UINT command) {
  return static_cast<int>(frame.m_wndToolBarBottom.SendMessage(TB_COMMANDTOINDEX, command, 0));
}

UINT HotCommand(CMainFrame &frame) {
  const LRESULT hot = frame.m_wndToolBarBottom.SendMessage(TB_GETHOTITEM, 0, 0);
  if (hot < 0) return 0;
  TBBUTTON button{};
  if (!frame.m_wndToolBarBottom.SendMessage(TB_GETBUTTON, static_cast<WPARAM>(hot), reinterpret_cast<LPARAM>(&button)))
    return 0;
  return static_cast<UINT>(button.idCommand);
}

int PlaceOf(CMainFrame &frame, HWND focus) {
  if (g_pLeftView && Within(g_pLeftView->m_hWnd, focus)) return kTree;
  if (g_pThumbView && Within(g_pThumbView->m_hWnd, focus)) return kDrawings;
  if (Within(frame.m_wndSearch.m_hWnd, focus)) return kSearch;
  if (focus == frame.m_wndToolBarBottom.m_hWnd) return HotCommand(frame) == ID_BROWSE_CANCEL ? kCancel : kAccept;
  return -1;
}

bool Reachable(CMainFrame &frame, int place) {
  switch (place) {
    case kTree: return g_pLeftView && g_pLeftView->m_hWnd;
    case kDrawings: return g_pThumbView && g_pThumbView->m_hWnd;
    case kSearch: return frame.m_wndSearch.m_hWnd != nullptr;
    case kAccept: return frame.m_wndToolBarBottom.SendMessage(TB_ISBUTTONENABLED, ID_BROWSE_ACCEPT, 0) != 0;
    default: return true;
  }
}

void Enter(CMainFrame &frame, int place) {
  frame.m_wndToolBarBottom.SendMessage(TB_SETHOTITEM, static_cast<WPARAM>(-1), 0);
  switch (place) {
    case kTree: g_pLeftView->GetTreeCtrl().SetFocus(); return;
    case kDrawings: g_pThumbView->SetFocus(); return;
    case kSearch:
      frame.m_wndSearch.SetFocus();
      frame.m_wndSearch.SendMessage(EM_SETSEL, 0, -1);
      return;
    default:
      frame.m_wndToolBarBottom.SetFocus();
      frame.m_wndToolBarBottom.SendMessage(TB_SETHOTITEM,
                                           ButtonIndex(frame, place == kAccept ? ID_BROWSE_ACCEPT : ID_BROWSE_CANCEL), 0);
      return;
  }
}
}  // namespace

bool HandleFocusKey(CMainFrame &frame, const MSG &msg) {
  if (msg.message != WM_KEYDOWN || !Within(frame.m_hWnd, msg.hwnd)) return false;
  // Tab out of a caption box being renamed gives the rename up, as leaving the box does.
  const HWND focus = ::GetFocus();
  const int place = PlaceOf(frame, focus);
  if (msg.wParam == VK_TAB) {
    const int step = ::GetKeyState(VK_SHIFT) < 0 ? kPlaces - 1 : 1;
    int next = place < 0 ? kTree : place;
    do next = (next + step) % kPlaces;
    while (!Reachable(frame, next));
    Enter(frame, next);
    return true;
  }
  if ((msg.wParam == VK_RETURN || msg.wParam == VK_SPACE) && (place == kAccept || place == kCancel)) {
    const UINT command = place == kAccept ? ID_BROWSE_ACCEPT : ID_BROWSE_CANCEL;
    if (frame.m_wndToolBarBottom.SendMessage(TB_ISBUTTONENABLED, command, 0)) frame.PostMessage(WM_COMMAND, command);
    return true;
  }
  if (msg.wParam == VK_RETURN && place == kSearch) {
    // Enter in the search box accepts the drawing the search found, as the accept button does.
    if (frame.m_wndToolBarBottom.SendMessage(TB_ISBUTTONENABLED, ID_BROWSE_ACCEPT, 0)) frame.PostMessage(WM_COMMAND, ID_BROWSE_ACCEPT);
    return true;
  }
  return false;
}
