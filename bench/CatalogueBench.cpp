// Costs of the drawing catalogue: scanning a large folder against a bare directory listing,
// sorting a large catalogue by each key, and the memory one record takes, counted in a pass of
// its own.
// Prints one figure a line: name value unit.
#include "BenchClock.h"
#include "catalogue/DwgData.h"
#include "catalogue/FolderScan.h"
#include "catalogue/Ordering.h"

#include <windows.h>

#include <malloc.h>

#include <algorithm>
#include <atomic>
#include <cstdio>
#include <cstdlib>
#include <new>
#include <random>
#include <string>
#include <vector>

// Live heap bytes handed out by operator new while the memory pass counts them: the catalogue's
// array and its names' text both come from it. The sizes are the C heap's for each block (the
// sizes asked for), not its own bookkeeping. Outside that pass nothing is counted, so that no
// timing pays for it.
namespace {
std::atomic<bool> g_counting{false};
std::atomic<long long> g_liveBytes{0};

void *CountedAllocate(std::size_t size) {
  void *block = std::malloc(size ? size : 1);
  if (!block) throw std::bad_alloc();
  if (g_counting) g_liveBytes += static_cast<long long>(_msize(block));
  return block;
}

void CountedFree(void *block) {
  if (block && g_counting) g_liveBytes -= static_cast<long long>(_msize(block));
  std::free(block);
}
}  // namespace

void *operator new(std::size_t size) { return CountedAllocate(size); }
void *operator new[](std::size_t size) { return CountedAllocate(size); }
void operator delete(void *pointer) noexcept { CountedFree(pointer); }
void operator delete[](void *pointer) noexcept { CountedFree(pointer); }
void operator delete(void *pointer, std::size_t) noexcept { CountedFree(pointer); }
void operator delete[](void *pointer, std::size_t) noexcept { CountedFree(pointer); }

namespace {
const char kMixedFolder[] = "Z:\\tmp\\lumvex-bench-100k";        // 100,000 entries, 10% drawings
const char kDrawingFolder[] = "Z:\\tmp\\lumvex-bench-100k-dwg";  // 100,000 drawings
const int kEntries = 100000;
const int kRounds = 3;

std::string DrawingName(int i, std::mt19937 &random) {
  char name[64];
  std::snprintf(name, sizeof name, "plan-%05d-rev %c.dwg", i, 'a' + static_cast<int>(random() % 26));
  return name;
}

bool Exists(const std::string &path) { return GetFileAttributesA(path.c_str()) != INVALID_FILE_ATTRIBUTES; }

// The folders are made natively by CatalogueBenchFolders.cmake: through Wine it takes too long.
bool FolderReady(const char *folder) {
  if (Exists(std::string(folder) + ".complete")) return true;
  std::fprintf(stderr, "%s is missing: build the target catalogue_bench_folders first\n", folder);
  return false;
}

int PlainListing(const char *folder) {
  WIN32_FIND_DATAA entry;
  const HANDLE find = FindFirstFileA((std::string(folder) + "\\*").c_str(), &entry);
  if (find == INVALID_HANDLE_VALUE) return 0;
  int count = 0;
  do ++count;
  while (FindNextFileA(find, &entry));
  FindClose(find);
  return count;
}

void BenchScan() {
  PlainListing(kMixedFolder);
  ScanFolder(kMixedFolder, ".dwg");

  double bestPlain = 1e300, bestScan = 1e300;
  int listed = 0, taken = 0;
  for (int round = 0; round < kRounds; ++round) {
    double start = NowMs();
    listed = PlainListing(kMixedFolder);
    bestPlain = std::min(bestPlain, NowMs() - start);
    start = NowMs();
    ScanFolder(kMixedFolder, ".dwg");
    bestScan = std::min(bestScan, NowMs() - start);
    taken = g_pCatalogue->GetSize();
  }
  std::fprintf(stderr, "listed %d entries, %d drawings taken\n", listed, taken);
  if (listed < kEntries || taken == 0) {
    std::fprintf(stderr, "%s could not be listed in full: no figures\n", kMixedFolder);
    std::exit(1);
  }
  std::printf("scan_100k_ms %.1f ms\n", bestScan);
  std::printf("plain_loop_100k_ms %.1f ms\n", bestPlain);
  std::printf("scan_ratio_100k %.2f x\n", bestScan / bestPlain);
  EmptyCatalogue();
}

// The folder of drawings only: timed as the mixed folder is, after a first scan, best of the
// rounds; then scanned once more with the heap counted, for the bytes a record takes.
void BenchDrawings() {
  ScanFolder(kDrawingFolder, ".dwg");
  double best = 1e300;
  for (int round = 0; round < kRounds; ++round) {
    const double start = NowMs();
    ScanFolder(kDrawingFolder, ".dwg");
    best = std::min(best, NowMs() - start);
  }
  EmptyCatalogue();

  g_counting = true;
  ScanFolder(kDrawingFolder, ".dwg");
  g_counting = false;
  const long long bytes = g_liveBytes;
  const int count = g_pCatalogue->GetSize();
  std::printf("scan_100k_drawings_ms %.1f ms\n", best);
  std::printf("catalogue_bytes_per_record %.1f bytes\n", count ? static_cast<double>(bytes) / count : 0.0);
  std::fprintf(stderr, "%d records, %lld bytes live, sizeof(DwgData) %zu\n", count, bytes, sizeof(DwgData));
  EmptyCatalogue();
}

void BenchSort() {
  std::mt19937 random(42);
  DwgCatalogue shuffled;
  shuffled.SetSize(0, kEntries);
  std::vector<int> numbers(kEntries);
  for (int i = 0; i < kEntries; ++i) numbers[i] = i;
  std::shuffle(numbers.begin(), numbers.end(), random);
  for (int number : numbers) {
    shuffled.Add(
        DwgData(DrawingName(number, random), 1500000000 + static_cast<int64_t>(random() % 300000000), random() % 5000000));
  }

  const struct {
    const char *figure;
    int key;
  } keys[] = {{"sort_name_100k_ms", kSortByName}, {"sort_date_100k_ms", kSortByDate}, {"sort_size_100k_ms", kSortBySize}};
  for (const auto &key : keys) {
    double best = 1e300;
    for (int round = 0; round < kRounds; ++round) {
      DwgCatalogue catalogue = shuffled;
      const double start = NowMs();
      SortRecords(catalogue, key.key);
      best = std::min(best, NowMs() - start);
    }
    std::printf("%s %.1f ms\n", key.figure, best);
  }
}
}  // namespace

int main() {
  if (!FolderReady(kMixedFolder) || !FolderReady(kDrawingFolder)) return 1;
  BenchScan();
  BenchSort();
  BenchDrawings();
  return 0;
}
