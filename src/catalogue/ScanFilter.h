// Which directory-listing entries a folder scan takes as drawings.
#pragma once

// Lowers A-Z in place and leaves every other byte as it is, as _strlwr does in the "C" locale:
// the catalogue's names must not depend on the user's locale.
void LowerAsciiInPlace(char *text);

// Applies the scan's rules to one entry: a folder is skipped unless its name begins with ".";
// otherwise the name is lowered in place and taken when it contains `extension` anywhere.
// A folder that is skipped keeps its name unchanged.
bool TakeListingEntry(char *name, bool isFolder, const char *extension);
