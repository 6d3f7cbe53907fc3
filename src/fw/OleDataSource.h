// The framework's OLE data source: global memory blocks cached under clipboard formats, handed
// to the clipboard as a real IDataObject.
#pragma once

#include "fw/SharedFile.h"

#include <windows.h>
#include <ole2.h>

#include <utility>
#include <vector>

namespace fw {

class COleDataSource {
 public:
  COleDataSource() = default;
  COleDataSource(const COleDataSource &) = delete;
  COleDataSource &operator=(const COleDataSource &) = delete;

  // Takes the block over; it is offered under the format from then on.
  void CacheGlobalData(CLIPFORMAT format, CGlobalMemory block);
  // Puts the cached data on the clipboard, which then holds its own copy (the data is flushed
  // at once, so it outlives this module and this process). False when the clipboard could
  // not be set; the cache is given up in both cases.
  bool SetClipboard();

 private:
  std::vector<std::pair<CLIPFORMAT, CGlobalMemory>> m_cache;
};

}  // namespace fw
