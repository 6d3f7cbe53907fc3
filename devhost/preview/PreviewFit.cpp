#include "preview/PreviewFit.h"

namespace devhost::preview {

FitRect fitCentred(uint32_t pictureWidth, uint32_t pictureHeight, int32_t areaWidth, int32_t areaHeight) {
  FitRect fit;
  if (pictureWidth == 0 || pictureHeight == 0 || areaWidth <= 0 || areaHeight <= 0) return fit;
  const uint64_t pw = pictureWidth, ph = pictureHeight;
  const uint64_t aw = uint64_t(areaWidth), ah = uint64_t(areaHeight);
  // Compare the aspect ratios by cross-multiplying, so no rounding decides which side limits.
  if (pw * ah >= ph * aw) {
    fit.width = areaWidth;
    fit.height = int32_t((ph * aw + pw / 2) / pw);
  } else {
    fit.height = areaHeight;
    fit.width = int32_t((pw * ah + ph / 2) / ph);
  }
  // A very thin picture still shows as a line rather than vanishing.
  if (fit.width == 0) fit.width = 1;
  if (fit.height == 0) fit.height = 1;
  fit.left = (areaWidth - fit.width) / 2;
  fit.top = (areaHeight - fit.height) / 2;
  return fit;
}

}  // namespace devhost::preview
