// The development host's own interface: how devhost.exe drives the module and how tests read
// what the module asked of the host. Plain C so it crosses the DLL boundary safely.
#pragma once

#include "host/HostApi.h"

#ifndef LUMVEX_HOST_EXPORT
#define DEVHOST_API LUMVEX_HOST_API
#else
#define DEVHOST_API LUMVEX_HOST_EXPORT
#endif

extern "C" {
// Result buffers: nodes made by acutNewRb/acutBuildList/acad__strdup copies and not yet released.
DEVHOST_API long devhostLiveResbufCount();
// Makes the allocation after the next `count` ones fail (acutNewRb and acad__strdup return null);
// a negative count turns failures off.
DEVHOST_API void devhostFailAllocationsAfter(long count);

// Modules and drawings. Results: 0 on success, otherwise a non-zero reason.
enum DevhostLoadError : int {
  kDevhostLoaded = 0,
  kDevhostNoSuchModule = 1,
  kDevhostNoEntryPoint = 2,
  kDevhostWrongApiVersion = 3,
  kDevhostAlreadyLoaded = 4,
};
DEVHOST_API int devhostLoadModule(const wchar_t *path);  // LoadLibrary, then entry code 1
DEVHOST_API void devhostUnloadModule();                  // code 4 per open drawing, code 2, FreeLibrary
DEVHOST_API int devhostSendEntryMessage(int code);       // the module's answer
DEVHOST_API int devhostOpenDrawing();                    // a new current drawing, code 3; its index
DEVHOST_API void devhostCloseDrawing(int index);         // code 4 in that drawing, then it is destroyed
DEVHOST_API int devhostDrawingCount();
DEVHOST_API void devhostActivateDrawing(int index);
DEVHOST_API bool devhostIsDefined(int drawing, const wchar_t *name);
DEVHOST_API bool devhostModuleUnlocked();
DEVHOST_API bool devhostModuleMdiAware();
DEVHOST_API int devhostReactorCount();

// AutoLISP calls. `args` is taken over by the host. Returns false when no function of that name
// (compared without case) is defined in the current drawing.
DEVHOST_API bool devhostInvoke(const wchar_t *name, resbuf *args);
DEVHOST_API bool devhostInvokeCode(int funcCode, resbuf *args);
// The result of the last call: RTNONE for void, RTNIL, or RTLB/the type of a single value; a copy
// of the chain (for a list) that the caller releases with acutRelRb.
DEVHOST_API int devhostResultKind();
DEVHOST_API resbuf *devhostResultCopy();
DEVHOST_API void devhostClearResult();

// What the module said. Events are recorded in order; the text stays valid until devhostClearEvents.
enum DevhostEventKind : int { kDevhostPrint = 1, kDevhostAlert = 2, kDevhostFail = 3, kDevhostRelease = 4 };
DEVHOST_API int devhostEventCount();
DEVHOST_API int devhostEventKind(int index);
DEVHOST_API const wchar_t *devhostEventText(int index);
DEVHOST_API void devhostClearEvents();

// Presentation: where printed text goes, and whether an alert is a message box (interactive)
// or one line on standard error (batch).
typedef void (*DevhostOutputSink)(const wchar_t *text, void *context);
DEVHOST_API void devhostSetOutputSink(DevhostOutputSink sink, void *context);
DEVHOST_API void devhostSetBatchMode(bool batch);

// The current drawing's layer table, from "NAME=COLOUR;NAME=COLOUR..." (colours 1 to 255);
// false, with the table unchanged, when the text is malformed or no drawing is open.
DEVHOST_API bool devhostSetLayers(const wchar_t *spec);

// The host's windows, as the module asks for them.
DEVHOST_API void devhostSetWindows(void *mainFrame, void *drawingView);
}
