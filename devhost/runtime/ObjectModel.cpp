// The host's system registry with its dynamic linker, and the document manager's reactors.
#include "runtime/HostState.h"

#include <algorithm>
#include <cwchar>

namespace {
using devhost::State;

class DynamicLinker final : public AcRxDynamicLinker {
 public:
  const ACHAR *className() const override { return kClassName; }
  bool unlockApplication(void *appId) const override { return Mark(appId, State().unlocked); }
  bool registerAppMDIAware(void *appId) const override { return Mark(appId, State().mdiAware); }

 private:
  static bool Mark(void *appId, bool &flag) {
    if (!appId || appId != State().module) return false;
    flag = true;
    return true;
  }
};

class SystemRegistry final : public AcRxDictionary {
 public:
  const ACHAR *className() const override { return L"AcRxDictionary"; }
  AcRxObject *at(const ACHAR *key) const override {
    static DynamicLinker linker;
    return key && std::wcscmp(key, L"DynamicLinker") == 0 ? &linker : nullptr;
  }
};

class DocManager final : public AcApDocManager {
 public:
  void addReactor(AcApDocManagerReactor *reactor) override {
    auto &reactors = State().reactors;
    if (reactor && std::find(reactors.begin(), reactors.end(), reactor) == reactors.end()) reactors.push_back(reactor);
  }
  void removeReactor(AcApDocManagerReactor *reactor) override {
    auto &reactors = State().reactors;
    reactors.erase(std::remove(reactors.begin(), reactors.end(), reactor), reactors.end());
  }
};
}  // namespace

extern "C" {
AcRxDictionary *acrxSysRegistry() {
  static SystemRegistry registry;
  return &registry;
}

AcApDocManager *acDocManagerPtr() {
  static DocManager manager;
  return &manager;
}

bool devhostModuleUnlocked() { return State().unlocked; }
bool devhostModuleMdiAware() { return State().mdiAware; }
int devhostReactorCount() { return static_cast<int>(State().reactors.size()); }
}
