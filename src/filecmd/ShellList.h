// One list of paths in the form the shell's file operation takes: each path ended by a NUL,
// then one more NUL. The buffer comes from the C heap and grows to exactly what it needs.
#pragma once

#include <cstddef>

using ShellListReallocate = void *(*)(void *block, size_t size);

// Appends path to the list held in buffer (capacity bytes, used bytes of paths without the
// final NUL, end where the next path goes). For a null or empty path, a failed allocation, or
// a list that would pass what an int counts, the list stays exactly as it was and false is
// returned.
bool AppendShellListPath(char *&buffer, int &capacity, int &used, char *&end, const char *path, ShellListReallocate reallocate);
