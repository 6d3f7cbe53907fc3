#include "lisp/Value.h"

#include <utility>

#include "lisp/Utf8.h"

namespace lisp {

Value Value::Nil() { return Value{}; }

Value Value::True() {
  Value v;
  v.kind = Kind::T;
  return v;
}

Value Value::Int(int32_t value) {
  Value v;
  v.kind = Kind::Int;
  v.integer = value;
  return v;
}

Value Value::Real(double value) {
  Value v;
  v.kind = Kind::Real;
  v.real = value;
  return v;
}

Value Value::Str(std::wstring value) {
  Value v;
  v.kind = Kind::Str;
  v.text = std::move(value);
  return v;
}

Value Value::Sym(std::wstring name) {
  Value v;
  v.kind = Kind::Sym;
  v.text = std::move(name);
  return v;
}

Value Value::List(std::vector<Value> items) {
  Value v;
  if (items.empty()) return v;
  v.kind = Kind::List;
  v.items = std::move(items);
  return v;
}

Value Value::Void() {
  Value v;
  v.kind = Kind::Void;
  return v;
}

bool operator==(const Value &a, const Value &b) {
  if (a.kind != b.kind) return false;
  switch (a.kind) {
    case Value::Kind::Int: return a.integer == b.integer;
    case Value::Kind::Real: return a.real == b.real;
    case Value::Kind::Str:
    case Value::Kind::Sym: return a.text == b.text;
    case Value::Kind::List: return a.items == b.items;
    default: return true;
  }
}

Error::Error(const std::string &message) : std::runtime_error(message) {}

std::wstring WideMessage(const Error &error) { return FromUtf8(error.what()); }

std::wstring UpperName(std::wstring name) {
  for (wchar_t &c : name) {
    const bool asciiLower = c >= L'a' && c <= L'z';
    const bool latinLower = c >= 0xE0 && c <= 0xFE && c != 0xF7;
    if (asciiLower || latinLower) c = static_cast<wchar_t>(c - 0x20);
  }
  return name;
}

}  // namespace lisp
