// The framework's document: the data of one browse call that the views show. Documents here
// are made directly by their owner and never stored as files, so the base carries no template,
// no file name and no view list; only the serialisation hook stays, doing nothing.
#pragma once

namespace fw {

// The stream a document would be stored to; no document of this system is ever stored.
class CArchive;

class CDocument {
 public:
  CDocument();
  virtual ~CDocument();
  CDocument(const CDocument &) = delete;
  CDocument &operator=(const CDocument &) = delete;

  virtual void Serialize(CArchive &archive);
};

}  // namespace fw
