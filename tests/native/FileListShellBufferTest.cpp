// The shell's double-NUL path list: a failed allocation loses nothing, and the list goes on after it.
#include "filecmd/ShellList.h"

#include <gtest/gtest.h>

#include <cstdlib>
#include <string>

namespace {
struct List {
  char *buffer = nullptr;
  int capacity = 0;
  int used = 0;
  char *end = nullptr;
  ~List() { std::free(buffer); }
  bool Add(const char *path, ShellListReallocate reallocate = std::realloc) {
    return AppendShellListPath(buffer, capacity, used, end, path, reallocate);
  }
  std::string Bytes() const { return std::string(buffer, static_cast<size_t>(capacity)); }
};

void *FailAlways(void *, size_t) { return nullptr; }

TEST(FileListShellBuffer, FailedAllocationLeavesTheListAsItWas) {
  List list;
  EXPECT_FALSE(list.Add("C:\\a.dwg", FailAlways));
  EXPECT_EQ(list.buffer, nullptr);
  EXPECT_EQ(list.capacity, 0);
  EXPECT_EQ(list.used, 0);

  ASSERT_TRUE(list.Add("C:\\a.dwg"));
  EXPECT_FALSE(list.Add("C:\\longer\\b.dwg", FailAlways));
  EXPECT_EQ(list.capacity, 10);
  EXPECT_EQ(list.used, 9);
  EXPECT_EQ(list.Bytes(), std::string("C:\\a.dwg\0\0", 10));

  ASSERT_TRUE(list.Add("C:\\c.dwg"));
  EXPECT_EQ(list.capacity, 19);
  EXPECT_EQ(list.end, list.buffer + 18);
  EXPECT_EQ(list.Bytes(), std::string("C:\\a.dwg\0C:\\c.dwg\0\0", 19));
}

TEST(FileListShellBuffer, MissingOrEmptyPathAddsNothing) {
  List list;
  EXPECT_FALSE(list.Add(nullptr));
  EXPECT_EQ(list.buffer, nullptr);
  ASSERT_TRUE(list.Add("C:\\a.dwg"));
  // An empty path would end the list before the paths after it.
  EXPECT_FALSE(list.Add(""));
  EXPECT_EQ(list.Bytes(), std::string("C:\\a.dwg\0\0", 10));
}
}  // namespace
