// Fill width of the loading progress bar: the curve without an expected number, the share of a
// known total, and the bar's own width as the limit wherever the arithmetic would leave it.
#include "explorer/ProgressFill.h"

#include <gtest/gtest.h>

TEST(ProgressFill, WidthsForChildCounts) {
  struct Case {
    int total, done, width;
  };
  const Case cases[] = {
      {0, 0, 0},       {0, 1, 8},    {0, 2, 16},          {0, 3, 23}, {0, 5, 34}, {0, 10, 47},   {0, 20, 49},
      {0, 100, 50},    {-3, 10, 47}, {4, 1, 12},          {4, 4, 50}, {1, 1, 50}, {0, 1774, 50}, {0, 1775, 50},
      {0, 100000, 50}, {4, 9, 50},   {1, 2147483647, 50}, {0, -5, 0}, {4, -1, 0},
  };
  for (const Case &c : cases) EXPECT_EQ(ProgressFillWidth(c.total, c.done), c.width) << c.done << " of " << c.total;
}
