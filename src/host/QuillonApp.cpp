#include "host/QuillonApp.h"

#include "host/DataManager.h"
#include "host/DocData.h"
#include "host/ModuleGlobals.h"

namespace {
constexpr UINT kExplorerFrameResource = 128;

CQuillonApp theApp;
AsdkDataManager<CDocData> theDataManager;
}  // namespace

BOOL CQuillonApp::InitInstance() {
  g_hModule = GetModuleHandleA("Lumvex1.arx");
  // A copy of the module under another file name still finds its state and help files.
  if (!g_hModule) g_hModule = m_hInstance;
  return SetFrameResource(kExplorerFrameResource);
}
