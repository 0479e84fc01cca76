#include "hostlibs/VynAlloc.h"

#include <dlfcn.h>
#include <gtest/gtest.h>

#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <cstdlib>
#include <cstring>
#include <fstream>
#include <mutex>
#include <string>
#include <string_view>
#include <thread>
#include <utility>
#include <vector>

#include "hostlibs/VynString.h"

namespace {

std::uintptr_t addressOf(const void* block) {
  return reinterpret_cast<std::uintptr_t>(block);
}

// The alignment a block of size bytes is owed: the largest power of two dividing size, up to 16.
std::size_t owedAlignment(std::size_t size) {
  return std::min<std::size_t>(alignof(std::max_align_t), size & (~size + 1));
}

// Fills a block with a pattern of its own and checks it back, so that overlapping blocks show.
void fill(void* block, std::size_t size, unsigned char seed) {
  std::memset(block, seed, size);
}
bool holds(const void* block, std::size_t size, unsigned char seed) {
  const auto* bytes = static_cast<const unsigned char*>(block);
  return std::all_of(bytes, bytes + size, [seed](unsigned char byte) { return byte == seed; });
}

struct Block {
  void* address;
  std::size_t size;
};

// Sizes at the edges of the small, medium, large and huge classes of the allocators.
constexpr std::size_t kSizes[] = {0,    1,     7,     8,      9,      15,     16,      17,       24,
                                  40,   48,    56,    64,     65,     127,    128,     129,      216,
                                  255,  256,   257,   1023,   1024,   1025,   4095,    4096,     4097,
                                  8193, 65535, 65537, 131073, 524287, 524289, 2097153, 16777217, 33554433};

TEST(VynAlloc, BlocksOfEverySizeClassAreOwnAlignedAndWritable) {
  std::vector<Block> blocks;
  for (const std::size_t size : kSizes) {
    void* const block = vyn_block_new(size);
    ASSERT_NE(block, nullptr) << size;
    EXPECT_EQ(addressOf(block) % owedAlignment(std::max<std::size_t>(size, 1)), 0U) << size;
    fill(block, size, static_cast<unsigned char>(blocks.size() + 1));
    blocks.push_back({block, size});
  }
  for (std::size_t i = 0; i < blocks.size(); ++i)
    EXPECT_TRUE(holds(blocks[i].address, blocks[i].size, static_cast<unsigned char>(i + 1)))
        << blocks[i].size;
  std::sort(blocks.begin(), blocks.end(),
            [](const Block& a, const Block& b) { return addressOf(a.address) < addressOf(b.address); });
  for (std::size_t i = 1; i < blocks.size(); ++i)
    EXPECT_GE(addressOf(blocks[i].address), addressOf(blocks[i - 1].address) + blocks[i - 1].size);
  for (const Block& block : blocks)
    vyn_block_delete(block.address);
  vyn_block_delete(nullptr);
}

TEST(VynAlloc, AlignedBlocksKeepTheirAlignmentAndImpossibleRequestsAnswerNull) {
  struct Case {
    std::size_t size;
    std::size_t alignment;
    bool served;
  };
  constexpr std::size_t kHalfTheAddressSpace = std::size_t{1} << 63;
  const Case cases[] = {
      {1, 1, true},          {3, 2, true},
      {24, 8, true},         {40, 32, true},
      {64, 64, true},        {100, 128, true},
      {4096, 4096, true},    {70000, 65536, true},
      {10, 2097152, true},   {0, 256, true},
      {64, 0, false},        {64, 3, false},
      {64, 24, false},       {kHalfTheAddressSpace, 16, false},
      {SIZE_MAX, 64, false},
  };
  for (const Case& c : cases) {
    void* const block = vyn_block_new_aligned(c.size, c.alignment);
    EXPECT_EQ(block != nullptr, c.served) << c.size << " by " << c.alignment;
    if (block == nullptr) continue;
    EXPECT_EQ(addressOf(block) % c.alignment, 0U) << c.size << " by " << c.alignment;
    fill(block, c.size, 0x5a);
    vyn_block_delete(block);
  }
  EXPECT_EQ(vyn_block_new(kHalfTheAddressSpace), nullptr);
  EXPECT_EQ(vyn_block_new(SIZE_MAX), nullptr);
}

// Code that pairs its allocations with free() itself gets blocks of the C library's heap, whichever
// allocator serves the model.
TEST(VynAlloc, OperatorNewBlocksGoBackThroughFree) {
  void* const model = vyn_block_new(64);
  for (const std::size_t size : kSizes) {
    void* const block = vyn_operator_new(size);
    ASSERT_NE(block, nullptr) << size;
    EXPECT_EQ(addressOf(block) % owedAlignment(std::max<std::size_t>(size, 1)), 0U) << size;
    fill(block, size, 0x3c);
    std::free(block);
  }
  EXPECT_EQ(vyn_operator_new(SIZE_MAX), nullptr);
  vyn_block_delete(model);
}

// Model-like classes: a polymorphic pair deleted through the base, and an over-aligned one.
int liveObjects = 0;
struct Base {
  VYN_CLASS_ALLOCATOR
  Base() { ++liveObjects; }
  virtual ~Base() { --liveObjects; }
  Base(const Base&) = delete;
  Base& operator=(const Base&) = delete;
  CVynStringT<wchar_t> name{L"a name longer than one character"};
};
struct Derived : Base {
  double values[20] = {};  // NOLINT(modernize-avoid-c-arrays): a larger dynamic type
};
struct alignas(64) CacheLine {
  VYN_CLASS_ALLOCATOR
  std::int64_t counter = 0;
};

TEST(VynAlloc, ClassAllocatorServesObjectsArraysAndOverAlignedTypes) {
  Base* const object = new Derived;
  ASSERT_NE(object, nullptr);
  delete object;

  Base* const objects = new Base[5];
  ASSERT_NE(objects, nullptr);
  EXPECT_EQ(liveObjects, 5);
  delete[] objects;
  EXPECT_EQ(liveObjects, 0);

  auto* const line = new CacheLine;
  auto* const lines = new CacheLine[3];
  ASSERT_NE(line, nullptr);
  ASSERT_NE(lines, nullptr);
  EXPECT_EQ(addressOf(line) % 64, 0U);
  for (int i = 0; i < 3; ++i)
    EXPECT_EQ(addressOf(&lines[i]) % 64, 0U);
  delete line;
  delete[] lines;
}

// Each thread makes blocks and texts and hands them to the next thread, which checks and frees them.
TEST(VynAlloc, ThreadsReleaseWhatOtherThreadsMade) {
  constexpr int kThreads = 8;
  constexpr int kRounds = 2000;
  struct Parcel {
    void* block;
    std::size_t size;
    unsigned char seed;
    CVynStringT<wchar_t>* text;
  };
  std::vector<std::vector<Parcel>> inboxes(kThreads);
  std::vector<std::mutex> guards(kThreads);
  std::vector<int> corrupted(kThreads, 0);

  const auto drain = [&](int thread) {
    std::vector<Parcel> parcels;
    {
      const std::lock_guard<std::mutex> lock(guards[thread]);
      parcels.swap(inboxes[thread]);
    }
    for (const Parcel& parcel : parcels) {
      if (!holds(parcel.block, parcel.size, parcel.seed) ||
          parcel.text->GetLength() != static_cast<int>(parcel.size))
        ++corrupted[thread];
      vyn_block_delete(parcel.block);
      delete parcel.text;
    }
  };
  std::vector<std::thread> threads;
  threads.reserve(kThreads);
  for (int thread = 0; thread < kThreads; ++thread) {
    threads.emplace_back([&, thread] {
      const int next = (thread + 1) % kThreads;
      for (int round = 0; round < kRounds; ++round) {
        const std::size_t size = kSizes[(round + thread) % std::size(kSizes)] % 5000;
        const auto seed = static_cast<unsigned char>(round);
        void* const block = vyn_block_new(size);
        fill(block, size, seed);
        auto* const text = new CVynStringT<wchar_t>(L'x', static_cast<int>(size));
        {
          const std::lock_guard<std::mutex> lock(guards[next]);
          inboxes[next].push_back({block, size, seed, text});
        }
        if (round % 64 == 0) drain(thread);
      }
    });
  }
  for (std::thread& thread : threads)
    thread.join();
  for (int thread = 0; thread < kThreads; ++thread) {
    drain(thread);
    EXPECT_EQ(corrupted[thread], 0) << "thread " << thread;
  }
}

std::size_t residentMegabytes() {
  std::ifstream status("/proc/self/status");
  std::string line;
  while (std::getline(status, line)) {
    if (line.rfind("VmRSS:", 0) == 0) return std::stoul(line.substr(6)) / 1024;
  }
  return 0;
}

// Jobs of a host: a worker thread fills a model and ends, the host's thread frees it. The next
// workers must be served from the freed memory, or a long-running host grows by a model a job.
TEST(VynAlloc, MemoryFreedByTheHostServesTheNextWorkers) {
#if defined(__SANITIZE_ADDRESS__)
  GTEST_SKIP() << "AddressSanitizer holds freed blocks back in its quarantine";
#endif
  constexpr int kJobs = 4;
  static constexpr std::size_t kJobSizes[] = {216, 40, 56, 120};
  constexpr std::size_t kBlocksPerJob = 1200000;
  constexpr std::size_t kJobMegabytes = kBlocksPerJob * (216 + 40 + 56 + 120) / 4 / 1000000;
  std::vector<void*> model;
  model.reserve(kBlocksPerJob);
  std::size_t afterFirstJob = 0;
  for (int job = 0; job < kJobs; ++job) {
    std::thread worker([&model] {
      for (std::size_t i = 0; i < kBlocksPerJob; ++i) {
        const std::size_t size = kJobSizes[i % std::size(kJobSizes)];
        void* const block = vyn_block_new(size);
        if (block != nullptr) fill(block, size, 1);
        model.push_back(block);
      }
    });
    worker.join();
    if (job == 0) afterFirstJob = residentMegabytes();
    for (void* const block : model)
      vyn_block_delete(block);
    model.clear();
  }
  // Allocators keep some freed memory at hand (mimalloc up to a segment of 32 MiB), never a job's.
  EXPECT_LE(residentMegabytes(), afterFirstJob + kJobMegabytes / 2)
      << "one job: " << kJobMegabytes << " MB; after the first job: " << afterFirstJob << " MB";
}

// The library's allocator is its own: malloc and operator new stay the runtimes' for the process,
// and operator new also inside the library's own dependencies, where a program that loads the library
// with dlopen and has no C++ runtime of its own finds it.
TEST(VynAlloc, TheProcessKeepsItsOwnMalloc) {
  EXPECT_TRUE(std::string_view(vyn_block_allocator()) == "mimalloc" ||
              std::string_view(vyn_block_allocator()) == "malloc");
  Dl_info library{};
  ASSERT_NE(dladdr(reinterpret_cast<void*>(&vyn_block_new), &library), 0);
  void* const libraryScope = dlopen(library.dli_fname, RTLD_NOW | RTLD_NOLOAD);
  ASSERT_NE(libraryScope, nullptr);
  const std::pair<void*, std::vector<const char*>> lookups[] = {
      {RTLD_DEFAULT, {"malloc", "free", "_Znwm", "_ZdlPv"}}, {libraryScope, {"_Znwm", "_ZdlPv", "_Znam"}}};
  for (const auto& [scope, symbols] : lookups) {
    for (const char* symbol : symbols) {
      Dl_info info{};
      ASSERT_NE(dladdr(dlsym(scope, symbol), &info), 0) << symbol;
      EXPECT_EQ(std::string_view(info.dli_fname).find("mimalloc"), std::string_view::npos) << symbol;
    }
  }
  dlclose(libraryScope);
}

}  // namespace
