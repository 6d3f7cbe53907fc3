// The command line's input box: Enter submits the line, Up and Down walk earlier lines.
#pragma once

#include <windows.h>

#include <functional>
#include <string>
#include <vector>

class CommandInput {
 public:
  using SubmitHandler = std::function<void(const std::wstring &line)>;

  bool Create(HWND parent, int id, SubmitHandler onSubmit);
  HWND Handle() const { return m_hwnd; }

 private:
  static LRESULT CALLBACK SubclassProc(HWND hwnd, UINT message, WPARAM wParam, LPARAM lParam, UINT_PTR id, DWORD_PTR self);
  bool OnKey(WPARAM key);
  void Recall(int step);
  void Submit();

  HWND m_hwnd = nullptr;
  SubmitHandler m_onSubmit;
  std::vector<std::wstring> m_history;
  size_t m_recall = 0;  // index into m_history; m_history.size() means the new, empty line
};
