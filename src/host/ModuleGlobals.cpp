#include "host/ModuleGlobals.h"

HMODULE g_hModule = nullptr;
char g_szAcceptCaption[56] = "";
char g_szCancelCaption[56] = "";
char g_szStartShellPath[260] = "";
char g_szStartFolder[260] = "";
