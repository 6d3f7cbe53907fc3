// The AutoLISP functions this module defines; an entry's index is its function code.
#pragma once

#include "host/HostApi.h"

#include <cstddef>

struct LispFunction {
  const ACHAR *name;
  int (*handler)();
};

extern const LispFunction g_lispFunctions[];
extern const size_t g_lispFunctionCount;
