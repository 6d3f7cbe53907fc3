#include "CaseTimeLimit.h"

#include <gtest/gtest.h>
#include <windows.h>

#include <cstdio>
#include <cstdlib>
#include <mutex>
#include <thread>

namespace {
// Generous for a loaded machine: the longest case takes a few seconds.
constexpr DWORD kDefaultLimitMs = 60000;

DWORD LimitMs() {
  const char *seconds = std::getenv("LUMVEX_CASE_TIME_LIMIT");
  return seconds && std::atoi(seconds) > 0 ? static_cast<DWORD>(std::atoi(seconds)) * 1000 : kDefaultLimitMs;
}

// Starts the clock at every case and stops it at its end; a watch thread ends the program when
// a case outlives the limit. The line it prints is read by the fault harness.
class CaseClock : public ::testing::EmptyTestEventListener {
 public:
  CaseClock() : m_hCaseEnded(CreateEventA(nullptr, FALSE, FALSE, nullptr)), m_hCaseStarted(CreateEventA(nullptr, FALSE, FALSE, nullptr)) {
    std::thread([this] { Watch(); }).detach();
  }

 private:
  void OnTestStart(const ::testing::TestInfo &info) override {
    {
      std::lock_guard<std::mutex> hold(m_lock);
      m_name = std::string(info.test_suite_name()) + "." + info.name();
    }
    SetEvent(m_hCaseStarted);
  }
  void OnTestEnd(const ::testing::TestInfo &) override { SetEvent(m_hCaseEnded); }

  void Watch() {
    const DWORD limit = LimitMs();
    for (;;) {
      WaitForSingleObject(m_hCaseStarted, INFINITE);
      if (WaitForSingleObject(m_hCaseEnded, limit) == WAIT_OBJECT_0) continue;
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

  HANDLE m_hCaseEnded, m_hCaseStarted;  // for the program's life
  std::mutex m_lock;
  std::string m_name;
};

const bool kInstalled = [] {
  ::testing::UnitTest::GetInstance()->listeners().Append(new CaseClock);
  return true;
}();
}  // namespace
