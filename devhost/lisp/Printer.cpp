#include "lisp/Printer.h"

#include <charconv>
#include <cmath>
#include <string>

namespace lisp {

namespace {

void AppendOctal(std::wstring &out, wchar_t c) {
  const unsigned code = static_cast<unsigned>(c);
  out += L'\\';
  out += static_cast<wchar_t>(L'0' + ((code >> 6) & 7));
  out += static_cast<wchar_t>(L'0' + ((code >> 3) & 7));
  out += static_cast<wchar_t>(L'0' + (code & 7));
}

void AppendQuoted(std::wstring &out, const std::wstring &text) {
  out += L'"';
  for (const wchar_t c : text) {
    switch (c) {
      case L'\\': out += L"\\\\"; break;
      case L'"': out += L"\\\""; break;
      case L'\n': out += L"\\n"; break;
      case L'\r': out += L"\\r"; break;
      case L'\t': out += L"\\t"; break;
      case wchar_t{27}: out += L"\\e"; break;
      default:
        if (c < L' ' || c == wchar_t{127}) {
          AppendOctal(out, c);
        } else {
          out += c;
        }
    }
  }
  out += L'"';
}

void Append(std::wstring &out, const Value &value, bool quoteStrings) {
  switch (value.kind) {
    case Value::Kind::Nil: out += L"nil"; break;
    case Value::Kind::T: out += L"T"; break;
    case Value::Kind::Int: out += std::to_wstring(value.integer); break;
    case Value::Kind::Real: out += FormatReal(value.real); break;
    case Value::Kind::Str:
      if (quoteStrings) {
        AppendQuoted(out, value.text);
      } else {
        out += value.text;
      }
      break;
    case Value::Kind::Sym: out += value.text; break;
    case Value::Kind::List:
      out += L'(';
      for (size_t i = 0; i < value.items.size(); ++i) {
        if (i > 0) out += L' ';
        Append(out, value.items[i], quoteStrings);
      }
      out += L')';
      break;
    case Value::Kind::Void: break;
  }
}

}  // namespace

std::wstring Prin1(const Value &value) {
  std::wstring out;
  Append(out, value, true);
  return out;
}

std::wstring Princ(const Value &value) {
  std::wstring out;
  Append(out, value, false);
  return out;
}

std::wstring FormatReal(double value) {
  if (std::isnan(value)) return std::signbit(value) ? L"-1.#IND" : L"1.#QNAN";
  if (std::isinf(value)) return value > 0 ? L"1.#INF" : L"-1.#INF";
  char buffer[64];
  const auto result = std::to_chars(buffer, buffer + sizeof buffer, value, std::chars_format::general, 6);
  const std::string digits(buffer, result.ptr);
  const size_t e = digits.find('e');
  std::string mantissa = digits.substr(0, e);
  if (mantissa.find('.') == std::string::npos) mantissa += ".0";
  std::string text = mantissa;
  if (e != std::string::npos) {
    // "e+06" becomes "e+006": AutoLISP writes at least three exponent digits.
    const char sign = digits[e + 1];
    std::string exponent = digits.substr(e + 2);
    while (exponent.size() < 3) exponent.insert(exponent.begin(), '0');
    text += 'e';
    text += sign;
    text += exponent;
  }
  return std::wstring(text.begin(), text.end());
}

}  // namespace lisp
