// UTF-8 for error messages, which carry wide symbol names and printed values in narrow text.
#pragma once

#include <string>

namespace lisp {

// Surrogate pairs (where wchar_t is 16 bits) become one code point; a lone surrogate is
// encoded as it stands so that decoding gives it back.
std::string ToUtf8(const std::wstring &text);

// Malformed sequences decode to U+FFFD.
std::wstring FromUtf8(const std::string &text);

}  // namespace lisp
