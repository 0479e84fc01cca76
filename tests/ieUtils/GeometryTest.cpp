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
#include "support/Cases.h"
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

// Plane positions from "x y x y ...", heights alternately far below and above (they do not matter).
std::vector<DexPosition3D> positions(const std::vector<double>& xy) {
  std::vector<DexPosition3D> result;
  for (std::size_t i = 0; i + 1 < xy.size(); i += 2)
    result.emplace_back(xy[i], xy[i + 1], i % 4 == 0 ? -1e9 : 1e9);
  return result;
}

// The plane geometry of tests/data/cases/geometry.txt.
TEST(PlaneGeometry, DirectionsDistancesHeightsArcsScalesAndTurnsAreAsTheCasesGive) {
  const dex_test::LogCapture log;
  std::size_t logged = 0;
  dex_test::forEachCase("geometry.txt", [&](const dex_test::Case& c) {
    const std::vector<double> v = c.numbers(1);
    if (c[0] == "ctt" || c[0] == "dtt") {
      dex_test::expectNumber(c[0] == "ctt" ? utils::ctt(&v[0], &v[2]) : utils::dtt(&v[0], &v[2]), c, 2, 3);
    } else if (c[0] == "elevation") {
      dex_test::expectNumber(utils::getElevationOnLine(v[0], v[1], v[2], v[3], v[4]), c, 2, 3);
    } else if (c[0] == "borders") {
      EXPECT_EQ(c.integer(2), utils::isInBorders(v[0], v[1], v[2]));
    } else if (c[0] == "odd") {
      for (const double n : v)
        EXPECT_EQ(c.integer(2), utils::isOdd(static_cast<int>(n))) << n;
    } else if (c[0] == "arc") {
      double out[6] = {7, 7, 7, 7, 7, 7};  // centre (x, y, z), radius, the two directions
      const bool found = utils::arcBy3Points(&v[0], &v[2], &v[4], out, out[3], out[4], out[5]);
      ASSERT_EQ(c[2] != "refused", found);
      const std::vector<double> expected = found ? c.numbers(2) : std::vector<double>{7, 7, 7, 7, 7};
      EXPECT_EQ(found ? 0.0 : 7.0, out[2]);
      for (std::size_t i = 0; i < expected.size(); ++i)
        EXPECT_NEAR(expected[i], out[i < 2 ? i : i + 1], found ? c.number(3) : 0.0) << i;
    } else if (c[0] == "scale") {
      dex_test::expectNumber(utils::getEllToGroundScale(v[0], v[1]), c, 2, 3);
      logged += static_cast<std::size_t>(c.integer(4));
      EXPECT_EQ(logged, log.size());
    } else if (c[0] == "clockwise") {
      EXPECT_EQ(c.integer(2), utils::isClockwise(static_cast<unsigned>(v.size() / 2), positions(v).data()));
    } else if (c[0] == "triangle") {
      std::vector<DexPosition3D> points = positions(v);
      auto count = static_cast<unsigned int>(points.size());
      EXPECT_FALSE(utils::makeSureTriangleIsClockwise(count, points.data()));
      ASSERT_EQ(static_cast<unsigned int>(c.integer(2)), count);
      const std::vector<double> after = c.numbers(3);
      for (unsigned int i = 0; i < count; ++i)
        EXPECT_TRUE(points[i].x == after[2 * i] && points[i].y == after[2 * i + 1]) << i;
    }
  });
  EXPECT_EQ(log.count(L"ieUtils\\IEUtils", utils::kLogLineUnusualEarthRadius), 5);
  EXPECT_TRUE(log.records().front().message.empty());
  const double a[2] = {1.0, 1.0};  // null points give nothing
  double out[3] = {7, 7, 7};
  EXPECT_EQ(
      0.0, utils::ctt(nullptr, a) + utils::ctt(a, nullptr) + utils::dtt(nullptr, a) + utils::dtt(a, nullptr));
  EXPECT_FALSE(utils::arcBy3Points(nullptr, a, a, out, out[0], out[1], out[2]) ||
               utils::arcBy3Points(a, nullptr, a, out, out[0], out[1], out[2]) ||
               utils::arcBy3Points(a, a, nullptr, out, out[0], out[1], out[2]) ||
               utils::arcBy3Points(a, a, a, nullptr, out[0], out[1], out[2]));
  EXPECT_TRUE(utils::isClockwise(0, nullptr) && utils::isClockwise(5, nullptr));
  unsigned int count = 3;
  EXPECT_FALSE(utils::makeSureTriangleIsClockwise(count, nullptr));
  EXPECT_EQ(3u, count);
}

// Geodetic coordinates (llh, xyz and roundtrip of geometry.txt): x is the latitude, y the longitude.
TEST(GeodeticCoordinates, ConvertAndRoundTripAsTheCasesGiveAndRefuseWhatHasNoPosition) {
  dex_test::forEachCase("geometry.txt", [](const dex_test::Case& c) {
    if (c[0] != "llh" && c[0] != "xyz" && c[0] != "roundtrip") return;
    const std::vector<double> v = c.numbers(1);
    const DexPosition3D untouched(1.0, 2.0, 3.0);
    DexPosition3D out = untouched;
    const DexPosition3D llh(radians(v[0]), radians(v[1]), v[2]);
    const int converted =
        c[0] == "xyz" ? math::_xyz2llh(DexPosition3D(v[0], v[1], v[2]), out, v[3]) : math::_llh2xyz(llh, out);
    ASSERT_EQ(c[2] == "refused" ? 0 : 1, converted);
    if (c[0] == "roundtrip") {
      DexPosition3D back;
      ASSERT_EQ(1, math::_xyz2llh(out, back, 1e-13));
      EXPECT_NEAR(back.x, llh.x, 1e-11);
      EXPECT_NEAR(back.z, llh.z, 1e-4);
      if (std::fabs(v[0]) < 90.0) {
        EXPECT_NEAR(back.y, llh.y, 1e-11);  // poles carry no longitude
      }
      return;
    }
    if (converted == 0) {
      EXPECT_EQ(untouched, out);
      return;
    }
    const std::vector<double> e = c.numbers(2);
    const DexPosition3D expected =
        c[0] == "xyz" ? DexPosition3D(radians(e[0]), radians(e[1]), e[2]) : DexPosition3D(e[0], e[1], e[2]);
    for (int i = 0; i < 3; ++i)
      EXPECT_NEAR(expected[i], out[i], c.number(3)) << i;
  });
  // A large tolerance keeps the first estimate, visibly off far above the ellipsoid.
  DexPosition3D xyz;
  DexPosition3D llh;
  ASSERT_EQ(1, math::_llh2xyz(DexPosition3D(radians(45), radians(10), 20000000.0), xyz));
  ASSERT_EQ(1, math::_xyz2llh(xyz, llh, 10.0));
  EXPECT_DOUBLE_EQ(llh.x, std::atan2(xyz.z, std::hypot(xyz.x, xyz.y) * 0.99330562000986));
  EXPECT_GT(std::fabs(llh.x - radians(45)), 1e-4);
  ASSERT_EQ(1, math::_xyz2llh(xyz, llh, 9.999));
  EXPECT_NEAR(llh.x, radians(45), 1e-2);
}

}  // namespace
