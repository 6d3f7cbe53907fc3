// The framework's case-insensitive text comparison.
#pragma once

// Less than, equal to or greater than 0 as a is before, equal to or after b without regard to
// case. On Windows it is the run time's multibyte comparison, which knows the ANSI code page's
// double-byte characters; elsewhere only A-Z and a-z are paired.
int CompareNoCase(const char *a, const char *b);
