#include "catalogue/Ombra3Doc.h"

#include "catalogue/StateFilePath.h"
#include "catalogue/StateSizes.h"
#include "host/ModuleGlobals.h"

#include <windows.h>

COmbra3Doc *g_pDoc = nullptr;

namespace {
const char kCurrentPath[] = "CurrentPath";
const char kSize[] = "Size";
const char kView[] = "View";

// The module this code lives in: the host's handle once the module is loaded; a program that
// links the document in directly (a test) has its own executable instead.
HMODULE OwnModule() {
  if (g_hModule) return g_hModule;
  HMODULE module = nullptr;
  GetModuleHandleExA(GET_MODULE_HANDLE_EX_FLAG_FROM_ADDRESS | GET_MODULE_HANDLE_EX_FLAG_UNCHANGED_REFCOUNT,
                     reinterpret_cast<LPCSTR>(&OwnModule), &module);
  return module;
}

std::string StateFileOfThisModule() {
  char modulePath[MAX_PATH] = "";
  GetModuleFileNameA(OwnModule(), modulePath, MAX_PATH);
  return ComposeStateFilePath(modulePath);
}
}  // namespace

COmbra3Doc::COmbra3Doc() {
  g_pDoc = this;
  LoadState();
  if (m_nSplitterSize == 0) m_nSplitterSize = kDefaultSplitterSize;
}

COmbra3Doc::~COmbra3Doc() {
  SaveState();
  if (g_pDoc == this) g_pDoc = nullptr;
}

void COmbra3Doc::LoadState() {
  m_iniFile.SetFilePath(StateFileOfThisModule());
  if (!m_iniFile.Load()) return;
  // A value that is not a number reads as 0, as a plain decimal conversion gives.
  m_strPath = m_iniFile.GetString(kCurrentPath, "Path");
  m_strName = m_iniFile.GetString(kCurrentPath, "Name");
  m_strShellPath = m_iniFile.GetString(kCurrentPath, "ShellPath");
  const StateSizes sizes = ReadStateSizes(m_iniFile);
  m_nSplitterSize = sizes.splitterSize;
  m_nWindowWidth = sizes.windowWidth;
  m_nWindowHeight = sizes.windowHeight;
  m_nPictureWidth = sizes.pictureWidth;
  m_nPictureHeight = sizes.pictureHeight;
  m_nSort = m_iniFile.GetInt(kView, "Sort");
}

// A file in a folder without write access keeps its old content: the save reports nothing.
void COmbra3Doc::SaveState() {
  m_iniFile.SetString(kCurrentPath, "Path", m_strPath, true);
  m_iniFile.SetString(kCurrentPath, "Name", m_strName, true);
  m_iniFile.SetString(kCurrentPath, "ShellPath", m_strShellPath, true);
  m_iniFile.SetInt(kSize, "SplitterSize", m_nSplitterSize, true);
  m_iniFile.SetInt(kSize, "WindowWidth", m_nWindowWidth, true);
  m_iniFile.SetInt(kSize, "WindowHeight", m_nWindowHeight, true);
  m_iniFile.SetInt(kView, "PictureWidth", m_nPictureWidth, true);
  m_iniFile.SetInt(kView, "PictureHeight", m_nPictureHeight, true);
  m_iniFile.SetInt(kView, "Sort", m_nSort, true);
  m_iniFile.Save();
}
