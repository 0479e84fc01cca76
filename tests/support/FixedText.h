#pragma once

#include <charconv>
#include <string>

namespace dex_test {

// value with the given decimals, always with a decimal point: the suite also runs under a comma
// locale, which printf-family calls would follow.
inline std::string fixedText(double value, int decimals) {
  char text[400];
  const auto end = std::to_chars(text, text + sizeof text, value, std::chars_format::fixed, decimals).ptr;
  return std::string(text, end);
}

}  // namespace dex_test
