// Where the explorer frame opens: centred on the hidden dialog with the remembered size (the
// vertical term is the historical formula), maximised when both coordinates clamp, left where
// the system put it without a remembered size.
#include "explorer/FramePlacement.h"

#include <gtest/gtest.h>

namespace {
TEST(PlaceFrame, PositionMaximisedAndResized) {
  const DialogRect centred{736, 485, 932, 534};
  const struct {
    DialogRect dialog;
    int width, height, x, y;
    bool maximized, resized;
  } rows[] = {{centred, 1000, 700, 334, 135, false, true},  {centred, 0, 0, 834, 485, false, false},
              {centred, 800, 0, 434, 485, false, false},    {centred, 0, 600, 834, 185, false, false},
              {centred, 4000, 3000, 0, 0, true, false},     {centred, 4000, 400, 0, 285, false, true},
              {{0, 0, 101, 41}, 51, 11, 25, 0, false, true}};
  for (const auto &row : rows) {
    const FramePlacement placement = PlaceFrame(row.dialog, row.width, row.height);
    SCOPED_TRACE(testing::Message() << row.width << "x" << row.height);
    EXPECT_EQ(placement.x, row.x);
    EXPECT_EQ(placement.y, row.y);
    EXPECT_EQ(placement.maximized, row.maximized);
    EXPECT_EQ(placement.resized, row.resized);
  }
}
}  // namespace
