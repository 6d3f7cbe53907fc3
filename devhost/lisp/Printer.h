// The AutoLISP printer: values as (prin1) and (princ) write them.
#pragma once

#include <string>

#include "lisp/Value.h"

namespace lisp {

// Strings quoted, with \\ \" \n \r \t \e and other control characters as \nnn escapes, so
// that reading the text back gives the value again.
std::wstring Prin1(const Value &value);

// Strings as their raw characters, at any depth of a list.
std::wstring Princ(const Value &value);

// A real as AutoLISP shows it: six significant digits, always a point or an exponent
// ("2.0", "0.333333", "1.0e+010").
std::wstring FormatReal(double value);

}  // namespace lisp
