// The clipboard's file-list block: what the copy command writes and how any block is read back.
#include "filecmd/FileListBlock.h"

#include <gtest/gtest.h>

#include <string>
#include <vector>

namespace {
// `point` fills the drop point and the non-client flag, which a reader must never take for paths.
std::string Header(uint32_t offset, uint32_t wide, char point = '\0') {
  std::string header(kFileListHeaderSize, point);
  for (int i = 0; i < 4; ++i) {
    header[i] = static_cast<char>(offset >> (8 * i));
    header[16 + i] = static_cast<char>(wide >> (8 * i));
  }
  return header;
}

std::vector<std::string> NarrowPaths(const std::string &block) {
  FileListReader reader(block.data(), block.size());
  std::vector<std::string> paths;
  std::string path;
  while (reader.NextNarrow(path)) paths.push_back(path);
  return paths;
}

std::vector<std::u16string> WidePaths(const std::string &block) {
  FileListReader reader(block.data(), block.size());
  std::vector<std::u16string> paths;
  std::u16string path;
  while (reader.NextWide(path)) paths.push_back(path);
  return paths;
}

std::string WideBytes(const std::u16string &text) {
  std::string bytes;
  for (char16_t unit : text) {
    bytes.push_back(static_cast<char>(unit & 0xFF));
    bytes.push_back(static_cast<char>(unit >> 8));
  }
  return bytes;
}

using Paths = std::vector<std::string>;

TEST(FileListBlock, CopyIsHeaderThenNarrowPathsThenFinalNulAndReadsBackAsWritten) {
  EXPECT_EQ(EncodeFileList({"C:\\Work\\a.dwg", "C:\\Work\\c.dwg"}),
            Header(20, 0) + std::string("C:\\Work\\a.dwg\0C:\\Work\\c.dwg\0\0", 29));
  EXPECT_EQ(EncodeFileList({}), Header(20, 0) + std::string(1, '\0'));
  EXPECT_TRUE(NarrowPaths(EncodeFileList({})).empty());
  const Paths written{"C:\\a.dwg", "Z:\\tmp\\notes.txt", "\\\\server\\share\\x.DWG"};
  const std::string block = EncodeFileList(written);
  EXPECT_FALSE(FileListReader(block.data(), block.size()).IsWide());
  EXPECT_EQ(NarrowPaths(block), written);
}

TEST(FileListBlock, ListIsReadFromTheOffsetTheHeaderGivesToTheFirstEmptyPath) {
  EXPECT_EQ(NarrowPaths(Header(24, 0) + "junk" + std::string("C:\\x.dwg\0\0b\0\0", 13)), Paths{"C:\\x.dwg"});
}

TEST(FileListBlock, BlockIsNeverReadPastItsEnd) {
  // Without its NULs the list ends at the block's end.
  EXPECT_EQ(NarrowPaths(Header(20, 0) + "C:\\a.dwg"), Paths{"C:\\a.dwg"});
  EXPECT_EQ(NarrowPaths(Header(20, 0) + std::string("C:\\a\0C:\\b", 9)), (Paths{"C:\\a", "C:\\b"}));
  // Offsets into the header, past the end or far out of range give no paths; those into the
  // header come first, so that a reader that follows any offset fails here before it overruns.
  ASSERT_EQ(NarrowPaths(Header(4, 0, 'H') + "abc"), Paths{});
  ASSERT_EQ(NarrowPaths(Header(19, 0, 'H') + "abc"), Paths{});
  ASSERT_EQ(WidePaths(Header(8, 1, 'H') + WideBytes(u"C:\\a")), std::vector<std::u16string>{});
  ASSERT_EQ(WidePaths(Header(16, 1, 'H') + WideBytes(u"C:\\a")), std::vector<std::u16string>{});
  EXPECT_TRUE(NarrowPaths(Header(30, 0, 'H') + "abc").empty());
  EXPECT_TRUE(NarrowPaths(Header(0xFFFFFFFFu, 0, 'H') + "abc").empty());
  EXPECT_TRUE(WidePaths(Header(0xFFFFFFF0u, 1, 'H') + WideBytes(u"C:\\a")).empty());
  // Too short for a header, or no block at all.
  EXPECT_TRUE(NarrowPaths(Header(20, 0).substr(0, 19)).empty());
  FileListReader none(nullptr, 100);
  std::string path;
  EXPECT_FALSE(none.NextNarrow(path));
}

TEST(FileListBlock, WideListGivesWholePathsNotOneCharacterEachReadWithinTheBlock) {
  const std::u16string first = u"C:\\Pl\u00e4ne\\a.dwg", second = u"Z:\\notes.txt";
  const std::string block = Header(20, 1) + WideBytes(first) + std::string(2, '\0') + WideBytes(second) + std::string(4, '\0');
  FileListReader reader(block.data(), block.size());
  EXPECT_TRUE(reader.IsWide());
  std::string narrow;
  EXPECT_FALSE(reader.NextNarrow(narrow));
  EXPECT_EQ(WidePaths(block), (std::vector<std::u16string>{first, second}));

  // An odd offset, a missing final NUL and a dangling half unit are all read safely.
  const std::string odd = Header(21, 1) + "#" + WideBytes(u"C:\\a") + std::string(2, '\0') + WideBytes(u"C:\\b") + "x";
  EXPECT_EQ(WidePaths(odd), (std::vector<std::u16string>{u"C:\\a", u"C:\\b"}));
  EXPECT_TRUE(WidePaths(Header(20, 1)).empty());
  EXPECT_TRUE(WidePaths(Header(20, 1) + "x").empty());
}
}  // namespace
