// Any state file loads into sizes within the explorer's limits that the thumbnail view can lay
// out: a positive row step, a scroll range within the cap, and scroll positions on the row grid
// and below the wrap for every top row.
#include "catalogue/StateSizes.h"
#include "settings/IniFile.h"
#include "thumbs/RingLayout.h"

#include <unistd.h>

#include <algorithm>
#include <cstdint>
#include <cstdio>
#include <fstream>
#include <string>

namespace {
constexpr int kGap = 5;
constexpr int kDefaultPictureWidth = 173, kDefaultPictureHeight = 143;

void Check(bool holds) {
  if (!holds) __builtin_trap();
}

struct ScratchFile {
  ScratchFile() : path("/tmp/StateLayoutFuzz-" + std::to_string(::getpid()) + ".ini") {}
  ~ScratchFile() { std::remove(path.c_str()); }
  std::string path;
};

void LayOut(const StateSizes &sizes, int captionHeight, int clientWidth, int clientHeight, int records, int wantedTop) {
  const bool stored = sizes.pictureWidth != 0 && sizes.pictureHeight != 0;
  const int pictureWidth = stored ? sizes.pictureWidth : kDefaultPictureWidth;
  const int pictureHeight = stored ? sizes.pictureHeight : kDefaultPictureHeight;
  const int rowStep = pictureHeight + captionHeight;
  const int colStep = pictureWidth + kGap;
  Check(rowStep > 0 && colStep > 0);
  const int columns = ColumnsThatFit(clientWidth, kGap, colStep);
  Check(columns >= 1 && columns <= std::max(1, (clientWidth + kGap) / (kMinPictureSide + kGap)));
  const int totalRows = RowsFor(records, columns);
  const int visibleRows = std::min(clientHeight / rowStep, totalRows);
  const int remainder = clientHeight % rowStep;
  const int total = CappedTotalHeight(rowStep, totalRows, remainder);
  Check(total >= 0 && total <= kMaxScrollHeight);
  if (totalRows > 0) Check(total >= rowStep);
  const bool capped = static_cast<long long>(rowStep) * totalRows + remainder > kMaxScrollHeight;
  for (const int top :
       {0, wantedTop % std::max(1, totalRows), std::max(0, totalRows - visibleRows), std::max(0, totalRows - 1)}) {
    const int position = ScrollPositionForTopRow(top, rowStep, visibleRows, totalRows, remainder);
    Check(position >= 0 && position % rowStep == 0);
    if (capped) Check(position + static_cast<long long>(rowStep) * (visibleRows + 1) <= total);
    // After a change to another column count the top row still holds a record.
    const int regrouped = TopRowForColumns(top, columns, columns + 1, records);
    Check(regrouped >= 0 && regrouped <= records);
  }
}
}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t *data, std::size_t size) {
  static const ScratchFile file;
  std::ofstream(file.path, std::ios::binary | std::ios::trunc)
      .write(reinterpret_cast<const char *>(data), static_cast<std::streamsize>(size));
  CIniFile ini;
  ini.SetFilePath(file.path);
  ini.Load();
  const StateSizes sizes = ReadStateSizes(ini);
  const auto within = [](int side, int low, int high) { return side == 0 || (side >= low && side <= high); };
  Check(sizes.splitterSize >= 1 && sizes.splitterSize <= kMaxWindowExtent);
  Check(within(sizes.windowWidth, 1, kMaxWindowExtent) && within(sizes.windowHeight, 1, kMaxWindowExtent));
  Check(within(sizes.pictureWidth, kMinPictureSide, kMaxPictureSide) &&
        within(sizes.pictureHeight, kMinPictureSide, kMaxPictureSide));
  const int wantedTop = size > 0 ? data[0] * 37 + static_cast<int>(size) : 0;
  for (const int captionHeight : {0, 20, 40})
    for (const auto &[width, height] : {std::pair{1, 1}, std::pair{800, 600}, std::pair{1600, 1000}})
      for (const int records : {0, 1, 1000, 6000, 1000000}) LayOut(sizes, captionHeight, width, height, records, wantedTop);
  return 0;
}
