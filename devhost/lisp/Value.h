// AutoLISP values as the development host's command line reads, evaluates and prints them.
#pragma once

#include <cstdint>
#include <stdexcept>
#include <string>
#include <vector>

namespace lisp {

struct Value {
  enum class Kind { Nil, T, Int, Real, Str, Sym, List, Void };
  Kind kind = Kind::Nil;
  int32_t integer = 0;       // Int
  double real = 0;           // Real
  std::wstring text;         // Str (the string's characters), Sym (upper-cased name)
  std::vector<Value> items;  // List (a non-empty list; the empty list is Nil)

  static Value Nil();
  static Value True();
  static Value Int(int32_t value);
  static Value Real(double value);
  static Value Str(std::wstring value);
  static Value Sym(std::wstring name);
  // An empty vector gives Nil, so that a list value is never empty.
  static Value List(std::vector<Value> items);
  // What (princ) returns: prints as nothing and counts as nil when passed on.
  static Value Void();

  bool IsNil() const { return kind == Kind::Nil; }
  bool IsList() const { return kind == Kind::List; }
};

// Structural equality: same kind and same contents; reals compare by value.
bool operator==(const Value &a, const Value &b);
inline bool operator!=(const Value &a, const Value &b) { return !(a == b); }

// An AutoLISP error; the message is the text after "; error: ", in UTF-8.
struct Error : std::runtime_error {
  explicit Error(const std::string &message);
};

// The error's message as wide text, for a command line that prints wide text.
std::wstring WideMessage(const Error &error);

// Upper-cases a symbol name as the reader does: ASCII and Latin-1 letters only, so that the
// result does not depend on the process locale.
std::wstring UpperName(std::wstring name);

}  // namespace lisp
