#include "ieUtils/IEUtilsGeometry.h"

#include <gtest/gtest.h>

#include <climits>
#include <cmath>
#include <limits>
#include <numbers>
#include <string>
#include <utility>
#include <vector>

#include "ieObjects/IENoValue.h"
#include "support/LogCapture.h"

namespace {

using vyn::ie::DexPosition3D;
namespace utils = vyn::ie::utils;
namespace math = vyn::ie::math;

constexpr double kNaN = std::numeric_limits<double>::quiet_NaN();
constexpr double kInfinity = std::numeric_limits<double>::infinity();
constexpr double kPi = std::numbers::pi;

double radians(double degrees) {
  return degrees * kPi / 180.0;
}

// Plane positions, and their plane coordinates as "x,y x,y ...".
std::vector<DexPosition3D> positions(std::initializer_list<std::pair<double, double>> points) {
  std::vector<DexPosition3D> result;
  for (const auto& [x, y] : points)
    result.emplace_back(x, y, 0.0);
  return result;
}
std::string planeOf(const std::vector<DexPosition3D>& points, unsigned int count) {
  std::string text;
  for (unsigned int i = 0; i < count; ++i)
    text += (i > 0 ? " " : "") + std::to_string(static_cast<int>(points[i].x)) + "," +
            std::to_string(static_cast<int>(points[i].y));
  return text;
}

TEST(PlaneGeometry, DirectionDistanceHeightAndNumberRules) {
  const double a[2] = {1.0, 1.0};
  const double east[2] = {3.0, 1.0};
  const double north[2] = {1.0, 4.0};
  const double southWest[2] = {0.0, 0.0};
  const double far[2] = {4.0, 5.0};
  EXPECT_DOUBLE_EQ(utils::ctt(a, east), 0.0);
  EXPECT_DOUBLE_EQ(utils::ctt(a, north), kPi / 2);
  EXPECT_DOUBLE_EQ(utils::ctt(a, southWest), -3 * kPi / 4);
  EXPECT_DOUBLE_EQ(utils::dtt(a, far), 5.0);
  EXPECT_DOUBLE_EQ(utils::dtt(far, a), 5.0);
  EXPECT_EQ(utils::ctt(nullptr, a) + utils::ctt(a, nullptr) + utils::dtt(nullptr, a) + utils::dtt(a, nullptr),
            0.0);
  EXPECT_DOUBLE_EQ(utils::getElevationOnLine(0, 10, 10, 20, 5), 15.0);
  EXPECT_DOUBLE_EQ(utils::getElevationOnLine(0, 10, 10, 20, 20), 30.0);
  EXPECT_DOUBLE_EQ(utils::getElevationOnLine(10, 20, 0, 10, -10), 0.0);
  EXPECT_EQ(utils::getElevationOnLine(3, 10, 3, 20, 5), 10.0);  // a vertical line: the first height
  EXPECT_TRUE(utils::isInBorders(5, 5, 5) && utils::isInBorders(1, 1, 2) && utils::isInBorders(2, 1, 2));
  EXPECT_FALSE(utils::isInBorders(0.999, 1, 2) || utils::isInBorders(1.5, 2, 1) ||
               utils::isInBorders(kNaN, 1, 2));
  EXPECT_TRUE(utils::isOdd(-3) && utils::isOdd(1) && utils::isOdd(INT_MAX));
  EXPECT_FALSE(utils::isOdd(0) || utils::isOdd(-4) || utils::isOdd(INT_MIN));
}

TEST(ArcBy3Points, FindsTheCentreRadiusAndDirectionsTowardTheCentreOfAnyCircle) {
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
  for (const double sign : {1.0, -1.0}) {  // whatever the turn of the points
    const double q1[2] = {-1234.5 + 42 * std::cos(0.3), 678.25 + sign * 42 * std::sin(0.3)};
    const double q2[2] = {-1234.5 + 42 * std::cos(1.9), 678.25 + sign * 42 * std::sin(1.9)};
    const double q3[2] = {-1234.5 + 42 * std::cos(4.0), 678.25 + sign * 42 * std::sin(4.0)};
    ASSERT_TRUE(utils::arcBy3Points(q1, q2, q3, centre, radius, angle2, angle3));
    EXPECT_NEAR(centre[0], -1234.5, 1e-9);
    EXPECT_NEAR(centre[1], 678.25, 1e-9);
    EXPECT_NEAR(radius, 42.0, 1e-9);
    EXPECT_NEAR(angle2, utils::ctt(q2, centre), 1e-15);
    EXPECT_NEAR(angle3, utils::ctt(q3, centre), 1e-15);
  }
}

TEST(ArcBy3Points, RefusesPointsWithoutACircleAndWritesNothing) {
  const double p1[2] = {0.0, 0.0};
  const double p2[2] = {1.0, 1.0};
  const double onLine[2] = {5.0, 5.0};
  const double nan[2] = {kNaN, 1.0};
  const double infinite[2] = {kInfinity, 1.0};
  const double far2[2] = {1.0, 0.0};
  const double far3[2] = {2.0, 1e-320};  // not quite collinear, but the centre lies beyond any double
  double centre[3] = {7.0, 7.0, 7.0};
  double radius = 7.0;
  double angle2 = 7.0;
  double angle3 = 7.0;
  EXPECT_FALSE(utils::arcBy3Points(p1, p2, onLine, centre, radius, angle2, angle3));
  EXPECT_FALSE(utils::arcBy3Points(p1, p1, p2, centre, radius, angle2, angle3));
  EXPECT_FALSE(utils::arcBy3Points(p1, p2, p1, centre, radius, angle2, angle3));
  EXPECT_FALSE(utils::arcBy3Points(p1, p2, nan, centre, radius, angle2, angle3));
  EXPECT_FALSE(utils::arcBy3Points(infinite, p1, p2, centre, radius, angle2, angle3));
  EXPECT_FALSE(utils::arcBy3Points(p1, far2, far3, centre, radius, angle2, angle3));
  EXPECT_TRUE(centre[0] == 7.0 && centre[1] == 7.0 && centre[2] == 7.0 && radius == 7.0 && angle2 == 7.0 &&
              angle3 == 7.0);
  EXPECT_FALSE(utils::arcBy3Points(nullptr, p2, onLine, centre, radius, angle2, angle3) ||
               utils::arcBy3Points(p1, nullptr, onLine, centre, radius, angle2, angle3) ||
               utils::arcBy3Points(p1, far2, nullptr, centre, radius, angle2, angle3) ||
               utils::arcBy3Points(p1, far2, p2, nullptr, radius, angle2, angle3));
}

TEST(GetEllToGroundScale, UsesTheGivenRadiusOrTheMeanOneAndLogsImplausibleRadii) {
  const dex_test::LogCapture log;
  EXPECT_DOUBLE_EQ(utils::getEllToGroundScale(100, 0), 100 / 6371000.0 + 1);
  EXPECT_DOUBLE_EQ(utils::getEllToGroundScale(-50, 6378137), -50 / 6378137.0 + 1);
  EXPECT_EQ(log.size(), 0u);
  EXPECT_DOUBLE_EQ(utils::getEllToGroundScale(100, 5000000), 100 / 5000000.0 + 1);
  EXPECT_DOUBLE_EQ(utils::getEllToGroundScale(100, 6000000), 100 / 6000000.0 + 1);
  for (const double meanTakesOver : {1.0, -7.0, kNaN})
    EXPECT_DOUBLE_EQ(utils::getEllToGroundScale(100, meanTakesOver), 100 / 6371000.0 + 1);
  EXPECT_EQ(log.count(L"ieUtils\\IEUtils", utils::kLogLineUnusualEarthRadius), 5);
  EXPECT_EQ(log.size(), 5u);
  EXPECT_TRUE(log.records().front().message.empty());
}

TEST(IsClockwise, CountsLeftTurnsIgnoringHeightsAndTakesDegenerateInputsAsClockwise) {
  EXPECT_TRUE(utils::isClockwise(4, positions({{0, 0}, {1, 0}, {1, 1}, {0, 1}}).data()));
  std::vector<DexPosition3D> reversed = positions({{0, 1}, {1, 1}, {1, 0}, {0, 0}});
  reversed[1].z = 1e9;
  reversed[3].z = -1e9;
  EXPECT_FALSE(utils::isClockwise(4, reversed.data()));
  // Three left turns and two right turns make a sum of +1: turns count, not area.
  EXPECT_TRUE(utils::isClockwise(5, positions({{0, 0}, {4, 0}, {4, 4}, {2, 1}, {0, 4}}).data()));
  EXPECT_FALSE(utils::isClockwise(5, positions({{0, 4}, {2, 1}, {4, 4}, {4, 0}, {0, 0}}).data()));
  const auto line = positions({{0, 0}, {1, 1}, {2, 2}});
  EXPECT_TRUE(utils::isClockwise(0, nullptr) && utils::isClockwise(5, nullptr) &&
              utils::isClockwise(0, line.data()) && utils::isClockwise(1, line.data()) &&
              utils::isClockwise(2, line.data()) && utils::isClockwise(3, line.data()));
}

TEST(MakeSureTriangleIsClockwise, ReversesDropsTheClosingVertexAndMovesRepeatsToTheEnd) {
  const struct {
    std::vector<DexPosition3D> points;
    unsigned int countAfter;
    const char* after;
  } cases[] = {
      {positions({{0, 0}, {0, 1}, {1, 0}}), 3, "0,1 0,0 1,0"},          // turning right: reversed
      {positions({{0, 0}, {1, 0}, {0, 1}}), 3, "0,0 1,0 0,1"},          // accepted as it is
      {positions({{0, 0}, {0, 1}, {1, 0}, {0, 0}}), 3, "0,1 0,0 1,0"},  // closed: the closing vertex goes
      {positions({{0, 0}, {0, 0}, {0, 1}, {1, 0}}), 3, "0,0 1,0 0,1"},  // a repeat exchanged with the last
      {positions({{0, 0}, {0, 0}, {1, 0}, {0, 0}}), 2, "0,0 1,0"},      // the vertex moved in is examined
      {positions({{0, 0}, {0, 1}, {1, 1}, {1, 0}}), 4, "1,1 0,1 0,0 1,0"},  // a quadrilateral at its diagonal
      {positions({{0, 0}, {1, 1}, {0, 0}, {1, 1}}), 2, "0,0 1,1"}};  // fewer than three distinct vertices
  for (auto c : cases) {
    unsigned int count = static_cast<unsigned int>(c.points.size());
    c.points.back().z = 5.0;  // heights do not matter
    EXPECT_FALSE(utils::makeSureTriangleIsClockwise(count, c.points.data()));
    EXPECT_EQ(count, c.countAfter);
    EXPECT_EQ(planeOf(c.points, count), c.after);
  }
  auto five = positions({{0, 0}, {0, 1}, {1, 1}, {1, 0}, {0, 0}});
  for (unsigned int count : {0u, 1u, 2u, 5u}) {  // other counts and null vertices are ignored
    unsigned int changed = count;
    EXPECT_FALSE(utils::makeSureTriangleIsClockwise(changed, five.data()));
    EXPECT_EQ(changed, count);
  }
  EXPECT_EQ(planeOf(five, 5), "0,0 0,1 1,1 1,0 0,0");
  unsigned int count = 3;
  EXPECT_FALSE(utils::makeSureTriangleIsClockwise(count, nullptr));
  EXPECT_EQ(count, 3u);
}

TEST(GeodeticCoordinates, PutTheEquatorAtTheSemiMajorAxisAndThePolesAtTheSemiMinorOne) {
  DexPosition3D xyz;
  ASSERT_EQ(math::_llh2xyz(DexPosition3D(0.0, 0.0, 100.0), xyz), 1);
  EXPECT_DOUBLE_EQ(xyz.x, 6378237.0);
  EXPECT_NEAR(xyz.y, 0.0, 1e-9);
  ASSERT_EQ(math::_llh2xyz(DexPosition3D(0.0, radians(-90), 0.0), xyz), 1);
  EXPECT_DOUBLE_EQ(xyz.y, -6378137.0);
  ASSERT_EQ(math::_llh2xyz(DexPosition3D(kPi / 2, 0.0, 10.0), xyz), 1);
  EXPECT_NEAR(xyz.x, 0.0, 1e-6);
  EXPECT_NEAR(xyz.z, 6356752.3142 + 10.0, 1e-4);
  ASSERT_EQ(math::_llh2xyz(DexPosition3D(-kPi / 2, 1.0, 0.0), xyz), 1);
  EXPECT_NEAR(xyz.z, -6356752.3142, 1e-4);
  DexPosition3D llh(9.0, 9.0, 9.0);
  ASSERT_EQ(math::_xyz2llh(DexPosition3D(6378137.0, 0.0, 0.0), llh, 1e-12), 1);
  EXPECT_TRUE(llh.x == 0.0 && llh.y == 0.0);
  EXPECT_NEAR(llh.z, 0.0, 1e-9);
  ASSERT_EQ(math::_xyz2llh(DexPosition3D(0.0, 0.0, 6356752.3142 + 250.0), llh, 1e-12), 1);
  EXPECT_DOUBLE_EQ(llh.x, kPi / 2);
  EXPECT_EQ(llh.y, 0.0);
  EXPECT_NEAR(llh.z, 250.0, 1e-4);
  ASSERT_EQ(math::_xyz2llh(DexPosition3D(0.0, 0.0, -6356752.3142), llh, 1e-12), 1);
  EXPECT_DOUBLE_EQ(llh.x, -kPi / 2);
}

TEST(GeodeticCoordinates, RefuseTheOriginMissingHeightsNonFiniteValuesAndAToleranceNeverReached) {
  const DexPosition3D untouched(1.0, 2.0, 3.0);
  for (const DexPosition3D& llh : {DexPosition3D(0.0, 0.0, 0.0), DexPosition3D(0.5, 0.5, vyn::ie::kNoHeight),
                                   DexPosition3D(kNaN, 0.5, 1.0), DexPosition3D(0.5, kInfinity, 1.0),
                                   DexPosition3D(0.5, 0.5, -kInfinity)}) {
    DexPosition3D xyz = untouched;
    EXPECT_EQ(math::_llh2xyz(llh, xyz), 0);
    EXPECT_EQ(xyz, untouched);
  }
  for (const DexPosition3D& xyz : {DexPosition3D(0.0, 0.0, 0.0), DexPosition3D(kNaN, 1.0, 1.0),
                                   DexPosition3D(1.0, kInfinity, 1.0), DexPosition3D(1.0, 1.0, -kInfinity)}) {
    DexPosition3D llh = untouched;
    EXPECT_EQ(math::_xyz2llh(xyz, llh, 1e-12), 0);
    EXPECT_EQ(llh, untouched);
  }
  DexPosition3D xyz;
  ASSERT_EQ(math::_llh2xyz(DexPosition3D(radians(30), radians(30), 0.0), xyz), 1);
  DexPosition3D llh = untouched;
  EXPECT_EQ(math::_xyz2llh(xyz, llh, -1.0), 0);
  EXPECT_EQ(llh, untouched);
  // A large tolerance keeps the first estimate, visibly off far above the ellipsoid.
  ASSERT_EQ(math::_llh2xyz(DexPosition3D(radians(45), radians(10), 20000000.0), xyz), 1);
  ASSERT_EQ(math::_xyz2llh(xyz, llh, 10.0), 1);
  EXPECT_DOUBLE_EQ(llh.x, std::atan2(xyz.z, std::hypot(xyz.x, xyz.y) * 0.99330562000986));
  EXPECT_GT(std::fabs(llh.x - radians(45)), 1e-4);
  ASSERT_EQ(math::_xyz2llh(xyz, llh, 9.999), 1);
  EXPECT_NEAR(llh.x, radians(45), 1e-2);
}

TEST(GeodeticCoordinates, RoundTripWithinTolerance) {
  const double points[][3] = {{0, 0, 1},
                              {0, 179.5, 0.5},
                              {0, -179.5, -30},
                              {47.3769, 8.5417, 408},
                              {-33.8688, 151.2093, 58},
                              {40.7128, -74.006, 10},
                              {-54.8, -68.3, -20},
                              {79.99, -45, 1000},
                              {80.01, 45, 1000},
                              {89.9999, 12, 2},
                              {90, 0, 100},
                              {-90, 0, -100},
                              {-85, -120, 3000},
                              {55, -3, 20200000},
                              {-12, 100, 35786000},
                              {30, 30, 400000}};
  for (const auto& point : points) {
    const DexPosition3D llh(radians(point[0]), radians(point[1]), point[2]);
    DexPosition3D xyz;
    DexPosition3D back;
    ASSERT_EQ(math::_llh2xyz(llh, xyz), 1);
    ASSERT_EQ(math::_xyz2llh(xyz, back, 1e-13), 1);
    EXPECT_NEAR(back.x, llh.x, 1e-11) << point[0];
    EXPECT_NEAR(back.z, llh.z, 1e-4) << point[0];
    if (std::fabs(point[0]) < 90.0) {
      EXPECT_NEAR(back.y, llh.y, 1e-11) << point[0];  // poles carry no longitude
    }
  }
}

}  // namespace
