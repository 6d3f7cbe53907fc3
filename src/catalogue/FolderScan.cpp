#include "catalogue/FolderScan.h"

#include "catalogue/DwgData.h"
#include "catalogue/ListingCollector.h"
#include "catalogue/Ombra3Doc.h"
#include "catalogue/ScanFilter.h"

#include <windows.h>

#include <io.h>

namespace {
const int kCatalogueGrowBy = 100;

class FindListing {
 public:
  explicit FindListing(intptr_t handle) : m_handle(handle) {}
  ~FindListing() {
    if (IsOpen()) _findclose(m_handle);
  }
  FindListing(const FindListing &) = delete;
  FindListing &operator=(const FindListing &) = delete;

  bool IsOpen() const { return m_handle != -1; }
  intptr_t Handle() const { return m_handle; }

 private:
  intptr_t m_handle;
};
}  // namespace

void EmptyCatalogue() { g_pCatalogue->SetSize(0, kCatalogueGrowBy); }

bool ScanFolder(const std::string &path, const char *extension) {
  EmptyCatalogue();
  if (g_pDoc) g_pDoc->m_strPath = path;
  // Other windows build file paths from the current directory.
  SetCurrentDirectoryA(path.c_str());

  // The separator goes in even after a root's own "\": "C:\\*" lists the root all the same.
  _finddata64i32_t entry;
  const FindListing listing(_findfirst64i32((path + "\\*").c_str(), &entry));
  if (!listing.IsOpen()) return false;
  ListingCollector records;
  do {
    if (TakeListingEntry(entry.name, (entry.attrib & _A_SUBDIR) != 0, extension))
      records.Add(entry.name, entry.time_write, static_cast<uint32_t>(entry.size));
  } while (_findnext64i32(listing.Handle(), &entry) == 0);
  records.MoveInto(*g_pCatalogue, kCatalogueGrowBy);
  return true;
}
