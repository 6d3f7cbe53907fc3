// The framework's OLE data object, as far as the file commands read the clipboard with it.
#pragma once

#include "fw/SharedFile.h"

#include <windows.h>
#include <ole2.h>
#include <wrl/client.h>

namespace fw {

class COleDataObject {
 public:
  // Takes the clipboard's current data object; false when the clipboard cannot be opened.
  bool AttachClipboard();
  void Release() { m_pDataObject.Reset(); }

  bool IsDataAvailable(CLIPFORMAT format) const;
  // A copy of the data in global memory, owned by the caller; empty when not offered.
  CGlobalMemory GetGlobalData(CLIPFORMAT format) const;

 private:
  Microsoft::WRL::ComPtr<IDataObject> m_pDataObject;
};

}  // namespace fw
