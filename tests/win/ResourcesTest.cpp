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
class ResourceModule {
 public:
  ResourceModule()
      : m_module(LoadLibraryExW((ProgramFolder() + L"Lumvex1.arx").c_str(), nullptr,
                                LOAD_LIBRARY_AS_DATAFILE | LOAD_LIBRARY_AS_IMAGE_RESOURCE)) {}
  ~ResourceModule() {
    if (m_module) FreeLibrary(m_module);
  }
  ResourceModule(const ResourceModule &) = delete;
  ResourceModule &operator=(const ResourceModule &) = delete;
  HMODULE get() const { return m_module; }

 private:
  HMODULE m_module;
};

HMODULE Module() {
  static ResourceModule module;
  return module.get();
}

std::vector<BYTE> RawResource(int id, int type) {
  HRSRC found = FindResourceW(Module(), MAKEINTRESOURCEW(id), MAKEINTRESOURCEW(type));
  if (!found) return {};
  HGLOBAL loaded = LoadResource(Module(), found);
  const BYTE *bytes = static_cast<const BYTE *>(LockResource(loaded));
  return std::vector<BYTE>(bytes, bytes + SizeofResource(Module(), found));
}

struct MenuDeleter {
  void operator()(HMENU menu) const { DestroyMenu(menu); }
};
using MenuHandle = std::unique_ptr<std::remove_pointer_t<HMENU>, MenuDeleter>;

struct GdiDeleter {
  void operator()(HGDIOBJ object) const { DeleteObject(object); }
};
using BitmapHandle = std::unique_ptr<std::remove_pointer_t<HBITMAP>, GdiDeleter>;

struct IconDeleter {
  void operator()(HICON icon) const { DestroyIcon(icon); }
};
using IconHandle = std::unique_ptr<std::remove_pointer_t<HICON>, IconDeleter>;

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
  MenuHandle menu(LoadMenuW(Module(), MAKEINTRESOURCEW(128)));
  ASSERT_TRUE(menu);
  EXPECT_EQ(Entries(menu.get()), (std::vector<Entry>{{-1, L"&File"}, {-1, L"&View"}, {-1, L"&Sort"}, {-1, L"&Help"}}));

  EXPECT_EQ(Entries(GetSubMenu(menu.get(), 0)), (std::vector<Entry>{{57665, L"E&xit"}}));
  EXPECT_EQ(Entries(GetSubMenu(menu.get(), 1)), (std::vector<Entry>{{32771, L"&Begin"},
                                                                    {32774, L"&Increase"},
                                                                    {32775, L"&Decrease"},
                                                                    {32782, L"&Aligne"},
                                                                    {0, L""},
                                                                    {59392, L"&Toolbar"},
                                                                    {59393, L"&Status Bar"}}));
  EXPECT_EQ(Entries(GetSubMenu(menu.get(), 2)), kSortEntries);
  EXPECT_EQ(Entries(GetSubMenu(menu.get(), 3)), (std::vector<Entry>{{57664, L"&About"}, {57670, L"&Help"}}));

  // The frame's update handlers find the sort items by command.
  wchar_t text[64];
  ASSERT_GT(GetMenuStringW(menu.get(), 32788, text, 64, MF_BYCOMMAND), 0);
  EXPECT_STREQ(text, L"By &Date");
}

TEST(Menus, TileMenuIsOnePopupWithFileCommandsSortAndProperty) {
  MenuHandle menu(LoadMenuW(Module(), MAKEINTRESOURCEW(208)));
  ASSERT_TRUE(menu);
  ASSERT_EQ(GetMenuItemCount(menu.get()), 1);
  HMENU popup = GetSubMenu(menu.get(), 0);
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

  // The tile checks and grays items by command on the popup it tracks.
  EXPECT_NE(CheckMenuItem(popup, 32788, MF_BYCOMMAND | MF_CHECKED), static_cast<DWORD>(-1));
  EXPECT_EQ(GetMenuState(popup, 32788, MF_BYCOMMAND) & MF_CHECKED, static_cast<UINT>(MF_CHECKED));
  EXPECT_NE(EnableMenuItem(popup, 32801, MF_BYCOMMAND | MF_GRAYED), -1);
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

// Reads a DLGTEMPLATEEX and its items; every read is checked against the resource's size.
class TemplateReader {
 public:
  explicit TemplateReader(std::vector<BYTE> bytes) : m_bytes(std::move(bytes)) {}

  template <typename T>
  T Read() {
    if (m_at + sizeof(T) > m_bytes.size()) throw std::out_of_range("template ends early");
    T value;
    std::memcpy(&value, m_bytes.data() + m_at, sizeof(T));
    m_at += sizeof(T);
    return value;
  }
  // A name or ordinal field: 0, 0xFFFF followed by a number, or a NUL-ended string.
  std::wstring NameOrOrdinal() {
    const WORD first = Read<WORD>();
    if (first == 0xFFFF) return L"#" + std::to_wstring(Read<WORD>());
    std::wstring text;
    for (WORD c = first; c != 0; c = Read<WORD>()) text += static_cast<wchar_t>(c);
    return text;
  }
  void AlignTo(size_t boundary) { m_at = (m_at + boundary - 1) / boundary * boundary; }
  void Skip(size_t count) { m_at += count; }

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

// The system control classes by ordinal or by name, in any case, as the dialog manager takes them.
std::wstring ClassName(const std::wstring &name) {
  for (const auto &[ordinal, known] :
       {std::pair<const wchar_t *, const wchar_t *>{L"#128", L"Button"}, {L"#129", L"Edit"}, {L"#130", L"Static"}}) {
    if (name == ordinal || lstrcmpiW(name.c_str(), known) == 0) return known;
  }
  return name;
}

DialogTemplate ParseDialog(int id) {
  TemplateReader reader(RawResource(id, 5));  // RT_DIALOG
  DialogTemplate dialog{};
  EXPECT_EQ(reader.Read<WORD>(), 1) << "version";
  EXPECT_EQ(reader.Read<WORD>(), 0xFFFF) << "extended template";
  reader.Read<DWORD>();  // help id
  reader.Read<DWORD>();  // extended style
  dialog.style = reader.Read<DWORD>();
  const WORD count = reader.Read<WORD>();
  reader.Read<short>();
  reader.Read<short>();
  dialog.cx = reader.Read<short>();
  dialog.cy = reader.Read<short>();
  EXPECT_EQ(reader.NameOrOrdinal(), L"") << "no menu";
  EXPECT_EQ(reader.NameOrOrdinal(), L"") << "the standard dialog class";
  dialog.title = reader.NameOrOrdinal();
  if (dialog.style & DS_SETFONT) {
    dialog.points = reader.Read<WORD>();
    reader.Read<WORD>();  // weight
    reader.Read<BYTE>();  // italic
    reader.Read<BYTE>();  // character set
    dialog.face = reader.NameOrOrdinal();
  }
  for (WORD i = 0; i < count; ++i) {
    reader.AlignTo(4);
    DialogItem item{};
    reader.Read<DWORD>();  // help id
    reader.Read<DWORD>();  // extended style
    item.style = reader.Read<DWORD>();
    item.x = reader.Read<short>();
    item.y = reader.Read<short>();
    item.cx = reader.Read<short>();
    item.cy = reader.Read<short>();
    item.id = static_cast<int>(reader.Read<DWORD>());
    item.windowClass = ClassName(reader.NameOrOrdinal());
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

INT_PTR CALLBACK QuietDialog(HWND, UINT message, WPARAM, LPARAM) { return message == WM_INITDIALOG; }

TEST(Dialogs, FolderSettingsTemplateMakesARealDialog) {
  HWND dialog = CreateDialogParamW(Module(), MAKEINTRESOURCEW(136), nullptr, QuietDialog, 0);
  ASSERT_TRUE(dialog);
  wchar_t text[64] = L"";
  GetWindowTextW(dialog, text, 64);
  EXPECT_STREQ(text, L"Folder settings");
  for (int id : {1, 2, 1017, 1081, 200, 201}) EXPECT_TRUE(GetDlgItem(dialog, id)) << id;
  GetDlgItemTextW(dialog, 1081, text, 64);
  EXPECT_STREQ(text, L"&Use current layer");
  EXPECT_EQ(SendDlgItemMessageW(dialog, 1081, BM_GETCHECK, 0, 0), BST_UNCHECKED);
  SendDlgItemMessageW(dialog, 1081, WM_LBUTTONDOWN, MK_LBUTTON, 0);
  SendDlgItemMessageW(dialog, 1081, WM_LBUTTONUP, 0, 0);
  EXPECT_EQ(SendDlgItemMessageW(dialog, 1081, BM_GETCHECK, 0, 0), BST_CHECKED) << "an automatic check box";
  DestroyWindow(dialog);
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

// The 32-bit pixels of a bitmap resource, top row first, with its size and colour depth.
struct Picture {
  int width = 0, height = 0, bitsPerPixel = 0;
  std::vector<RGBQUAD> pixels;
  const RGBQUAD &at(int x, int y) const { return pixels[static_cast<size_t>(y) * width + x]; }
};

Picture LoadPicture(int id) {
  Picture picture;
  BitmapHandle bitmap(static_cast<HBITMAP>(LoadImageW(Module(), MAKEINTRESOURCEW(id), IMAGE_BITMAP, 0, 0, LR_CREATEDIBSECTION)));
  if (!bitmap) return picture;
  DIBSECTION section{};
  GetObjectW(bitmap.get(), sizeof section, &section);
  picture.width = section.dsBm.bmWidth;
  picture.height = section.dsBm.bmHeight;
  picture.bitsPerPixel = section.dsBm.bmBitsPixel;
  BITMAPINFO info{};
  info.bmiHeader.biSize = sizeof info.bmiHeader;
  info.bmiHeader.biWidth = picture.width;
  info.bmiHeader.biHeight = -picture.height;
  info.bmiHeader.biPlanes = 1;
  info.bmiHeader.biBitCount = 32;
  picture.pixels.resize(static_cast<size_t>(picture.width) * picture.height);
  HDC screen = GetDC(nullptr);
  GetDIBits(screen, bitmap.get(), 0, picture.height, picture.pixels.data(), &info, DIB_RGB_COLORS);
  ReleaseDC(nullptr, screen);
  return picture;
}

bool IsButtonFace(const RGBQUAD &p) { return p.rgbRed == 192 && p.rgbGreen == 192 && p.rgbBlue == 192; }

// Every button of a strip has a picture of its own on the light grey the framework maps.
void ExpectButtonsDrawn(const Picture &picture, int buttonWidth) {
  ASSERT_FALSE(picture.pixels.empty());
  EXPECT_TRUE(IsButtonFace(picture.at(0, 0)));
  EXPECT_TRUE(IsButtonFace(picture.at(picture.width - 1, picture.height - 1)));
  for (int left = 0; left < picture.width; left += buttonWidth) {
    int drawn = 0;
    for (int y = 0; y < picture.height; ++y)
      for (int x = left; x < left + buttonWidth; ++x) drawn += !IsButtonFace(picture.at(x, y));
    EXPECT_GE(drawn, 20) << "button at x = " << left;
  }
}

TEST(ToolBars, StripsHoldOneImagePerButton) {
  const Picture top = LoadPicture(128);
  EXPECT_EQ(top.width, 112) << "seven images of 16: every item but the separators";
  EXPECT_EQ(top.height, 20);
  EXPECT_LE(top.bitsPerPixel, 8) << "a colour table, so that grey maps to the button face";
  ExpectButtonsDrawn(top, 16);

  const Picture bottom = LoadPicture(204);
  EXPECT_EQ(bottom.width, 160);
  EXPECT_EQ(bottom.height, 20);
  EXPECT_LE(bottom.bitsPerPixel, 8);
  ExpectButtonsDrawn(bottom, 80);
}

TEST(Icons, WindowAndAboutIconsLoadInBothSizes) {
  for (int id : {128, 221}) {
    for (int size : {16, 32}) {
      IconHandle icon(static_cast<HICON>(LoadImageW(Module(), MAKEINTRESOURCEW(id), IMAGE_ICON, size, size, 0)));
      ASSERT_TRUE(icon) << id << " at " << size;
      ICONINFO info{};
      ASSERT_TRUE(GetIconInfo(icon.get(), &info));
      BITMAP colour{};
      GetObjectW(info.hbmColor, sizeof colour, &colour);
      EXPECT_EQ(colour.bmWidth, size) << id;
      DeleteObject(info.hbmColor);
      DeleteObject(info.hbmMask);
    }
  }
}

// The chunks of a RIFF file by tag, looking into LIST chunks.
void CollectChunks(const std::vector<BYTE> &riff, size_t at, size_t end,
                   std::vector<std::pair<std::string, std::vector<BYTE>>> &chunks) {
  while (at + 8 <= end) {
    const std::string tag(reinterpret_cast<const char *>(&riff[at]), 4);
    DWORD size;
    std::memcpy(&size, &riff[at + 4], 4);
    ASSERT_LE(at + 8 + size, end) << "chunk " << tag << " runs past its parent";
    if (tag == "LIST") {
      chunks.emplace_back("LIST:" + std::string(reinterpret_cast<const char *>(&riff[at + 8]), 4), std::vector<BYTE>());
      CollectChunks(riff, at + 12, at + 8 + size, chunks);
    } else {
      chunks.emplace_back(tag, std::vector<BYTE>(riff.begin() + at + 8, riff.begin() + at + 8 + size));
    }
    at += 8 + size + (size & 1);
  }
}

// A frame of an animated cursor is a whole .cur file; the cursor API wants its image with the
// hot spot in front.
HICON CursorFromFrame(const std::vector<BYTE> &file) {
  if (file.size() < 22) return nullptr;
  WORD hotspot[2];
  DWORD size, offset;
  std::memcpy(hotspot, &file[10], 4);
  std::memcpy(&size, &file[14], 4);
  std::memcpy(&offset, &file[18], 4);
  if (offset + size > file.size()) return nullptr;
  std::vector<BYTE> resource(4 + size);
  std::memcpy(resource.data(), hotspot, 4);
  std::memcpy(resource.data() + 4, &file[offset], size);
  return CreateIconFromResourceEx(resource.data(), static_cast<DWORD>(resource.size()), FALSE, 0x00030000, 32, 32, 0);
}

// One step of a cursor drawn on white, as the tree's loading effect draws it.
std::vector<DWORD> DrawStep(HICON cursor, UINT step) {
  BITMAPINFO info{};
  info.bmiHeader.biSize = sizeof info.bmiHeader;
  info.bmiHeader.biWidth = 32;
  info.bmiHeader.biHeight = -32;
  info.bmiHeader.biPlanes = 1;
  info.bmiHeader.biBitCount = 32;
  void *bits = nullptr;
  BitmapHandle bitmap(CreateDIBSection(nullptr, &info, DIB_RGB_COLORS, &bits, nullptr, 0));
  HDC dc = CreateCompatibleDC(nullptr);
  HGDIOBJ old = SelectObject(dc, bitmap.get());
  HBRUSH white = static_cast<HBRUSH>(GetStockObject(WHITE_BRUSH));
  DrawIconEx(dc, 0, 0, cursor, 32, 32, step, white, DI_NORMAL);
  GdiFlush();
  std::vector<DWORD> pixels(static_cast<DWORD *>(bits), static_cast<DWORD *>(bits) + 32 * 32);
  SelectObject(dc, old);
  DeleteDC(dc);
  return pixels;
}

TEST(LoadingCursor, IsAnAnimatedCursorOfTenHourglassFrames) {
  const std::vector<BYTE> ani = RawResource(131, 21);  // RT_ANICURSOR
  ASSERT_GE(ani.size(), 12u);
  ASSERT_EQ(std::string(reinterpret_cast<const char *>(ani.data()), 4), "RIFF");
  ASSERT_EQ(std::string(reinterpret_cast<const char *>(ani.data() + 8), 4), "ACON");
  std::vector<std::pair<std::string, std::vector<BYTE>>> chunks;
  CollectChunks(ani, 12, ani.size(), chunks);

  std::vector<std::vector<BYTE>> frames;
  bool header = false;
  for (const auto &[tag, body] : chunks) {
    if (tag == "anih") {
      ASSERT_EQ(body.size(), 36u);
      DWORD fields[9];
      std::memcpy(fields, body.data(), 36);
      EXPECT_EQ(fields[1], 10u) << "frames";
      EXPECT_EQ(fields[2], 10u) << "steps";
      EXPECT_TRUE(fields[8] & 1) << "frames are icon resources";
      header = true;
    }
    if (tag == "icon") frames.push_back(body);
  }
  EXPECT_TRUE(header);
  ASSERT_EQ(frames.size(), 10u);
  for (size_t i = 0; i < frames.size(); ++i) {
    IconHandle frame(CursorFromFrame(frames[i]));
    EXPECT_TRUE(frame) << "frame " << i;
  }
}

TEST(LoadingCursor, LoadsAsACursorWhoseStepsShowTheSandRunning) {
  HCURSOR cursor = static_cast<HCURSOR>(LoadImageW(Module(), MAKEINTRESOURCEW(131), IMAGE_CURSOR, 0, 0, LR_DEFAULTSIZE));
  ASSERT_TRUE(cursor);
  std::vector<std::vector<DWORD>> steps;
  for (UINT step = 0; step < 10; ++step) steps.push_back(DrawStep(cursor, step));
  for (UINT step = 1; step < 10; ++step) EXPECT_NE(steps[step], steps[step - 1]) << "step " << step;
  const auto painted = [](const std::vector<DWORD> &pixels) {
    int count = 0;
    for (DWORD p : pixels) count += (p & 0xFFFFFF) != 0xFFFFFF;
    return count;
  };
  EXPECT_GT(painted(steps[0]), 200) << "an hourglass, not a speck";
  DestroyCursor(cursor);
}

TEST(Version, NamesTheModule) {
  const std::vector<BYTE> version = RawResource(1, 16);  // RT_VERSION
  ASSERT_FALSE(version.empty());
  const std::wstring text(reinterpret_cast<const wchar_t *>(version.data()), version.size() / 2);
  const size_t key = text.find(L"OriginalFilename");
  ASSERT_NE(key, std::wstring::npos);
  EXPECT_NE(text.find(L"Lumvex1.arx", key), std::wstring::npos);
  EXPECT_NE(text.find(L"ProductName"), std::wstring::npos);
}

}  // namespace
