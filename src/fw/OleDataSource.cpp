#include "fw/OleDataSource.h"

#include <ole2.h>
#include <shlobj.h>
#include <wrl/client.h>

#include <new>

namespace fw {
namespace {

FORMATETC HGlobalFormat(CLIPFORMAT format) { return {format, nullptr, DVASPECT_CONTENT, -1, TYMED_HGLOBAL}; }

// What the clipboard holds while it owns the data source: answers for the cached formats and
// hands out a fresh copy of a block on each request.
class CachedDataObject final : public IDataObject {
 public:
  explicit CachedDataObject(std::vector<std::pair<CLIPFORMAT, CGlobalMemory>> cache) : m_cache(std::move(cache)) {}

  HRESULT STDMETHODCALLTYPE QueryInterface(REFIID iid, void **object) override {
    if (!object) return E_POINTER;
    if (iid == IID_IUnknown || iid == IID_IDataObject) {
      *object = static_cast<IDataObject *>(this);
      AddRef();
      return S_OK;
    }
    *object = nullptr;
    return E_NOINTERFACE;
  }
  ULONG STDMETHODCALLTYPE AddRef() override { return InterlockedIncrement(&m_nRefs); }
  ULONG STDMETHODCALLTYPE Release() override {
    const ULONG refs = InterlockedDecrement(&m_nRefs);
    if (refs == 0) delete this;
    return refs;
  }

  HRESULT STDMETHODCALLTYPE GetData(FORMATETC *format, STGMEDIUM *medium) override {
    if (!format || !medium) return E_INVALIDARG;
    HGLOBAL block = nullptr;
    const HRESULT found = Find(*format, block);
    if (found != S_OK) return found;
    CGlobalMemory copy = CopyGlobalMemory(block);
    if (!copy) return E_OUTOFMEMORY;
    medium->tymed = TYMED_HGLOBAL;
    medium->hGlobal = copy.release();
    medium->pUnkForRelease = nullptr;
    return S_OK;
  }
  HRESULT STDMETHODCALLTYPE GetDataHere(FORMATETC *, STGMEDIUM *) override { return E_NOTIMPL; }
  HRESULT STDMETHODCALLTYPE QueryGetData(FORMATETC *format) override {
    if (!format) return E_INVALIDARG;
    HGLOBAL block = nullptr;
    return Find(*format, block);
  }
  HRESULT STDMETHODCALLTYPE GetCanonicalFormatEtc(FORMATETC *, FORMATETC *out) override {
    if (out) out->ptd = nullptr;
    return DATA_S_SAMEFORMATETC;
  }
  HRESULT STDMETHODCALLTYPE SetData(FORMATETC *, STGMEDIUM *, BOOL) override { return E_NOTIMPL; }
  HRESULT STDMETHODCALLTYPE EnumFormatEtc(DWORD direction, IEnumFORMATETC **formats) override {
    if (!formats) return E_INVALIDARG;
    *formats = nullptr;
    if (direction != DATADIR_GET) return E_NOTIMPL;
    std::vector<FORMATETC> offered;
    for (const auto &entry : m_cache) offered.push_back(HGlobalFormat(entry.first));
    return SHCreateStdEnumFmtEtc(static_cast<UINT>(offered.size()), offered.data(), formats);
  }
  HRESULT STDMETHODCALLTYPE DAdvise(FORMATETC *, DWORD, IAdviseSink *, DWORD *) override { return OLE_E_ADVISENOTSUPPORTED; }
  HRESULT STDMETHODCALLTYPE DUnadvise(DWORD) override { return OLE_E_ADVISENOTSUPPORTED; }
  HRESULT STDMETHODCALLTYPE EnumDAdvise(IEnumSTATDATA **) override { return OLE_E_ADVISENOTSUPPORTED; }

 private:
  ~CachedDataObject() = default;

  HRESULT Find(const FORMATETC &format, HGLOBAL &block) const {
    if (format.dwAspect != DVASPECT_CONTENT) return DV_E_DVASPECT;
    for (const auto &entry : m_cache) {
      if (entry.first != format.cfFormat) continue;
      if (!(format.tymed & TYMED_HGLOBAL)) return DV_E_TYMED;
      block = entry.second.get();
      return S_OK;
    }
    return DV_E_FORMATETC;
  }

  LONG m_nRefs = 1;
  std::vector<std::pair<CLIPFORMAT, CGlobalMemory>> m_cache;
};

}  // namespace

void COleDataSource::CacheGlobalData(CLIPFORMAT format, CGlobalMemory block) {
  if (!block) return;
  for (auto &entry : m_cache) {
    if (entry.first == format) {
      entry.second = std::move(block);
      return;
    }
  }
  m_cache.emplace_back(format, std::move(block));
}

bool COleDataSource::SetClipboard() {
  Microsoft::WRL::ComPtr<IDataObject> source;
  source.Attach(new (std::nothrow) CachedDataObject(std::move(m_cache)));
  m_cache.clear();
  if (!source) return false;
  if (FAILED(OleSetClipboard(source.Get()))) return false;
  if (SUCCEEDED(OleFlushClipboard())) return true;
  // The clipboard must not keep a data object whose code may be unloaded before it is asked.
  OleSetClipboard(nullptr);
  return false;
}

}  // namespace fw
