// devhost.exe: loads the module as the CAD application does and offers an AutoLISP command
// line, interactive or in batch (--batch --eval EXPR ...).
#include "app/CommandSession.h"
#include "app/LispBridge.h"
#include "app/MainWindow.h"
#include "app/Options.h"
#include "lisp/Utf8.h"
#include "runtime/TestApi.h"

#include "LumvexVersion.h"

#include <windows.h>
#include <commctrl.h>
#include <fcntl.h>
#include <io.h>
#include <ole2.h>
#include <shellapi.h>

#include <cstdio>
#include <string>
#include <vector>

namespace {
constexpr int kExitModuleNotLoaded = 2;
constexpr int kExitBadOptions = 64;

std::vector<std::wstring> CommandLineArguments() {
  int count = 0;
  LPWSTR *argv = CommandLineToArgvW(GetCommandLineW(), &count);
  std::vector<std::wstring> args;
  for (int i = 1; i < count; ++i) args.emplace_back(argv[i]);
  LocalFree(argv);
  return args;
}

std::wstring DefaultModulePath() {
  wchar_t path[MAX_PATH] = L"";
  const DWORD length = GetModuleFileNameW(nullptr, path, MAX_PATH);
  std::wstring folder(path, length);
  folder.erase(folder.find_last_of(L"\\/") + 1);
  return folder + L"Lumvex1.arx";
}

// Standard output and standard error carry UTF-8, whatever the ANSI code page, so that scripts
// and terminals read every character.
void Write(FILE *stream, const std::wstring &text) {
  const std::string bytes = lisp::ToUtf8(text);
  std::fwrite(bytes.data(), 1, bytes.size(), stream);
  std::fflush(stream);
}

void ForwardPrinted(const wchar_t *text, void *session) { static_cast<CommandSession *>(session)->Write(text); }

const wchar_t *LoadErrorText(int error) {
  switch (error) {
    case kDevhostNoSuchModule: return L"the file is missing or is not a loadable module";
    case kDevhostNoEntryPoint: return L"it exports no acrxEntryPoint/acrxGetApiVersion";
    case kDevhostWrongApiVersion: return L"it was built for another ObjectARX release";
    default: return L"unknown failure";
  }
}

struct OleSession {
  OleSession() { OleInitialize(nullptr); }
  ~OleSession() { OleUninitialize(); }
};

int RunInteractive(MainWindow &window, CommandSession &session, const HostOptions &options) {
  window.Show();
  for (const std::wstring &expression : options.evals) {
    session.Write(L"Command: " + expression + L"\n");
    session.Evaluate(expression);
  }
  window.FocusInput();
  MSG message;
  while (GetMessageW(&message, nullptr, 0, 0) > 0) {
    TranslateMessage(&message);
    DispatchMessageW(&message);
  }
  return 0;
}
}  // namespace

int main() {
  _setmode(_fileno(stdout), _O_BINARY);
  _setmode(_fileno(stderr), _O_BINARY);
  const HostOptions options = ParseOptions(CommandLineArguments());
  if (!options.error.empty()) {
    Write(stderr, L"devhost: " + options.error +
                      L"\nusage: devhost [--version] [--batch] [--eval EXPR]... [--module PATH] [--drawings N] [--layers NAME=COLOUR;...]\n");
    return kExitBadOptions;
  }
  if (options.version) {
    Write(stdout, L"devhost " LUMVEX_VERSION_WIDE L"\n");
    return 0;
  }

  OleSession ole;
  INITCOMMONCONTROLSEX controls{sizeof controls, ICC_WIN95_CLASSES};
  InitCommonControlsEx(&controls);
  devhostSetBatchMode(options.batch);

  MainWindow window;
  CommandSession session(
      [&window, &options](const std::wstring &text) {
        // The interactive command line is echoed on standard output too, for whoever started the host.
        Write(stdout, text);
        if (!options.batch) window.AppendHistory(text);
      },
      CallModuleFunction);
  devhostSetOutputSink(ForwardPrinted, &session);
  const bool hasWindow = window.Create(
      GetModuleHandleW(nullptr),
      [&session, &window](const std::wstring &line) {
        session.Write((session.Waiting() ? L"(_> " : L"Command: ") + line + L"\n");
        session.EnterLine(line);
        // A browse hands the keyboard to the drawing view as it ends; typing goes on here.
        window.FocusInput();
      },
      [] { devhostUnloadModule(); });
  if (hasWindow) devhostSetWindows(window.Frame(), window.DrawingView());

  for (int i = 0; i < options.drawings; ++i) {
    devhostOpenDrawing();
    if (!options.layers.empty() && !devhostSetLayers(options.layers.c_str())) {
      std::fprintf(stderr, "devhost: --layers takes NAME=COLOUR;... with colours from 1 to 255\n");
      return kExitBadOptions;
    }
  }
  const std::wstring modulePath = options.modulePath.empty() ? DefaultModulePath() : options.modulePath;
  const int loaded = devhostLoadModule(modulePath.c_str());
  if (loaded != kDevhostLoaded) {
    Write(stderr, L"devhost: cannot load " + modulePath + L": " + LoadErrorText(loaded) + L"\n");
    return kExitModuleNotLoaded;
  }

  if (!options.batch && hasWindow) return RunInteractive(window, session, options);

  for (const std::wstring &expression : options.evals) session.Evaluate(expression);
  devhostUnloadModule();
  if (hasWindow) DestroyWindow(window.Frame());
  return 0;
}
