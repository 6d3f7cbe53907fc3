// Decoding the bitmaps that drawings store, in every layout a writer may use, and refusing the
// ones that lie about themselves.
#include "PreviewTestFiles.h"
#include "preview/DibDecoder.h"

#include <gtest/gtest.h>

using namespace devhost::preview;
using previewtest::Bytes;
using previewtest::DibSpec;

namespace {

DecodedPicture decode(const Bytes &dib) {
  DecodedPicture picture;
  EXPECT_TRUE(decodeDib(dib.data(), dib.size(), picture));
  return picture;
}

bool refuses(const Bytes &dib) {
  DecodedPicture picture;
  const bool ok = decodeDib(dib.data(), dib.size(), picture);
  return !ok && picture.pixels.empty() && picture.width == 0;
}

DibSpec spec(int32_t width, int32_t height, uint16_t bitCount) {
  DibSpec s;
  s.width = width;
  s.height = height;
  s.bitCount = bitCount;
  return s;
}

constexpr uint32_t kBlack = 0xFF000000, kWhite = 0xFFFFFFFF, kRed = 0xFFFF0000, kGreen = 0xFF00FF00, kBlue = 0xFF0000FF;

}  // namespace

TEST(PreviewBitmap, PalettedDepthsReadBitsFromTheHighEnd) {
  // 1 bit, 10 pixels wide: two bytes of pixels padded to four; bottom row first in the file.
  DibSpec one = spec(10, 2, 1);
  one.palette = {0x000000, 0xFFFFFF};
  const auto mono = decode(buildDib(one, {0x00, 0x00, 0, 0, /* top: */ 0x80, 0x40, 0, 0}));
  ASSERT_EQ(mono.width, 10u);
  ASSERT_EQ(mono.height, 2u);
  EXPECT_EQ(mono.pixels[0], kWhite);
  EXPECT_EQ(mono.pixels[1], kBlack);
  EXPECT_EQ(mono.pixels[9], kWhite);
  EXPECT_EQ(mono.pixels[10 + 0], kBlack);

  DibSpec four = spec(3, 1, 4);
  four.colorsUsed = 3;
  four.palette = {0x0000FF, 0x00FF00, 0xFF0000};
  const auto nibbles = decode(buildDib(four, {0x21, 0x00, 0, 0}));
  EXPECT_EQ(nibbles.pixels, (std::vector<uint32_t>{kRed, kGreen, kBlue}));

  // A short palette: indices past it show black.
  DibSpec eight = spec(3, 1, 8);
  eight.colorsUsed = 2;
  eight.palette = {0xFFFFFF, 0xFF0000};
  const auto indexed = decode(buildDib(eight, {1, 0, 200, 0}));
  EXPECT_EQ(indexed.pixels, (std::vector<uint32_t>{kRed, kWhite, kBlack}));
}

TEST(PreviewBitmap, SixteenBitsAsFiveFiveFiveOrWithMasks) {
  DibSpec plain = spec(2, 1, 16);
  // 5-5-5: pure red and full white, each channel stretched to the full 8-bit range.
  const auto rgb555 = decode(buildDib(plain, {0x00, 0x7C, 0xFF, 0x7F}));
  EXPECT_EQ(rgb555.pixels, (std::vector<uint32_t>{kRed, kWhite}));

  DibSpec fields = spec(3, 1, 16);
  fields.compression = 3;
  fields.masks = {0xF800, 0x07E0, 0x001F};  // 5-6-5
  const auto rgb565 = decode(buildDib(fields, {0x00, 0xF8, 0xE0, 0x07, 0x1F, 0x00, 0, 0}));
  EXPECT_EQ(rgb565.pixels, (std::vector<uint32_t>{kRed, kGreen, kBlue}));
}

TEST(PreviewBitmap, TrueColourRowsPaddingAndOrientation) {
  // Three pixels of 24 bits: nine bytes padded to twelve per row.
  const Bytes rows = {0,   0,   255, 0, 255, 0, 255, 0, 0, 0, 0, 0, /* second row */
                      255, 255, 255, 0, 0,   0, 0,   0, 0, 9, 9, 9};
  const auto bottomUp = decode(buildDib(spec(3, 2, 24), rows));
  EXPECT_EQ(bottomUp.pixels, (std::vector<uint32_t>{kWhite, kBlack, kBlack, kRed, kGreen, kBlue}));
  const auto topDown = decode(buildDib(spec(3, -2, 24), rows));
  EXPECT_EQ(topDown.height, 2u);
  EXPECT_EQ(topDown.pixels, (std::vector<uint32_t>{kRed, kGreen, kBlue, kWhite, kBlack, kBlack}));

  // 32 bits: the fourth byte is not alpha in a plain bitmap, so the picture stays opaque.
  const auto plain32 = decode(buildDib(spec(2, 1, 32), {0, 0, 255, 0, 255, 255, 255, 0x80}));
  EXPECT_EQ(plain32.pixels, (std::vector<uint32_t>{kRed, kWhite}));
  EXPECT_FALSE(plain32.hasAlpha);

  // 32 bits with masks inside a version 5 header, channels in an unusual order.
  DibSpec v5 = spec(1, 1, 32);
  v5.compression = 3;
  v5.headerSize = 124;
  v5.masks = {0x000000FF, 0x0000FF00, 0x00FF0000};
  EXPECT_EQ(decode(buildDib(v5, {0x11, 0x22, 0x33, 0})).pixels[0], 0xFF112233u);
}

TEST(PreviewBitmapHostile, ImpossibleHeadersAndClaimsBeyondTheEntryAreRefused) {
  const Bytes pixel = {1, 2, 3, 0};
  EXPECT_TRUE(refuses({}));
  EXPECT_TRUE(refuses(Bytes(39, 0)));
  for (int32_t width : {0, -1, 4097, INT32_MIN}) EXPECT_TRUE(refuses(buildDib(spec(width, 1, 24), pixel))) << "width " << width;
  for (int32_t height : {0, 4097, -4097, INT32_MIN}) EXPECT_TRUE(refuses(buildDib(spec(1, height, 24), pixel))) << height;
  for (uint16_t bits : {0, 2, 7, 48}) EXPECT_TRUE(refuses(buildDib(spec(1, 1, bits), Bytes(64, 0)))) << bits << " bits";
  const auto with = [](int32_t width, int32_t height, uint16_t bits, const std::function<void(DibSpec &)> &change) {
    DibSpec s = spec(width, height, bits);
    change(s);
    return s;
  };
  const std::pair<const char *, DibSpec> hostile[] = {
      {"header size 12", with(1, 1, 24, [](DibSpec &s) { s.headerSize = 12; })},
      {"header size past the entry", with(1, 1, 24, [](DibSpec &s) { s.headerSize = 0xFFFFFFFF; })},
      {"no planes", with(1, 1, 24, [](DibSpec &s) { s.planes = 0; })},
      {"run-length compression", with(1, 1, 8, [](DibSpec &s) { s.compression = 1, s.palette = {0}; })},
      {"masks at 24 bits", with(1, 1, 24,
                                [](DibSpec &s) {
                                  s.compression = 3, s.masks = {0xFF0000, 0xFF00, 0xFF};
                                })},
      {"palette larger than the entry", with(1, 1, 8, [](DibSpec &s) { s.colorsUsed = 256, s.palette.resize(10); })},
      {"more colours than 4 bits index", with(1, 1, 4, [](DibSpec &s) { s.colorsUsed = 17, s.palette.resize(17); })},
      {"colours times four wrap", with(1, 1, 24, [](DibSpec &s) { s.colorsUsed = 0x40000000; })},
  };
  for (const auto &[what, dib] : hostile) EXPECT_TRUE(refuses(buildDib(dib, pixel))) << what;
  DibSpec cutMasks = spec(1, 1, 16);
  cutMasks.compression = 3;
  EXPECT_TRUE(refuses(buildDib(cutMasks, {}))) << "masks missing";
  // The largest allowed picture with its rows missing: refused before anything is allocated.
  EXPECT_TRUE(refuses(buildDib(spec(4096, 4096, 32), Bytes(4096, 0))));
  Bytes shortRow = buildDib(spec(3, 2, 24), Bytes(24, 0));
  shortRow.pop_back();
  EXPECT_TRUE(refuses(shortRow)) << "last row one byte short";
}
