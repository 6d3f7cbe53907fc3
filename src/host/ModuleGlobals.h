// Module-wide values set when the module loads and at the start of each browse call.
#pragma once

#include <windows.h>

extern HMODULE g_hModule;
extern char g_szAcceptCaption[56];
extern char g_szCancelCaption[56];
extern char g_szStartShellPath[260];
extern char g_szStartFolder[260];  // the browse call's start folder as given, empty when none
