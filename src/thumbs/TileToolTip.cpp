#include "thumbs/TileToolTip.h"

#include <commctrl.h>

#include <algorithm>
#include <cstdio>
#include <ctime>

namespace {
std::string Padded(std::string text, size_t width) {
  if (text.size() < width) text.append(width - text.size(), ' ');
  return text;
}

std::string DateText(int64_t lastWrite) {
  // A time the run time cannot convert prints as 0 for the date and -1 for the time of day.
  std::tm local{};
  const __time64_t time = lastWrite;
  int day = 0, month = 0, year = 0, hour = -1, minute = -1, second = -1;
  if (_localtime64_s(&local, &time) == 0) {
    day = local.tm_mday;
    month = local.tm_mon + 1;
    year = local.tm_year + 1900;
    hour = local.tm_hour;
    minute = local.tm_min;
    second = local.tm_sec;
  }
  char text[64];
  std::snprintf(text, sizeof text, "%02d/%02d/%4d;%02d.%02d.%02d", day, month, year, hour, minute, second);
  return text;
}
}  // namespace

std::string TileTipText(const std::string &name, const DwgData &record) {
  char size[32];
  std::snprintf(size, sizeof size, "Size=%d ", static_cast<int>(record.m_nFileSize));
  const std::string date = DateText(record.m_tLastWrite);
  const size_t width = std::max({name.size(), std::string(size).size(), date.size()});
  return Padded(name, width) + " " + Padded(size, width) + " " + Padded(date, width);
}

int TileTipWidth(const std::string &tipText) { return static_cast<int>((tipText.size() - 2) / 3); }

BOOL CViewToolTip::Create(fw::CWnd *owner) {
  INITCOMMONCONTROLSEX init{sizeof(init), ICC_WIN95_CLASSES};
  InitCommonControlsEx(&init);
  return CreateEx(WS_EX_TOPMOST, TOOLTIPS_CLASSA, nullptr, WS_POPUP | TTS_ALWAYSTIP | TTS_NOPREFIX, RECT{0, 0, 0, 0},
                  owner ? owner->m_hWnd : nullptr, 0);
}

void CTileTool::Add(HWND toolTip, HWND tile, const std::string &text) {
  Remove();
  if (!toolTip || !tile) return;
  TTTOOLINFOA tool{};
  tool.cbSize = sizeof tool;
  tool.uFlags = TTF_IDISHWND;
  tool.hwnd = tile;
  tool.uId = reinterpret_cast<UINT_PTR>(tile);
  tool.lpszText = const_cast<char *>(text.c_str());
  if (!SendMessageA(toolTip, TTM_ADDTOOLA, 0, reinterpret_cast<LPARAM>(&tool))) return;
  SendMessageA(toolTip, TTM_SETMAXTIPWIDTH, 0, TileTipWidth(text));
  m_hToolTip = toolTip;
  m_hTile = tile;
}

void CTileTool::Remove() {
  if (m_hToolTip && IsWindow(m_hToolTip)) {
    TTTOOLINFOA tool{};
    tool.cbSize = sizeof tool;
    tool.hwnd = m_hTile;
    tool.uId = reinterpret_cast<UINT_PTR>(m_hTile);
    SendMessageA(m_hToolTip, TTM_DELTOOLA, 0, reinterpret_cast<LPARAM>(&tool));
  }
  m_hToolTip = nullptr;
  m_hTile = nullptr;
}

void CTileTool::RelayEvent(const MSG *msg) const {
  if (m_hToolTip) SendMessageA(m_hToolTip, TTM_RELAYEVENT, 0, reinterpret_cast<LPARAM>(msg));
}
