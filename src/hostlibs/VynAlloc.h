#pragma once

#include <cstddef>
#include <new>

#include "hostlibs/DexApi.h"

// The host allocator: the blocks of the objects that cross the library/plug-in boundary
// (VYN_CLASS_ALLOCATOR) and of the strings. A block made by vyn_block_new on one side goes back
// through vyn_block_delete on the other, never through free(), and any thread may release a block
// that another thread made.
//
// The blocks come from mimalloc, through its own calls (the process's malloc stays the C library's),
// on memory advised as transparent huge pages: an import makes millions of small blocks, and faulting
// in fresh 4 KiB pages would be most of its time. Each thread allocates from a heap of its own; a
// block another thread releases returns to its heap, and the heap of a thread that has ended is taken
// over by the next thread that needs memory, so a freed dataset's memory serves the next import.
// DEXCHANGE_ALLOCATOR=malloc in the environment (read once, at the first allocation) serves every
// block from the C library's malloc instead; a build configured with -DDEXCHANGE_ALLOCATOR=malloc
// (the sanitizer builds, so that they see every block) always does.

// Blocks of the C library's heap, released with free(): for code that pairs its allocations with
// free() itself. The classes and strings of the library do not use it.
DEX_API void* vyn_operator_new(std::size_t size) noexcept;

// A block of at least size bytes, aligned for any object of that size: to the largest power of two
// that divides size, up to alignof(std::max_align_t). Null when the memory is not available (never
// throws); a size of 0 gives a unique block.
DEX_API void* vyn_block_new(std::size_t size) noexcept;
// A block of at least size bytes aligned to alignment, which must be a power of two; null otherwise
// or when the memory is not available.
DEX_API void* vyn_block_new_aligned(std::size_t size, std::size_t alignment) noexcept;
// Releases a block of either block allocation function; null is ignored.
DEX_API void vyn_block_delete(void* block) noexcept;
// The allocator serving the blocks in this process: "mimalloc" or "malloc".
DEX_API const char* vyn_block_allocator() noexcept;

// Class-level allocation through the host allocator. Put it in the class body; the base list stays as
// it is. The allocation functions are noexcept, so a failed `new` yields null instead of throwing.
// Over-aligned classes get their alignment through the align_val_t forms.
// The macro expands to member declarations, which cannot be parenthesised.
// NOLINTBEGIN(bugprone-macro-parentheses)
#define VYN_CLASS_ALLOCATOR                                                            \
 public:                                                                               \
  static void* operator new(std::size_t size) noexcept {                               \
    return ::vyn_block_new(size);                                                      \
  }                                                                                    \
  static void* operator new[](std::size_t size) noexcept {                             \
    return ::vyn_block_new(size);                                                      \
  }                                                                                    \
  static void* operator new(std::size_t size, std::align_val_t alignment) noexcept {   \
    return ::vyn_block_new_aligned(size, static_cast<std::size_t>(alignment));         \
  }                                                                                    \
  static void* operator new[](std::size_t size, std::align_val_t alignment) noexcept { \
    return ::vyn_block_new_aligned(size, static_cast<std::size_t>(alignment));         \
  }                                                                                    \
  static void* operator new(std::size_t, void* place) noexcept {                       \
    return place;                                                                      \
  }                                                                                    \
  static void operator delete(void* block) noexcept {                                  \
    ::vyn_block_delete(block);                                                         \
  }                                                                                    \
  static void operator delete[](void* block) noexcept {                                \
    ::vyn_block_delete(block);                                                         \
  }                                                                                    \
  static void operator delete(void* block, std::align_val_t) noexcept {                \
    ::vyn_block_delete(block);                                                         \
  }                                                                                    \
  static void operator delete[](void* block, std::align_val_t) noexcept {              \
    ::vyn_block_delete(block);                                                         \
  }                                                                                    \
  static void operator delete(void*, void*) noexcept {}
// NOLINTEND(bugprone-macro-parentheses)
