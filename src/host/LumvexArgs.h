// Checks the arguments of the current AutoLISP call against (short short string string string).
#pragma once

#include "host/HostApi.h"

#include <cstddef>

struct LumvexText {
  ACHAR *buffer;
  size_t capacity;  // in characters, the terminator included
};

// On success stores the two shorts (sign-extended) and the three texts, each cut to its buffer,
// releases the argument chain and returns true. Otherwise tells the user and returns false.
bool ReadLumvexArgs(int &a, int &b, LumvexText s1, LumvexText s2, LumvexText s3);
