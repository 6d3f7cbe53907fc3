// The window wrapper every framework window derives from: it owns its HWND, maps the handle
// back to the object, dispatches through one virtual WindowProc, reflects control
// notifications to the control's own object and routes commands.
#pragma once

#include <windows.h>

#include <string>

namespace fw {

class CCmdUI;

// Codes of OnCmdMsg besides a control's notification code.
constexpr int CN_COMMAND = 0;
constexpr int CN_UPDATE_COMMAND_UI = -1;

class CWnd {
 public:
  CWnd() = default;
  virtual ~CWnd();
  CWnd(const CWnd &) = delete;
  CWnd &operator=(const CWnd &) = delete;

  HWND GetSafeHwnd() const { return m_hWnd; }
  operator HWND() const { return m_hWnd; }
  // The object wrapping the handle, or null when the handle is no framework window.
  static CWnd *FromHandlePermanent(HWND hwnd);

  // Creates the window with this object attached from its very first message on.
  BOOL CreateEx(DWORD exStyle, LPCSTR className, LPCSTR windowName, DWORD style, const RECT &rect, CWnd *parent, UINT id,
                LPVOID param = nullptr);
  BOOL CreateEx(DWORD exStyle, LPCSTR className, LPCSTR windowName, DWORD style, const RECT &rect, HWND parent, UINT id,
                LPVOID param = nullptr);
  // The same from a filled creation record (position and size may be CW_USEDEFAULT).
  BOOL CreateFromStruct(const CREATESTRUCTA &cs);
  // Attaches the object to an existing window (a control made elsewhere): its messages now pass
  // through WindowProc before the control's own procedure.
  BOOL SubclassWindow(HWND hwnd);
  BOOL SubclassDlgItem(UINT id, CWnd *parent);
  HWND UnsubclassWindow();
  BOOL DestroyWindow();

  virtual LRESULT WindowProc(UINT message, WPARAM wParam, LPARAM lParam);
  virtual BOOL PreTranslateMessage(MSG *msg);
  // Command routing: a command (code CN_COMMAND or a control's notification code) or an update
  // request (CN_UPDATE_COMMAND_UI with cmdUI) for id; TRUE when some handler took it.
  virtual BOOL OnCmdMsg(UINT id, int code, CCmdUI *cmdUI);
  // Message reflection: called on a control when its parent receives one of its notifications
  // (WM_COMMAND, WM_NOTIFY, WM_CTLCOLOR*, WM_HSCROLL/WM_VSCROLL); TRUE when the control handled it.
  virtual BOOL OnChildNotify(UINT message, WPARAM wParam, LPARAM lParam, LRESULT *result);
  virtual void PostNcDestroy() {}

  // The window procedure the object replaced, for the message being handled.
  LRESULT Default();
  LRESULT DefWindowProc(UINT message, WPARAM wParam, LPARAM lParam);

  CWnd *GetParent() const { return FromHandlePermanent(::GetParent(m_hWnd)); }
  CWnd *GetDlgItem(int id) const { return FromHandlePermanent(::GetDlgItem(m_hWnd, id)); }
  LRESULT SendMessage(UINT message, WPARAM wParam = 0, LPARAM lParam = 0) const {
    return ::SendMessageA(m_hWnd, message, wParam, lParam);
  }
  BOOL PostMessage(UINT message, WPARAM wParam = 0, LPARAM lParam = 0) const {
    return ::PostMessageA(m_hWnd, message, wParam, lParam);
  }
  BOOL ShowWindow(int command) const { return ::ShowWindow(m_hWnd, command); }
  BOOL EnableWindow(BOOL enable = TRUE) const { return ::EnableWindow(m_hWnd, enable); }
  BOOL IsWindowVisible() const { return ::IsWindowVisible(m_hWnd); }
  void MoveWindow(const RECT &rect, BOOL repaint = TRUE) const {
    ::MoveWindow(m_hWnd, rect.left, rect.top, rect.right - rect.left, rect.bottom - rect.top, repaint);
  }
  void GetClientRect(RECT *rect) const { ::GetClientRect(m_hWnd, rect); }
  void GetWindowRect(RECT *rect) const { ::GetWindowRect(m_hWnd, rect); }
  void SetWindowText(const std::string &text) const { ::SetWindowTextA(m_hWnd, text.c_str()); }
  std::string GetWindowText() const;
  HWND SetFocus() const { return ::SetFocus(m_hWnd); }
  void UpdateWindow() const { ::UpdateWindow(m_hWnd); }
  void Invalidate(BOOL erase = TRUE) const { ::InvalidateRect(m_hWnd, nullptr, erase); }
  int GetDlgCtrlID() const { return ::GetDlgCtrlID(m_hWnd); }
  HFONT GetFont() const { return reinterpret_cast<HFONT>(SendMessage(WM_GETFONT)); }
  void SetFont(HFONT font, BOOL redraw = TRUE) const { SendMessage(WM_SETFONT, reinterpret_cast<WPARAM>(font), redraw); }

  HWND m_hWnd = nullptr;

 protected:
  // Runs a creation call (CreateWindowEx, CreateDialogIndirectParam, ...) with this object
  // attached to the first window it creates, before that window's first message.
  HWND CreateAttached(HWND (*create)(void *context), void *context);

  // Commands and notifications arriving at this window: reflected to the sending control first,
  // then routed through OnCmdMsg.
  virtual BOOL OnCommand(WPARAM wParam, LPARAM lParam);
  virtual BOOL OnNotify(WPARAM wParam, LPARAM lParam, LRESULT *result);

 private:
  friend LRESULT CALLBACK AfxWndProc(HWND, UINT, WPARAM, LPARAM);
  friend LRESULT CALLBACK AfxCbtHook(int, WPARAM, LPARAM);
  void Attach(HWND hwnd);
  void Detach();
  LRESULT Dispatch(UINT message, WPARAM wParam, LPARAM lParam);

  WNDPROC m_superProc = nullptr;  // the procedure replaced by subclassing
  MSG m_current{};                // the message being handled, for Default()
};

LRESULT CALLBACK AfxWndProc(HWND hwnd, UINT message, WPARAM wParam, LPARAM lParam);
// Attaches the object being created to its window before the window's first message.
LRESULT CALLBACK AfxCbtHook(int code, WPARAM wParam, LPARAM lParam);
// The window class every framework window of our own uses, registered on this module.
LPCSTR AfxWndClassName();

}  // namespace fw
