// The thumbnail view's copy, delete and paste of marked drawings. The view passes the shown
// folder and the catalogue; the folder gets one "\" before the names.
#pragma once

#include "catalogue/DwgData.h"

#include <string>

// Puts the marked drawings on the clipboard as a file list (an empty list when none is
// marked); false when the clipboard could not be given the list.
bool CopySelected(const DwgCatalogue &catalogue, const std::string &folder);
// Deletes the marked drawings to the recycle bin, with the shell's confirmation; returns the
// shell's result, which callers need not look at: they scan the folder again in any case.
// With nothing marked the shell is not called at all (non-zero result, nothing touched).
int DeleteSelected(const DwgCatalogue &catalogue, const std::string &folder);
bool PasteFiles(const std::string &folder);
