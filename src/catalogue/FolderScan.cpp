#include "catalogue/FolderScan.h"

#include "catalogue/DwgData.h"
#include "catalogue/ListingCollector.h"
#include "catalogue/Ombra3Doc.h"
#include "catalogue/ScanFilter.h"
#include "host/TextConvert.h"

#include <windows.h>

#include <io.h>

#include <cstring>

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

// The entry's name in the ANSI code page, false when it has no exact form there. ASCII, the
// usual name, reads the same in every ANSI code page: only other names take the conversion.
bool AnsiName(const wchar_t *wide, std::string &name) {
  name.clear();
  for (const wchar_t *c = wide; *c; ++c) {
    if (*c >= 0x80) return ToAnsiExact(wide, name);
    name.push_back(static_cast<char>(*c));
  }
  return true;
}

// The scan's filter for a name that has no ANSI form, on its wide text: is it one of the
// entries the scan would take?
bool WouldTake(std::wstring name, bool isFolder, const char *extension) {
  if (isFolder && name[0] != L'.') return false;
  for (wchar_t &c : name)
    if (c >= L'A' && c <= L'Z') c = static_cast<wchar_t>(c - L'A' + L'a');
  return name.find(std::wstring(extension, extension + std::strlen(extension))) != std::wstring::npos;
}
}  // namespace

void EmptyCatalogue() {
  g_pCatalogue->SetSize(0, kCatalogueGrowBy);
  if (g_pDoc) {
    g_pDoc->m_bFolderShown = false;
    g_pDoc->m_nDrawingsLeftOut = 0;
  }
}

bool ScanFolder(const std::string &path, const char *extension) {
  EmptyCatalogue();
  if (g_pDoc) {
    g_pDoc->m_strPath = path;
    g_pDoc->m_bFolderShown = true;
  }
  // Other windows build file paths from the current directory.
  SetCurrentDirectoryA(path.c_str());

  // The separator goes in even after a root's own "\": "C:\\*" lists the root all the same.
  // Listed wide, so that a name the code page cannot hold is seen as such.
  _wfinddata64i32_t entry;
  const FindListing listing(_wfindfirst64i32((ToWide(path.c_str()) + L"\\*").c_str(), &entry));
  if (!listing.IsOpen()) return false;
  ListingCollector records;
  int leftOut = 0;
  std::string name;
  do {
    const bool isFolder = (entry.attrib & _A_SUBDIR) != 0;
    if (!AnsiName(entry.name, name)) {
      if (WouldTake(entry.name, isFolder, extension)) ++leftOut;
    } else if (TakeListingEntry(name.data(), isFolder, extension)) {
      records.Add(name.c_str(), entry.time_write, static_cast<uint32_t>(entry.size));
    }
  } while (_wfindnext64i32(listing.Handle(), &entry) == 0);
  records.MoveInto(*g_pCatalogue, kCatalogueGrowBy);
  if (g_pDoc) g_pDoc->m_nDrawingsLeftOut = leftOut;
  return true;
}
