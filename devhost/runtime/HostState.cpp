#include "runtime/HostState.h"

#include <cstdlib>
#include <cwchar>

namespace devhost {

HostState &State() {
  static HostState state;
  return state;
}

Drawing *CurrentDrawing() {
  HostState &state = State();
  if (state.current < 0 || state.current >= static_cast<int>(state.drawings.size())) return nullptr;
  return &state.drawings[state.current];
}

resbuf *CopyChain(const resbuf *chain) {
  resbuf *head = nullptr;
  resbuf *tail = nullptr;
  for (; chain; chain = chain->rbnext) {
    resbuf *node = acutNewRb(chain->restype);
    if (!node) break;
    node->resval = chain->resval;
    if (chain->restype == RTSTR) node->resval.rstring = acad__strdup(chain->resval.rstring ? chain->resval.rstring : L"");
    (tail ? tail->rbnext : head) = node;
    tail = node;
    if (chain->restype == RTSTR && !node->resval.rstring) break;
  }
  return head;
}

}  // namespace devhost
