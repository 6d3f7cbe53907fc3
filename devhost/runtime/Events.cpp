#include "runtime/Events.h"

#include "runtime/TestApi.h"
#include "lisp/Utf8.h"

#include <cstdio>
#include <utility>
#include <vector>

namespace {
struct Event {
  int kind;
  std::wstring text;
};

std::vector<Event> &Log() {
  static std::vector<Event> log;
  return log;
}
}  // namespace

namespace devhost {
void RecordEvent(int kind, std::wstring text) { Log().push_back({kind, std::move(text)}); }
}  // namespace devhost

extern "C" {
int devhostEventCount() { return static_cast<int>(Log().size()); }

int devhostEventKind(int index) {
  if (index < 0 || index >= devhostEventCount()) return 0;
  return Log()[index].kind;
}

const wchar_t *devhostEventText(int index) {
  if (index < 0 || index >= devhostEventCount()) return L"";
  return Log()[index].text.c_str();
}

void devhostClearEvents() { Log().clear(); }

void acdbFail(const ACHAR *message) {
  const std::wstring text = message ? message : L"";
  devhost::RecordEvent(kDevhostFail, text);
  std::fprintf(stderr, "fail: %s\n", lisp::ToUtf8(text).c_str());
}
}
