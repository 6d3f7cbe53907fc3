// AutoLISP function definition, arguments and results, as the module sees them.
#include "runtime/HostState.h"
#include "runtime/ResultBuffers.h"

#include <algorithm>
#include <cwctype>

namespace {
using devhost::State;

bool SameName(const std::wstring &a, const std::wstring &b) {
  return a.size() == b.size() &&
         std::equal(a.begin(), a.end(), b.begin(), [](wchar_t x, wchar_t y) { return std::towupper(x) == std::towupper(y); });
}

void SetResult(int kind, resbuf *copy) {
  devhost::ReleaseNodes(State().result);
  State().resultKind = kind;
  State().result = copy;
}

bool Invoke(int code, resbuf *args) {
  devhost::HostState &state = State();
  devhost::ReleaseNodes(state.callArgs);
  state.callArgs = args;
  state.callCode = code;
  // A function that sets no result of its own gives LISP nil, as in the CAD application.
  SetResult(RTNIL, nullptr);
  if (state.entryPoint) state.entryPoint(kInvkSubrMsg, state.module);
  devhost::ReleaseNodes(state.callArgs);
  state.callArgs = nullptr;
  state.callCode = -1;
  return true;
}
}  // namespace

extern "C" {
int acedDefun(const ACHAR *name, int funcNumber) {
  devhost::Drawing *drawing = devhost::CurrentDrawing();
  if (!drawing || !name || !*name) return RTERROR;
  auto &functions = drawing->functions;
  auto found =
      std::find_if(functions.begin(), functions.end(), [&](const devhost::DefinedFunction &f) { return SameName(f.name, name); });
  if (found != functions.end())
    found->code = funcNumber;
  else
    functions.push_back({name, funcNumber});
  return RTNORM;
}

int acedUndef(const ACHAR *name, int funcNumber) {
  devhost::Drawing *drawing = devhost::CurrentDrawing();
  if (!drawing || !name) return RTERROR;
  auto &functions = drawing->functions;
  auto found = std::find_if(functions.begin(), functions.end(),
                            [&](const devhost::DefinedFunction &f) { return SameName(f.name, name) && f.code == funcNumber; });
  if (found == functions.end()) return RTERROR;
  functions.erase(found);
  return RTNORM;
}

int acedGetFunCode() { return State().callCode < 0 ? RTERROR : State().callCode; }

resbuf *acedGetArgs() { return devhost::CopyChain(State().callArgs); }

int acedRetVoid() {
  SetResult(RTNONE, nullptr);
  return RTNORM;
}

int acedRetNil() {
  SetResult(RTNIL, nullptr);
  return RTNORM;
}

int acedRetList(const resbuf *chain) {
  if (!chain) return acedRetNil();
  SetResult(RTLB, devhost::CopyChain(chain));
  return RTNORM;
}

bool devhostIsDefined(int drawing, const wchar_t *name) {
  auto &drawings = State().drawings;
  if (drawing < 0 || drawing >= static_cast<int>(drawings.size()) || !name) return false;
  const auto &functions = drawings[drawing].functions;
  return std::any_of(functions.begin(), functions.end(),
                     [&](const devhost::DefinedFunction &f) { return SameName(f.name, name); });
}

bool devhostInvoke(const wchar_t *name, resbuf *args) {
  devhost::Drawing *drawing = devhost::CurrentDrawing();
  if (drawing && name) {
    for (const auto &function : drawing->functions)
      if (SameName(function.name, name)) return Invoke(function.code, args);
  }
  devhost::ReleaseNodes(args);
  return false;
}

bool devhostInvokeCode(int funcCode, resbuf *args) { return Invoke(funcCode, args); }

int devhostResultKind() { return State().resultKind; }

resbuf *devhostResultCopy() { return devhost::CopyChain(State().result); }

void devhostClearResult() { SetResult(RTNONE, nullptr); }
}
