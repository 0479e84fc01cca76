#pragma once

#include <array>
#include <concepts>
#include <cstddef>
#include <cstdint>
#include <type_traits>

namespace vyn::ie {

// A kind argument: the class's enumeration or a plain number (plug-ins often pass numbers).
template <class K>
concept DexKindArgument = std::is_enum_v<K> || std::integral<K>;

// A fixed array of N values indexed by a class's kind enumeration: the storage behind the many
// "typed value records" of the data model (road elements, raw observations, reports, imaging). A
// class holds one as a member and forwards its accessors in one line each:
//
//   double getData(ELSDataType kind) const { return data_.get(kind); }
//   void setData(ELSDataType kind, double value) { data_.set(kind, value); }
//
// A kind outside 0 to N-1 (negative values cast from a number included) is ignored by set() and
// reads as the neutral value T{} (0.0 for doubles, false for marks). The record owns no heap memory
// and copies by value. Classes whose range rule differs (a sentinel answer, an error-log record) test
// contains() first and answer for themselves.
template <class Kind, std::size_t N, class T = double>
class DexTypedArray {
 public:
  using kind_type = Kind;
  using value_type = T;

  // Every element value-initialised (0.0 for doubles).
  constexpr DexTypedArray() = default;
  // Every element set to initial (a class whose values start as the no-value marker or NaN).
  constexpr explicit DexTypedArray(const T& initial) { values_.fill(initial); }

  static constexpr int size() noexcept { return static_cast<int>(N); }
  // True when kind indexes an element of the array.
  template <DexKindArgument K = Kind>
  static constexpr bool contains(K kind) noexcept {
    const auto index = static_cast<std::int64_t>(kind);
    return index >= 0 && index < static_cast<std::int64_t>(N);
  }

  // The value of kind; the neutral value T{} for a kind outside the array.
  template <DexKindArgument K = Kind>
  const T& get(K kind) const noexcept {
    return contains(kind) ? values_[indexOf(kind)] : neutral();
  }
  // Stores value under kind and returns true; a kind outside the array changes nothing (false).
  template <DexKindArgument K = Kind>
  constexpr bool set(K kind, const T& value) {
    if (!contains(kind)) return false;
    values_[indexOf(kind)] = value;
    return true;
  }
  constexpr void fill(const T& value) { values_.fill(value); }

  // The elements in kind order, for callers that hand the whole record to a routine.
  constexpr const T* data() const noexcept { return values_.data(); }
  constexpr T* data() noexcept { return values_.data(); }

  friend constexpr bool operator==(const DexTypedArray&, const DexTypedArray&) = default;

 private:
  template <DexKindArgument K>
  static constexpr std::size_t indexOf(K kind) noexcept {
    return static_cast<std::size_t>(kind);
  }
  static const T& neutral() noexcept {
    static const T value{};
    return value;
  }

  std::array<T, N> values_{};
};

// The usual record: N doubles indexed by Kind, 0.0 outside.
template <class Kind, std::size_t N>
using DexTypedValues = DexTypedArray<Kind, N, double>;

// The position variant: N positions indexed by Kind (a DexPosition2D or DexPosition3D record); a kind
// outside the array reads as a default-constructed position, that is the origin.
template <class Kind, std::size_t N, class Position>
using DexTypedPositions = DexTypedArray<Kind, N, Position>;

}  // namespace vyn::ie
