// The functions the evaluator provides itself. Each gets its arguments already evaluated.
#pragma once

#include <string>
#include <vector>

#include "lisp/Evaluator.h"
#include "lisp/Value.h"

namespace lisp {

struct BuiltinCall {
  const std::wstring &name;  // upper-cased, for functions that serve a family of names
  std::vector<Value> &args;  // the evaluated arguments, which the function may take over
  const Evaluator::Output &output;
};

using Builtin = Value (*)(const BuiltinCall &call);

struct BuiltinEntry {
  const wchar_t *name;
  Builtin function;
};

// The groups, one file each.
const std::vector<BuiltinEntry> &ListBuiltins();
const std::vector<BuiltinEntry> &NumberBuiltins();
const std::vector<BuiltinEntry> &TextBuiltins();

// The built-in function of that upper-cased name, or null.
Builtin FindBuiltin(const std::wstring &name);

}  // namespace lisp
