#include "hostlibs/VynAlloc.h"

#include <cstddef>
#include <cstdint>
#include <cstdlib>
#include <string_view>

#ifdef DEXCHANGE_WITH_MIMALLOC
#include <mimalloc.h>
#endif

namespace {

// No allocator can serve more than half the address space; refusing here keeps the answer the same
// (null) whichever allocator serves, and keeps the sanitizers' allocators from aborting on it.
constexpr std::size_t kLargestBlock = PTRDIFF_MAX;

bool isPowerOfTwo(std::size_t value) noexcept {
  return value != 0 && (value & (value - 1)) == 0;
}

#ifdef DEXCHANGE_WITH_MIMALLOC

constexpr const char* kChoiceVariable = "DEXCHANGE_ALLOCATOR";

// mimalloc reads its options from the environment at start; a host's MIMALLOC_... settings win.
void setUnlessGiven(mi_option_t option, const char* variable, long value) noexcept {
  if (std::getenv(variable) == nullptr) mi_option_set(option, value);
}

void tuneMimalloc() noexcept {
  // Memory advised as transparent huge pages: one fault per 2 MiB instead of one per 4 KiB.
  setUnlessGiven(mi_option_large_os_pages, "MIMALLOC_LARGE_OS_PAGES", 1);
  // The memory of an ended worker that another thread freed is found again by the next thread that
  // needs memory; looking through all of it, not the first few segments, keeps a host that imports
  // job after job from growing by part of a model per job.
  setUnlessGiven(mi_option_max_segment_reclaim, "MIMALLOC_MAX_SEGMENT_RECLAIM", 1024);
}

bool chooseMimalloc() noexcept {
  const char* const choice = std::getenv(kChoiceVariable);
  if (choice != nullptr && std::string_view(choice) == "malloc") return false;
  tuneMimalloc();
  return true;
}

// Decided once, before the first block: a block must go back to the allocator that made it.
bool usesMimalloc() noexcept {
  static const bool chosen = chooseMimalloc();
  return chosen;
}

#else

constexpr bool usesMimalloc() noexcept {
  return false;
}

#endif

void* plainAligned(std::size_t size, std::size_t alignment) noexcept {
  void* block = nullptr;
  const std::size_t atLeastPointer = alignment < sizeof(void*) ? sizeof(void*) : alignment;
  return posix_memalign(&block, atLeastPointer, size) == 0 ? block : nullptr;
}

}  // namespace

void* vyn_operator_new(std::size_t size) noexcept {
  if (size > kLargestBlock) return nullptr;
  return std::malloc(size == 0 ? 1 : size);
}

void* vyn_block_new(std::size_t size) noexcept {
  if (size > kLargestBlock) return nullptr;
  if (size == 0) size = 1;
#ifdef DEXCHANGE_WITH_MIMALLOC
  if (usesMimalloc()) return mi_malloc(size);
#endif
  return std::malloc(size);
}

void* vyn_block_new_aligned(std::size_t size, std::size_t alignment) noexcept {
  if (size > kLargestBlock || !isPowerOfTwo(alignment)) return nullptr;
  if (size == 0) size = 1;
#ifdef DEXCHANGE_WITH_MIMALLOC
  if (usesMimalloc()) return mi_malloc_aligned(size, alignment);
#endif
  return plainAligned(size, alignment);
}

void vyn_block_delete(void* block) noexcept {
#ifdef DEXCHANGE_WITH_MIMALLOC
  if (usesMimalloc()) {
    mi_free(block);
    return;
  }
#endif
  std::free(block);
}

const char* vyn_block_allocator() noexcept {
  return usesMimalloc() ? "mimalloc" : "malloc";
}
