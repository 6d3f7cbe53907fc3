// Result buffers as the host keeps them: malloc'ed nodes and texts, released chain-wise.
#include "runtime/ResultBuffers.h"

#include "runtime/Events.h"
#include "runtime/TestApi.h"

#include <cstdarg>
#include <cstdlib>
#include <cstring>
#include <cwchar>
#include <string>

namespace {
long g_liveNodes = 0;
long g_allocationsBeforeFailure = -1;

bool AllocationAllowed() {
  if (g_allocationsBeforeFailure < 0) return true;
  if (g_allocationsBeforeFailure == 0) return false;
  --g_allocationsBeforeFailure;
  return true;
}

bool CarriesText(short type) { return type == RTSTR; }

}  // namespace

namespace devhost {
int ReleaseNodes(resbuf *chain) {
  int released = 0;
  while (chain) {
    resbuf *next = chain->rbnext;
    if (CarriesText(chain->restype)) std::free(chain->resval.rstring);
    std::free(chain);
    --g_liveNodes;
    ++released;
    chain = next;
  }
  return released;
}
}  // namespace devhost

extern "C" {
long devhostLiveResbufCount() { return g_liveNodes; }

void devhostFailAllocationsAfter(long count) { g_allocationsBeforeFailure = count; }

resbuf *acutNewRb(int type) {
  if (!AllocationAllowed()) return nullptr;
  auto *node = static_cast<resbuf *>(std::calloc(1, sizeof(resbuf)));
  if (!node) return nullptr;
  node->restype = static_cast<short>(type);
  ++g_liveNodes;
  return node;
}

ACHAR *acad__strdup(const ACHAR *text) {
  if (!text || !AllocationAllowed()) return nullptr;
  const size_t bytes = (std::wcslen(text) + 1) * sizeof(ACHAR);
  auto *copy = static_cast<ACHAR *>(std::malloc(bytes));
  if (copy) std::memcpy(copy, text, bytes);
  return copy;
}

int acutRelRb(resbuf *chain) {
  if (!chain) return RTNORM;
  const int released = devhost::ReleaseNodes(chain);
  devhost::RecordEvent(kDevhostRelease, std::to_wstring(released));
  return RTNORM;
}

resbuf *acutBuildList(int type, ...) {
  va_list args;
  va_start(args, type);
  resbuf *head = nullptr;
  resbuf *tail = nullptr;
  bool failed = false;
  for (; type != 0 && !failed; type = va_arg(args, int)) {
    resbuf *node = acutNewRb(type);
    if (!node) {
      failed = true;
      break;
    }
    (tail ? tail->rbnext : head) = node;
    tail = node;
    switch (type) {
      case RTSHORT: node->resval.rint = static_cast<short>(va_arg(args, int)); break;
      case RTLONG: node->resval.rlong = va_arg(args, int32_t); break;
      case RTREAL:
      case RTANG:
      case RTORINT: node->resval.rreal = va_arg(args, double); break;
      case RTSTR: {
        const ACHAR *text = va_arg(args, const ACHAR *);
        node->resval.rstring = acad__strdup(text ? text : L"");
        failed = node->resval.rstring == nullptr;
        break;
      }
      case RTPOINT:
      case RT3DPOINT: {
        const double *point = va_arg(args, const double *);
        for (int i = 0; i < 3; ++i) node->resval.rpoint[i] = point ? point[i] : 0.0;
        break;
      }
      case RTENAME:
      case RTPICKS: {
        const int64_t *name = va_arg(args, const int64_t *);
        for (int i = 0; i < 2; ++i) node->resval.rlname[i] = name ? name[i] : 0;
        break;
      }
      case RTLB:
      case RTLE:
      case RTDOTE:
      case RTNIL:
      case RTT:
      case RTVOID:
      case RTNONE: break;
      default: failed = true; break;  // a type this host does not know: the rest cannot be read
    }
  }
  va_end(args);
  if (failed) {
    devhost::ReleaseNodes(head);
    return nullptr;
  }
  return head;
}
}
