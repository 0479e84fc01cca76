#include "ieUtils/IEUtilsUnits.h"

#include <array>
#include <cmath>
#include <cstdlib>
#include <cwchar>
#include <string>

#include "hostlibs/VynFormats.h"
#include "hostlibs/detail/CLocale.h"
#include "hostlibs/detail/DecimalText.h"
#include "hostlibs/vynmath.h"
#include "ieUtils/detail/FlagReader.h"

namespace vyn::ie::utils {

namespace {

using vyn_text::detail::CLocaleScope;

// Meters per unit for the units converted by a plain factor, from USCHAINS (5) to PARSECS (26). The
// feet and feet-and-inches before them go through the host math library.
constexpr int kFirstFactorUnit = 5;
constexpr int kLastFactorUnit = 26;
constexpr std::array<double, kLastFactorUnit - kFirstFactorUnit + 1> kMetersPerUnit = {
    20.116840233680467,  // USCHAINS
    20.1168,             // ICHAINS
    1609.344,            // MILE
    0.0254,              // INCHES
    0.0254000508001016,  // USINCHES
    0.001,               // MILLIMETERS
    0.01,                // CENTIMETERS
    1000.0,              // KILOMETERS
    2.54e-5,             // MICROINCHES, the factor of MILS
    2.54e-5,             // MILS
    0.9144,              // IYARDS
    0.9144,              // USYARDS, the factor of IYARDS
    1e-10,               // ANGSTROMS
    1e-9,                // NANOMETERS
    1e-6,                // MICRONS
    0.1,                 // DECIMETERS
    10.0,                // DECAMETERS
    100.0,               // HECTOMETER
    1e9,                 // GIGAMETERS
    149597870691.0,      // ASTRONOMICAL_UNITS
    9460730472580800.0,  // LIGHT_YEARS
    3.08567782e16,       // PARSECS
};

bool isNoValue(double value) {
  return value == kNoValue;
}

// Meters, ANY_UNITS and numbers outside the enumeration convert nothing.
bool isConvertedDistUnit(EDistUnits units) {
  const int value = static_cast<int>(units);
  return value >= static_cast<int>(EDistUnits::USFEET) && value <= kLastFactorUnit;
}

double metersPerUnit(EDistUnits units) {
  return kMetersPerUnit[static_cast<std::size_t>(static_cast<int>(units) - kFirstFactorUnit)];
}

// The leading number of text as the C library's wcstod reads it: 0 when there is none.
double leadingNumber(const CVynStringT<wchar_t>& text) {
  const CLocaleScope numericLocale;
  return std::wcstod(text.GetString(), nullptr);
}

// Blanks, tabs and line ends may follow a number.
constexpr const wchar_t* kTrailingBlanks = L" \t\r\n";

// The significant digits doubleToStringWithExp writes after its point.
constexpr std::size_t kExpMantissaDigits = 17;

}  // namespace

// ---- Unit conversions ---------------------------------------------------------------------------

double toMetersFactor(double value, EDistUnits units) {
  if (isNoValue(value) || !isConvertedDistUnit(units)) return value;
  switch (units) {
    case EDistUnits::USFEET:
      return USFeet2Meter(value);
    case EDistUnits::IFEET:
      return IFeet2Meter(value);
    case EDistUnits::USFEETINCHES:
      return FFFII2Meter(value, true);
    case EDistUnits::IFEETINCHES:
      return FFFII2Meter(value, false);
    default:
      return value * metersPerUnit(units);
  }
}

double fromMetersFactor(double value, EDistUnits units) {
  if (isNoValue(value) || !isConvertedDistUnit(units)) return value;
  switch (units) {
    case EDistUnits::USFEET:
      return Meter2USFeet(value);
    case EDistUnits::IFEET:
      return Meter2IFeet(value);
    case EDistUnits::USFEETINCHES:
      return Meter2FFFII(value, true);
    case EDistUnits::IFEETINCHES:
      return Meter2FFFII(value, false);
    default:
      return value / metersPerUnit(units);
  }
}

double angleToDecDeg(double value, EAngleUnits units) {
  if (isNoValue(value)) return value;
  switch (units) {
    case EAngleUnits::RADIANS:
      return Rad2Deg(value, false);
    case EAngleUnits::GRADS_GONS:
      return Grad2Deg(value, false);
    case EAngleUnits::MILS:
      return Mil2Deg(value, false);
    case EAngleUnits::DDDMMSSS:
      return DDDMMSS2Deg(value);
    default:
      return value;
  }
}

double decDegToAngle(EAngleUnits units, double value, int precision) {
  if (isNoValue(value)) return value;
  switch (units) {
    case EAngleUnits::RADIANS:
      return Deg2Rad(value, false);
    case EAngleUnits::GRADS_GONS:
      return Deg2Grad(value, false);
    case EAngleUnits::MILS:
      return Deg2Mil(value, false);
    case EAngleUnits::DDDMMSSS:
      return Deg2DDDMMSS(value, precision, false);
    default:
      return value;
  }
}

double fromCelsius(double celsius, ETemperatureUnits units) {
  return units == ETemperatureUnits::FAHRENHEIT ? celsius * 1.8 + 32.0 : celsius;
}

double fromHpa(double hpa, EPressureUnits units) {
  switch (units) {
    case EPressureUnits::MMHG:
      return hpa / 1.33322387415;
    case EPressureUnits::INHG:
      return hpa * 0.02953;
    default:
      return hpa;
  }
}

// ---- Writing numbers ----------------------------------------------------------------------------

CVynStringT<wchar_t> doubleToString(double value, int decimals) {
  return decimals < 0 ? vyn_formats::DoubleToString(value) : vyn_formats::DoubleToString(value, decimals);
}

CVynStringT<wchar_t> intToString(int value) {
  return vyn_formats::IntToString(value);
}

CVynStringT<wchar_t> angleByStyleToString(EAngleUnits units, double decDeg, int decimals) {
  return doubleToString(decDegToAngle(units, decDeg, decimals), decimals);
}

CVynStringT<wchar_t> distByStyleToString(EDistUnits units, double meters, int decimals) {
  return doubleToString(fromMetersFactor(meters, units), decimals);
}

void appendDistByStyle(std::wstring& out, EDistUnits units, double meters, int decimals) {
  const double value = fromMetersFactor(meters, units);
  if (decimals < 0) {
    out += vyn_formats::DoubleToString(value).view();
  } else {
    vyn_formats::AppendDoubleToString(out, value, decimals);
  }
}

bool doubleToStringWithExp(double value, CVynStringT<wchar_t>& out) {
  if (value == 0.0) {
    out = L"0.00000000000000000E+00";
    return true;
  }
  if (!std::isfinite(value)) return false;

  // |value| = d.ddd... x 10^exponent printed with 17 decimals becomes .dddd... x 10^(exponent + 1),
  // of which 17 digits are kept. The digits are the shortest that read back as the value, padded with
  // zeros, so 0.05 gives .50000000000000000 rather than the binary expansion's .50000000000000002.
  const vyn_formats::detail::DecimalDigits digits = vyn_formats::detail::shortestDigits(value);
  std::string mantissa = digits.digits.substr(0, kExpMantissaDigits);
  mantissa.resize(kExpMantissaDigits, '0');
  const int exponent = digits.exponent + 1;

  out.Format(L"%lc.%sE%lc%02d", value < 0.0 ? L'-' : L'0', mantissa.c_str(), exponent < 0 ? L'-' : L'+',
             std::abs(exponent));
  return true;
}

double checkZeroVal(double value) {
  return std::fabs(value) < 0.0001 ? 0.0 : value;
}

// ---- Reading numbers ----------------------------------------------------------------------------

bool stringToDouble(const CVynStringT<wchar_t>& text, double& value, bool /*reserved*/) {
  CVynStringT<wchar_t> trimmed(text);
  trimmed.TrimRight(kTrailingBlanks);
  if (trimmed.IsEmpty()) {
    value = kNoValue;
    return true;
  }

  // consumed counts the leading white space as well, which the trimmed copy still has.
  int consumed = 0;
  int converted = 0;
  {
    const CLocaleScope numericLocale;
    converted = std::swscanf(text.GetString(), L"%lf%n", &value, &consumed);
  }
  if (converted != 1) return false;

  const int rest = trimmed.GetLength() - consumed;
  if (rest < 1) return rest == 0;
  // What the Windows runtime prints for the infinities and NaN: 1.#INF, -1.#IND, 1.#QNAN.
  if (trimmed[consumed] == L'#') {
    value = kNoValue;
    return true;
  }
  return false;
}

double stringByStyleToDist(EDistUnits units, const CVynStringT<wchar_t>& text) {
  return toMetersFactor(text.IsEmpty() ? 0.0 : leadingNumber(text), units);
}

double stringByStyleToDist(EDistUnits units, const CVynStringT<wchar_t>& text, bool& ok) {
  double value = 0.0;
  ok = stringToDouble(text, value);
  return ok ? toMetersFactor(value, units) : 0.0;
}

double stringByStyleToDistEx(EDistUnits units, const CVynStringT<wchar_t>& text, EFlagFltValues& flag) {
  return detail::readWithVerdict(text, flag, [units](const CVynStringT<wchar_t>& field, bool& ok) {
    return stringByStyleToDist(units, field, ok);
  });
}

double stringByStyleToAngle(EAngleUnits units, const CVynStringT<wchar_t>& text) {
  return angleToDecDeg(text.IsEmpty() ? 0.0 : leadingNumber(text), units);
}

}  // namespace vyn::ie::utils
