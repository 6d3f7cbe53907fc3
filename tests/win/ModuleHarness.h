// Loads Lumvex1.arx into the development host's runtime for one test, and reads back what the
// module asked of the host.
#pragma once

#include "runtime/TestApi.h"

#include <windows.h>

#include <ostream>
#include <string>
#include <vector>

inline std::wstring ProgramFolder() {
  wchar_t path[MAX_PATH] = L"";
  const DWORD length = GetModuleFileNameW(nullptr, path, MAX_PATH);
  std::wstring folder(path, length);
  return folder.substr(0, folder.find_last_of(L"\\/") + 1);
}

class LoadedModule {
 public:
  explicit LoadedModule(int drawings = 1) {
    devhostSetBatchMode(true);  // alerts as lines on standard error, not message boxes
    for (int i = 0; i < drawings; ++i) devhostOpenDrawing();
    m_loadResult = devhostLoadModule((ProgramFolder() + L"Lumvex1.arx").c_str());
    devhostClearEvents();
  }
  ~LoadedModule() {
    devhostUnloadModule();
    devhostClearEvents();
  }
  LoadedModule(const LoadedModule &) = delete;
  LoadedModule &operator=(const LoadedModule &) = delete;

  int LoadResult() const { return m_loadResult; }

 private:
  int m_loadResult;
};

struct HostEvent {
  int kind;
  std::wstring text;
  bool operator==(const HostEvent &other) const { return kind == other.kind && text == other.text; }
};

inline std::ostream &operator<<(std::ostream &out, const HostEvent &event) {
  static const char *const kNames[] = {"?", "print", "alert", "fail", "release"};
  out << kNames[event.kind >= 1 && event.kind <= 4 ? event.kind : 0] << "(";
  for (wchar_t c : event.text) out << (c == L'\n' ? std::string("\\n") : std::string(1, static_cast<char>(c)));
  return out << ")";
}

inline std::vector<HostEvent> HostEvents() {
  std::vector<HostEvent> events;
  for (int i = 0; i < devhostEventCount(); ++i) events.push_back({devhostEventKind(i), devhostEventText(i)});
  return events;
}

inline HostEvent Printed(const wchar_t *text) { return {kDevhostPrint, text}; }
inline HostEvent Alerted(const wchar_t *text) { return {kDevhostAlert, text}; }
inline HostEvent Released(int nodes) { return {kDevhostRelease, std::to_wstring(nodes)}; }
