#include "ieUtils/IEUtilsUnits.h"

#include <gtest/gtest.h>

#include <cmath>
#include <cstdint>
#include <cstring>
#include <limits>
#include <numbers>
#include <string>
#include <type_traits>

#include "hostlibs/vynmath.h"
#include "support/CommaLocale.h"

namespace {

using String = CVynStringT<wchar_t>;
using vyn::ie::EAngleUnits;
using vyn::ie::EDistUnits;
using vyn::ie::EPressureUnits;
using vyn::ie::ETemperatureUnits;
using vyn::ie::kNoValue;
using vyn::ie::utils::EFlagFltValues;
namespace utils = vyn::ie::utils;

constexpr double kInfinity = std::numeric_limits<double>::infinity();

std::wstring text(const String& value) {
  return std::wstring(value.view());
}

EDistUnits distUnits(int value) {
  return static_cast<EDistUnits>(value);
}

EAngleUnits angleUnits(int value) {
  return static_cast<EAngleUnits>(value);
}

// ---- Enumerations and the marker ----------------------------------------------------------------

static_assert(sizeof(EDistUnits) == 4 && sizeof(EAngleUnits) == 4 && sizeof(ETemperatureUnits) == 4 &&
              sizeof(EPressureUnits) == 4 && sizeof(EFlagFltValues) == 4);
static_assert(static_cast<int>(EDistUnits::USFEETINCHES) == 3 && static_cast<int>(EDistUnits::MILS) == 14 &&
              static_cast<int>(EDistUnits::PARSECS) == 26 && static_cast<int>(EDistUnits::ANY_UNITS) == 27);
static_assert(static_cast<int>(EAngleUnits::DECDEG) == 3 && static_cast<int>(EAngleUnits::DDDMMSSS) == 4 &&
              static_cast<int>(EAngleUnits::ANY_UNITS) == 5);
static_assert(static_cast<int>(ETemperatureUnits::CELSIUS) == 1 &&
              static_cast<int>(EPressureUnits::MBAR) == 3);
static_assert(static_cast<int>(EFlagFltValues::NOT_A_NUMBER) == 0 &&
              static_cast<int>(EFlagFltValues::EMPTY_TEXT) == 1 &&
              static_cast<int>(EFlagFltValues::VALID_NUMBER) == 2);

TEST(NoValueMarker, IsTheLargestFiniteDouble) {
  std::uint64_t bits = 0;
  std::memcpy(&bits, &kNoValue, sizeof bits);
  EXPECT_EQ(bits, 0x7FEFFFFFFFFFFFFFull);
  EXPECT_EQ(kNoValue, 1.7976931348623157e308);
}

// ---- Distance conversions -----------------------------------------------------------------------

struct FactorRow {
  EDistUnits units;
  double metersPerUnit;
};

constexpr FactorRow kFactorRows[] = {
    {EDistUnits::USCHAINS, 20.116840233680467},
    {EDistUnits::ICHAINS, 20.1168},
    {EDistUnits::MILE, 1609.344},
    {EDistUnits::INCHES, 0.0254},
    {EDistUnits::USINCHES, 0.0254000508001016},
    {EDistUnits::MILLIMETERS, 0.001},
    {EDistUnits::CENTIMETERS, 0.01},
    {EDistUnits::KILOMETERS, 1000.0},
    {EDistUnits::MICROINCHES, 2.54e-5},
    {EDistUnits::MILS, 2.54e-5},
    {EDistUnits::IYARDS, 0.9144},
    {EDistUnits::USYARDS, 0.9144},
    {EDistUnits::ANGSTROMS, 1e-10},
    {EDistUnits::NANOMETERS, 1e-9},
    {EDistUnits::MICRONS, 1e-6},
    {EDistUnits::DECIMETERS, 0.1},
    {EDistUnits::DECAMETERS, 10.0},
    {EDistUnits::HECTOMETER, 100.0},
    {EDistUnits::GIGAMETERS, 1e9},
    {EDistUnits::ASTRONOMICAL_UNITS, 149597870691.0},
    {EDistUnits::LIGHT_YEARS, 9460730472580800.0},
    {EDistUnits::PARSECS, 3.08567782e16},
};

TEST(DistanceConversion, FactorUnitsMultiplyToMetersAndDivideBack) {
  for (const FactorRow& row : kFactorRows) {
    SCOPED_TRACE(static_cast<int>(row.units));
    EXPECT_EQ(utils::toMetersFactor(2.5, row.units), 2.5 * row.metersPerUnit);
    EXPECT_EQ(utils::fromMetersFactor(2.5, row.units), 2.5 / row.metersPerUnit);
  }
}

TEST(DistanceConversion, FeetUnitsUseTheHostConversions) {
  EXPECT_EQ(utils::toMetersFactor(100.0, EDistUnits::USFEET), USFeet2Meter(100.0));
  EXPECT_EQ(utils::fromMetersFactor(100.0, EDistUnits::USFEET), Meter2USFeet(100.0));
  EXPECT_EQ(utils::toMetersFactor(100.0, EDistUnits::IFEET), 30.48);
  EXPECT_EQ(utils::fromMetersFactor(30.48, EDistUnits::IFEET), Meter2IFeet(30.48));
  EXPECT_EQ(utils::toMetersFactor(5.065, EDistUnits::USFEETINCHES), FFFII2Meter(5.065, true));
  EXPECT_EQ(utils::fromMetersFactor(1.0, EDistUnits::USFEETINCHES), Meter2FFFII(1.0, true));
  EXPECT_EQ(utils::toMetersFactor(5.065, EDistUnits::IFEETINCHES), FFFII2Meter(5.065, false));
  EXPECT_DOUBLE_EQ(utils::toMetersFactor(5.06, EDistUnits::IFEETINCHES), 5.5 * 0.3048);
  EXPECT_EQ(utils::fromMetersFactor(1.0, EDistUnits::IFEETINCHES), Meter2FFFII(1.0, false));
}

TEST(DistanceConversion, MetersAnyUnitsAndUnknownUnitsConvertNothing) {
  for (const int units : {0, 27, 28, 99, -1}) {
    SCOPED_TRACE(units);
    EXPECT_EQ(utils::toMetersFactor(12.345, distUnits(units)), 12.345);
    EXPECT_EQ(utils::fromMetersFactor(12.345, distUnits(units)), 12.345);
    EXPECT_EQ(utils::distByStyleToString(distUnits(units), 12.345, 2), String(L"12.35"));
  }
}

TEST(DistanceConversion, NoValueMarkerPassesThroughEveryUnit) {
  for (int units = -1; units <= 30; ++units) {
    SCOPED_TRACE(units);
    EXPECT_EQ(utils::toMetersFactor(kNoValue, distUnits(units)), kNoValue);
    EXPECT_EQ(utils::fromMetersFactor(kNoValue, distUnits(units)), kNoValue);
  }
  EXPECT_EQ(utils::toMetersFactor(1.7976931348623157e308, EDistUnits::USFEET), kNoValue);
  // Only the marker itself is spared: its negative is an ordinary (overflowing) number.
  EXPECT_EQ(utils::toMetersFactor(-kNoValue, EDistUnits::KILOMETERS), -kInfinity);
}

TEST(DistanceConversion, WritesInTheUnitWithTheGivenDecimals) {
  EXPECT_EQ(text(utils::distByStyleToString(EDistUnits::IFEET, 30.48, 3)), L"100.000");
  EXPECT_EQ(text(utils::distByStyleToString(EDistUnits::KILOMETERS, 1234.5, -1)), L"1.2345");
  EXPECT_EQ(text(utils::distByStyleToString(EDistUnits::MILLIMETERS, 0.0125, 0)), L"12");
  EXPECT_EQ(text(utils::distByStyleToString(EDistUnits::USFEET, kNoValue, -1)), L"1.7976931348623157e+308");
}

TEST(DistanceConversion, AppendingWritesWhatTheStringFormAnswers) {
  const double values[] = {30.48, -0.0001, 1234.5, kNoValue, -kNoValue, std::nan(""), 0.125};
  const int decimals[] = {-1, 0, 2, 3, 150};
  std::wstring out = L"kept:";
  std::wstring expected = out;
  for (const double value : values) {
    for (const int places : decimals) {
      utils::appendDistByStyle(out, EDistUnits::IFEET, value, places);
      expected += text(utils::distByStyleToString(EDistUnits::IFEET, value, places));
      out += L';';
      expected += L';';
    }
  }
  EXPECT_EQ(out, expected);
}

// ---- Angle conversions --------------------------------------------------------------------------

TEST(AngleConversion, EachUnitUsesItsHostConversion) {
  EXPECT_EQ(utils::angleToDecDeg(std::numbers::pi, EAngleUnits::RADIANS), Rad2Deg(std::numbers::pi, false));
  EXPECT_EQ(utils::angleToDecDeg(100.0, EAngleUnits::GRADS_GONS), 90.0);
  EXPECT_EQ(utils::angleToDecDeg(1600.0, EAngleUnits::MILS), 90.0);
  EXPECT_EQ(utils::angleToDecDeg(12.3015, EAngleUnits::DDDMMSSS), DDDMMSS2Deg(12.3015));
  EXPECT_EQ(utils::angleToDecDeg(12.5, EAngleUnits::DECDEG), 12.5);

  EXPECT_EQ(utils::decDegToAngle(EAngleUnits::RADIANS, 180.0, 3), Deg2Rad(180.0, false));
  EXPECT_EQ(utils::decDegToAngle(EAngleUnits::GRADS_GONS, 90.0, 3), 100.0);
  EXPECT_EQ(utils::decDegToAngle(EAngleUnits::MILS, 90.0, 3), 1600.0);
  EXPECT_EQ(utils::decDegToAngle(EAngleUnits::DECDEG, 12.5, 3), 12.5);
}

TEST(AngleConversion, PackedDegreesRoundToThePrecision) {
  EXPECT_EQ(utils::decDegToAngle(EAngleUnits::DDDMMSSS, 12.5, 4), 12.3);
  EXPECT_EQ(utils::decDegToAngle(EAngleUnits::DDDMMSSS, 12.504166666, 4),
            Deg2DDDMMSS(12.504166666, 4, false));
  EXPECT_EQ(utils::decDegToAngle(EAngleUnits::DDDMMSSS, 10.99999999, 4), 11.0);
  EXPECT_EQ(text(utils::angleByStyleToString(EAngleUnits::DDDMMSSS, 12.5, 4)), L"12.3000");
  EXPECT_EQ(text(utils::angleByStyleToString(EAngleUnits::GRADS_GONS, 90.0, 2)), L"100.00");
  EXPECT_EQ(text(utils::angleByStyleToString(EAngleUnits::RADIANS, 180.0, -1)), L"3.141592653589793");
}

TEST(AngleConversion, DecimalDegreesAnyUnitsAndUnknownUnitsConvertNothing) {
  for (const int units : {3, 5, 6, 99, -1}) {
    SCOPED_TRACE(units);
    EXPECT_EQ(utils::angleToDecDeg(123.456, angleUnits(units)), 123.456);
    EXPECT_EQ(utils::decDegToAngle(angleUnits(units), 123.456, 4), 123.456);
  }
}

TEST(AngleConversion, NoValueMarkerPassesThroughEveryUnit) {
  for (int units = -1; units <= 7; ++units) {
    SCOPED_TRACE(units);
    EXPECT_EQ(utils::angleToDecDeg(kNoValue, angleUnits(units)), kNoValue);
    EXPECT_EQ(utils::decDegToAngle(angleUnits(units), kNoValue, 4), kNoValue);
    EXPECT_EQ(text(utils::angleByStyleToString(angleUnits(units), kNoValue, -1)), L"1.7976931348623157e+308");
  }
}

// ---- Temperature and pressure -------------------------------------------------------------------

TEST(TemperatureConversion, FahrenheitOnlyAndNoMarkerCheck) {
  EXPECT_EQ(utils::fromCelsius(0.0, ETemperatureUnits::FAHRENHEIT), 32.0);
  EXPECT_EQ(utils::fromCelsius(100.0, ETemperatureUnits::FAHRENHEIT), 212.0);
  EXPECT_EQ(utils::fromCelsius(-40.0, ETemperatureUnits::FAHRENHEIT), -40.0);
  EXPECT_EQ(utils::fromCelsius(21.5, ETemperatureUnits::CELSIUS), 21.5);
  EXPECT_EQ(utils::fromCelsius(21.5, static_cast<ETemperatureUnits>(7)), 21.5);
  EXPECT_EQ(utils::fromCelsius(kNoValue, ETemperatureUnits::FAHRENHEIT), kInfinity);
  EXPECT_EQ(utils::fromCelsius(kNoValue, ETemperatureUnits::CELSIUS), kNoValue);
}

TEST(PressureConversion, MillimetersAndInchesOfMercuryOnlyAndNoMarkerCheck) {
  EXPECT_EQ(utils::fromHpa(1013.25, EPressureUnits::MMHG), 1013.25 / 1.33322387415);
  EXPECT_NEAR(utils::fromHpa(1013.25, EPressureUnits::MMHG), 760.0, 1e-3);
  EXPECT_EQ(utils::fromHpa(1013.25, EPressureUnits::INHG), 1013.25 * 0.02953);
  EXPECT_EQ(utils::fromHpa(1013.25, EPressureUnits::HPA), 1013.25);
  EXPECT_EQ(utils::fromHpa(1013.25, EPressureUnits::MBAR), 1013.25);
  EXPECT_EQ(utils::fromHpa(1013.25, static_cast<EPressureUnits>(-3)), 1013.25);
  EXPECT_NE(utils::fromHpa(kNoValue, EPressureUnits::MMHG), kNoValue);
  EXPECT_NE(utils::fromHpa(kNoValue, EPressureUnits::INHG), kNoValue);
}

// ---- Writing numbers ----------------------------------------------------------------------------

TEST(DoubleToString, NegativeDecimalsWriteTheShortestForm) {
  EXPECT_EQ(text(utils::doubleToString(12.5, -1)), L"12.5");
  EXPECT_EQ(text(utils::doubleToString(0.1 + 0.2, -7)), L"0.30000000000000004");
  EXPECT_EQ(text(utils::doubleToString(1e-7, -1)), L"1e-07");
  EXPECT_EQ(text(utils::doubleToString(12.5, 0)), L"12");
  EXPECT_EQ(text(utils::doubleToString(12.5, 3)), L"12.500");
  EXPECT_EQ(text(utils::doubleToString(-0.0001, 3)), L"0.000");
  EXPECT_EQ(text(utils::intToString(-42)), L"-42");
  EXPECT_EQ(text(utils::intToString(std::numeric_limits<int>::min())), L"-2147483648");
}

TEST(DoubleToStringWithExp, WritesAZeroMantissaBelowOne) {
  String out;
  ASSERT_TRUE(utils::doubleToStringWithExp(1.0, out));
  EXPECT_EQ(text(out), L"0.10000000000000000E+01");
  ASSERT_TRUE(utils::doubleToStringWithExp(0.5, out));
  EXPECT_EQ(text(out), L"0.50000000000000000E+00");
  ASSERT_TRUE(utils::doubleToStringWithExp(123.456, out));
  EXPECT_EQ(text(out), L"0.12345600000000000E+03");
  ASSERT_TRUE(utils::doubleToStringWithExp(-0.05, out));
  EXPECT_EQ(text(out), L"-.50000000000000000E-01");
  ASSERT_TRUE(utils::doubleToStringWithExp(-1234.5, out));
  EXPECT_EQ(text(out), L"-.12345000000000000E+04");
  ASSERT_TRUE(utils::doubleToStringWithExp(123.4, out));
  EXPECT_EQ(text(out), L"0.12340000000000000E+03");
  ASSERT_TRUE(utils::doubleToStringWithExp(0.1 + 0.2, out));
  EXPECT_EQ(text(out), L"0.30000000000000004E+00");
  ASSERT_TRUE(utils::doubleToStringWithExp(0.001, out));
  EXPECT_EQ(text(out), L"0.10000000000000000E-02");
  EXPECT_EQ(out.GetLength(), 23);
}

TEST(DoubleToStringWithExp, ZeroOfEitherSignIsAllZeros) {
  String out;
  ASSERT_TRUE(utils::doubleToStringWithExp(0.0, out));
  EXPECT_EQ(text(out), L"0.00000000000000000E+00");
  ASSERT_TRUE(utils::doubleToStringWithExp(-0.0, out));
  EXPECT_EQ(text(out), L"0.00000000000000000E+00");
}

TEST(DoubleToStringWithExp, ThreeDigitExponentsWidenTheText) {
  String out;
  ASSERT_TRUE(utils::doubleToStringWithExp(kNoValue, out));
  EXPECT_EQ(text(out), L"0.17976931348623157E+309");
  ASSERT_TRUE(utils::doubleToStringWithExp(1e-100, out));
  EXPECT_EQ(text(out), L"0.10000000000000000E-99");
  ASSERT_TRUE(utils::doubleToStringWithExp(5e-324, out));
  EXPECT_EQ(text(out), L"0.50000000000000000E-323");
}

TEST(DoubleToStringWithExp, NanAndInfinitiesFailAndLeaveTheOutputAlone) {
  for (const double value : {std::nan(""), kInfinity, -kInfinity}) {
    String out(L"kept");
    EXPECT_FALSE(utils::doubleToStringWithExp(value, out));
    EXPECT_EQ(text(out), L"kept");
  }
}

TEST(CheckZeroVal, ZeroesMagnitudesBelowOneTenThousandth) {
  EXPECT_EQ(utils::checkZeroVal(0.00009999), 0.0);
  EXPECT_EQ(utils::checkZeroVal(-0.00005), 0.0);
  EXPECT_EQ(utils::checkZeroVal(0.0001), 0.0001);
  EXPECT_EQ(utils::checkZeroVal(-0.0001), -0.0001);
  EXPECT_EQ(utils::checkZeroVal(kNoValue), kNoValue);
  EXPECT_TRUE(std::isnan(utils::checkZeroVal(std::nan(""))));
}

// ---- stringToDouble -----------------------------------------------------------------------------

TEST(StringToDouble, ReadsANumberWithWhiteSpaceAround) {
  double value = 0.0;
  EXPECT_TRUE(utils::stringToDouble(String(L"  12.5  "), value));
  EXPECT_EQ(value, 12.5);
  EXPECT_TRUE(utils::stringToDouble(String(L"\t-3.25\t"), value));
  EXPECT_EQ(value, -3.25);
  EXPECT_TRUE(utils::stringToDouble(String(L"12.5\r\n"), value));
  EXPECT_EQ(value, 12.5);
  EXPECT_TRUE(utils::stringToDouble(String(L"\n+.5"), value));
  EXPECT_EQ(value, 0.5);
  EXPECT_TRUE(utils::stringToDouble(String(L"1e3"), value));
  EXPECT_EQ(value, 1000.0);
  EXPECT_TRUE(utils::stringToDouble(String(L"-2.5E-2"), value));
  EXPECT_EQ(value, -0.025);
}

TEST(StringToDouble, EmptyAndBlankTextsGiveTheMarker) {
  for (const wchar_t* blank : {L"", L" ", L"   ", L"\t", L"\r\n", L" \t\r\n "}) {
    double value = 0.0;
    EXPECT_TRUE(utils::stringToDouble(String(blank), value)) << blank;
    EXPECT_EQ(value, kNoValue);
  }
}

TEST(StringToDouble, PrintedInfinitiesAndNanGiveTheMarker) {
  for (const wchar_t* printed :
       {L"1.#INF", L"-1.#INF", L"-1.#IND", L"1.#QNAN", L"1.#INF00", L"12#anything"}) {
    double value = 0.0;
    EXPECT_TRUE(utils::stringToDouble(String(printed), value)) << printed;
    EXPECT_EQ(value, kNoValue);
  }
}

TEST(StringToDouble, ReadsNanAndInfinityAsTheCLibraryDoes) {
  double value = 0.0;
  EXPECT_TRUE(utils::stringToDouble(String(L"nan"), value));
  EXPECT_TRUE(std::isnan(value));
  EXPECT_TRUE(utils::stringToDouble(String(L"-inf"), value));
  EXPECT_EQ(value, -kInfinity);
  EXPECT_TRUE(utils::stringToDouble(String(L"1e999"), value));
  EXPECT_EQ(value, kInfinity);
  EXPECT_TRUE(utils::stringToDouble(String(L"-1e99999"), value));
  EXPECT_EQ(value, -kInfinity);
  EXPECT_TRUE(utils::stringToDouble(String(L"1e-999"), value));
  EXPECT_EQ(value, 0.0);
  EXPECT_TRUE(utils::stringToDouble(String(L"1.7976931348623157e308"), value));
  EXPECT_EQ(value, kNoValue);
}

TEST(StringToDouble, TrailingCharactersFailButKeepTheNumberRead) {
  double value = 0.0;
  EXPECT_FALSE(utils::stringToDouble(String(L"12.5m"), value));
  EXPECT_EQ(value, 12.5);
  EXPECT_FALSE(utils::stringToDouble(String(L"12,5"), value));
  EXPECT_EQ(value, 12.0);
  EXPECT_FALSE(utils::stringToDouble(String(L"12 5"), value));
  EXPECT_FALSE(utils::stringToDouble(String(L"12.5\v"), value));  // only blanks, tabs, CR and LF may follow
  EXPECT_FALSE(utils::stringToDouble(String(L"1.5 #"), value));   // the # must follow the number at once
}

TEST(StringToDouble, TextsWithoutANumberFailAndLeaveTheValueAlone) {
  for (const wchar_t* bad : {L"abc", L"#", L"-", L".", L"\v", L",5", L"m12"}) {
    double value = 7.0;
    EXPECT_FALSE(utils::stringToDouble(String(bad), value)) << bad;
    EXPECT_EQ(value, 7.0);
  }
}

TEST(StringToDouble, TheThirdArgumentChangesNothing) {
  double a = 0.0;
  double b = 0.0;
  EXPECT_EQ(utils::stringToDouble(String(L"4.5"), a, true), utils::stringToDouble(String(L"4.5"), b, false));
  EXPECT_EQ(a, b);
  EXPECT_FALSE(utils::stringToDouble(String(L"4.5x"), a, true));
}

TEST(StringToDouble, IgnoresACommaDecimalLocale) {
  const dex_test::CommaLocale comma;
  if (!comma.active()) GTEST_SKIP() << comma.reason();
  double value = 0.0;
  EXPECT_TRUE(utils::stringToDouble(String(L"12.5"), value));
  EXPECT_EQ(value, 12.5);
  EXPECT_FALSE(utils::stringToDouble(String(L"12,5"), value));
  EXPECT_EQ(utils::stringByStyleToDist(EDistUnits::METERS, String(L"12.5xyz")), 12.5);
  EXPECT_EQ(utils::stringByStyleToAngle(EAngleUnits::DECDEG, String(L"0.25")), 0.25);
  EXPECT_EQ(text(utils::doubleToString(12.5, 2)), L"12.50");
  String out;
  ASSERT_TRUE(utils::doubleToStringWithExp(123.456, out));
  EXPECT_EQ(text(out), L"0.12345600000000000E+03");
}

// ---- Reading distances --------------------------------------------------------------------------

TEST(StringByStyleToDist, WithoutVerdictReadsTheLeadingNumber) {
  EXPECT_EQ(utils::stringByStyleToDist(EDistUnits::IFEET, String(L"100")), 30.48);
  EXPECT_EQ(utils::stringByStyleToDist(EDistUnits::IFEET, String(L"  100ft and more")), 30.48);
  EXPECT_EQ(utils::stringByStyleToDist(EDistUnits::KILOMETERS, String(L"1.5,7")), 1500.0);
  EXPECT_EQ(utils::stringByStyleToDist(EDistUnits::KILOMETERS, String(L"abc")), 0.0);
  EXPECT_EQ(utils::stringByStyleToDist(EDistUnits::KILOMETERS, String(L"")), 0.0);
  EXPECT_EQ(utils::stringByStyleToDist(EDistUnits::KILOMETERS, String(L"   ")), 0.0);
  EXPECT_EQ(utils::stringByStyleToDist(EDistUnits::USFEET, String(L"1.7976931348623157e308")), kNoValue);
  EXPECT_EQ(utils::stringByStyleToDist(distUnits(99), String(L"2.5")), 2.5);
}

TEST(StringByStyleToDist, WithVerdictAcceptsOnlyAWholeNumber) {
  bool ok = false;
  EXPECT_EQ(utils::stringByStyleToDist(EDistUnits::IFEET, String(L" 100 "), ok), 30.48);
  EXPECT_TRUE(ok);
  EXPECT_EQ(utils::stringByStyleToDist(EDistUnits::IFEET, String(L"100ft"), ok), 0.0);
  EXPECT_FALSE(ok);
  EXPECT_EQ(utils::stringByStyleToDist(EDistUnits::IFEET, String(L"abc"), ok), 0.0);
  EXPECT_FALSE(ok);
  EXPECT_EQ(utils::stringByStyleToDist(EDistUnits::IFEET, String(L""), ok), kNoValue);
  EXPECT_TRUE(ok);
  EXPECT_EQ(utils::stringByStyleToDist(EDistUnits::KILOMETERS, String(L"1.#INF"), ok), kNoValue);
  EXPECT_TRUE(ok);
}

TEST(StringByStyleToDistEx, TellsEmptyInvalidAndValidTextsApart) {
  EFlagFltValues flag = EFlagFltValues::VALID_NUMBER;
  EXPECT_EQ(utils::stringByStyleToDistEx(EDistUnits::IFEET, String(L""), flag), 0.0);
  EXPECT_EQ(flag, EFlagFltValues::EMPTY_TEXT);

  EXPECT_EQ(utils::stringByStyleToDistEx(EDistUnits::IFEET, String(L"abc"), flag), 0.0);
  EXPECT_EQ(flag, EFlagFltValues::NOT_A_NUMBER);

  EXPECT_EQ(utils::stringByStyleToDistEx(EDistUnits::IFEET, String(L"3.2808"), flag), IFeet2Meter(3.2808));
  EXPECT_EQ(flag, EFlagFltValues::VALID_NUMBER);

  // Blank is not empty: the reader sees it and answers the marker.
  EXPECT_EQ(utils::stringByStyleToDistEx(EDistUnits::IFEET, String(L"  "), flag), kNoValue);
  EXPECT_EQ(flag, EFlagFltValues::VALID_NUMBER);
}

// ---- Reading angles -----------------------------------------------------------------------------

TEST(StringByStyleToAngle, ReadsTheLeadingNumberInTheUnit) {
  EXPECT_EQ(utils::stringByStyleToAngle(EAngleUnits::GRADS_GONS, String(L"100")), 90.0);
  EXPECT_EQ(utils::stringByStyleToAngle(EAngleUnits::GRADS_GONS, String(L"200g")), 180.0);
  EXPECT_EQ(utils::stringByStyleToAngle(EAngleUnits::DDDMMSSS, String(L"12.3")), 12.5);
  EXPECT_EQ(utils::stringByStyleToAngle(EAngleUnits::MILS, String(L"abc")), 0.0);
  EXPECT_EQ(utils::stringByStyleToAngle(EAngleUnits::RADIANS, String(L"")), 0.0);
  EXPECT_EQ(utils::stringByStyleToAngle(EAngleUnits::RADIANS, String(L"1.7976931348623157e308")), kNoValue);
  EXPECT_EQ(utils::stringByStyleToAngle(angleUnits(42), String(L"3.5")), 3.5);
}

}  // namespace
