// The command line and alert boxes.
#include "runtime/Events.h"
#include "runtime/HostState.h"
#include "lisp/Utf8.h"

#include <cstdarg>
#include <cstdio>
#include <string>
#include <vector>

namespace {
using devhost::State;

std::wstring Format(const ACHAR *format, va_list args) {
  std::vector<wchar_t> buffer(512);
  for (;;) {
    va_list copy;
    va_copy(copy, args);
    const int written = _vsnwprintf(buffer.data(), buffer.size(), format, copy);
    va_end(copy);
    if (written >= 0 && static_cast<size_t>(written) < buffer.size()) return std::wstring(buffer.data(), written);
    if (buffer.size() >= (1u << 20)) return std::wstring(buffer.data(), buffer.size() - 1);
    buffer.resize(buffer.size() * 2);
  }
}

// One line of UTF-8, every newline written as "\n".
std::string Escaped(const std::wstring &text) {
  std::wstring line;
  for (wchar_t c : text) {
    if (c == L'\n')
      line += L"\\n";
    else
      line += c;
  }
  return lisp::ToUtf8(line);
}
}  // namespace

extern "C" {
int acutPrintf(const ACHAR *format, ...) {
  if (!format) return 0;
  va_list args;
  va_start(args, format);
  const std::wstring text = Format(format, args);
  va_end(args);
  devhost::RecordEvent(kDevhostPrint, text);
  if (State().sink) State().sink(text.c_str(), State().sinkContext);
  return static_cast<int>(text.size());
}

int acedAlert(const ACHAR *text) {
  const std::wstring message = text ? text : L"";
  devhost::RecordEvent(kDevhostAlert, message);
  if (State().batch) {
    std::fprintf(stderr, "alert: %s\n", Escaped(message).c_str());
    std::fflush(stderr);
  } else {
    // Owned by the window the person works in (a module's dialog, say): owned by the main
    // window, which a module disables, it could fall behind that dialog and leave it usable.
    HWND owner = GetActiveWindow();
    MessageBoxW(owner ? owner : State().mainFrame, message.c_str(), L"AutoCAD Message", MB_OK | MB_ICONWARNING);
  }
  return RTNORM;
}

void devhostSetOutputSink(DevhostOutputSink sink, void *context) {
  State().sink = sink;
  State().sinkContext = context;
}

void devhostSetBatchMode(bool batch) { State().batch = batch; }
}
