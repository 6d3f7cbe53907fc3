// Paths of the shown folder's drawings: every folder scan makes the folder the process's current
// directory, and tiles and the search box name their drawings from it.
#pragma once

#include <string>

// The current directory as the system reports it.
std::string CurrentDirectory();
// The current directory, one "\" unless it already ends with one, and the name.
std::string PathInCurrentDirectory(const std::string &name);
