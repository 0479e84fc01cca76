#include "ieUtils/IEUtilsGeometry.h"

#include <gtest/gtest.h>

#include <array>
#include <climits>
#include <cmath>
#include <limits>
#include <numbers>
#include <vector>

#include "ieObjects/IENoValue.h"
#include "support/LogCapture.h"

namespace {

using vyn::ie::DexPosition3D;
namespace utils = vyn::ie::utils;
namespace math = vyn::ie::math;

const std::wstring kUtilsSource = L"ieUtils\\IEUtils";
constexpr double kNaN = std::numeric_limits<double>::quiet_NaN();
constexpr double kInfinity = std::numeric_limits<double>::infinity();
constexpr double kPi = std::numbers::pi;

double degrees(double value) {
  return value * kPi / 180.0;
}

std::vector<DexPosition3D> positions(std::initializer_list<std::array<double, 2>> points) {
  std::vector<DexPosition3D> result;
  for (const auto& point : points)
    result.emplace_back(point[0], point[1], 0.0);
  return result;
}

void expectPlane(const DexPosition3D& position, double x, double y) {
  EXPECT_EQ(position.x, x);
  EXPECT_EQ(position.y, y);
}

}  // namespace

// ---- Plane direction and distance ---------------------------------------------------------------

TEST(Ctt, GivesTheDirectionFromTheFirstPointInRadians) {
  const double a[2] = {1.0, 1.0};
  const double east[2] = {3.0, 1.0};
  const double north[2] = {1.0, 4.0};
  const double southWest[2] = {0.0, 0.0};
  EXPECT_DOUBLE_EQ(utils::ctt(a, east), 0.0);
  EXPECT_DOUBLE_EQ(utils::ctt(a, north), kPi / 2);
  EXPECT_DOUBLE_EQ(utils::ctt(a, southWest), -3 * kPi / 4);
}

TEST(Dtt, GivesThePlaneDistance) {
  const double a[2] = {1.0, 2.0};
  const double b[2] = {4.0, 6.0};
  EXPECT_DOUBLE_EQ(utils::dtt(a, b), 5.0);
  EXPECT_DOUBLE_EQ(utils::dtt(b, a), 5.0);
  EXPECT_DOUBLE_EQ(utils::dtt(a, a), 0.0);
}

TEST(CttAndDtt, NullPointsGiveZero) {
  const double a[2] = {1.0, 2.0};
  EXPECT_EQ(utils::ctt(nullptr, a), 0.0);
  EXPECT_EQ(utils::ctt(a, nullptr), 0.0);
  EXPECT_EQ(utils::dtt(nullptr, a), 0.0);
  EXPECT_EQ(utils::dtt(a, nullptr), 0.0);
}

// ---- Arc by three points ------------------------------------------------------------------------

TEST(ArcBy3Points, FindsTheCentreRadiusAndDirectionsTowardTheCentre) {
  const double p1[2] = {0.0, 0.0};
  const double p2[2] = {2.0, 0.0};
  const double p3[2] = {2.0, 2.0};
  double centre[3] = {9.0, 9.0, 9.0};
  double radius = 0.0;
  double angle2 = 0.0;
  double angle3 = 0.0;
  ASSERT_TRUE(utils::arcBy3Points(p1, p2, p3, centre, radius, angle2, angle3));
  EXPECT_DOUBLE_EQ(centre[0], 1.0);
  EXPECT_DOUBLE_EQ(centre[1], 1.0);
  EXPECT_EQ(centre[2], 0.0);
  EXPECT_DOUBLE_EQ(radius, std::sqrt(2.0));
  EXPECT_DOUBLE_EQ(angle2, 3 * kPi / 4);   // from (2, 0) toward (1, 1)
  EXPECT_DOUBLE_EQ(angle3, -3 * kPi / 4);  // from (2, 2) toward (1, 1)
}

TEST(ArcBy3Points, RecoversAnyCircleWhateverTheTurnOfThePoints) {
  const double cx = -1234.5;
  const double cy = 678.25;
  const double r = 42.0;
  for (const double sign : {1.0, -1.0}) {
    const double p1[2] = {cx + r * std::cos(0.3), cy + sign * r * std::sin(0.3)};
    const double p2[2] = {cx + r * std::cos(1.9), cy + sign * r * std::sin(1.9)};
    const double p3[2] = {cx + r * std::cos(4.0), cy + sign * r * std::sin(4.0)};
    double centre[3];
    double radius = 0.0;
    double angle2 = 0.0;
    double angle3 = 0.0;
    ASSERT_TRUE(utils::arcBy3Points(p1, p2, p3, centre, radius, angle2, angle3));
    EXPECT_NEAR(centre[0], cx, 1e-9);
    EXPECT_NEAR(centre[1], cy, 1e-9);
    EXPECT_NEAR(radius, r, 1e-9);
    EXPECT_NEAR(angle2, utils::ctt(p2, centre), 1e-15);
    EXPECT_NEAR(angle3, utils::ctt(p3, centre), 1e-15);
  }
}

TEST(ArcBy3Points, RefusesPointsWithoutACircleAndWritesNothing) {
  const double p1[2] = {0.0, 0.0};
  const double p2[2] = {1.0, 1.0};
  const double onLine[2] = {5.0, 5.0};
  const double nan[2] = {kNaN, 1.0};
  const double infinite[2] = {kInfinity, 1.0};
  // Not exactly collinear, but the centre lies beyond the range of a double.
  const double far1[2] = {0.0, 0.0};
  const double far2[2] = {1.0, 0.0};
  const double far3[2] = {2.0, 1e-320};
  double centre[3] = {7.0, 7.0, 7.0};
  double radius = 7.0;
  double angle2 = 7.0;
  double angle3 = 7.0;
  EXPECT_FALSE(utils::arcBy3Points(p1, p2, onLine, centre, radius, angle2, angle3));
  EXPECT_FALSE(utils::arcBy3Points(p1, p1, p2, centre, radius, angle2, angle3));
  EXPECT_FALSE(utils::arcBy3Points(p1, p2, p1, centre, radius, angle2, angle3));
  EXPECT_FALSE(utils::arcBy3Points(p1, p2, nan, centre, radius, angle2, angle3));
  EXPECT_FALSE(utils::arcBy3Points(infinite, p1, p2, centre, radius, angle2, angle3));
  EXPECT_FALSE(utils::arcBy3Points(far1, far2, far3, centre, radius, angle2, angle3));
  EXPECT_EQ(centre[0], 7.0);
  EXPECT_EQ(centre[1], 7.0);
  EXPECT_EQ(centre[2], 7.0);
  EXPECT_EQ(radius, 7.0);
  EXPECT_EQ(angle2, 7.0);
  EXPECT_EQ(angle3, 7.0);
}

TEST(ArcBy3Points, RefusesNullPointers) {
  const double p1[2] = {0.0, 0.0};
  const double p2[2] = {2.0, 0.0};
  const double p3[2] = {2.0, 2.0};
  double centre[3];
  double radius = 0.0;
  double angle2 = 0.0;
  double angle3 = 0.0;
  EXPECT_FALSE(utils::arcBy3Points(nullptr, p2, p3, centre, radius, angle2, angle3));
  EXPECT_FALSE(utils::arcBy3Points(p1, nullptr, p3, centre, radius, angle2, angle3));
  EXPECT_FALSE(utils::arcBy3Points(p1, p2, nullptr, centre, radius, angle2, angle3));
  EXPECT_FALSE(utils::arcBy3Points(p1, p2, p3, nullptr, radius, angle2, angle3));
}

// ---- Heights and scale --------------------------------------------------------------------------

TEST(GetElevationOnLine, InterpolatesAndExtrapolatesLinearly) {
  EXPECT_DOUBLE_EQ(utils::getElevationOnLine(0, 10, 10, 20, 5), 15.0);
  EXPECT_DOUBLE_EQ(utils::getElevationOnLine(0, 10, 10, 20, 20), 30.0);
  EXPECT_DOUBLE_EQ(utils::getElevationOnLine(10, 20, 0, 10, -10), 0.0);
}

TEST(GetElevationOnLine, AVerticalLineGivesTheFirstHeight) {
  EXPECT_EQ(utils::getElevationOnLine(3, 10, 3, 20, 5), 10.0);
  EXPECT_EQ(utils::getElevationOnLine(3, 10, 3, 20, 3), 10.0);
}

TEST(GetEllToGroundScale, UsesTheMeanEarthRadiusForZeroWithoutLogging) {
  const dex_test::LogCapture log;
  EXPECT_DOUBLE_EQ(utils::getEllToGroundScale(100, 0), 100 / 6371000.0 + 1);
  EXPECT_DOUBLE_EQ(utils::getEllToGroundScale(-50, 6378137), -50 / 6378137.0 + 1);
  EXPECT_EQ(log.size(), 0u);
}

TEST(GetEllToGroundScale, LogsImplausibleRadiiAndStillUsesThem) {
  const dex_test::LogCapture log;
  EXPECT_DOUBLE_EQ(utils::getEllToGroundScale(100, 5000000), 100 / 5000000.0 + 1);
  EXPECT_DOUBLE_EQ(utils::getEllToGroundScale(100, 6000000), 100 / 6000000.0 + 1);
  // At or below 1 the mean radius takes over, but the value is still reported.
  EXPECT_DOUBLE_EQ(utils::getEllToGroundScale(100, 1), 100 / 6371000.0 + 1);
  EXPECT_DOUBLE_EQ(utils::getEllToGroundScale(100, -7), 100 / 6371000.0 + 1);
  EXPECT_EQ(log.count(kUtilsSource, utils::kLogLineUnusualEarthRadius), 4);
  EXPECT_EQ(log.size(), 4u);
  EXPECT_TRUE(log.records().front().message.empty());
}

TEST(GetEllToGroundScale, ANaNRadiusIsLoggedAndReplacedByTheMeanRadius) {
  const dex_test::LogCapture log;
  EXPECT_DOUBLE_EQ(utils::getEllToGroundScale(100, kNaN), 100 / 6371000.0 + 1);
  EXPECT_EQ(log.count(kUtilsSource, utils::kLogLineUnusualEarthRadius), 1);
}

// ---- Numbers ------------------------------------------------------------------------------------

TEST(IsInBorders, IncludesBothEnds) {
  EXPECT_TRUE(utils::isInBorders(5, 5, 5));
  EXPECT_TRUE(utils::isInBorders(1, 1, 2));
  EXPECT_TRUE(utils::isInBorders(2, 1, 2));
  EXPECT_FALSE(utils::isInBorders(0.999, 1, 2));
  EXPECT_FALSE(utils::isInBorders(1.5, 2, 1));
  EXPECT_FALSE(utils::isInBorders(kNaN, 1, 2));
}

TEST(IsOdd, TreatsNegativeNumbersByMagnitude) {
  EXPECT_TRUE(utils::isOdd(-3));
  EXPECT_TRUE(utils::isOdd(1));
  EXPECT_TRUE(utils::isOdd(INT_MAX));
  EXPECT_FALSE(utils::isOdd(0));
  EXPECT_FALSE(utils::isOdd(-4));
  EXPECT_FALSE(utils::isOdd(INT_MIN));
}

// ---- Polygon turn -------------------------------------------------------------------------------

TEST(IsClockwise, ASquareTurningLeftAtEveryCornerIsClockwise) {
  const auto square = positions({{0, 0}, {1, 0}, {1, 1}, {0, 1}});
  EXPECT_TRUE(utils::isClockwise(4, square.data()));
}

TEST(IsClockwise, TheSameSquareListedTheOtherWayIsNot) {
  const auto square = positions({{0, 1}, {1, 1}, {1, 0}, {0, 0}});
  EXPECT_FALSE(utils::isClockwise(4, square.data()));
}

TEST(IsClockwise, CountsTurnsNotArea) {
  // Five corners: three left turns and two right turns make a sum of +1.
  const auto mostlyLeft = positions({{0, 0}, {4, 0}, {4, 4}, {2, 1}, {0, 4}});
  EXPECT_TRUE(utils::isClockwise(5, mostlyLeft.data()));
  const auto mostlyRight = positions({{0, 4}, {2, 1}, {4, 4}, {4, 0}, {0, 0}});
  EXPECT_FALSE(utils::isClockwise(5, mostlyRight.data()));
}

TEST(IsClockwise, IgnoresHeights) {
  std::vector<DexPosition3D> square = positions({{0, 1}, {1, 1}, {1, 0}, {0, 0}});
  square[1].z = 1e9;
  square[3].z = -1e9;
  EXPECT_FALSE(utils::isClockwise(4, square.data()));
}

TEST(IsClockwise, DegenerateInputsAreClockwise) {
  const auto line = positions({{0, 0}, {1, 1}, {2, 2}});
  EXPECT_TRUE(utils::isClockwise(0, nullptr));
  EXPECT_TRUE(utils::isClockwise(5, nullptr));
  EXPECT_TRUE(utils::isClockwise(0, line.data()));
  EXPECT_TRUE(utils::isClockwise(1, line.data()));
  EXPECT_TRUE(utils::isClockwise(2, line.data()));
  EXPECT_TRUE(utils::isClockwise(3, line.data()));
}

TEST(MakeSureTriangleIsClockwise, ReversesATriangleTurningRight) {
  auto triangle = positions({{0, 0}, {0, 1}, {1, 0}});
  unsigned int count = 3;
  EXPECT_FALSE(utils::makeSureTriangleIsClockwise(count, triangle.data()));
  EXPECT_EQ(count, 3u);
  expectPlane(triangle[0], 0, 1);
  expectPlane(triangle[1], 0, 0);
  expectPlane(triangle[2], 1, 0);
  EXPECT_TRUE(utils::isClockwise(count, triangle.data()));
}

TEST(MakeSureTriangleIsClockwise, LeavesAnAcceptedTriangleAlone) {
  auto triangle = positions({{0, 0}, {1, 0}, {0, 1}});
  unsigned int count = 3;
  EXPECT_FALSE(utils::makeSureTriangleIsClockwise(count, triangle.data()));
  EXPECT_EQ(count, 3u);
  expectPlane(triangle[0], 0, 0);
  expectPlane(triangle[1], 1, 0);
  expectPlane(triangle[2], 0, 1);
}

TEST(MakeSureTriangleIsClockwise, DropsTheClosingVertexOfAClosedTriangle) {
  auto closed = positions({{0, 0}, {0, 1}, {1, 0}, {0, 0}});
  closed[3].z = 5.0;  // heights do not matter for the comparison
  unsigned int count = 4;
  EXPECT_FALSE(utils::makeSureTriangleIsClockwise(count, closed.data()));
  EXPECT_EQ(count, 3u);
  expectPlane(closed[0], 0, 1);
  expectPlane(closed[1], 0, 0);
  expectPlane(closed[2], 1, 0);
}

TEST(MakeSureTriangleIsClockwise, MovesARepeatedVertexToTheEnd) {
  auto withRepeat = positions({{0, 0}, {0, 0}, {0, 1}, {1, 0}});
  unsigned int count = 4;
  EXPECT_FALSE(utils::makeSureTriangleIsClockwise(count, withRepeat.data()));
  EXPECT_EQ(count, 3u);
  // The repeat was exchanged with the last vertex; the triangle left over is accepted as it is.
  expectPlane(withRepeat[0], 0, 0);
  expectPlane(withRepeat[1], 1, 0);
  expectPlane(withRepeat[2], 0, 1);
  expectPlane(withRepeat[3], 0, 0);
}

TEST(MakeSureTriangleIsClockwise, ExaminesTheVertexMovedIntoThePlaceOfARepeat) {
  auto twoRepeats = positions({{0, 0}, {0, 0}, {1, 0}, {0, 0}});
  unsigned int count = 4;
  EXPECT_FALSE(utils::makeSureTriangleIsClockwise(count, twoRepeats.data()));
  EXPECT_EQ(count, 2u);
  expectPlane(twoRepeats[0], 0, 0);
  expectPlane(twoRepeats[1], 1, 0);
}

TEST(MakeSureTriangleIsClockwise, ReversesAQuadrilateralAtItsDiagonal) {
  auto quad = positions({{0, 0}, {0, 1}, {1, 1}, {1, 0}});
  unsigned int count = 4;
  EXPECT_FALSE(utils::makeSureTriangleIsClockwise(count, quad.data()));
  EXPECT_EQ(count, 4u);
  expectPlane(quad[0], 1, 1);
  expectPlane(quad[1], 0, 1);
  expectPlane(quad[2], 0, 0);
  expectPlane(quad[3], 1, 0);
  EXPECT_TRUE(utils::isClockwise(count, quad.data()));
}

TEST(MakeSureTriangleIsClockwise, StopsWhenFewerThanThreeDistinctVerticesRemain) {
  auto twoPoints = positions({{0, 0}, {1, 1}, {0, 0}, {1, 1}});
  unsigned int count = 4;
  EXPECT_FALSE(utils::makeSureTriangleIsClockwise(count, twoPoints.data()));
  EXPECT_EQ(count, 2u);
  expectPlane(twoPoints[0], 0, 0);
  expectPlane(twoPoints[1], 1, 1);
}

TEST(MakeSureTriangleIsClockwise, IgnoresOtherCountsAndNullVertices) {
  auto five = positions({{0, 0}, {0, 1}, {1, 1}, {1, 0}, {0, 0}});
  const auto original = five;
  for (unsigned int count : {0u, 1u, 2u, 5u}) {
    unsigned int changed = count;
    EXPECT_FALSE(utils::makeSureTriangleIsClockwise(changed, five.data()));
    EXPECT_EQ(changed, count);
  }
  for (std::size_t i = 0; i < five.size(); ++i)
    expectPlane(five[i], original[i].x, original[i].y);
  unsigned int count = 3;
  EXPECT_FALSE(utils::makeSureTriangleIsClockwise(count, nullptr));
  EXPECT_EQ(count, 3u);
}

// ---- Geodetic and earth-centred coordinates -----------------------------------------------------

TEST(Llh2Xyz, PutsTheEquatorAtTheSemiMajorAxis) {
  DexPosition3D xyz;
  ASSERT_EQ(math::_llh2xyz(DexPosition3D(0.0, 0.0, 100.0), xyz), 1);
  EXPECT_DOUBLE_EQ(xyz.x, 6378237.0);
  EXPECT_NEAR(xyz.y, 0.0, 1e-9);
  EXPECT_NEAR(xyz.z, 0.0, 1e-9);
  ASSERT_EQ(math::_llh2xyz(DexPosition3D(0.0, degrees(-90), 0.0), xyz), 1);
  EXPECT_NEAR(xyz.x, 0.0, 1e-9);
  EXPECT_DOUBLE_EQ(xyz.y, -6378137.0);
}

TEST(Llh2Xyz, PutsThePolesAtTheSemiMinorAxis) {
  DexPosition3D xyz;
  ASSERT_EQ(math::_llh2xyz(DexPosition3D(kPi / 2, 0.0, 10.0), xyz), 1);
  EXPECT_NEAR(xyz.x, 0.0, 1e-6);
  EXPECT_NEAR(xyz.z, 6356752.3142 + 10.0, 1e-4);
  ASSERT_EQ(math::_llh2xyz(DexPosition3D(-kPi / 2, 1.0, 0.0), xyz), 1);
  EXPECT_NEAR(xyz.z, -6356752.3142, 1e-4);
}

TEST(Llh2Xyz, RefusesTheOriginMissingHeightsAndNonFiniteValues) {
  const DexPosition3D untouched(1.0, 2.0, 3.0);
  for (const DexPosition3D& llh : {DexPosition3D(0.0, 0.0, 0.0), DexPosition3D(0.5, 0.5, vyn::ie::kNoHeight),
                                   DexPosition3D(kNaN, 0.5, 1.0), DexPosition3D(0.5, kInfinity, 1.0),
                                   DexPosition3D(0.5, 0.5, -kInfinity)}) {
    DexPosition3D xyz = untouched;
    EXPECT_EQ(math::_llh2xyz(llh, xyz), 0);
    EXPECT_EQ(xyz, untouched);
  }
}

TEST(Xyz2Llh, PutsTheSemiMajorAxisOnTheEquatorAtHeightZero) {
  DexPosition3D llh(9.0, 9.0, 9.0);
  ASSERT_EQ(math::_xyz2llh(DexPosition3D(6378137.0, 0.0, 0.0), llh, 1e-12), 1);
  EXPECT_EQ(llh.x, 0.0);
  EXPECT_EQ(llh.y, 0.0);
  EXPECT_NEAR(llh.z, 0.0, 1e-9);
}

TEST(Xyz2Llh, TakesPolarHeightsFromZ) {
  DexPosition3D llh;
  ASSERT_EQ(math::_xyz2llh(DexPosition3D(0.0, 0.0, 6356752.3142 + 250.0), llh, 1e-12), 1);
  EXPECT_DOUBLE_EQ(llh.x, kPi / 2);
  EXPECT_EQ(llh.y, 0.0);
  EXPECT_NEAR(llh.z, 250.0, 1e-4);
  ASSERT_EQ(math::_xyz2llh(DexPosition3D(0.0, 0.0, -6356752.3142), llh, 1e-12), 1);
  EXPECT_DOUBLE_EQ(llh.x, -kPi / 2);
  EXPECT_NEAR(llh.z, 0.0, 1e-4);
}

TEST(Xyz2Llh, ALargeToleranceKeepsTheFirstEstimate) {
  DexPosition3D xyz;
  ASSERT_EQ(math::_llh2xyz(DexPosition3D(degrees(45), degrees(10), 20000000.0), xyz), 1);
  const double p = std::hypot(xyz.x, xyz.y);
  DexPosition3D llh;
  ASSERT_EQ(math::_xyz2llh(xyz, llh, 10.0), 1);
  EXPECT_DOUBLE_EQ(llh.x, std::atan2(xyz.z, p * 0.99330562000986));
  // Far above the ellipsoid the first estimate is visibly off; refinement removes the error.
  EXPECT_GT(std::fabs(llh.x - degrees(45)), 1e-4);
  ASSERT_EQ(math::_xyz2llh(xyz, llh, 9.999), 1);
  EXPECT_NEAR(llh.x, degrees(45), 1e-2);
}

TEST(Xyz2Llh, FailsWhenTheToleranceIsNeverReached) {
  DexPosition3D xyz;
  ASSERT_EQ(math::_llh2xyz(DexPosition3D(degrees(30), degrees(30), 0.0), xyz), 1);
  const DexPosition3D untouched(1.0, 2.0, 3.0);
  DexPosition3D llh = untouched;
  EXPECT_EQ(math::_xyz2llh(xyz, llh, -1.0), 0);
  EXPECT_EQ(llh, untouched);
}

TEST(Xyz2Llh, RefusesTheOriginAndNonFiniteValues) {
  const DexPosition3D untouched(1.0, 2.0, 3.0);
  for (const DexPosition3D& xyz : {DexPosition3D(0.0, 0.0, 0.0), DexPosition3D(kNaN, 1.0, 1.0),
                                   DexPosition3D(1.0, kInfinity, 1.0), DexPosition3D(1.0, 1.0, -kInfinity)}) {
    DexPosition3D llh = untouched;
    EXPECT_EQ(math::_xyz2llh(xyz, llh, 1e-12), 0);
    EXPECT_EQ(llh, untouched);
  }
}

struct GeodeticPoint {
  double latitudeDegrees;
  double longitudeDegrees;
  double height;
};

class GeodeticRoundTrip : public testing::TestWithParam<GeodeticPoint> {};

TEST_P(GeodeticRoundTrip, ComesBackWithinTolerance) {
  const GeodeticPoint point = GetParam();
  const DexPosition3D llh(degrees(point.latitudeDegrees), degrees(point.longitudeDegrees), point.height);
  DexPosition3D xyz;
  ASSERT_EQ(math::_llh2xyz(llh, xyz), 1);
  DexPosition3D back;
  ASSERT_EQ(math::_xyz2llh(xyz, back, 1e-13), 1);
  EXPECT_NEAR(back.x, llh.x, 1e-11);
  EXPECT_NEAR(back.z, llh.z, 1e-4);
  // At the poles the longitude is not carried by the coordinates.
  if (std::fabs(point.latitudeDegrees) < 90.0) {
    EXPECT_NEAR(back.y, llh.y, 1e-11);
  }
}

INSTANTIATE_TEST_SUITE_P(Wgs84, GeodeticRoundTrip,
                         testing::Values(GeodeticPoint{0, 0, 1}, GeodeticPoint{0, 179.5, 0.5},
                                         GeodeticPoint{0, -179.5, -30}, GeodeticPoint{47.3769, 8.5417, 408},
                                         GeodeticPoint{-33.8688, 151.2093, 58},
                                         GeodeticPoint{40.7128, -74.006, 10},
                                         GeodeticPoint{-54.8, -68.3, -20}, GeodeticPoint{79.99, -45, 1000},
                                         GeodeticPoint{80.01, 45, 1000}, GeodeticPoint{89.9999, 12, 2},
                                         GeodeticPoint{90, 0, 100}, GeodeticPoint{-90, 0, -100},
                                         GeodeticPoint{-85, -120, 3000}, GeodeticPoint{55, -3, 20200000},
                                         GeodeticPoint{-12, 100, 35786000}, GeodeticPoint{30, 30, 400000}));
