// What a metafile preview is: an enhanced metafile, or a Windows metafile with or without the
// 22-byte "placeable" header, and the aspect ratio it wants when one can be told.
#pragma once

#include <cstddef>
#include <cstdint>
#include <optional>

namespace devhost::preview {

enum class MetafileKind { Enhanced, Windows };

struct MetafileLayout {
  MetafileKind kind = MetafileKind::Enhanced;
  // The metafile proper (past a placeable header) within the entry's bytes.
  size_t offset = 0;
  size_t size = 0;
  // Picture extents in any unit; zero when the metafile does not say.
  uint32_t aspectWidth = 0;
  uint32_t aspectHeight = 0;
};

// Nothing when the bytes are not a metafile whose header agrees with the bytes there are.
std::optional<MetafileLayout> inspectMetafile(const uint8_t *data, size_t size);

}  // namespace devhost::preview
