// A static splitter: a grid of pane windows with bars between them that the user drags to
// resize the panes. Panes are children of the splitter with ids AFX_IDW_PANE_FIRST + row * 16
// + col; the splitter owns the views it creates for them.
#pragma once

#include "fw/ControlBar.h"
#include "fw/View.h"

#include <memory>
#include <utility>
#include <vector>

namespace fw {

class CSplitterWnd : public CWnd {
 public:
  BOOL CreateStatic(CWnd *parent, int rows, int cols, DWORD style = WS_CHILD | WS_VISIBLE, UINT id = AFX_IDW_PANE_FIRST);
  // Creates the pane at (row, col) from view, initialSize giving the pane's ideal width and
  // height. On failure the view object is destroyed.
  BOOL CreateView(int row, int col, std::unique_ptr<CView> view, SIZE initialSize);
  template <class TView>
  BOOL CreateView(int row, int col, SIZE initialSize) {
    return CreateView(row, col, std::make_unique<TView>(), initialSize);
  }

  int GetRowCount() const { return static_cast<int>(m_rows.size()); }
  int GetColumnCount() const { return static_cast<int>(m_cols.size()); }
  CWnd *GetPane(int row, int col) const;
  int IdFromRowCol(int row, int col) const { return static_cast<int>(AFX_IDW_PANE_FIRST) + row * 16 + col; }

  // Current width as laid out (0 when the pane is hidden) and minimum width of a column.
  void GetColumnInfo(int col, int &cur, int &min) const;
  // Ideal and minimum width of a column; RecalcLayout applies them. A column whose ideal width
  // is below its minimum is hidden.
  void SetColumnInfo(int col, int ideal, int min);
  void GetRowInfo(int row, int &cur, int &min) const;
  void SetRowInfo(int row, int ideal, int min);
  // Lays the panes out in the client area: ideal sizes first, the last column and row take the rest.
  void RecalcLayout();

  LRESULT WindowProc(UINT message, WPARAM wParam, LPARAM lParam) override;

  // Border around the panes and width of a bar between two of them, in pixels.
  static constexpr int kBorder = 2;
  static constexpr int kSplitterGap = 7;

 protected:
  BOOL OnCommand(WPARAM wParam, LPARAM lParam) override;
  BOOL OnNotify(WPARAM wParam, LPARAM lParam, LRESULT *result) override;

 private:
  struct RowColInfo {
    int minSize = 0;
    int idealSize = 0;
    int curSize = 0;
  };
  // A bar under the pointer: vertical bars lie after column index, horizontal ones after row index.
  struct Hit {
    bool vertical = false;
    int index = -1;
  };

  static void LayoutRowCol(std::vector<RowColInfo> &infos, int size);
  const RowColInfo &Column(int col) const;
  const RowColInfo &Row(int row) const;
  RowColInfo &Column(int col) { return const_cast<RowColInfo &>(std::as_const(*this).Column(col)); }
  RowColInfo &Row(int row) { return const_cast<RowColInfo &>(std::as_const(*this).Row(row)); }
  Hit HitTest(POINT pt) const;
  RECT BarRect(const Hit &hit) const;
  void OnPaint();
  void StartTracking(const Hit &hit, POINT pt);
  void MoveTracker(POINT pt);
  void StopTracking(bool accept);
  void InvertTracker() const;

  std::vector<RowColInfo> m_rows;
  std::vector<RowColInfo> m_cols;
  std::vector<std::unique_ptr<CView>> m_views;  // row-major

  bool m_bTracking = false;
  Hit m_tracked;
  RECT m_rectTracker{};  // the bar's outline while it is dragged
  RECT m_rectLimit{};    // where the tracker may go
  POINT m_trackOffset{};
  HWND m_hWndFocusBefore = nullptr;
};

}  // namespace fw
