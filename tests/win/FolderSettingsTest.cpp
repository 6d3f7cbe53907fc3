// The folder settings dialog, opened from the tree's menu in a browse call and answered by a
// watcher: what it shows for the folder's "datains.ini", what accepting writes or deletes, the
// empty layer refused with an alert in front of the dialog, a file that cannot be written, the
// host's colour dialog accepted and cancelled, a folder path too long, and the browse result.
#include "ScratchFolder.h"
#include "TreeWatch.h"
#include "settings/IniFile.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <cstring>
#include <iterator>
#include <optional>
#include <functional>
#include <tuple>

namespace {
constexpr int kLayer = 1017, kUseCurrent = 1081, kSwatch = 200, kCommand = 201, kAccept = 32795;

COLORREF SwatchColor(HWND dialog) {
  HWND swatch = GetDlgItem(dialog, kSwatch);
  RedrawWindow(swatch, nullptr, nullptr, RDW_INVALIDATE | RDW_UPDATENOW);
  RECT client;
  GetClientRect(swatch, &client);
  HDC dc = GetDC(swatch);
  const COLORREF color = GetPixel(dc, client.right / 2, client.bottom / 2);
  ReleaseDC(swatch, dc);
  return color;
}

// Clicks the swatch and answers the host's colour dialog with `index`, or cancels it with 0.
void PickColor(HWND dialog, int index) {
  PostMessageA(dialog, WM_COMMAND, MAKEWPARAM(kSwatch, STN_CLICKED), reinterpret_cast<LPARAM>(GetDlgItem(dialog, kSwatch)));
  HWND colors = WaitForWindow("DevhostSelectColor", "Select Color", 5000);
  ASSERT_NE(colors, nullptr);
  if (index) SetDlgItemTextA(colors, 100, std::to_string(index).c_str());
  SendMessageA(colors, WM_COMMAND, index ? IDOK : IDCANCEL, 0);
  for (int i = 0; i < 100 && IsWindow(colors); ++i) Sleep(20);
}

struct Shown {
  bool checked = false, layerEnabled = false, swatchEnabled = false, openAfterAccept = false;
  std::string layer, command;
  COLORREF swatch = CLR_INVALID;
  auto Fields() const { return std::tie(checked, layerEnabled, swatchEnabled, openAfterAccept, layer, command, swatch); }
};

struct Case {
  const char *name;
  const char *file;  // the folder's "datains.ini" before, or null
  bool lockedWhileOpen;  // another program holds the file open, sharing nothing, while the dialog is open
  std::function<void(HWND dialog)> act;
  Shown expected;
  std::optional<std::string> after;   // the file afterwards, none when there is no file
  const wchar_t *alert;               // the alert shown, or null
  std::string layer, color, command;  // what the browse returns
};

const char kWallsWithOther[] =
    "[Other]\r\nKey=kept\r\n\r\n[Default Parameters]\r\nLayer=WALLS\r\nLisp command=\r\nColor=1\r\n\r\n";
const char kGreenCommand[] = "[Default Parameters]\r\nLayer=\r\nLisp command=GO\r\nColor=3\r\n\r\n";
const std::string kLongest(2047 - std::strlen("Lisp command="), 'x');

void Click(HWND dialog, int id) { SendMessageA(GetDlgItem(dialog, id), BM_CLICK, 0, 0); }

class FolderSettings : public BrowseTest {};

// What the dialog shows for the folder's file, what accepting leaves on disk, and what the
// browse then returns: an untouched value stays as the file had it, a command as long as the
// loader reads back, and nothing lost when the settings go or the file cannot be written.
TEST_F(FolderSettings, DialogRulesAndTheBrowseResult) {
  const Case cases[] = {
      {"no file, accepted at once", nullptr, false, nullptr, {true, false, false, false, "", "", RGB(255, 255, 255)}, std::nullopt,
       nullptr, "", "", ""},
      {"no file, a command typed",
       nullptr, false,
       [](HWND d) { SetDlgItemTextA(d, kCommand, "GO"); },
       {true, false, false, false, "", "", RGB(255, 255, 255)},
       "[Default Parameters]\r\nLayer=\r\nLisp command=GO\r\nColor=7\r\n\r\n",
       nullptr, "", "7", "GO"},
      {"WALLS in colour 1; colour 3 cancelled, then taken",
       kWallsWithOther, false,
       [](HWND d) {
         PickColor(d, 0);
         EXPECT_EQ(SwatchColor(d), RGB(255, 0, 0)) << "cancelled";
         PickColor(d, 3);
         EXPECT_EQ(SwatchColor(d), RGB(0, 255, 0)) << "accepted";
         SetDlgItemTextA(d, kCommand, "MYCMD");
       },
       {false, true, true, false, "WALLS", "", RGB(255, 0, 0)},
       "[Other]\r\nKey=kept\r\n\r\n[Default Parameters]\r\nLayer=WALLS\r\nLisp command=MYCMD\r\nColor=3\r\n\r\n",
       nullptr, "WALLS", "3", "MYCMD"},
      {"a layer without a colour keeps it missing",
       "[Default Parameters]\r\nLayer=WALLS\r\n", false,
       [](HWND d) { SetDlgItemTextA(d, kCommand, "X"); },
       {false, true, true, false, "WALLS", "", RGB(255, 255, 255)},
       "[Default Parameters]\r\nLayer=WALLS\r\nLisp command=X\r\n\r\n",
       nullptr, "WALLS", "", "X"},
      {"the current layer keeps the file's colour", kGreenCommand, false, nullptr,
       {true, false, false, false, "", "GO", RGB(0, 255, 0)}, kGreenCommand, nullptr, "", "3", "GO"},
      {"an empty layer refused",
       nullptr, false,
       [](HWND d) { Click(d, kUseCurrent); },
       {true, false, false, true, "", "", RGB(255, 255, 255)},
       std::nullopt, L"Name of layer is empty", "", "", ""},
      {"current layer and no command remove the section, other sections stay",
       kWallsWithOther, false,
       [](HWND d) { Click(d, kUseCurrent); },
       {false, true, true, false, "WALLS", "", RGB(255, 0, 0)},
       "[Other]\r\nKey=kept\r\n\r\n", nullptr, "", "", ""},
      {"current layer and no command remove a file of ours alone",
       "[Default Parameters]\r\nLayer=WALLS\r\nColor=1\r\n", false,
       [](HWND d) { Click(d, kUseCurrent); },
       {false, true, true, false, "WALLS", "", RGB(255, 0, 0)},
       std::nullopt, nullptr, "", "", ""},
      {"a pasted command longer than a line takes stops where the loader reads",
       kWallsWithOther, false,
       [](HWND d) {
         SendDlgItemMessageA(d, kCommand, EM_REPLACESEL, TRUE, reinterpret_cast<LPARAM>(std::string(3000, 'x').c_str()));
       },
       {false, true, true, false, "WALLS", "", RGB(255, 0, 0)},
       "[Other]\r\nKey=kept\r\n\r\n[Default Parameters]\r\nLayer=WALLS\r\nLisp command=" + kLongest + "\r\nColor=1\r\n\r\n",
       nullptr, "WALLS", "1", kLongest},
      {"a file that cannot be written stays, and so does the dialog",
       kWallsWithOther, true,
       [](HWND d) { SetDlgItemTextA(d, kCommand, "LOST"); },
       {false, true, true, true, "WALLS", "", RGB(255, 0, 0)},
       kWallsWithOther, L"The folder settings could not be saved", "WALLS", "1", ""},
  };
  for (const Case &c : cases) {
    const ScratchFolder scratch("settings");
    const std::string settings = scratch.File("datains.ini", c.file);
    Shown shown;
    devhostClearEvents();
    const std::string start = scratch.Path() + "\\";
    const BrowseOutcome outcome = Browse(BrowseArgs(std::wstring(start.begin(), start.end()).c_str()), [&](HWND frame) {
      HWND dialog = OpenFolderSettings(FindTree(frame));
      if (!dialog) return PostMessageA(frame, WM_CLOSE, 0, 0), void();
      shown.checked = IsDlgButtonChecked(dialog, kUseCurrent) == BST_CHECKED;
      shown.layerEnabled = IsWindowEnabled(GetDlgItem(dialog, kLayer));
      shown.swatchEnabled = IsWindowEnabled(GetDlgItem(dialog, kSwatch));
      shown.layer = WindowText(GetDlgItem(dialog, kLayer));
      shown.command = WindowText(GetDlgItem(dialog, kCommand));
      shown.swatch = SwatchColor(dialog);
      if (c.act) c.act(dialog);
      HANDLE lock = c.lockedWhileOpen ? CreateFileA(settings.c_str(), GENERIC_READ, 0, nullptr, OPEN_EXISTING, 0, nullptr)
                                      : INVALID_HANDLE_VALUE;
      SendMessageA(dialog, WM_COMMAND, IDOK, 0);
      for (int i = 0; i < 50 && IsWindow(dialog); ++i) Sleep(20);
      shown.openAfterAccept = IsWindow(dialog);
      if (lock != INVALID_HANDLE_VALUE) CloseHandle(lock);
      if (shown.openAfterAccept) SendMessageA(dialog, WM_COMMAND, IDCANCEL, 0);
      PostMessageA(frame, WM_COMMAND, kAccept, 0);
    });
    SCOPED_TRACE(c.name);
    ASSERT_TRUE(outcome.watcherFoundFrame);
    EXPECT_EQ(shown.Fields(), c.expected.Fields());
    std::vector<HostEvent> alerts, events = HostEvents();
    std::copy_if(events.begin(), events.end(), std::back_inserter(alerts), [](const HostEvent &e) { return e.kind == kDevhostAlert; });
    EXPECT_EQ(alerts, c.alert ? std::vector<HostEvent>{Alerted(c.alert)} : std::vector<HostEvent>{});
    auto wide = [](const std::string &narrow) { return std::wstring(narrow.begin(), narrow.end()); };
    EXPECT_EQ(outcome.texts, (std::vector<std::wstring>{outcome.texts.empty() ? L"" : outcome.texts[0], wide(c.layer),
                                                        wide(c.color), wide(c.command)}));
    const bool exists = GetFileAttributesA(settings.c_str()) != INVALID_FILE_ATTRIBUTES;
    EXPECT_EQ(exists, c.after.has_value()) << Content(settings);
    if (exists && c.after) {
      EXPECT_EQ(Content(settings), *c.after);
    }
  }
}

// The alert of a refused entry is owned by the settings dialog, so that it stays in front of it
// and keeps it disabled until answered.
TEST_F(FolderSettings, TheAlertIsOwnedByTheDialog) {
  const ScratchFolder scratch("alert");
  const std::string start = scratch.Path() + "\\";
  HWND dialog = nullptr, owner = nullptr;
  bool dialogEnabled = true;
  devhostSetBatchMode(false);
  Browse(BrowseArgs(std::wstring(start.begin(), start.end()).c_str()), [&](HWND frame) {
    dialog = OpenFolderSettings(FindTree(frame));
    if (dialog) {
      Click(dialog, kUseCurrent);
      PostMessageA(dialog, WM_COMMAND, IDOK, 0);
      if (HWND alert = WaitForWindow("#32770", "AutoCAD Message", 5000)) {
        owner = GetWindow(alert, GW_OWNER);
        dialogEnabled = IsWindowEnabled(dialog);
        SendMessageA(GetDlgItem(alert, IDOK), BM_CLICK, 0, 0);
        for (int i = 0; i < 100 && IsWindow(alert); ++i) Sleep(20);
      }
      SendMessageA(dialog, WM_COMMAND, IDCANCEL, 0);
    }
    PostMessageA(frame, WM_CLOSE, 0, 0);
  });
  devhostSetBatchMode(true);
  ASSERT_NE(dialog, nullptr);
  EXPECT_EQ(owner, dialog);
  EXPECT_FALSE(dialogEnabled);
}

// A folder whose path leaves no room for "\datains.ini" is told so, and no file is touched. Its
// path is too long for a start folder: the watcher opens the tree down to it.
TEST_F(FolderSettings, AFolderPathTooLongForItsSettingsFileIsToldNotIgnored) {
  const ScratchFolder scratch("long");
  std::string folder = scratch.Path();
  std::vector<std::string> names;
  while (folder.size() < 250) {
    names.emplace_back(std::min<size_t>(40, 250 - folder.size() - 1), 'd');
    folder += "\\" + names.back();
    CreateDirectoryA(folder.c_str(), nullptr);
  }
  ASSERT_EQ(folder.size(), 250u);
  const std::string start = scratch.Path() + "\\";
  HWND dialog = nullptr;
  Browse(BrowseArgs(std::wstring(start.begin(), start.end()).c_str()), [&](HWND frame) {
    HWND tree = FindTree(frame);
    HTREEITEM item = TreeNext(tree, nullptr, TVGN_CARET);
    for (const std::string &name : names) {
      SendMessageA(tree, TVM_EXPAND, TVE_EXPAND, reinterpret_cast<LPARAM>(item));
      item = ChildNamed(tree, item, name);
    }
    SendMessageA(tree, TVM_SELECTITEM, TVGN_CARET, reinterpret_cast<LPARAM>(item));
    if (!item || !ChooseFolderSettings(tree)) return PostMessageA(frame, WM_CLOSE, 0, 0), void();
    SendMessageA(tree, WM_NULL, 0, 0);  // answered once the menu's handler is done or in its dialog
    dialog = FindWindowA("#32770", "Folder settings");
    if (dialog) SendMessageA(dialog, WM_COMMAND, IDCANCEL, 0);
    PostMessageA(frame, WM_CLOSE, 0, 0);
  });
  EXPECT_EQ(dialog, nullptr);
  const std::vector<HostEvent> events = HostEvents();
  EXPECT_NE(std::find(events.begin(), events.end(), Alerted(L"The folder's path is too long for its settings file")),
            events.end());
  EXPECT_EQ(GetFileAttributesA((folder + "\\datains.ini").c_str()), INVALID_FILE_ATTRIBUTES);
}

// Presses `key` as a person does, with `held` (say Shift) held down; the keys go to the window
// with the keyboard focus.
void Press(WORD key, WORD held = 0) {
  if (held) keybd_event(static_cast<BYTE>(held), 0, 0, 0);
  keybd_event(static_cast<BYTE>(key), 0, 0, 0);
  keybd_event(static_cast<BYTE>(key), 0, KEYEVENTF_KEYUP, 0);
  if (held) keybd_event(static_cast<BYTE>(held), 0, KEYEVENTF_KEYUP, 0);
}

// The menu is for the row under the cursor wherever on the row the click is (its button, its
// indent), and from the keyboard (the context-menu key, Shift+F10) for the row with the caret.
TEST_F(FolderSettings, TheMenuIsForTheRowClickedOrForTheCaret) {
  const ScratchFolder scratch("rows");
  for (const char *folder : {"b", "c", "c\\sub"}) CreateDirectoryA((scratch.Path() + "\\" + folder).c_str(), nullptr);
  const std::string start = scratch.Path() + "\\";
  auto select = [](HWND tree, HTREEITEM row) { SendMessageA(tree, TVM_SELECTITEM, TVGN_CARET, reinterpret_cast<LPARAM>(row)); };
  const struct {
    const char *name, *row;
    std::function<bool(HWND tree, HTREEITEM row)> open;
  } cases[] = {
      {"a right click on the row's button", "c",
       [](HWND tree, HTREEITEM row) {
         RECT text{};
         std::memcpy(&text, &row, sizeof row);
         SendMessageA(tree, TVM_GETITEMRECT, TRUE, reinterpret_cast<LPARAM>(&text));
         const int indent = static_cast<int>(SendMessageA(tree, TVM_GETINDENT, 0, 0));
         return ChooseFolderSettings(tree, row, text.left - GetSystemMetrics(SM_CXSMICON) - indent / 2);
       }},
      {"a right click on the row's indent", "b", [](HWND tree, HTREEITEM row) { return ChooseFolderSettings(tree, row, 1); }},
      {"the context-menu key", "b", [&](HWND tree, HTREEITEM row) { return select(tree, row), Press(VK_APPS), ChooseFromMenu(); }},
      {"Shift+F10", "c", [&](HWND tree, HTREEITEM row) { return select(tree, row), Press(VK_F10, VK_SHIFT), ChooseFromMenu(); }},
  };
  for (const auto &c : cases) {
    SCOPED_TRACE(c.name);
    Browse(BrowseArgs(std::wstring(start.begin(), start.end()).c_str()), [&](HWND frame) {
      HWND tree = FindTree(frame);
      const HTREEITEM row = ChildNamed(tree, TreeNext(tree, nullptr, TVGN_CARET), c.row);
      if (row && c.open(tree, row)) {
        if (HWND dialog = WaitForWindow("#32770", "Folder settings", 5000)) {
          SetDlgItemTextA(dialog, kCommand, "X");
          SendMessageA(dialog, WM_COMMAND, IDOK, 0);
        }
      }
      PostMessageA(frame, WM_CLOSE, 0, 0);
    });
    for (const char *folder : {"", "b\\", "c\\"}) {
      const std::string file = scratch.Path() + "\\" + folder + "datains.ini";
      EXPECT_EQ(GetFileAttributesA(file.c_str()) != INVALID_FILE_ATTRIBUTES, folder == std::string(c.row) + "\\") << file;
      DeleteFileA(file.c_str());
    }
  }
}
}  // namespace
