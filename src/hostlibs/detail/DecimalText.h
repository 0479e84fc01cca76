#pragma once

#include <string>
#include <string_view>

// Decimal texts of doubles, exact and locale-independent (std::to_chars/from_chars). Shared by the
// number formats and the packed angle and length conversions, which read a double by the digits a
// person typed rather than by its binary value.
namespace vyn_formats::detail {

// The shortest text in fixed notation (no exponent) that reads back as the same finite double:
// 12.3 gives "12.3", 1e-5 gives "0.00001", -2 gives "-2".
std::string shortestFixed(double value);

// The shortest round-trip significant digits of a finite, nonzero value, without sign:
// |value| = d0.d1d2... x 10^exponent. 2.675 gives {"2675", 0}, 0.0125 gives {"125", -2}.
struct DecimalDigits {
  std::string digits;
  int exponent = 0;
};
DecimalDigits shortestDigits(double value);

// Reads the whole text as a decimal number (optional "-" or "+", digits with an optional point, an
// optional exponent) giving the nearest double. False for anything else, for the texts of NaN and
// infinity, and for a value out of range; value is then unchanged.
bool parseDecimal(std::string_view text, double& value);

// The wide form of an ASCII text.
std::wstring widenAscii(std::string_view text);

}  // namespace vyn_formats::detail
