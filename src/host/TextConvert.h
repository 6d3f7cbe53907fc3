// Text crosses between the host's wide text and the module's narrow ANSI text here.
#pragma once

#include "host/SplitPath.h"

#include <cstddef>
#include <string>

std::string ToAnsi(const wchar_t *text);
// The ANSI text that stands for exactly this wide text: false when some character has no
// equivalent in the code page (no best-fit look-alike, no "?" in its place).
bool ToAnsiExact(const std::wstring &text, std::string &out);
std::wstring ToWide(const char *text);
// Copies as much of the text as fits the buffer with its terminator, never splitting a
// double-byte character.
void CopyAnsiCut(const std::string &text, char *buffer, size_t capacity);
// Splits a path of ANSI text by its characters, double-byte ones included.
PathParts SplitAnsiPath(const std::string &path);
