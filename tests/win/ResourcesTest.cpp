// The module's resources as its callers load them: menus, accelerators, strings, dialog
// templates, tool bars with their pictures, icons and the animated loading cursor.
#include "ModuleHarness.h"
#include "res/resource.h"

#include <windows.h>

#include <gtest/gtest.h>

#include <cstring>
#include <memory>
#include <set>
#include <stdexcept>
#include <string>
#include <tuple>
#include <type_traits>
#include <utility>
#include <vector>

namespace {

// The module mapped for its resources only, as a resource editor or a caller of LoadString
// would see it; nothing of its code runs.
HMODULE Module() {
  static const HMODULE module = LoadLibraryExW((ProgramFolder() + L"Lumvex1.arx").c_str(), nullptr,
                                               LOAD_LIBRARY_AS_DATAFILE | LOAD_LIBRARY_AS_IMAGE_RESOURCE);
  return module;
}

std::vector<BYTE> RawResource(int id, int type) {
  HRSRC found = FindResourceW(Module(), MAKEINTRESOURCEW(id), MAKEINTRESOURCEW(type));
  if (!found) return {};
  HGLOBAL loaded = LoadResource(Module(), found);
  const BYTE *bytes = static_cast<const BYTE *>(LockResource(loaded));
  return std::vector<BYTE>(bytes, bytes + SizeofResource(Module(), found));
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

const std::vector<Entry> kSortEntries = {{32799, L"By &Name"}, {32788, L"By &Date"}, {32789, L"By &Size"}};

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
  EXPECT_EQ(Entries(GetSubMenu(menu, 2)), kSortEntries);
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

// Reads a DLGTEMPLATEEX and its items; a read past the resource's end fails the test.
class TemplateReader {
 public:
  explicit TemplateReader(std::vector<BYTE> bytes) : m_bytes(std::move(bytes)) {}
  template <typename T>
  T Read() {
    T value{};
    if (m_at + sizeof(T) > m_bytes.size()) throw std::out_of_range("template ends early");
    std::memcpy(&value, m_bytes.data() + m_at, sizeof(T));
    m_at += sizeof(T);
    return value;
  }
  // A name or ordinal field: 0xFFFF followed by a number, or a NUL-ended string.
  std::wstring NameOrOrdinal() {
    std::wstring text;
    for (WORD c = Read<WORD>(); c != 0; c = Read<WORD>()) {
      if (c == 0xFFFF) return L"#" + std::to_wstring(Read<WORD>());
      text += static_cast<wchar_t>(c);
    }
    return text;
  }
  void Skip(size_t count) { m_at += count; }
  void AlignTo4() { m_at = (m_at + 3) / 4 * 4; }

 private:
  std::vector<BYTE> m_bytes;
  size_t m_at = 0;
};

struct DialogItem {
  DWORD style;
  short x, y, cx, cy;
  int id;
  std::wstring windowClass, text;
};

struct DialogTemplate {
  DWORD style;
  short cx, cy;
  std::wstring title, face;
  WORD points;
  std::vector<DialogItem> items;
};

DialogTemplate ParseDialog(int id) {
  TemplateReader reader(RawResource(id, 5));  // RT_DIALOG
  DialogTemplate dialog{};
  EXPECT_EQ(reader.Read<DWORD>(), 0xFFFF0001u) << "extended template, version 1";
  reader.Skip(8);  // help id, extended style
  dialog.style = reader.Read<DWORD>();
  const WORD count = reader.Read<WORD>();
  reader.Skip(4);  // x, y
  dialog.cx = reader.Read<short>();
  dialog.cy = reader.Read<short>();
  EXPECT_EQ(reader.NameOrOrdinal() + reader.NameOrOrdinal(), L"") << "no menu, the standard dialog class";
  dialog.title = reader.NameOrOrdinal();
  if (dialog.style & DS_SETFONT) {
    dialog.points = reader.Read<WORD>();
    reader.Skip(4);  // weight, italic, character set
    dialog.face = reader.NameOrOrdinal();
  }
  // The system control classes by ordinal or by name, as the dialog manager takes them.
  const std::pair<const wchar_t *, const wchar_t *> classes[] = {{L"#128", L"Button"}, {L"#129", L"Edit"}, {L"#130", L"Static"}};
  for (WORD i = 0; i < count; ++i) {
    reader.AlignTo4();
    DialogItem item{};
    reader.Skip(8);  // help id, extended style
    item.style = reader.Read<DWORD>();
    item.x = reader.Read<short>();
    item.y = reader.Read<short>();
    item.cx = reader.Read<short>();
    item.cy = reader.Read<short>();
    item.id = static_cast<int>(reader.Read<DWORD>());
    item.windowClass = reader.NameOrOrdinal();
    for (const auto &[ordinal, name] : classes)
      if (item.windowClass == ordinal || lstrcmpiW(item.windowClass.c_str(), name) == 0) item.windowClass = name;
    item.text = reader.NameOrOrdinal();
    reader.Skip(reader.Read<WORD>());  // creation data
    dialog.items.push_back(item);
  }
  return dialog;
}

TEST(Dialogs, HostDialogIsAnUncaptionedCentredPopupWithoutControls) {
  const DialogTemplate dialog = ParseDialog(200);
  EXPECT_EQ(dialog.cx, 128);
  EXPECT_EQ(dialog.cy, 30);
  EXPECT_TRUE(dialog.style & WS_POPUP);
  EXPECT_TRUE(dialog.style & DS_CENTER);
  EXPECT_NE(dialog.style & WS_CAPTION, static_cast<DWORD>(WS_CAPTION));
  EXPECT_FALSE(dialog.style & WS_VISIBLE);
  EXPECT_EQ(dialog.points, 8);
  EXPECT_EQ(dialog.face, L"MS Sans Serif");
  EXPECT_TRUE(dialog.items.empty());
}

TEST(Dialogs, FolderSettingsLayoutIsAsDesigned) {
  const DialogTemplate dialog = ParseDialog(136);
  EXPECT_EQ(dialog.title, L"Folder settings");
  EXPECT_EQ(dialog.cx, 212);
  EXPECT_EQ(dialog.cy, 81);
  EXPECT_EQ(dialog.style & (WS_POPUP | WS_CAPTION | WS_SYSMENU), static_cast<DWORD>(WS_POPUP | WS_CAPTION | WS_SYSMENU));
  EXPECT_EQ(dialog.points, 8);
  EXPECT_EQ(dialog.face, L"MS Sans Serif");

  struct Expected {
    int id;
    const wchar_t *windowClass, *text;
    short x, y, cx, cy;
  };
  const std::vector<Expected> expected = {
      {1, L"Button", L"&Accept", 46, 61, 50, 14},
      {2, L"Button", L"&Cancel", 115, 61, 50, 14},
      {-1, L"Static", L"Layer name :", 6, 10, 42, 9},
      {1017, L"Edit", L"", 58, 7, 119, 14},
      {1081, L"Button", L"&Use current layer", 6, 22, 69, 9},
      {200, L"Static", L"", 183, 7, 20, 14},
      {201, L"Edit", L"", 58, 40, 120, 14},
      {-1, L"Static", L"Lisp command:", 5, 43, 50, 8},
  };
  ASSERT_EQ(dialog.items.size(), expected.size());
  for (size_t i = 0; i < expected.size(); ++i) {
    const DialogItem &item = dialog.items[i];
    SCOPED_TRACE(testing::Message() << "item " << i << ", id " << expected[i].id);
    EXPECT_EQ(item.id, expected[i].id);
    EXPECT_EQ(item.windowClass, expected[i].windowClass);
    EXPECT_EQ(item.text, expected[i].text);
    EXPECT_EQ(std::make_tuple(item.x, item.y, item.cx, item.cy),
              std::make_tuple(expected[i].x, expected[i].y, expected[i].cx, expected[i].cy));
  }
  EXPECT_EQ(dialog.items[0].style & 0xF, static_cast<DWORD>(BS_DEFPUSHBUTTON));
  EXPECT_EQ(dialog.items[1].style & 0xF, static_cast<DWORD>(BS_PUSHBUTTON));
  for (size_t edit : {3u, 6u}) {
    EXPECT_TRUE(dialog.items[edit].style & WS_BORDER);
    EXPECT_TRUE(dialog.items[edit].style & ES_AUTOHSCROLL);
  }
  EXPECT_EQ(dialog.items[4].style & 0xF, static_cast<DWORD>(BS_AUTOCHECKBOX));
  EXPECT_EQ(dialog.items[5].style & SS_TYPEMASK, static_cast<DWORD>(SS_WHITERECT));
  EXPECT_TRUE(dialog.items[5].style & SS_NOTIFY) << "the swatch reports clicks";
}

TEST(Dialogs, AboutBoxShowsTheIconAndTheModuleName) {
  const DialogTemplate dialog = ParseDialog(100);
  EXPECT_EQ(dialog.title, L"About Lumvex1");
  bool icon = false, name = false, ok = false;
  for (const DialogItem &item : dialog.items) {
    icon |= item.windowClass == L"Static" && (item.style & SS_TYPEMASK) == SS_ICON && item.text == L"#221";
    name |= item.windowClass == L"Static" && item.text == L"Lumvex1";
    ok |= item.id == IDOK;
  }
  EXPECT_TRUE(icon) << "icon 221";
  EXPECT_TRUE(name) << "the text Lumvex1";
  EXPECT_TRUE(ok) << "a way to close it";
}

std::vector<WORD> ToolBarData(int id) {
  const std::vector<BYTE> raw = RawResource(id, RT_TOOLBAR_TYPE);
  std::vector<WORD> words(raw.size() / 2);
  std::memcpy(words.data(), raw.data(), words.size() * 2);
  return words;
}

TEST(ToolBars, ItemsAndButtonSizesAreInTheFrameworksLayout) {
  // WORD version 1, button width, height, item count, then the ids (0 for a separator).
  EXPECT_EQ(ToolBarData(128), (std::vector<WORD>{1, 16, 20, 11, 32771, 0, 32774, 0, 32775, 0, 32782, 0, 32804, 32790, 32805}));
  EXPECT_EQ(ToolBarData(204), (std::vector<WORD>{1, 80, 20, 3, 32795, 0, 32796}));
}

// Each tool bar strip holds one image per button, in a colour table so that the framework can
// map its light grey to the button face.
TEST(ToolBars, StripsHoldOneImagePerButton) {
  for (const auto &[id, width] : {std::pair{128, 7 * 16}, std::pair{204, 2 * 80}}) {
    const HBITMAP bitmap =
        static_cast<HBITMAP>(LoadImageW(Module(), MAKEINTRESOURCEW(id), IMAGE_BITMAP, 0, 0, LR_CREATEDIBSECTION));
    DIBSECTION section{};
    ASSERT_TRUE(bitmap && GetObjectW(bitmap, sizeof section, &section)) << id;
    EXPECT_EQ(section.dsBm.bmWidth, width) << id;
    EXPECT_EQ(section.dsBm.bmHeight, 20) << id;
    EXPECT_LE(section.dsBm.bmBitsPixel, 8) << id;
    DeleteObject(bitmap);
  }
}

TEST(Icons, TheWindowIconTheAboutIconAndTheLoadingCursor) {
  for (int id : {128, 221}) EXPECT_TRUE(LoadImageW(Module(), MAKEINTRESOURCEW(id), IMAGE_ICON, 16, 16, 0)) << id;
  const std::vector<BYTE> cursor = RawResource(131, 21);  // RT_ANICURSOR
  ASSERT_GE(cursor.size(), 12u);
  EXPECT_EQ(std::string(reinterpret_cast<const char *>(cursor.data() + 8), 4), "ACON");
}

}  // namespace
