// A rename takes one plain file name: each name the rule refuses, and the names it lets through.
#include "filecmd/PlainFileName.h"

#include <gtest/gtest.h>

namespace {
TEST(PlainFileName, EachRuleAndTheNamesItLetsThrough) {
  using R = NameRule;
  const struct {
    const char *name;
    NameRule rule;
  } rows[] = {{"plan2.dwg", R::Plain},
              {"Plan 2 (old).DWG", R::Plain},
              {".dwg", R::Plain},
              {"console.dwg", R::Plain},
              {"com10.dwg", R::Plain},
              {"nul-a.dwg", R::Plain},
              {"", R::Empty},
              {"a/b.dwg", R::PathSeparator},
              {"..\\moved.dwg", R::PathSeparator},
              {"c:x.dwg", R::PathSeparator},
              {"x.dwg:s", R::PathSeparator},
              {"a<b.dwg", R::ForbiddenCharacter},
              {"a>b", R::ForbiddenCharacter},
              {"\"q\".dwg", R::ForbiddenCharacter},
              {"a|b", R::ForbiddenCharacter},
              {"p?.dwg", R::ForbiddenCharacter},
              {"*.dwg", R::ForbiddenCharacter},
              {"t\t.dwg", R::ForbiddenCharacter},
              {"\x1f.dwg", R::ForbiddenCharacter},
              {"plan.dwg.", R::EndsWithDotOrSpace},
              {"plan.dwg ", R::EndsWithDotOrSpace},
              {"..", R::EndsWithDotOrSpace},
              {"con.dwg", R::ReservedDevice},
              {"CON", R::ReservedDevice},
              {"Nul.tar.gz", R::ReservedDevice},
              {"aux .dwg", R::ReservedDevice},
              {"prn.txt", R::ReservedDevice},
              {"com1.dwg", R::ReservedDevice},
              {"COM9", R::ReservedDevice},
              {"LpT1.x", R::ReservedDevice}};
  for (const auto &row : rows) {
    EXPECT_EQ(CheckPlainFileName(row.name), row.rule) << row.name;
    EXPECT_EQ(NameRuleText(row.rule).empty(), row.rule == R::Plain) << row.name;
  }
}
}  // namespace
