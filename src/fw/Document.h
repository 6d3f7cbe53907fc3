// The framework's document: the data of one browse call that the views show. Documents here
// are made directly by their owner and never stored as files, so the base carries no template,
// no file name, no view list and no serialisation.
#pragma once

namespace fw {

class CDocument {
 public:
  CDocument() = default;
  virtual ~CDocument() = default;
  CDocument(const CDocument &) = delete;
  CDocument &operator=(const CDocument &) = delete;
};

}  // namespace fw
