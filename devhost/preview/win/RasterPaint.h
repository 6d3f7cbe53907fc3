// Paints a decoded picture into its place in a window.
#pragma once

#include "preview/PreviewFit.h"
#include "preview/win/PreviewImage.h"

#include <windows.h>

namespace devhost::preview {

// Stretched with halftoning into fit; a picture with transparency is blended over the background.
// Keeps the stretched pixels in the image for the next paint at the same size.
void paintRaster(HDC dc, const FitRect &fit, const PreviewImage &image, COLORREF background);

}  // namespace devhost::preview
