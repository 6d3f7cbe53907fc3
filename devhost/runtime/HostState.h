// Everything the development host remembers about the loaded module, its drawings and the
// AutoLISP call in progress.
#pragma once

#include "runtime/TestApi.h"

#include <windows.h>

#include <memory>
#include <string>
#include <vector>

class AcApDocument {
 public:
  explicit AcApDocument(int serial) : m_serial(serial) {}
  int serial() const { return m_serial; }

 private:
  int m_serial;
};

namespace devhost {

struct DefinedFunction {
  std::wstring name;
  int code;
};

// One layer of a drawing's layer table.
class LayerRecord final : public AcDbLayerTableRecord {
 public:
  LayerRecord(std::wstring layerName, short colorIndex) : name(std::move(layerName)), index(colorIndex) {}
  const ACHAR *className() const override;
  Acad::ErrorStatus close() override { return Acad::eOk; }
  AcCmColor color() const override { return AcCmColor(index); }

  std::wstring name;
  short index;
};

// A new drawing's layer table: layer "0" in colour 7.
std::vector<std::unique_ptr<LayerRecord>> DefaultLayers();

struct Drawing {
  std::unique_ptr<AcApDocument> document;
  std::vector<DefinedFunction> functions;
  std::vector<std::unique_ptr<LayerRecord>> layers = DefaultLayers();
};

using EntryPointFunction = int (*)(int message, void *appId);

struct HostState {
  HMODULE module = nullptr;
  EntryPointFunction entryPoint = nullptr;
  bool unlocked = false;
  bool mdiAware = false;
  std::vector<Drawing> drawings;
  int current = -1;
  int nextSerial = 1;
  std::vector<AcApDocManagerReactor *> reactors;

  resbuf *callArgs = nullptr;  // owned; acedGetArgs hands out copies
  int callCode = -1;
  int resultKind = RTNONE;
  resbuf *result = nullptr;  // owned copy of what the module returned

  bool batch = false;
  DevhostOutputSink sink = nullptr;
  void *sinkContext = nullptr;
  HWND mainFrame = nullptr;
  HWND drawingView = nullptr;
};

HostState &State();
Drawing *CurrentDrawing();

// A copy of a chain made of the host's own nodes (null when memory ran out part-way).
resbuf *CopyChain(const resbuf *chain);

}  // namespace devhost
