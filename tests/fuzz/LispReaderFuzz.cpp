// Hostile text for the AutoLISP reader: any bytes, widened one to one into wide characters.
// Reading must fail only with lisp::Error, and what prin1 writes must read back as the same
// value (or, where reals are rounded to six digits, print the same text again).
#include <cmath>
#include <cstddef>
#include <cstdint>
#include <string>
#include <vector>

#include "lisp/Printer.h"
#include "lisp/Reader.h"

namespace {

bool HasReal(const lisp::Value &value, bool &finite) {
  if (value.kind == lisp::Value::Kind::Real) {
    finite = finite && std::isfinite(value.real);
    return true;
  }
  bool found = false;
  for (const lisp::Value &item : value.items) found = HasReal(item, finite) || found;
  return found;
}

void CheckRoundTrip(const lisp::Value &form) {
  const std::wstring printed = lisp::Prin1(form);
  lisp::Princ(form);
  std::vector<lisp::Value> again;
  try {
    again = lisp::ReadAll(printed);
  } catch (const lisp::Error &) {
    __builtin_trap();
  }
  if (again.size() != 1) __builtin_trap();
  bool finite = true;
  if (!HasReal(form, finite)) {
    if (again.front() != form) __builtin_trap();
  } else if (finite && lisp::Prin1(again.front()) != printed) {
    __builtin_trap();
  }
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const uint8_t *data, size_t size) {
  const std::wstring source(data, data + size);
  std::vector<lisp::Value> forms;
  try {
    forms = lisp::ReadAll(source);
  } catch (const lisp::Error &) {
    return 0;
  }
  for (const lisp::Value &form : forms) CheckRoundTrip(form);
  return 0;
}
