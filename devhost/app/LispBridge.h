// AutoLISP values to and from the host's result-buffer chains, and calls of the functions
// the module defined.
#pragma once

#include "host/HostApi.h"
#include "lisp/Value.h"

#include <optional>
#include <string>
#include <vector>

// A new chain for the arguments of a call (the caller owns it); null for no arguments.
resbuf *ArgumentsToChain(const std::vector<lisp::Value> &args);
// The value a chain stands for, as acedRetList hands it back: one item alone, several as a list.
lisp::Value ChainToValue(const resbuf *chain);
// Calls a function the module defined in the current drawing; nullopt when there is none.
std::optional<lisp::Value> CallModuleFunction(const std::wstring &name, const std::vector<lisp::Value> &args);
