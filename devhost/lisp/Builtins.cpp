#include "lisp/Builtins.h"

#include <unordered_map>
#include <utility>

#include "lisp/Arguments.h"

namespace lisp {

namespace {

using Table = std::unordered_map<std::wstring, Builtin>;

Table MakeTable() {
  Table table;
  for (const auto *group : {&ListBuiltins(), &NumberBuiltins(), &TextBuiltins()}) {
    for (const BuiltinEntry &entry : *group) table.emplace(entry.name, entry.function);
  }
  return table;
}

// CAR and CDR compose up to four deep: CADR, CDDR, CADDR, ..., CDDDDR.
bool IsCarCdrChain(const std::wstring &name) {
  if (name.size() < 3 || name.size() > 6) return false;
  if (name.front() != L'C' || name.back() != L'R') return false;
  for (size_t i = 1; i + 1 < name.size(); ++i) {
    if (name[i] != L'A' && name[i] != L'D') return false;
  }
  return true;
}

Value CarCdrChain(const BuiltinCall &call) {
  RequireCount(call.args, 1, 1);
  Value value = call.args[0];
  // The letters apply from the innermost (rightmost) outwards; nil stays nil.
  for (size_t i = call.name.size() - 2; i >= 1 && !value.IsNil(); --i) {
    if (!value.IsList()) BadArgument("consp", value);
    if (call.name[i] == L'A') {
      Value first = std::move(value.items.front());
      value = std::move(first);
    } else {
      value.items.erase(value.items.begin());
      if (value.items.empty()) value = Value::Nil();
    }
  }
  return value;
}

}  // namespace

Builtin FindBuiltin(const std::wstring &name) {
  static const Table table = MakeTable();
  const auto found = table.find(name);
  if (found != table.end()) return found->second;
  return IsCarCdrChain(name) ? &CarCdrChain : nullptr;
}

}  // namespace lisp
