// The host's own handling of result-buffer chains.
#pragma once

#include "host/HostApi.h"

namespace devhost {
// Releases a chain without recording it: for the host's own copies, not the module's doing.
int ReleaseNodes(resbuf *chain);
}  // namespace devhost
