// Costs of the thumbnail view on a folder of 100,000 drawings with real previews, laid out in 6
// columns and 4 visible rows, measured through a browse call of the loaded module:
//   view_step_ms                 median one-row line step, previews already decoded
//   view_step_cold_ms            the same with previews decoded for the first time
//   view_step_ratio              cold step over the same row's windows made, painted and destroyed bare
//   view_first_paint_ratio_100k  rescan and reload until the first screen is painted, over the
//                                bare scan plus the cold paint of the visible previews
//   view_windows_growth          windows of the explorer after 1,000 steps and 100 reloads, minus before
//   view_tiles_max               most tile windows alive during those steps
//   view_gdi_growth              live GDI objects after, minus before
// Prints one figure a line: name value unit.
#include "BenchClock.h"
#include "ViewBenchRun.h"
#include "catalogue/FolderScan.h"
#include "preview/PreviewTestApi.h"

#include <windows.h>

#include <algorithm>
#include <cstdio>
#include <string>
#include <vector>

namespace {
constexpr int kColumns = 6;
constexpr int kVisibleRows = 4;
constexpr int kSteps = 200;
constexpr UINT kRefreshFolder = WM_APP + 0x10;  // the view's own rescan-and-reload message
constexpr int kPaneFirst = 0xE900;
constexpr int kBrowseCancel = 32796;

std::string Name(int record) {
  char name[32];
  std::snprintf(name, sizeof name, "d%06d.dwg", record);
  return name;
}

std::wstring FullPath(int record) {
  const std::string path = kViewBenchFolder + Name(record);
  return std::wstring(path.begin(), path.end());
}

int CountWindows(HWND parent, const char *className) {
  struct Count {
    const char *className;
    int n;
  } count{className, 0};
  EnumChildWindows(
      parent,
      [](HWND hwnd, LPARAM param) {
        auto *c = reinterpret_cast<Count *>(param);
        char name[64] = "";
        GetClassNameA(hwnd, name, sizeof name);
        if (!c->className || lstrcmpiA(name, c->className) == 0) ++c->n;
        return TRUE;
      },
      reinterpret_cast<LPARAM>(&count));
  return count.n;
}

// Every window of the explorer: the frame's descendants and the top-level windows of its thread
// (tooltips and menus are top-level).
int ExplorerWindows(HWND frame) {
  int count = CountWindows(frame, nullptr);
  EnumThreadWindows(
      GetWindowThreadProcessId(frame, nullptr),
      [](HWND, LPARAM param) {
        ++*reinterpret_cast<int *>(param);
        return TRUE;
      },
      reinterpret_cast<LPARAM>(&count));
  return count;
}

// GetGuiResources reports 0 under Wine. Its GDI handles carry the table index in their low word,
// and a handle with an empty high word stands for whatever object lives at that index: probing
// every index counts the live objects of the process.
int LiveGdiObjects() {
  int count = 0;
  for (UINT_PTR index = 1; index <= 0xFFFF; ++index)
    if (GetObjectType(reinterpret_cast<HGDIOBJ>(index)) != 0) ++count;
  return count;
}

// The same windows a step makes for one row, made bare on this thread: plain child windows
// painted with the row's previews, edit controls beneath, all destroyed again.
double BareRowMs(HWND parent, int firstRecord, int rowStep) {
  const double start = NowMs();
  std::vector<HWND> windows;
  for (int c = 0; c < kColumns; ++c) {
    const int x = c * 178;
    HWND picture = CreateWindowExA(0, "STATIC", "", WS_CHILD | WS_VISIBLE | WS_BORDER, x, rowStep, 173, 143, parent, nullptr,
                                   nullptr, nullptr);
    windows.push_back(picture);
    windows.push_back(CreateWindowExA(0, "EDIT", Name(firstRecord + c).c_str(), WS_CHILD | WS_VISIBLE | ES_READONLY, x + 2,
                                      rowStep + 145, 169, rowStep - 147, parent, nullptr, nullptr, nullptr));
    const uint32_t background = 0;
    acdbDisplayPreviewFromDwg(FullPath(firstRecord + c).c_str(), picture, &background);
  }
  UpdateWindow(parent);
  for (HWND hwnd : windows) DestroyWindow(hwnd);
  return NowMs() - start;
}

// The bare canvas lies where the frame lies: each is shown only while it is measured, so that
// neither clips the other's painting.
void ShowOnly(HWND shown, HWND hidden) {
  ShowWindow(hidden, SW_HIDE);
  ShowWindow(shown, SW_SHOWNA);
  RedrawWindow(shown, nullptr, nullptr, RDW_INVALIDATE | RDW_ERASE | RDW_ALLCHILDREN | RDW_UPDATENOW);
}

void Measure(HWND frame) {
  HWND view = GetDlgItem(GetDlgItem(frame, kPaneFirst), kPaneFirst + 1);
  const int rowStep = 143 + CaptionHeight();
  // The view's client: 6 columns of 178 pixels (the last without its gap) and 4 whole rows, set
  // once the browse has built its first tiles and settled.
  const int ringTiles = (kVisibleRows + 2) * kColumns;
  SizeViewForBench(frame, view, kVisibleRows, rowStep);
  // The frame lays its panes out once it is idle: wait for the view's ring of rows.
  for (int waited = 0; waited < 10000 && CountWindows(view, "FwWnd") != ringTiles; waited += 50) Sleep(50);
  RECT client;
  GetClientRect(view, &client);
  if (client.bottom / rowStep != kVisibleRows)
    std::fprintf(stderr, "bench_thumbview: the view shows %ld rows, not %d\n", client.bottom / rowStep, kVisibleRows);

  // First screen after a rescan, against the bare scan and the bare cold paint of its previews.
  std::vector<double> reload, bare;
  HWND canvas = CreateWindowExA(WS_EX_TOPMOST, "STATIC", "", WS_POPUP, 0, 0, 1100, kVisibleRows * rowStep, nullptr, nullptr,
                                nullptr, nullptr);
  for (int round = 0; round < 3; ++round) {
    ShowOnly(frame, canvas);
    devhostPreviewClearCache();
    const unsigned long decoded = devhostPreviewDecodeCount();
    double start = NowMs();
    PostMessageA(view, kRefreshFolder, 0, 0);
    while (devhostPreviewDecodeCount() - decoded < kColumns * kVisibleRows) Sleep(0);
    reload.push_back(NowMs() - start);
    SendMessageA(view, WM_NULL, 0, 0);

    ShowOnly(canvas, frame);
    devhostPreviewClearCache();
    start = NowMs();
    ScanFolder(kViewBenchFolder, ".dwg");
    for (int row = 0; row < kVisibleRows; ++row)
      for (int c = 0; c < kColumns; ++c) {
        HWND picture = CreateWindowExA(0, "STATIC", "", WS_CHILD | WS_VISIBLE, c * 178, row * rowStep, 173, 143, canvas, nullptr,
                                       nullptr, nullptr);
        const uint32_t background = 0;
        acdbDisplayPreviewFromDwg(FullPath(row * kColumns + c).c_str(), picture, &background);
        DestroyWindow(picture);
      }
    bare.push_back(NowMs() - start);
  }

  // Line steps downwards: every row that comes into view is decoded for the first time.
  ShowOnly(frame, canvas);
  devhostPreviewClearCache();
  std::vector<double> cold, warm, bareRows;
  for (int i = 0; i < kSteps; ++i) {
    const double start = NowMs();
    SendMessageA(view, WM_VSCROLL, SB_LINEDOWN, 0);
    cold.push_back(NowMs() - start);
  }
  // Up and down over the same rows: they were painted a step or two before.
  for (int i = 0; i < kSteps; ++i) {
    const double start = NowMs();
    SendMessageA(view, WM_VSCROLL, i % 2 ? SB_LINEDOWN : SB_LINEUP, 0);
    warm.push_back(NowMs() - start);
  }
  ShowOnly(canvas, frame);
  for (int i = 0; i < kSteps; ++i) {
    devhostPreviewClearCache();
    bareRows.push_back(BareRowMs(canvas, (kVisibleRows + i) * kColumns, rowStep));
  }
  ShowOnly(frame, canvas);
  DestroyWindow(canvas);

  // Decoded previews the painter keeps hold GDI objects of their own: counted without them.
  devhostPreviewClearCache();
  const int windowsBefore = ExplorerWindows(frame);
  const int gdiBefore = LiveGdiObjects();
  int tilesMax = 0;
  for (int i = 0; i < 1000; ++i) {
    SendMessageA(view, WM_VSCROLL, SB_LINEDOWN, 0);
    tilesMax = std::max(tilesMax, CountWindows(view, "FwWnd"));
  }
  for (int i = 0; i < 100; ++i) {
    SendMessageA(view, kRefreshFolder, 0, 0);
    tilesMax = std::max(tilesMax, CountWindows(view, "FwWnd"));
  }
  devhostPreviewClearCache();
  const int windowsGrowth = ExplorerWindows(frame) - windowsBefore;
  const int gdiGrowth = LiveGdiObjects() - gdiBefore;

  std::printf("view_step_ms %.2f ms\n", Median(warm));
  std::printf("view_step_cold_ms %.2f ms\n", Median(cold));
  std::printf("view_step_ratio %.2f x\n", Median(cold) / Median(bareRows));
  std::printf("view_first_paint_ratio_100k %.2f x\n", Median(reload) / Median(bare));
  std::printf("view_windows_growth %d windows\n", windowsGrowth);
  std::printf("view_tiles_max %d windows\n", tilesMax);
  std::printf("view_gdi_growth %d objects\n", gdiGrowth);
  std::printf("view_gdi_probe_live %d objects\n", gdiBefore);
  PostMessageA(frame, WM_COMMAND, kBrowseCancel, 0);
}
}  // namespace

int main() { return RunViewBench("bench_thumbview", Measure); }
