// The loading effect of a progress bar: a black frame 56 pixels wide and at most 16 high,
// 3 pixels right of the placeholder's text, filled in red as children are added.
#pragma once

#include "explorer/Handles.h"
#include "explorer/ProgressFill.h"

#include <algorithm>

constexpr int kProgressBarWidth = 56;
constexpr int kProgressBarMaxHeight = 16;
constexpr int kProgressMargin = 3;

template <class T>
class CProgressFX : public T {
 public:
  const RECT &BarRect() const { return m_rcBar; }
  const RECT &FillRect() const { return m_rcFill; }

 protected:
  void OnWaitBegin(HTREEITEM placeholder) override {
    T::OnWaitBegin(placeholder);
    RECT bar{};
    this->GetItemRect(placeholder, &bar, TRUE);
    const int d = std::max<LONG>((bar.bottom - bar.top - kProgressBarMaxHeight) / 2, 0);
    bar.top += d;
    bar.bottom -= d;
    OffsetRect(&bar, bar.right - bar.left + kProgressMargin, 0);
    m_rcFill = bar;
    InflateRect(&m_rcFill, -kProgressMargin, -kProgressMargin);
    m_rcFill.right = m_rcFill.left;
    bar.right = bar.left + kProgressBarWidth;
    m_rcBar = bar;
    m_frameBrush.Reset(CreateSolidBrush(RGB(0, 0, 0)));
    m_fillBrush.Reset(CreateSolidBrush(RGB(255, 0, 0)));
  }

  void OnWaitTick(bool isTick, int total, int done) override {
    T::OnWaitTick(isTick, total, done);
    if (isTick) return;
    const ClientDeviceContext dc(this->m_hWnd);
    ::FrameRect(dc.Get(), &m_rcBar, m_frameBrush.Get());
    m_rcFill.right = m_rcFill.left + ProgressFillWidth(total, done);
    ::FillRect(dc.Get(), &m_rcFill, m_fillBrush.Get());
  }

  void OnWaitEnd() override {
    m_frameBrush.Reset();
    m_fillBrush.Reset();
    T::OnWaitEnd();
  }

 private:
  RECT m_rcBar{};
  RECT m_rcFill{};
  BrushHandle m_frameBrush;
  BrushHandle m_fillBrush;
};
