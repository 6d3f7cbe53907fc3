// The result-list builder over the host's result buffers: chain shape, ownership, copies and
// allocation failures.
#include "host/AdsListUser.h"
#include "runtime/TestApi.h"

#include <gtest/gtest.h>

#include <cwchar>
#include <string>
#include <vector>

namespace {
const resbuf *g_returned = nullptr;
int g_returnCalls = 0;
}  // namespace

// The host copies what it is given; here the test only needs to see what was passed.
extern "C" int acedRetList(const resbuf *chain) {
  g_returned = chain;
  ++g_returnCalls;
  return RTNORM;
}

namespace {
std::vector<short> Types(const resbuf *chain) {
  std::vector<short> types;
  for (; chain; chain = chain->rbnext) types.push_back(chain->restype);
  return types;
}

std::vector<std::wstring> Failures() {
  std::vector<std::wstring> failures;
  for (int i = 0; i < devhostEventCount(); ++i)
    if (devhostEventKind(i) == kDevhostFail) failures.emplace_back(devhostEventText(i));
  return failures;
}

class AdsListUserTest : public ::testing::Test {
 protected:
  void SetUp() override {
    devhostClearEvents();
    devhostFailAllocationsAfter(-1);
    m_liveBefore = devhostLiveResbufCount();
  }
  void TearDown() override {
    devhostFailAllocationsAfter(-1);
    EXPECT_EQ(devhostLiveResbufCount(), m_liveBefore) << "every node is released with its list";
  }
  long m_liveBefore = 0;
};

TEST_F(AdsListUserTest, NestedListOfTextsFromListBeginToListEndWalkedThenHandedOverButStillOwned) {
  ads_list_user list;
  list + acutBuildList(RTLB, 0) + L"WALLS" + L"1" + L"MYCMD" + acutBuildList(RTLE, 0);
  EXPECT_EQ(Types(list.head()), (std::vector<short>{RTLB, RTSTR, RTSTR, RTSTR, RTLE}));
  EXPECT_EQ(list.tail()->restype, RTLE);
  EXPECT_EQ(list.tail()->rbnext, nullptr);
  EXPECT_EQ(list.rewind(), list.head());
  EXPECT_EQ(list.next()->restype, RTLB);
  EXPECT_STREQ(list.next()->resval.rstring, L"WALLS");
  for (int i = 0; i < 3; ++i) list.next();
  EXPECT_EQ(list.next(), nullptr);
  EXPECT_EQ(list.next(), nullptr);
  list.retList();
  EXPECT_EQ(g_returned, list.head());
  EXPECT_FALSE(list.isEmpty());
}

TEST_F(AdsListUserTest, TypedAppendsStoreTheirValues) {
  ads_list_user list;
  const long pair[2] = {-1, 2};
  const ads_point point = {1.5, -2.5, 3.0};
  list + ads_int(-7) + 100000L + 2.5 + pair + point;
  EXPECT_EQ(Types(list.head()), (std::vector<short>{RTSHORT, RTLONG, RTREAL, RTENAME, RT3DPOINT}));
  const resbuf *node = list.head();
  EXPECT_EQ(node->resval.rint, -7);
  EXPECT_EQ((node = node->rbnext)->resval.rlong, 100000);
  EXPECT_EQ((node = node->rbnext)->resval.rreal, 2.5);
  node = node->rbnext;
  EXPECT_EQ(node->resval.rlname[0], -1) << "each half is sign-extended";
  EXPECT_EQ(node->resval.rlname[1], 2);
  node = node->rbnext;
  EXPECT_EQ(node->resval.rpoint[1], -2.5);
}

TEST_F(AdsListUserTest, EmptyListPassesNullAndReleasesNothing) {
  g_returnCalls = 0;
  {
    ads_list_user list;
    EXPECT_TRUE(list.isEmpty());
    EXPECT_EQ(list.head(), nullptr);
    list.retList();
    EXPECT_EQ(g_returned, nullptr);
  }
  EXPECT_EQ(g_returnCalls, 1);
  EXPECT_EQ(devhostEventCount(), 0) << "no release recorded for an empty list";
}

TEST_F(AdsListUserTest, AdoptedChainIsOwnedAndAppendedChainsMoveTheTail) {
  ads_list_user list(acutBuildList(RTSTR, L"x", RTSHORT, 3, 0));
  EXPECT_EQ(list.tail()->restype, RTSHORT);
  list + acutBuildList(RTLB, RTREAL, 1.0, RTLE, 0);
  EXPECT_EQ(Types(list.head()), (std::vector<short>{RTSTR, RTSHORT, RTLB, RTREAL, RTLE}));
  EXPECT_EQ(ads_list_user::lastOf(list.head()), list.tail());
  EXPECT_EQ(list.tail()->restype, RTLE);
}

TEST_F(AdsListUserTest, CopiesDuplicateTextsAndLeaveTheSourceCursorAtItsEnd) {
  ads_list_user source;
  source + L"one" + ads_int(2);
  ads_list_user copy(source);
  EXPECT_EQ(source.next(), nullptr) << "the copy walked the source with its cursor";
  ASSERT_EQ(Types(copy.head()), Types(source.head()));
  EXPECT_NE(copy.head()->resval.rstring, source.head()->resval.rstring);
  EXPECT_STREQ(copy.head()->resval.rstring, L"one");

  resbuf *node = ads_list_user::copyNode(source.head());
  EXPECT_STREQ(node->resval.rstring, L"one");
  EXPECT_EQ(node->rbnext, nullptr);
  acutRelRb(node);
}

TEST_F(AdsListUserTest, FailedAllocationsAreReportedAndSkipped) {
  ads_list_user list;
  list + ads_int(1);
  devhostFailAllocationsAfter(0);
  list + ads_int(2) + 3L + 4.0 + L"text";
  const long pair[2] = {1, 2};
  const ads_point point = {0, 0, 0};
  list + pair + point;
  devhostFailAllocationsAfter(-1);
  list + ads_int(5);
  EXPECT_EQ(Types(list.head()), (std::vector<short>{RTSHORT, RTSHORT}));
  EXPECT_EQ(list.tail()->resval.rint, 5);
  EXPECT_EQ(Failures(), (std::vector<std::wstring>{
                            L"\n Error of allocate memory ads_list_user & operator + (ads_int)",
                            L"\n Error of allocate memory ads_list_user & operator + (long )",
                            L"\n Error of allocate memory ads_list_user & operator + (ads_real)",
                            L"\n Error of allocate memory ads_list_user & operator + (char * )",
                            L"\n Error of allocate memory ads_list_user & operator + (long r[2])",
                            L"\n Error of allocate memory ads_list_user & operator + (ads_point)",
                        }));
}

TEST_F(AdsListUserTest, CopyGoesOnPastANodeThatCannotBeCopied) {
  ads_list_user source;
  source + L"first" + L"second";
  devhostFailAllocationsAfter(1);  // the first node copies, its text does not
  ads_list_user copy(source);
  devhostFailAllocationsAfter(-1);
  EXPECT_EQ(Failures().size(), 2u);
  EXPECT_EQ(Failures().front(), L"\n Error of allocate memory ads_list_user(ads_list_user &");
  EXPECT_TRUE(copy.isEmpty());
}
}  // namespace
