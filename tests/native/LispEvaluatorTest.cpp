#include <gtest/gtest.h>

#include <optional>
#include <string>
#include <tuple>
#include <vector>

#include "lisp/Evaluator.h"
#include "lisp/Printer.h"
#include "lisp/Reader.h"

using lisp::Value;

namespace {

// A command line: every form of the input evaluated in order, as the host's session does.
class LispEvaluator : public ::testing::Test {
 protected:
  LispEvaluator()
      : m_evaluator(
            [this](const std::wstring &name, const std::vector<Value> &args) -> std::optional<Value> {
              calls.push_back(Value::List({Value::Sym(name), Value::List(args)}));
              if (name == L"LUMVEX") return Value::List({Value::Str(L"picked"), Value::List(args)});
              if (name == L"QUIET") return Value::Void();
              return std::nullopt;
            },
            [this](const std::wstring &text) { output += text; }) {}

  // The last form's result as prin1 writes it.
  std::wstring Run(const std::wstring &source) { return Session(m_evaluator, source); }
  static std::wstring Session(lisp::Evaluator &evaluator, const std::wstring &source) {
    Value result;
    for (const Value &form : lisp::ReadAll(source)) result = evaluator.Eval(form);
    return lisp::Prin1(result);
  }

  // The message of the error the source ends with.
  std::wstring Fails(const std::wstring &source) {
    try {
      Run(source);
    } catch (const lisp::Error &error) {
      return lisp::WideMessage(error);
    }
    return L"(no error)";
  }

  lisp::Evaluator m_evaluator;
  std::vector<Value> calls;
  std::wstring output;
};

}  // namespace

// Each row's source runs in a session of its own; its last result as prin1 writes it, or the
// error it ends with.
TEST_F(LispEvaluator, VariablesListsArithmeticAndComparisons) {
  const std::pair<const wchar_t *, const char *> rows[] = {
      {L"(setq a 1 b \"two\") (list a b never-set)", "(1 \"two\" nil)"},
      {L"(setq a 1) (setq a nil) a", "nil"},
      {L"'(car x)", "(CAR X)"},
      {L"(setq a)", "error: too few arguments"},
      {L"(setq 1 2)", "error: bad argument type: symbolp 1"},
      {L"(quote a b)", "error: too many arguments"},
      {L"(list (car nil) (cdr '(1)) (cadr '(1)) (car (cadddr '(1 2 3 (4)))) (cdr (cddr '(1 2 3 (4)))))", "(nil nil nil 4 ((4)))"},
      {L"(list (cons 0 '(1 2)) (cons 0 nil) (length '(1 2 3)) (length nil))", "((0 1 2) (0) 3 0)"},
      {L"(list (nth 1 '(a b)) (nth 2 '(a b)) (nth -1 '(a b)))", "(B nil nil)"},
      {L"(list (atom 1) (atom nil) (atom '(1)) (listp nil) (listp 1))", "(T T nil T nil)"},
      {L"(list (not nil) (null 0) (equal '(1 \"a\") (list 1 \"a\")))", "(T nil T)"},
      {L"(car \"a\")", "error: bad argument type: consp \"a\""},
      {L"(nth 1.0 '(a))", "error: bad argument type: fixnump: 1.0"},
      {L"(cons 1 2)", "error: dotted pairs are not supported"},
      {L"(list (+ 1 2) (+ 1 2.5) (- 10 1 2) (- 5) (* 2 3.0))", "(3 3.5 7 -5 6.0)"},
      {L"(list (/ 7 2) (/ -7 2) (/ 7 2 2.0) (/ 1.0 3) (+) (*) (/ 4))", "(3 -3 1.5 0.333333 0 0 4)"},
      {L"(list (+ 2147483647 1) (/ -2147483648 -1) (1+ 1) (1- 1.5))", "(-2147483648 -2147483648 2 0.5)"},
      {L"(/ 1 0)", "error: divide by zero"},
      {L"(+ 1 \"a\")", "error: bad argument type: numberp: \"a\""},
      {L"(list (= 1 1.0) (= 1 2) (= \"a\" \"a\") (= \"a\" 1) (/= 1 2))", "(T nil T nil T)"},
      {L"(list (< 1 2 3) (< 1 3 2) (> 2.5 2) (<= 2 2) (>= 1 2) (< \"a\" \"b\"))", "(T nil T T nil T)"},
      {L"(1 2)", "error: bad function: 1"},
      {L"((car x))", "error: bad function: (CAR X)"}};
  for (const auto &[source, expected] : rows) {
    lisp::Evaluator session(nullptr, nullptr);
    std::string outcome;
    try {
      const std::wstring printed = Session(session, source);
      outcome.assign(printed.begin(), printed.end());
    } catch (const lisp::Error &error) {
      outcome = std::string("error: ") + error.what();
    }
    EXPECT_EQ(outcome, expected) << source;
  }
}

// Each row: the source, its last result as prin1 writes it, and what it printed.
TEST_F(LispEvaluator, StrcatPrincAndPrin1) {
  const std::tuple<const wchar_t *, const wchar_t *, const wchar_t *> rows[] = {
      {L"(strcat \"a\" \"\\\\\" \"b\")", LR"("a\\b")", L""},
      {L"(strcat)", L"\"\"", L""},
      {L"(princ \"a\\\\b\")", LR"("a\\b")", L"a\\b"},
      {L"(prin1 \"a\\\\b\")", LR"("a\\b")", LR"("a\\b")"},
      {L"(princ '(\"x\" 1))", L"(\"x\" 1)", L"(x 1)"},
      {L"(print 5) (terpri) (princ 1.0 nil)", L"1.0", L"\n5 \n1.0"},
      {L"(list (princ))", L"(nil)", L""}};
  for (const auto &[source, result, printed] : rows) {
    output.clear();
    EXPECT_EQ(Run(source), result) << source;
    EXPECT_EQ(output, printed) << source;
  }
  EXPECT_EQ(m_evaluator.Eval(lisp::ReadAll(L"(princ)").front()), Value::Void());
  EXPECT_EQ(Fails(L"(strcat \"a\" 1)"), L"bad argument type: stringp 1");
  EXPECT_EQ(Fails(L"(princ 1 \"file\")"), L"bad argument type: streamp \"file\"");
}

TEST_F(LispEvaluator, ExternalFunctionsGetTheUpperCasedNameAndEvaluatedArguments) {
  EXPECT_EQ(Run(L"(setq dir \"Z:\\\\work\\\\\") (Lumvex 0 (+ 1 1) dir \"Insert\" (princ))"),
            LR"(("picked" (0 2 "Z:\\work\\" "Insert" nil)))");
  ASSERT_EQ(calls.size(), 1u);
  EXPECT_EQ(lisp::Prin1(calls[0]), LR"((LUMVEX (0 2 "Z:\\work\\" "Insert" nil)))");

  EXPECT_EQ(m_evaluator.Eval(lisp::ReadAll(L"(quiet)").front()), Value::Void());
  EXPECT_EQ(Fails(L"(foo 1 (car \"x\"))"), L"bad argument type: consp \"x\"");
  EXPECT_EQ(Fails(L"(foo (princ \"evaluated first\"))"), L"no function definition: FOO");
  EXPECT_EQ(output, L"evaluated first");

  lisp::Evaluator withoutModule(nullptr, nullptr);
  EXPECT_THROW(withoutModule.Eval(lisp::ReadAll(L"(lumvex)").front()), lisp::Error);
  EXPECT_EQ(withoutModule.Eval(lisp::ReadAll(L"(princ 1)").front()), Value::Int(1));
}

// Messages are UTF-8 inside lisp::Error; names and printed values beyond ASCII, and characters
// beyond 16 bits, come back intact as wide text.
TEST_F(LispEvaluator, ErrorMessagesKeepWideText) {
  EXPECT_EQ(Fails(L"(caf\u00e9 1)"), L"no function definition: CAF\u00c9");
  EXPECT_EQ(Fails(L"(strcat \"a\" 'caf\u00e9)"), L"bad argument type: stringp CAF\u00c9");
  EXPECT_EQ(Fails(L"(\"\U0001F600\u4e2d\")"), L"bad function: \"\U0001F600\u4e2d\"");
}

TEST_F(LispEvaluator, NestingDepthIsBounded) {
  const int limit = lisp::kMaxEvalDepth;
  std::wstring nested = L"1";
  for (int level = 0; level < limit; ++level) nested = L"(list " + nested + L")";
  EXPECT_NO_THROW(Run(nested));

  Value form = Value::Int(1);
  for (int level = 0; level <= limit; ++level) {
    std::vector<Value> call;
    call.push_back(Value::Sym(L"LIST"));
    call.push_back(std::move(form));
    form = Value::List(std::move(call));
  }
  EXPECT_THROW(m_evaluator.Eval(form), lisp::Error);
}
