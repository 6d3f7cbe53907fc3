// The preview directory of drawings: real files from CAD applications, and damaged or hostile
// ones built in memory.
#include "PreviewTestFiles.h"
#include "preview/PreviewDirectory.h"

#include <gtest/gtest.h>

#include <filesystem>
#include <fstream>
#include <iterator>

using namespace devhost::preview;
using previewtest::Bytes;

namespace {

// Counts what a parse costs, so the tests can hold it to "header and picture only"; it may claim
// to be larger than the bytes it holds.
class CountingSource final : public PreviewSource {
 public:
  explicit CountingSource(const Bytes &bytes, uint64_t size = 0) : m_inner(bytes.data(), bytes.size()), m_size(size) {}
  uint64_t size() const override { return m_size ? m_size : m_inner.size(); }
  bool read(uint64_t offset, void *into, size_t count) override {
    m_bytesRead += count;
    return m_inner.read(offset, into, count);
  }
  uint64_t bytesRead() const { return m_bytesRead; }

 private:
  MemorySource m_inner;
  uint64_t m_size, m_bytesRead = 0;
};

std::filesystem::path fixtureFolder() { return std::filesystem::path(LUMVEX_FIXTURES_DIR) / "dwg"; }

Bytes readFile(const std::filesystem::path &path) {
  std::ifstream in(path, std::ios::binary);
  return Bytes(std::istreambuf_iterator<char>(in), {});
}

std::optional<PreviewDirectory> directoryOf(const Bytes &file) {
  MemorySource source(file.data(), file.size());
  return readPreviewDirectory(source);
}

struct FixtureCase {
  const char *file;
  bool hasDirectory;
  size_t entryCount;
  uint8_t chosenCode;  // 0: no picture
  uint32_t chosenSize;
};

const FixtureCase kFixtures[] = {
    {"r14-example.dwg", true, 2, kBitmap, 31304},   {"r2000-arc.dwg", true, 2, kBitmap, 27176},
    {"r2004-hatch.dwg", true, 2, kBitmap, 21856},   {"r2007-two-bitmaps.dwg", true, 3, kBitmap, 163880},
    {"r2010-line.dwg", true, 2, kBitmap, 27176},    {"r2013-arc-png.dwg", true, 2, kPng, 1088},
    {"r2013-leader-png.dwg", true, 2, kPng, 14976}, {"r2018-header-only.dwg", true, 1, 0, 0},
    {"r2018-no-images.dwg", true, 0, 0, 0},         {"r11-no-preview.dwg", false, 0, 0, 0},
};

}  // namespace

TEST(PreviewFixtures, DirectoryPictureChoiceAndBytesRead) {
  if (!std::filesystem::is_directory(fixtureFolder())) GTEST_SKIP() << "no fixtures at " << fixtureFolder();
  for (const FixtureCase &c : kFixtures) {
    SCOPED_TRACE(c.file);
    const Bytes file = readFile(fixtureFolder() / c.file);
    ASSERT_FALSE(file.empty());
    CountingSource source(file);
    const auto directory = readPreviewDirectory(source);
    ASSERT_EQ(directory.has_value(), c.hasDirectory);
    if (!directory) continue;
    EXPECT_EQ(directory->entries.size(), c.entryCount);
    if (c.entryCount != 0) EXPECT_EQ(directory->entries.front().code, kHeaderData);

    const auto pictures = picturesByPreference(*directory);
    if (c.chosenCode == 0) {
      EXPECT_TRUE(pictures.empty());
      continue;
    }
    ASSERT_FALSE(pictures.empty());
    EXPECT_EQ(pictures.front().code, c.chosenCode);
    EXPECT_EQ(pictures.front().size, c.chosenSize);

    Bytes picture;
    ASSERT_TRUE(readEntryBytes(source, pictures.front(), picture));
    // The drawing itself is never read: only the directory and the chosen picture.
    EXPECT_LE(source.bytesRead(), picture.size() + 4096);
  }
}

TEST(PreviewDirectoryHostile, MissingOrDamagedDirectoryIsRefused) {
  const Bytes good = previewtest::buildDrawing({previewtest::headerData(), {kBitmap, Bytes(100, 1)}});
  ASSERT_TRUE(directoryOf(good));
  // The first `size` bytes of the good file with the 32-bit value (or the byte) at `at` changed.
  const auto changed = [&](size_t at, uint32_t value, size_t size, bool oneByte = false) {
    Bytes file(good.begin(), good.begin() + long(std::min(size, good.size())));
    if (oneByte) file[at] = uint8_t(value);
    if (!oneByte && at + 4 <= file.size()) previewtest::set32(file, at, value);
    return file;
  };
  const size_t address = previewtest::kDirectoryAddress;
  const std::pair<const char *, Bytes> damaged[] = {
      {"empty", Bytes()},
      {"address cut off", changed(0, 0, 0x10)},
      {"directory runs past the end", changed(0x0D, uint32_t(good.size() - 10), good.size())},
      {"address far past the end", changed(0x0D, 0xFFFFFFFF, good.size())},
      {"address pointing at itself", changed(0x0D, 0x0D, good.size())},
      {"wrong sentinel", changed(address + 15, good[address + 15] ^ 1u, good.size(), true)},
      {"table past the end", changed(address + 20, 255, address + 21 + 18, true)}};
  for (const auto &[what, file] : damaged) EXPECT_FALSE(directoryOf(file)) << what;
}

TEST(PreviewDirectoryHostile, EntriesOutsideTheFileAreDropped) {
  Bytes file = previewtest::buildDrawing(
      {previewtest::headerData(), {kPng, Bytes(64, 2)}, {kBitmap, Bytes(64, 3)}, {kMetafile, Bytes(64, 4)}});
  const size_t table = previewtest::kDirectoryAddress + 21;
  previewtest::set32(file, table + 9 + 5, uint32_t(file.size()));        // PNG: size beyond the file
  previewtest::set32(file, table + 18 + 1, 0xFFFFFFF0);                  // bitmap: start + size wraps
  previewtest::set32(file, table + 27 + 1, uint32_t(file.size() - 63));  // metafile: one byte short
  const auto directory = directoryOf(file);
  ASSERT_TRUE(directory);
  ASSERT_EQ(directory->entries.size(), 1u);
  EXPECT_EQ(directory->entries[0].code, kHeaderData);
  EXPECT_TRUE(picturesByPreference(*directory).empty());
}

TEST(PreviewDirectory, PreferencePngThenLargestBitmapThenMetafile) {
  const Bytes file = previewtest::buildDrawing({previewtest::headerData(), {kMetafile, Bytes(500, 0)}, {kBitmap, Bytes(100, 0)},
                                                {9, Bytes(900, 0)}, {kBitmap, Bytes(300, 0)}, {kPng, Bytes(50, 0)}, {kBitmap, Bytes()}});
  std::vector<std::pair<int, uint32_t>> pictures;
  for (const PreviewEntry &entry : picturesByPreference(*directoryOf(file))) pictures.emplace_back(entry.code, entry.size);
  EXPECT_EQ(pictures, (std::vector<std::pair<int, uint32_t>>{{kPng, 50}, {kBitmap, 300}, {kBitmap, 100}, {kMetafile, 500}}))
      << "header data, unknown codes and empty entries are no pictures";
}

TEST(PreviewDirectory, OversizedPictureIsNeitherChosenNorRead) {
  // The entry claims more than any preview may hold; the source claims to be that large.
  Bytes file = previewtest::buildDrawing({previewtest::headerData(), {kBitmap, Bytes(16, 0)}});
  previewtest::set32(file, previewtest::kDirectoryAddress + 21 + 9 + 5, kMaxPictureBytes + 1);
  CountingSource source(file, 1ull << 32);
  const auto directory = readPreviewDirectory(source);
  ASSERT_TRUE(directory);
  ASSERT_EQ(directory->entries.size(), 2u);
  EXPECT_TRUE(picturesByPreference(*directory).empty());
  Bytes bytes;
  EXPECT_FALSE(readEntryBytes(source, directory->entries[1], bytes));
  EXPECT_TRUE(bytes.empty());
}
