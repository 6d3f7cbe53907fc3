#include "explorer/ProgressFill.h"

#include <algorithm>
#include <cmath>

namespace {
// Beyond this count exp() leaves the double range; the curve is at its end long before.
constexpr int kCurveLimit = 1775;
}  // namespace

int ProgressFillWidth(int total, int done) {
  if (done <= 0) return 0;
  if (total >= 1)
    return static_cast<int>(std::min<long long>(static_cast<long long>(done) * kProgressFillMax / total, kProgressFillMax));
  if (done >= kCurveLimit) return kProgressFillMax;
  const double n = done;
  const double e2 = std::exp(2.0);
  const double width =
      -std::trunc(-kProgressFillMax * (1.0 + n * 10.0 / 50.0 - 0.5 * std::log(std::exp(n * 20.0 / 50.0) + e2 - 1.0)));
  return std::clamp(static_cast<int>(width), 0, kProgressFillMax);
}
