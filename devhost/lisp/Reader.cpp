#include "lisp/Reader.h"

#include <utility>

#include "lisp/NumberSyntax.h"

namespace lisp {

namespace {

const char kMalformedList[] = "malformed list on input";
const char kMalformedString[] = "malformed string on input";
const char kExtraParen[] = "extra right paren on input";
const char kMisplacedDot[] = "misplaced dot on input";

bool IsBlank(wchar_t c) { return c <= L' '; }

bool EndsToken(wchar_t c) { return IsBlank(c) || c == L'(' || c == L')' || c == L'\'' || c == L'"' || c == L';'; }

bool IsOctal(wchar_t c) { return c >= L'0' && c <= L'7'; }

// A list still open: its items so far, the quotes written before its '(', and the state of
// a dotted tail "(a . rest)".
struct OpenList {
  std::vector<Value> items;
  int quotes = 0;
  bool dotSeen = false;
  bool tailRead = false;
  Value tail;
};

// Reads without recursion, so that the depth limit, not the machine stack, bounds nesting.
class Reader {
 public:
  explicit Reader(const std::wstring &source) : m_source(source) {}

  std::vector<Value> ReadAll() {
    for (;;) {
      SkipBlanksAndComments();
      if (AtEnd()) break;
      const wchar_t c = m_source[m_pos];
      if (c == L'(') {
        ++m_pos;
        Deeper();
        m_open.emplace_back();
        m_open.back().quotes = m_quotes;
        m_quotes = 0;
      } else if (c == L')') {
        ++m_pos;
        CloseList();
      } else if (c == L'\'') {
        ++m_pos;
        Deeper();
        ++m_quotes;
      } else if (c == L'"') {
        ++m_pos;
        Deliver(Value::Str(ReadString()));
      } else {
        ReadToken();
      }
    }
    if (!m_open.empty() || m_quotes > 0) throw Error(kMalformedList);
    return std::move(m_forms);
  }

 private:
  bool AtEnd() const { return m_pos >= m_source.size(); }

  void Deeper() {
    if (m_depth >= kMaxReadDepth) throw Error("input nested too deeply");
    ++m_depth;
  }

  void SkipBlanksAndComments() {
    while (!AtEnd()) {
      const wchar_t c = m_source[m_pos];
      if (IsBlank(c)) {
        ++m_pos;
      } else if (c == L';') {
        SkipComment();
      } else {
        return;
      }
    }
  }

  // ";| ... |;" may end inside a line; any other ';' runs to the end of the line.
  void SkipComment() {
    ++m_pos;
    if (!AtEnd() && m_source[m_pos] == L'|') {
      const size_t end = m_source.find(L"|;", m_pos + 1);
      m_pos = end == std::wstring::npos ? m_source.size() : end + 2;
      return;
    }
    while (!AtEnd() && m_source[m_pos] != L'\n' && m_source[m_pos] != L'\r') ++m_pos;
  }

  void CloseList() {
    if (m_quotes > 0) throw Error(kMalformedList);
    if (m_open.empty()) throw Error(kExtraParen);
    OpenList list = std::move(m_open.back());
    m_open.pop_back();
    if (list.dotSeen && !list.tailRead) throw Error(kMisplacedDot);
    --m_depth;
    m_quotes = list.quotes;
    Deliver(Close(std::move(list)));
  }

  // A complete datum: wrapped in the quotes before it, then placed in the open list or
  // among the top-level forms.
  void Deliver(Value value) {
    for (; m_quotes > 0; --m_quotes, --m_depth) {
      // Built by moving: an initializer list would copy the quoted value once per quote.
      std::vector<Value> quoted;
      quoted.reserve(2);
      quoted.push_back(Value::Sym(L"QUOTE"));
      quoted.push_back(std::move(value));
      value = Value::List(std::move(quoted));
    }
    if (m_open.empty()) {
      m_forms.push_back(std::move(value));
      return;
    }
    OpenList &list = m_open.back();
    if (!list.dotSeen) {
      list.items.push_back(std::move(value));
      return;
    }
    if (list.tailRead) throw Error(kMisplacedDot);
    list.tailRead = true;
    list.tail = std::move(value);
  }

  // "(a . (b c))" is "(a b c)" and "(a . nil)" is "(a)"; a pair with an atom tail has no
  // representation here.
  static Value Close(OpenList list) {
    if (list.tail.IsList()) {
      for (Value &item : list.tail.items) list.items.push_back(std::move(item));
    } else if (!list.tail.IsNil()) {
      throw Error("dotted pairs are not supported on input");
    }
    return Value::List(std::move(list.items));
  }

  std::wstring ReadString() {
    std::wstring text;
    for (;;) {
      if (AtEnd()) throw Error(m_open.empty() ? kMalformedString : kMalformedList);
      const wchar_t c = m_source[m_pos++];
      if (c == L'"') return text;
      if (c != L'\\') {
        text += c;
        continue;
      }
      if (AtEnd()) throw Error(m_open.empty() ? kMalformedString : kMalformedList);
      text += ReadEscape();
    }
  }

  wchar_t ReadEscape() {
    const wchar_t c = m_source[m_pos++];
    switch (c) {
      case L'n': return L'\n';
      case L'r': return L'\r';
      case L't': return L'\t';
      case L'e': return wchar_t{27};
      default: break;
    }
    if (!IsOctal(c)) return c;  // \\, \" and any other character stand for themselves
    int code = c - L'0';
    for (int digits = 1; digits < 3 && !AtEnd() && IsOctal(m_source[m_pos]); ++digits) {
      code = code * 8 + (m_source[m_pos++] - L'0');
    }
    return static_cast<wchar_t>(code);
  }

  void ReadToken() {
    const size_t begin = m_pos;
    while (!AtEnd() && !EndsToken(m_source[m_pos])) ++m_pos;
    const std::wstring token = m_source.substr(begin, m_pos - begin);
    if (token == L".") {
      ReadDot();
      return;
    }
    if (auto number = ParseNumber(token)) {
      Deliver(std::move(*number));
      return;
    }
    std::wstring name = UpperName(token);
    if (name == L"NIL") {
      Deliver(Value::Nil());
    } else if (name == L"T") {
      Deliver(Value::True());
    } else {
      Deliver(Value::Sym(std::move(name)));
    }
  }

  void ReadDot() {
    if (m_open.empty() || m_quotes > 0) throw Error(kMisplacedDot);
    OpenList &list = m_open.back();
    if (list.items.empty() || list.dotSeen) throw Error(kMisplacedDot);
    list.dotSeen = true;
  }

  const std::wstring &m_source;
  size_t m_pos = 0;
  std::vector<OpenList> m_open;
  int m_quotes = 0;  // quotes read since the last datum, waiting for the next one
  int m_depth = 0;   // open lists plus pending quotes at every level
  std::vector<Value> m_forms;
};

}  // namespace

std::vector<Value> ReadAll(const std::wstring &source) { return Reader(source).ReadAll(); }

}  // namespace lisp
