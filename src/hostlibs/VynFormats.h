#pragma once

#include <cstdio>
#include <string>

#include "hostlibs/DexApi.h"
#include "hostlibs/VynString.h"

// Number texts of the host utility library. Every function here writes and reads "." as the decimal
// separator whatever the process locale is, and none throws.
namespace vyn_formats {

// ---- Writing numbers ----------------------------------------------------------------------------

// The shortest text that reads back as the same double, in fixed or scientific notation, whichever is
// shorter (std::to_chars): 0.1 is "0.1", 100 is "100", 1e21 is "1e+21", 1e-7 is "1e-07". Negative zero
// is written "0", NaN "nan", the infinities "inf" and "-inf".
DEX_API CVynStringT<wchar_t> DoubleToString(double value);

// Fixed notation with exactly `decimals` decimals, rounded from the binary value as printf's "%.*f"
// rounds it: 0.125 with 2 decimals is "0.12" (that double is an exact tie, rounded to even) and 2.675
// is "2.67" (that double lies just below 2.675). A result that shows only zeros carries no minus sign:
// -0.0001 with 3 decimals is "0.000", not "-0.000". decimals is taken into 0..100. Every finite double
// is written in full: the largest, the no-value marker, has 309 digits before the point. NaN gives
// "nan", the infinities "inf" and "-inf".
DEX_API CVynStringT<wchar_t> DoubleToString(double value, int decimals);
// Appends what DoubleToString(value, decimals) answers to out, without a string of its own: for
// writers of many numbers.
DEX_API void AppendDoubleToString(std::wstring& out, double value, int decimals);

DEX_API CVynStringT<wchar_t> IntToString(int value);
DEX_API CVynStringT<wchar_t> UIntToString(unsigned value);

// Writes the text to the file in UTF-8 (no byte-order mark, nothing added). False for a null file or
// when the file takes fewer bytes than given; a null text writes nothing and answers true.
DEX_API bool WriteString(FILE* file, const wchar_t* text);

// ---- Reading angles -----------------------------------------------------------------------------

// Reads an angle text into decimal degrees. Accepted, with blanks around:
// - a decimal number of degrees: "12.5", "-0.25", ".5", "1e-07" (all that DoubleToString writes);
// - degrees, minutes and seconds with marks: 12°30'15.5", 12°30'15.5 (the closing mark is optional),
//   12°30', 12°; blanks may follow each mark; the minute mark is ' or U+2032, the second mark " or
//   U+2033 or two apostrophes;
// - blank-separated fields 12 30 15.5 or 12 30.5, colon-separated 12:30:15.5 or 12:30.5.
// In the field forms every field but the last is a whole number, only the last may have decimals, and
// minutes and seconds are below 60. A leading "+" or "-", or a hemisphere letter at the start or the
// end, N or E (positive), S or W (negative), in either case, signs the whole angle: "-0 30" is -0.5,
// 75°15'00"W is -75.25. A sign together with a letter is rejected as ambiguous.
// Answers false, leaving degrees unchanged, for a null or empty text and anything else.
DEX_API bool StringToDegree(const wchar_t* text, double& degrees);

}  // namespace vyn_formats

namespace vyn::math {

// value rounded half away from zero at decimal digit `decimals` (0 is the units digit, negative values
// round to tens, hundreds, ...), judged by the shortest decimal text of value, the digits a person
// typed: round_prec(2.675, 2) is 2.68 and round_prec(-1.005, 2) is -1.01 although those doubles lie
// just inside the tie. The result is the double nearest to the rounded decimal; a result of zero is
// +0. Values that have no such digit to round (too large, or already short enough), NaN and the
// infinities are returned unchanged. decimals is taken into -400..400.
DEX_API double round_prec(double value, int decimals);

}  // namespace vyn::math
