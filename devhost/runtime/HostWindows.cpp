// The host's main frame, application object and drawing view.
#include "runtime/HostState.h"

namespace {
class HostApplication final : public CWinAppHost {
 public:
  void *mainWindow() const override { return devhost::State().mainFrame; }
};
}  // namespace

extern "C" {
void *acedGetAcadFrame() { return devhost::State().mainFrame; }

CWinAppHost *acedGetAcadWinApp() {
  static HostApplication application;
  return &application;
}

void *acedGetAcadDwgView() { return devhost::State().drawingView; }

void devhostSetWindows(void *mainFrame, void *drawingView) {
  devhost::State().mainFrame = static_cast<HWND>(mainFrame);
  devhost::State().drawingView = static_cast<HWND>(drawingView);
}
}
