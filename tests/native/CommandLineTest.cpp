// The development host's command line as a person types at it: lines that leave a list or a
// string open wait for the rest, bare words are command names, "!" shows a value.
#include "app/CommandSession.h"

#include <gtest/gtest.h>

#include <string>
#include <vector>

namespace {
// A command C:HELLO that prints, as a module's command would; no other external function.
std::optional<lisp::Value> Commands(const std::wstring &name, const std::vector<lisp::Value> &) {
  if (name != L"C:HELLO") return std::nullopt;
  return lisp::Value::Str(L"hello");
}

struct Typed {
  std::vector<std::wstring> lines;
  std::wstring shown;
  bool continued = false;  // every line but the last leaves the expression open
};

TEST(CommandLine, LinesWaitForTheRestBareWordsAreCommandsAndBangShowsAValue) {
  const std::vector<Typed> cases{
      {{L"(+ 1", L"2)"}, L"3\n", true},
      {{L"(strcat \"a(", L"b\")"}, L"\"a(\\nb\"\n", true},
      {{L"(+ 1 ; (", L"2)"}, L"3\n", true},
      {{L"(+ 1 2))"}, L"; error: extra right paren on input\n"},
      {{L"line"}, L"Unknown command \"LINE\".\n"},
      {{L"  Line  "}, L"Unknown command \"LINE\".\n"},
      {{L"hello"}, L"\"hello\"\n"},
      {{L"42"}, L"42\n"},
      {{L"(setq x 5)", L"!x"}, L"5\n5\n"},
      {{L"x"}, L"Unknown command \"X\".\n"},
      {{L""}, L""},
  };
  for (const Typed &typed : cases) {
    std::wstring shown;
    CommandSession session([&shown](const std::wstring &text) { shown += text; }, Commands);
    for (size_t i = 0; i < typed.lines.size(); ++i) {
      session.EnterLine(typed.lines[i]);
      EXPECT_EQ(typed.continued && i + 1 < typed.lines.size(), session.Waiting()) << typed.lines[i];
    }
    EXPECT_EQ(typed.shown, shown) << typed.lines.front();
  }
}

TEST(CommandLine, AWholeExpressionFromTheCallerIsNeverKeptWaiting) {
  std::wstring shown;
  CommandSession session([&shown](const std::wstring &text) { shown += text; }, Commands);
  session.Evaluate(L"(car (list 1");
  EXPECT_FALSE(session.Waiting());
  EXPECT_EQ(L"; error: malformed list on input\n", shown);
}
}  // namespace
