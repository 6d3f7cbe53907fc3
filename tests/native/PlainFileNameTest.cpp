// A rename takes one plain file name: each name the rule refuses, and the names it lets through.
#include "filecmd/PlainFileName.h"

#include <gtest/gtest.h>

namespace {
TEST(PlainFileName, EachRuleAndTheNamesItLetsThrough) {
  const struct {
    const char *name;
    NameRule rule;
  } rows[] = {{"plan2.dwg", NameRule::Plain},
              {"Plan 2 (old).DWG", NameRule::Plain},
              {".dwg", NameRule::Plain},
              {"console.dwg", NameRule::Plain},  // only the device name itself is reserved
              {"com10.dwg", NameRule::Plain},
              {"lpt0.dwg", NameRule::Plain},
              {"nul-a.dwg", NameRule::Plain},
              {"", NameRule::Empty},
              {"a/b.dwg", NameRule::PathSeparator},
              {"..\\moved.dwg", NameRule::PathSeparator},
              {"c:x.dwg", NameRule::PathSeparator},
              {"x.dwg:stream", NameRule::PathSeparator},
              {"a<b.dwg", NameRule::ForbiddenCharacter},
              {"a>b.dwg", NameRule::ForbiddenCharacter},
              {"say \"hi\".dwg", NameRule::ForbiddenCharacter},
              {"a|b.dwg", NameRule::ForbiddenCharacter},
              {"plan?.dwg", NameRule::ForbiddenCharacter},
              {"*.dwg", NameRule::ForbiddenCharacter},
              {"tab\there.dwg", NameRule::ForbiddenCharacter},
              {"\x1f.dwg", NameRule::ForbiddenCharacter},
              {"plan.dwg.", NameRule::EndsWithDotOrSpace},
              {"plan.dwg ", NameRule::EndsWithDotOrSpace},
              {"..", NameRule::EndsWithDotOrSpace},
              {"con.dwg", NameRule::ReservedDevice},
              {"CON", NameRule::ReservedDevice},
              {"Nul.tar.gz", NameRule::ReservedDevice},
              {"aux .dwg", NameRule::ReservedDevice},
              {"prn.txt", NameRule::ReservedDevice},
              {"com1.dwg", NameRule::ReservedDevice},
              {"COM9", NameRule::ReservedDevice},
              {"lpt1.dwg", NameRule::ReservedDevice},
              {"LpT9.x", NameRule::ReservedDevice}};
  for (const auto &row : rows) {
    EXPECT_EQ(CheckPlainFileName(row.name), row.rule) << row.name;
    EXPECT_EQ(NameRuleText(row.rule).empty(), row.rule == NameRule::Plain) << row.name;
  }
}
}  // namespace
