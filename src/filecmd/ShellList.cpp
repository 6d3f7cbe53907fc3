#include "filecmd/ShellList.h"

#include <climits>
#include <cstring>

bool AppendShellListPath(char *&buffer, int &capacity, int &used, char *&end, const char *path, ShellListReallocate reallocate) {
  // An empty path would end the list early and hide the paths after it.
  if (!path || !*path) return false;
  const size_t length = std::strlen(path) + 1;
  const size_t need = static_cast<size_t>(used) + 1 + length;
  if (length > INT_MAX || need > INT_MAX) return false;
  if (need > static_cast<size_t>(capacity)) {
    char *grown = static_cast<char *>(reallocate(buffer, need));
    if (!grown) return false;
    if (!buffer) grown[0] = '\0';
    buffer = grown;
    end = grown + used;
    capacity = static_cast<int>(need);
  }
  std::memcpy(end, path, length);
  end += length;
  used += static_cast<int>(length);
  *end = '\0';
  return true;
}
