// One AutoLISP command line: evaluates what is entered and writes what the command line shows
// (the module's printed text verbatim, each result on a line of its own, errors as AutoLISP
// reports them).
#pragma once

#include "lisp/Evaluator.h"

#include <functional>
#include <string>

class CommandSession {
 public:
  using Writer = std::function<void(const std::wstring &text)>;
  CommandSession(Writer writer, lisp::Evaluator::External external);

  // Module output arrives here too, so that the session knows where the line stands.
  void Write(const std::wstring &text);
  // A whole expression, as --eval gives it.
  void Evaluate(const std::wstring &source);
  // A line typed at the command line, echoed after its prompt. As on the CAD command line, a
  // line that leaves a list or a string open waits for the rest, a bare word is a command name,
  // and "!" evaluates what follows.
  void EnterLine(const std::wstring &line);
  bool Waiting() const { return !m_pending.empty(); }

 private:
  void StartLine();
  void RunCommand(const std::wstring &word);

  Writer m_writer;
  bool m_atLineStart = true;
  std::wstring m_pending;  // the lines of an unfinished expression
  lisp::Evaluator m_evaluator;
};
