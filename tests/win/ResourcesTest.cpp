// The module's resources as its code and its callers rely on them: the commands its menus
// offer, the accelerators, the texts looked for, the dialogs' controls, icons and the animated
// loading cursor.
#include "ModuleHarness.h"
#include "res/resource.h"

#include <windows.h>

#include <gtest/gtest.h>

#include <ostream>
#include <set>
#include <string>
#include <tuple>
#include <vector>

namespace {

// The module mapped for its resources only, as a resource editor or a caller of LoadString
// would see it; nothing of its code runs.
HMODULE Module() {
  static const HMODULE module = LoadLibraryExW((ProgramFolder() + L"Lumvex1.arx").c_str(), nullptr,
                                               LOAD_LIBRARY_AS_DATAFILE | LOAD_LIBRARY_AS_IMAGE_RESOURCE);
  return module;
}

// The commands of a menu and its submenus.
std::set<int> Commands(HMENU menu) {
  std::set<int> commands;
  for (int i = 0; i < GetMenuItemCount(menu); ++i) {
    if (HMENU submenu = GetSubMenu(menu, i)) {
      const std::set<int> inner = Commands(submenu);
      commands.insert(inner.begin(), inner.end());
    } else if (const UINT id = GetMenuItemID(menu, i); id != 0 && id != 0xFFFFFFFFu) {
      commands.insert(static_cast<int>(id));
    }
  }
  return commands;
}

// The menus offer exactly the commands the frame and the tile handle.
TEST(Menus, OfferTheCommandsTheExplorerHandles) {
  const HMENU frame = LoadMenuW(Module(), MAKEINTRESOURCEW(IDR_MAINFRAME)), tile = LoadMenuW(Module(), MAKEINTRESOURCEW(IDR_TILE_MENU));
  ASSERT_TRUE(frame && tile);
  EXPECT_EQ(Commands(frame), (std::set<int>{ID_APP_EXIT, ID_VIEW_BEGIN, ID_VIEW_INCREASE, ID_VIEW_DECREASE, ID_VIEW_ALIGNE,
                                            ID_VIEW_TOOLBAR, ID_VIEW_STATUS_BAR, ID_SORT_BY_NAME, ID_SORT_BY_DATE,
                                            ID_SORT_BY_SIZE, ID_APP_ABOUT, ID_HELP}));
  ASSERT_EQ(GetMenuItemCount(tile), 1) << "one popup, the one the tile opens";
  EXPECT_EQ(Commands(tile), (std::set<int>{ID_TILE_COPY, ID_TILE_DELETE, ID_TILE_PASTE, ID_TILE_RENAME, ID_SORT_BY_NAME,
                                           ID_SORT_BY_DATE, ID_SORT_BY_SIZE, ID_TILE_PROPERTY}));
}

TEST(Accelerators, FrameTableMapsEveryKeyToItsCommand) {
  HACCEL table = LoadAcceleratorsW(Module(), MAKEINTRESOURCEW(IDR_MAINFRAME));
  ASSERT_TRUE(table);
  std::vector<ACCEL> entries(CopyAcceleratorTableW(table, nullptr, 0));
  CopyAcceleratorTableW(table, entries.data(), static_cast<int>(entries.size()));

  using Key = std::tuple<int, int, int>;  // modifiers, virtual key, command
  std::set<Key> actual;
  for (const ACCEL &a : entries) {
    EXPECT_TRUE(a.fVirt & FVIRTKEY) << "key " << a.key << " is a virtual key";
    actual.insert({a.fVirt & (FSHIFT | FCONTROL | FALT), a.key, a.cmd});
  }
  const std::set<Key> expected = {
      {FCONTROL, 'C', ID_EDIT_COPY},  {FCONTROL, VK_INSERT, ID_EDIT_COPY}, {FCONTROL, 'V', ID_EDIT_PASTE},
      {FSHIFT, VK_INSERT, ID_EDIT_PASTE}, {FCONTROL, 'X', ID_EDIT_CUT},     {FSHIFT, VK_DELETE, ID_EDIT_CUT},
      {FCONTROL, 'A', ID_MARK_ALL},   {0, VK_DELETE, ID_CLEAR_FOCUSED_EDIT}, {0, VK_F6, ID_NEXT_PANE},
      {FSHIFT, VK_F6, ID_PREV_PANE},  {FCONTROL, 'O', ID_FILE_OPEN},        {FCONTROL, 'P', ID_FILE_PRINT},
      {FCONTROL, 'N', ID_FILE_NEW},   {FCONTROL, 'S', ID_FILE_SAVE},        {FCONTROL, 'Z', ID_EDIT_UNDO},
      {FALT, VK_BACK, ID_EDIT_UNDO},
  };
  EXPECT_EQ(actual, expected);
  EXPECT_EQ(entries.size(), expected.size());
  DestroyAcceleratorTable(table);
}

std::wstring String(UINT id) {
  wchar_t text[512] = L"";
  const int length = LoadStringW(Module(), id, text, 512);
  return std::wstring(text, length);
}

// The texts scripts and the frame look for: the title that finds a frame, the idle prompt.
TEST(Strings, TitleAndIdlePrompt) {
  const std::wstring title = String(IDR_MAINFRAME);
  EXPECT_EQ(title.substr(0, title.find(L'\n')), L"ombra3") << "the frame's title until a folder is shown";
  EXPECT_EQ(String(AFX_IDS_IDLEMESSAGE), L"Ready");
}

// A dialog of the module as the dialog manager builds it from the template, hidden: its title
// and, in their order, each control's id, class and text.
struct Control {
  int id;
  std::wstring windowClass, text;
  DWORD style;
  bool operator==(const Control &o) const { return id == o.id && windowClass == o.windowClass && text == o.text; }
};

std::vector<Control> Controls(int id, std::wstring &title) {
  const HWND dialog = CreateDialogParamW(Module(), MAKEINTRESOURCEW(id), nullptr,
                                         [](HWND, UINT, WPARAM, LPARAM) -> INT_PTR { return FALSE; }, 0);
  std::vector<Control> controls;
  wchar_t text[256] = L"";
  GetWindowTextW(dialog, text, 256);
  title = text;
  for (HWND child = GetWindow(dialog, GW_CHILD); child; child = GetWindow(child, GW_HWNDNEXT)) {
    wchar_t name[64] = L"";
    GetClassNameW(child, name, 64);
    GetWindowTextW(child, text, 256);
    controls.push_back({GetDlgCtrlID(child), name, text, static_cast<DWORD>(GetWindowLongW(child, GWL_STYLE))});
  }
  DestroyWindow(dialog);
  return controls;
}

std::ostream &operator<<(std::ostream &out, const Control &c) {
  return out << c.id << " " << std::string(c.windowClass.begin(), c.windowClass.end()) << " "
             << std::string(c.text.begin(), c.text.end());
}

// The controls the dialog's code reaches by id, of the classes it treats them as, and the
// captions of its two ways out.
TEST(Dialogs, FolderSettingsControlsTheCodeUses) {
  std::wstring title;
  std::vector<Control> used;
  for (const Control &c : Controls(IDD_FOLDER_SETTINGS, title))
    if (c.id != IDC_STATIC) used.push_back(c);
  EXPECT_EQ(title, L"Folder settings");
  const std::vector<Control> expected = {
      {IDC_USE_CURRENT_LAYER, L"Button", L"&Use current layer", 0}, {IDC_LAYER_NAME, L"Edit", L"", 0},
      {IDC_COLOR_SWATCH, L"Static", L"", 0}, {IDC_LISP_COMMAND, L"Edit", L"", 0},
      {IDOK, L"Button", L"&Accept", 0},           {IDCANCEL, L"Button", L"&Cancel", 0},
  };
  ASSERT_EQ(used, expected);
  EXPECT_EQ(used[0].style & 0xF, static_cast<DWORD>(BS_AUTOCHECKBOX));
  EXPECT_TRUE(used[2].style & SS_NOTIFY) << "the swatch reports clicks";
  EXPECT_EQ(used[4].style & 0xF, static_cast<DWORD>(BS_DEFPUSHBUTTON));
}

TEST(Dialogs, AboutBoxShowsTheIconTheModuleNameAndAWayToCloseAndTheIconsAndCursorLoad) {
  std::wstring title;
  bool icon = false, name = false, ok = false;
  for (const Control &c : Controls(100, title)) {
    icon |= c.windowClass == L"Static" && (c.style & SS_TYPEMASK) == SS_ICON;
    name |= c.text == L"Lumvex1";
    ok |= c.id == IDOK;
  }
  EXPECT_EQ(title, L"About Lumvex1");
  EXPECT_TRUE(icon && name && ok) << icon << name << ok;
  for (int id : {128, 221}) EXPECT_TRUE(LoadImageW(Module(), MAKEINTRESOURCEW(id), IMAGE_ICON, 16, 16, 0)) << id;
  EXPECT_TRUE(FindResourceW(Module(), MAKEINTRESOURCEW(131), MAKEINTRESOURCEW(21)));  // RT_ANICURSOR
}

}  // namespace
