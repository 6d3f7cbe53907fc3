// The AutoLISP reader: source text to values, as the command line and (read) take it.
#pragma once

#include <string>
#include <vector>

#include "lisp/Value.h"

namespace lisp {

// Deepest nesting of lists and quotes the reader accepts; deeper input is an error rather than
// a value too deep to print, compare or free without exhausting the stack.
constexpr int kMaxReadDepth = 1000;

// Every top-level form in order. Throws Error on malformed input.
std::vector<Value> ReadAll(const std::wstring &source);

}  // namespace lisp
