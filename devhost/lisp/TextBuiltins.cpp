// String and output functions: strcat, princ, prin1, print, terpri.
#include <string>

#include "lisp/Arguments.h"
#include "lisp/Builtins.h"
#include "lisp/Printer.h"

namespace lisp {

namespace {

void Write(const BuiltinCall &call, const std::wstring &text) {
  if (call.output) call.output(text);
}

Value Strcat(const BuiltinCall &call) {
  std::wstring text;
  for (const Value &arg : call.args) {
    if (arg.kind != Value::Kind::Str) BadArgument("stringp", arg);
    text += arg.text;
  }
  return Value::Str(std::move(text));
}

// The optional second argument of the printing functions is a file; only nil, the command
// line, is open here.
void RequireCommandLine(const BuiltinCall &call) {
  RequireCount(call.args, 0, 2);
  if (call.args.size() == 2 && !call.args[1].IsNil()) BadArgument("streamp", call.args[1]);
}

Value WritePrinc(const BuiltinCall &call) {
  RequireCommandLine(call);
  if (call.args.empty()) return Value::Void();
  Write(call, Princ(call.args[0]));
  return call.args[0];
}

Value WritePrin1(const BuiltinCall &call) {
  RequireCommandLine(call);
  if (call.args.empty()) return Value::Void();
  Write(call, Prin1(call.args[0]));
  return call.args[0];
}

Value WritePrint(const BuiltinCall &call) {
  RequireCommandLine(call);
  if (call.args.empty()) return Value::Void();
  Write(call, L"\n" + Prin1(call.args[0]) + L" ");
  return call.args[0];
}

Value WriteNewline(const BuiltinCall &call) {
  RequireCount(call.args, 0, 0);
  Write(call, L"\n");
  return Value::Nil();
}

}  // namespace

const std::vector<BuiltinEntry> &TextBuiltins() {
  static const std::vector<BuiltinEntry> entries = {
      {L"STRCAT", &Strcat}, {L"PRINC", &WritePrinc}, {L"PRIN1", &WritePrin1}, {L"PRINT", &WritePrint}, {L"TERPRI", &WriteNewline},
  };
  return entries;
}

}  // namespace lisp
