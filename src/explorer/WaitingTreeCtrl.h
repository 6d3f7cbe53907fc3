// A tree control that fills an item's children when the item is first expanded, behind a
// "Loading..." placeholder, while a second thread animates over the frozen tree: it wakes on a
// periodic tick and on every progress step, and draws through the OnWait* operations.
#pragma once

#include "explorer/Handles.h"
#include "fw/Controls.h"

#include <atomic>
#include <string>

class CWaitingTreeCtrl : public fw::CTreeCtrl {
 public:
  CWaitingTreeCtrl();
  ~CWaitingTreeCtrl() override;

  // Progress of the filling code, read by the animation thread.
  void SetProgress(int total, int done);
  void StepProgress(int n = 1);
  int GetProgress(int *total = nullptr) const;

  void SetTickPeriod(UINT milliseconds) { m_nTickPeriod = milliseconds; }
  void DeleteChildren(HTREEITEM item);

  // The display names from the root down to `item`, joined by "\".
  std::string GetItemPath(HTREEITEM item) const;
  // Scans the item's file-system folder into the catalogue (the document's tree path and folder
  // follow the item); false when the item has no file-system folder or it cannot be listed.
  bool LoadFolder(HTREEITEM item, const char *extension);
  // Scans the selected folder again and lets the thumbnail view show it.
  void RefreshSelectedFolder();
  // Expands the tree along a path of display names (any letter case); the last item found on a
  // complete walk becomes the start item.
  void ExpandToPath(const std::string &path);
  HTREEITEM GetStartItem() const { return m_hStartItem; }

  BOOL OnChildNotify(UINT message, WPARAM wParam, LPARAM lParam, LRESULT *result) override;
  LRESULT WindowProc(UINT message, WPARAM wParam, LPARAM lParam) override;

 protected:
  virtual void OnWaitBegin(HTREEITEM placeholder) { (void)placeholder; }
  // Called on the animation thread: one step of the drawing.
  virtual void OnWaitTick(bool isTick, int total, int done) { (void)isTick, (void)total, (void)done; }
  virtual void OnWaitEnd() {}
  virtual bool CanRefreshChildren(HTREEITEM item) { return (void)item, false; }
  // Fills the item's children; true when its children button is to follow what was found.
  virtual bool FillItemChildren(HTREEITEM item) = 0;

  void PrepareLoading(HTREEITEM item);
  void RunLoading(HTREEITEM item);
  // The small-icon square whose right edge lies 3 pixels left of the item's text; false when
  // the tree has no image list or no rectangle for the item.
  bool GetIconRect(HTREEITEM item, RECT *rect) const;
  // The colour the tree paints its background with: its own, or the window colour when it has
  // none (the tree then reports no colour at all, which read as a colour is white).
  COLORREF BackgroundColor() const;

  // Animation state; the handles exist only while a load runs.
  KernelHandle m_hThread;
  KernelHandle m_hTickEvent;
  KernelHandle m_hProgressEvent;
  std::atomic<int> m_bProgressSignalled{0};
  std::atomic<int> m_bStop{0};
  int m_bSnapshotValid = 0;
  BitmapHandle m_hSnapshot;
  TimerHandle m_nTimerId;
  UINT m_nTickPeriod = 0;
  std::string m_strLoading = "Loading...";
  HICON m_hPlaceholderIcon = nullptr;
  int m_bEraseIcon = 0;
  std::atomic<int> m_nDone{0};
  std::atomic<int> m_nTotal{0};
  HTREEITEM m_hPlaceholder = nullptr;
  HTREEITEM m_hPending = nullptr;  // the item prepared for a load, until the load starts
  bool m_bLoading = false;         // a load runs: its thread and drawing objects are in use
  int m_nPendingButton = 0;  // the pending item's children button before the load
  HTREEITEM m_hStartItem = nullptr;

 private:
  static DWORD WINAPI AnimationThread(void *tree);
  void Animate();
  void StartAnimation();
  void StopAnimation();
  void SignalProgress();
  void EraseIconArea();
  void TakeSnapshot();
  void DropSnapshot();
  void SetRedraw(bool redraw) { SendMessage(WM_SETREDRAW, redraw ? TRUE : FALSE); }
};
