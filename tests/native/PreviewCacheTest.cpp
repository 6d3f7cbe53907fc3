// The cache of decoded previews: a changed drawing is decoded again, and the cache stays within
// its count and byte budgets by dropping the least recently painted.
#include "preview/PreviewCache.h"

#include <gtest/gtest.h>

#include <memory>

using devhost::preview::PreviewCache;
using devhost::preview::PreviewKey;

namespace {

struct FakeImage {
  size_t bytes;
  size_t cost() const { return bytes; }
};

PreviewKey key(const wchar_t *path, uint64_t size = 100, uint64_t lastWrite = 7) { return PreviewKey{path, size, lastWrite}; }

std::shared_ptr<const FakeImage> image(size_t bytes = 10) { return std::make_shared<FakeImage>(FakeImage{bytes}); }

}  // namespace

TEST(PreviewCache, ChangedFileIsAMiss) {
  PreviewCache<FakeImage> cache(8, 1000);
  const auto kept = image();
  cache.store(key(L"a"), kept);
  EXPECT_EQ(cache.find(key(L"a")), kept);
  EXPECT_EQ(cache.find(key(L"a", 101)), nullptr) << "size changed";
  EXPECT_EQ(cache.find(key(L"a")), nullptr) << "the stale entry is gone, not kept beside";
  cache.store(key(L"a"), kept);
  EXPECT_EQ(cache.find(key(L"a", 100, 8)), nullptr) << "last-write time changed";
  EXPECT_EQ(cache.entryCount(), 0u);
  EXPECT_EQ(cache.bytesHeld(), 0u);
}

TEST(PreviewCache, LeastRecentlyUsedGoesFirst) {
  PreviewCache<FakeImage> cache(3, 1000);
  cache.store(key(L"a"), image());
  cache.store(key(L"b"), image());
  cache.store(key(L"c"), image());
  ASSERT_NE(cache.find(key(L"a")), nullptr);
  cache.store(key(L"d"), image());
  EXPECT_EQ(cache.entryCount(), 3u);
  EXPECT_EQ(cache.find(key(L"b")), nullptr);
  EXPECT_NE(cache.find(key(L"a")), nullptr);
  EXPECT_NE(cache.find(key(L"c")), nullptr);
  EXPECT_NE(cache.find(key(L"d")), nullptr);
}

TEST(PreviewCache, ByteBudgetEvictsAndRefusesTheOversized) {
  // Each entry also pays for its path: one wide character here.
  const size_t pathBytes = sizeof(wchar_t);
  PreviewCache<FakeImage> cache(100, 100);
  cache.store(key(L"a"), image(40));
  cache.store(key(L"b"), image(40));
  EXPECT_EQ(cache.bytesHeld(), 80 + 2 * pathBytes);
  cache.store(key(L"c"), image(40));
  EXPECT_EQ(cache.find(key(L"a")), nullptr);
  EXPECT_EQ(cache.entryCount(), 2u);

  cache.store(key(L"d"), image(200));
  EXPECT_EQ(cache.find(key(L"d")), nullptr) << "larger than the whole budget";
  EXPECT_EQ(cache.entryCount(), 2u) << "and nothing was evicted for it";

  cache.store(key(L"b"), image(10));
  EXPECT_EQ(cache.bytesHeld(), 50 + 2 * pathBytes) << "storing a path again replaces its entry";
  cache.clear();
  EXPECT_EQ(cache.entryCount(), 0u);
  EXPECT_EQ(cache.bytesHeld(), 0u);
}
