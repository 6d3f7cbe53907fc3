#include "CaseTimeLimit.h"

#include <gtest/gtest.h>
#include <windows.h>

#include <cstdio>
#include <cstdlib>
#include <mutex>
#include <string>
#include <thread>
#include <utility>

namespace {
// Generous for a loaded machine: the longest case takes a few seconds.
constexpr DWORD kDefaultLimitMs = 60000;

DWORD LimitMs() {
  const char *seconds = std::getenv("LUMVEX_CASE_TIME_LIMIT");
  return seconds && std::atoi(seconds) > 0 ? static_cast<DWORD>(std::atoi(seconds)) * 1000 : kDefaultLimitMs;
}

// The clock of the running case, watched by a thread of its own. It lives as long as the
// process: its thread may still be waiting while the program's statics are destroyed.
class CaseClock {
 public:
  static CaseClock &Get() {
    static CaseClock *const clock = new CaseClock;
    return *clock;
  }

  void Start(std::string name) {
    {
      std::lock_guard<std::mutex> hold(m_lock);
      m_name = std::move(name);
    }
    SetEvent(m_hCaseStarted);
  }
  void Stop() { SetEvent(m_hCaseEnded); }

 private:
  CaseClock() { std::thread([this] { Watch(); }).detach(); }

  // Ends the program when a case outlives the limit; the lines it prints are read by the fault
  // harness.
  void Watch() {
    const DWORD limit = LimitMs();
    while (WaitForSingleObject(m_hCaseStarted, INFINITE) == WAIT_OBJECT_0) {
      if (WaitForSingleObject(m_hCaseEnded, limit) != WAIT_TIMEOUT) continue;
      std::string waits;
      {
        std::lock_guard<std::mutex> hold(NamedWaits::Get().lock);
        for (const auto &wait : NamedWaits::Get().named) waits += "\n  waiting for " + wait.second;
      }
      if (waits.empty()) waits = "\n  waiting for the code under test (no wait named)";
      std::lock_guard<std::mutex> hold(m_lock);
      std::fprintf(stdout, "[ TIMEOUT  ] %s did not end within %lu s%s\n[  FAILED  ] %s\n", m_name.c_str(),
                   static_cast<unsigned long>(limit / 1000), waits.c_str(), m_name.c_str());
      std::fflush(stdout);
      TerminateProcess(GetCurrentProcess(), 3);
    }
  }

  const HANDLE m_hCaseStarted = CreateEventA(nullptr, FALSE, FALSE, nullptr);
  const HANDLE m_hCaseEnded = CreateEventA(nullptr, FALSE, FALSE, nullptr);
  std::mutex m_lock;
  std::string m_name;
};

// Starts the clock at every case and stops it at its end.
class CaseClockListener : public ::testing::EmptyTestEventListener {
  void OnTestStart(const ::testing::TestInfo &info) override {
    CaseClock::Get().Start(std::string(info.test_suite_name()) + "." + info.name());
  }
  void OnTestEnd(const ::testing::TestInfo &) override { CaseClock::Get().Stop(); }
};

const bool kInstalled = [] {
  ::testing::UnitTest::GetInstance()->listeners().Append(new CaseClockListener);
  return true;
}();
}  // namespace
