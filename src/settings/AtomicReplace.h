#pragma once

#include <cstdio>
#include <string>

// The platform pieces of a crash-safe save: the new content reaches the disk
// before it takes the old file's place, and it takes that place in one step,
// so a reader sees either the old file or the new one, never a part of either.

// Pushes the stream's data through to the disk; the stream must be flushed first.
bool CommitFileToDisk(std::FILE *file);

// Puts the file `source` in the place of `target` (replacing it when it exists).
// Both lie in the same folder. On failure `target` is left as it was.
bool ReplaceFileAtomically(const std::string &source, const std::string &target);
