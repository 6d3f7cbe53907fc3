// Recognising a drawing by its path, as the paste command does for the clipboard's list.
#pragma once

#include <string>

// True when the path's extension, as _splitpath finds it (from the last "." of the file name,
// after the drive and folders), is ".dwg" in any case.
bool IsDwgPath(const std::string &path);
