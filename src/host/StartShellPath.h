// The shell display path of the folder in which the explorer opens.
#pragma once

#include <cstddef>

// Writes the path into out (capacity bytes with the terminator). A path that does not fit is
// left empty: a cut path would lead the folder tree to the wrong folder.
void MakeStartShellPath(const char *folder, char *out, size_t capacity);
