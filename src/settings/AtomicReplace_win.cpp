#include "settings/AtomicReplace.h"

#include <io.h>
#include <windows.h>

bool CommitFileToDisk(std::FILE *file) { return _commit(_fileno(file)) == 0; }

bool ReplaceFileAtomically(const std::string &source, const std::string &target) {
  return MoveFileExA(source.c_str(), target.c_str(), MOVEFILE_REPLACE_EXISTING | MOVEFILE_WRITE_THROUGH) != 0;
}
