// The module's resources as its callers load them: menus, accelerators, strings, the dialogs'
// controls, icons and the animated loading cursor.
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

// One menu entry as a person sees it: id (0 for a separator, -1 for a submenu) and text.
using Entry = std::pair<int, std::wstring>;

std::vector<Entry> Entries(HMENU menu) {
  std::vector<Entry> entries;
  for (int i = 0; i < GetMenuItemCount(menu); ++i) {
    wchar_t text[128] = L"";
    MENUITEMINFOW info{};
    info.cbSize = sizeof info;
    info.fMask = MIIM_FTYPE | MIIM_ID | MIIM_STRING | MIIM_SUBMENU;
    info.dwTypeData = text;
    info.cch = 128;
    GetMenuItemInfoW(menu, i, TRUE, &info);
    const int id = (info.fType & MFT_SEPARATOR) ? 0 : info.hSubMenu ? -1 : static_cast<int>(info.wID);
    entries.emplace_back(id, text);
  }
  return entries;
}

TEST(Menus, FrameMenuOffersEveryCommandUnderItsHeading) {
  const HMENU menu = LoadMenuW(Module(), MAKEINTRESOURCEW(128));
  ASSERT_TRUE(menu);
  EXPECT_EQ(Entries(menu), (std::vector<Entry>{{-1, L"&File"}, {-1, L"&View"}, {-1, L"&Sort"}, {-1, L"&Help"}}));

  EXPECT_EQ(Entries(GetSubMenu(menu, 0)), (std::vector<Entry>{{57665, L"E&xit"}}));
  EXPECT_EQ(Entries(GetSubMenu(menu, 1)), (std::vector<Entry>{{32771, L"&Begin"},
                                                              {32774, L"&Increase"},
                                                              {32775, L"&Decrease"},
                                                              {32782, L"&Aligne"},
                                                              {0, L""},
                                                              {59392, L"&Toolbar"},
                                                              {59393, L"&Status Bar"}}));
  EXPECT_EQ(Entries(GetSubMenu(menu, 2)), (std::vector<Entry>{{32799, L"By &Name"}, {32788, L"By &Date"}, {32789, L"By &Size"}}));
  EXPECT_EQ(Entries(GetSubMenu(menu, 3)), (std::vector<Entry>{{57664, L"&About"}, {57670, L"&Help"}}));
}

TEST(Menus, TileMenuIsOnePopupWithFileCommandsSortAndProperty) {
  const HMENU menu = LoadMenuW(Module(), MAKEINTRESOURCEW(208));
  ASSERT_TRUE(menu);
  ASSERT_EQ(GetMenuItemCount(menu), 1);
  HMENU popup = GetSubMenu(menu, 0);
  EXPECT_EQ(Entries(popup), (std::vector<Entry>{{32797, L"&Copy"},
                                                {32800, L"&Delete"},
                                                {32801, L"&Paste"},
                                                {32802, L"&Rename"},
                                                {0, L""},
                                                {-1, L"&Sort"},
                                                {0, L""},
                                                {32803, L"Property"}}));
  EXPECT_EQ(Entries(GetSubMenu(popup, 5)),
            (std::vector<Entry>{{32799, L"&By Name"}, {32788, L"By &Date"}, {32789, L"By &Size"}}));
}

TEST(Accelerators, FrameTableMapsEveryKeyToItsCommand) {
  HACCEL table = LoadAcceleratorsW(Module(), MAKEINTRESOURCEW(128));
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
      {FCONTROL, 'C', 57634}, {FCONTROL, VK_INSERT, 57634}, {FCONTROL, 'V', 57637}, {FSHIFT, VK_INSERT, 57637},
      {FCONTROL, 'X', 57635}, {FSHIFT, VK_DELETE, 57635},   {FCONTROL, 'A', 32793}, {0, VK_DELETE, 32794},
      {0, VK_F6, 57680},      {FSHIFT, VK_F6, 57681},       {FCONTROL, 'O', 57601}, {FCONTROL, 'P', 57607},
      {FCONTROL, 'N', 57600}, {FCONTROL, 'S', 57603},       {FCONTROL, 'Z', 57643}, {FALT, VK_BACK, 57643},
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

TEST(Strings, PromptsToolTipsTitleAndStatusBarTexts) {
  EXPECT_EQ(String(32771), L"Scroll to begin\nScroll to begin");
  EXPECT_EQ(String(32774), L"Increase\nIncrease");
  EXPECT_EQ(String(32775), L"Decrease\nDecrease");
  EXPECT_EQ(String(32782), L"Aligne\nAligne");
  EXPECT_EQ(String(32799), L"Sort by name\nSort by name");
  EXPECT_EQ(String(32788), L"Sort by date\nSort by date");
  EXPECT_EQ(String(32789), L"Sort by size\nSort by size");
  EXPECT_EQ(String(57634), L"Copy the selection and put it on the Clipboard\nCopy");
  EXPECT_EQ(String(57637), L"Insert Clipboard contents\nPaste");
  EXPECT_EQ(String(57635), L"Cut the selection and put it on the Clipboard\nCut");

  const std::wstring title = String(128);
  EXPECT_EQ(title.substr(0, title.find(L'\n')), L"ombra3") << "the frame's title until a folder is shown";
  EXPECT_EQ(String(0xE001), L"Ready");
  EXPECT_EQ(String(0xE701), L"CAP");
  EXPECT_EQ(String(0xE702), L"NUM");
  EXPECT_EQ(String(0xE703), L"SCRL");
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
