// What the view benchmarks share: the bench folder of 100,000 drawings, the caption band's
// height, the explorer's frame, and one browse of that folder with the measurement run on its
// own thread while the browse's modal loop runs here.
#pragma once

#include "ExplorerHarness.h"

#include <windows.h>
#include <ole2.h>

#include <cstdio>
#include <thread>

inline const char kViewBenchFolder[] = "Z:\\tmp\\lumvex-bench-view-100k\\";
inline const wchar_t kViewBenchFolderW[] = L"Z:\\tmp\\lumvex-bench-view-100k\\";

inline int CaptionHeight() {
  HDC screen = GetDC(nullptr);
  TEXTMETRICA metrics{};
  GetTextMetricsA(screen, &metrics);
  ReleaseDC(nullptr, screen);
  return metrics.tmHeight + 2 + GetSystemMetrics(SM_CYEDGE);
}

inline HWND FindFrame() {
  for (int waited = 0; waited < 60000; waited += 50) {
    if (HWND frame = FindWindowA("FwFrame128", nullptr); frame && IsWindowVisible(frame)) return frame;
    Sleep(50);
  }
  return nullptr;
}

// Once the browse has built its first tiles, sizes the frame so that the view's client is 1,100
// pixels wide (6 columns of 178, the last without its gap) and `rows` whole rows high, at the
// screen's top left corner so that the screen's height does not cut the frame short.
inline void SizeViewForBench(HWND frame, HWND view, int rows, int rowStep) {
  for (int waited = 0; waited < 10000 && Children(view, "FwWnd").empty(); waited += 50) Sleep(50);
  SendMessageA(view, WM_NULL, 0, 0);
  RECT client, window;
  GetClientRect(view, &client);
  GetWindowRect(frame, &window);
  SetWindowPos(frame, nullptr, 0, 0, window.right - window.left + 1100 - client.right,
               window.bottom - window.top + rows * rowStep - client.bottom, SWP_NOZORDER);
}

// Browses the bench folder and runs measure(frame) once the frame shows; the program's exit code.
inline int RunViewBench(const char *program, void (*measure)(HWND frame)) {
  if (GetFileAttributesA(kViewBenchFolder) == INVALID_FILE_ATTRIBUTES) {
    std::fprintf(stderr, "%s: %s is missing (target thumbview_bench_folder makes it)\n", program, kViewBenchFolder);
    return 1;
  }
  OleInitialize(nullptr);
  {
    StateFileGuard state;  // the browse remembers the bench folder: the state file is put back after
    LoadedModule module;
    std::thread watcher([measure] {
      if (HWND frame = FindFrame()) measure(frame);
    });
    devhostInvoke(L"Lumvex",
                  acutBuildList(RTSHORT, 0, RTSHORT, 0, RTSTR, kViewBenchFolderW, RTSTR, L"Insert", RTSTR, L"Close", 0));
    watcher.join();
    devhostClearResult();
  }
  OleUninitialize();
  return 0;
}
