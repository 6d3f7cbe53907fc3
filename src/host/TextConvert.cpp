#include "host/TextConvert.h"

#include <windows.h>

std::string ToAnsi(const wchar_t *text) {
  if (!text || !*text) return std::string();
  const int bytes = WideCharToMultiByte(CP_ACP, 0, text, -1, nullptr, 0, nullptr, nullptr);
  if (bytes <= 1) return std::string();
  std::string result(static_cast<size_t>(bytes), '\0');
  WideCharToMultiByte(CP_ACP, 0, text, -1, result.data(), bytes, nullptr, nullptr);
  result.resize(static_cast<size_t>(bytes) - 1);
  return result;
}

bool ToAnsiExact(const std::wstring &text, std::string &out) {
  out.clear();
  if (text.empty()) return true;
  const int length = static_cast<int>(text.size());
  BOOL usedDefault = FALSE;
  const int bytes = WideCharToMultiByte(CP_ACP, WC_NO_BEST_FIT_CHARS, text.data(), length, nullptr, 0, nullptr, &usedDefault);
  if (bytes <= 0 || usedDefault) return false;
  out.resize(static_cast<size_t>(bytes));
  WideCharToMultiByte(CP_ACP, WC_NO_BEST_FIT_CHARS, text.data(), length, out.data(), bytes, nullptr, &usedDefault);
  // The way back must give the same text: only then does the ANSI name name the same file.
  return !usedDefault && ToWide(out.c_str()) == text;
}

std::wstring ToWide(const char *text) {
  if (!text || !*text) return std::wstring();
  const int chars = MultiByteToWideChar(CP_ACP, 0, text, -1, nullptr, 0);
  if (chars <= 1) return std::wstring();
  std::wstring result(static_cast<size_t>(chars), L'\0');
  MultiByteToWideChar(CP_ACP, 0, text, -1, result.data(), chars);
  result.resize(static_cast<size_t>(chars) - 1);
  return result;
}

void CopyAnsiCut(const std::string &text, char *buffer, size_t capacity) {
  if (!buffer || capacity == 0) return;
  size_t length = 0;
  while (length < text.size()) {
    const size_t width = IsDBCSLeadByte(static_cast<BYTE>(text[length])) ? 2 : 1;
    if (length + width > capacity - 1 || length + width > text.size()) break;
    length += width;
  }
  text.copy(buffer, length);
  buffer[length] = '\0';
}

PathParts SplitAnsiPath(const std::string &path) {
  return SplitPath(path, [](const char *at) -> const char * { return CharNextA(at); });
}
