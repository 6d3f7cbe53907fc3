// The host's colour dialog opens near its owner and inside the work area, wherever the owner
// lies: a person can always reach its title bar and its buttons.
#include "host/HostApi.h"

#include <windows.h>

#include <gtest/gtest.h>

#include <thread>

namespace {

// Reads where the colour dialog opened and cancels it, from its own thread, as a person would.
RECT CancelledAt() {
  RECT at{};
  for (int waited = 0; waited < 10000; waited += 20) {
    if (HWND dialog = FindWindowA("DevhostSelectColor", "Select Color"); dialog && IsWindowVisible(dialog)) {
      GetWindowRect(dialog, &at);
      PostMessageA(dialog, WM_COMMAND, IDCANCEL, 0);
      return at;
    }
    Sleep(20);
  }
  ADD_FAILURE() << "the colour dialog never showed";
  return at;
}

TEST(ColorDialog, OpensInsideTheWorkAreaNearItsOwner) {
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
    RECT at{};
    std::thread watcher([&at] { at = CancelledAt(); });
    int color = 7;
    EXPECT_FALSE(acedSetColorDialog(color, false, 7));
    watcher.join();
    DestroyWindow(window);
    EXPECT_GE(at.left, work.left);
    EXPECT_GE(at.top, work.top) << "its title bar is out of reach";
    EXPECT_LE(at.right, work.right);
    EXPECT_LE(at.bottom, work.bottom);
    if (owner.centred) {
      EXPECT_NEAR((at.left + at.right) / 2, (owner.rect.left + owner.rect.right) / 2, 1);
      EXPECT_NEAR((at.top + at.bottom) / 2, (owner.rect.top + owner.rect.bottom) / 2, 1);
    }
  }
}

}  // namespace
