#include "hostlibs/vynmathCurves.h"

#include <gtest/gtest.h>

#include <cmath>
#include <functional>
#include <limits>
#include <numbers>

// The curve elements checked against values computed here independently: the textbook series of the
// clothoid, Simpson's rule, the closing of a circle, the tangent length of an arc, the tangent point
// of the cubic parabola. Points are (northing, easting), azimuths clockwise from north.
namespace {

constexpr double kTolerance = 1e-9;  // metres, on elements up to 1 km
constexpr double kPi = std::numbers::pi;
using Spiral = CCurveDataSpiral;

// The world point `along` the start tangent and `right` of it, from the definition of the frame.
CCurveNE placed(const CCurveNE& start, double azimuthDeg, double along, double right) {
  const double a = azimuthDeg * kPi / 180.0;
  return {start.x + along * std::cos(a) - right * std::sin(a),
          start.y + along * std::sin(a) + right * std::cos(a)};
}

void expectNear(const CCurveNE& expected, const CCurveNE& actual) {
  EXPECT_NEAR(expected.x, actual.x, kTolerance);
  EXPECT_NEAR(expected.y, actual.y, kTolerance);
}

// a - b in degrees, in (-180, 180].
double azimuthGap(double a, double b) {
  const double gap = std::remainder(a - b, 360.0);
  return gap == -180.0 ? 180.0 : gap;
}

// A clothoid from the tangent in its own frame, by the series in tau = L / (2R):
// x = L sum (-1)^n tau^2n / ((4n+1) (2n)!), y = L sum (-1)^n tau^(2n+1) / ((4n+3) (2n+1)!).
CCurveNE clothoidBySeries(double length, double radius) {
  const long double tau = length / (2.0L * radius);
  long double sums[2] = {0.0L, 0.0L};
  long double term = 1.0L;  // tau^k / k!
  for (int k = 0; k < 60; ++k) {
    sums[k % 2] += ((k / 2) % 2 == 0 ? term : -term) / (2 * k + 1);
    term *= tau / (k + 1);
  }
  return {static_cast<double>(length * sums[0]), static_cast<double>(length * sums[1])};
}

// The integral over [0, length] of (cos, sin) of heading(s), by Simpson's rule.
CCurveNE bySimpson(double length, const std::function<double(double)>& heading) {
  constexpr int kSteps = 20000;
  const double h = length / kSteps;
  long double x = 0.0L;
  long double y = 0.0L;
  for (int i = 0; i <= kSteps; ++i) {
    const double weight = i == 0 || i == kSteps ? 1.0 : (i % 2 == 1 ? 4.0 : 2.0);
    x += weight * std::cos(heading(i * h));
    y += weight * std::sin(heading(i * h));
  }
  return {static_cast<double>(x * h / 3.0L), static_cast<double>(y * h / 3.0L)};
}

TEST(CurveSegment, RunsAlongItsAzimuthExactlyOnTheAxesWithoutIntersectionPoint) {
  for (const double azimuth : {0.0, 135.0, 301.25}) {
    const CCurveSegment segment(CCurveDataSegment(250.0), 1000.0, 2000.0, CMathAngle(azimuth));
    expectNear(placed({1000.0, 2000.0}, azimuth, 250.0, 0.0), segment.getFinalNE());
    CCurveNE ip;
    EXPECT_FALSE(segment.getCurveIp(ip));
  }
  const COrgAzFrame east(0.0, 0.0, CMathAngle(90.0));
  EXPECT_EQ(10.0, east.curveNE2worldNE({10.0, 0.0}).y);
  EXPECT_EQ(0.0, east.curveNE2worldNE({10.0, 0.0}).x);
  EXPECT_EQ(-1.0, east.curveNE2worldNE({0.0, 1.0}).x);  // right of east is south
}

TEST(CurveArc, ChainOfArcsAroundAFullCircleReturnsToItsStart) {
  for (const double radius : {123.4, -987.65}) {
    CCurveNE here{5000.0, 3000.0};
    CMathAngle azimuth(17.0);
    for (const double share : {0.05, 0.2, 0.1, 0.3, 0.15, 0.2}) {
      const CCurveArc arc(CCurveDataArc(share * 2.0 * kPi * std::abs(radius), radius), here.x, here.y,
                          azimuth);
      const CCurveNE centre = arc.curveNE2worldNE(arc.getCenterNE());
      expectNear(placed(here, azimuth.getDeg(), 0.0, radius), centre);  // on the side of the turn
      EXPECT_NEAR(std::abs(radius),
                  std::hypot(arc.getFinalNorthing() - centre.x, arc.getFinalEasting() - centre.y),
                  kTolerance);
      here = arc.getFinalNE();
      azimuth = arc.getFinalAzimut();
    }
    expectNear({5000.0, 3000.0}, here);
    EXPECT_NEAR(0.0, azimuthGap(azimuth.getDeg(), 17.0), 1e-9);
  }
}

TEST(CurveArc, IntersectionPointLiesAtTheTangentLengthOnBothTangents) {
  for (const double radius : {250.0, -250.0}) {
    for (const double deltaDeg : {5.0, 90.0, 170.0}) {
      const double delta = deltaDeg * kPi / 180.0;
      const CCurveArc arc(CCurveDataArc(250.0 * delta, radius), 200.0, 300.0, CMathAngle(40.0));
      const double tangent = 250.0 * std::tan(delta / 2.0);
      CCurveNE ip;
      ASSERT_TRUE(arc.getCurveIp(ip));
      expectNear(placed({200.0, 300.0}, 40.0, tangent, 0.0), ip);
      expectNear(placed(arc.getFinalNE(), arc.getFinalAzimut().getDeg(), -tangent, 0.0), ip);
      EXPECT_NEAR(0.0,
                  azimuthGap(arc.getFinalAzimut().getDeg(), 40.0 + (radius > 0.0 ? deltaDeg : -deltaDeg)),
                  1e-12);
    }
  }
  const double inf = std::numeric_limits<double>::infinity();
  for (const CCurveDataArc& data :
       {CCurveDataArc(110.0 * kPi, 100.0), CCurveDataArc(0.0, 100.0), CCurveDataArc(50.0, inf)}) {
    CCurveNE ip;
    EXPECT_FALSE(CCurveArc(data, 0.0, 0.0, CMathAngle(0.0)).getCurveIp(ip));
  }
  EXPECT_TRUE(std::isnan(CCurveArc(CCurveDataArc(50.0, 0.0), 0.0, 0.0, CMathAngle(0.0)).getFinalNorthing()));
}

TEST(CurveSpiral, ClothoidEndPointsMatchTheSeriesAndSimpsonsRule) {
  const struct {
    double length, radius, azimuth;
  } cases[] = {{100.0, 500.0, 0.0},      {100.0, -500.0, 123.0}, {1000.0, 500.0, 45.0},
               {1000.0, -2000.0, 310.0}, {60.0, 30.0, 200.0},    {1000.0, 300.0, 90.0}};
  const CCurveNE start{10000.0, 20000.0};
  for (const auto& c : cases) {
    const CCurveSpiral spiral(Spiral(Spiral::CLOTHOID, c.length, 0.0, c.radius), start.x, start.y,
                              CMathAngle(c.azimuth));
    const CCurveNE series = clothoidBySeries(c.length, c.radius);
    const CCurveNE simpson =
        bySimpson(c.length, [&c](double s) { return s * s / (2.0 * c.radius * c.length); });
    expectNear(placed(start, c.azimuth, series.x, series.y), spiral.getFinalNE());
    expectNear(placed(start, c.azimuth, simpson.x, simpson.y), spiral.getFinalNE());
    EXPECT_NEAR(
        0.0,
        azimuthGap(spiral.getFinalAzimut().getDeg(), c.azimuth + c.length / (2.0 * c.radius) * 180.0 / kPi),
        1e-10);
  }
}

TEST(CurveSpiral, ClothoidBetweenTwoArcsMatchesSimpsonsRule) {
  const struct {
    double length, startRadius, endRadius;
  } cases[] = {{150.0, 1000.0, 400.0}, {150.0, -400.0, -1000.0}, {300.0, 600.0, -600.0}, {80.0, 200.0, 0.0}};
  for (const auto& c : cases) {
    const CCurveSpiral spiral(Spiral(Spiral::CLOTHOID, c.length, c.startRadius, c.endRadius), 0.0, 0.0,
                              CMathAngle(0.0));
    const double k0 = 1.0 / c.startRadius;
    const double k1 = c.endRadius == 0.0 ? 0.0 : 1.0 / c.endRadius;
    expectNear(bySimpson(c.length, [&](double s) { return k0 * s + (k1 - k0) * s * s / (2.0 * c.length); }),
               spiral.getFinalNE());
  }
}

TEST(CurveSpiral, SpiralConstantIsTheRootOfRadiusTimesLength) {
  EXPECT_DOUBLE_EQ(std::sqrt(500.0 * 120.0), GetSpiralConstant(120.0, -500.0));
  EXPECT_NEAR(300.0, Spiral(Spiral::CLOTHOID, 100.0, 0.0, -900.0).getSpiralConstant(), 1e-12);
  EXPECT_NEAR(300.0, Spiral(Spiral::CLOTHOID, 100.0, 900.0, 0.0).getSpiralConstant(), 1e-12);
  // from 1000 m to 500 m in 100 m: A^2 = L / (1/500 - 1/1000)
  EXPECT_NEAR(std::sqrt(100000.0), Spiral(Spiral::CLOTHOID, 100.0, 1000.0, 500.0).getSpiralConstant(), 1e-9);
}

TEST(CurveSpiral, SpiralToTheTangentRetracesTheSpiralFromItBackwards) {
  for (const Spiral::ESpiralMathType type : {Spiral::CLOTHOID, Spiral::CUBIC_PARABOLA}) {
    for (const double radius : {300.0, -300.0}) {
      const CCurveSpiral out(Spiral(type, 120.0, 0.0, radius), 700.0, 900.0, CMathAngle(75.0));
      const CMathAngle back(out.getFinalAzimut().getDeg() + 180.0);
      const CCurveSpiral in(Spiral(type, 120.0, -radius, 0.0), out.getFinalNorthing(), out.getFinalEasting(),
                            back);
      ASSERT_TRUE(out.isTSSC() && in.isCSST());
      expectNear({700.0, 900.0}, in.getFinalNE());
      EXPECT_NEAR(0.0, azimuthGap(in.getFinalAzimut().getDeg(), 255.0), 1e-10);
      CCurveNE outIp;
      CCurveNE inIp;
      ASSERT_TRUE(out.getCurveIp(outIp) && in.getCurveIp(inIp));
      expectNear(outIp, inIp);
    }
  }
}

TEST(CurveSpiral, CubicParabolaHasTheOffsetAndTangentPointOfTheTextbook) {
  for (const double radius : {400.0, -400.0}) {
    const CCurveSpiral spiral(Spiral(Spiral::CUBIC_PARABOLA, 90.0, 0.0, radius), 0.0, 0.0, CMathAngle(0.0));
    expectNear({90.0, 90.0 * 90.0 / (6.0 * radius)}, spiral.getFinalNE());
    CCurveNE ip;
    ASSERT_TRUE(spiral.getCurveIp(ip));
    expectNear({60.0, 0.0}, ip);  // the end tangent cuts the start tangent at 2/3 of the length
    const CCurveNE before = spiral.getNEAt(90.0 - 1e-3);
    const CCurveNE after = spiral.getNEAt(90.0 + 1e-3);
    const double chordDeg = std::atan2(after.y - before.y, after.x - before.x) * 180.0 / kPi;
    EXPECT_NEAR(0.0, azimuthGap(spiral.getFinalAzimut().getDeg(), chordDeg), 1e-7);
  }
}

TEST(CurveSpiral, UndefinedSpiralsGiveNaNAndNoIntersectionPoint) {
  for (const Spiral& data : {Spiral(Spiral::CUBIC_PARABOLA, 50.0, 300.0, 200.0),
                             Spiral(static_cast<Spiral::ESpiralMathType>(7), 50.0, 0.0, 200.0)}) {
    const CCurveSpiral spiral(data, 0.0, 0.0, CMathAngle(0.0));
    CCurveNE ip;
    EXPECT_TRUE(std::isnan(spiral.getFinalNorthing()));
    EXPECT_FALSE(spiral.getCurveIp(ip));
  }
  expectNear({0.0, 50.0},
             CCurveSpiral(Spiral(Spiral::CLOTHOID, 50.0, 0.0, 0.0), 0.0, 0.0, CMathAngle(90.0)).getFinalNE());
}

}  // namespace
