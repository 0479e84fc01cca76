#pragma once

#include <cstdint>
#include <functional>
#include <string_view>
#include <unordered_set>
#include <vector>

namespace vyn::ie::landxml {

// Sorts keys by their upper 32 bits; keys of equal upper halves keep their order (a stable radix
// sort of two 16-bit passes).
void sortByUpperHalf(std::vector<std::uint64_t>& keys);

// Marks each position of 0..count-1 whose name an earlier position had; empty names never repeat.
// nameAt(i) gives the name of position i. One sequential hashing pass and a radix sort of
// (hash, position) keys: names are compared only where their hashes agree, so a million names cost
// no random probe each, as a hash table of them would.
template <class NameAt>
std::vector<bool> markRepeatedNames(std::uint32_t count, const NameAt& nameAt) {
  constexpr std::uint64_t kHashBits = 0xFFFFFFFF00000000ULL;
  std::vector<std::uint64_t> keys;
  keys.reserve(count);
  for (std::uint32_t at = 0; at < count; ++at) {
    const std::wstring_view name = nameAt(at);
    if (!name.empty()) keys.push_back((std::hash<std::wstring_view>{}(name)&kHashBits) | at);
  }
  sortByUpperHalf(keys);
  std::vector<bool> repeated(count, false);
  std::unordered_set<std::wstring_view> seen;
  for (std::size_t begin = 0, end = 0; begin < keys.size(); begin = end) {
    for (end = begin + 1; end < keys.size() && (keys[end] & kHashBits) == (keys[begin] & kHashBits);)
      ++end;
    if (end - begin == 1) continue;
    seen.clear();
    for (std::size_t key = begin; key < end; ++key) {
      const auto at = static_cast<std::uint32_t>(keys[key]);
      if (!seen.insert(nameAt(at)).second) repeated[at] = true;
    }
  }
  return repeated;
}

}  // namespace vyn::ie::landxml
