#include "lisp/Evaluator.h"

#include <utility>

#include "lisp/Arguments.h"
#include "lisp/Builtins.h"
#include "lisp/Printer.h"
#include "lisp/Utf8.h"

namespace lisp {

namespace {

// What (princ) returns is nil to whoever receives it.
Value Received(Value value) {
  if (value.kind == Value::Kind::Void) return Value::Nil();
  return value;
}

}  // namespace

Evaluator::Evaluator(External external, Output output) : m_external(std::move(external)), m_output(std::move(output)) {}

Value Evaluator::Eval(const Value &form) { return EvalAt(form, 0); }

Value Evaluator::EvalAt(const Value &form, int depth) {
  switch (form.kind) {
    case Value::Kind::Sym: {
      const auto found = m_variables.find(form.text);
      return found == m_variables.end() ? Value::Nil() : found->second;
    }
    case Value::Kind::List: return EvalCall(form, depth + 1);
    default: return form;
  }
}

Value Evaluator::EvalCall(const Value &form, int depth) {
  if (depth > kMaxEvalDepth) throw Error("stack limit reached");
  const Value &head = form.items.front();
  if (head.kind != Value::Kind::Sym) throw Error("bad function: " + ToUtf8(Prin1(head)));
  const std::wstring &name = head.text;
  if (name == L"QUOTE") {
    if (form.items.size() < 2) throw Error("too few arguments");
    if (form.items.size() > 2) throw Error("too many arguments");
    return form.items[1];
  }
  if (name == L"SETQ") return Setq(form.items, depth);

  std::vector<Value> args;
  args.reserve(form.items.size() - 1);
  for (size_t i = 1; i < form.items.size(); ++i) {
    args.push_back(Received(EvalAt(form.items[i], depth)));
  }
  if (const Builtin builtin = FindBuiltin(name)) return builtin(BuiltinCall{name, args, m_output});
  return CallExternal(name, args);
}

// (setq name value ...): each value is evaluated and bound before the next pair.
Value Evaluator::Setq(const std::vector<Value> &items, int depth) {
  if (items.size() % 2 == 0) throw Error("too few arguments");
  Value result;
  for (size_t i = 1; i < items.size(); i += 2) {
    const Value &target = items[i];
    if (target.kind != Value::Kind::Sym) BadArgument("symbolp", target);
    result = Received(EvalAt(items[i + 1], depth));
    if (result.IsNil()) {
      m_variables.erase(target.text);
    } else {
      m_variables[target.text] = result;
    }
  }
  return result;
}

Value Evaluator::CallExternal(const std::wstring &name, const std::vector<Value> &args) {
  std::optional<Value> result;
  if (m_external) result = m_external(name, args);
  if (!result) throw Error("no function definition: " + ToUtf8(name));
  return std::move(*result);
}

}  // namespace lisp
