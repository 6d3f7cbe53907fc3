// Turns a drawing's stored preview into something paintable.
#pragma once

#include "preview/PreviewSource.h"
#include "preview/win/PreviewImage.h"

namespace devhost::preview {

// The first picture, in order of preference, that decodes; an image without a picture when the
// drawing has none, or none that can be trusted.
PreviewImage loadPreviewImage(PreviewSource &source);

}  // namespace devhost::preview
