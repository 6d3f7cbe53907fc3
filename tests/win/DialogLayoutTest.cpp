// The module's dialogs as a person meets them: every text fits its control at the dialog's own
// font, as the platform draws it; Tab walks the folder settings in the order of their layout;
// the about box names the release.
#include <windows.h>

#include <gtest/gtest.h>

#include <algorithm>
#include <string>
#include <vector>

#include "LumvexVersion.h"
#include "res/resource.h"

namespace {

HMODULE Module() {
  wchar_t path[MAX_PATH] = L"";
  GetModuleFileNameW(nullptr, path, MAX_PATH);
  std::wstring folder(path);
  folder.erase(folder.find_last_of(L"\\/") + 1);
  static const HMODULE module = LoadLibraryExW((folder + L"Lumvex1.arx").c_str(), nullptr, LOAD_LIBRARY_AS_DATAFILE);
  return module;
}

INT_PTR CALLBACK Quiet(HWND, UINT, WPARAM, LPARAM) { return FALSE; }

struct DialogWindow {
  explicit DialogWindow(int id) {
    HRSRC found = FindResourceW(Module(), MAKEINTRESOURCEW(id), MAKEINTRESOURCEW(5));  // RT_DIALOG
    const auto *layout = found ? static_cast<const DLGTEMPLATE *>(LockResource(LoadResource(Module(), found))) : nullptr;
    if (layout) hwnd = CreateDialogIndirectParamW(GetModuleHandleW(nullptr), layout, nullptr, Quiet, 0);
  }
  ~DialogWindow() {
    if (hwnd) DestroyWindow(hwnd);
  }
  HWND hwnd = nullptr;
};

std::wstring TextOf(HWND window) {
  wchar_t text[256] = L"";
  GetWindowTextW(window, text, 256);
  return text;
}

std::wstring ClassOf(HWND window) {
  wchar_t name[64] = L"";
  GetClassNameW(window, name, 64);
  return name;
}

std::vector<HWND> Children(HWND dialog) {
  std::vector<HWND> children;
  for (HWND child = GetWindow(dialog, GW_CHILD); child; child = GetWindow(child, GW_HWNDNEXT)) children.push_back(child);
  return children;
}

// The room a control leaves for its text: a check box's box and a button's edges take their part.
int TextRoom(HWND control) {
  RECT client{};
  GetClientRect(control, &client);
  const LONG style = GetWindowLongW(control, GWL_STYLE);
  if (ClassOf(control) != L"Button") return client.right;
  switch (style & BS_TYPEMASK) {
    case BS_CHECKBOX:
    case BS_AUTOCHECKBOX:
    case BS_RADIOBUTTON:
    case BS_AUTORADIOBUTTON: return client.right - GetSystemMetrics(SM_CXMENUCHECK) - 4;
    default: return client.right - 2 * GetSystemMetrics(SM_CXEDGE);
  }
}

TEST(Dialogs, EveryTextFitsItsControlAtTheDialogFont) {
  for (int id : {IDD_ABOUTBOX, IDD_FOLDER_SETTINGS}) {
    DialogWindow dialog(id);
    ASSERT_TRUE(dialog.hwnd) << "dialog " << id;
    const auto font = reinterpret_cast<HFONT>(SendMessageW(dialog.hwnd, WM_GETFONT, 0, 0));
    for (HWND control : Children(dialog.hwnd)) {
      const std::wstring text = TextOf(control);
      const std::wstring kind = ClassOf(control);
      const bool picture = kind == L"Static" && (GetWindowLongW(control, GWL_STYLE) & SS_TYPEMASK) == SS_ICON;
      if (text.empty() || picture || (kind != L"Static" && kind != L"Button")) continue;
      HDC dc = GetDC(control);
      const HGDIOBJ old = SelectObject(dc, font);
      RECT needed{0, 0, 0, 0};
      DrawTextW(dc, text.c_str(), -1, &needed, DT_CALCRECT | DT_SINGLELINE);
      SelectObject(dc, old);
      ReleaseDC(control, dc);
      RECT client{};
      GetClientRect(control, &client);
      EXPECT_LE(needed.right, TextRoom(control)) << "dialog " << id << ": \"" << std::string(text.begin(), text.end())
                                                 << "\" is clipped";
      EXPECT_LE(needed.bottom, client.bottom) << "dialog " << id << ": \"" << std::string(text.begin(), text.end())
                                               << "\" is cut at the bottom";
    }
  }
}

TEST(Dialogs, TheAboutBoxNamesTheRelease) {
  DialogWindow about(IDD_ABOUTBOX);
  ASSERT_TRUE(about.hwnd);
  std::vector<std::wstring> texts;
  for (HWND control : Children(about.hwnd)) texts.push_back(TextOf(control));
  EXPECT_NE(std::find(texts.begin(), texts.end(), L"Version " LUMVEX_VERSION_WIDE), texts.end());
}

TEST(Dialogs, TabWalksTheFolderSettingsInTheOrderOfTheirLayoutFromTheCheckBox) {
  DialogWindow settings(IDD_FOLDER_SETTINGS);
  ASSERT_TRUE(settings.hwnd);
  std::vector<int> order;
  HWND first = GetNextDlgTabItem(settings.hwnd, nullptr, FALSE);
  for (HWND at = first; at && order.size() < 10; at = GetNextDlgTabItem(settings.hwnd, at, FALSE)) {
    order.push_back(GetDlgCtrlID(at));
    if (GetNextDlgTabItem(settings.hwnd, at, FALSE) == first) break;
  }
  EXPECT_EQ(order, (std::vector<int>{IDC_USE_CURRENT_LAYER, IDC_LAYER_NAME, IDC_COLOR_SWATCH, IDC_LISP_COMMAND, IDOK, IDCANCEL}));
  EXPECT_EQ(SendDlgItemMessageW(settings.hwnd, IDOK, WM_GETDLGCODE, 0, 0) & DLGC_DEFPUSHBUTTON, DLGC_DEFPUSHBUTTON);
}

}  // namespace
