#include "thumbs/RingLayout.h"

#include <algorithm>

namespace {
constexpr double kPictureStep = 1.25;

int RoundHalfUp(double value) { return static_cast<int>(value + 0.5); }
}  // namespace

int ColumnsThatFit(int width, int gap, int colStep) {
  if (colStep <= 0) return 1;
  return std::max(1, (width + gap) / colStep);
}

int CappedTotalHeight(int rowStep, int rows, int remainder) {
  const long long total = static_cast<long long>(rowStep) * rows + remainder;
  if (total <= kMaxScrollHeight || rowStep <= 0) return static_cast<int>(total);
  return kMaxScrollHeight - kMaxScrollHeight % rowStep;
}

int RowsFor(int recordCount, int columns) {
  if (columns <= 0 || recordCount <= 0) return 0;
  return static_cast<int>((static_cast<long long>(recordCount) + columns - 1) / columns);
}

int ScrollPositionForTopRow(int topRow, int rowStep, int visibleRows, int totalRows, int remainder) {
  if (rowStep <= 0 || topRow <= 0) return 0;
  const long long place = static_cast<long long>(rowStep) * topRow;
  if (static_cast<long long>(rowStep) * totalRows + remainder <= kMaxScrollHeight) return static_cast<int>(place);
  const long long wrap = CappedTotalHeight(rowStep, totalRows, remainder) - static_cast<long long>(rowStep) * (visibleRows + 1);
  return wrap > 0 ? static_cast<int>(place % wrap) : 0;
}

int TopRowForColumns(int oldTopRow, int oldColumns, int newColumns, int recordCount) {
  if (newColumns <= 0) return 0;
  const long long top = static_cast<long long>(oldColumns) * oldTopRow / newColumns;
  return static_cast<int>(std::min<long long>(top, recordCount));
}

PictureSize LargerPicture(PictureSize size) {
  return {RoundHalfUp(size.width * kPictureStep), RoundHalfUp(size.height * kPictureStep)};
}

PictureSize SmallerPicture(PictureSize size) {
  return {RoundHalfUp(size.width / kPictureStep), RoundHalfUp(size.height / kPictureStep)};
}
