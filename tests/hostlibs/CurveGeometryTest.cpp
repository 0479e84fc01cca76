#include "hostlibs/vynmathCurves.h"

#include <gtest/gtest.h>

#include <cmath>
#include <functional>
#include <limits>
#include <numbers>
#include <vector>

// The curve elements checked against values computed here independently: the textbook series of the
// clothoid, Simpson's rule, the closing of a circle, the tangent length of an arc, the tangent
// properties of the cubic parabola. Points are (northing, easting), azimuths clockwise from north.
namespace {

constexpr double kTolerance = 1e-9;  // metres, on elements up to 1 km
constexpr double kPi = std::numbers::pi;

using Spiral = CCurveDataSpiral;

// The world point of a point given in the frame of an element that starts at start with azimuth
// azimuthDeg: written out from the definition, without the library's rotation.
CCurveNE placed(const CCurveNE& start, double azimuthDeg, double along, double right) {
  const double a = azimuthDeg * kPi / 180.0;
  return {start.x + along * std::cos(a) - right * std::sin(a),
          start.y + along * std::sin(a) + right * std::cos(a)};
}

void expectNear(const CCurveNE& expected, const CCurveNE& actual, double tolerance = kTolerance) {
  EXPECT_NEAR(expected.x, actual.x, tolerance);
  EXPECT_NEAR(expected.y, actual.y, tolerance);
}

// The difference of two azimuths in degrees, in (-180, 180].
double azimuthGap(double a, double b) {
  double gap = std::fmod(a - b, 360.0);
  if (gap <= -180.0) gap += 360.0;
  if (gap > 180.0) gap -= 360.0;
  return gap;
}

// A clothoid from the tangent in its own frame by the standard series in tau = L / (2R):
// x = L sum (-1)^n tau^2n / ((4n+1) (2n)!), y = L sum (-1)^n tau^(2n+1) / ((4n+3) (2n+1)!).
CCurveNE clothoidBySeries(double length, double radius) {
  const long double tau = static_cast<long double>(length) / (2.0L * radius);
  long double x = 0.0L;
  long double y = 0.0L;
  long double power = 1.0L;  // tau^k / k!
  for (int k = 0; k < 60; ++k) {
    const int n = k / 2;
    const long double sign = n % 2 == 0 ? 1.0L : -1.0L;
    if (k % 2 == 0) {
      x += sign * power / (4 * n + 1);
    } else {
      y += sign * power / (4 * n + 3);
    }
    power *= tau / (k + 1);
  }
  return {static_cast<double>(length * x), static_cast<double>(length * y)};
}

// Integral over [0, length] of (cos, sin) of heading(s), by Simpson's rule with many steps.
CCurveNE bySimpson(double length, const std::function<double(double)>& heading) {
  constexpr int kSteps = 20000;
  const double h = length / kSteps;
  long double x = 0.0L;
  long double y = 0.0L;
  for (int i = 0; i <= kSteps; ++i) {
    const double weight = i == 0 || i == kSteps ? 1.0 : (i % 2 == 1 ? 4.0 : 2.0);
    const double angle = heading(i * h);
    x += weight * std::cos(angle);
    y += weight * std::sin(angle);
  }
  return {static_cast<double>(x * h / 3.0L), static_cast<double>(y * h / 3.0L)};
}

// ---- Straight -----------------------------------------------------------------------------------

TEST(CurveSegment, RunsAlongItsAzimuthAndHasNoIntersectionPoint) {
  const CCurveNE start{1000.0, 2000.0};
  for (const double azimuth : {0.0, 90.0, 135.0, 270.0, 301.25}) {
    const CCurveSegment segment(CCurveDataSegment(250.0), start.x, start.y, CMathAngle(azimuth));
    expectNear(placed(start, azimuth, 250.0, 0.0), segment.getFinalNE());
    EXPECT_DOUBLE_EQ(azimuth, segment.getFinalAzimut().getDeg());
    CCurveNE ip{-1.0, -1.0};
    EXPECT_FALSE(segment.getCurveIp(ip));
    EXPECT_EQ(-1.0, ip.x);
  }
  const CCurveSegment east(CCurveDataSegment(10.0), 0.0, 0.0, CMathAngle(90.0));
  EXPECT_EQ(0.0, east.getFinalNorthing());  // exact along the axes
  EXPECT_EQ(10.0, east.getFinalEasting());
}

TEST(CurveFrame, LocalEastingPointsNinetyDegreesClockwiseFromTheStartTangent) {
  const COrgAzFrame facingEast(100.0, 200.0, CMathAngle(90.0));
  expectNear({100.0, 201.0}, facingEast.curveNE2worldNE({1.0, 0.0}));
  expectNear({99.0, 200.0}, facingEast.curveNE2worldNE({0.0, 1.0}));  // right of east is south
  EXPECT_DOUBLE_EQ(180.0, facingEast.azimuthAfterTurn(kPi / 2.0).getDeg());
  EXPECT_DOUBLE_EQ(0.0, facingEast.azimuthAfterTurn(-kPi / 2.0).getDeg());
}

// ---- Circular arc -------------------------------------------------------------------------------

TEST(CurveArc, ChainOfArcsAroundAFullCircleReturnsToItsStart) {
  const CCurveNE start{5000.0, 3000.0};
  for (const double radius : {123.4, -123.4, 987.65}) {
    const double circumference = 2.0 * kPi * std::abs(radius);
    const std::vector<double> shares = {0.05, 0.2, 0.1, 0.3, 0.15, 0.2};
    CCurveNE here = start;
    CMathAngle azimuth(17.0);
    for (const double share : shares) {
      const CCurveArc arc(CCurveDataArc(share * circumference, radius), here.x, here.y, azimuth);
      const CCurveNE centre = placed(here, azimuth.getDeg(), 0.0, radius);
      EXPECT_NEAR(std::abs(radius),
                  std::hypot(arc.getFinalNorthing() - centre.x, arc.getFinalEasting() - centre.y),
                  kTolerance);
      here = arc.getFinalNE();
      azimuth = arc.getFinalAzimut();
    }
    expectNear(start, here);
    EXPECT_NEAR(0.0, azimuthGap(azimuth.getDeg(), 17.0), 1e-9);
  }
}

TEST(CurveArc, IntersectionPointLiesAtTheTangentLengthOnBothTangents) {
  const CCurveNE start{200.0, 300.0};
  const double startAzimuth = 40.0;
  for (const double radius : {250.0, -250.0}) {
    for (const double deltaDeg : {5.0, 60.0, 90.0, 170.0}) {
      const double delta = deltaDeg * kPi / 180.0;
      const CCurveArc arc(CCurveDataArc(std::abs(radius) * delta, radius), start.x, start.y,
                          CMathAngle(startAzimuth));
      const double tangent = std::abs(radius) * std::tan(delta / 2.0);
      CCurveNE ip;
      ASSERT_TRUE(arc.getCurveIp(ip));
      expectNear(placed(start, startAzimuth, tangent, 0.0), ip);
      // and one tangent length back from the end along the end tangent
      expectNear(placed(arc.getFinalNE(), arc.getFinalAzimut().getDeg(), -tangent, 0.0), ip);
      const double turn = radius > 0.0 ? deltaDeg : -deltaDeg;
      EXPECT_NEAR(0.0, azimuthGap(arc.getFinalAzimut().getDeg(), startAzimuth + turn), 1e-12);
    }
  }
}

TEST(CurveArc, CentreLiesOnTheSideOfTheTurn) {
  const CCurveNE start{0.0, 0.0};
  for (const double radius : {80.0, -80.0}) {
    const CCurveArc arc(CCurveDataArc(100.0, radius), start.x, start.y, CMathAngle(0.0));
    const CCurveNE centre = arc.curveNE2worldNE(arc.getCenterNE());
    expectNear({0.0, radius}, centre);  // east of a northward start for a clockwise turn
    EXPECT_NEAR(80.0, std::hypot(arc.getFinalNorthing() - centre.x, arc.getFinalEasting() - centre.y),
                kTolerance);
    EXPECT_EQ(radius > 0.0, arc.getFinalEasting() > 0.0);
  }
}

TEST(CurveArc, ArcsWithoutATurnOfLessThanHalfACircleHaveNoIntersectionPoint) {
  struct Case {
    double length;
    double radius;
  };
  const Case cases[] = {{1.1 * kPi * 100.0, 100.0},
                        {1.5 * kPi * 100.0, -100.0},
                        {0.0, 100.0},
                        {50.0, std::numeric_limits<double>::infinity()}};
  for (const Case& c : cases) {
    const CCurveArc arc(CCurveDataArc(c.length, c.radius), 0.0, 0.0, CMathAngle(0.0));
    CCurveNE ip;
    EXPECT_FALSE(arc.getCurveIp(ip)) << c.length << " " << c.radius;
  }
  const CCurveArc straight(CCurveDataArc(50.0, std::numeric_limits<double>::infinity()), 0.0, 0.0,
                           CMathAngle(0.0));
  expectNear({50.0, 0.0}, straight.getFinalNE());
  const CCurveArc degenerate(CCurveDataArc(50.0, 0.0), 0.0, 0.0, CMathAngle(0.0));
  EXPECT_TRUE(std::isnan(degenerate.getFinalNorthing()));
}

// ---- Clothoid -----------------------------------------------------------------------------------

struct ClothoidCase {
  double length;
  double radius;  // signed: the end radius of a spiral from the tangent
  double azimuth;
};

const ClothoidCase kClothoids[] = {
    {100.0, 500.0, 0.0}, {100.0, -500.0, 123.0}, {1000.0, 500.0, 45.0}, {1000.0, -2000.0, 310.0},
    {60.0, 30.0, 200.0}, {1000.0, 300.0, 90.0},  {250.0, -100.0, 0.0},
};

TEST(CurveSpiral, ClothoidEndPointsMatchTheSeriesAndSimpsonsRule) {
  const CCurveNE start{10000.0, 20000.0};
  for (const ClothoidCase& c : kClothoids) {
    const CCurveSpiral spiral(Spiral(Spiral::CLOTHOID, c.length, 0.0, c.radius), start.x, start.y,
                              CMathAngle(c.azimuth));
    const CCurveNE series = clothoidBySeries(c.length, c.radius);
    const CCurveNE simpson =
        bySimpson(c.length, [&c](double s) { return s * s / (2.0 * c.radius * c.length); });
    expectNear(placed(start, c.azimuth, series.x, series.y), spiral.getFinalNE());
    expectNear(placed(start, c.azimuth, simpson.x, simpson.y), spiral.getFinalNE());
    const double turnDeg = c.length / (2.0 * c.radius) * 180.0 / kPi;
    EXPECT_NEAR(0.0, azimuthGap(spiral.getFinalAzimut().getDeg(), c.azimuth + turnDeg), 1e-10);
  }
}

TEST(CurveSpiral, ClothoidBetweenTwoArcsMatchesSimpsonsRule) {
  struct Case {
    double length;
    double startRadius;
    double endRadius;
  };
  const Case cases[] = {
      {150.0, 1000.0, 400.0}, {150.0, -400.0, -1000.0}, {300.0, 600.0, -600.0}, {80.0, 200.0, 0.0}};
  for (const Case& c : cases) {
    const CCurveSpiral spiral(Spiral(Spiral::CLOTHOID, c.length, c.startRadius, c.endRadius), 0.0, 0.0,
                              CMathAngle(0.0));
    const double k0 = 1.0 / c.startRadius;
    const double k1 = c.endRadius == 0.0 ? 0.0 : 1.0 / c.endRadius;
    const CCurveNE simpson =
        bySimpson(c.length, [&](double s) { return k0 * s + (k1 - k0) * s * s / (2.0 * c.length); });
    expectNear(simpson, spiral.getFinalNE());
  }
}

TEST(CurveSpiral, SpiralConstantIsTheRootOfRadiusTimesLength) {
  EXPECT_DOUBLE_EQ(std::sqrt(500.0 * 120.0), GetSpiralConstant(120.0, 500.0));
  EXPECT_DOUBLE_EQ(std::sqrt(500.0 * 120.0), GetSpiralConstant(120.0, -500.0));
  EXPECT_NEAR(300.0, Spiral(Spiral::CLOTHOID, 100.0, 0.0, -900.0).getSpiralConstant(), 1e-12);
  EXPECT_NEAR(300.0, Spiral(Spiral::CLOTHOID, 100.0, 900.0, 0.0).getSpiralConstant(), 1e-12);
  // from 1000 m to 500 m in 100 m: A^2 = L / (1/500 - 1/1000) = 100000
  EXPECT_NEAR(std::sqrt(100000.0), Spiral(Spiral::CLOTHOID, 100.0, 1000.0, 500.0).getSpiralConstant(), 1e-9);
}

TEST(CurveSpiral, SpiralToTheTangentRetracesTheSpiralFromItBackwards) {
  const CCurveNE a{700.0, 900.0};
  for (const Spiral::ESpiralMathType type : {Spiral::CLOTHOID, Spiral::CUBIC_PARABOLA}) {
    for (const double radius : {300.0, -300.0}) {
      const CCurveSpiral out(Spiral(type, 120.0, 0.0, radius), a.x, a.y, CMathAngle(75.0));
      ASSERT_TRUE(out.isTSSC());
      const CMathAngle back(out.getFinalAzimut().getDeg() + 180.0);
      const CCurveSpiral in(Spiral(type, 120.0, -radius, 0.0), out.getFinalNorthing(), out.getFinalEasting(),
                            back);
      ASSERT_TRUE(in.isCSST());
      expectNear(a, in.getFinalNE());
      EXPECT_NEAR(0.0, azimuthGap(in.getFinalAzimut().getDeg(), 255.0), 1e-10);
      CCurveNE outIp;
      CCurveNE inIp;
      ASSERT_TRUE(out.getCurveIp(outIp));
      ASSERT_TRUE(in.getCurveIp(inIp));
      expectNear(outIp, inIp);
    }
  }
}

TEST(CurveSpiral, SpiralIntersectionPointLiesOnBothTangents) {
  for (const ClothoidCase& c : kClothoids) {
    const CCurveSpiral spiral(Spiral(Spiral::CLOTHOID, c.length, 0.0, c.radius), 0.0, 0.0,
                              CMathAngle(c.azimuth));
    CCurveNE ip;
    ASSERT_TRUE(spiral.getCurveIp(ip));
    const CCurveNE end = spiral.getFinalNE();
    const double start = c.azimuth * kPi / 180.0;
    const double final = spiral.getFinalAzimut().getDeg() * kPi / 180.0;
    EXPECT_NEAR(0.0, ip.x * std::sin(start) - ip.y * std::cos(start), kTolerance);  // on the start tangent
    EXPECT_NEAR(0.0, (ip.x - end.x) * std::sin(final) - (ip.y - end.y) * std::cos(final), kTolerance);
  }
}

// ---- Cubic parabola -----------------------------------------------------------------------------

TEST(CurveSpiral, CubicParabolaHasItsOffsetAndTangentPointOfTheTextbook) {
  const double length = 90.0;  // along the tangent
  for (const double radius : {400.0, -400.0}) {
    const CCurveSpiral spiral(Spiral(Spiral::CUBIC_PARABOLA, length, 0.0, radius), 0.0, 0.0, CMathAngle(0.0));
    expectNear({length, length * length / (6.0 * radius)}, spiral.getFinalNE());
    CCurveNE ip;
    ASSERT_TRUE(spiral.getCurveIp(ip));
    expectNear({2.0 * length / 3.0, 0.0}, ip);  // the end tangent cuts the start tangent at 2/3
    // The end azimuth is the direction of the curve at its end, measured here by a short chord.
    const CCurveNE before = spiral.getNEAt(length - 1e-3);
    const CCurveNE after = spiral.getNEAt(length + 1e-3);
    const double chord = std::atan2(after.y - before.y, after.x - before.x);
    EXPECT_NEAR(0.0, azimuthGap(spiral.getFinalAzimut().getDeg(), chord * 180.0 / kPi), 1e-7);
  }
}

TEST(CurveSpiral, UndefinedSpiralsGiveNaNAndNoIntersectionPoint) {
  const Spiral cases[] = {Spiral(Spiral::CUBIC_PARABOLA, 50.0, 300.0, 200.0),
                          Spiral(static_cast<Spiral::ESpiralMathType>(7), 50.0, 0.0, 200.0)};
  for (const Spiral& data : cases) {
    const CCurveSpiral spiral(data, 0.0, 0.0, CMathAngle(0.0));
    EXPECT_TRUE(std::isnan(spiral.getFinalNorthing()));
    CCurveNE ip;
    EXPECT_FALSE(spiral.getCurveIp(ip));
  }
  const CCurveSpiral straight(Spiral(Spiral::CLOTHOID, 50.0, 0.0, 0.0), 0.0, 0.0, CMathAngle(90.0));
  expectNear({0.0, 50.0}, straight.getFinalNE());
  EXPECT_FALSE(straight.isTSSC() || straight.isCSST());
}

}  // namespace
