// The arithmetic of the thumbnail view's grid: how many columns fit, the capped scroll height,
// the top row that keeps the same first drawing after a change of columns, and the steps of
// the picture size.
#pragma once

// The scroll range stays within 32768 pixels; longer folders wrap the scroll bar instead.
constexpr int kMaxScrollHeight = 32768;

// Whole tiles of colStep that fit into width (the last one without its gap), at least one.
int ColumnsThatFit(int width, int gap, int colStep);

// rowStep × rows + remainder, cut down to the largest multiple of rowStep within the cap.
int CappedTotalHeight(int rowStep, int rows, int remainder);

// Rows of `columns` that hold recordCount records.
int RowsFor(int recordCount, int columns);

// The scroll position at which the view shows topRow at the top. Within an uncapped range it is
// topRow's own place. In the capped range the line steps cycle the position through the row
// grid from 0 to the wrap, totalHeight − rowStep × (visibleRows + 1): the position lies on
// that grid and below the wrap, where a line step down still meets the wrap exactly.
int ScrollPositionForTopRow(int topRow, int rowStep, int visibleRows, int totalRows, int remainder);

// The row that holds the first drawing of oldTopRow laid out in oldColumns, once laid out in
// newColumns; never beyond recordCount.
int TopRowForColumns(int oldTopRow, int oldColumns, int newColumns, int recordCount);

struct PictureSize {
  int width;
  int height;
};
// One step larger (×1.25) and one step smaller (÷1.25), rounded half up.
PictureSize LargerPicture(PictureSize size);
PictureSize SmallerPicture(PictureSize size);
