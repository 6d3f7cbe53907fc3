#include "host/LispFunctions.h"

#include "host/RunLumvex.h"

const LispFunction g_lispFunctions[] = {
    {L"Lumvex", RunLumvex},
};

const size_t g_lispFunctionCount = sizeof g_lispFunctions / sizeof g_lispFunctions[0];
