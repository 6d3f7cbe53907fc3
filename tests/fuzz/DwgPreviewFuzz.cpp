// Hostile drawings: the preview directory, then every picture it leads to. The same bytes are
// also fed straight to the bitmap decoder, the PNG size check and the metafile inspection, so
// the fuzzer reaches their checks without first having to find the sentinel.
#include "preview/DibDecoder.h"
#include "preview/MetafileLayout.h"
#include "preview/PngHeader.h"
#include "preview/PreviewDirectory.h"
#include "preview/PreviewFit.h"

#include <cstddef>
#include <cstdint>
#include <vector>

using namespace devhost::preview;

namespace {

void decodePicture(const uint8_t *data, size_t size) {
  DecodedPicture picture;
  if (decodeDib(data, size, picture)) {
    if (picture.pixels.size() != size_t(picture.width) * picture.height) __builtin_trap();
    const FitRect fit = fitCentred(picture.width, picture.height, 300, 200);
    if (fit.left < 0 || fit.top < 0 || fit.left + fit.width > 300 || fit.top + fit.height > 200) __builtin_trap();
  }
  uint32_t width = 0, height = 0;
  if (readPngSize(data, size, width, height) && (width == 0 || width > kMaxPictureSide || height > kMaxPictureSide))
    __builtin_trap();
  if (auto layout = inspectMetafile(data, size))
    if (layout->offset > size || layout->size > size - layout->offset) __builtin_trap();
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const uint8_t *data, size_t size) {
  MemorySource source(data, size);
  if (auto directory = readPreviewDirectory(source)) {
    std::vector<uint8_t> bytes;
    for (const PreviewEntry &entry : picturesByPreference(*directory))
      if (readEntryBytes(source, entry, bytes)) decodePicture(bytes.data(), bytes.size());
  }
  decodePicture(data, size);
  return 0;
}
