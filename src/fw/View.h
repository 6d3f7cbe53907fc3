// Views: the pane windows of a frame. A view paints and prints through OnDraw, is told when
// the frame makes it the active view, and asks its frame to activate it when it is clicked.
// Views are owned by whoever created them (the splitter for its panes); they do not delete
// themselves.
#pragma once

#include "fw/Wnd.h"

namespace fw {

class CFrameWnd;

// Sent by a frame to its views once their windows exist, before the frame is first shown.
constexpr UINT WM_INITIALUPDATE = 0x0364;

class CView : public CWnd {
 public:
  // Creates the view window; PreCreateWindow may change the creation values first.
  virtual BOOL Create(LPCSTR className, LPCSTR windowName, DWORD style, const RECT &rect, CWnd *parent, UINT id);
  // The base gives views the framework's view class and turns WS_BORDER into a sunken edge.
  virtual BOOL PreCreateWindow(CREATESTRUCTA &cs);

  virtual void OnInitialUpdate() { Invalidate(); }
  // Called by the frame when the active view changes; the view that becomes active takes the
  // focus when its frame is the active window.
  virtual void OnActivateView(BOOL activate, CView *activateView, CView *deactiveView);
  virtual void OnDraw(HDC dc) { (void)dc; }
  virtual void OnPrepareDC(HDC dc) { (void)dc; }

  // The nearest enclosing frame window, or null.
  CFrameWnd *GetParentFrame() const;

  // The print commands (the frame routes them to its active view): the view printed on one
  // page, after the print dialog or, for the direct command, on the default printer.
  BOOL OnCmdMsg(UINT id, int code, CCmdUI *cmdUI) override;
  LRESULT WindowProc(UINT message, WPARAM wParam, LPARAM lParam) override;

 protected:
  void OnFilePrint(bool direct);

 private:
  LRESULT OnMouseActivate();
};

// A view whose content is larger than its window, scrolled by its scroll bars in MM_TEXT units
// (pixels): scroll bar positions are the scroll position, and scrolling moves the window's
// content together with its child windows.
class CScrollView : public CView {
 public:
  // Page and line sizes of zero mean a tenth of the total and a tenth of the page.
  static constexpr SIZE sizeDefault{0, 0};

  void SetScrollSizes(int mapMode, SIZE total, const SIZE &page = sizeDefault, const SIZE &line = sizeDefault);
  SIZE GetTotalSize() const { return m_totalLog; }
  void GetDeviceScrollSizes(int &mapMode, SIZE &total, SIZE &page, SIZE &line) const;
  POINT GetScrollPosition() const { return GetDeviceScrollPosition(); }
  POINT GetDeviceScrollPosition() const;
  // Scrolls to pt, limited to the scroll range.
  void ScrollToPosition(POINT pt);

  // A scroll bar message: scrollCode has the horizontal code in its low byte and the vertical
  // code in its high byte (0xFF for none); pos is the thumb position of the thumb codes.
  virtual BOOL OnScroll(UINT scrollCode, UINT pos, BOOL doScroll = TRUE);
  // Scrolls by the given amount, limited to the scroll range; FALSE when nothing would move.
  virtual BOOL OnScrollBy(SIZE sizeScroll, BOOL doScroll = TRUE);

  void OnPrepareDC(HDC dc) override;
  LRESULT WindowProc(UINT message, WPARAM wParam, LPARAM lParam) override;

 protected:
  // Shows the scroll bars the total size needs at the current window size, sets their ranges
  // and pages, and scrolls back when the position lies beyond the new range.
  void UpdateBars();

 private:
  int ScrollLimit(int bar) const;
  void ScrollToDevicePosition(POINT pt);
  BOOL OnMouseWheel(short delta);

  int m_nMapMode = 0;
  SIZE m_totalLog{0, 0};
  SIZE m_totalDev{0, 0};
  SIZE m_pageDev{0, 0};
  SIZE m_lineDev{0, 0};
  bool m_bInsideUpdate = false;
};

}  // namespace fw
