#include "hostlibs/vynmath.h"

#include <algorithm>
#include <cmath>
#include <cstdint>
#include <limits>
#include <numbers>
#include <string>
#include <string_view>

#include "hostlibs/detail/DecimalText.h"
#include "hostlibs/detail/SinCosDegrees.h"

namespace {

using vyn_formats::detail::parseDecimal;
using vyn_formats::detail::shortestFixed;
using vyn_math::detail::SinCos;
using vyn_math::detail::sinCosDegrees;

constexpr double kDegreesPerTurn = 360.0;
constexpr double kGradsPerTurn = 400.0;
constexpr double kMilsPerTurn = 6400.0;
constexpr double kMetersPerInternationalFoot = 0.3048;

constexpr int kMaxPackedAngleDecimals = 15;
// Meter2FFFII keeps the inch to 9 decimals: two digits of inches and 9 decimals after the point.
constexpr int kInchDecimals = 9;
constexpr int kPackedLengthDecimals = 2 + kInchDecimals;
constexpr double kMaxExactInteger = 9007199254740992.0;  // 2^53

double wrapped(double value, bool normalize, double turn) {
  return normalize ? toRange(value, 0.0, turn) : value;
}

std::int64_t powerOfTen(int exponent) {
  std::int64_t power = 1;
  for (int i = 0; i < exponent; ++i)
    power *= 10;
  return power;
}

// Digit `position` after the point of DDD.MMSSsss counts units of which `radix` make one unit of the
// digit before it: tens of minutes (6 to a degree), minutes, tens of seconds (6 to a minute),
// seconds, decimals of a second.
std::int64_t packedAngleDigitRadix(int position) {
  return position == 1 || position == 3 ? 6 : 10;
}

std::int64_t packedAngleUnitsPerDegree(int decimals) {
  std::int64_t units = 1;
  for (int position = 1; position <= decimals; ++position)
    units *= packedAngleDigitRadix(position);
  return units;
}

// fraction (in [0, 1), the part of magnitude after its whole units) as a count of 1/units, rounded
// half away from zero. A value that a decimal tie turned into a binary number a little below the tie
// still rounds up: the allowance covers the few ulps by which magnitude can miss its decimal value.
std::int64_t roundedUnits(double magnitude, double fraction, std::int64_t units) {
  const double scaled = fraction * static_cast<double>(units);
  const double allowance =
      std::min(2.0 * std::numeric_limits<double>::epsilon() * magnitude * static_cast<double>(units), 0.25);
  const double below = std::floor(scaled);
  const std::int64_t count = static_cast<std::int64_t>(below);
  return scaled - below >= 0.5 - allowance ? count + 1 : count;
}

// The double nearest to the decimal value whole + fraction / 10^decimals, with the sign. Exact integer
// arithmetic and one correctly rounded division where the digits fit a double, the decimal text
// otherwise. Zero is +0.
double packedValue(bool negative, double whole, std::int64_t fraction, int decimals) {
  if (whole == 0.0 && fraction == 0) return 0.0;
  const std::int64_t scale = powerOfTen(decimals);
  double magnitude = 0.0;
  if (whole < kMaxExactInteger / static_cast<double>(scale) &&
      static_cast<double>(static_cast<std::int64_t>(whole) * scale + fraction) < kMaxExactInteger) {
    magnitude =
        static_cast<double>(static_cast<std::int64_t>(whole) * scale + fraction) / static_cast<double>(scale);
  } else {
    std::string text = shortestFixed(whole);
    if (decimals > 0) {
      std::string digits = std::to_string(fraction);
      text += '.';
      text.append(static_cast<std::size_t>(decimals) - digits.size(), '0');
      text += digits;
    }
    parseDecimal(text, magnitude);
  }
  return negative ? -magnitude : magnitude;
}

// A packed value (DDD.MMSSsss or FFF.IIiii) read by its shortest decimal text.
struct PackedDigits {
  bool negative = false;
  double whole = 0.0;
  std::string fraction;  // the digits after the point
};

PackedDigits readPackedDigits(double packed) {
  PackedDigits digits;
  digits.negative = std::signbit(packed);
  const std::string text = shortestFixed(std::abs(packed));
  const std::size_t point = text.find('.');
  parseDecimal(std::string_view(text).substr(0, point), digits.whole);
  if (point != std::string::npos) digits.fraction = text.substr(point + 1);
  return digits;
}

// The two digits of fraction at first (missing digits are zeros) as a number; withDecimals adds the
// digits after them as its decimals.
double twoDigitField(const std::string& fraction, std::size_t first, bool withDecimals) {
  std::string field = first < fraction.size() ? fraction.substr(first, 2) : std::string();
  field.resize(2, '0');
  if (withDecimals && fraction.size() > first + 2) {
    field += '.';
    field += fraction.substr(first + 2);
  }
  double value = 0.0;
  parseDecimal(field, value);
  return value;
}

}  // namespace

// ---- Angle units --------------------------------------------------------------------------------

double Deg2Rad(double degrees, bool normalize) {
  return wrapped(degrees * (std::numbers::pi / 180.0), normalize, 2.0 * std::numbers::pi);
}

double Rad2Deg(double radians, bool normalize) {
  return wrapped(radians * (180.0 / std::numbers::pi), normalize, kDegreesPerTurn);
}

// Multiplying before dividing keeps the round values exact (90 degrees is 100 grads and 1600 mils).
double Deg2Grad(double degrees, bool normalize) {
  return wrapped(degrees * 10.0 / 9.0, normalize, kGradsPerTurn);
}

double Grad2Deg(double grads, bool normalize) {
  return wrapped(grads * 9.0 / 10.0, normalize, kDegreesPerTurn);
}

double Deg2Mil(double degrees, bool normalize) {
  return wrapped(degrees * 160.0 / 9.0, normalize, kMilsPerTurn);
}

double Mil2Deg(double mils, bool normalize) {
  return wrapped(mils * 9.0 / 160.0, normalize, kDegreesPerTurn);
}

// ---- Packed degrees-minutes-seconds -------------------------------------------------------------

double Deg2DDDMMSS(double degrees, int decimals, bool normalize) {
  if (!std::isfinite(degrees)) return degrees;
  if (normalize) degrees = toRange(degrees, 0.0, kDegreesPerTurn);
  decimals = std::clamp(decimals, 0, kMaxPackedAngleDecimals);

  const double magnitude = std::abs(degrees);
  double whole = std::floor(magnitude);
  std::int64_t count = roundedUnits(magnitude, magnitude - whole, packedAngleUnitsPerDegree(decimals));

  std::int64_t packedFraction = 0;
  std::int64_t place = 1;
  for (int position = decimals; position >= 1; --position) {
    const std::int64_t radix = packedAngleDigitRadix(position);
    packedFraction += (count % radix) * place;
    count /= radix;
    place *= 10;
  }
  whole += static_cast<double>(count);  // what the rounding carried into the degrees
  if (normalize && whole >= kDegreesPerTurn) whole -= kDegreesPerTurn;
  return packedValue(degrees < 0.0, whole, packedFraction, decimals);
}

double DDDMMSS2Deg(double packed) {
  if (!std::isfinite(packed)) return packed;
  const PackedDigits digits = readPackedDigits(packed);
  const double minutes = twoDigitField(digits.fraction, 0, false);
  const double seconds = twoDigitField(digits.fraction, 2, true);
  const double magnitude = digits.whole + (minutes * 60.0 + seconds) / 3600.0;
  return digits.negative ? -magnitude : magnitude;
}

// ---- Feet ---------------------------------------------------------------------------------------

double Meter2USFeet(double meters) {
  return meters * 3937.0 / 1200.0;
}

double USFeet2Meter(double usFeet) {
  return usFeet * 1200.0 / 3937.0;
}

double Meter2IFeet(double meters) {
  return meters / kMetersPerInternationalFoot;
}

double IFeet2Meter(double internationalFeet) {
  return internationalFeet * kMetersPerInternationalFoot;
}

double Meter2FFFII(double meters, bool us) {
  const double feet = us ? Meter2USFeet(meters) : Meter2IFeet(meters);
  if (!std::isfinite(feet)) return feet;
  const double magnitude = std::abs(feet);
  double whole = std::floor(magnitude);
  const std::int64_t unitsPerFoot = 12 * powerOfTen(kInchDecimals);
  std::int64_t inchUnits = roundedUnits(magnitude, magnitude - whole, unitsPerFoot);
  if (inchUnits >= unitsPerFoot) {  // 12 inches after rounding are the next foot
    whole += 1.0;
    inchUnits = 0;
  }
  return packedValue(feet < 0.0, whole, inchUnits, kPackedLengthDecimals);
}

double FFFII2Meter(double packed, bool us) {
  if (!std::isfinite(packed)) return packed;
  const PackedDigits digits = readPackedDigits(packed);
  const double magnitude = digits.whole + twoDigitField(digits.fraction, 0, true) / 12.0;
  const double feet = digits.negative ? -magnitude : magnitude;
  return us ? USFeet2Meter(feet) : IFeet2Meter(feet);
}

// ---- Ranges -------------------------------------------------------------------------------------

double toRange(double value, double low, double high) {
  if (!std::isfinite(value) || !std::isfinite(low) || !std::isfinite(high) || !(high > low)) return value;
  if (value >= low && value < high) return value;
  const double width = high - low;
  const double shifted = value - low;
  if (!std::isfinite(width) || !std::isfinite(shifted)) return value;
  double offset = std::fmod(shifted, width);
  if (offset < 0.0) offset += width;
  const double result = low + offset;
  return result < high ? result : low;  // an offset just below the width may round up to it
}

// ---- Angle type ---------------------------------------------------------------------------------

CMathAngle::CMathAngle(double degrees) noexcept {
  setDeg(degrees);
}

double CMathAngle::getRad() const noexcept {
  return Deg2Rad(degrees_);
}

void CMathAngle::setDeg(double degrees) noexcept {
  degrees_ = std::isfinite(degrees) ? toRange(degrees, 0.0, kDegreesPerTurn)
                                    : std::numeric_limits<double>::quiet_NaN();
}

void CMathAngle::RotatePoint(const vyn_math::TAbstractPoint<double>& centre,
                             const vyn_math::TAbstractPoint<double>& point,
                             vyn_math::TAbstractPoint<double>& out) const noexcept {
  if (std::isnan(degrees_)) {
    out = {degrees_, degrees_};
    return;
  }
  const SinCos turn = sinCosDegrees(degrees_);
  const double dx = point.x - centre.x;
  const double dy = point.y - centre.y;
  const vyn_math::TAbstractPoint<double> rotated(centre.x + dx * turn.cos - dy * turn.sin,
                                                 centre.y + dx * turn.sin + dy * turn.cos);
  out = rotated;
}
