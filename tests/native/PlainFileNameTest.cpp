// A rename takes one plain file name: each name the rule refuses, and the names it lets through.
#include "filecmd/PlainFileName.h"

#include <gtest/gtest.h>

#include <utility>
#include <vector>

namespace {
TEST(PlainFileName, EachRuleAndTheNamesItLetsThrough) {
  using R = NameRule;
  const std::vector<std::pair<NameRule, std::vector<const char *>>> rules{
      {R::Plain, {"plan2.dwg", "Plan 2 (old).DWG", ".dwg", "console.dwg", "com10.dwg", "nul-a.dwg"}},
      {R::Empty, {""}},
      {R::PathSeparator, {"a/b.dwg", "..\\moved.dwg", "c:x.dwg", "x.dwg:s"}},
      {R::ForbiddenCharacter, {"a<b.dwg", "a>b", "\"q\".dwg", "a|b", "p?.dwg", "*.dwg", "t\t.dwg", "\x1f.dwg"}},
      {R::EndsWithDotOrSpace, {"plan.dwg.", "plan.dwg ", ".."}},
      {R::ReservedDevice, {"con.dwg", "CON", "Nul.tar.gz", "aux .dwg", "prn.txt", "com1.dwg", "COM9", "LpT1.x"}}};
  for (const auto &[rule, names] : rules) {
    EXPECT_EQ(NameRuleText(rule).empty(), rule == R::Plain);
    for (const char *name : names) EXPECT_EQ(CheckPlainFileName(name), rule) << name;
  }
}
}  // namespace
