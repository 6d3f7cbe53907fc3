// Where the explorer frame opens, from the hidden dialog's rectangle and the remembered size.
#pragma once

struct DialogRect {
  int left, top, right, bottom;
};

struct FramePlacement {
  int x = 0;
  int y = 0;
  bool maximized = false;  // both coordinates clamped to 0: the remembered size is not applied
  bool resized = false;    // moved to (x, y) with the remembered size
};

FramePlacement PlaceFrame(const DialogRect &dialog, int width, int height);
