// The sizes of a hand-edited state file, brought into what the explorer can show.
#include "catalogue/StateSizes.h"

#include <gtest/gtest.h>

#include <climits>

namespace {
TEST(StateSizes, EachValueIsHeldToWhatTheExplorerCanShow) {
  const struct {
    StateSizes read, used;
  } rows[] = {{{250, 800, 600, 200, 150}, {250, 800, 600, 200, 150}},
              {{0, 0, 0, 0, 0}, {100, 0, 0, 0, 0}},
              {{-5, -3, 600, -20, 143}, {100, 0, 600, 0, 143}},  // a negative side: not set
              {{100, 800, 600, 173, -20}, {100, 800, 600, 173, 0}},
              {{100, 800, 600, 1, 2}, {100, 800, 600, kMinPictureSide, kMinPictureSide}},
              {{INT_MAX, INT_MAX, 40000, 32769, INT_MAX},
               {kMaxWindowExtent, kMaxWindowExtent, kMaxWindowExtent, kMaxPictureSide, kMaxPictureSide}}};
  for (const auto &row : rows) {
    const StateSizes used = LimitStateSizes(row.read);
    EXPECT_EQ(used.splitterSize, row.used.splitterSize) << row.read.splitterSize;
    EXPECT_EQ(used.windowWidth, row.used.windowWidth) << row.read.windowWidth;
    EXPECT_EQ(used.windowHeight, row.used.windowHeight) << row.read.windowHeight;
    EXPECT_EQ(used.pictureWidth, row.used.pictureWidth) << row.read.pictureWidth;
    EXPECT_EQ(used.pictureHeight, row.used.pictureHeight) << row.read.pictureHeight;
  }
}
}  // namespace
