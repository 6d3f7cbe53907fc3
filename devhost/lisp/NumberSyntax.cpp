#include "lisp/NumberSyntax.h"

#include <charconv>
#include <cstdint>
#include <limits>
#include <string>
#include <system_error>

namespace lisp {

namespace {

bool IsDigit(wchar_t c) { return c >= L'0' && c <= L'9'; }

// The parts of [+-]digits[.digits][e[+-]digits], as positions in the token.
struct NumberParts {
  bool negative = false;
  size_t intBegin = 0, intEnd = 0;
  size_t fracBegin = 0, fracEnd = 0;
  bool hasPoint = false;
  bool hasExponent = false;
  long exponent = 0;  // saturated well beyond any double's range
};

std::optional<NumberParts> Split(const std::wstring &token) {
  NumberParts parts;
  size_t i = 0;
  if (i < token.size() && (token[i] == L'+' || token[i] == L'-')) {
    parts.negative = token[i] == L'-';
    ++i;
  }
  parts.intBegin = i;
  while (i < token.size() && IsDigit(token[i])) ++i;
  parts.intEnd = i;
  if (i < token.size() && token[i] == L'.') {
    parts.hasPoint = true;
    ++i;
    parts.fracBegin = i;
    while (i < token.size() && IsDigit(token[i])) ++i;
    parts.fracEnd = i;
  }
  if (parts.intEnd == parts.intBegin && parts.fracEnd == parts.fracBegin) return std::nullopt;
  if (i < token.size() && (token[i] == L'e' || token[i] == L'E')) {
    parts.hasExponent = true;
    ++i;
    bool negativeExponent = false;
    if (i < token.size() && (token[i] == L'+' || token[i] == L'-')) {
      negativeExponent = token[i] == L'-';
      ++i;
    }
    const size_t digitsBegin = i;
    while (i < token.size() && IsDigit(token[i])) {
      if (parts.exponent < 1000000) parts.exponent = parts.exponent * 10 + (token[i] - L'0');
      ++i;
    }
    if (i == digitsBegin) return std::nullopt;
    if (negativeExponent) parts.exponent = -parts.exponent;
  }
  if (i != token.size()) return std::nullopt;
  return parts;
}

std::optional<int32_t> ToInteger(const std::wstring &token, const NumberParts &parts) {
  const int64_t limit = parts.negative ? int64_t{1} << 31 : (int64_t{1} << 31) - 1;
  int64_t magnitude = 0;
  for (size_t i = parts.intBegin; i < parts.intEnd; ++i) {
    magnitude = magnitude * 10 + (token[i] - L'0');
    if (magnitude > limit) return std::nullopt;
  }
  return static_cast<int32_t>(parts.negative ? -magnitude : magnitude);
}

// Infinity or zero for a real beyond the range of double, by the power of ten of its first
// significant digit.
double OutOfRange(const std::wstring &token, const NumberParts &parts) {
  long leading = 0;
  bool found = false;
  for (size_t i = parts.intBegin; i < parts.intEnd && !found; ++i) {
    if (token[i] != L'0') {
      leading = static_cast<long>(parts.intEnd - i);
      found = true;
    }
  }
  for (size_t i = parts.fracBegin; i < parts.fracEnd && !found; ++i) {
    if (token[i] != L'0') {
      leading = -static_cast<long>(i - parts.fracBegin);
      found = true;
    }
  }
  const double magnitude = found && leading + parts.exponent > 0 ? std::numeric_limits<double>::infinity() : 0.0;
  return parts.negative ? -magnitude : magnitude;
}

double ToReal(const std::wstring &token, const NumberParts &parts) {
  // The token is plain ASCII here; from_chars reads it the same in every locale.
  std::string narrow;
  narrow.reserve(token.size());
  for (size_t i = 0; i < token.size(); ++i) {
    if (i == 0 && token[i] == L'+') continue;
    narrow += static_cast<char>(token[i]);
  }
  double value = 0;
  const auto result = std::from_chars(narrow.data(), narrow.data() + narrow.size(), value, std::chars_format::general);
  if (result.ec == std::errc::result_out_of_range) return OutOfRange(token, parts);
  return value;
}

}  // namespace

std::optional<Value> ParseNumber(const std::wstring &token) {
  const auto parts = Split(token);
  if (!parts) return std::nullopt;
  if (!parts->hasPoint && !parts->hasExponent) {
    if (const auto integer = ToInteger(token, *parts)) return Value::Int(*integer);
  }
  return Value::Real(ToReal(token, *parts));
}

}  // namespace lisp
