#pragma once

#include <cstddef>
#include <cstdint>
#include <cstring>
#include <optional>

namespace dex_test {

// The entry of a virtual member function in its class's primary virtual table, counted in pointers,
// or nothing where the representation is not known. Under the Itanium C++ ABI of x86-64 a pointer to
// a virtual member function holds 1 plus the byte offset of the entry. A destructor takes two entries
// (complete and deleting), so the first function declared after it sits at entry 2.
//
//   EXPECT_EQ(dex_test::vtableEntryOf(&DexPosition3D::shiftValues), 2);
template <class MemberFunction>
std::optional<std::ptrdiff_t> vtableEntryOf(MemberFunction function) {
#if defined(__x86_64__)
  struct Representation {
    std::uintptr_t pointerOrOffset;
    std::ptrdiff_t thisAdjustment;
  };
  static_assert(sizeof(MemberFunction) == sizeof(Representation));
  Representation representation{};
  std::memcpy(&representation, &function, sizeof representation);
  if ((representation.pointerOrOffset & 1u) == 0) return std::nullopt;  // not virtual
  return static_cast<std::ptrdiff_t>((representation.pointerOrOffset - 1) / sizeof(void*));
#else
  (void)function;
  return std::nullopt;
#endif
}

}  // namespace dex_test
