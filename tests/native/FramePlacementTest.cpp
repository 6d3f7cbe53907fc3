// Where the explorer frame opens: centred on the hidden dialog with the remembered size,
// maximised when both coordinates clamp, left alone without a remembered size.
#include "explorer/FramePlacement.h"

#include <gtest/gtest.h>

namespace {
const DialogRect kCentredDialog{736, 485, 932, 534};

TEST(PlaceFrame, RememberedSizeIsCentredHorizontallyAndPlacedByTheVerticalFormula) {
  const FramePlacement placement = PlaceFrame(kCentredDialog, 1000, 700);
  EXPECT_EQ(placement.x, 834 - 500);
  EXPECT_EQ(placement.y, 509 - (700 - 485 + 534) / 2);
  EXPECT_TRUE(placement.resized);
  EXPECT_FALSE(placement.maximized);
}

TEST(PlaceFrame, NoRememberedSizeLeavesTheFrameWhereTheSystemPutIt) {
  for (auto [width, height] : {std::pair{0, 0}, std::pair{800, 0}, std::pair{0, 600}}) {
    const FramePlacement placement = PlaceFrame(kCentredDialog, width, height);
    EXPECT_FALSE(placement.resized) << width << "x" << height;
    EXPECT_FALSE(placement.maximized) << width << "x" << height;
  }
}

TEST(PlaceFrame, HugeSizeClampsBothToZeroAndMaximises) {
  const FramePlacement placement = PlaceFrame(kCentredDialog, 4000, 3000);
  EXPECT_EQ(placement.x, 0);
  EXPECT_EQ(placement.y, 0);
  EXPECT_TRUE(placement.maximized);
  EXPECT_FALSE(placement.resized) << "the remembered size is not applied";
}

TEST(PlaceFrame, OneClampedCoordinateStillMovesWithTheRememberedSize) {
  const FramePlacement placement = PlaceFrame(kCentredDialog, 4000, 400);
  EXPECT_EQ(placement.x, 0);
  EXPECT_GT(placement.y, 0);
  EXPECT_TRUE(placement.resized);
  EXPECT_FALSE(placement.maximized);
}

TEST(PlaceFrame, DivisionTruncatesTowardZero) {
  const FramePlacement placement = PlaceFrame({0, 0, 101, 41}, 51, 11);
  EXPECT_EQ(placement.x, 50 - 25);
  EXPECT_EQ(placement.y, std::max(20 - (11 - 0 + 41) / 2, 0));
}
}  // namespace
