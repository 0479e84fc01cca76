// Number, distance and angle texts. The first bytes choose a coordinate style (0..7, one beyond the
// enumeration), a sign style, a precision (-3..20) and a unit; the next eight bytes are the bits of a
// double, the rest a text in lenient UTF-8. The text goes through every reader, whose verdicts must
// agree with one another; the double goes through every writer, and what a writer forms must read
// back as the value within the precision written, whenever the value is finite and in range.

#include <cmath>
#include <cstddef>
#include <cstdint>

#include "ieUtils/IEUtilsCoords.h"
#include "ieUtils/IEUtilsUnits.h"
#include "support/FuzzCheck.h"
#include "support/FuzzInput.h"
#include "support/FuzzText.h"

namespace {

namespace utils = vyn::ie::utils;
using String = CVynStringT<wchar_t>;
using vyn::ie::ECoordsSign;
using vyn::ie::ECoordsStyle;

constexpr int kStyleCount = 7;
constexpr double kLargestCoordinate = 360.0;
// What packing into DDD.MMSSsss and reading back may cost beyond the rounding of the text.
constexpr double kArithmeticSlack = 1e-9;

struct Choices {
  ECoordsStyle style;
  ECoordsSign sign;
  int precision;
  int units;
};

bool sameNumber(double a, double b) {
  return a == b || (std::isnan(a) && std::isnan(b));
}

// ---- Readers --------------------------------------------------------------------------------------

void readAsNumber(const String& text, int units) {
  double value = 12345.0;
  const bool ok = utils::stringToDouble(text, value);
  if (text.IsEmpty()) DEX_FUZZ_CHECK(ok && value == vyn::ie::kNoValue);

  const auto distUnits = static_cast<vyn::ie::EDistUnits>(units);
  bool distOk = !ok;
  const double meters = utils::stringByStyleToDist(distUnits, text, distOk);
  DEX_FUZZ_CHECK(distOk == ok);
  if (!ok) DEX_FUZZ_CHECK(meters == 0.0);
  if (ok) DEX_FUZZ_CHECK(sameNumber(meters, utils::toMetersFactor(value, distUnits)));

  utils::EFlagFltValues flag = utils::NOT_A_NUMBER;
  const double metersEx = utils::stringByStyleToDistEx(distUnits, text, flag);
  if (text.IsEmpty()) {
    DEX_FUZZ_CHECK(flag == utils::EMPTY_TEXT && metersEx == 0.0);
  } else {
    DEX_FUZZ_CHECK(flag == (ok ? utils::VALID_NUMBER : utils::NOT_A_NUMBER));
    DEX_FUZZ_CHECK(sameNumber(metersEx, meters));
  }

  [[maybe_unused]] const double leading = utils::stringByStyleToDist(distUnits, text);
  [[maybe_unused]] const double angle =
      utils::stringByStyleToAngle(static_cast<vyn::ie::EAngleUnits>(units % 8), text);
}

void readAsCoordinate(const String& text, ECoordsStyle style) {
  bool ok = false;
  const double value = utils::stringByStyleToCoords(style, text, ok);
  if (!ok) DEX_FUZZ_CHECK(value == 0.0);

  utils::EFlagFltValues flag = utils::NOT_A_NUMBER;
  const double valueEx = utils::stringByStyleToCoordsEx(style, text, flag);
  if (text.IsEmpty()) {
    DEX_FUZZ_CHECK(flag == utils::EMPTY_TEXT && valueEx == 0.0);
  } else {
    DEX_FUZZ_CHECK(flag == (ok ? utils::VALID_NUMBER : utils::NOT_A_NUMBER));
    DEX_FUZZ_CHECK(sameNumber(valueEx, value));
  }
}

// ---- Writers --------------------------------------------------------------------------------------

// The finest step, in degrees, of a packed DDD.MMSSsss value written with decimals decimals (which
// the packing takes into 0..15): 0 whole degrees, 1 tens of minutes, 2 minutes, 3 tens of seconds, 4
// seconds, then tenths of a second and so on.
double packedStep(int decimals) {
  static constexpr double kCoarseSteps[] = {1.0, 10.0 / 60.0, 1.0 / 60.0, 10.0 / 3600.0};
  const int clamped = decimals < 0 ? 0 : (decimals > 15 ? 15 : decimals);
  if (clamped < 4) return kCoarseSteps[clamped];
  return std::pow(10.0, 4 - clamped) / 3600.0;
}

// How far a written coordinate may read back from decDeg; a negative answer when the style writes
// nothing readable for that precision.
double coordinateTolerance(ECoordsStyle style, int precision) {
  const int decimals = precision;
  switch (style) {
    case ECoordsStyle::DECIMAL_DEGREES:
      return decimals < 0 ? 0.0 : 0.5 * std::pow(10.0, -decimals);
    case ECoordsStyle::PLAIN_NUMBER:
      return std::fmax(1e-4, decimals < 0 ? 0.0 : 0.5 * std::pow(10.0, -decimals));
    case ECoordsStyle::PACKED_DMS:
      return packedStep(decimals);
    case ECoordsStyle::DMS_WHOLE_SECONDS:
      return packedStep(4);
    default:  // the styles that need minutes and seconds
      return decimals < 4 ? -1.0 : packedStep(decimals);
  }
}

int defaultPrecision(ECoordsStyle style) {
  switch (style) {
    case ECoordsStyle::DECIMAL_DEGREES:
    case ECoordsStyle::PACKED_DMS:
      return 12;
    case ECoordsStyle::PLAIN_NUMBER:
      return 3;
    case ECoordsStyle::DMS_WHOLE_SECONDS:
      return 4;
    default:
      return 9;
  }
}

void writeCoordinate(double decDeg, const Choices& choices) {
  for (int s = 0; s <= kStyleCount; ++s) {
    const auto style = static_cast<ECoordsStyle>(s);
    const String text = utils::coordsByStyleToString(style, decDeg, choices.precision, choices.sign);
    if (s == kStyleCount) {
      DEX_FUZZ_CHECK(text.IsEmpty());
      continue;
    }
    readAsCoordinate(text, style);
    if (!std::isfinite(decDeg) || std::fabs(decDeg) > kLargestCoordinate) continue;

    const int precision = choices.precision == -1 ? defaultPrecision(style) : choices.precision;
    const double tolerance = coordinateTolerance(style, precision);
    if (tolerance < 0.0) {
      DEX_FUZZ_CHECK(text.IsEmpty());
      continue;
    }
    // Other sign values write the magnitude without a letter: the sign is gone by design.
    const bool signKept =
        style != ECoordsStyle::DMS_WITH_MARKS || choices.sign == ECoordsSign::SIGNED_NUMBER ||
        choices.sign == ECoordsSign::LATITUDE_LETTER || choices.sign == ECoordsSign::LONGITUDE_LETTER;
    bool ok = false;
    const double back = utils::stringByStyleToCoords(style, text, ok);
    DEX_FUZZ_CHECK(ok);
    const double expected = signKept ? decDeg : std::fabs(decDeg);
    DEX_FUZZ_CHECK(std::fabs(back - expected) <= tolerance + kArithmeticSlack);
  }
}

void writeNumber(double value, const Choices& choices) {
  // The shortest text reads back exactly.
  const String shortest = utils::doubleToString(value, -1);
  double back = 0.0;
  if (std::isfinite(value) && value != vyn::ie::kNoValue) {
    DEX_FUZZ_CHECK(utils::stringToDouble(shortest, back) && back == value);
  }
  // So does the scientific form.
  String scientific;
  const bool written = utils::doubleToStringWithExp(value, scientific);
  DEX_FUZZ_CHECK(written == std::isfinite(value));
  if (written && value != vyn::ie::kNoValue) {
    DEX_FUZZ_CHECK(utils::stringToDouble(scientific, back) && back == value);
  }

  if (choices.precision >= 0 && std::isfinite(value) && std::fabs(value) < 1e15) {
    const String fixed = utils::doubleToString(value, choices.precision);
    DEX_FUZZ_CHECK(fixed.Find(L',') < 0);
    DEX_FUZZ_CHECK(utils::stringToDouble(fixed, back));
    DEX_FUZZ_CHECK(std::fabs(back - value) <=
                   0.5 * std::pow(10.0, -choices.precision) + 1e-15 * std::fabs(value));
  }
  const auto distUnits = static_cast<vyn::ie::EDistUnits>(choices.units);
  [[maybe_unused]] const String distance = utils::distByStyleToString(distUnits, value, choices.precision);
  [[maybe_unused]] const String angle = utils::angleByStyleToString(
      static_cast<vyn::ie::EAngleUnits>(choices.units % 8), value, choices.precision);
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  dex_fuzz::FuzzInput input(data, size);
  Choices choices{};
  choices.style = static_cast<ECoordsStyle>(input.takeInt(0, kStyleCount));
  choices.sign = static_cast<ECoordsSign>(input.takeInt(0, 3));
  choices.precision = input.takeInt(-3, 20);
  choices.units = input.takeInt(0, 29);
  double value = input.takeDoubleBits();
  const String text(dex_fuzz::decodeLenientUtf8(input.takeRest()));

  readAsNumber(text, choices.units);
  readAsCoordinate(text, choices.style);

  writeNumber(value, choices);
  // Most bit patterns are huge or tiny; folding them into a turn tests the coordinates people write.
  if (std::isfinite(value)) value = std::fmod(value, kLargestCoordinate);
  writeCoordinate(value, choices);
  return 0;
}
