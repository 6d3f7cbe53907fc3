#include <gtest/gtest.h>

#include <cmath>
#include <string>

#include "lisp/Reader.h"

using lisp::Value;

namespace {

Value ReadOne(const std::wstring &source) {
  auto forms = lisp::ReadAll(source);
  EXPECT_EQ(forms.size(), 1u) << "reading " << std::string(source.begin(), source.end());
  return forms.empty() ? Value::Nil() : forms.front();
}

std::string ReadError(const std::wstring &source) {
  try {
    lisp::ReadAll(source);
  } catch (const lisp::Error &error) {
    return error.what();
  }
  return "(no error)";
}

Value Sym(const wchar_t *name) { return Value::Sym(name); }

}  // namespace

TEST(LispReader, IntegersAreThirtyTwoBitAndBiggerLiteralsBecomeReals) {
  EXPECT_EQ(ReadOne(L"42"), Value::Int(42));
  EXPECT_EQ(ReadOne(L"-7"), Value::Int(-7));
  EXPECT_EQ(ReadOne(L"+5"), Value::Int(5));
  EXPECT_EQ(ReadOne(L"007"), Value::Int(7));
  EXPECT_EQ(ReadOne(L"2147483647"), Value::Int(2147483647));
  EXPECT_EQ(ReadOne(L"-2147483648"), Value::Int(INT32_MIN));
  EXPECT_EQ(ReadOne(L"2147483648"), Value::Real(2147483648.0));
  EXPECT_EQ(ReadOne(L"-2147483649"), Value::Real(-2147483649.0));
  EXPECT_EQ(ReadOne(L"99999999999999999999"), Value::Real(1e20));
}

TEST(LispReader, RealsInEveryWrittenForm) {
  EXPECT_EQ(ReadOne(L"1.5"), Value::Real(1.5));
  EXPECT_EQ(ReadOne(L"-2."), Value::Real(-2.0));
  EXPECT_EQ(ReadOne(L".5"), Value::Real(0.5));
  EXPECT_EQ(ReadOne(L"-.25"), Value::Real(-0.25));
  EXPECT_EQ(ReadOne(L"1e3"), Value::Real(1000.0));
  EXPECT_EQ(ReadOne(L"1.5e-2"), Value::Real(0.015));
  EXPECT_EQ(ReadOne(L"2E+2"), Value::Real(200.0));
  EXPECT_EQ(ReadOne(L"1e999"), Value::Real(INFINITY));
  EXPECT_EQ(ReadOne(L"-1e999"), Value::Real(-INFINITY));
  EXPECT_EQ(ReadOne(L"1e-999"), Value::Real(0.0));
  EXPECT_EQ(ReadOne(L"0.0000001e400"), Value::Real(INFINITY));
}

TEST(LispReader, TokensThatAreNotWhollyNumbersAreSymbols) {
  EXPECT_EQ(ReadOne(L"1+"), Sym(L"1+"));
  EXPECT_EQ(ReadOne(L"-"), Sym(L"-"));
  EXPECT_EQ(ReadOne(L"1e"), Sym(L"1E"));
  EXPECT_EQ(ReadOne(L"1.2.3"), Sym(L"1.2.3"));
  EXPECT_EQ(ReadOne(L"c:MyCmd"), Sym(L"C:MYCMD"));
  EXPECT_EQ(ReadOne(L"a.b"), Sym(L"A.B"));
  EXPECT_EQ(ReadOne(L"\u00e9t\u00e9"), Sym(L"\u00c9T\u00c9"));
}

TEST(LispReader, NilAndTInAnyCase) {
  EXPECT_EQ(ReadOne(L"nil"), Value::Nil());
  EXPECT_EQ(ReadOne(L"NiL"), Value::Nil());
  EXPECT_EQ(ReadOne(L"()"), Value::Nil());
  EXPECT_EQ(ReadOne(L"t"), Value::True());
  EXPECT_EQ(ReadOne(L"T"), Value::True());
  EXPECT_EQ(ReadOne(L"tt"), Sym(L"TT"));
}

TEST(LispReader, StringEscapes) {
  EXPECT_EQ(ReadOne(LR"("a\\b\"c")"), Value::Str(L"a\\b\"c"));
  EXPECT_EQ(ReadOne(LR"("\n\r\t\e")"), Value::Str(L"\n\r\t\x1b"));
  EXPECT_EQ(ReadOne(LR"("\033[0m")"), Value::Str(L"\x1b[0m"));
  EXPECT_EQ(ReadOne(LR"("\0015")"), Value::Str(std::wstring(L"\x01") + L"5"));
  EXPECT_EQ(ReadOne(LR"("\7x")"), Value::Str(L"\x07x"));
  EXPECT_EQ(ReadOne(LR"("\101\102")"), Value::Str(L"AB"));
  EXPECT_EQ(ReadOne(LR"("\q\8")"), Value::Str(L"q8"));
  EXPECT_EQ(ReadOne(L"\"two\nlines; not a comment\""), Value::Str(L"two\nlines; not a comment"));
  EXPECT_EQ(ReadOne(L"\"\""), Value::Str(L""));
}

TEST(LispReader, ListsQuotesAndComments) {
  EXPECT_EQ(ReadOne(L"(1 (2 \"x\") nil)"),
            Value::List({Value::Int(1), Value::List({Value::Int(2), Value::Str(L"x")}), Value::Nil()}));
  EXPECT_EQ(ReadOne(L"'x"), Value::List({Sym(L"QUOTE"), Sym(L"X")}));
  EXPECT_EQ(ReadOne(L"''x"), Value::List({Sym(L"QUOTE"), Value::List({Sym(L"QUOTE"), Sym(L"X")})}));
  EXPECT_EQ(ReadOne(L"'(a 'b)"), Value::List({Sym(L"QUOTE"), Value::List({Sym(L"A"), Value::List({Sym(L"QUOTE"), Sym(L"B")})})}));
  EXPECT_EQ(ReadOne(L"(a\"b\"c)"), Value::List({Sym(L"A"), Value::Str(L"b"), Sym(L"C")}));
  EXPECT_EQ(ReadOne(L"(a;comment ) (\n b)"), Value::List({Sym(L"A"), Sym(L"B")}));
  EXPECT_EQ(ReadOne(L"(a ;| inline ) |; b)"), Value::List({Sym(L"A"), Sym(L"B")}));
  EXPECT_EQ(lisp::ReadAll(L"1 \"two\" three ; the end"), (std::vector<Value>{Value::Int(1), Value::Str(L"two"), Sym(L"THREE")}));
  EXPECT_TRUE(lisp::ReadAll(L"  ; only a comment\n\t").empty());
  EXPECT_TRUE(lisp::ReadAll(L";| never closed").empty());
}

TEST(LispReader, DottedTailsThatAreListsJoinTheList) {
  EXPECT_EQ(ReadOne(L"(a . (b c))"), Value::List({Sym(L"A"), Sym(L"B"), Sym(L"C")}));
  EXPECT_EQ(ReadOne(L"(a . nil)"), Value::List({Sym(L"A")}));
  EXPECT_EQ(ReadError(L"(a . b)"), "dotted pairs are not supported on input");
  EXPECT_EQ(ReadError(L"(. a)"), "misplaced dot on input");
  EXPECT_EQ(ReadError(L"(a . b c)"), "misplaced dot on input");
  EXPECT_EQ(ReadError(L"(a .)"), "misplaced dot on input");
  EXPECT_EQ(ReadError(L"."), "misplaced dot on input");
}

TEST(LispReader, MalformedInputMessages) {
  EXPECT_EQ(ReadError(L"(1 2"), "malformed list on input");
  EXPECT_EQ(ReadError(L"((1) (2)"), "malformed list on input");
  EXPECT_EQ(ReadError(L"(princ \"abc)"), "malformed list on input");
  EXPECT_EQ(ReadError(L"\"abc"), "malformed string on input");
  EXPECT_EQ(ReadError(L"\"abc\\"), "malformed string on input");
  EXPECT_EQ(ReadError(L"'"), "malformed list on input");
  EXPECT_EQ(ReadError(L"(a ')"), "malformed list on input");
  EXPECT_EQ(ReadError(L")"), "extra right paren on input");
  EXPECT_EQ(ReadError(L"(a))"), "extra right paren on input");
}

TEST(LispReader, NestingIsLimitedWithoutExhaustingTheStack) {
  const int limit = lisp::kMaxReadDepth;
  const Value deepest = ReadOne(std::wstring(limit, L'(') + L"1" + std::wstring(limit, L')'));
  const Value *inner = &deepest;
  for (int level = 1; level < limit; ++level) inner = &inner->items.front();
  EXPECT_EQ(*inner, Value::List({Value::Int(1)}));

  EXPECT_EQ(ReadError(std::wstring(limit + 1, L'(') + std::wstring(limit + 1, L')')), "input nested too deeply");
  EXPECT_EQ(ReadError(std::wstring(1000000, L'(')), "input nested too deeply");
  EXPECT_EQ(ReadError(std::wstring(1000000, L'\'') + L"x"), "input nested too deeply");
  EXPECT_EQ(ReadError(std::wstring(600, L'(') + std::wstring(600, L'\'') + L"x"), "input nested too deeply");
}
