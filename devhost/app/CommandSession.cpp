#include "app/CommandSession.h"

#include "app/LispBridge.h"
#include "lisp/Printer.h"
#include "lisp/Reader.h"

CommandSession::CommandSession(Writer writer)
    : m_writer(std::move(writer)), m_evaluator(CallModuleFunction, [this](const std::wstring &text) { Write(text); }) {}

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
