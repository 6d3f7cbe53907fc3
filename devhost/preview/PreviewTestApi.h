// What tests and benchmarks may ask the preview painter inside devhostrt: how often it went to a
// drawing file, and how many bytes it read there.
#pragma once

#include "host/HostApi.h"

#ifndef LUMVEX_HOST_EXPORT
#define DEVHOST_PREVIEW_API LUMVEX_HOST_API
#else
#define DEVHOST_PREVIEW_API LUMVEX_HOST_EXPORT
#endif

extern "C" {
// Drawings whose preview was read and decoded (a paint served from the cache adds nothing).
DEVHOST_PREVIEW_API unsigned long devhostPreviewDecodeCount();
// Bytes read from drawing files by the painter.
DEVHOST_PREVIEW_API unsigned long long devhostPreviewBytesRead();
// Forgets every decoded preview, so the next paint of each drawing starts cold.
DEVHOST_PREVIEW_API void devhostPreviewClearCache();
}
