#pragma once

#include <bit>
#include <cstdint>
#include <initializer_list>

namespace vyn::ie {

// A set of values of the enumeration E held as one unsigned 64-bit mask: value v is bit v. Used for the
// configurations, using modes, data kinds, units and parameters of the format descriptors and for the
// data kinds of the settings. Passed by value.
//
// Only values 0 to 63 can be members. Any other value (a negative number cast to E, or 64 and above)
// is never a member: adding it changes nothing and has() answers false for it.
template <class E>
struct DexFlags {
 public:
  using value_type = E;
  static constexpr int kCapacity = 64;

  // The empty set.
  constexpr DexFlags() noexcept = default;
  // The set of the one value v; implicit, so that a single value can be passed where a set is asked.
  constexpr DexFlags(E value) noexcept : mask_(bitOf(value)) {}  // NOLINT(google-explicit-constructor)
  constexpr DexFlags(std::initializer_list<E> values) noexcept {
    for (const E value : values)
      mask_ |= bitOf(value);
  }
  // The set whose mask is given (bit v stands for value v).
  static constexpr DexFlags fromMask(std::uint64_t mask) noexcept {
    DexFlags flags;
    flags.mask_ = mask;
    return flags;
  }

  // Membership and size.
  constexpr bool has(E value) const noexcept { return (mask_ & bitOf(value)) != 0; }
  constexpr int count() const noexcept { return std::popcount(mask_); }
  constexpr bool isEmpty() const noexcept { return mask_ == 0; }
  constexpr std::uint64_t getMask() const noexcept { return mask_; }

  // Editing.
  constexpr DexFlags& add(E value) noexcept {
    mask_ |= bitOf(value);
    return *this;
  }
  constexpr DexFlags& remove(E value) noexcept {
    mask_ &= ~bitOf(value);
    return *this;
  }
  constexpr void clear() noexcept { mask_ = 0; }

  // Joining sets.
  constexpr DexFlags& operator|=(DexFlags other) noexcept {
    mask_ |= other.mask_;
    return *this;
  }
  friend constexpr DexFlags operator|(DexFlags a, DexFlags b) noexcept { return a |= b; }
  friend constexpr bool operator==(DexFlags a, DexFlags b) noexcept { return a.mask_ == b.mask_; }

 private:
  static constexpr std::uint64_t bitOf(E value) noexcept {
    const auto number = static_cast<long long>(value);
    return number >= 0 && number < kCapacity ? std::uint64_t{1} << number : 0;
  }

  std::uint64_t mask_ = 0;
};

}  // namespace vyn::ie
