// A keystroke in the explorer's search box on a folder of 100,000 drawings with real previews,
// laid out in 6 columns and 4 visible rows, measured through a browse call of the loaded module:
//   search_keystroke_100k_ms  median of one typed character, from the key until the view and
//                             every tile in it are painted
//   search_rebuild_100k_ms    median of one rebuild of the ring at the same row (the fit command,
//                             which changes nothing else), timed the same way
//   search_keystroke_ratio    median over the rounds of keystroke over rebuild, each round taking
//                             the two one after the other, so that a busy machine weighs on both
// Prints one figure a line: name value unit.
#include "BenchClock.h"
#include "ViewBenchRun.h"

#include <windows.h>

#include <cstdio>
#include <vector>

namespace {
constexpr int kColumns = 6;
constexpr int kVisibleRows = 4;
constexpr int kRounds = 41;
constexpr int kPaneFirst = 0xE900;
constexpr int kFitCommand = 32782;
constexpr int kBrowseCancel = 32796;
// The text the rounds start from and the character typed: "d05" shows the row of d050000.dwg,
// "d050" the same row again, so every round does the same work.
const char kStartText[] = "d05";
constexpr WPARAM kTyped = '0';

bool AnyUnpainted(HWND view) {
  if (GetUpdateRect(view, nullptr, FALSE)) return true;
  bool unpainted = false;
  EnumChildWindows(
      view,
      [](HWND child, LPARAM found) {
        if (!GetUpdateRect(child, nullptr, FALSE)) return TRUE;
        *reinterpret_cast<bool *>(found) = true;
        return FALSE;
      },
      reinterpret_cast<LPARAM>(&unpainted));
  return unpainted;
}

// Sends the action to the browse's thread, then has that thread paint what the action left
// unpainted in the view and its tiles, as its message loop would, and times the whole.
double UntilPainted(HWND view, const std::function<void()> &action) {
  const double start = NowMs();
  action();
  RedrawWindow(view, nullptr, nullptr, RDW_UPDATENOW | RDW_ALLCHILDREN);
  while (AnyUnpainted(view)) Sleep(0);  // whatever a paint invalidated anew
  SendMessageA(view, WM_NULL, 0, 0);
  return NowMs() - start;
}

void Measure(HWND frame) {
  HWND view = GetDlgItem(GetDlgItem(frame, kPaneFirst), kPaneFirst + 1);
  HWND box = Children(ToolBars(frame)[0], "Edit")[0];
  const int rowStep = 143 + CaptionHeight();
  SizeViewForBench(frame, view, kVisibleRows, rowStep);
  // The fit makes the client exactly the columns wide; from then on it moves nothing.
  SendMessageA(frame, WM_COMMAND, kFitCommand, 0);
  SendMessageA(view, WM_NULL, 0, 0);
  RECT client;
  GetClientRect(view, &client);
  if (client.bottom / rowStep != kVisibleRows || (client.right + 5) / 178 != kColumns)
    std::fprintf(stderr, "bench_search: the view shows %ld rows of %ld columns, not %d of %d\n", client.bottom / rowStep,
                 (client.right + 5) / 178, kVisibleRows, kColumns);

  std::vector<double> keystroke, rebuild, ratio;
  for (int round = 0; round < kRounds; ++round) {
    SendMessageA(box, WM_SETTEXT, 0, reinterpret_cast<LPARAM>(kStartText));
    SendMessageA(box, EM_SETSEL, sizeof kStartText - 1, sizeof kStartText - 1);
    UntilPainted(view, [] {});
    keystroke.push_back(UntilPainted(view, [box] { SendMessageA(box, WM_CHAR, kTyped, 1); }));
    rebuild.push_back(UntilPainted(view, [frame] { SendMessageA(frame, WM_COMMAND, kFitCommand, 0); }));
    ratio.push_back(keystroke.back() / rebuild.back());
  }
  std::printf("search_keystroke_100k_ms %.2f ms\n", Median(keystroke));
  std::printf("search_rebuild_100k_ms %.2f ms\n", Median(rebuild));
  std::printf("search_keystroke_ratio %.2f x\n", Median(ratio));
  PostMessageA(frame, WM_COMMAND, kBrowseCancel, 0);
}
}  // namespace

int main() { return RunViewBench("bench_search", Measure); }
