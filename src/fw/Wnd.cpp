#include "fw/Wnd.h"

#include "fw/WinApp.h"

#include <unordered_map>

namespace fw {
namespace {
// All framework windows live on the user-interface thread; the map needs no lock.
std::unordered_map<HWND, CWnd *> &HandleMap() {
  static std::unordered_map<HWND, CWnd *> map;
  return map;
}

thread_local CWnd *t_creating = nullptr;
thread_local HHOOK t_cbtHook = nullptr;

// A window made while another is being created (a frame's bars inside its WM_CREATE) has a
// scope of its own inside the outer one: each scope removes its own hook and gives the outer
// one back.
class HookScope {
 public:
  explicit HookScope(CWnd *wnd) : m_previousCreating(t_creating), m_previousHook(t_cbtHook) {
    t_creating = wnd;
    m_hook = SetWindowsHookExA(WH_CBT, AfxCbtHook, nullptr, GetCurrentThreadId());
    t_cbtHook = m_hook;
  }
  ~HookScope() {
    if (m_hook) UnhookWindowsHookEx(m_hook);
    t_cbtHook = m_previousHook;
    t_creating = m_previousCreating;
  }
  HookScope(const HookScope &) = delete;
  HookScope &operator=(const HookScope &) = delete;

 private:
  CWnd *m_previousCreating;
  HHOOK m_previousHook;
  HHOOK m_hook;
};

bool IsReflected(UINT message) {
  switch (message) {
    case WM_CTLCOLORBTN:
    case WM_CTLCOLOREDIT:
    case WM_CTLCOLORLISTBOX:
    case WM_CTLCOLORSCROLLBAR:
    case WM_CTLCOLORSTATIC:
    case WM_HSCROLL:
    case WM_VSCROLL:
    case WM_DRAWITEM:
    case WM_MEASUREITEM: return true;
    default: return false;
  }
}

HWND ReflectionTarget(UINT message, WPARAM wParam, LPARAM lParam) {
  if (message == WM_DRAWITEM) return reinterpret_cast<DRAWITEMSTRUCT *>(lParam)->hwndItem;
  if (message == WM_MEASUREITEM) return nullptr;
  (void)wParam;
  return reinterpret_cast<HWND>(lParam);
}
}  // namespace

LRESULT CALLBACK AfxCbtHook(int code, WPARAM wParam, LPARAM lParam) {
  if (code == HCBT_CREATEWND && t_creating) {
    CWnd *wnd = t_creating;
    t_creating = nullptr;  // only the window being created; its children come with their own
    wnd->Attach(reinterpret_cast<HWND>(wParam));
    wnd->m_superProc =
        reinterpret_cast<WNDPROC>(SetWindowLongPtrA(wnd->m_hWnd, GWLP_WNDPROC, reinterpret_cast<LONG_PTR>(AfxWndProc)));
  }
  return CallNextHookEx(t_cbtHook, code, wParam, lParam);
}

LRESULT CALLBACK AfxWndProc(HWND hwnd, UINT message, WPARAM wParam, LPARAM lParam) {
  CWnd *wnd = CWnd::FromHandlePermanent(hwnd);
  if (!wnd) return ::DefWindowProcA(hwnd, message, wParam, lParam);
  LRESULT result = 0;
  try {
    result = wnd->Dispatch(message, wParam, lParam);
  } catch (...) {
    // No exception may unwind through the window system; the message counts as handled.
    result = 0;
  }
  if (message == WM_NCDESTROY) {
    wnd->Detach();
    wnd->PostNcDestroy();
  }
  return result;
}

LPCSTR AfxWndClassName() {
  static const char *const kName = "FwWnd";
  static const ATOM registered = [] {
    WNDCLASSA wc{};
    wc.style = CS_DBLCLKS;
    wc.lpfnWndProc = ::DefWindowProcA;
    wc.hInstance = AfxGetInstanceHandle();
    wc.hCursor = LoadCursor(nullptr, IDC_ARROW);
    wc.lpszClassName = kName;
    return RegisterClassA(&wc);
  }();
  (void)registered;
  return kName;
}

CWnd::~CWnd() {
  if (m_hWnd && ::IsWindow(m_hWnd)) {
    HWND hwnd = m_hWnd;
    Detach();
    ::DestroyWindow(hwnd);
  }
}

CWnd *CWnd::FromHandlePermanent(HWND hwnd) {
  if (!hwnd) return nullptr;
  auto found = HandleMap().find(hwnd);
  return found == HandleMap().end() ? nullptr : found->second;
}

void CWnd::Attach(HWND hwnd) {
  m_hWnd = hwnd;
  HandleMap()[hwnd] = this;
}

void CWnd::Detach() {
  if (!m_hWnd) return;
  if (m_superProc && ::IsWindow(m_hWnd) && reinterpret_cast<WNDPROC>(GetWindowLongPtrA(m_hWnd, GWLP_WNDPROC)) == AfxWndProc)
    SetWindowLongPtrA(m_hWnd, GWLP_WNDPROC, reinterpret_cast<LONG_PTR>(m_superProc));
  HandleMap().erase(m_hWnd);
  m_hWnd = nullptr;
  m_superProc = nullptr;
}

BOOL CWnd::CreateEx(DWORD exStyle, LPCSTR className, LPCSTR windowName, DWORD style, const RECT &rect, CWnd *parent, UINT id,
                    LPVOID param) {
  return CreateEx(exStyle, className, windowName, style, rect, parent ? parent->m_hWnd : nullptr, id, param);
}

BOOL CWnd::CreateEx(DWORD exStyle, LPCSTR className, LPCSTR windowName, DWORD style, const RECT &rect, HWND parent, UINT id,
                    LPVOID param) {
  CREATESTRUCTA cs{};
  cs.dwExStyle = exStyle;
  cs.lpszClass = className;
  cs.lpszName = windowName;
  cs.style = static_cast<LONG>(style);
  cs.x = rect.left;
  cs.y = rect.top;
  cs.cx = rect.right - rect.left;
  cs.cy = rect.bottom - rect.top;
  cs.hwndParent = parent;
  cs.hMenu = (style & WS_CHILD) ? reinterpret_cast<HMENU>(static_cast<UINT_PTR>(id)) : nullptr;
  cs.lpCreateParams = param;
  return CreateFromStruct(cs);
}

BOOL CWnd::CreateFromStruct(const CREATESTRUCTA &cs) {
  if (m_hWnd) return FALSE;
  struct Call {
    const CREATESTRUCTA &cs;
    static HWND Create(void *context) {
      const CREATESTRUCTA &c = static_cast<Call *>(context)->cs;
      return ::CreateWindowExA(c.dwExStyle, c.lpszClass ? c.lpszClass : AfxWndClassName(), c.lpszName,
                               static_cast<DWORD>(c.style), c.x, c.y, c.cx, c.cy, c.hwndParent, c.hMenu, AfxGetInstanceHandle(),
                               c.lpCreateParams);
    }
  } call{cs};
  return CreateAttached(Call::Create, &call) != nullptr;
}

HWND CWnd::CreateAttached(HWND (*create)(void *context), void *context) {
  // A window that fails after being attached is destroyed, and its WM_NCDESTROY detaches it (and
  // may delete a self-deleting object): nothing here touches the object after a failure.
  HookScope hook(this);
  return create(context);
}

BOOL CWnd::SubclassWindow(HWND hwnd) {
  if (m_hWnd || !hwnd || FromHandlePermanent(hwnd)) return FALSE;
  Attach(hwnd);
  m_superProc = reinterpret_cast<WNDPROC>(SetWindowLongPtrA(hwnd, GWLP_WNDPROC, reinterpret_cast<LONG_PTR>(AfxWndProc)));
  return TRUE;
}

BOOL CWnd::SubclassDlgItem(UINT id, CWnd *parent) {
  return parent && SubclassWindow(::GetDlgItem(parent->m_hWnd, static_cast<int>(id)));
}

HWND CWnd::UnsubclassWindow() {
  HWND hwnd = m_hWnd;
  Detach();
  return hwnd;
}

BOOL CWnd::DestroyWindow() {
  if (!m_hWnd) return FALSE;
  return ::DestroyWindow(m_hWnd);
}

std::string CWnd::GetWindowText() const {
  const int length = ::GetWindowTextLengthA(m_hWnd);
  std::string text(static_cast<size_t>(length) + 1, '\0');
  const int copied = ::GetWindowTextA(m_hWnd, text.data(), length + 1);
  text.resize(static_cast<size_t>(copied > 0 ? copied : 0));
  return text;
}

LRESULT CWnd::Dispatch(UINT message, WPARAM wParam, LPARAM lParam) {
  const MSG previous = m_current;
  m_current = MSG{m_hWnd, message, wParam, lParam, 0, {}};
  const LRESULT result = WindowProc(message, wParam, lParam);
  m_current = previous;
  return result;
}

LRESULT CWnd::DefWindowProc(UINT message, WPARAM wParam, LPARAM lParam) {
  if (m_superProc) return ::CallWindowProcA(m_superProc, m_hWnd, message, wParam, lParam);
  return ::DefWindowProcA(m_hWnd, message, wParam, lParam);
}

LRESULT CWnd::Default() { return DefWindowProc(m_current.message, m_current.wParam, m_current.lParam); }

LRESULT CWnd::WindowProc(UINT message, WPARAM wParam, LPARAM lParam) {
  switch (message) {
    case WM_COMMAND:
      if (OnCommand(wParam, lParam)) return 0;
      break;
    case WM_NOTIFY: {
      LRESULT result = 0;
      if (OnNotify(wParam, lParam, &result)) return result;
      break;
    }
    default:
      if (IsReflected(message)) {
        LRESULT result = 0;
        CWnd *child = FromHandlePermanent(ReflectionTarget(message, wParam, lParam));
        if (child && child != this && child->OnChildNotify(message, wParam, lParam, &result)) return result;
      }
      break;
  }
  return DefWindowProc(message, wParam, lParam);
}

BOOL CWnd::OnCommand(WPARAM wParam, LPARAM lParam) {
  HWND control = reinterpret_cast<HWND>(lParam);
  if (control) {
    LRESULT result = 0;
    CWnd *child = FromHandlePermanent(control);
    if (child && child != this && child->OnChildNotify(WM_COMMAND, wParam, lParam, &result)) return TRUE;
  }
  return OnCmdMsg(LOWORD(wParam), control ? static_cast<int>(HIWORD(wParam)) : CN_COMMAND, nullptr);
}

BOOL CWnd::OnNotify(WPARAM, LPARAM lParam, LRESULT *result) {
  const NMHDR *header = reinterpret_cast<const NMHDR *>(lParam);
  CWnd *child = FromHandlePermanent(header->hwndFrom);
  if (child && child != this && child->OnChildNotify(WM_NOTIFY, header->idFrom, lParam, result)) return TRUE;
  return OnCmdMsg(static_cast<UINT>(header->idFrom), static_cast<int>(header->code), nullptr);
}

BOOL CWnd::PreTranslateMessage(MSG *) { return FALSE; }

BOOL CWnd::OnCmdMsg(UINT, int, CCmdUI *) { return FALSE; }

BOOL CWnd::OnChildNotify(UINT, WPARAM, LPARAM, LRESULT *) { return FALSE; }

}  // namespace fw
