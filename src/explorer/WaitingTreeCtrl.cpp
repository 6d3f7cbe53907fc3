#include "explorer/WaitingTreeCtrl.h"

namespace {
// Tolerance of the multimedia timer, in milliseconds.
constexpr UINT kTimerResolution = 5;

bool IsCode(const NMHDR *header, UINT ansi, UINT wide) { return header->code == ansi || header->code == wide; }
}  // namespace

CWaitingTreeCtrl::CWaitingTreeCtrl() = default;

CWaitingTreeCtrl::~CWaitingTreeCtrl() = default;

void CWaitingTreeCtrl::SetProgress(int total, int done) {
  m_nTotal = total;
  m_nDone = done;
  SignalProgress();
}

void CWaitingTreeCtrl::StepProgress(int n) {
  m_nDone += n;
  SignalProgress();
}

// The progress event resets when the thread wakes on it: until then, setting it again would
// change nothing, so it is set once between two of the thread's progress steps.
void CWaitingTreeCtrl::SignalProgress() {
  if (m_hProgressEvent && !m_bProgressSignalled.exchange(1)) SetEvent(m_hProgressEvent.Get());
}

int CWaitingTreeCtrl::GetProgress(int *total) const {
  if (total) *total = m_nTotal;
  return m_nDone;
}

void CWaitingTreeCtrl::DeleteChildren(HTREEITEM item) {
  while (HTREEITEM child = GetChildItem(item)) DeleteItem(child);
}

BOOL CWaitingTreeCtrl::OnChildNotify(UINT message, WPARAM wParam, LPARAM lParam, LRESULT *result) {
  if (message != WM_NOTIFY) return CTreeCtrl::OnChildNotify(message, wParam, lParam, result);
  const auto *header = reinterpret_cast<const NMHDR *>(lParam);
  // The item handle and the action lie at the same place in the ANSI and the wide record.
  const auto *tree = reinterpret_cast<const NMTREEVIEWA *>(lParam);
  if (IsCode(header, TVN_ITEMEXPANDINGA, TVN_ITEMEXPANDINGW)) {
    // The shell may pump messages while a load enumerates: a second load then would take over
    // the running thread's handles and brushes. The expansion is refused instead.
    *result = (tree->action & TVE_EXPAND) && m_bLoading;
    if ((tree->action & TVE_EXPAND) && !m_bLoading) PrepareLoading(tree->itemNew.hItem);
    return TRUE;
  }
  if (IsCode(header, TVN_ITEMEXPANDEDA, TVN_ITEMEXPANDEDW)) {
    if (tree->action & TVE_EXPAND)
      RunLoading(tree->itemNew.hItem);
    else if ((tree->action & TVE_COLLAPSE) && CanRefreshChildren(tree->itemNew.hItem))
      DeleteChildren(tree->itemNew.hItem);
    *result = 0;
    return TRUE;
  }
  return CTreeCtrl::OnChildNotify(message, wParam, lParam, result);
}

LRESULT CWaitingTreeCtrl::WindowProc(UINT message, WPARAM wParam, LPARAM lParam) {
  // Numpad "*" expands every descendant, one load after another: from the Desktop that is the
  // whole namespace, for minutes.
  if (message == WM_KEYDOWN && wParam == VK_MULTIPLY) return 0;
  if (message == WM_ERASEBKGND && m_bSnapshotValid) {
    // While the children are filled the tree shows what it showed when the load began; the
    // animation is drawn again over it.
    HDC target = reinterpret_cast<HDC>(wParam);
    HDC source = CreateCompatibleDC(target);
    BITMAP info{};
    GetObject(m_hSnapshot.Get(), sizeof info, &info);
    HGDIOBJ previous = SelectObject(source, m_hSnapshot.Get());
    BitBlt(target, 0, 0, info.bmWidth, info.bmHeight, source, 0, 0, SRCCOPY);
    SelectObject(source, previous);
    DeleteDC(source);
    SignalProgress();
    return 1;
  }
  return CTreeCtrl::WindowProc(message, wParam, lParam);
}

void CWaitingTreeCtrl::PrepareLoading(HTREEITEM item) {
  if (GetChildItem(item)) {
    if (!CanRefreshChildren(item)) {
      m_hPending = nullptr;
      return;
    }
    DeleteChildren(item);
  }
  m_hPending = item;
  TVITEMA button{};
  button.mask = TVIF_CHILDREN;
  button.hItem = item;
  m_nPendingButton = GetItem(&button) ? button.cChildren : 1;
  UpdateWindow();
  SetRedraw(false);
  TVINSERTSTRUCTA insert{};
  insert.hParent = item;
  insert.hInsertAfter = TVI_LAST;
  insert.item.mask = TVIF_TEXT;
  insert.item.pszText = m_strLoading.data();
  m_hPlaceholder = InsertItem(insert);
  if (!m_hPlaceholder) {
    // Without its placeholder the item does not open: nothing to load, the tree draws again.
    m_hPending = nullptr;
    SetRedraw(true);
    return;
  }
  m_nTotal = 1;
  m_nDone = 0;
}

void CWaitingTreeCtrl::RunLoading(HTREEITEM item) {
  // Only the expansion that was prepared loads: a stray notification would delete a null
  // placeholder, which is the whole tree.
  if (m_bLoading || !m_hPending || m_hPending != item || !m_hPlaceholder) return;
  m_hPending = nullptr;
  m_bLoading = true;
  OnWaitBegin(m_hPlaceholder);
  StartAnimation();
  EraseIconArea();
  SetRedraw(false);
  TakeSnapshot();
  DeleteItem(m_hPlaceholder);
  m_hPlaceholder = nullptr;

  const bool result = FillItemChildren(item);

  StopAnimation();
  OnWaitEnd();
  if (item != TVI_ROOT) {
    if (result) {
      TVITEMA children{};
      children.mask = TVIF_CHILDREN;
      children.hItem = item;
      children.cChildren = GetChildItem(item) ? 1 : 0;
      SetItem(&children);
    } else if (!GetChildItem(item)) {
      // The tree drops the button with the placeholder, its last child: it comes back.
      TVITEMA collapsed{};
      collapsed.mask = TVIF_CHILDREN | TVIF_STATE;
      collapsed.hItem = item;
      collapsed.cChildren = m_nPendingButton;
      collapsed.stateMask = TVIS_EXPANDED;
      SetItem(&collapsed);
    }
  }
  DropSnapshot();
  SetRedraw(true);
  m_bLoading = false;
}

void CWaitingTreeCtrl::StartAnimation() {
  m_bStop = 0;
  m_hTickEvent.Reset(CreateEventA(nullptr, FALSE, TRUE, nullptr));
  m_hProgressEvent.Reset(CreateEventA(nullptr, FALSE, TRUE, nullptr));
  m_bProgressSignalled = 1;
  // Without its events or its thread the load runs all the same, only without animation.
  if (!m_hTickEvent || !m_hProgressEvent) return;
  m_hThread.Reset(CreateThread(nullptr, 0, AnimationThread, this, 0, nullptr));
  if (m_hThread && m_nTickPeriod)
    m_nTimerId.Reset(timeSetEvent(m_nTickPeriod, kTimerResolution, reinterpret_cast<LPTIMECALLBACK>(m_hTickEvent.Get()), 0,
                                  TIME_PERIODIC | TIME_CALLBACK_EVENT_SET));
}

void CWaitingTreeCtrl::StopAnimation() {
  m_nTimerId.Reset();
  // The flag goes up before the last wake-up, and nothing the thread uses is released before it
  // has ended.
  m_bStop = 1;
  if (m_hProgressEvent) SetEvent(m_hProgressEvent.Get());
  if (m_hThread) WaitForSingleObject(m_hThread.Get(), INFINITE);
  m_hThread.Reset();
  m_hTickEvent.Reset();
  m_hProgressEvent.Reset();
}

DWORD WINAPI CWaitingTreeCtrl::AnimationThread(void *tree) {
  static_cast<CWaitingTreeCtrl *>(tree)->Animate();
  return 0;
}

void CWaitingTreeCtrl::Animate() {
  if (m_bStop) return;
  const HANDLE events[2] = {m_hTickEvent.Get(), m_hProgressEvent.Get()};
  do {
    const DWORD woken = WaitForMultipleObjects(2, events, FALSE, INFINITE);
    if (m_bStop || (woken != WAIT_OBJECT_0 && woken != WAIT_OBJECT_0 + 1)) return;
    if (woken == WAIT_OBJECT_0 + 1) m_bProgressSignalled = 0;  // before the values are read
    int total = 0;
    const int done = GetProgress(&total);
    OnWaitTick(woken == WAIT_OBJECT_0, total, done);
  } while (!m_bStop);
}

bool CWaitingTreeCtrl::GetIconRect(HTREEITEM item, RECT *rect) const {
  RECT text;
  if (!GetImageList(TVSIL_NORMAL) || !item || !GetItemRect(item, &text, TRUE)) return false;
  const int cx = GetSystemMetrics(SM_CXSMICON);
  const int cy = GetSystemMetrics(SM_CYSMICON);
  rect->left = text.left - cx - 3;
  rect->top = text.top + (text.bottom - text.top - cy) / 2;
  rect->right = rect->left + cx;
  rect->bottom = rect->top + cy;
  return true;
}

COLORREF CWaitingTreeCtrl::BackgroundColor() const {
  const COLORREF own = GetBkColor();
  return own == CLR_NONE ? GetSysColor(COLOR_WINDOW) : own & 0xFFFFFF;
}

void CWaitingTreeCtrl::EraseIconArea() {
  RECT icon;
  if (!m_bEraseIcon || !GetIconRect(m_hPlaceholder, &icon)) return;
  const BrushHandle background(CreateSolidBrush(BackgroundColor()));
  const ClientDeviceContext dc(m_hWnd);
  if (m_hPlaceholderIcon)
    DrawIconEx(dc.Get(), icon.left, icon.top, m_hPlaceholderIcon, icon.right - icon.left, icon.bottom - icon.top, 0,
               background.Get(), DI_NORMAL);
  else
    FillRect(dc.Get(), &icon, background.Get());
}

void CWaitingTreeCtrl::TakeSnapshot() {
  RECT client;
  GetClientRect(&client);
  const ClientDeviceContext screen(m_hWnd);
  m_hSnapshot.Reset(CreateCompatibleBitmap(screen.Get(), client.right, client.bottom));
  if (!m_hSnapshot) return;
  HDC copy = CreateCompatibleDC(screen.Get());
  HGDIOBJ previous = SelectObject(copy, m_hSnapshot.Get());
  BitBlt(copy, 0, 0, client.right, client.bottom, screen.Get(), 0, 0, SRCCOPY);
  SelectObject(copy, previous);
  DeleteDC(copy);
  m_bSnapshotValid = 1;
}

void CWaitingTreeCtrl::DropSnapshot() {
  m_hSnapshot.Reset();
  m_bSnapshotValid = 0;
}
