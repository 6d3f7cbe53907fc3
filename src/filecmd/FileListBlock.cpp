#include "filecmd/FileListBlock.h"

#include <cstdint>
#include <cstring>

namespace {
void AppendUint32(std::string &out, uint32_t value) {
  for (int i = 0; i < 4; ++i) out.push_back(static_cast<char>((value >> (8 * i)) & 0xFF));
}

// Header fields are little-endian as Windows writes them; the block may sit at any alignment.
uint32_t ReadUint32(const unsigned char *at) {
  return static_cast<uint32_t>(at[0]) | static_cast<uint32_t>(at[1]) << 8 | static_cast<uint32_t>(at[2]) << 16 |
         static_cast<uint32_t>(at[3]) << 24;
}
}  // namespace

std::string EncodeFileList(const std::vector<std::string> &paths) {
  std::string block;
  AppendUint32(block, static_cast<uint32_t>(kFileListHeaderSize));
  AppendUint32(block, 0);  // drop point x
  AppendUint32(block, 0);  // drop point y
  AppendUint32(block, 0);  // not in the non-client area
  AppendUint32(block, 0);  // narrow text
  for (const std::string &path : paths) {
    block.append(path.c_str());
    block.push_back('\0');
  }
  block.push_back('\0');
  return block;
}

FileListReader::FileListReader(const void *block, size_t size)
    : m_pBlock(static_cast<const unsigned char *>(block)), m_nSize(block ? size : 0), m_nPos(m_nSize) {
  if (m_nSize < kFileListHeaderSize) return;
  const uint32_t offset = ReadUint32(m_pBlock);
  if (offset < kFileListHeaderSize || offset > m_nSize) return;
  m_nPos = offset;
  m_bWide = ReadUint32(m_pBlock + 16) != 0;
}

bool FileListReader::NextNarrow(std::string &path) {
  if (m_bWide || m_nPos >= m_nSize || m_pBlock[m_nPos] == 0) return false;
  const unsigned char *start = m_pBlock + m_nPos;
  const size_t rest = m_nSize - m_nPos;
  const void *nul = std::memchr(start, 0, rest);
  const size_t length = nul ? static_cast<size_t>(static_cast<const unsigned char *>(nul) - start) : rest;
  path.assign(reinterpret_cast<const char *>(start), length);
  m_nPos += nul ? length + 1 : length;
  return true;
}

bool FileListReader::NextWide(std::u16string &path) {
  path.clear();
  if (!m_bWide) return false;
  while (m_nSize - m_nPos >= 2) {
    const char16_t unit = static_cast<char16_t>(m_pBlock[m_nPos] | m_pBlock[m_nPos + 1] << 8);
    m_nPos += 2;
    if (unit == 0) break;
    path.push_back(unit);
  }
  if (path.empty()) {
    m_nPos = m_nSize;  // the list has ended; later calls find nothing either
    return false;
  }
  return true;
}
