#include "explorer/ShellString.h"

#include <vector>

bool CShellString::GetDisplayNameOf(IShellFolder *folder, LPCITEMIDLIST item, SHGDNF flags) {
  Reset();
  m_pidl.Reset(pidl::Copy(item));
  if (!folder || !m_pidl.Get()) return false;
  m_strRet.uType = STRRET_CSTR;
  if (SUCCEEDED(folder->GetDisplayNameOf(m_pidl.Get(), flags, &m_strRet))) return true;
  m_strRet = STRRET{};
  return false;
}

std::string CShellString::ToString() const {
  switch (m_strRet.uType) {
    case STRRET_WSTR: {
      if (!m_strRet.pOleStr) return {};
      const int bytes = WideCharToMultiByte(CP_ACP, 0, m_strRet.pOleStr, -1, nullptr, 0, nullptr, nullptr);
      if (bytes <= 1) return {};
      std::vector<char> text(static_cast<size_t>(bytes));
      WideCharToMultiByte(CP_ACP, 0, m_strRet.pOleStr, -1, text.data(), bytes, nullptr, nullptr);
      return text.data();
    }
    case STRRET_OFFSET:
      return m_pidl.Get() ? std::string(reinterpret_cast<const char *>(m_pidl.Get()) + m_strRet.uOffset) : std::string();
    case STRRET_CSTR: return std::string(m_strRet.cStr, strnlen(m_strRet.cStr, sizeof m_strRet.cStr));
    default: return {};
  }
}

void CShellString::Reset() {
  if (m_strRet.uType == STRRET_WSTR && m_strRet.pOleStr && m_malloc.Get()) m_malloc.Get()->Free(m_strRet.pOleStr);
  m_strRet = STRRET{};
}
