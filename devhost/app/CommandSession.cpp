#include "app/CommandSession.h"

#include "lisp/Printer.h"
#include "lisp/Reader.h"
#include "lisp/Utf8.h"

#include <cwctype>

namespace {
// Whether the text ends inside a list or a string, outside comments.
bool Unfinished(const std::wstring &text) {
  int depth = 0;
  bool inString = false;
  for (size_t i = 0; i < text.size(); ++i) {
    const wchar_t c = text[i];
    if (inString) {
      if (c == L'\\') ++i;
      else if (c == L'"') inString = false;
    } else if (c == L'"') {
      inString = true;
    } else if (c == L';') {
      while (i < text.size() && text[i] != L'\n') ++i;
    } else if (c == L'(') {
      ++depth;
    } else if (c == L')') {
      --depth;
    }
  }
  return inString || depth > 0;
}

std::wstring Trimmed(const std::wstring &text) {
  const size_t first = text.find_first_not_of(L" \t\r\n");
  if (first == std::wstring::npos) return {};
  return text.substr(first, text.find_last_not_of(L" \t\r\n") - first + 1);
}

// A word the command line takes as a command name: no blank, list, string, quote or comment,
// and not a number.
bool IsBareWord(const std::wstring &text) {
  if (text.empty() || text.find_first_of(L" \t()\"';!") != std::wstring::npos) return false;
  wchar_t *end = nullptr;
  std::wcstod(text.c_str(), &end);
  return *end != L'\0';
}

std::wstring Upper(std::wstring text) {
  for (wchar_t &c : text) c = static_cast<wchar_t>(std::towupper(c));
  return text;
}
}  // namespace

CommandSession::CommandSession(Writer writer, lisp::Evaluator::External external)
    : m_writer(std::move(writer)), m_evaluator(std::move(external), [this](const std::wstring &text) { Write(text); }) {}

void CommandSession::Write(const std::wstring &text) {
  if (text.empty()) return;
  m_writer(text);
  m_atLineStart = text.back() == L'\n';
}

void CommandSession::StartLine() {
  if (!m_atLineStart) Write(L"\n");
}

void CommandSession::Evaluate(const std::wstring &source) {
  try {
    for (const lisp::Value &form : lisp::ReadAll(source)) {
      const lisp::Value result = m_evaluator.Eval(form);
      if (result.kind == lisp::Value::Kind::Void) continue;
      StartLine();
      Write(lisp::Prin1(result) + L"\n");
    }
  } catch (const lisp::Error &error) {
    StartLine();
    Write(L"; error: " + lisp::WideMessage(error) + L"\n");
  }
}

void CommandSession::EnterLine(const std::wstring &line) {
  m_pending += m_pending.empty() ? line : L"\n" + line;
  if (Unfinished(m_pending)) return;
  const std::wstring entered = Trimmed(m_pending);
  m_pending.clear();
  if (entered.empty()) return;
  if (entered[0] == L'!') return Evaluate(entered.substr(1));
  if (IsBareWord(entered)) return RunCommand(entered);
  Evaluate(entered);
}

// A command is a function named C:WORD; without one the command line says so, as the CAD
// application does.
void CommandSession::RunCommand(const std::wstring &word) {
  const std::wstring name = Upper(word);
  try {
    const lisp::Value result = m_evaluator.Eval(lisp::ReadAll(L"(C:" + name + L")").front());
    if (result.kind != lisp::Value::Kind::Void) {
      StartLine();
      Write(lisp::Prin1(result) + L"\n");
    }
  } catch (const lisp::Error &error) {
    StartLine();
    if (error.what() == "no function definition: C:" + lisp::ToUtf8(name))
      Write(L"Unknown command \"" + name + L"\".\n");
    else
      Write(L"; error: " + lisp::WideMessage(error) + L"\n");
  }
}
