// One drawing of the shown folder, as the directory listing describes it.
#pragma once

#include "fw/Array.h"

#include <cstdint>
#include <string>

class DwgData {
 public:
  DwgData() = default;
  DwgData(std::string lowerName, int64_t lastWrite, uint32_t fileSize)
      : m_strDwgName(std::move(lowerName)), m_tLastWrite(lastWrite), m_nFileSize(fileSize) {}
  DwgData(const DwgData &) = default;
  DwgData &operator=(const DwgData &) = default;
  // Moving keeps the growth of a large catalogue from copying every name again.
  DwgData(DwgData &&) noexcept = default;
  DwgData &operator=(DwgData &&) noexcept = default;
  virtual ~DwgData() = default;

  bool IsSelected() const { return m_bSelected != 0; }
  void Select() { m_bSelected = 1; }
  void Deselect() { m_bSelected = 0; }

  unsigned char m_bSelected = 0;
  std::string m_strDwgName;
  int64_t m_tLastWrite = 0;
  uint32_t m_nFileSize = 0;
};

using DwgCatalogue = fw::CArray<DwgData>;

// The catalogue of the shown folder, for the module's whole life.
extern DwgCatalogue *const g_pCatalogue;
