// Second process of the clipboard test: reads the clipboard's file list the way other programs
// do (the shell's own DragQueryFile) and prints its header and paths, one a line.
#include <windows.h>
#include <shellapi.h>
#include <shlobj.h>

#include <cstdio>

int main() {
  for (int tries = 0; !OpenClipboard(nullptr); ++tries) {
    if (tries == 50) return 2;
    Sleep(20);
  }
  HANDLE block = GetClipboardData(CF_HDROP);
  if (!block) {
    std::printf("none\n");
    CloseClipboard();
    return 0;
  }
  if (const auto *header = static_cast<const DROPFILES *>(GlobalLock(block))) {
    std::printf("offset=%lu wide=%d\n", static_cast<unsigned long>(header->pFiles), header->fWide ? 1 : 0);
    GlobalUnlock(block);
  }
  auto drop = static_cast<HDROP>(block);
  const UINT count = DragQueryFileA(drop, 0xFFFFFFFF, nullptr, 0);
  for (UINT i = 0; i < count; ++i) {
    char path[MAX_PATH] = "";
    // Wine counts the final NUL of an empty list as one empty name.
    if (DragQueryFileA(drop, i, path, MAX_PATH) > 0) std::printf("%s\n", path);
  }
  CloseClipboard();
  return 0;
}
