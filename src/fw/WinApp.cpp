#include "fw/WinApp.h"

namespace fw {
namespace {
CWinApp *g_application = nullptr;
HINSTANCE g_resourceHandle = nullptr;
}  // namespace

CWinApp::CWinApp() { g_application = this; }

CWinApp::~CWinApp() {
  if (g_application == this) g_application = nullptr;
}

CWinApp *AfxGetApp() { return g_application; }

HINSTANCE AfxGetResourceHandle() { return g_resourceHandle; }

void AfxSetResourceHandle(HINSTANCE instance) { g_resourceHandle = instance; }

CModuleStateScope::CModuleStateScope() : m_previous(g_resourceHandle) {
  if (g_application) g_resourceHandle = g_application->m_hInstance;
}

CModuleStateScope::~CModuleStateScope() { g_resourceHandle = m_previous; }

}  // namespace fw
