// A drawing's name as its caption box edits it: the name is what comes before the extension, and
// a new name typed without the drawing's extension keeps it, so that the drawing stays a drawing
// the browser shows.
#pragma once

#include <cstddef>
#include <string>

// How many characters of the file name come before its extension (all of them without one).
std::size_t NameLengthBeforeExtension(const std::string &fileName);

// The new name, with the old name's extension added when it does not already end with it (in
// any letter case). A name the rename refuses stays as typed, so that the refusal names it.
std::string KeepingExtension(const std::string &newName, const std::string &oldName);
