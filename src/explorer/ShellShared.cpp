#include "explorer/ShellShared.h"

IMalloc *g_pShellMalloc = nullptr;
IShellFolder *g_pDesktopFolder = nullptr;

namespace {
int g_nMallocRefs = 0;
int g_nDesktopRefs = 0;

template <class T>
void Release(T *&shared, int &refs) {
  if (--refs > 0) return;
  refs = 0;
  if (shared) shared->Release();
  shared = nullptr;
}
}  // namespace

CShellMallocRef::CShellMallocRef() {
  if (!g_pShellMalloc) SHGetMalloc(&g_pShellMalloc);
  ++g_nMallocRefs;
}

CShellMallocRef::~CShellMallocRef() { Release(g_pShellMalloc, g_nMallocRefs); }

CDesktopFolderRef::CDesktopFolderRef() {
  if (!g_pDesktopFolder) SHGetDesktopFolder(&g_pDesktopFolder);
  ++g_nDesktopRefs;
}

CDesktopFolderRef::~CDesktopFolderRef() { Release(g_pDesktopFolder, g_nDesktopRefs); }
