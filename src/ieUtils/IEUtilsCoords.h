#pragma once

#include <cstdint>

#include "hostlibs/DexApi.h"
#include "hostlibs/VynString.h"
#include "ieUtils/IEUtilsUnits.h"

// Text forms of a latitude or longitude held in decimal degrees.

namespace vyn::ie {

// The text form of a geographic coordinate. The default precision is the one a precision of -1
// selects; the example is 12.5 degrees written with it.
enum ECoordsStyle : std::int32_t {
  DECIMAL_DEGREES = 0,      // 12.500000000000 (12 decimals)
  PACKED_DMS = 1,           // DDD.MMSSsss: 12.300000000000 (12 decimals of the packed value)
  DMS_DIGITS = 2,           // DDDMMSS.sss: 123000.00000 (9 decimals of the packed value)
  DMS_BLANK_SEPARATED = 3,  // DDD MM SS.sss: 12 30 00.00000 (9)
  DMS_WHOLE_SECONDS = 4,    // DDDMMSS: 123000 (always whole seconds; the precision is ignored)
  PLAIN_NUMBER = 5,         // 12.500 (3 decimals); magnitudes below 0.0001 are written as 0
  DMS_WITH_MARKS = 6,       // D°MM'SS.sss" with an optional hemisphere letter: 12°30'00.00000"N (9)
};

// The sign of DMS_WITH_MARKS.
enum ECoordsSign : std::int32_t {
  SIGNED_NUMBER = 0,     // a minus sign for negative values, no letter
  LATITUDE_LETTER = 1,   // N for 0 and above, S below 0; the number is unsigned
  LONGITUDE_LETTER = 2,  // E for 0 and above, W below 0; the number is unsigned
};

}  // namespace vyn::ie

namespace vyn::ie::utils {

// Writes decDeg in style. precision counts the decimals of the number the style is built from: of the
// degrees in DECIMAL_DEGREES and PLAIN_NUMBER, of the packed DDD.MMSSsss value in the others (4 is
// whole seconds, 9 is seconds to 5 decimals); -1 selects the style's default. Any other negative
// precision writes that number in its shortest form.
// Degrees are never padded (5.5 degrees in DMS_DIGITS is "53000.00000"); rounding carries
// (10.99999999 with 4 decimals is 11°00'00"). Negative values keep their minus sign in front, except
// in DMS_WITH_MARKS with a letter sign, which writes the magnitude and the letter (any sign value
// other than 0 writes the magnitude; only 1 and 2 add a letter).
// Returns an empty string for a style outside 0..6, and for DMS_DIGITS, DMS_BLANK_SEPARATED and
// DMS_WITH_MARKS when the packed value does not give two digits of minutes and two of seconds: a
// precision below 4 (other than -1), NaN or an infinity. Precision 4 in those styles leaves a point
// after the whole seconds ("123000.").
DEX_API CVynStringT<wchar_t> coordsByStyleToString(ECoordsStyle style, double decDeg, int precision,
                                                   ECoordsSign sign);

// Reads what coordsByStyleToString writes, back to decimal degrees; ok tells whether it could.
// - DECIMAL_DEGREES, PLAIN_NUMBER: the number as stringToDouble reads it, so an empty or blank text
//   gives kNoValue with ok true. PACKED_DMS: that number unpacked (kNoValue stays kNoValue).
//   DMS_DIGITS, DMS_WHOLE_SECONDS: that number divided by 10000 and unpacked, so an empty text gives
//   about 1.8e304 with ok true, not kNoValue: test for an empty field first, or use the Ex form.
//   A style outside 0..6 gives the number unchanged.
// - DMS_BLANK_SEPARATED: degrees, minutes and seconds separated by single blanks; one-digit minutes
//   and seconds are padded ("12 3 5.5" is 12°03'05.5"). DMS_WITH_MARKS: D°M'S.sss (degree sign
//   U+00B0, apostrophe) with an optional closing double quote; everything from the double quote on is
//   dropped, so the letter N or E after it changes nothing, and minutes get one padding zero at most.
//   In both styles the first S or W anywhere in the text (either case) makes the value negative; a
//   leading minus sign is read as well.
// ok is false, with the result 0.0, for a text that stringToDouble rejects once the separators are
// taken out, and in DMS_BLANK_SEPARATED and DMS_WITH_MARKS for a text
// - without its separators (both blanks; the degree sign and the apostrophe),
// - without a decimal point, or with the first point before the seconds,
// - with the apostrophe before the degree sign.
DEX_API double stringByStyleToCoords(ECoordsStyle style, const CVynStringT<wchar_t>& text, bool& ok);

// As stringByStyleToCoords with a three-way verdict: an empty text (no characters) gives EMPTY_TEXT
// and 0.0; a text it rejects gives NOT_A_NUMBER and 0.0; otherwise VALID_NUMBER.
DEX_API double stringByStyleToCoordsEx(ECoordsStyle style, const CVynStringT<wchar_t>& text,
                                       EFlagFltValues& flag);

}  // namespace vyn::ie::utils
