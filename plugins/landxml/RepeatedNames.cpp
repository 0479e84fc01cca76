#include "RepeatedNames.h"

#include <algorithm>
#include <utility>

namespace vyn::ie::landxml {

void sortByUpperHalf(std::vector<std::uint64_t>& keys) {
  constexpr int kDigitBits = 16;
  constexpr std::size_t kDigits = std::size_t{1} << kDigitBits;
  std::vector<std::uint64_t> sorted(keys.size());
  std::vector<std::size_t> starts(kDigits);
  for (const int shift : {32, 48}) {
    const auto digitOf = [shift](std::uint64_t key) { return (key >> shift) & (kDigits - 1); };
    std::fill(starts.begin(), starts.end(), 0);
    for (const std::uint64_t key : keys)
      ++starts[digitOf(key)];
    std::size_t start = 0;
    for (std::size_t& digitStart : starts)
      start += std::exchange(digitStart, start);
    for (const std::uint64_t key : keys)
      sorted[starts[digitOf(key)]++] = key;
    keys.swap(sorted);
  }
}

}  // namespace vyn::ie::landxml
