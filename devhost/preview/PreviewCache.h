// Decoded previews kept between paints, so that scrolling and repainting tiles reads no file and
// decodes nothing. A drawing is known by its full path, size and last-write time: a changed file
// is read again. Bounded by count and by bytes; the least recently painted goes first.
// Used on the one user-interface thread that paints tiles, so it takes no locks.
#pragma once

#include <cstddef>
#include <cstdint>
#include <iterator>
#include <list>
#include <memory>
#include <string>
#include <unordered_map>

namespace devhost::preview {

struct PreviewKey {
  std::wstring path;
  uint64_t size = 0;
  uint64_t lastWrite = 0;
};

// Image is anything with cost(): the bytes it holds.
template <class Image>
class PreviewCache {
 public:
  PreviewCache(size_t maxEntries, size_t maxBytes) : m_maxEntries(maxEntries), m_maxBytes(maxBytes) {}

  // The image kept for exactly this file, or null.
  std::shared_ptr<const Image> find(const PreviewKey &key) {
    const auto found = m_byPath.find(key.path);
    if (found == m_byPath.end()) return nullptr;
    const typename Order::iterator slot = found->second;
    if (slot->key.size != key.size || slot->key.lastWrite != key.lastWrite) {
      erase(slot);  // the drawing changed since it was decoded
      return nullptr;
    }
    m_entries.splice(m_entries.begin(), m_entries, slot);
    return slot->image;
  }

  // Keeps the image unless it alone exceeds the byte budget, evicting the oldest to make room.
  void store(const PreviewKey &key, std::shared_ptr<const Image> image) {
    const auto found = m_byPath.find(key.path);
    if (found != m_byPath.end()) erase(found->second);
    const size_t cost = image->cost() + key.path.size() * sizeof(wchar_t);
    if (cost > m_maxBytes || m_maxEntries == 0) return;
    while (!m_entries.empty() && (m_entries.size() >= m_maxEntries || m_bytes + cost > m_maxBytes))
      erase(std::prev(m_entries.end()));
    m_entries.push_front(Slot{key, std::move(image), cost});
    m_byPath[key.path] = m_entries.begin();
    m_bytes += cost;
  }

  void clear() {
    m_entries.clear();
    m_byPath.clear();
    m_bytes = 0;
  }

  size_t entryCount() const { return m_entries.size(); }
  size_t bytesHeld() const { return m_bytes; }

 private:
  struct Slot {
    PreviewKey key;
    std::shared_ptr<const Image> image;
    size_t cost;
  };
  using Order = std::list<Slot>;  // most recently used first

  void erase(typename Order::iterator slot) {
    m_bytes -= slot->cost;
    m_byPath.erase(slot->key.path);
    m_entries.erase(slot);
  }

  size_t m_maxEntries;
  size_t m_maxBytes;
  size_t m_bytes = 0;
  Order m_entries;
  std::unordered_map<std::wstring, typename Order::iterator> m_byPath;
};

}  // namespace devhost::preview
