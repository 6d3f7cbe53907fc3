#include "fw/StatusBar.h"

#include "fw/FrameWnd.h"

#include <commctrl.h>

#include <algorithm>
#include <stdexcept>

namespace fw {
namespace {
constexpr int kPanePadding = 10;  // text margins and the pane's own border

int KeyOfIndicator(UINT id) {
  switch (id) {
    case ID_INDICATOR_CAPS: return VK_CAPITAL;
    case ID_INDICATOR_NUM: return VK_NUMLOCK;
    case ID_INDICATOR_SCRL: return VK_SCROLL;
    default: return 0;
  }
}

std::string IndicatorText(UINT id) {
  std::string text = AfxLoadString(id);
  if (!text.empty()) return text;
  switch (id) {
    case ID_INDICATOR_CAPS: return "CAP";
    case ID_INDICATOR_NUM: return "NUM";
    case ID_INDICATOR_SCRL: return "SCRL";
    default: return {};
  }
}

// The font the control draws with, selected into a device context of it for measuring.
class MeasuringDC {
 public:
  explicit MeasuringDC(HWND window) : m_window(window), m_dc(::GetDC(window)) {
    HFONT font = reinterpret_cast<HFONT>(::SendMessageA(window, WM_GETFONT, 0, 0));
    if (!font) font = static_cast<HFONT>(::GetStockObject(DEFAULT_GUI_FONT));
    if (m_dc) m_previous = ::SelectObject(m_dc, font);
  }
  ~MeasuringDC() {
    if (!m_dc) return;
    ::SelectObject(m_dc, m_previous);
    ::ReleaseDC(m_window, m_dc);
  }
  MeasuringDC(const MeasuringDC &) = delete;
  MeasuringDC &operator=(const MeasuringDC &) = delete;
  HDC get() const { return m_dc; }

 private:
  HWND m_window;
  HDC m_dc;
  HGDIOBJ m_previous = nullptr;
};

class CStatusCmdUI : public CCmdUI {
 public:
  CStatusCmdUI(CStatusBar &bar, UINT index, UINT id) : m_bar(bar) {
    m_nIndex = index;
    m_nID = id;
  }
  void Enable(BOOL on = TRUE) override {
    const UINT style = m_bar.GetPaneStyle(static_cast<int>(m_nIndex));
    m_bar.SetPaneStyle(static_cast<int>(m_nIndex), on ? style & ~SBPS_DISABLED : style | SBPS_DISABLED);
  }
  void SetCheck(int check = 1) override {
    const UINT style = m_bar.GetPaneStyle(static_cast<int>(m_nIndex));
    m_bar.SetPaneStyle(static_cast<int>(m_nIndex), check ? style | SBPS_POPOUT : style & ~SBPS_POPOUT);
  }
  void SetText(const std::string &text) override { m_bar.SetPaneText(static_cast<int>(m_nIndex), text); }

 private:
  CStatusBar &m_bar;
};
}  // namespace

BOOL CStatusBar::Create(CWnd *parent, DWORD style, UINT id) {
  INITCOMMONCONTROLSEX init{sizeof(init), ICC_BAR_CLASSES};
  ::InitCommonControlsEx(&init);
  DWORD windowStyle = TakeBarStyle(style) | CCS_NOPARENTALIGN | CCS_NOMOVEY | CCS_NODIVIDER | CCS_NORESIZE;
  if (parent && (::GetWindowLongA(parent->m_hWnd, GWL_STYLE) & WS_THICKFRAME)) windowStyle |= SBARS_SIZEGRIP;
  const RECT empty{0, 0, 0, 0};
  return CWnd::CreateEx(0, STATUSCLASSNAMEA, nullptr, windowStyle, empty, parent, id);
}

const CStatusBar::PaneInfo &CStatusBar::Pane(int index) const {
  if (index < 0 || index >= GetCount()) throw std::out_of_range("CStatusBar: pane index out of range");
  return m_panes[static_cast<size_t>(index)];
}

int CStatusBar::CommandToIndex(UINT id) const {
  for (int i = 0; i < GetCount(); ++i)
    if (m_panes[static_cast<size_t>(i)].id == id) return i;
  return -1;
}

int CStatusBar::MeasureText(const std::string &text) const {
  const MeasuringDC dc(m_hWnd);
  SIZE extent{0, 0};
  if (dc.get()) ::GetTextExtentPoint32A(dc.get(), text.c_str(), static_cast<int>(text.size()), &extent);
  return extent.cx;
}

BOOL CStatusBar::SetIndicators(const UINT *ids, int count) {
  if (!m_hWnd || count < 0 || (count > 0 && !ids)) return FALSE;
  std::vector<PaneInfo> panes(static_cast<size_t>(count));
  for (int i = 0; i < count; ++i) {
    PaneInfo &pane = panes[static_cast<size_t>(i)];
    pane.id = ids[i];
    if (pane.id == 0) {
      if (i == 0) pane.style = SBPS_STRETCH | SBPS_NOBORDERS;
      continue;
    }
    pane.text = IndicatorText(pane.id);
    if (pane.text.empty()) return FALSE;  // an indicator without a string is a resource fault
    pane.textWidth = MeasureText(pane.text);
  }
  m_panes = std::move(panes);
  UpdatePaneLayout();
  for (int i = 0; i < count; ++i) ShowPane(i);
  return TRUE;
}

void CStatusBar::UpdatePaneLayout() const {
  if (m_panes.empty()) {
    int single = -1;
    SendMessage(SB_SETPARTS, 1, reinterpret_cast<LPARAM>(&single));
    return;
  }
  RECT client;
  GetClientRect(&client);
  int borders[3] = {0, 0, 0};
  SendMessage(SB_GETBORDERS, 0, reinterpret_cast<LPARAM>(borders));
  int available = client.right - borders[0];
  if (::GetWindowLongA(m_hWnd, GWL_STYLE) & SBARS_SIZEGRIP) available -= ::GetSystemMetrics(SM_CXVSCROLL);
  int stretchy = 0;
  for (const PaneInfo &pane : m_panes) {
    available -= pane.textWidth + kPanePadding + borders[2];
    if (pane.style & SBPS_STRETCH) ++stretchy;
  }
  // Stretchy panes share what the others leave.
  std::vector<int> rights;
  int right = borders[0];
  for (const PaneInfo &pane : m_panes) {
    right += pane.textWidth + kPanePadding;
    if ((pane.style & SBPS_STRETCH) && available > 0) {
      const int share = available / stretchy--;
      right += share;
      available -= share;
    }
    rights.push_back(right);
    right += borders[2];
  }
  SendMessage(SB_SETPARTS, rights.size(), reinterpret_cast<LPARAM>(rights.data()));
}

void CStatusBar::ShowPane(int index) const {
  const PaneInfo &pane = Pane(index);
  const UINT drawing = pane.style & (SBPS_NOBORDERS | SBPS_POPOUT);
  const char *text = (pane.style & SBPS_DISABLED) ? "" : pane.text.c_str();
  SendMessage(SB_SETTEXTA, static_cast<WPARAM>(index) | drawing, reinterpret_cast<LPARAM>(text));
}

BOOL CStatusBar::SetPaneText(int index, const std::string &text) {
  Pane(index).text = text;
  ShowPane(index);
  return TRUE;
}

void CStatusBar::SetMessagePaneText(const std::string &text) {
  const int index = CommandToIndex(0);
  if (index >= 0) SetPaneText(index, text);
}

void CStatusBar::SetPaneStyle(int index, UINT style) {
  PaneInfo &pane = Pane(index);
  if (pane.style == style) return;
  const bool stretchChanged = (pane.style ^ style) & SBPS_STRETCH;
  pane.style = style;
  if (stretchChanged) UpdatePaneLayout();
  ShowPane(index);
}

SIZE CStatusBar::CalcFixedLayout(BOOL stretch, BOOL) {
  TEXTMETRICA metrics{};
  {
    const MeasuringDC dc(m_hWnd);
    if (dc.get()) ::GetTextMetricsA(dc.get(), &metrics);
  }
  int borders[3] = {0, 0, 0};
  SendMessage(SB_GETBORDERS, 0, reinterpret_cast<LPARAM>(borders));
  SIZE size{0, std::max<int>(metrics.tmHeight, ::GetSystemMetrics(SM_CYSMICON)) + 2 * borders[1] + 4};
  if (stretch) {
    size.cx = 32767;
  } else {
    for (const PaneInfo &pane : m_panes) size.cx += pane.textWidth + kPanePadding + borders[2];
  }
  return size;
}

void CStatusBar::OnUpdateCmdUI(CWnd *target) {
  for (int i = 0; i < GetCount(); ++i) {
    const UINT id = m_panes[static_cast<size_t>(i)].id;
    if (id == 0) continue;
    CStatusCmdUI state(*this, static_cast<UINT>(i), id);
    if (target && target->OnCmdMsg(id, CN_UPDATE_COMMAND_UI, &state)) continue;
    if (const int key = KeyOfIndicator(id)) state.Enable(::GetKeyState(key) & 1);
  }
}

LRESULT CStatusBar::WindowProc(UINT message, WPARAM wParam, LPARAM lParam) {
  if (message == WM_SIZE) {
    const LRESULT result = CControlBar::WindowProc(message, wParam, lParam);
    UpdatePaneLayout();
    return result;
  }
  return CControlBar::WindowProc(message, wParam, lParam);
}

}  // namespace fw
