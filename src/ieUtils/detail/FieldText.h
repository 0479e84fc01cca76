#pragma once

#include <string_view>
#include <utility>

#include "hostlibs/VynString.h"
#include "ieUtils/IEUtilsStringArray.h"

// Cleaning of the values cut out of a line of an exchange file, shared by the parsers and the field
// lists so that every reader trims a value the same way.
namespace vyn::ie::utils::detail {

inline constexpr wchar_t kBlank = L' ';
inline constexpr wchar_t kDoubleQuote = L'"';
// What is trimmed from both ends of a value: blanks, tabs and line ends.
inline constexpr std::wstring_view kValueTrimCharacters = L" \t\r\n";
inline constexpr std::wstring_view kLineEnds = L"\r\n";

constexpr bool isLineEnd(wchar_t ch) noexcept {
  return ch == L'\r' || ch == L'\n';
}

// value without blanks, tabs and line ends at either end.
constexpr std::wstring_view trimValue(std::wstring_view value) noexcept {
  const std::size_t first = value.find_first_not_of(kValueTrimCharacters);
  if (first == std::wstring_view::npos) return {};
  const std::size_t last = value.find_last_not_of(kValueTrimCharacters);
  return value.substr(first, last - first + 1);
}

// value trimmed at both ends and without any CR or LF left inside it.
inline CVynStringT<wchar_t> cleanValue(std::wstring_view value) {
  CVynStringT<wchar_t> cleaned(trimValue(value));
  if (cleaned.view().find_first_of(kLineEnds) != std::wstring_view::npos) {
    cleaned.Remove(L'\r');
    cleaned.Remove(L'\n');
  }
  return cleaned;
}

// Appends value to values, moving its characters instead of copying them (the array's Add copies).
inline void appendValue(StringArray& values, CVynStringT<wchar_t>&& value) {
  const int index = values.Add(CVynStringT<wchar_t>());
  values[index] = std::move(value);
}

}  // namespace vyn::ie::utils::detail
