#include "fw/WinApp.h"

extern "C" IMAGE_DOS_HEADER __ImageBase;  // the linker's name for this module's base

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

HINSTANCE AfxGetInstanceHandle() { return reinterpret_cast<HINSTANCE>(&__ImageBase); }

HINSTANCE AfxGetResourceHandle() { return g_resourceHandle; }

void AfxSetResourceHandle(HINSTANCE instance) { g_resourceHandle = instance; }

std::string AfxLoadString(UINT id) {
  // With no buffer the wide call hands out the resource's own text and its length.
  const wchar_t *resource = nullptr;
  const int length = LoadStringW(g_resourceHandle, id, reinterpret_cast<LPWSTR>(&resource), 0);
  if (length <= 0 || !resource) return std::string();
  const int bytes = WideCharToMultiByte(CP_ACP, 0, resource, length, nullptr, 0, nullptr, nullptr);
  std::string text(static_cast<size_t>(bytes > 0 ? bytes : 0), '\0');
  WideCharToMultiByte(CP_ACP, 0, resource, length, text.data(), bytes, nullptr, nullptr);
  return text;
}

CModuleStateScope::CModuleStateScope() : m_previous(g_resourceHandle) {
  if (g_application) g_resourceHandle = g_application->m_hInstance;
}

CModuleStateScope::~CModuleStateScope() { g_resourceHandle = m_previous; }

}  // namespace fw
