#include "lisp/Arguments.h"

#include <string>

#include "lisp/Printer.h"
#include "lisp/Utf8.h"

namespace lisp {

void RequireCount(const std::vector<Value> &args, size_t least, size_t most) {
  if (args.size() < least) throw Error("too few arguments");
  if (args.size() > most) throw Error("too many arguments");
}

void BadArgument(const char *predicate, const Value &value) {
  throw Error(std::string("bad argument type: ") + predicate + " " + ToUtf8(Prin1(value)));
}

const std::vector<Value> &ListItems(const Value &value, const char *predicate) {
  static const std::vector<Value> empty;
  if (value.IsNil()) return empty;
  if (!value.IsList()) BadArgument(predicate, value);
  return value.items;
}

}  // namespace lisp
