// The development host's main window: a drawing area (the active drawing view) above an
// AutoLISP command line made of a history pane and an input line.
#pragma once

#include "app/CommandInput.h"

#include <windows.h>

#include <functional>
#include <memory>
#include <type_traits>
#include <string>

class MainWindow {
 public:
  using CloseHandler = std::function<void()>;

  bool Create(HINSTANCE instance, CommandInput::SubmitHandler onSubmit, CloseHandler onClose);
  HWND Frame() const { return m_frame; }
  HWND DrawingView() const { return m_view; }
  void AppendHistory(const std::wstring &text);
  void Show();
  void FocusInput();

 private:
  static LRESULT CALLBACK FrameProc(HWND hwnd, UINT message, WPARAM wParam, LPARAM lParam);
  void CreateChildren();
  void Layout();

  HWND m_frame = nullptr;
  HWND m_view = nullptr;
  HWND m_history = nullptr;
  HWND m_prompt = nullptr;
  struct FontDelete {
    void operator()(HFONT font) const { DeleteObject(font); }
  };
  std::unique_ptr<std::remove_pointer_t<HFONT>, FontDelete> m_font;
  CommandInput m_input;
  CommandInput::SubmitHandler m_onSubmit;
  CloseHandler m_onClose;
};
