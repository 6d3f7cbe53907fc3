#include "fw/ToolBar.h"

#include "fw/FrameWnd.h"
#include "fw/WinApp.h"

#include <algorithm>
#include <stdexcept>

namespace fw {
namespace {
constexpr WORD kToolBarResourceType = 241;
constexpr COLORREF kButtonFaceInPictures = RGB(192, 192, 192);
constexpr int kEdge = 2;     // a CBRS_BORDER_* side
constexpr int kGripper = 7;  // the gripper and the space around it
constexpr int kFlatSeparator = 6;

// The tip part of a command's "prompt\ntip" string; empty when there is none.
std::string ToolTipOf(UINT id) {
  const std::string full = AfxLoadString(id);
  const size_t newline = full.find('\n');
  return newline == std::string::npos ? std::string() : full.substr(newline + 1);
}

class CToolCmdUI : public CCmdUI {
 public:
  CToolCmdUI(const CToolBar &bar, UINT index, UINT id) : m_bar(bar) {
    m_nIndex = index;
    m_nID = id;
  }
  void Enable(BOOL on = TRUE) override { m_bar.SendMessage(TB_ENABLEBUTTON, m_nID, MAKELPARAM(on ? TRUE : FALSE, 0)); }
  void SetCheck(int check = 1) override {
    m_bar.SendMessage(TB_CHECKBUTTON, m_nID, MAKELPARAM(check == 1, 0));
    m_bar.SendMessage(TB_INDETERMINATE, m_nID, MAKELPARAM(check == 2, 0));
  }

 private:
  const CToolBar &m_bar;
};
}  // namespace

CToolBar::~CToolBar() {
  DestroyWindow();  // the control draws with the image list until its window is gone
  if (m_hImages) ImageList_Destroy(m_hImages);
}

BOOL CToolBar::CreateEx(CWnd *parent, DWORD ctrlStyle, DWORD style, RECT borders, UINT id) {
  INITCOMMONCONTROLSEX init{sizeof(init), ICC_BAR_CLASSES};
  ::InitCommonControlsEx(&init);
  m_borders = borders;
  // The frame places its bars itself, so the control neither moves nor sizes itself.
  DWORD windowStyle = TakeBarStyle(style) | ctrlStyle | CCS_NOPARENTALIGN | CCS_NORESIZE | CCS_NODIVIDER;
  if (m_dwStyle & CBRS_TOOLTIPS) windowStyle |= TBSTYLE_TOOLTIPS;
  const RECT empty{0, 0, 0, 0};
  if (!CWnd::CreateEx(0, TOOLBARCLASSNAMEA, nullptr, windowStyle, empty, parent, id)) return FALSE;
  SendMessage(TB_BUTTONSTRUCTSIZE, sizeof(TBBUTTON));
  return TRUE;
}

BOOL CToolBar::LoadToolBar(UINT resourceId) {
  HINSTANCE module = AfxGetResourceHandle();
  HRSRC found = ::FindResourceA(module, MAKEINTRESOURCEA(resourceId), MAKEINTRESOURCEA(kToolBarResourceType));
  if (!found) return FALSE;
  const DWORD size = ::SizeofResource(module, found);
  HGLOBAL loaded = ::LoadResource(module, found);
  const WORD *data = loaded ? static_cast<const WORD *>(::LockResource(loaded)) : nullptr;
  if (!data || size < 4 * sizeof(WORD) || data[0] != 1) return FALSE;
  const size_t count = data[3];
  if (size < (4 + count) * sizeof(WORD)) return FALSE;
  const std::vector<UINT> ids(data + 4, data + 4 + count);

  HBITMAP images =
      static_cast<HBITMAP>(::LoadImageA(module, MAKEINTRESOURCEA(resourceId), IMAGE_BITMAP, 0, 0, LR_CREATEDIBSECTION));
  if (!images) return FALSE;
  const BOOL loadedButtons = LoadToolBar(SIZE{data[1], data[2]}, ids, images);
  ::DeleteObject(images);
  return loadedButtons;
}

BOOL CToolBar::LoadToolBar(SIZE imageSize, const std::vector<UINT> &ids, HBITMAP images) {
  if (!m_hWnd || imageSize.cx <= 0 || imageSize.cy <= 0) return FALSE;
  while (SendMessage(TB_DELETEBUTTON, 0)) {
  }
  SendMessage(TB_SETIMAGELIST, 0, 0);
  if (m_hImages) ImageList_Destroy(m_hImages);
  const int pictures = static_cast<int>(std::count_if(ids.begin(), ids.end(), [](UINT id) { return id != 0; }));
  m_hImages = ImageList_Create(imageSize.cx, imageSize.cy, ILC_COLOR24 | ILC_MASK, pictures, 0);
  if (!m_hImages) return FALSE;
  if (images) ImageList_AddMasked(m_hImages, images, kButtonFaceInPictures);
  SendMessage(TB_SETBITMAPSIZE, 0, MAKELPARAM(imageSize.cx, imageSize.cy));
  SendMessage(TB_SETIMAGELIST, 0, reinterpret_cast<LPARAM>(m_hImages));
  // Buttons are the picture plus room for the pressed and hot edges.
  SendMessage(TB_SETBUTTONSIZE, 0, MAKELPARAM(imageSize.cx + 7, imageSize.cy + 7));

  std::vector<TBBUTTON> buttons;
  int picture = 0;
  for (UINT id : ids) {
    TBBUTTON button{};
    button.idCommand = static_cast<int>(id);
    button.fsState = TBSTATE_ENABLED;
    if (id == 0) {
      button.fsStyle = TBSTYLE_SEP;
      button.iBitmap = kFlatSeparator;
    } else {
      button.fsStyle = TBSTYLE_BUTTON;
      button.iBitmap = picture++;
    }
    buttons.push_back(button);
  }
  if (!buttons.empty() && !SendMessage(TB_ADDBUTTONSA, buttons.size(), reinterpret_cast<LPARAM>(buttons.data()))) return FALSE;
  Invalidate();
  return TRUE;
}

UINT CToolBar::GetItemID(int index) const {
  UINT id, style;
  int image;
  GetButtonInfo(index, id, style, image);
  return id;
}

void CToolBar::GetButtonInfo(int index, UINT &id, UINT &style, int &imageOrWidth) const {
  TBBUTTON button{};
  if (index < 0 || !SendMessage(TB_GETBUTTON, static_cast<WPARAM>(index), reinterpret_cast<LPARAM>(&button)))
    throw std::out_of_range("CToolBar: item index out of range");
  id = static_cast<UINT>(button.idCommand);
  style = button.fsStyle;
  imageOrWidth = button.iBitmap;
}

void CToolBar::GetItemRect(int index, RECT *rect) const {
  if (index < 0 || !SendMessage(TB_GETITEMRECT, static_cast<WPARAM>(index), reinterpret_cast<LPARAM>(rect)))
    throw std::out_of_range("CToolBar: item index out of range");
}

void CToolBar::SetButtonInfo(int index, UINT id, UINT style, int imageOrWidth) {
  TBBUTTON button{};
  if (index < 0 || !SendMessage(TB_GETBUTTON, static_cast<WPARAM>(index), reinterpret_cast<LPARAM>(&button)))
    throw std::out_of_range("CToolBar: item index out of range");
  button.idCommand = static_cast<int>(id);
  button.fsStyle = static_cast<BYTE>(style);
  button.iBitmap = imageOrWidth;
  // The control takes a separator's width only when the item is inserted.
  SendMessage(TB_DELETEBUTTON, static_cast<WPARAM>(index));
  SendMessage(TB_INSERTBUTTONA, static_cast<WPARAM>(index), reinterpret_cast<LPARAM>(&button));
}

RECT CToolBar::NonClientInsets() const {
  RECT insets = m_borders;
  if (m_dwStyle & CBRS_BORDER_LEFT) insets.left += kEdge;
  if (m_dwStyle & CBRS_BORDER_TOP) insets.top += kEdge;
  if (m_dwStyle & CBRS_BORDER_RIGHT) insets.right += kEdge;
  if (m_dwStyle & CBRS_BORDER_BOTTOM) insets.bottom += kEdge;
  if (m_dwStyle & CBRS_GRIPPER) insets.left += kGripper;
  return insets;
}

SIZE CToolBar::CalcFixedLayout(BOOL stretch, BOOL horizontal) {
  SIZE extent{0, HIWORD(SendMessage(TB_GETBUTTONSIZE))};
  for (int i = 0; i < GetCount(); ++i) {
    RECT item{};
    if (!SendMessage(TB_GETITEMRECT, static_cast<WPARAM>(i), reinterpret_cast<LPARAM>(&item))) continue;
    extent.cx = std::max(extent.cx, item.right);
    extent.cy = std::max(extent.cy, item.bottom);
  }
  const RECT insets = NonClientInsets();
  extent.cx += insets.left + insets.right;
  extent.cy += insets.top + insets.bottom;
  if (stretch) (horizontal ? extent.cx : extent.cy) = 32767;
  return extent;
}

void CToolBar::OnUpdateCmdUI(CWnd *target) {
  if (!target || !m_hWnd) return;
  for (int i = 0; i < GetCount(); ++i) {
    TBBUTTON button{};
    if (!SendMessage(TB_GETBUTTON, static_cast<WPARAM>(i), reinterpret_cast<LPARAM>(&button))) continue;
    if (button.fsStyle & TBSTYLE_SEP) continue;
    // A command without an update handler keeps the state it was given directly.
    CToolCmdUI state(*this, static_cast<UINT>(i), static_cast<UINT>(button.idCommand));
    target->OnCmdMsg(state.m_nID, CN_UPDATE_COMMAND_UI, &state);
  }
}

void CToolBar::OnNcPaint() {
  RECT window;
  GetWindowRect(&window);
  RECT client;
  GetClientRect(&client);
  ::MapWindowPoints(m_hWnd, nullptr, reinterpret_cast<POINT *>(&client), 2);
  ::OffsetRect(&client, -window.left, -window.top);
  ::OffsetRect(&window, -window.left, -window.top);

  HDC dc = ::GetWindowDC(m_hWnd);
  if (!dc) return;
  ::ExcludeClipRect(dc, client.left, client.top, client.right, client.bottom);
  ::FillRect(dc, &window, ::GetSysColorBrush(COLOR_BTNFACE));
  UINT sides = 0;
  if (m_dwStyle & CBRS_BORDER_LEFT) sides |= BF_LEFT;
  if (m_dwStyle & CBRS_BORDER_TOP) sides |= BF_TOP;
  if (m_dwStyle & CBRS_BORDER_RIGHT) sides |= BF_RIGHT;
  if (m_dwStyle & CBRS_BORDER_BOTTOM) sides |= BF_BOTTOM;
  if (sides) ::DrawEdge(dc, &window, EDGE_ETCHED, sides);
  if (m_dwStyle & CBRS_GRIPPER) {
    const int left = window.left + m_borders.left + ((m_dwStyle & CBRS_BORDER_LEFT) ? kEdge : 0) + 2;
    RECT grip{left, client.top + 2, left + 3, client.bottom - 2};
    ::DrawEdge(dc, &grip, BDR_RAISEDINNER, BF_RECT);
  }
  ::ReleaseDC(m_hWnd, dc);
}

BOOL CToolBar::OnToolTipText(NMHDR *header) {
  if (header->hwndFrom != GetToolTips()) return FALSE;
  const std::string tip = ToolTipOf(static_cast<UINT>(header->idFrom));
  if (header->code == TTN_GETDISPINFOW) {
    auto *info = reinterpret_cast<NMTTDISPINFOW *>(header);
    const int written = ::MultiByteToWideChar(CP_ACP, 0, tip.c_str(), -1, info->szText, ARRAYSIZE(info->szText));
    if (written == 0) info->szText[ARRAYSIZE(info->szText) - 1] = L'\0';  // cut to the buffer
    info->lpszText = info->szText;
    info->hinst = nullptr;
  } else {
    auto *info = reinterpret_cast<NMTTDISPINFOA *>(header);
    ::lstrcpynA(info->szText, tip.c_str(), ARRAYSIZE(info->szText));
    info->lpszText = info->szText;
    info->hinst = nullptr;
  }
  return TRUE;
}

void CToolBar::OnFlyBy(int index) {
  UINT id = 0;
  if (index >= 0 && index < GetCount()) id = GetItemID(index);
  if (id == m_nFlyByID) return;
  m_nFlyByID = id;
  HWND owner = ::GetParent(m_hWnd);
  if (id) {
    TRACKMOUSEEVENT leave{sizeof(leave), TME_LEAVE, m_hWnd, 0};
    ::TrackMouseEvent(&leave);
    ::SendMessageA(owner, WM_SETMESSAGESTRING, id, 0);
  } else {
    ::SendMessageA(owner, WM_SETMESSAGESTRING, AFX_IDS_IDLEMESSAGE, 0);
  }
}

LRESULT CToolBar::WindowProc(UINT message, WPARAM wParam, LPARAM lParam) {
  switch (message) {
    case WM_NCCALCSIZE: {
      const LRESULT result = Default();
      RECT *client = wParam ? &reinterpret_cast<NCCALCSIZE_PARAMS *>(lParam)->rgrc[0] : reinterpret_cast<RECT *>(lParam);
      const RECT insets = NonClientInsets();
      client->left += insets.left;
      client->top += insets.top;
      client->right = std::max(client->left, client->right - insets.right);
      client->bottom = std::max(client->top, client->bottom - insets.bottom);
      return result;
    }
    case WM_NCPAINT: OnNcPaint(); return 0;
    case WM_NOTIFY: {
      auto *header = reinterpret_cast<NMHDR *>(lParam);
      if ((header->code == TTN_GETDISPINFOA || header->code == TTN_GETDISPINFOW) && OnToolTipText(header)) return 0;
      break;
    }
    case WM_MOUSEMOVE:
      if (m_dwStyle & CBRS_FLYBY) {
        POINT pt{static_cast<short>(LOWORD(lParam)), static_cast<short>(HIWORD(lParam))};
        OnFlyBy(static_cast<int>(SendMessage(TB_HITTEST, 0, reinterpret_cast<LPARAM>(&pt))));
      }
      break;
    case WM_MOUSELEAVE:
      if (m_dwStyle & CBRS_FLYBY) OnFlyBy(-1);
      break;
    default: break;
  }
  return CControlBar::WindowProc(message, wParam, lParam);
}

}  // namespace fw
