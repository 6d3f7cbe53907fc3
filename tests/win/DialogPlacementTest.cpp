// The host's colour dialog and its alerts open near their owner and inside the work area,
// wherever the owner lies: a person can always reach their title bar and their buttons.
#include "host/HostApi.h"

#include <windows.h>

#include <gtest/gtest.h>

#include <thread>

namespace {

// Reads where the dialog opened and closes it with the button, from its own thread, as a person would.
RECT ClosedAt(const char *className, const char *title, int button) {
  RECT at{};
  for (int waited = 0; waited < 10000; waited += 20) {
    if (HWND dialog = FindWindowA(className, title); dialog && IsWindowVisible(dialog)) {
      GetWindowRect(dialog, &at);
      PostMessageA(dialog, WM_COMMAND, button, 0);
      return at;
    }
    Sleep(20);
  }
  ADD_FAILURE() << title << " never showed";
  return at;
}

TEST(HostDialogs, TheColourDialogAndAlertsOpenInsideTheWorkAreaNearTheirOwner) {
  RECT work{};
  SystemParametersInfoA(SPI_GETWORKAREA, 0, &work, 0);
  const int right = work.right - 200, bottom = work.bottom - 100;
  struct Owner {
    RECT rect;
    bool centred;  // the dialog fits centred on it
  };
  for (const Owner &owner : {Owner{{work.left, work.top, work.left + 200, work.top + 100}, false},
                             Owner{{right, bottom, work.right, work.bottom}, false},
                             Owner{{work.left - 150, work.top - 80, work.left + 50, work.top + 20}, false},
                             Owner{{work.left + 100, work.top + 100, work.right - 100, work.bottom - 100}, true}}) {
    HWND window = CreateWindowExA(0, "STATIC", "owner", WS_POPUP | WS_VISIBLE | WS_CAPTION, owner.rect.left, owner.rect.top,
                                  owner.rect.right - owner.rect.left, owner.rect.bottom - owner.rect.top, nullptr, nullptr,
                                  nullptr, nullptr);
    ASSERT_TRUE(window);
    SetActiveWindow(window);
    RECT colors{}, alert{};
    std::thread watcher([&colors] { colors = ClosedAt("DevhostSelectColor", "Select Color", IDCANCEL); });
    int color = 7;
    EXPECT_FALSE(acedSetColorDialog(color, false, 7));
    watcher.join();
    SetActiveWindow(window);
    std::thread answerer([&alert] { alert = ClosedAt("#32770", "AutoCAD Message", IDOK); });
    acedAlert(L"Name of layer is empty");
    answerer.join();
    DestroyWindow(window);
    for (const RECT &at : {colors, alert}) {
      EXPECT_GE(at.left, work.left);
      EXPECT_GE(at.top, work.top) << "its title bar is out of reach";
      EXPECT_LE(at.right, work.right);
      EXPECT_LE(at.bottom, work.bottom);
    }
    if (owner.centred) {
      EXPECT_NEAR((colors.left + colors.right) / 2, (owner.rect.left + owner.rect.right) / 2, 1);
      EXPECT_NEAR((colors.top + colors.bottom) / 2, (owner.rect.top + owner.rect.bottom) / 2, 1);
    }
  }
}

}  // namespace
