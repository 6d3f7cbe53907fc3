// Filling the catalogue from a folder of the file system.
#pragma once

#include <string>

// Empties the catalogue and sets its growth step to 100 records, as every scan begins; until a
// scan lists a folder, the document shows none.
void EmptyCatalogue();

// The listing half of the folder tree's LoadFolder: empties the catalogue, makes `path` the
// document's shown folder (when a document exists) and the process's current directory, then
// adds one record for every entry of the folder that the scan's filter takes, in listing order,
// every record unmarked. An entry whose name has no exact ANSI form is left out and counted in
// the document: its narrow name ("????.dwg", or a look-alike such as "plan.dwg" for "plān.dwg")
// would name no file or another one. False when the folder cannot be listed; the catalogue is
// then empty.
bool ScanFolder(const std::string &path, const char *extension);
