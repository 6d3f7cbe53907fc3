#include "fw/Document.h"

namespace fw {

CDocument::CDocument() = default;

CDocument::~CDocument() = default;

void CDocument::Serialize(CArchive &) {}

}  // namespace fw
