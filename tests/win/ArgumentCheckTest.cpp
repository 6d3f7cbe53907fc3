// (Lumvex short short string string string): every path of the argument check, with the
// texts printed and alerted in their order, and every node released.
#include "ExplorerHarness.h"

#include <gtest/gtest.h>

#include <string>

namespace {
const wchar_t *const kMissing = L"\nMissing parametrs\n";
const wchar_t *const kWrongType = L"\nArgument should be an short";

class ArgumentCheck : public ::testing::Test {
 protected:
  void SetUp() override {
    ASSERT_EQ(m_module.LoadResult(), kDevhostLoaded);
    m_liveBefore = devhostLiveResbufCount();
  }
  void TearDown() override {
    devhostClearResult();
    EXPECT_EQ(devhostLiveResbufCount(), m_liveBefore) << "a node was left unreleased";
  }

  // Calls Lumvex with the chain and returns what the host was asked, in order.
  std::vector<HostEvent> Call(resbuf *args) {
    devhostClearEvents();
    EXPECT_TRUE(devhostInvoke(L"Lumvex", args));
    return HostEvents();
  }

  // A well-typed call opens the explorer: a watcher cancels it as soon as it shows.
  std::vector<HostEvent> CallAndCancel(resbuf *args) {
    devhostClearEvents();
    std::vector<HostEvent> events;
    const BrowseOutcome outcome = Browse(args, [](HWND frame) { PostMessageA(frame, WM_COMMAND, 32796, 0); });
    EXPECT_TRUE(outcome.watcherFoundFrame);
    m_resultKind = outcome.resultKind;
    return HostEvents();
  }

  StateFileGuard m_state;
  LoadedModule m_module;
  long m_liveBefore = 0;
  int m_resultKind = 0;
};

// Missing arguments print, then alert, then release; a first argument of the wrong type too.
TEST_F(ArgumentCheck, MissingArgumentsOrAFirstArgumentNotAShort) {
  const std::pair<resbuf *, std::vector<HostEvent>> rows[] = {
      {nullptr, {Printed(kMissing), Alerted(kMissing)}},
      {acutBuildList(RTSTR, L"0", RTSHORT, 0, RTSTR, L"", RTSTR, L"", RTSTR, L"", 0),
       {Printed(kWrongType), Alerted(kWrongType), Released(5)}},
      {acutBuildList(RTLONG, 70000, 0), {Printed(kWrongType), Alerted(kWrongType), Released(1)}},
      {acutBuildList(RTSHORT, 0, 0), {Printed(kMissing), Alerted(kMissing), Released(1)}},
      {acutBuildList(RTSHORT, 0, RTSHORT, 0, RTSTR, L"", RTSTR, L"", 0), {Printed(kMissing), Alerted(kMissing), Released(4)}}};
  for (const auto &[args, events] : rows) {
    EXPECT_EQ(Call(args), events);
    EXPECT_EQ(devhostResultKind(), RTNONE);
  }
}

TEST_F(ArgumentCheck, WrongTypeAtAnyLaterPositionReleasesFirstThenAlertsThenPrints) {
  const std::vector<HostEvent> expected{Released(5), Alerted(kWrongType), Printed(kWrongType)};
  EXPECT_EQ(Call(acutBuildList(RTSHORT, 0, RTSTR, L"0", RTSTR, L"", RTSTR, L"", RTSTR, L"", 0)), expected);
  EXPECT_EQ(Call(acutBuildList(RTSHORT, 0, RTSHORT, 0, RTSHORT, 1, RTSTR, L"", RTSTR, L"", 0)), expected);
  EXPECT_EQ(Call(acutBuildList(RTSHORT, 0, RTSHORT, 0, RTSTR, L"", RTREAL, 1.0, RTSTR, L"", 0)), expected);
  EXPECT_EQ(Call(acutBuildList(RTSHORT, 0, RTSHORT, 0, RTSTR, L"", RTSTR, L"", RTNIL, 0)), expected);
  EXPECT_EQ(devhostResultKind(), RTNONE);
}

TEST_F(ArgumentCheck, ArgumentsAreCheckedOneByOneSoAnEarlierWrongTypeBeatsALaterGap) {
  const std::vector<HostEvent> wrongType{Released(2), Alerted(kWrongType), Printed(kWrongType)};
  EXPECT_EQ(Call(acutBuildList(RTSHORT, 0, RTSTR, L"x", 0)), wrongType);
  EXPECT_EQ(Call(acutBuildList(RTSHORT, 0, RTSHORT, 0, RTSHORT, 1, 0)),
            (std::vector<HostEvent>{Released(3), Alerted(kWrongType), Printed(kWrongType)}));
  EXPECT_EQ(Call(acutBuildList(RTSHORT, 0, RTSHORT, 0, RTSTR, L"a", 0)),
            (std::vector<HostEvent>{Printed(kMissing), Alerted(kMissing), Released(3)}));
  EXPECT_EQ(devhostResultKind(), RTNONE);
}

TEST_F(ArgumentCheck, WellTypedCallReleasesItsArgumentsAndGivesNilWhenCancelled) {
  EXPECT_EQ(CallAndCancel(acutBuildList(RTSHORT, 0, RTSHORT, -3, RTSTR, L"", RTSTR, L"", RTSTR, L"", 0)),
            (std::vector<HostEvent>{Released(5)}));
  EXPECT_EQ(m_resultKind, RTNIL);
}

TEST_F(ArgumentCheck, ExtraArgumentsAreIgnored) {
  EXPECT_EQ(CallAndCancel(acutBuildList(RTSHORT, 0, RTSHORT, 0, RTSTR, L"", RTSTR, L"", RTSTR, L"", RTSHORT, 7, RTSTR, L"x", 0)),
            (std::vector<HostEvent>{Released(7)}));
  EXPECT_EQ(m_resultKind, RTNIL);
}

TEST_F(ArgumentCheck, OverlongTextsAreCutNotOverrun) {
  const std::wstring longText(5000, L'x');
  const std::wstring longFolder = L"C:\\" + std::wstring(4000, L'd') + L"\\";
  std::vector<std::string> captions;
  devhostClearEvents();
  Browse(acutBuildList(RTSHORT, 0, RTSHORT, 0, RTSTR, longFolder.c_str(), RTSTR, longText.c_str(), RTSTR, longText.c_str(), 0),
         [&](HWND frame) {
           const std::vector<HWND> bars = ToolBars(frame);
           if (bars.size() == 2)
             for (HWND caption : Children(bars[1], "STATIC")) captions.push_back(WindowText(caption));
           PostMessageA(frame, WM_COMMAND, 32796, 0);
         });
  EXPECT_EQ(HostEvents(), (std::vector<HostEvent>{Released(5)}));
  EXPECT_EQ(captions, (std::vector<std::string>(2, std::string(55, 'x')))) << "cut to the 56-byte caption buffers";
}

}  // namespace
