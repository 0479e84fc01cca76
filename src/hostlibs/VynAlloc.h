#pragma once

#include <cstddef>
#include <cstdlib>
#include <new>

#include "hostlibs/DexApi.h"

// The host allocator. Objects that cross the library/plug-in boundary allocate through it and release
// through the runtime's free(), so an object made on one side may be deleted on the other.
// Returns null when the memory is not available (never throws); a size of 0 gives a unique block.
DEX_API void* vyn_operator_new(std::size_t size) noexcept;

// Class-level allocation through the host allocator. Put it in the class body; the base list stays as
// it is. The allocation functions are noexcept, so a failed `new` yields null instead of throwing.
// The macro expands to member declarations, which cannot be parenthesised.
// NOLINTBEGIN(bugprone-macro-parentheses)
#define VYN_CLASS_ALLOCATOR                                      \
 public:                                                         \
  static void* operator new(std::size_t size) noexcept {         \
    return ::vyn_operator_new(size);                             \
  }                                                              \
  static void* operator new[](std::size_t size) noexcept {       \
    return ::vyn_operator_new(size);                             \
  }                                                              \
  static void* operator new(std::size_t, void* place) noexcept { \
    return place;                                                \
  }                                                              \
  static void operator delete(void* block) noexcept {            \
    std::free(block);                                            \
  }                                                              \
  static void operator delete[](void* block) noexcept {          \
    std::free(block);                                            \
  }                                                              \
  static void operator delete(void*, void*) noexcept {}
// NOLINTEND(bugprone-macro-parentheses)
