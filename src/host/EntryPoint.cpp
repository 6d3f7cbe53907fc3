// The module's entry point: the host's messages for the module's life and each AutoLISP call.
#include "host/HostApi.h"
#include "host/LispFunctions.h"

namespace {
constexpr int kObjectArxApiVersion = 0x170000;  // ObjectARX release 23

void InitApplication(void *appId) {
  AcRxDictionary *registry = acrxSysRegistry();
  AcRxDynamicLinker *linker = registry ? AcRxDynamicLinker::cast(registry->at(L"DynamicLinker")) : nullptr;
  if (!linker) return;
  linker->unlockApplication(appId);
  linker->registerAppMDIAware(appId);
}

void DefineFunctions() {
  for (size_t i = 0; i < g_lispFunctionCount; ++i) acedDefun(g_lispFunctions[i].name, static_cast<int>(i));
}

void UndefineFunctions() {
  for (size_t i = 0; i < g_lispFunctionCount; ++i) acedUndef(g_lispFunctions[i].name, static_cast<int>(i));
}

void InvokeFunction() {
  acedRetVoid();
  const int code = acedGetFunCode();
  if (code >= 0 && static_cast<size_t>(code) < g_lispFunctionCount) g_lispFunctions[code].handler();
}
}  // namespace

extern "C" __declspec(dllexport) int acrxEntryPoint(int message, void *appId) {
  try {
    switch (message) {
      case kInitAppMsg: InitApplication(appId); break;
      case kLoadDwgMsg: DefineFunctions(); break;
      case kUnloadDwgMsg: UndefineFunctions(); break;
      case kInvkSubrMsg: InvokeFunction(); break;
      default: break;
    }
  } catch (...) {
    // Nothing may unwind into the host; the call simply gives LISP no result of its own.
  }
  return kRetOK;
}

extern "C" __declspec(dllexport) int acrxGetApiVersion() { return kObjectArxApiVersion; }
