// The AutoLISP evaluator behind the development host's command line: variables, the few
// built-in functions a person tries first, and calls into the loaded module's functions.
#pragma once

#include <functional>
#include <map>
#include <optional>
#include <string>
#include <vector>

#include "lisp/Value.h"

namespace lisp {

// Deepest nesting of calls the evaluator follows before it reports an error.
constexpr int kMaxEvalDepth = 1000;

class Evaluator {
 public:
  // An external function (one the loaded module defined). Called with the upper-cased name;
  // returns std::nullopt when no such function is defined, else its result (Value::Void() for
  // a void result).
  using External = std::function<std::optional<Value>(const std::wstring &name, const std::vector<Value> &args)>;
  using Output = std::function<void(const std::wstring &text)>;  // where princ/prin1 write

  Evaluator(External external, Output output);

  Value Eval(const Value &form);  // throws Error

 private:
  Value EvalAt(const Value &form, int depth);
  Value EvalCall(const Value &form, int depth);
  Value Setq(const std::vector<Value> &items, int depth);
  Value CallExternal(const std::wstring &name, const std::vector<Value> &args);

  External m_external;
  Output m_output;
  std::map<std::wstring, Value> m_variables;  // only bound symbols; an unbound one is nil
};

}  // namespace lisp
