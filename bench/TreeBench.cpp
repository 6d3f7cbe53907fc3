// Expanding a folder of 1,000 sub-folders in the explorer's tree, from the expansion to the
// children painted, against a bare enumeration of the same folder through the shell (names and
// attributes of every child). Prints one figure a line: name value unit.
#include "BenchClock.h"
#include "TreeWatch.h"

#include <ole2.h>
#include <shlobj.h>
#include <shlwapi.h>

#include <algorithm>
#include <cstdio>

namespace {
constexpr int kFolders = 1000;
constexpr int kRounds = 6;  // even: each goes first as often

// <temp>\lumvex-tree-bench\big with its sub-folders, made once.
std::string MakeBenchFolder() {
  char temp[MAX_PATH] = "";
  GetTempPathA(MAX_PATH, temp);
  const std::string parent = std::string(temp) + "lumvex-tree-bench";
  const std::string big = parent + "\\big";
  if (GetFileAttributesA((parent + "\\complete").c_str()) == INVALID_FILE_ATTRIBUTES) {
    CreateDirectoryA(parent.c_str(), nullptr);
    CreateDirectoryA(big.c_str(), nullptr);
    for (int i = 0; i < kFolders; ++i) CreateDirectoryA((big + "\\folder " + std::to_string(1000 + i)).c_str(), nullptr);
    CloseHandle(CreateFileA((parent + "\\complete").c_str(), GENERIC_WRITE, 0, nullptr, CREATE_ALWAYS, 0, nullptr));
  }
  return parent;
}

double BareEnumerationMs(const std::string &folder) {
  const double start = NowMs();
  IShellFolder *desktop = nullptr, *shellFolder = nullptr;
  SHGetDesktopFolder(&desktop);
  const std::wstring wide(folder.begin(), folder.end());
  LPITEMIDLIST list = nullptr;
  desktop->ParseDisplayName(nullptr, nullptr, const_cast<LPWSTR>(wide.c_str()), nullptr, &list, nullptr);
  desktop->BindToObject(list, nullptr, IID_IShellFolder, reinterpret_cast<void **>(&shellFolder));
  IEnumIDList *children = nullptr;
  int count = 0;
  if (shellFolder && shellFolder->EnumObjects(nullptr, SHCONTF_FOLDERS, &children) == S_OK) {
    LPITEMIDLIST child = nullptr;
    while (children->Next(1, &child, nullptr) == S_OK) {
      STRRET name{};
      char text[MAX_PATH];
      if (SUCCEEDED(shellFolder->GetDisplayNameOf(child, SHGDN_INFOLDER, &name))) StrRetToBufA(&name, child, text, MAX_PATH);
      ULONG attributes = SFGAO_FOLDER | SFGAO_HASSUBFOLDER | SFGAO_GHOSTED | SFGAO_LINK | SFGAO_SHARE;
      LPCITEMIDLIST one = child;
      shellFolder->GetAttributesOf(1, &one, &attributes);
      CoTaskMemFree(child);
      ++count;
    }
    children->Release();
  }
  if (shellFolder) shellFolder->Release();
  CoTaskMemFree(list);
  desktop->Release();
  const double elapsed = NowMs() - start;
  return count == kFolders ? elapsed : -1;
}

double TreeExpansionMs(const std::string &parent) {
  double elapsed = -1;
  const std::string start = parent + "\\";
  Browse(BrowseArgs(std::wstring(start.begin(), start.end()).c_str()), [&](HWND frame) {
    HWND tree = FindTree(frame);
    HTREEITEM big = TreeNext(tree, TreeNext(tree, nullptr, TVGN_CARET), TVGN_CHILD);
    const double begin = NowMs();
    SendMessageA(tree, TVM_EXPAND, TVE_EXPAND, reinterpret_cast<LPARAM>(big));
    UpdateWindow(tree);
    const double end = NowMs();
    int count = 0;
    for (HTREEITEM child = TreeNext(tree, big, TVGN_CHILD); child; child = TreeNext(tree, child, TVGN_NEXT)) ++count;
    if (count == kFolders) elapsed = end - begin;
    PostMessageA(frame, WM_CLOSE, 0, 0);
  });
  return elapsed;
}

}  // namespace

int main() {
  OleInitialize(nullptr);
  const std::string parent = MakeBenchFolder();
  const StateFileGuard state;
  state.Remove();
  std::vector<double> tree, bare;
  {
    const LoadedModule module;
    if (module.LoadResult() != kDevhostLoaded) return 1;
    // Whichever runs second finds the folder in the caches the first warmed: they take turns.
    for (int i = 0; i < kRounds; ++i) {
      const bool treeFirst = i % 2 == 0;
      if (treeFirst) tree.push_back(TreeExpansionMs(parent));
      bare.push_back(BareEnumerationMs(parent + "\\big"));
      if (!treeFirst) tree.push_back(TreeExpansionMs(parent));
    }
  }
  OleUninitialize();
  const double treeMs = Median(tree), bareMs = Median(bare);
  std::printf("tree_expand_1k_ms %.1f ms\n", treeMs);
  std::printf("tree_expand_ratio %.2f ratio\n", bareMs > 0 ? treeMs / bareMs : -1.0);
  return treeMs > 0 && bareMs > 0 ? 0 : 1;
}
