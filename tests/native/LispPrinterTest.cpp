#include <gtest/gtest.h>

#include <cmath>
#include <string>
#include <vector>

#include "lisp/Printer.h"
#include "lisp/Reader.h"

using lisp::Value;

TEST(LispPrinter, BrowseResultAndAtomsPrintAsAutoLisp) {
  EXPECT_EQ(lisp::Prin1(Value::List({Value::Nil(), Value::True(), Value::Int(INT32_MIN), Value::Sym(L"C:MYCMD")})),
            L"(nil T -2147483648 C:MYCMD)");
  EXPECT_EQ(lisp::Prin1(Value::Void()), L"");
  EXPECT_EQ(lisp::Prin1(Value::List({})), L"nil");
  const Value result =
      Value::List({Value::Str(L"c:\\a\\b.dwg"), Value::List({Value::Str(L"WALLS"), Value::Str(L"1"), Value::Str(L"MYCMD")})});
  EXPECT_EQ(lisp::Prin1(result), LR"(("c:\\a\\b.dwg" ("WALLS" "1" "MYCMD")))");
  EXPECT_EQ(lisp::Princ(result), LR"((c:\a\b.dwg (WALLS 1 MYCMD)))");
}

TEST(LispPrinter, RealsWithSixSignificantDigitsAndAlwaysAPoint) {
  const std::vector<std::pair<double, std::wstring>> cases = {
      {2.5, L"2.5"},
      {2.0, L"2.0"},
      {0.0, L"0.0"},
      {1.0 / 3.0, L"0.333333"},
      {123456.0, L"123456.0"},
      {1234567.0, L"1.23457e+006"},
      {1e6, L"1.0e+006"},
      {1e20, L"1.0e+020"},
      {0.0001, L"0.0001"},
      {0.00001, L"1.0e-005"},
      {-1.5e-7, L"-1.5e-007"},
      {2147483648.0, L"2.14748e+009"},
      {INFINITY, L"1.#INF"},
  };
  for (const auto &[value, text] : cases) {
    EXPECT_EQ(lisp::Prin1(Value::Real(value)), text) << value;
  }
}

TEST(LispPrinter, StringEscapesForPrin1AndRawForPrinc) {
  const std::wstring raw =
      L"q\"b\\s\nn\rr\tt\x1b"
      L"e\x01\x7f"
      L"z\u00e9";
  EXPECT_EQ(lisp::Prin1(Value::Str(raw)),
            LR"("q\"b\\s\nn\rr\tt\ee\001\177z)"
            L"\u00e9\"");
  EXPECT_EQ(lisp::Princ(Value::Str(raw)), raw);
  EXPECT_EQ(lisp::Princ(Value::List({Value::Str(L"a b"), Value::Str(L"\"")})), L"(a b \")");
}
