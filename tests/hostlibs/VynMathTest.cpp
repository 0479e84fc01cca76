#include "hostlibs/vynmath.h"

#include <gtest/gtest.h>

#include <cmath>
#include <limits>
#include <numbers>

#include "hostlibs/VynFormats.h"

namespace {

constexpr double kNoValue = std::numeric_limits<double>::max();
constexpr double kNaN = std::numeric_limits<double>::quiet_NaN();
constexpr double kInfinity = std::numeric_limits<double>::infinity();

double dms(double degrees, double minutes, double seconds) {
  return degrees + minutes / 60.0 + seconds / 3600.0;
}

std::wstring packedText(double degrees, int decimals) {
  return std::wstring(vyn_formats::DoubleToString(Deg2DDDMMSS(degrees, decimals, false), decimals).view());
}

// ---- Angle units --------------------------------------------------------------------------------

TEST(AngleUnits, ConvertRoundValuesExactly) {
  EXPECT_EQ(Deg2Rad(180.0), std::numbers::pi);
  EXPECT_EQ(Rad2Deg(std::numbers::pi), 180.0);
  EXPECT_EQ(Deg2Grad(90.0), 100.0);
  EXPECT_EQ(Grad2Deg(100.0), 90.0);
  EXPECT_EQ(Deg2Mil(90.0), 1600.0);
  EXPECT_EQ(Mil2Deg(3200.0), 180.0);
}

TEST(AngleUnits, RoundTripThroughEveryUnit) {
  for (const double degrees : {0.1, 12.345678, 89.999999, 359.123456789, -45.5}) {
    EXPECT_NEAR(Rad2Deg(Deg2Rad(degrees)), degrees, 1e-12);
    EXPECT_NEAR(Grad2Deg(Deg2Grad(degrees)), degrees, 1e-12);
    EXPECT_NEAR(Mil2Deg(Deg2Mil(degrees)), degrees, 1e-12);
  }
}

TEST(AngleUnits, NormalizeFlagWrapsTheResultIntoOneTurn) {
  EXPECT_EQ(Deg2Grad(-90.0, true), 300.0);
  EXPECT_EQ(Deg2Mil(450.0, true), 1600.0);
  EXPECT_EQ(Grad2Deg(500.0, true), 90.0);
  EXPECT_DOUBLE_EQ(Rad2Deg(-std::numbers::pi / 2.0, true), 270.0);
  EXPECT_DOUBLE_EQ(Deg2Rad(-90.0, true), 1.5 * std::numbers::pi);
  EXPECT_EQ(Deg2Grad(-90.0, false), -100.0);
}

TEST(AngleUnits, NonFiniteInputsComeBackNonFinite) {
  EXPECT_TRUE(std::isnan(Deg2Rad(kNaN)));
  EXPECT_TRUE(std::isnan(Mil2Deg(kNaN, true)));
  EXPECT_EQ(Deg2Grad(kInfinity, true), kInfinity);
}

// ---- toRange ------------------------------------------------------------------------------------

TEST(ToRange, WrapsValuesPeriodicallyIntoTheHalfOpenRange) {
  EXPECT_EQ(toRange(-90.0, 0.0, 360.0), 270.0);
  EXPECT_EQ(toRange(720.0, 0.0, 360.0), 0.0);
  EXPECT_EQ(toRange(360.0, 0.0, 360.0), 0.0);
  EXPECT_EQ(toRange(540.0, -180.0, 180.0), -180.0);
  EXPECT_EQ(toRange(190.0, -180.0, 180.0), -170.0);
  EXPECT_EQ(toRange(179.5, -180.0, 180.0), 179.5);
}

TEST(ToRange, NeverAnswersTheUpperBound) {
  EXPECT_EQ(toRange(-1e-17, 0.0, 360.0), 0.0);
}

TEST(ToRange, ReturnsTheValueForAnInvalidRangeOrNonFiniteInput) {
  EXPECT_EQ(toRange(400.0, 360.0, 0.0), 400.0);
  EXPECT_EQ(toRange(400.0, 10.0, 10.0), 400.0);
  EXPECT_EQ(toRange(kInfinity, 0.0, 360.0), kInfinity);
  EXPECT_TRUE(std::isnan(toRange(kNaN, 0.0, 360.0)));
  EXPECT_EQ(toRange(5.0, 0.0, kInfinity), 5.0);
}

// ---- Packed degrees-minutes-seconds -------------------------------------------------------------

TEST(PackedAngle, TwelveAndAHalfDegreesPacksAsTwelveThirty) {
  EXPECT_EQ(Deg2DDDMMSS(12.5, 12, false), 12.3);
  EXPECT_EQ(Deg2DDDMMSS(12.5, 9, false), 12.3);
  EXPECT_EQ(Deg2DDDMMSS(12.5, 4, false), 12.3);
  EXPECT_EQ(DDDMMSS2Deg(12.3), 12.5);
}

TEST(PackedAngle, FixedTextShowsExactlyThePackedDigits) {
  EXPECT_EQ(packedText(12.5, 12), L"12.300000000000");
  EXPECT_EQ(packedText(12.5, 9), L"12.300000000");
  EXPECT_EQ(packedText(12.5, 4), L"12.3000");
  EXPECT_EQ(packedText(75.25, 9), L"75.150000000");
  EXPECT_EQ(packedText(5.5, 9), L"5.300000000");
  EXPECT_EQ(packedText(-0.5, 4), L"-0.3000");
  EXPECT_EQ(packedText(dms(12, 3, 5.5), 5), L"12.03055");
  EXPECT_EQ(packedText(12.9999999, 12), L"12.595999964000");
  EXPECT_EQ(packedText(dms(359, 59, 59.12345678), 12), L"359.595912345678");
}

TEST(PackedAngle, RoundingCarriesSecondsIntoMinutesAndMinutesIntoDegrees) {
  EXPECT_EQ(Deg2DDDMMSS(dms(10, 59, 59.99999), 4, false), 11.0);
  EXPECT_EQ(Deg2DDDMMSS(12.9999999, 4, false), 13.0);
  EXPECT_EQ(Deg2DDDMMSS(dms(12, 59, 59.5), 4, false), 13.0);
  EXPECT_EQ(Deg2DDDMMSS(dms(12, 59, 59.5), 5, false), 12.59595);
  EXPECT_EQ(Deg2DDDMMSS(dms(12, 30, 59.9999), 6, false), 12.31);
  EXPECT_EQ(Deg2DDDMMSS(dms(359, 59, 59.9), 4, false), 360.0);
}

TEST(PackedAngle, FewerThanFourDecimalsRoundToTensOfSecondsMinutesAndDegrees) {
  const double angle = dms(12, 30, 16);
  EXPECT_EQ(Deg2DDDMMSS(angle, 3, false), 12.302);
  EXPECT_EQ(Deg2DDDMMSS(angle, 2, false), 12.3);
  EXPECT_EQ(Deg2DDDMMSS(angle, 1, false), 12.3);
  EXPECT_EQ(Deg2DDDMMSS(angle, 0, false), 13.0);
  EXPECT_EQ(Deg2DDDMMSS(dms(12, 35, 0), 1, false), 12.4);
  EXPECT_EQ(Deg2DDDMMSS(dms(12, 55, 0), 1, false), 13.0);
  EXPECT_EQ(Deg2DDDMMSS(dms(12, 59, 55), 3, false), 13.0);
}

TEST(PackedAngle, HalvesRoundAwayFromZeroDespiteBinaryFractions) {
  EXPECT_EQ(Deg2DDDMMSS(dms(12, 30, 30.5), 4, false), 12.3031);
  EXPECT_EQ(Deg2DDDMMSS(-dms(12, 30, 30.5), 4, false), -12.3031);
  EXPECT_EQ(Deg2DDDMMSS(dms(12, 30, 15), 3, false), 12.302);
}

TEST(PackedAngle, NegativeAnglesKeepTheirSignOnTheWholeValue) {
  EXPECT_EQ(Deg2DDDMMSS(-75.25, 9, false), -75.15);
  EXPECT_EQ(Deg2DDDMMSS(-0.5, 4, false), -0.3);
  EXPECT_EQ(DDDMMSS2Deg(-0.3), -0.5);
  EXPECT_EQ(DDDMMSS2Deg(-75.15), -75.25);
}

TEST(PackedAngle, ATinyNegativeAngleRoundsToPositiveZero) {
  const double packed = Deg2DDDMMSS(-1e-9, 4, false);
  EXPECT_EQ(packed, 0.0);
  EXPECT_FALSE(std::signbit(packed));
}

TEST(PackedAngle, ReadsTheDigitsAsTyped) {
  EXPECT_NEAR(DDDMMSS2Deg(12.03055), 12.0515277777777778, 1e-12);
  EXPECT_EQ(DDDMMSS2Deg(0.0001), 1.0 / 3600.0);
  EXPECT_EQ(DDDMMSS2Deg(45.0), 45.0);
  EXPECT_EQ(DDDMMSS2Deg(0.0), 0.0);
}

TEST(PackedAngle, TakesMinutesOfSixtyOrMoreAtFaceValue) {
  EXPECT_EQ(DDDMMSS2Deg(12.75), 13.25);
}

TEST(PackedAngle, PackedValuesRoundTripExactly) {
  const struct {
    double packed;
    int decimals;
  } cases[] = {{12.3, 1},           {0.0001, 4},   {359.5959, 4},         {45.0, 0},
               {123.455989, 6},     {0.000001, 6}, {-75.15, 4},           {12.30155, 5},
               {89.5959999999, 10}, {-0.0030, 4},  {179.000000000001, 12}};
  for (const auto& c : cases) {
    EXPECT_EQ(Deg2DDDMMSS(DDDMMSS2Deg(c.packed), c.decimals, false), c.packed) << c.packed;
  }
}

TEST(PackedAngle, DecimalDegreesRoundTripToTheResolutionOfTheDecimals) {
  for (const double degrees : {12.5, 0.1, 33.333333, 359.999, -122.987654321}) {
    EXPECT_NEAR(DDDMMSS2Deg(Deg2DDDMMSS(degrees, 12, false)), degrees, 1e-11) << degrees;
  }
}

TEST(PackedAngle, NormalizeFlagWrapsIntoOneTurnBeforeAndAfterRounding) {
  EXPECT_EQ(Deg2DDDMMSS(-90.0, 4, true), 270.0);
  EXPECT_EQ(Deg2DDDMMSS(725.5, 2, true), 5.3);
  EXPECT_EQ(Deg2DDDMMSS(359.99999999, 4, true), 0.0);
}

TEST(PackedAngle, DecimalsAreTakenIntoZeroToFifteen) {
  EXPECT_EQ(Deg2DDDMMSS(12.5, -3, false), 13.0);
  EXPECT_EQ(Deg2DDDMMSS(dms(1, 2, 3.123456789), 40, false), Deg2DDDMMSS(dms(1, 2, 3.123456789), 15, false));
}

TEST(PackedAngle, LargeAnglesStayExactBeyondTheIntegerPath) {
  EXPECT_EQ(Deg2DDDMMSS(10000.5, 12, false), 10000.3);
  EXPECT_EQ(Deg2DDDMMSS(1e20, 4, false), 1e20);
}

TEST(PackedAngle, NonFiniteInputsAndTheNoValueMarkerPassThrough) {
  EXPECT_TRUE(std::isnan(Deg2DDDMMSS(kNaN, 4, false)));
  EXPECT_TRUE(std::isnan(DDDMMSS2Deg(kNaN)));
  EXPECT_EQ(Deg2DDDMMSS(-kInfinity, 4, false), -kInfinity);
  EXPECT_EQ(DDDMMSS2Deg(kInfinity), kInfinity);
  EXPECT_EQ(Deg2DDDMMSS(kNoValue, 12, false), kNoValue);
  EXPECT_EQ(DDDMMSS2Deg(kNoValue), kNoValue);
}

// ---- Feet ---------------------------------------------------------------------------------------

TEST(Feet, OneMeterInUsSurveyAndInternationalFeet) {
  EXPECT_NEAR(Meter2USFeet(1.0), 3.280833333, 1e-9);
  EXPECT_NEAR(Meter2IFeet(1.0), 3.2808398950, 1e-10);
  EXPECT_EQ(Meter2USFeet(1200.0), 3937.0);
  EXPECT_EQ(USFeet2Meter(3937.0), 1200.0);
  EXPECT_EQ(IFeet2Meter(1.0), 0.3048);
  EXPECT_EQ(Meter2IFeet(0.3048), 1.0);
}

TEST(Feet, ConversionsRoundTrip) {
  for (const double meters : {0.001, 1.0, 123.456, -98765.4321}) {
    EXPECT_NEAR(USFeet2Meter(Meter2USFeet(meters)), meters, 1e-12 * std::max(1.0, std::abs(meters)));
    EXPECT_NEAR(IFeet2Meter(Meter2IFeet(meters)), meters, 1e-12 * std::max(1.0, std::abs(meters)));
  }
}

TEST(FeetAndInches, PacksFeetThenTwoDigitsOfInches) {
  EXPECT_EQ(Meter2FFFII(IFeet2Meter(5.0 + 6.5 / 12.0), false), 5.065);
  EXPECT_EQ(Meter2FFFII(IFeet2Meter(3.0 + 11.0 / 12.0), false), 3.11);
  EXPECT_EQ(Meter2FFFII(1.0, true), 3.0337);
  EXPECT_NEAR(Meter2FFFII(1.0, false), 3.0337007874, 1e-10);
  EXPECT_EQ(Meter2FFFII(0.0, true), 0.0);
}

TEST(FeetAndInches, ReadsThePackedDigits) {
  EXPECT_NEAR(FFFII2Meter(5.065, false), IFeet2Meter(5.0 + 6.5 / 12.0), 1e-12);
  EXPECT_NEAR(FFFII2Meter(3.0337, true), 1.0, 1e-12);
  EXPECT_NEAR(FFFII2Meter(5.1, false), IFeet2Meter(5.0 + 10.0 / 12.0), 1e-12);
  EXPECT_NEAR(FFFII2Meter(2.0, true), USFeet2Meter(2.0), 1e-15);
}

TEST(FeetAndInches, TwelveInchesAfterRoundingCarryIntoTheNextFoot) {
  EXPECT_EQ(Meter2FFFII(IFeet2Meter(5.0 + 11.9999999999 / 12.0), false), 6.0);
  EXPECT_EQ(Meter2FFFII(-IFeet2Meter(5.0 + 11.9999999999 / 12.0), false), -6.0);
}

TEST(FeetAndInches, NegativeLengthsKeepTheSignOnTheWholeValue) {
  EXPECT_EQ(Meter2FFFII(-IFeet2Meter(5.0 + 6.5 / 12.0), false), -5.065);
  EXPECT_NEAR(FFFII2Meter(-5.065, false), -IFeet2Meter(5.0 + 6.5 / 12.0), 1e-12);
}

TEST(FeetAndInches, PackedValuesRoundTripExactly) {
  for (const bool us : {true, false}) {
    for (const double packed : {0.01, 1.0, 12.115, 100.065, 5.0000001, -7.0912}) {
      EXPECT_EQ(Meter2FFFII(FFFII2Meter(packed, us), us), packed)
          << packed << (us ? " US" : " international");
    }
  }
}

TEST(FeetAndInches, NonFiniteInputsComeBackNonFinite) {
  EXPECT_TRUE(std::isnan(Meter2FFFII(kNaN, true)));
  EXPECT_TRUE(std::isnan(FFFII2Meter(kNaN, false)));
  EXPECT_EQ(Meter2FFFII(kInfinity, false), kInfinity);
}

// ---- Points and CMathAngle ----------------------------------------------------------------------

TEST(AbstractPoint, ComparesAllCoordinatesExactly) {
  using vyn_math::TAbstractPoint;
  using vyn_math::TAbstractPoint3;
  EXPECT_EQ(TAbstractPoint<double>(1.0, 2.0), TAbstractPoint<double>(1.0, 2.0));
  EXPECT_NE(TAbstractPoint<double>(1.0, 2.0), TAbstractPoint<double>(1.0, 2.0000001));
  EXPECT_EQ(TAbstractPoint3<double>(), TAbstractPoint3<double>(0.0, 0.0, 0.0));
  EXPECT_NE(TAbstractPoint3<double>(1.0, 2.0, 3.0), TAbstractPoint3<double>(1.0, 2.0, 3.5));
  EXPECT_EQ(TAbstractPoint3<int>(1, 2, 3).z, 3);
}

TEST(CMathAngle, NormalisesIntoOneTurn) {
  EXPECT_EQ(CMathAngle(-90.0).getDeg(), 270.0);
  EXPECT_EQ(CMathAngle(720.0).getDeg(), 0.0);
  EXPECT_EQ(CMathAngle(360.0).getDeg(), 0.0);
  EXPECT_EQ(CMathAngle(-720.5).getDeg(), 359.5);
  EXPECT_EQ(CMathAngle().getDeg(), 0.0);
  EXPECT_EQ(CMathAngle(180.0).getRad(), std::numbers::pi);

  CMathAngle angle(10.0);
  angle.setDeg(-10.0);
  EXPECT_EQ(angle.getDeg(), 350.0);
}

TEST(CMathAngle, KeepsANonFiniteAngleAsNaN) {
  EXPECT_TRUE(std::isnan(CMathAngle(kInfinity).getDeg()));
  EXPECT_TRUE(std::isnan(CMathAngle(kNaN).getDeg()));

  vyn_math::TAbstractPoint<double> out;
  CMathAngle(kNaN).RotatePoint({0.0, 0.0}, {1.0, 0.0}, out);
  EXPECT_TRUE(std::isnan(out.x));
  EXPECT_TRUE(std::isnan(out.y));
}

TEST(CMathAngle, RotatesCounterClockwiseAndExactlyByQuarterTurns) {
  using Point = vyn_math::TAbstractPoint<double>;
  Point out;
  CMathAngle(90.0).RotatePoint({0.0, 0.0}, {1.0, 0.0}, out);
  EXPECT_EQ(out, Point(0.0, 1.0));
  CMathAngle(90.0).RotatePoint({10.0, 20.0}, {11.0, 20.0}, out);
  EXPECT_EQ(out, Point(10.0, 21.0));
  CMathAngle(180.0).RotatePoint({0.0, 0.0}, {1.0, 2.0}, out);
  EXPECT_EQ(out, Point(-1.0, -2.0));
  CMathAngle(-90.0).RotatePoint({0.0, 0.0}, {1.0, 0.0}, out);
  EXPECT_EQ(out, Point(0.0, -1.0));
}

TEST(CMathAngle, RotatesByAnyAngle) {
  vyn_math::TAbstractPoint<double> out;
  CMathAngle(45.0).RotatePoint({1.0, 1.0}, {2.0, 1.0}, out);
  EXPECT_NEAR(out.x, 1.0 + std::sqrt(0.5), 1e-15);
  EXPECT_NEAR(out.y, 1.0 + std::sqrt(0.5), 1e-15);
  CMathAngle(210.0).RotatePoint({0.0, 0.0}, {2.0, 0.0}, out);
  EXPECT_NEAR(out.x, -std::sqrt(3.0), 1e-15);
  EXPECT_NEAR(out.y, -1.0, 1e-15);
}

TEST(CMathAngle, RotatesAPointInPlace) {
  vyn_math::TAbstractPoint<double> point(3.0, 4.0);
  CMathAngle(270.0).RotatePoint({1.0, 1.0}, point, point);
  EXPECT_EQ(point, vyn_math::TAbstractPoint<double>(4.0, -1.0));
}

}  // namespace
