// The shell's double-NUL path list: each path grows it by exactly what it needs, a failed
// allocation loses nothing, and no path is left out without saying so.
#include "filecmd/ShellList.h"

#include <gtest/gtest.h>

#include <cstdlib>
#include <string>

namespace {
struct List {
  char *buffer = nullptr;
  int capacity = 0, used = 0;
  char *end = nullptr;
  ~List() { std::free(buffer); }
  bool Add(const char *path, ShellListReallocate reallocate = std::realloc) {
    return AppendShellListPath(buffer, capacity, used, end, path, reallocate);
  }
  std::string Bytes() const { return std::string(buffer, static_cast<size_t>(capacity)); }
};

void *FailAlways(void *, size_t) { return nullptr; }

TEST(FileListShellBuffer, GrowsByEachPathAndKeepsTheListWhole) {
  List list;
  EXPECT_FALSE(list.Add("C:\\a.dwg", FailAlways));
  EXPECT_EQ(list.buffer, nullptr);
  EXPECT_EQ(list.capacity, 0);
  EXPECT_FALSE(list.Add(nullptr));
  EXPECT_EQ(list.buffer, nullptr);

  ASSERT_TRUE(list.Add("C:\\a.dwg"));
  EXPECT_EQ(list.Bytes(), std::string("C:\\a.dwg\0\0", 10));
  EXPECT_FALSE(list.Add("C:\\longer\\b.dwg", FailAlways));
  EXPECT_FALSE(list.Add("")) << "an empty path would end the list before the paths after it";
  EXPECT_EQ(list.used, 9);
  EXPECT_EQ(list.Bytes(), std::string("C:\\a.dwg\0\0", 10));

  ASSERT_TRUE(list.Add("C:\\c.dwg"));
  EXPECT_EQ(list.end, list.buffer + 18);
  EXPECT_EQ(list.Bytes(), std::string("C:\\a.dwg\0C:\\c.dwg\0\0", 19));
}
}  // namespace
