// Argument checks that fail with AutoLISP's own messages.
#pragma once

#include <cstddef>
#include <vector>

#include "lisp/Value.h"

namespace lisp {

// "too few arguments" / "too many arguments".
void RequireCount(const std::vector<Value> &args, size_t least, size_t most);

// "bad argument type: <predicate> <value as prin1 writes it>"; AutoLISP writes "numberp:" and
// "fixnump:" with a colon, and the caller passes the predicate that way.
[[noreturn]] void BadArgument(const char *predicate, const Value &value);

// A list's items for functions that take a list; nil is the empty list.
const std::vector<Value> &ListItems(const Value &value, const char *predicate);

}  // namespace lisp
