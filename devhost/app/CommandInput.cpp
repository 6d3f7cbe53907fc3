#include "app/CommandInput.h"

#include <commctrl.h>

bool CommandInput::Create(HWND parent, int id, SubmitHandler onSubmit) {
  m_onSubmit = std::move(onSubmit);
  m_hwnd = CreateWindowExW(WS_EX_CLIENTEDGE, L"EDIT", L"", WS_CHILD | WS_VISIBLE | WS_TABSTOP | ES_AUTOHSCROLL, 0, 0, 10, 10,
                           parent, reinterpret_cast<HMENU>(static_cast<INT_PTR>(id)), GetModuleHandleW(nullptr), nullptr);
  return m_hwnd && SetWindowSubclass(m_hwnd, SubclassProc, 1, reinterpret_cast<DWORD_PTR>(this));
}

LRESULT CALLBACK CommandInput::SubclassProc(HWND hwnd, UINT message, WPARAM wParam, LPARAM lParam, UINT_PTR, DWORD_PTR self) {
  auto *input = reinterpret_cast<CommandInput *>(self);
  switch (message) {
    case WM_GETDLGCODE: return DefSubclassProc(hwnd, message, wParam, lParam) | DLGC_WANTALLKEYS;
    case WM_KEYDOWN:
      if (input->OnKey(wParam)) return 0;
      break;
    case WM_CHAR:
      if (wParam == L'\r' || wParam == L'\n') return 0;  // no beep for the Enter already handled
      break;
    case WM_NCDESTROY: RemoveWindowSubclass(hwnd, SubclassProc, 1); break;
    default: break;
  }
  return DefSubclassProc(hwnd, message, wParam, lParam);
}

bool CommandInput::OnKey(WPARAM key) {
  switch (key) {
    case VK_RETURN: Submit(); return true;
    case VK_UP: Recall(-1); return true;
    case VK_DOWN: Recall(+1); return true;
    default: return false;
  }
}

void CommandInput::Recall(int step) {
  if (step < 0 && m_recall == 0) return;
  if (step > 0 && m_recall >= m_history.size()) return;
  m_recall += step;
  const std::wstring &line = m_recall < m_history.size() ? m_history[m_recall] : std::wstring();
  SetWindowTextW(m_hwnd, line.c_str());
  const int end = static_cast<int>(line.size());
  SendMessageW(m_hwnd, EM_SETSEL, end, end);
}

void CommandInput::Submit() {
  const int length = GetWindowTextLengthW(m_hwnd);
  std::wstring line(static_cast<size_t>(length) + 1, L'\0');
  GetWindowTextW(m_hwnd, line.data(), length + 1);
  line.resize(static_cast<size_t>(length));
  SetWindowTextW(m_hwnd, L"");
  if (!line.empty() && (m_history.empty() || m_history.back() != line)) m_history.push_back(line);
  m_recall = m_history.size();
  if (m_onSubmit) m_onSubmit(line);
}
