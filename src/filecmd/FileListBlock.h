// The shell's file-list block (clipboard format CF_HDROP): a 20-byte header, then the paths,
// each ended by a NUL, then one more NUL. The header says where the list starts and whether it
// is narrow (ANSI) or wide (UTF-16) text.
#pragma once

#include <cstddef>
#include <string>
#include <vector>

constexpr size_t kFileListHeaderSize = 20;

// The block the copy command puts on the clipboard: list at offset 20, drop point 0,0 in the
// client area, narrow text. A path is written up to its first NUL.
std::string EncodeFileList(const std::vector<std::string> &paths);

// Walks the paths of a block that came from anywhere (another program may have written it)
// without reading past its end: a block too short for its header, or whose list offset points
// into the header or past the end, has no paths; a list without its final NUL ends at the
// block's end.
class FileListReader {
 public:
  FileListReader(const void *block, size_t size);

  bool IsWide() const { return m_bWide; }
  // The next path of a narrow list; false at the list's end (and always for a wide list).
  bool NextNarrow(std::string &path);
  // The next path of a wide list, as UTF-16 code units; false at the end (always for narrow).
  bool NextWide(std::u16string &path);

 private:
  const unsigned char *m_pBlock;
  size_t m_nSize;
  size_t m_nPos;
  bool m_bWide = false;
};
