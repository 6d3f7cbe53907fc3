// The full paths of the drawings the user has marked, for the view's copy and delete.
#pragma once

#include "catalogue/DwgData.h"

#include <string>
#include <vector>

// The folder text with one "\" at its end, added only when it is not there already.
std::string FolderWithSeparator(std::string folder);

// Folder + name of every marked record, in catalogue order.
std::vector<std::string> MarkedPaths(const DwgCatalogue &catalogue, const std::string &folder);
