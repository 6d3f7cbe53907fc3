// The module's DllMain: static objects are constructed by then; the application object is
// initialised on load and told to exit on unload, as the framework does for a DLL.
#include "fw/WinApp.h"

extern "C" BOOL WINAPI DllMain(HINSTANCE instance, DWORD reason, LPVOID) {
  fw::CWinApp *application = fw::AfxGetApp();
  switch (reason) {
    case DLL_PROCESS_ATTACH:
      DisableThreadLibraryCalls(instance);
      fw::AfxSetResourceHandle(instance);
      if (!application) return TRUE;
      application->m_hInstance = instance;
      return application->InitInstance();
    case DLL_PROCESS_DETACH:
      if (application) application->ExitInstance();
      return TRUE;
    default: return TRUE;
  }
}
