// Where a preview lands in its window, and what kind of metafile a drawing stores.
#include "PreviewTestFiles.h"
#include "preview/MetafileLayout.h"
#include "preview/PreviewFit.h"

#include <gtest/gtest.h>

#include <tuple>

using namespace devhost::preview;
using previewtest::Bytes;

TEST(PreviewFit, ScalesToFitKeepingAspectAndCentres) {
  const struct {
    int32_t pictureWidth, pictureHeight, areaWidth, areaHeight, left, top, width, height;
  } rows[] = {{256, 160, 256, 160, 0, 0, 256, 160},
              {256, 102, 200, 200, 0, 60, 200, 80},   // wide picture: bands above and below
              {120, 200, 200, 200, 40, 0, 120, 200},  // tall picture: bands left and right
              {16, 10, 160, 160, 0, 30, 160, 100},    // small pictures grow
              {3, 1, 10, 10, 0, 3, 10, 3},            // an odd remainder stays centred
              {4096, 1, 100, 100, 0, 49, 100, 1},     // a line stays visible
              {4096, 4096, 0x7FFFFFFF, 1, 0x3FFFFFFF, 0, 1, 1}};
  for (const auto &r : rows) {
    const FitRect fit = fitCentred(r.pictureWidth, r.pictureHeight, r.areaWidth, r.areaHeight);
    EXPECT_EQ(std::make_tuple(fit.left, fit.top, fit.width, fit.height), std::make_tuple(r.left, r.top, r.width, r.height))
        << r.pictureWidth << "x" << r.pictureHeight << " in " << r.areaWidth << "x" << r.areaHeight;
  }
  for (const FitRect &fit :
       {fitCentred(0, 10, 100, 100), fitCentred(10, 0, 100, 100), fitCentred(10, 10, 0, 100), fitCentred(10, 10, 100, -5)})
    EXPECT_EQ(std::make_pair(fit.width, fit.height), std::make_pair(0, 0)) << "an empty picture or area gives nothing";
}

namespace {

Bytes enhancedMetafile(int32_t frameRight, int32_t frameBottom, uint32_t totalSize) {
  Bytes b;
  previewtest::put32(b, 1);   // EMR_HEADER
  previewtest::put32(b, 88);  // header size
  for (int32_t v : {0, 0, 100, 100, 0, 0, frameRight, frameBottom}) previewtest::put32(b, uint32_t(v));
  previewtest::put32(b, 0x464D4520);
  previewtest::put32(b, 0x10000);
  previewtest::put32(b, totalSize);
  b.resize(std::max<size_t>(totalSize, 88), 0);
  return b;
}

Bytes windowsMetafile(int16_t extentX, int16_t extentY) {
  Bytes b;
  previewtest::put16(b, 1);
  previewtest::put16(b, 9);
  previewtest::put16(b, 0x300);
  previewtest::put32(b, (18 + 10 + 6) / 2);
  previewtest::put16(b, 0);
  previewtest::put32(b, 5);
  previewtest::put16(b, 0);
  previewtest::put32(b, 5);  // SetWindowExt(y, x)
  previewtest::put16(b, 0x020C);
  previewtest::put16(b, uint16_t(extentY));
  previewtest::put16(b, uint16_t(extentX));
  previewtest::put32(b, 3);  // end of file
  previewtest::put16(b, 0);
  return b;
}

}  // namespace

TEST(PreviewMetafile, KindsAndAspectAndClaimsBeyondTheBytesRefused) {
  const Bytes emf = enhancedMetafile(2000, 1000, 120);
  const auto enhanced = inspectMetafile(emf.data(), emf.size());
  ASSERT_TRUE(enhanced);
  EXPECT_EQ(enhanced->kind, MetafileKind::Enhanced);
  EXPECT_EQ(enhanced->size, 120u);
  EXPECT_EQ(enhanced->aspectWidth, 2000u);
  EXPECT_EQ(enhanced->aspectHeight, 1000u);

  const Bytes wmf = windowsMetafile(640, 480);
  const auto plain = inspectMetafile(wmf.data(), wmf.size());
  ASSERT_TRUE(plain);
  EXPECT_EQ(plain->kind, MetafileKind::Windows);
  EXPECT_EQ(plain->offset, 0u);
  EXPECT_EQ(plain->aspectWidth, 640u);
  EXPECT_EQ(plain->aspectHeight, 480u);

  Bytes placeable;
  previewtest::put32(placeable, 0x9AC6CDD7);
  previewtest::put16(placeable, 0);
  for (int16_t v : {10, 20, 310, 120})  // left, top, right, bottom
    previewtest::put16(placeable, uint16_t(v));
  placeable.resize(22, 0);
  placeable.insert(placeable.end(), wmf.begin(), wmf.end());
  const auto withHeader = inspectMetafile(placeable.data(), placeable.size());
  ASSERT_TRUE(withHeader);
  EXPECT_EQ(withHeader->offset, 22u);
  EXPECT_EQ(withHeader->size, wmf.size());
  EXPECT_EQ(withHeader->aspectWidth, 300u);
  EXPECT_EQ(withHeader->aspectHeight, 100u);

  // Claims beyond the bytes are refused.
  EXPECT_FALSE(inspectMetafile(emf.data(), 119)) << "enhanced metafile cut short";
  EXPECT_FALSE(inspectMetafile(wmf.data(), wmf.size() - 2)) << "Windows metafile cut short";
  EXPECT_FALSE(inspectMetafile(placeable.data(), 20)) << "placeable header alone";
  EXPECT_FALSE(inspectMetafile(Bytes(100, 0xAB).data(), 100)) << "not a metafile";

  // A record claiming more than remains ends the search for the extent, nothing worse.
  Bytes badRecord = wmf;
  previewtest::set32(badRecord, 18, 0xFFFFFFFF);
  const auto layout = inspectMetafile(badRecord.data(), badRecord.size());
  ASSERT_TRUE(layout);
  EXPECT_EQ(layout->aspectWidth, 0u);
}

