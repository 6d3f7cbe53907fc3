#include "catalogue/StateSizes.h"

#include <algorithm>

namespace {
// 0 (not set) for 0 or less, else held between low and high.
int SetOrNot(int value, int low, int high) { return value > 0 ? std::clamp(value, low, high) : 0; }
}  // namespace

StateSizes LimitStateSizes(StateSizes read) {
  StateSizes sizes;
  if (read.splitterSize > 0) sizes.splitterSize = std::min(read.splitterSize, kMaxWindowExtent);
  sizes.windowWidth = SetOrNot(read.windowWidth, 1, kMaxWindowExtent);
  sizes.windowHeight = SetOrNot(read.windowHeight, 1, kMaxWindowExtent);
  sizes.pictureWidth = SetOrNot(read.pictureWidth, kMinPictureSide, kMaxPictureSide);
  sizes.pictureHeight = SetOrNot(read.pictureHeight, kMinPictureSide, kMaxPictureSide);
  return sizes;
}

StateSizes ReadStateSizes(CIniFile &ini) {
  StateSizes read;
  read.splitterSize = ini.GetInt("Size", "SplitterSize");
  read.windowWidth = ini.GetInt("Size", "WindowWidth");
  read.windowHeight = ini.GetInt("Size", "WindowHeight");
  read.pictureWidth = ini.GetInt("View", "PictureWidth");
  read.pictureHeight = ini.GetInt("View", "PictureHeight");
  return LimitStateSizes(read);
}
