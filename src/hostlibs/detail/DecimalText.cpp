#include "hostlibs/detail/DecimalText.h"

#include <array>
#include <charconv>
#include <cstdlib>
#include <system_error>

namespace vyn_formats::detail {

namespace {

// Room for the fixed form of the largest double (309 digits) with sign and point.
constexpr std::size_t kFixedCapacity = 330;

bool isDecimalCharacter(char ch) {
  return (ch >= '0' && ch <= '9') || ch == '.' || ch == 'e' || ch == 'E' || ch == '+' || ch == '-';
}

}  // namespace

std::string shortestFixed(double value) {
  std::array<char, kFixedCapacity> buffer{};
  const auto result =
      std::to_chars(buffer.data(), buffer.data() + buffer.size(), value, std::chars_format::fixed);
  if (result.ec != std::errc()) return {};
  return std::string(buffer.data(), result.ptr);
}

DecimalDigits shortestDigits(double value) {
  std::array<char, 40> buffer{};
  const auto result = std::to_chars(buffer.data(), buffer.data() + buffer.size(), std::abs(value),
                                    std::chars_format::scientific);
  DecimalDigits decimal;
  if (result.ec != std::errc()) return decimal;
  const std::string_view text(buffer.data(), static_cast<std::size_t>(result.ptr - buffer.data()));
  const std::size_t exponentAt = text.find('e');
  for (const char ch : text.substr(0, exponentAt)) {
    if (ch != '.') decimal.digits += ch;
  }
  if (exponentAt != std::string_view::npos) {
    std::string_view exponent = text.substr(exponentAt + 1);
    if (!exponent.empty() && exponent.front() == '+') exponent.remove_prefix(1);
    std::from_chars(exponent.data(), exponent.data() + exponent.size(), decimal.exponent);
  }
  return decimal;
}

bool parseDecimal(std::string_view text, double& value) {
  if (text.empty()) return false;
  for (const char ch : text) {
    if (!isDecimalCharacter(ch)) return false;
  }
  // from_chars takes no plus sign.
  if (text.front() == '+') {
    text.remove_prefix(1);
    if (text.empty() || text.front() == '-') return false;
  }
  double parsed = 0.0;
  const auto result = std::from_chars(text.data(), text.data() + text.size(), parsed);
  if (result.ec != std::errc() || result.ptr != text.data() + text.size()) return false;
  value = parsed;
  return true;
}

std::wstring widenAscii(std::string_view text) {
  return std::wstring(text.begin(), text.end());
}

}  // namespace vyn_formats::detail
