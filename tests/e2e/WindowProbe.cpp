// Tells the end-to-end scripts where things are in the explorer of another process, so that
// they click what they mean rather than pixel offsets that move with a font, a theme or a
// picture size.
//   WindowProbe tree-item TITLE-PREFIX [ROWS]  the tree's selected item, or the one ROWS visible rows below it
//   WindowProbe tree-count TITLE-PREFIX        how many items the tree holds
//   WindowProbe tree TITLE-PREFIX              the folder tree
//   WindowProbe tree-load TITLE-PREFIX         "watching", then waits for the tree's next load: "red"
//                                              when the screen showed red over the tree while it ran
//   WindowProbe control TITLE-PREFIX ID        the dialog's control with that id
//   WindowProbe caption TITLE-PREFIX NAME      the caption box that shows NAME
//   WindowProbe tile TITLE-PREFIX NAME         the tile above that caption box
//   WindowProbe search TITLE-PREFIX            the search box
//   WindowProbe search-text TITLE-PREFIX       what the search box holds
//   WindowProbe button TITLE-PREFIX COMMAND    the tool bar button with that command id
// The explorer is the visible top-level window whose title starts with TITLE-PREFIX. Places are
// printed as "X Y WIDTH HEIGHT" on the screen; a count as a number. What is not found is said on
// standard error, with exit code 1.
#include <windows.h>

#include <commctrl.h>

#include "../win/ScreenPixels.h"

#include <algorithm>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <string>
#include <vector>

namespace {

// WM_GETTEXT itself: GetWindowText reads only the title the system keeps for a control of
// another process, not what the control holds.
std::string TextOf(HWND window) {
  char text[MAX_PATH] = "";
  DWORD_PTR copied = 0;
  SendMessageTimeoutA(window, WM_GETTEXT, sizeof text, reinterpret_cast<LPARAM>(text), SMTO_ABORTIFHUNG, 2000, &copied);
  return text;
}

std::string ClassOf(HWND window) {
  char name[64] = "";
  GetClassNameA(window, name, sizeof name);
  return name;
}

HWND FindFrame(const std::string &prefix) {
  struct Search {
    std::string prefix;
    HWND found;
  } search{prefix, nullptr};
  EnumWindows(
      [](HWND window, LPARAM data) {
        auto &search = *reinterpret_cast<Search *>(data);
        if (!IsWindowVisible(window) || TextOf(window).compare(0, search.prefix.size(), search.prefix) != 0) return TRUE;
        search.found = window;
        return FALSE;
      },
      reinterpret_cast<LPARAM>(&search));
  return search.found;
}

std::vector<HWND> Descendants(HWND parent) {
  std::vector<HWND> windows;
  EnumChildWindows(
      parent,
      [](HWND child, LPARAM list) {
        reinterpret_cast<std::vector<HWND> *>(list)->push_back(child);
        return TRUE;
      },
      reinterpret_cast<LPARAM>(&windows));
  return windows;
}

HWND FirstOfClass(HWND parent, const char *className) {
  for (HWND child : Descendants(parent))
    if (ClassOf(child) == className && IsWindowVisible(child)) return child;
  return nullptr;
}

// A few bytes in the explorer's process, for the control messages that fill a rectangle there.
class RemoteRect {
 public:
  explicit RemoteRect(HWND owner) {
    DWORD processId = 0;
    GetWindowThreadProcessId(owner, &processId);
    m_process = OpenProcess(PROCESS_VM_OPERATION | PROCESS_VM_READ | PROCESS_VM_WRITE, FALSE, processId);
    if (m_process) m_address = VirtualAllocEx(m_process, nullptr, sizeof(RECT), MEM_COMMIT, PAGE_READWRITE);
  }
  ~RemoteRect() {
    if (m_address) VirtualFreeEx(m_process, m_address, 0, MEM_RELEASE);
    if (m_process) CloseHandle(m_process);
  }
  RemoteRect(const RemoteRect &) = delete;
  RemoteRect &operator=(const RemoteRect &) = delete;

  LPARAM Address() const { return reinterpret_cast<LPARAM>(m_address); }
  bool Write(const RECT &rect) const { return m_address && WriteProcessMemory(m_process, m_address, &rect, sizeof rect, nullptr); }
  bool Read(RECT &rect) const { return m_address && ReadProcessMemory(m_process, m_address, &rect, sizeof rect, nullptr); }

 private:
  HANDLE m_process = nullptr;
  void *m_address = nullptr;
};

int Print(const RECT &rect) {
  std::printf("%ld %ld %ld %ld\n", rect.left, rect.top, rect.right - rect.left, rect.bottom - rect.top);
  return 0;
}

int Fail(const std::string &what) {
  std::fprintf(stderr, "WindowProbe: %s\n", what.c_str());
  return 1;
}

RECT ScreenRect(HWND window) {
  RECT rect{};
  GetWindowRect(window, &rect);
  return rect;
}

int TreeItem(HWND frame, int rows) {
  HWND tree = FirstOfClass(frame, WC_TREEVIEWA);
  if (!tree) return Fail("no folder tree");
  auto item = reinterpret_cast<HTREEITEM>(SendMessageA(tree, TVM_GETNEXTITEM, TVGN_CARET, 0));
  for (; item && rows != 0; rows += rows < 0 ? 1 : -1)
    item = reinterpret_cast<HTREEITEM>(
        SendMessageA(tree, TVM_GETNEXTITEM, rows < 0 ? TVGN_PREVIOUSVISIBLE : TVGN_NEXTVISIBLE, reinterpret_cast<LPARAM>(item)));
  if (!item) return Fail("no such tree item");
  RECT rect{};
  std::memcpy(&rect, &item, sizeof item);  // the message takes the item in the rectangle
  RemoteRect remote(tree);
  if (!remote.Write(rect) || !SendMessageA(tree, TVM_GETITEMRECT, TRUE, remote.Address()) || !remote.Read(rect))
    return Fail("the tree item is not in view");
  MapWindowPoints(tree, nullptr, reinterpret_cast<POINT *>(&rect), 2);
  return Print(rect);
}

bool Answers(HWND window, UINT milliseconds) {
  DWORD_PTR result = 0;
  return SendMessageTimeoutA(window, WM_NULL, 0, 0, SMTO_NORMAL, milliseconds, &result) != 0;
}

bool ShowsRed(HWND tree) {
  const std::vector<DWORD> pixels = ScreenPixels(ScreenRect(tree));
  return std::find(pixels.begin(), pixels.end(), 0xFF0000u) != pixels.end();
}

// The tree's thread answers no message while it fills an item: the load runs from the first
// question it leaves unanswered to the next one it answers. Meanwhile the screen is read as
// often as it can be.
int WatchLoad(HWND tree) {
  std::printf("watching\n");
  std::fflush(stdout);
  const DWORD start = GetTickCount();
  while (Answers(tree, 30))
    if (GetTickCount() - start > 20000) return Fail("no load began within 20 s");
  bool red = false;
  do {
    if (!IsWindow(tree)) return Fail("the tree went away during its load");
    if (GetTickCount() - start > 120000) return Fail("the load did not end within 2 minutes");
    red = ShowsRed(tree) || red;
  } while (!Answers(tree, 10));
  std::printf("%s\n", red ? "red" : "no red");
  return 0;
}

HWND Caption(HWND frame, const std::string &name) {
  for (HWND child : Descendants(frame))
    if (ClassOf(child) == "Edit" && IsWindowVisible(child) && TextOf(child) == name && GetParent(child) != nullptr &&
        ClassOf(GetParent(child)) != TOOLBARCLASSNAMEA)
      return child;
  return nullptr;
}

int Tile(HWND frame, const std::string &name) {
  HWND caption = Caption(frame, name);
  if (!caption) return Fail("no caption box shows " + name);
  const RECT below = ScreenRect(caption);
  const POINT above{(below.left + below.right) / 2, below.top - 4};
  for (HWND sibling : Descendants(GetParent(caption))) {
    const RECT rect = ScreenRect(sibling);
    if (sibling != caption && IsWindowVisible(sibling) && PtInRect(&rect, above)) return Print(rect);
  }
  return Fail("no tile above the caption box of " + name);
}

HWND SearchBox(HWND frame) {
  for (HWND child : Descendants(frame))
    if (ClassOf(child) == "Edit" && IsWindowVisible(child) && ClassOf(GetParent(child)) == TOOLBARCLASSNAMEA) return child;
  return nullptr;
}

int Button(HWND frame, int command) {
  for (HWND bar : Descendants(frame)) {
    if (ClassOf(bar) != TOOLBARCLASSNAMEA) continue;
    const LRESULT index = SendMessageA(bar, TB_COMMANDTOINDEX, command, 0);
    if (index < 0) continue;
    RemoteRect remote(bar);
    RECT rect{};
    if (!remote.Write(rect) || !SendMessageA(bar, TB_GETITEMRECT, index, remote.Address()) || !remote.Read(rect)) continue;
    MapWindowPoints(bar, nullptr, reinterpret_cast<POINT *>(&rect), 2);
    return Print(rect);
  }
  return Fail("no tool bar button " + std::to_string(command));
}

}  // namespace

int main(int argc, char **argv) {
  if (argc < 3) return Fail("usage: WindowProbe tree-item|tree-count|tree|tree-load|control|caption|tile|search|search-text|button TITLE-PREFIX [ARGUMENT]");
  const std::string what = argv[1];
  HWND frame = FindFrame(argv[2]);
  if (!frame) return Fail(std::string("no visible window titled ") + argv[2] + "...");
  const char *argument = argc > 3 ? argv[3] : nullptr;
  if (what == "tree-item") return TreeItem(frame, argument ? std::atoi(argument) : 0);
  if (what == "tree-count") {
    HWND tree = FirstOfClass(frame, WC_TREEVIEWA);
    if (!tree) return Fail("no folder tree");
    std::printf("%ld\n", static_cast<long>(SendMessageA(tree, TVM_GETCOUNT, 0, 0)));
    return 0;
  }
  if (what == "tree") {
    HWND tree = FirstOfClass(frame, WC_TREEVIEWA);
    return tree ? Print(ScreenRect(tree)) : Fail("no folder tree");
  }
  if (what == "tree-load") {
    HWND tree = FirstOfClass(frame, WC_TREEVIEWA);
    return tree ? WatchLoad(tree) : Fail("no folder tree");
  }
  if (what == "control" && argument) {
    HWND control = GetDlgItem(frame, std::atoi(argument));
    return control ? Print(ScreenRect(control)) : Fail(std::string("no control ") + argument);
  }
  if (what == "caption" && argument) {
    HWND caption = Caption(frame, argument);
    return caption ? Print(ScreenRect(caption)) : Fail(std::string("no caption box shows ") + argument);
  }
  if (what == "tile" && argument) return Tile(frame, argument);
  if (what == "search" || what == "search-text") {
    HWND box = SearchBox(frame);
    if (!box) return Fail("no search box");
    if (what == "search") return Print(ScreenRect(box));
    std::printf("%s\n", TextOf(box).c_str());
    return 0;
  }
  if (what == "button" && argument) return Button(frame, std::atoi(argument));
  return Fail("unknown question " + what);
}
