// The layer table of each open drawing: what acdbHostApplicationServices' working database
// offers, the records acdbOpenObject opens, and how the host fills it ("0=7;WALLS=1").
#include "runtime/HostState.h"

#include <cwchar>
#include <cwctype>

namespace {
using devhost::CurrentDrawing;
using devhost::LayerRecord;

bool SameName(const std::wstring &a, const ACHAR *b) {
  // Layer names compare without regard to case, as in the CAD application.
  size_t i = 0;
  for (; i < a.size() && b[i]; ++i)
    if (std::towupper(a[i]) != std::towupper(b[i])) return false;
  return i == a.size() && b[i] == L'\0';
}

class LayerTable final : public AcDbLayerTable {
 public:
  const ACHAR *className() const override { return L"AcDbLayerTable"; }
  Acad::ErrorStatus close() override { return Acad::eOk; }
  Acad::ErrorStatus getIdAt(const ACHAR *name, AcDbObjectId &id, bool) const override {
    devhost::Drawing *drawing = CurrentDrawing();
    if (!drawing || !name) return Acad::eKeyNotFound;
    for (const auto &record : drawing->layers)
      if (SameName(record->name, name)) {
        id = AcDbObjectId(record.get());
        return Acad::eOk;
      }
    return Acad::eKeyNotFound;
  }
};

class WorkingDatabase final : public AcDbDatabase {
 public:
  Acad::ErrorStatus getSymbolTable(AcDbLayerTable *&table, AcDb::OpenMode) override {
    static LayerTable layers;
    table = &layers;
    return Acad::eOk;
  }
};

class Services final : public AcDbHostApplicationServices {
 public:
  AcDbDatabase *workingDatabase() const override {
    static WorkingDatabase database;
    return CurrentDrawing() ? &database : nullptr;
  }
};
}  // namespace

namespace devhost {
const ACHAR *LayerRecord::className() const { return kClassName; }

std::vector<std::unique_ptr<LayerRecord>> DefaultLayers() {
  std::vector<std::unique_ptr<LayerRecord>> layers;
  layers.push_back(std::make_unique<LayerRecord>(L"0", 7));
  return layers;
}
}  // namespace devhost

extern "C" {
AcDbHostApplicationServices *acdbHostApplicationServices() {
  static Services services;
  return &services;
}

Acad::ErrorStatus acdbOpenObject(AcDbObject *&object, AcDbObjectId id, AcDb::OpenMode) {
  object = nullptr;
  if (id.isNull()) return Acad::eNullObjectId;
  // Only ids the current drawing handed out open; anything else is not one of its objects.
  if (devhost::Drawing *drawing = CurrentDrawing())
    for (const auto &record : drawing->layers)
      if (record.get() == id.stub()) {
        object = record.get();
        return Acad::eOk;
      }
  return Acad::eKeyNotFound;
}

bool devhostSetLayers(const wchar_t *spec) {
  devhost::Drawing *drawing = CurrentDrawing();
  if (!drawing || !spec) return false;
  std::vector<std::unique_ptr<LayerRecord>> layers;
  const std::wstring text(spec);
  size_t start = 0;
  while (start <= text.size()) {
    size_t end = text.find(L';', start);
    if (end == std::wstring::npos) end = text.size();
    const std::wstring entry = text.substr(start, end - start);
    start = end + 1;
    if (entry.empty()) continue;
    const size_t equals = entry.find(L'=');
    if (equals == 0 || equals == std::wstring::npos) return false;
    wchar_t *stop = nullptr;
    const long color = std::wcstol(entry.c_str() + equals + 1, &stop, 10);
    if (stop == entry.c_str() + equals + 1 || *stop || color < 1 || color > 255) return false;
    layers.push_back(std::make_unique<LayerRecord>(entry.substr(0, equals), static_cast<short>(color)));
  }
  drawing->layers = std::move(layers);
  return true;
}
}
