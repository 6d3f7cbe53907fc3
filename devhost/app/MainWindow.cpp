#include "app/MainWindow.h"

#include "app/DrawingView.h"

namespace {
constexpr wchar_t kClassName[] = L"DevhostMainWindow";
constexpr wchar_t kTitle[] = L"Lumvex development host";
constexpr int kViewId = 100;
constexpr int kHistoryId = 101;
constexpr int kInputId = 102;
constexpr int kCommandAreaHeight = 150;
constexpr int kInputHeight = 24;
constexpr int kPromptWidth = 80;

std::wstring WithWindowsLineEnds(const std::wstring &text) {
  std::wstring result;
  result.reserve(text.size() + 8);
  for (wchar_t c : text) {
    if (c == L'\n') result += L'\r';
    result += c;
  }
  return result;
}
}  // namespace

bool MainWindow::Create(HINSTANCE instance, CommandInput::SubmitHandler onSubmit, CloseHandler onClose) {
  m_onSubmit = std::move(onSubmit);
  m_onClose = std::move(onClose);
  WNDCLASSW wc{};
  wc.lpfnWndProc = FrameProc;
  wc.hInstance = instance;
  wc.hCursor = LoadCursorW(nullptr, IDC_ARROW);
  wc.hIcon = LoadIconW(nullptr, IDI_APPLICATION);
  wc.hbrBackground = reinterpret_cast<HBRUSH>(COLOR_BTNFACE + 1);
  wc.lpszClassName = kClassName;
  RegisterClassW(&wc);
  m_frame = CreateWindowExW(0, kClassName, kTitle, WS_OVERLAPPEDWINDOW | WS_CLIPCHILDREN, CW_USEDEFAULT, CW_USEDEFAULT, 1000, 720,
                            nullptr, nullptr, instance, this);
  return m_frame != nullptr;
}

void MainWindow::Show() {
  ShowWindow(m_frame, SW_SHOW);
  UpdateWindow(m_frame);
  SetFocus(m_input.Handle());
}

void MainWindow::FocusInput() {
  if (IsWindowVisible(m_frame)) SetFocus(m_input.Handle());
}

void MainWindow::AppendHistory(const std::wstring &text) {
  if (!m_history) return;
  const std::wstring converted = WithWindowsLineEnds(text);
  const LRESULT end = SendMessageW(m_history, WM_GETTEXTLENGTH, 0, 0);
  SendMessageW(m_history, EM_SETSEL, end, end);
  SendMessageW(m_history, EM_REPLACESEL, FALSE, reinterpret_cast<LPARAM>(converted.c_str()));
  SendMessageW(m_history, EM_SCROLLCARET, 0, 0);
}

LRESULT CALLBACK MainWindow::FrameProc(HWND hwnd, UINT message, WPARAM wParam, LPARAM lParam) {
  if (message == WM_NCCREATE) {
    auto *window = static_cast<MainWindow *>(reinterpret_cast<CREATESTRUCTW *>(lParam)->lpCreateParams);
    window->m_frame = hwnd;
    SetWindowLongPtrW(hwnd, GWLP_USERDATA, reinterpret_cast<LONG_PTR>(window));
  }
  auto *window = reinterpret_cast<MainWindow *>(GetWindowLongPtrW(hwnd, GWLP_USERDATA));
  if (!window) return DefWindowProcW(hwnd, message, wParam, lParam);
  switch (message) {
    case WM_CREATE: window->CreateChildren(); return 0;
    case WM_SIZE: window->Layout(); return 0;
    case WM_SETFOCUS: SetFocus(window->m_input.Handle()); return 0;
    case WM_CLOSE:
      if (window->m_onClose) window->m_onClose();
      DestroyWindow(hwnd);
      return 0;
    case WM_DESTROY: PostQuitMessage(0); return 0;
    default: return DefWindowProcW(hwnd, message, wParam, lParam);
  }
}

void MainWindow::CreateChildren() {
  HINSTANCE instance = GetModuleHandleW(nullptr);
  m_font.reset(CreateFontW(-13, 0, 0, 0, FW_NORMAL, FALSE, FALSE, FALSE, DEFAULT_CHARSET, OUT_DEFAULT_PRECIS, CLIP_DEFAULT_PRECIS,
                           DEFAULT_QUALITY, FIXED_PITCH | FF_MODERN, L"Courier New"));
  m_view = CreateDrawingView(m_frame, kViewId);
  m_history = CreateWindowExW(WS_EX_CLIENTEDGE, L"EDIT", L"",
                              WS_CHILD | WS_VISIBLE | WS_VSCROLL | ES_MULTILINE | ES_READONLY | ES_AUTOVSCROLL, 0, 0, 10, 10,
                              m_frame, reinterpret_cast<HMENU>(static_cast<INT_PTR>(kHistoryId)), instance, nullptr);
  SendMessageW(m_history, EM_SETLIMITTEXT, 0, 0);
  m_prompt = CreateWindowExW(0, L"STATIC", L"Command:", WS_CHILD | WS_VISIBLE | SS_CENTERIMAGE, 0, 0, 10, 10, m_frame, nullptr,
                             instance, nullptr);
  m_input.Create(m_frame, kInputId, m_onSubmit);
  for (HWND child : {m_history, m_prompt, m_input.Handle()})
    SendMessageW(child, WM_SETFONT, reinterpret_cast<WPARAM>(m_font.get()), TRUE);
}

void MainWindow::Layout() {
  RECT client;
  GetClientRect(m_frame, &client);
  const int width = client.right;
  const int commandTop = client.bottom > kCommandAreaHeight ? client.bottom - kCommandAreaHeight : 0;
  const int inputTop = client.bottom - kInputHeight;
  MoveWindow(m_view, 0, 0, width, commandTop, TRUE);
  MoveWindow(m_history, 0, commandTop, width, inputTop - commandTop, TRUE);
  MoveWindow(m_prompt, 4, inputTop, kPromptWidth - 4, kInputHeight, TRUE);
  MoveWindow(m_input.Handle(), kPromptWidth, inputTop, width - kPromptWidth, kInputHeight, TRUE);
}
