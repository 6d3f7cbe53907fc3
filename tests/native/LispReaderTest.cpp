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

TEST(LispReader, NumbersSymbolsNilAndT) {
  const std::pair<const wchar_t *, Value> rows[] = {
      {L"+5", Value::Int(5)},
      {L"007", Value::Int(7)},
      {L"2147483647", Value::Int(INT32_MAX)},
      {L"-2147483648", Value::Int(INT32_MIN)},
      {L"2147483648", Value::Real(2147483648.0)},  // past 32 bits an integer literal is a real
      {L"99999999999999999999", Value::Real(1e20)},
      {L"-.25", Value::Real(-0.25)},
      {L"1.5e-2", Value::Real(0.015)},
      {L"2E+2", Value::Real(200.0)},
      {L"1e999", Value::Real(INFINITY)},
      {L"1e-999", Value::Real(0.0)},
      {L"0.0000001e400", Value::Real(INFINITY)},
      {L"1+", Sym(L"1+")},
      {L"c:MyCmd", Sym(L"C:MYCMD")},
      {L"\u00e9t\u00e9", Sym(L"\u00c9T\u00c9")},
      {L"NiL", Value::Nil()},
      {L"t", Value::True()},
      {L"tt", Sym(L"TT")}};
  for (const auto &[source, value] : rows) EXPECT_EQ(ReadOne(source), value) << source;
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
