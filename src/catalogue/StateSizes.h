// The sizes the explorer state file keeps. The file is edited by hand, so every number read
// from it is brought into what the frame and the thumbnail view can show: a picture height of
// minus the caption height once made the row step zero, and the view divided by it.
#pragma once

#include "settings/IniFile.h"

// The smallest picture side the Decrease command can give (it stops below 20, and 20 / 1.25
// is 16), and a largest side and window extent well within the view's 32768-pixel scroll range.
constexpr int kMinPictureSide = 16;
constexpr int kMaxPictureSide = 4096;
constexpr int kMaxWindowExtent = 16384;
constexpr int kDefaultSplitterSize = 100;

struct StateSizes {
  int splitterSize = kDefaultSplitterSize;
  int windowWidth = 0;  // 0: the frame keeps the size it was created with
  int windowHeight = 0;
  int pictureWidth = 0;  // 0: the view keeps its default picture size
  int pictureHeight = 0;
};

// A splitter width of 0 or less is the default; any other side of 0 or less is not set (the
// frame keeps its created size, the view its default picture, as for a missing value); the
// rest are held between the limits above.
StateSizes LimitStateSizes(StateSizes read);

// The "Size" and "View" numbers of a loaded state file, limited as above.
StateSizes ReadStateSizes(CIniFile &ini);
