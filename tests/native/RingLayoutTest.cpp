// Where the view puts the scroll position for a top row: on the row grid, and in the capped
// range below the wrap, where a line step down still meets it.
#include "thumbs/RingLayout.h"

#include <gtest/gtest.h>

namespace {
TEST(RingLayout, TheScrollPositionOfATopRowStaysOnTheGridAndBelowTheWrap) {
  const struct {
    int topRow, rowStep, visibleRows, totalRows, remainder, position;
  } rows[] = {{50, 160, 4, 100, 0, 8000},      // uncapped: the row's own place
              {99, 160, 4, 100, 30, 15840},
              {0, 160, 4, 1000, 0, 0},
              {199, 160, 4, 1000, 0, 0},       // at the wrap, 31840, the line steps go on from 0
              {200, 160, 4, 1000, 0, 160},     // not 32000, beyond the wrap at 31840
              {198, 163, 3, 1000, 0, 163},     // 32274 would lie beyond the wrap at 32111
              {996, 197, 4, 1000, 50, 5910},
              {245, 160, 4, 250, 30, 7360}};   // 39200 wrapped by 31840, not by the uncapped range
  for (const auto &row : rows)
    EXPECT_EQ(ScrollPositionForTopRow(row.topRow, row.rowStep, row.visibleRows, row.totalRows, row.remainder), row.position)
        << row.topRow << " " << row.rowStep;
}
}  // namespace
