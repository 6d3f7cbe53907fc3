#include <gtest/gtest.h>

#include <optional>
#include <string>
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
  std::wstring Run(const std::wstring &source) {
    Value result;
    for (const Value &form : lisp::ReadAll(source)) result = m_evaluator.Eval(form);
    return lisp::Prin1(result);
  }

  std::wstring WideFailure(const std::wstring &source) {
    try {
      Run(source);
    } catch (const lisp::Error &error) {
      return lisp::WideMessage(error);
    }
    return L"(no error)";
  }

  std::string Fails(const std::wstring &source) {
    try {
      Run(source);
    } catch (const lisp::Error &error) {
      return error.what();
    }
    return "(no error)";
  }

  lisp::Evaluator m_evaluator;
  std::vector<Value> calls;
  std::wstring output;
};

}  // namespace

TEST_F(LispEvaluator, SetqThenCadr) {
  EXPECT_EQ(Run(LR"((setq x (list 1 2.5 "a\\b" (list "c"))))"), LR"((1 2.5 "a\\b" ("c")))");
  EXPECT_EQ(Run(L"(cadr x)"), L"2.5");
  EXPECT_EQ(Run(L"x"), LR"((1 2.5 "a\\b" ("c")))");
  EXPECT_EQ(Run(L"(car (cadddr x))"), L"\"c\"");
  EXPECT_EQ(Run(L"(cdr (cddr x))"), LR"((("c")))");
}

TEST_F(LispEvaluator, VariablesAndSelfEvaluatingAtoms) {
  EXPECT_EQ(Run(L"(setq a 1 b \"two\" c 'sym)"), L"SYM");
  EXPECT_EQ(Run(L"(list a b c never-set)"), L"(1 \"two\" SYM nil)");
  EXPECT_EQ(Run(L"(setq a nil)"), L"nil");
  EXPECT_EQ(Run(L"a"), L"nil");
  EXPECT_EQ(Run(L"(list 1 1.5 \"s\" T nil)"), L"(1 1.5 \"s\" T nil)");
  EXPECT_EQ(Run(L"'(car x)"), L"(CAR X)");
  EXPECT_EQ(Run(L"(setq)"), L"nil");
  EXPECT_EQ(Fails(L"(setq a)"), "too few arguments");
  EXPECT_EQ(Fails(L"(setq 1 2)"), "bad argument type: symbolp 1");
  EXPECT_EQ(Fails(L"(quote)"), "too few arguments");
  EXPECT_EQ(Fails(L"(quote a b)"), "too many arguments");
}

TEST_F(LispEvaluator, ListFunctions) {
  EXPECT_EQ(Run(L"(car nil)"), L"nil");
  EXPECT_EQ(Run(L"(cdr '(1))"), L"nil");
  EXPECT_EQ(Run(L"(cadr '(1))"), L"nil");
  EXPECT_EQ(Run(L"(cons 0 '(1 2))"), L"(0 1 2)");
  EXPECT_EQ(Run(L"(cons 0 nil)"), L"(0)");
  EXPECT_EQ(Run(L"(length '(1 2 3))"), L"3");
  EXPECT_EQ(Run(L"(length nil)"), L"0");
  EXPECT_EQ(Run(L"(nth 1 '(a b))"), L"B");
  EXPECT_EQ(Run(L"(nth 2 '(a b))"), L"nil");
  EXPECT_EQ(Run(L"(nth -1 '(a b))"), L"nil");
  EXPECT_EQ(Run(L"(list (atom 1) (atom nil) (atom '(1)) (listp nil) (listp 1))"), L"(T T nil T nil)");
  EXPECT_EQ(Run(L"(list (not nil) (null 0) (equal '(1 \"a\") (list 1 \"a\")))"), L"(T nil T)");
  EXPECT_EQ(Fails(L"(car \"a\")"), "bad argument type: consp \"a\"");
  EXPECT_EQ(Fails(L"(length 5)"), "bad argument type: listp 5");
  EXPECT_EQ(Fails(L"(nth 1.0 '(a))"), "bad argument type: fixnump: 1.0");
  EXPECT_EQ(Fails(L"(cons 1 2)"), "dotted pairs are not supported");
  EXPECT_EQ(Fails(L"(car)"), "too few arguments");
  EXPECT_EQ(Fails(L"(car nil nil)"), "too many arguments");
}

TEST_F(LispEvaluator, Arithmetic) {
  EXPECT_EQ(Run(L"(+ 1 2)"), L"3");
  EXPECT_EQ(Run(L"(+ 1 2.5)"), L"3.5");
  EXPECT_EQ(Run(L"(- 10 1 2)"), L"7");
  EXPECT_EQ(Run(L"(- 5)"), L"-5");
  EXPECT_EQ(Run(L"(* 2 3.0)"), L"6.0");
  EXPECT_EQ(Run(L"(/ 7 2)"), L"3");
  EXPECT_EQ(Run(L"(/ -7 2)"), L"-3");
  EXPECT_EQ(Run(L"(/ 7 2 2.0)"), L"1.5");
  EXPECT_EQ(Run(L"(/ 1.0 3)"), L"0.333333");
  EXPECT_EQ(Run(L"(list (+) (*) (/ 4))"), L"(0 0 4)");
  EXPECT_EQ(Run(L"(+ 2147483647 1)"), L"-2147483648");
  EXPECT_EQ(Run(L"(/ -2147483648 -1)"), L"-2147483648");
  EXPECT_EQ(Run(L"(list (1+ 1) (1- 1.5))"), L"(2 0.5)");
  EXPECT_EQ(Fails(L"(/ 1 0)"), "divide by zero");
  EXPECT_EQ(Fails(L"(/ 1.0 0.0)"), "divide by zero");
  EXPECT_EQ(Fails(L"(+ 1 \"a\")"), "bad argument type: numberp: \"a\"");
  EXPECT_EQ(Fails(L"(- nil)"), "bad argument type: numberp: nil");
}

TEST_F(LispEvaluator, Comparisons) {
  EXPECT_EQ(Run(L"(list (= 1 1.0) (= 1 2) (= \"a\" \"a\") (= \"a\" 1) (/= 1 2))"), L"(T nil T nil T)");
  EXPECT_EQ(Run(L"(list (< 1 2 3) (< 1 3 2) (> 2.5 2) (<= 2 2) (>= 1 2) (< \"a\" \"b\"))"), L"(T nil T T nil T)");
  EXPECT_EQ(Fails(L"(< 1 \"a\")"), "bad argument type: numberp: \"a\"");
  EXPECT_EQ(Fails(L"(=)"), "too few arguments");
}

TEST_F(LispEvaluator, StrcatPrincAndPrin1) {
  EXPECT_EQ(Run(L"(strcat \"a\" \"\\\\\" \"b\")"), LR"("a\\b")");
  EXPECT_EQ(Run(L"(strcat)"), L"\"\"");
  EXPECT_EQ(Fails(L"(strcat \"a\" 1)"), "bad argument type: stringp 1");

  EXPECT_EQ(Run(L"(princ \"a\\\\b\")"), LR"("a\\b")");
  EXPECT_EQ(output, L"a\\b");
  output.clear();
  EXPECT_EQ(Run(L"(prin1 \"a\\\\b\")"), LR"("a\\b")");
  EXPECT_EQ(output, LR"("a\\b")");
  output.clear();
  EXPECT_EQ(Run(L"(princ '(\"x\" 1))"), L"(\"x\" 1)");
  EXPECT_EQ(output, L"(x 1)");
  output.clear();
  EXPECT_EQ(Run(L"(print 5) (terpri) (princ 1.0 nil)"), L"1.0");
  EXPECT_EQ(output, L"\n5 \n1.0");

  output.clear();
  EXPECT_EQ(m_evaluator.Eval(lisp::ReadAll(L"(princ)").front()), Value::Void());
  EXPECT_EQ(output, L"");
  EXPECT_EQ(Run(L"(list (princ))"), L"(nil)");
  EXPECT_EQ(Fails(L"(princ 1 \"file\")"), "bad argument type: streamp \"file\"");
}

TEST_F(LispEvaluator, ExternalFunctionsGetTheUpperCasedNameAndEvaluatedArguments) {
  EXPECT_EQ(Run(L"(setq dir \"Z:\\\\work\\\\\") (Lumvex 0 (+ 1 1) dir \"Insert\" (princ))"),
            LR"(("picked" (0 2 "Z:\\work\\" "Insert" nil)))");
  ASSERT_EQ(calls.size(), 1u);
  EXPECT_EQ(lisp::Prin1(calls[0]), LR"((LUMVEX (0 2 "Z:\\work\\" "Insert" nil)))");

  EXPECT_EQ(m_evaluator.Eval(lisp::ReadAll(L"(quiet)").front()), Value::Void());
  EXPECT_EQ(Fails(L"(foo 1 (car \"x\"))"), "bad argument type: consp \"x\"");
  EXPECT_EQ(Fails(L"(foo (princ \"evaluated first\"))"), "no function definition: FOO");
  EXPECT_EQ(output, L"evaluated first");

  lisp::Evaluator withoutModule(nullptr, nullptr);
  EXPECT_THROW(withoutModule.Eval(lisp::ReadAll(L"(lumvex)").front()), lisp::Error);
  EXPECT_EQ(withoutModule.Eval(lisp::ReadAll(L"(princ 1)").front()), Value::Int(1));
}

// Messages are UTF-8 inside lisp::Error; names and printed values beyond ASCII, and characters
// beyond 16 bits, come back intact as wide text.
TEST_F(LispEvaluator, ErrorMessagesKeepWideText) {
  EXPECT_EQ(WideFailure(L"(caf\u00e9 1)"), L"no function definition: CAF\u00c9");
  EXPECT_EQ(WideFailure(L"(strcat \"a\" 'caf\u00e9)"), L"bad argument type: stringp CAF\u00c9");
  EXPECT_EQ(WideFailure(L"(\"\U0001F600\u4e2d\")"), L"bad function: \"\U0001F600\u4e2d\"");
}

TEST_F(LispEvaluator, BadFunctions) {
  EXPECT_EQ(Fails(L"(1 2)"), "bad function: 1");
  EXPECT_EQ(Fails(L"(\"a\")"), "bad function: \"a\"");
  EXPECT_EQ(Fails(L"(nil)"), "bad function: nil");
  EXPECT_EQ(Fails(L"((car x))"), "bad function: (CAR X)");
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
