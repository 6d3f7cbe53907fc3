// How the reader tells numbers from symbols: a token is a number only when all of it is one.
#pragma once

#include <optional>
#include <string>

#include "lisp/Value.h"

namespace lisp {

// An integer when the token has no point or exponent and fits 32 bits; otherwise a real
// (as AutoLISP reads a too-big integer literal). std::nullopt when the token is not a number.
std::optional<Value> ParseNumber(const std::wstring &token);

}  // namespace lisp
