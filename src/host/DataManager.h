// Per-drawing records, dropped when the host destroys a drawing. Registers with the host's
// document manager for its whole life.
#pragma once

#include "host/HostApi.h"

#include <map>

template <class T>
class AsdkDataManager : public AcApDocManagerReactor {
 public:
  AsdkDataManager() {
    if (AcApDocManager *manager = acDocManagerPtr()) manager->addReactor(this);
  }
  ~AsdkDataManager() override {
    if (AcApDocManager *manager = acDocManagerPtr()) manager->removeReactor(this);
  }
  AsdkDataManager(const AsdkDataManager &) = delete;
  AsdkDataManager &operator=(const AsdkDataManager &) = delete;

  void documentToBeDestroyed(AcApDocument *document) override { m_records.erase(document); }

 private:
  std::map<AcApDocument *, T> m_records;
};
