// The drawing area of the host window: the view the module gives the focus back to.
#pragma once

#include <windows.h>

HWND CreateDrawingView(HWND parent, int id);
