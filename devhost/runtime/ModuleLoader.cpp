// Loading the module and its drawings, as the CAD application does: LoadLibrary, code 1,
// one code 3 per open drawing; codes 4 and 2 on the way out.
#include "runtime/HostState.h"
#include "runtime/ResultBuffers.h"

namespace {
using devhost::State;

constexpr int kRequiredApiVersion = 0x170000;

template <class Function>
Function Export(HMODULE module, const char *name) {
  // FARPROC is the generic function pointer; the export's real type is known by its name.
  return reinterpret_cast<Function>(reinterpret_cast<void (*)()>(GetProcAddress(module, name)));
}

int Send(int code) {
  devhost::HostState &state = State();
  return state.entryPoint ? state.entryPoint(code, state.module) : kRetError;
}
}  // namespace

extern "C" {
int devhostLoadModule(const wchar_t *path) {
  devhost::HostState &state = State();
  if (state.module) return kDevhostAlreadyLoaded;
  HMODULE module = LoadLibraryW(path);
  if (!module) return kDevhostNoSuchModule;
  auto entryPoint = Export<devhost::EntryPointFunction>(module, "acrxEntryPoint");
  auto apiVersion = Export<int (*)()>(module, "acrxGetApiVersion");
  if (!entryPoint || !apiVersion) {
    FreeLibrary(module);
    return kDevhostNoEntryPoint;
  }
  if (apiVersion() != kRequiredApiVersion) {
    FreeLibrary(module);
    return kDevhostWrongApiVersion;
  }
  state.module = module;
  state.entryPoint = entryPoint;
  Send(kInitAppMsg);
  for (size_t i = 0; i < state.drawings.size(); ++i) {
    state.current = static_cast<int>(i);
    Send(kLoadDwgMsg);
  }
  return kDevhostLoaded;
}

void devhostUnloadModule() {
  devhost::HostState &state = State();
  while (!state.drawings.empty()) devhostCloseDrawing(static_cast<int>(state.drawings.size()) - 1);
  if (!state.module) return;
  Send(kUnloadAppMsg);
  FreeLibrary(state.module);
  state.module = nullptr;
  state.entryPoint = nullptr;
  state.unlocked = state.mdiAware = false;
  devhost::ReleaseNodes(state.result);
  state.result = nullptr;
  state.resultKind = RTNONE;
}

int devhostSendEntryMessage(int code) { return Send(code); }

int devhostOpenDrawing() {
  devhost::HostState &state = State();
  devhost::Drawing drawing;
  drawing.document = std::make_unique<AcApDocument>(state.nextSerial++);
  AcApDocument *document = drawing.document.get();
  state.drawings.push_back(std::move(drawing));
  state.current = static_cast<int>(state.drawings.size()) - 1;
  for (AcApDocManagerReactor *reactor : std::vector<AcApDocManagerReactor *>(state.reactors)) reactor->documentCreated(document);
  Send(kLoadDwgMsg);
  return state.current;
}

void devhostCloseDrawing(int index) {
  devhost::HostState &state = State();
  if (index < 0 || index >= static_cast<int>(state.drawings.size())) return;
  state.current = index;
  Send(kUnloadDwgMsg);
  AcApDocument *document = state.drawings[index].document.get();
  for (AcApDocManagerReactor *reactor : std::vector<AcApDocManagerReactor *>(state.reactors))
    reactor->documentToBeDestroyed(document);
  state.drawings.erase(state.drawings.begin() + index);
  state.current = state.drawings.empty() ? -1 : 0;
}

int devhostDrawingCount() { return static_cast<int>(State().drawings.size()); }

void devhostActivateDrawing(int index) {
  if (index >= 0 && index < devhostDrawingCount()) State().current = index;
}
}
