#include "host/RunLumvex.h"

#include "fw/WinApp.h"
#include "host/HostApi.h"
#include "host/LumvexArgs.h"
#include "host/ModuleGlobals.h"
#include "host/StartShellPath.h"
#include "host/TextConvert.h"

namespace {
constexpr size_t kArgumentChars = 260;

void StoreCaption(const ACHAR *argument, const char *fallback, char *caption, size_t capacity) {
  CopyAnsiCut(*argument ? ToAnsi(argument) : std::string(fallback), caption, capacity);
}

void FocusDrawingView() {
  if (HWND view = static_cast<HWND>(acedGetAcadDwgView())) SetFocus(view);
}
}  // namespace

int RunLumvex() {
  fw::CModuleStateScope moduleState;

  int first = 0;
  int second = 0;
  ACHAR folder[kArgumentChars] = L"";
  ACHAR accept[kArgumentChars] = L"";
  ACHAR cancel[kArgumentChars] = L"";
  if (!ReadLumvexArgs(first, second, {folder, kArgumentChars}, {accept, kArgumentChars}, {cancel, kArgumentChars}))
    return 0;

  StoreCaption(accept, "Ok", g_szAcceptCaption, sizeof g_szAcceptCaption);
  StoreCaption(cancel, "Cancel", g_szCancelCaption, sizeof g_szCancelCaption);

  g_szStartShellPath[0] = '\0';
  const std::string startFolder = ToAnsi(folder);
  if (!startFolder.empty()) MakeStartShellPath(startFolder.c_str(), g_szStartShellPath, sizeof g_szStartShellPath);

  // The explorer is not part of this module yet: the browse ends as a cancelled one does.
  acedRetNil();
  FocusDrawingView();
  return 1;
}
