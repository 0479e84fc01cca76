#include "hostlibs/VynAlloc.h"

void* vyn_operator_new(std::size_t size) noexcept {
  return std::malloc(size == 0 ? 1 : size);
}
