// Every case of a Windows test program runs under a time limit (CaseTimeLimit.cpp): a case that
// has not ended when its time is up is reported as failed with the waits it was in, and the
// program ends, so that a deadlock fails the run instead of hanging it.
#pragma once

#include <map>
#include <mutex>
#include <string>

// The waits under way on any thread, in the order they began.
struct NamedWaits {
  std::mutex lock;
  std::map<unsigned long, std::string> named;
  unsigned long next = 0;

  static NamedWaits &Get() {
    static NamedWaits waits;
    return waits;
  }
};

// Names what the code below waits for, for as long as it lives.
class WaitingFor {
 public:
  explicit WaitingFor(std::string what) {
    NamedWaits &waits = NamedWaits::Get();
    std::lock_guard<std::mutex> hold(waits.lock);
    m_nId = waits.next++;
    waits.named.emplace(m_nId, std::move(what));
  }
  ~WaitingFor() {
    NamedWaits &waits = NamedWaits::Get();
    std::lock_guard<std::mutex> hold(waits.lock);
    waits.named.erase(m_nId);
  }
  WaitingFor(const WaitingFor &) = delete;
  WaitingFor &operator=(const WaitingFor &) = delete;

 private:
  unsigned long m_nId;
};
