// The framework's growable array: records lie contiguously, grow in steps, and an index out
// of range raises the invalid-argument exception instead of reading past the end.
#pragma once

#include <stdexcept>
#include <vector>

namespace fw {

template <class T>
class CArray {
 public:
  int GetSize() const { return static_cast<int>(m_items.size()); }
  int GetCount() const { return GetSize(); }
  bool IsEmpty() const { return m_items.empty(); }

  // Empties the array when newSize is 0; growBy is how many records each growth makes room for.
  void SetSize(int newSize, int growBy = -1) {
    if (growBy > 0) m_growBy = growBy;
    m_items.resize(newSize < 0 ? 0 : static_cast<size_t>(newSize));
    if (newSize <= 0) m_items.shrink_to_fit();
  }

  int Add(const T &item) {
    if (m_items.size() == m_items.capacity()) m_items.reserve(m_items.size() + static_cast<size_t>(m_growBy));
    m_items.push_back(item);
    return GetSize() - 1;
  }

  void RemoveAll() {
    m_items.clear();
    m_items.shrink_to_fit();
  }

  T &operator[](int index) { return m_items[Checked(index)]; }
  const T &operator[](int index) const { return m_items[Checked(index)]; }
  T &ElementAt(int index) { return (*this)[index]; }
  const T &GetAt(int index) const { return (*this)[index]; }

  T *GetData() { return m_items.data(); }
  const T *GetData() const { return m_items.data(); }

 private:
  size_t Checked(int index) const {
    if (index < 0 || static_cast<size_t>(index) >= m_items.size()) throw std::invalid_argument("array index out of range");
    return static_cast<size_t>(index);
  }

  std::vector<T> m_items;
  int m_growBy = 1;
};

}  // namespace fw
