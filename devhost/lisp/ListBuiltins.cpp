// List functions: list, cons, length, nth and the predicates on lists and nil.
#include <utility>

#include "lisp/Arguments.h"
#include "lisp/Builtins.h"

namespace lisp {

namespace {

Value Truth(bool condition) { return condition ? Value::True() : Value::Nil(); }

Value List(const BuiltinCall &call) { return Value::List(std::move(call.args)); }

Value Cons(const BuiltinCall &call) {
  RequireCount(call.args, 2, 2);
  const Value &rest = call.args[1];
  // (cons 1 2) makes a dotted pair in AutoLISP; values here are proper lists only.
  if (!rest.IsNil() && !rest.IsList()) throw Error("dotted pairs are not supported");
  std::vector<Value> items;
  items.reserve(rest.items.size() + 1);
  items.push_back(call.args[0]);
  items.insert(items.end(), rest.items.begin(), rest.items.end());
  return Value::List(std::move(items));
}

Value Length(const BuiltinCall &call) {
  RequireCount(call.args, 1, 1);
  return Value::Int(static_cast<int32_t>(ListItems(call.args[0], "listp").size()));
}

Value Nth(const BuiltinCall &call) {
  RequireCount(call.args, 2, 2);
  const Value &index = call.args[0];
  if (index.kind != Value::Kind::Int) BadArgument("fixnump:", index);
  const std::vector<Value> &items = ListItems(call.args[1], "consp");
  if (index.integer < 0 || static_cast<size_t>(index.integer) >= items.size()) return Value::Nil();
  return items[static_cast<size_t>(index.integer)];
}

Value Atom(const BuiltinCall &call) {
  RequireCount(call.args, 1, 1);
  return Truth(!call.args[0].IsList());
}

Value Listp(const BuiltinCall &call) {
  RequireCount(call.args, 1, 1);
  return Truth(call.args[0].IsList() || call.args[0].IsNil());
}

Value Not(const BuiltinCall &call) {
  RequireCount(call.args, 1, 1);
  return Truth(call.args[0].IsNil());
}

Value Equal(const BuiltinCall &call) {
  RequireCount(call.args, 2, 2);
  return Truth(call.args[0] == call.args[1]);
}

}  // namespace

const std::vector<BuiltinEntry> &ListBuiltins() {
  static const std::vector<BuiltinEntry> entries = {
      {L"LIST", &List},   {L"CONS", &Cons}, {L"LENGTH", &Length}, {L"NTH", &Nth},     {L"ATOM", &Atom},
      {L"LISTP", &Listp}, {L"NOT", &Not},   {L"NULL", &Not},      {L"EQUAL", &Equal},
  };
  return entries;
}

}  // namespace lisp
