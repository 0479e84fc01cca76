#pragma once

#include <cstdint>
#include <limits>
#include <string>

#include "hostlibs/DexApi.h"
#include "hostlibs/VynString.h"

// Units, angles and number texts of the toolbox. The library holds distances in meters, angles in
// decimal degrees, temperatures in degrees Celsius and pressures in hectopascals; these functions move
// numbers between those internal units and the units of a file.
//
// Every number text is read and written with "." as the decimal separator, whatever the process
// locale is. No function here throws or logs: failures are told by the result alone.

namespace vyn::ie {

// The no-value marker: the largest finite double (bits 0x7FEFFFFFFFFFFFFF) stands for "no value" in
// every numeric field. The distance and angle conversions pass it through unchanged and the text
// readers produce it for an empty field.
inline constexpr double kNoValue = std::numeric_limits<double>::max();

// Distance units. Values are stored and compared by number (formats registry, job history); a value
// cast from any other number is accepted everywhere and converts nothing. The unit enumerations are
// unscoped so that they compare with plain numbers; name them qualified (EDistUnits::MILS) where a
// name is shared with the angle units.
enum EDistUnits : std::int32_t {
  METERS = 0,
  USFEET = 1,        // US survey foot, 1200/3937 m
  IFEET = 2,         // international foot, 0.3048 m
  USFEETINCHES = 3,  // packed US feet and inches FFF.IIiii
  IFEETINCHES = 4,   // packed international feet and inches FFF.IIiii
  USCHAINS = 5,
  ICHAINS = 6,
  MILE = 7,
  INCHES = 8,
  USINCHES = 9,
  MILLIMETERS = 10,
  CENTIMETERS = 11,
  KILOMETERS = 12,
  MICROINCHES = 13,  // converted with the same factor as MILS, 2.54e-5 m
  MILS = 14,
  IYARDS = 15,
  USYARDS = 16,  // converted with the same factor as IYARDS, 0.9144 m
  ANGSTROMS = 17,
  NANOMETERS = 18,
  MICRONS = 19,
  DECIMETERS = 20,
  DECAMETERS = 21,
  HECTOMETER = 22,
  GIGAMETERS = 23,
  ASTRONOMICAL_UNITS = 24,
  LIGHT_YEARS = 25,
  PARSECS = 26,
  ANY_UNITS = 27,  // a format that accepts every unit; converts nothing
};

// Angle units. They live in a namespace of their own because MILS and ANY_UNITS are also distance
// units; the type and the names it does not share are brought into vyn::ie.
namespace angle_units {
enum EAngleUnits : std::int32_t {
  RADIANS = 0,
  GRADS_GONS = 1,
  MILS = 2,       // 6400 to a turn
  DECDEG = 3,     // decimal degrees, the internal unit
  DDDMMSSS = 4,   // packed degrees, minutes and seconds DDD.MMSSsss
  ANY_UNITS = 5,  // converts nothing
};
}  // namespace angle_units
using angle_units::DDDMMSSS;
using angle_units::DECDEG;
using angle_units::EAngleUnits;
using angle_units::GRADS_GONS;
using angle_units::RADIANS;

enum ETemperatureUnits : std::int32_t {
  FAHRENHEIT = 0,
  CELSIUS = 1,
};

enum EPressureUnits : std::int32_t {
  MMHG = 0,
  HPA = 1,
  INHG = 2,
  MBAR = 3,
};

}  // namespace vyn::ie

namespace vyn::ie::utils {

// The verdict of the text readers whose names end in Ex.
enum EFlagFltValues : std::int32_t {
  NOT_A_NUMBER = 0,  // the text is not a valid number; the result is 0.0
  EMPTY_TEXT = 1,    // the text is empty (no characters at all); the result is 0.0
  VALID_NUMBER = 2,  // a number was read
};

// ---- Unit conversions ---------------------------------------------------------------------------
// The distance and angle conversions return the no-value marker unchanged, and the value unchanged
// for a unit that converts nothing (meters, decimal degrees, ANY_UNITS, or a number outside the
// enumeration). Feet and feet-and-inches go through the host math library; every other unit through
// its factor to meters.

// value in units to meters.
DEX_API double toMetersFactor(double value, EDistUnits units);
// meters to units (the inverse of toMetersFactor).
DEX_API double fromMetersFactor(double value, EDistUnits units);

// value in units to decimal degrees.
DEX_API double angleToDecDeg(double value, EAngleUnits units);
// Decimal degrees to units. precision is used by DDDMMSSS only: the decimals of the packed value
// (4 rounds to whole seconds; see Deg2DDDMMSS).
DEX_API double decDegToAngle(EAngleUnits units, double value, int precision);

// Celsius to Fahrenheit for FAHRENHEIT; any other unit returns celsius. Unlike the distance and angle
// conversions this one does not spare the no-value marker.
DEX_API double fromCelsius(double celsius, ETemperatureUnits units);
// Hectopascals to mmHg or inHg; HPA, MBAR and any other unit return hpa. No no-value check.
DEX_API double fromHpa(double hpa, EPressureUnits units);

// ---- Writing numbers ----------------------------------------------------------------------------

// decimals below 0 writes the shortest text that reads back as value ("12.5", "1e-07"); 0 or more
// writes fixed notation with exactly that many decimals ("12.500").
DEX_API CVynStringT<wchar_t> doubleToString(double value, int decimals);
DEX_API CVynStringT<wchar_t> intToString(int value);

// doubleToString(decDegToAngle(units, decDeg, decimals), decimals).
DEX_API CVynStringT<wchar_t> angleByStyleToString(EAngleUnits units, double decDeg, int decimals);
// doubleToString(fromMetersFactor(meters, units), decimals).
DEX_API CVynStringT<wchar_t> distByStyleToString(EDistUnits units, double meters, int decimals);
// Appends what distByStyleToString answers to out, without a string of its own: for writers of many
// numbers.
DEX_API void appendDistByStyle(std::wstring& out, EDistUnits units, double meters, int decimals);

// A fixed scientific form with the mantissa below 1 and 17 digits after its point:
// "0.12345600000000000E+03" for 123.456, "-.50000000000000000E-01" for -0.05 (a negative value puts
// its minus sign in place of the leading zero), "0.00000000000000000E+00" for zero. The digits are
// the shortest that read back as the value, padded with zeros. The exponent has at least two digits,
// so the text is 23 characters long unless the exponent needs three ("0.17976931348623157E+309" for
// the no-value marker). Answers false, leaving out unchanged, for NaN and the infinities.
DEX_API bool doubleToStringWithExp(double value, CVynStringT<wchar_t>& out);

// 0.0 when |value| < 0.0001, else value.
DEX_API double checkZeroVal(double value);

// ---- Reading numbers ----------------------------------------------------------------------------

// Reads a whole text as one number, as the C library's "%lf" reads it: leading white space, a sign,
// decimals, an exponent; "inf" and "nan" give the infinity and NaN, an exponent beyond the range of
// a double gives the infinity or zero. Blanks, tabs, CR and LF may follow the number. Results:
// - an empty or all-blank text (blanks, tabs, CR, LF only): true, value = kNoValue;
// - a number and nothing else: true, value = the number;
// - a number directly followed by "#", whatever comes after it (the printed infinities and NaN
//   "1.#INF", "-1.#IND", "1.#QNAN"): true, value = kNoValue;
// - anything else after the number ("12.5m", "12,5"): false, value holds the number read;
// - no number at all ("abc"): false, value unchanged.
// The third argument is not consulted.
DEX_API bool stringToDouble(const CVynStringT<wchar_t>& text, double& value, bool reserved = false);

// The leading number of text in units, converted to meters. Trailing characters are ignored and a
// text without a leading number reads as 0 ("5m" is 5, "abc" is 0); an empty text is 0 too. There is
// no failure result: use the forms below to tell bad texts apart.
DEX_API double stringByStyleToDist(EDistUnits units, const CVynStringT<wchar_t>& text);

// stringToDouble's verdict in ok. On false the result is 0.0; on true it is the number converted to
// meters, so an empty or blank text gives kNoValue with ok true.
DEX_API double stringByStyleToDist(EDistUnits units, const CVynStringT<wchar_t>& text, bool& ok);

// As the form above with a three-way verdict: an empty text (no characters) gives EMPTY_TEXT and 0.0;
// a text stringToDouble rejects gives NOT_A_NUMBER and 0.0; otherwise VALID_NUMBER and the meters
// (kNoValue for an all-blank text).
DEX_API double stringByStyleToDistEx(EDistUnits units, const CVynStringT<wchar_t>& text,
                                     EFlagFltValues& flag);

// The leading number of text in units, converted to decimal degrees; trailing characters are ignored
// and a text without a leading number reads as 0, as in the first stringByStyleToDist.
DEX_API double stringByStyleToAngle(EAngleUnits units, const CVynStringT<wchar_t>& text);

}  // namespace vyn::ie::utils
