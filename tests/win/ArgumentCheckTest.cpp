// (Lumvex short short string string string): every path of the argument check, with the
// texts printed and alerted in their order, and every node released.
#include "ModuleHarness.h"

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

  LoadedModule m_module;
  long m_liveBefore = 0;
};

TEST_F(ArgumentCheck, NoArgumentsAtAll) {
  EXPECT_EQ(Call(nullptr), (std::vector<HostEvent>{Printed(kMissing), Alerted(kMissing)}));
  EXPECT_EQ(devhostResultKind(), RTNONE);
}

TEST_F(ArgumentCheck, FirstArgumentNotAShort) {
  EXPECT_EQ(Call(acutBuildList(RTSTR, L"0", RTSHORT, 0, RTSTR, L"", RTSTR, L"", RTSTR, L"", 0)),
            (std::vector<HostEvent>{Printed(kWrongType), Alerted(kWrongType), Released(5)}));
  EXPECT_EQ(Call(acutBuildList(RTLONG, 70000, 0)), (std::vector<HostEvent>{Printed(kWrongType), Alerted(kWrongType), Released(1)}));
  EXPECT_EQ(devhostResultKind(), RTNONE);
}

TEST_F(ArgumentCheck, MissingSecondToFifthArgument) {
  EXPECT_EQ(Call(acutBuildList(RTSHORT, 0, 0)), (std::vector<HostEvent>{Printed(kMissing), Alerted(kMissing), Released(1)}));
  EXPECT_EQ(Call(acutBuildList(RTSHORT, 0, RTSHORT, 0, RTSTR, L"", RTSTR, L"", 0)),
            (std::vector<HostEvent>{Printed(kMissing), Alerted(kMissing), Released(4)}));
  EXPECT_EQ(devhostResultKind(), RTNONE);
}

TEST_F(ArgumentCheck, WrongTypeAtAnyLaterPositionReleasesFirstThenAlertsThenPrints) {
  const std::vector<HostEvent> expected{Released(5), Alerted(kWrongType), Printed(kWrongType)};
  EXPECT_EQ(Call(acutBuildList(RTSHORT, 0, RTSTR, L"0", RTSTR, L"", RTSTR, L"", RTSTR, L"", 0)), expected);
  EXPECT_EQ(Call(acutBuildList(RTSHORT, 0, RTSHORT, 0, RTSHORT, 1, RTSTR, L"", RTSTR, L"", 0)), expected);
  EXPECT_EQ(Call(acutBuildList(RTSHORT, 0, RTSHORT, 0, RTSTR, L"", RTREAL, 1.0, RTSTR, L"", 0)), expected);
  EXPECT_EQ(Call(acutBuildList(RTSHORT, 0, RTSHORT, 0, RTSTR, L"", RTSTR, L"", RTNIL, 0)), expected);
  EXPECT_EQ(devhostResultKind(), RTNONE);
}

TEST_F(ArgumentCheck, WellTypedCallReleasesItsArgumentsAndGivesNil) {
  EXPECT_EQ(Call(acutBuildList(RTSHORT, 0, RTSHORT, -3, RTSTR, L"", RTSTR, L"", RTSTR, L"", 0)),
            (std::vector<HostEvent>{Released(5)}));
  EXPECT_EQ(devhostResultKind(), RTNIL);
}

TEST_F(ArgumentCheck, ExtraArgumentsAreIgnored) {
  EXPECT_EQ(Call(acutBuildList(RTSHORT, 0, RTSHORT, 0, RTSTR, L"", RTSTR, L"", RTSTR, L"", RTSHORT, 7, RTSTR, L"x", 0)),
            (std::vector<HostEvent>{Released(7)}));
  EXPECT_EQ(devhostResultKind(), RTNIL);
}

TEST_F(ArgumentCheck, OverlongTextsAreCutNotOverrun) {
  const std::wstring longText(5000, L'x');
  const std::wstring longFolder = L"C:\\" + std::wstring(4000, L'd') + L"\\";
  EXPECT_EQ(Call(acutBuildList(RTSHORT, 0, RTSHORT, 0, RTSTR, longFolder.c_str(), RTSTR, longText.c_str(), RTSTR,
                               longText.c_str(), 0)),
            (std::vector<HostEvent>{Released(5)}));
  EXPECT_EQ(devhostResultKind(), RTNIL);
}

}  // namespace
