// The application object of a module: constructed statically, initialised when the module loads.
#pragma once

#include <windows.h>

#include <string>

namespace fw {

class CWnd;

class CWinApp {
 public:
  CWinApp();
  virtual ~CWinApp();
  CWinApp(const CWinApp &) = delete;
  CWinApp &operator=(const CWinApp &) = delete;

  virtual BOOL InitInstance() { return TRUE; }
  virtual int ExitInstance() { return 0; }

  HINSTANCE m_hInstance = nullptr;
  // The window that posted application messages go to (the modal dialog while it runs).
  CWnd *m_pMainWnd = nullptr;
};

CWinApp *AfxGetApp();
// The module this layer is linked into: its window classes are registered there, so that two
// modules using the layer, or two copies of one module, never share or replace a class.
HINSTANCE AfxGetInstanceHandle();
// The module whose dialogs, menus and strings are loaded.
HINSTANCE AfxGetResourceHandle();
void AfxSetResourceHandle(HINSTANCE instance);
// A string of the current resource module in ANSI text, whatever its length; empty when there
// is none.
std::string AfxLoadString(UINT id);

// Makes this module's resources current for the lifetime of the scope, restoring the previous
// ones after: a host calls into several modules on one thread.
class CModuleStateScope {
 public:
  CModuleStateScope();
  ~CModuleStateScope();
  CModuleStateScope(const CModuleStateScope &) = delete;
  CModuleStateScope &operator=(const CModuleStateScope &) = delete;

 private:
  HINSTANCE m_previous;
};

}  // namespace fw
