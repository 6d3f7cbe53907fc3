// Arithmetic and comparison: + - * / 1+ 1- = /= < > <= >=.
// Integers are AutoLISP's 32-bit integers and wrap around on overflow; any real operand
// makes the rest of the calculation real, from that operand on.
#include <cstdint>
#include <limits>

#include "lisp/Arguments.h"
#include "lisp/Builtins.h"

namespace lisp {

namespace {

enum class Op { Add, Subtract, Multiply, Divide };

void RequireNumber(const Value &value) {
  if (value.kind != Value::Kind::Int && value.kind != Value::Kind::Real) {
    BadArgument("numberp:", value);
  }
}

double AsReal(const Value &value) { return value.kind == Value::Kind::Int ? static_cast<double>(value.integer) : value.real; }

int32_t Wrap(int64_t value) { return static_cast<int32_t>(static_cast<uint32_t>(value)); }

Value Combine(Op op, const Value &a, const Value &b) {
  RequireNumber(b);
  if (a.kind == Value::Kind::Int && b.kind == Value::Kind::Int) {
    const int64_t x = a.integer, y = b.integer;
    switch (op) {
      case Op::Add: return Value::Int(Wrap(x + y));
      case Op::Subtract: return Value::Int(Wrap(x - y));
      case Op::Multiply: return Value::Int(Wrap(x * y));
      case Op::Divide:
        if (y == 0) throw Error("divide by zero");
        return Value::Int(Wrap(x / y));  // truncates toward zero, as AutoLISP does
    }
  }
  const double x = AsReal(a), y = AsReal(b);
  switch (op) {
    case Op::Add: return Value::Real(x + y);
    case Op::Subtract: return Value::Real(x - y);
    case Op::Multiply: return Value::Real(x * y);
    case Op::Divide:
      if (y == 0) throw Error("divide by zero");
      return Value::Real(x / y);
  }
  return Value::Nil();
}

Value Fold(Op op, const std::vector<Value> &args) {
  if (args.empty()) return Value::Int(0);
  RequireNumber(args[0]);
  if (args.size() == 1 && op == Op::Subtract) return Combine(op, Value::Int(0), args[0]);
  Value result = args[0];
  for (size_t i = 1; i < args.size(); ++i) result = Combine(op, result, args[i]);
  return result;
}

Value Add(const BuiltinCall &call) { return Fold(Op::Add, call.args); }
Value Subtract(const BuiltinCall &call) { return Fold(Op::Subtract, call.args); }
Value Multiply(const BuiltinCall &call) { return Fold(Op::Multiply, call.args); }
Value Divide(const BuiltinCall &call) { return Fold(Op::Divide, call.args); }

Value Increment(const BuiltinCall &call) {
  RequireCount(call.args, 1, 1);
  RequireNumber(call.args[0]);
  return Combine(Op::Add, call.args[0], Value::Int(1));
}

Value Decrement(const BuiltinCall &call) {
  RequireCount(call.args, 1, 1);
  RequireNumber(call.args[0]);
  return Combine(Op::Subtract, call.args[0], Value::Int(1));
}

bool IsNumber(const Value &value) { return value.kind == Value::Kind::Int || value.kind == Value::Kind::Real; }

// Numbers compare by value, strings by characters; ordering anything else is an error.
int Order(const Value &a, const Value &b) {
  if (a.kind == Value::Kind::Str && b.kind == Value::Kind::Str) return a.text.compare(b.text);
  if (!IsNumber(a)) BadArgument("numberp:", a);
  if (!IsNumber(b)) BadArgument("numberp:", b);
  if (a.kind == Value::Kind::Int && b.kind == Value::Kind::Int) {
    return a.integer < b.integer ? -1 : a.integer > b.integer ? 1 : 0;
  }
  const double x = AsReal(a), y = AsReal(b);
  return x < y ? -1 : x > y ? 1 : 0;
}

bool Same(const Value &a, const Value &b) {
  if (IsNumber(a) && IsNumber(b)) return Order(a, b) == 0;
  return a == b;
}

enum class Relation { Equal, NotEqual, Less, Greater, LessOrEqual, GreaterOrEqual };

bool Holds(Relation relation, const Value &a, const Value &b) {
  switch (relation) {
    case Relation::Equal: return Same(a, b);
    case Relation::NotEqual: return !Same(a, b);
    case Relation::Less: return Order(a, b) < 0;
    case Relation::Greater: return Order(a, b) > 0;
    case Relation::LessOrEqual: return Order(a, b) <= 0;
    case Relation::GreaterOrEqual: return Order(a, b) >= 0;
  }
  return false;
}

// True when the relation holds between every neighbouring pair.
Value Compare(Relation relation, const std::vector<Value> &args) {
  RequireCount(args, 1, std::numeric_limits<size_t>::max());
  for (size_t i = 1; i < args.size(); ++i) {
    if (!Holds(relation, args[i - 1], args[i])) return Value::Nil();
  }
  return Value::True();
}

Value Equal(const BuiltinCall &call) { return Compare(Relation::Equal, call.args); }
Value NotEqual(const BuiltinCall &call) { return Compare(Relation::NotEqual, call.args); }
Value Less(const BuiltinCall &call) { return Compare(Relation::Less, call.args); }
Value Greater(const BuiltinCall &call) { return Compare(Relation::Greater, call.args); }
Value LessOrEqual(const BuiltinCall &call) { return Compare(Relation::LessOrEqual, call.args); }
Value GreaterOrEqual(const BuiltinCall &call) { return Compare(Relation::GreaterOrEqual, call.args); }

}  // namespace

const std::vector<BuiltinEntry> &NumberBuiltins() {
  static const std::vector<BuiltinEntry> entries = {
      {L"+", &Add},   {L"-", &Subtract},  {L"*", &Multiply}, {L"/", &Divide},  {L"1+", &Increment},   {L"1-", &Decrement},
      {L"=", &Equal}, {L"/=", &NotEqual}, {L"<", &Less},     {L">", &Greater}, {L"<=", &LessOrEqual}, {L">=", &GreaterOrEqual},
  };
  return entries;
}

}  // namespace lisp
