#include "host/RunLumvex.h"

#include "explorer/DialogRun.h"
#include "explorer/MdiMixin.h"
#include "fw/WinApp.h"
#include "host/AdsListUser.h"
#include "host/HostApi.h"
#include "host/LumvexArgs.h"
#include "host/ModuleGlobals.h"
#include "host/StartShellPath.h"
#include "host/TextConvert.h"
#include "settings/IniFile.h"

namespace {
constexpr size_t kArgumentChars = 260;

void StoreCaption(const ACHAR *argument, const char *fallback, char *caption, size_t capacity) {
  CopyAnsiCut(*argument ? ToAnsi(argument) : std::string(fallback), caption, capacity);
}

// The result list: ("folder\\name.dwg" ("layer" "colour" "command")) from the folder's settings.
void ReturnChosenDrawing(CMdiMixin &app) {
  const std::string path = app.GetFullPath();
  ads_list_user result;
  result + ToWide(path.c_str()).c_str();
  CIniFile settings;
  settings.SetFilePath(app.GetFolderPath() + "datains.ini");
  result + acutBuildList(RTLB, 0);
  if (settings.Load()) {
    const std::string layer = settings.GetString("Default Parameters", "Layer");
    const std::string command = settings.GetString("Default Parameters", "Lisp command");
    const std::string colour = settings.GetString("Default Parameters", "Color");
    result + ToWide(layer.c_str()).c_str() + ToWide(colour.c_str()).c_str() + ToWide(command.c_str()).c_str();
  } else {
    result + L"" + L"" + L"";
  }
  result + acutBuildList(RTLE, 0);
  result.retList();
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
  if (!ReadLumvexArgs(first, second, {folder, kArgumentChars}, {accept, kArgumentChars}, {cancel, kArgumentChars})) return 0;

  StoreCaption(accept, "Ok", g_szAcceptCaption, sizeof g_szAcceptCaption);
  StoreCaption(cancel, "Cancel", g_szCancelCaption, sizeof g_szCancelCaption);

  g_szStartShellPath[0] = '\0';
  const std::string startFolder = ToAnsi(folder);
  if (!startFolder.empty()) MakeStartShellPath(startFolder.c_str(), g_szStartShellPath, sizeof g_szStartShellPath);
  CopyAnsiCut(startFolder.size() < sizeof g_szStartFolder ? startFolder : std::string(), g_szStartFolder,
              sizeof g_szStartFolder);

  auto *app = dynamic_cast<CMdiMixin *>(fw::AfxGetApp());
  CDialogRun dialog;
  if (app && dialog.DoModal() == 1) {
    ReturnChosenDrawing(*app);
  } else {
    acedRetNil();
  }
  if (app) app->DeleteDocument();
  // The modal run enables again only the window that was active when it began; the host's
  // main frame must not stay disabled when that was another window (or none).
  if (HWND hostFrame = static_cast<HWND>(acedGetAcadFrame())) EnableWindow(hostFrame, TRUE);
  FocusDrawingView();
  return 1;
}
