// A rename takes one plain file name (each name the rule refuses, and the names it lets through),
// and a name typed without the drawing's extension keeps it.
#include "filecmd/DrawingExtension.h"
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

TEST(DrawingExtension, TheNameComesBeforeItAndANewNameWithoutItKeepsIt) {
  struct Case {
    const char *oldName, *typed, *kept;
    std::size_t nameLength;  // of the old name
  };
  for (const Case &c : {Case{"plan.dwg", "renamed", "renamed.dwg", 4}, Case{"plan.dwg", "renamed.DWG", "renamed.DWG", 4},
                        Case{"plan.dwg", "notes.txt", "notes.txt.dwg", 4}, Case{"a.b.dwg", "c", "c.dwg", 3},
                        Case{"PLAN.DWG", "x.dwg", "x.dwg", 4}, Case{"noext", "other", "other", 5},
                        Case{"plan.dwg", "", "", 4}, Case{"plan.dwg", "new.", "new.", 4}, Case{"plan.dwg", "con", "con", 4}}) {
    EXPECT_EQ(NameLengthBeforeExtension(c.oldName), c.nameLength) << c.oldName;
    EXPECT_EQ(KeepingExtension(c.typed, c.oldName), c.kept) << c.typed;
  }
}
}  // namespace
