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
  explicit CommandSession(Writer writer);

  // Module output arrives here too, so that the session knows where the line stands.
  void Write(const std::wstring &text);
  void Evaluate(const std::wstring &source);

 private:
  void StartLine();

  Writer m_writer;
  bool m_atLineStart = true;
  lisp::Evaluator m_evaluator;
};
