#pragma once

#include <span>
#include <string_view>

#include "hostlibs/VynString.h"

// A fixed list of value-word pairs, searched in order in both directions.
namespace vyn::ie::detail {

template <class E>
struct WordEntry {
  E value;
  std::wstring_view word;
};

// Sets value to the first entry's value whose word equals word exactly; false when none does.
template <class E>
bool valueOfWord(std::span<const WordEntry<E>> table, const CVynStringT<wchar_t>& word, E& value) {
  for (const WordEntry<E>& entry : table) {
    if (entry.word == word.view()) {
      value = entry.value;
      return true;
    }
  }
  return false;
}

// The word of the first entry with the value; empty when none has it.
template <class E>
CVynStringT<wchar_t> wordOfValue(std::span<const WordEntry<E>> table, E value) {
  for (const WordEntry<E>& entry : table) {
    if (entry.value == value) return CVynStringT<wchar_t>(entry.word);
  }
  return CVynStringT<wchar_t>();
}

}  // namespace vyn::ie::detail
