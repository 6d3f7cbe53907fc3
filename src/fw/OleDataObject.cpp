#include "fw/OleDataObject.h"

#include <cstring>

namespace fw {
namespace {
FORMATETC HGlobalFormat(CLIPFORMAT format) { return {format, nullptr, DVASPECT_CONTENT, -1, TYMED_HGLOBAL}; }

// Releases a storage medium that came from another data object.
class CStorageMedium {
 public:
  CStorageMedium() { std::memset(&m_medium, 0, sizeof m_medium); }
  ~CStorageMedium() { ReleaseStgMedium(&m_medium); }
  CStorageMedium(const CStorageMedium &) = delete;
  CStorageMedium &operator=(const CStorageMedium &) = delete;

  STGMEDIUM m_medium;
};
}  // namespace

bool COleDataObject::AttachClipboard() {
  m_pDataObject.Reset();
  return SUCCEEDED(OleGetClipboard(m_pDataObject.GetAddressOf())) && m_pDataObject;
}

bool COleDataObject::IsDataAvailable(CLIPFORMAT format) const {
  FORMATETC wanted = HGlobalFormat(format);
  return m_pDataObject && m_pDataObject->QueryGetData(&wanted) == S_OK;
}

CGlobalMemory COleDataObject::GetGlobalData(CLIPFORMAT format) const {
  if (!m_pDataObject) return nullptr;
  FORMATETC wanted = HGlobalFormat(format);
  CStorageMedium medium;
  if (FAILED(m_pDataObject->GetData(&wanted, &medium.m_medium)) || medium.m_medium.tymed != TYMED_HGLOBAL) return nullptr;
  if (!medium.m_medium.pUnkForRelease) {
    // The block is ours to free: take it over instead of copying.
    CGlobalMemory block(medium.m_medium.hGlobal);
    medium.m_medium.tymed = TYMED_NULL;
    return block;
  }
  return CopyGlobalMemory(medium.m_medium.hGlobal);
}

}  // namespace fw
