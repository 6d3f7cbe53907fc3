// Tab and Shift+Tab walk the explorer's places in a ring: the folder tree, the drawings, the
// search box, the accept button and the cancel button. The buttons live on the bottom tool bar,
// which takes the keyboard with the button shown hot; Enter or Space there presses it.
#pragma once

#include <windows.h>

class CMainFrame;

// Whether the key was the ring's to handle (it is then handled).
bool HandleFocusKey(CMainFrame &frame, const MSG &msg);
