// The folder settings dialog, opened from the tree's menu in a browse call and answered by a
// watcher: what it shows for the folder's "datains.ini", what accepting writes or deletes, the
// empty layer refused, the host's colour dialog accepted and cancelled, and the browse result.
#include "ScratchFolder.h"
#include "TreeWatch.h"
#include "settings/IniFile.h"

#include <gtest/gtest.h>

#include <algorithm>
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
  std::function<void(HWND dialog)> act;
  Shown expected;
  const char *layer, *command, *color;  // afterwards; null layer: no file
};

const char kWallsWithOther[] =
    "[Other]\r\nKey=kept\r\n\r\n[Default Parameters]\r\nLayer=WALLS\r\nLisp command=\r\nColor=1\r\n\r\n";

class FolderSettings : public BrowseTest {};

TEST_F(FolderSettings, DialogRulesAndTheBrowseResult) {
  const Case cases[] = {
      {"no file, accepted at once",
       nullptr,
       nullptr,
       {true, false, false, false, "", "", RGB(255, 255, 255)},
       nullptr,
       nullptr,
       nullptr},
      {"WALLS in colour 1; colour 3 cancelled, then taken",
       kWallsWithOther,
       [](HWND d) {
         PickColor(d, 0);
         EXPECT_EQ(SwatchColor(d), RGB(255, 0, 0)) << "cancelled";
         PickColor(d, 3);
         EXPECT_EQ(SwatchColor(d), RGB(0, 255, 0)) << "accepted";
         SetDlgItemTextA(d, kCommand, "MYCMD");
       },
       {false, true, true, false, "WALLS", "", RGB(255, 0, 0)},
       "WALLS",
       "MYCMD",
       "3"},
      {"a layer without a colour",
       "[Default Parameters]\r\nLayer=WALLS\r\n",
       [](HWND d) { SetDlgItemTextA(d, kCommand, "X"); },
       {false, true, true, false, "WALLS", "", RGB(0, 0, 0)},
       "WALLS",
       "X",
       "0"},
      {"an empty layer refused",
       nullptr,
       [](HWND d) { SendMessageA(GetDlgItem(d, kUseCurrent), BM_CLICK, 0, 0); },
       {true, false, false, true, "", "", RGB(255, 255, 255)},
       nullptr,
       nullptr,
       nullptr},
      {"current layer and no command delete the file",
       kWallsWithOther,
       [](HWND d) { SendMessageA(GetDlgItem(d, kUseCurrent), BM_CLICK, 0, 0); },
       {false, true, true, false, "WALLS", "", RGB(255, 0, 0)},
       nullptr,
       nullptr,
       nullptr},
      {"current layer saves the swatch's colour, not the file's",
       "[Default Parameters]\r\nLayer=\r\nLisp command=GO\r\nColor=3\r\n",
       nullptr,
       {true, false, false, false, "", "GO", RGB(255, 255, 255)},
       "",
       "GO",
       "7"},
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
      SendMessageA(dialog, WM_COMMAND, IDOK, 0);
      for (int i = 0; i < 50 && IsWindow(dialog); ++i) Sleep(20);
      shown.openAfterAccept = IsWindow(dialog);
      if (shown.openAfterAccept) SendMessageA(dialog, WM_COMMAND, IDCANCEL, 0);
      PostMessageA(frame, WM_COMMAND, kAccept, 0);
    });
    SCOPED_TRACE(c.name);
    ASSERT_TRUE(outcome.watcherFoundFrame);
    EXPECT_EQ(shown.Fields(), c.expected.Fields());
    const std::vector<HostEvent> events = HostEvents();
    const bool alerted = std::find(events.begin(), events.end(), Alerted(L"Name of layer is empty")) != events.end();
    EXPECT_EQ(alerted, c.expected.openAfterAccept);
    auto wide = [](const char *text) {
      const std::string narrow = text ? text : "";
      return std::wstring(narrow.begin(), narrow.end());
    };
    ASSERT_EQ(outcome.texts.size(), 4u);
    EXPECT_EQ(std::vector<std::wstring>(outcome.texts.begin() + 1, outcome.texts.end()),
              (std::vector<std::wstring>{wide(c.layer), wide(c.color), wide(c.command)}));
    CIniFile file;
    file.SetFilePath(settings);
    const bool exists = file.Load();
    ASSERT_EQ(exists, c.layer != nullptr) << Content(settings);
    if (!exists) continue;
    EXPECT_EQ(file.GetString("Default Parameters", "Layer"), c.layer);
    EXPECT_EQ(file.GetString("Default Parameters", "Lisp command"), c.command);
    EXPECT_EQ(file.GetString("Default Parameters", "Color"), c.color);
    if (c.file == kWallsWithOther) {
      EXPECT_EQ(file.GetString("Other", "Key"), "kept");
    }
  }
}
}  // namespace
