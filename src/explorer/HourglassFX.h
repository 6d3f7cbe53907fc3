// The loading effect of an hourglass: the ten frames of an animated cursor, one a tick, in the
// placeholder's icon square left of its text.
#pragma once

#include "explorer/Handles.h"

constexpr int kHourglassFrames = 10;

template <class T>
class CHourglassFX : public T {
 public:
  int FrameIndex() const { return m_nFrame; }
  const RECT &IconRect() const { return m_rcIcon; }

 protected:
  void OnWaitBegin(HTREEITEM placeholder) override {
    T::OnWaitBegin(placeholder);
    m_nFrame = 0;
    RECT icon;
    if (this->GetIconRect(placeholder, &icon)) m_rcIcon = icon;
    m_background.Reset(CreateSolidBrush(this->BackgroundColor()));
  }

  void OnWaitTick(bool isTick, int total, int done) override {
    T::OnWaitTick(isTick, total, done);
    if (!isTick) return;
    m_nFrame = (m_nFrame + 1) % kHourglassFrames;
    // Never measured, the icon's place is empty: drawn there, the hourglass would cover the
    // first item.
    if (IsRectEmpty(&m_rcIcon)) return;
    const ClientDeviceContext dc(this->m_hWnd);
    DrawIconEx(dc.Get(), m_rcIcon.left, m_rcIcon.top, m_hCursor.Get(), m_rcIcon.right - m_rcIcon.left,
               m_rcIcon.bottom - m_rcIcon.top, static_cast<UINT>(m_nFrame), m_background.Get(), DI_NORMAL);
  }

  void OnWaitEnd() override {
    m_background.Reset();
    T::OnWaitEnd();
  }

  CursorHandle m_hCursor;

 private:
  BrushHandle m_background;
  RECT m_rcIcon{};
  int m_nFrame = 0;
};
