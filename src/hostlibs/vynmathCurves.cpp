#include "hostlibs/vynmathCurves.h"

#include <algorithm>
#include <array>
#include <cmath>
#include <limits>
#include <numbers>
#include <variant>

#include "hostlibs/detail/SinCosDegrees.h"

namespace {

constexpr double kNaN = std::numeric_limits<double>::quiet_NaN();
constexpr CCurveNE kNoPoint{kNaN, kNaN};

// Gauss-Legendre quadrature with 8 nodes on [-1, 1]: the nodes of the positive half and their weights.
constexpr std::array<double, 4> kNodes = {0.18343464249564980494, 0.52553240991632898582,
                                          0.79666647741362673959, 0.96028985649753623168};
constexpr std::array<double, 4> kWeights = {0.36268378337836198297, 0.31370664587788728734,
                                            0.22238103445337447054, 0.10122853629037625915};
// The quadrature integrates cos and sin of the direction exactly to rounding while the direction turns
// by no more than this over one piece (the error term is below 1e-25 of the piece's length).
constexpr double kMaxTurnPerPiece = 0.5;
// Beyond this many pieces a spiral is not a road element (a radius of millimetres over kilometres).
constexpr double kMaxPieces = 1.0e6;

// The curvature of a spiral end: none for a radius of 0 or an infinite one.
double curvatureOf(double radius) {
  return radius == 0.0 || std::isinf(radius) ? 0.0 : 1.0 / radius;
}

bool isCurved(double radius) {
  return curvatureOf(radius) != 0.0;
}

// A curve whose direction turns by k0 * s + rate * s^2 / 2 at distance s.
struct LinearCurvature {
  double k0 = 0.0;
  double rate = 0.0;

  double turnAt(double s) const { return s * (k0 + 0.5 * rate * s); }

  void addPiece(double from, double to, CCurveNE& sum) const {
    const double middle = 0.5 * (from + to);
    const double half = 0.5 * (to - from);
    for (std::size_t i = 0; i < kNodes.size(); ++i) {
      for (const double side : {-1.0, 1.0}) {
        const double turn = turnAt(middle + side * half * kNodes[i]);
        sum.x += half * kWeights[i] * std::cos(turn);
        sum.y += half * kWeights[i] * std::sin(turn);
      }
    }
  }

  // The point at distance s: the integral of (cos, sin) of the direction from 0 to s.
  CCurveNE pointAt(double s) const {
    const double sharpest = std::max(std::abs(k0), std::abs(k0 + rate * s));
    const double pieces = std::ceil(sharpest * std::abs(s) / kMaxTurnPerPiece);
    if (!(pieces <= kMaxPieces)) return kNoPoint;  // NaN and absurd input alike
    const int count = std::max(1, static_cast<int>(pieces));
    CCurveNE sum{0.0, 0.0};
    for (int piece = 0; piece < count; ++piece)
      addPiece(s * piece / count, s * (piece + 1) / count, sum);
    return sum;
  }
};

// The cubic parabola y = x^3 / (6 c) from the tangent at x = 0, with c = signed radius * length.
struct CubicParabola {
  double c = 0.0;

  CCurveNE pointAt(double x) const { return {x, x * x * x / (6.0 * c)}; }
  double turnAt(double x) const { return std::atan(x * x / (2.0 * c)); }
};

// The local point of vector v seen from a frame turned by angle (radians, clockwise).
CCurveNE turnedBack(const CCurveNE& v, double angle) {
  const double cosine = std::cos(angle);
  const double sine = std::sin(angle);
  return {v.x * cosine + v.y * sine, -v.x * sine + v.y * cosine};
}

// A spiral to the tangent is the parabola from the tangent run backwards: it starts at the parabola's
// far end, heading back, and turns the other way round. mirror is that parabola (of the opposite
// signed radius); distances u run from this spiral's start.
struct CubicParabolaToTangent {
  CubicParabola mirror;
  double length = 0.0;

  CCurveNE pointAt(double u) const {
    const CCurveNE far = mirror.pointAt(length);
    const CCurveNE here = mirror.pointAt(length - u);
    return turnedBack({far.x - here.x, far.y - here.y}, mirror.turnAt(length));
  }
  double turnAt(double u) const { return mirror.turnAt(length - u) - mirror.turnAt(length); }
};

struct Straight {
  CCurveNE pointAt(double s) const { return {s, 0.0}; }
  double turnAt(double /*s*/) const { return 0.0; }
};

// What has no defined shape: a cubic parabola between two arcs, an unknown math type.
struct Undefined {
  CCurveNE pointAt(double /*s*/) const { return kNoPoint; }
  double turnAt(double /*s*/) const { return kNaN; }
};

using SpiralShape = std::variant<Straight, LinearCurvature, CubicParabola, CubicParabolaToTangent, Undefined>;

// visitor(shape) for the shape held; without std::visit, which could throw.
template <class Visitor>
auto onShape(const SpiralShape& shape, Visitor visitor) noexcept {
  if (const auto* clothoid = std::get_if<LinearCurvature>(&shape)) return visitor(*clothoid);
  if (const auto* fromTangent = std::get_if<CubicParabola>(&shape)) return visitor(*fromTangent);
  if (const auto* toTangent = std::get_if<CubicParabolaToTangent>(&shape)) return visitor(*toTangent);
  if (const auto* straight = std::get_if<Straight>(&shape)) return visitor(*straight);
  return visitor(Undefined{});
}

// The formula that gives the points and turns of a spiral.
SpiralShape spiralShape(int mathType, double length, double startRadius, double endRadius) {
  const double k0 = curvatureOf(startRadius);
  const double k1 = curvatureOf(endRadius);
  if (length == 0.0 || (k0 == 0.0 && k1 == 0.0)) return Straight{};
  if (mathType == CCurveDataSpiral::CLOTHOID) return LinearCurvature{k0, (k1 - k0) / length};
  if (mathType != CCurveDataSpiral::CUBIC_PARABOLA || (k0 != 0.0 && k1 != 0.0)) return Undefined{};
  if (k0 == 0.0) return CubicParabola{endRadius * length};
  return CubicParabolaToTangent{CubicParabola{-startRadius * length}, length};
}

// The intersection of the start tangent (the local northing axis) with the tangent at end, heading
// turned by turn; false when the tangents do not meet ahead of the start.
bool tangentIntersection(const CCurveNE& end, double turn, CCurveNE& ip) {
  if (!(turn != 0.0 && std::abs(turn) < std::numbers::pi) || !std::isfinite(end.x) || !std::isfinite(end.y))
    return false;
  ip = {end.x - end.y * std::cos(turn) / std::sin(turn), 0.0};
  return true;
}

}  // namespace

double GetSpiralConstant(double length, double radius) {
  return std::sqrt(std::abs(length) * std::abs(radius));
}

// ---- Straight -----------------------------------------------------------------------------------

CCurveNE CCurveDataSegment::getLocalNE(double distance) const noexcept {
  return {distance, 0.0};
}

double CCurveDataSegment::getLocalTurn(double /*distance*/) const noexcept {
  return 0.0;
}

bool CCurveDataSegment::getLocalIp(CCurveNE& /*ip*/) const noexcept {
  return false;
}

// ---- Circular arc -------------------------------------------------------------------------------

double CCurveDataArc::getLocalTurn(double distance) const noexcept {
  return radius_ == 0.0 ? kNaN : distance / radius_;
}

CCurveNE CCurveDataArc::getLocalNE(double distance) const noexcept {
  const double turn = getLocalTurn(distance);
  if (std::isnan(turn)) return kNoPoint;
  if (turn == 0.0) return {distance, 0.0};
  // 2 sin^2(turn / 2) rather than 1 - cos(turn), which loses the digits of a short arc.
  const double halfSine = std::sin(0.5 * turn);
  return {radius_ * std::sin(turn), 2.0 * radius_ * halfSine * halfSine};
}

bool CCurveDataArc::getLocalIp(CCurveNE& ip) const noexcept {
  const double delta = getDeltaRad();
  if (!(delta != 0.0 && std::abs(delta) < std::numbers::pi)) return false;
  ip = {radius_ * std::tan(0.5 * delta), 0.0};
  return true;
}

// ---- Transition spiral --------------------------------------------------------------------------

bool CCurveDataSpiral::isTSSC() const noexcept {
  return !isCurved(startRadius_) && isCurved(endRadius_);
}

bool CCurveDataSpiral::isCSST() const noexcept {
  return isCurved(startRadius_) && !isCurved(endRadius_);
}

double CCurveDataSpiral::getDefiningRadius() const noexcept {
  return 1.0 / std::abs(curvatureOf(endRadius_) - curvatureOf(startRadius_));
}

CCurveNE CCurveDataSpiral::getLocalNE(double distance) const noexcept {
  return onShape(spiralShape(mathType_, length_, startRadius_, endRadius_),
                 [distance](const auto& shape) { return shape.pointAt(distance); });
}

double CCurveDataSpiral::getLocalTurn(double distance) const noexcept {
  return onShape(spiralShape(mathType_, length_, startRadius_, endRadius_),
                 [distance](const auto& shape) { return shape.turnAt(distance); });
}

bool CCurveDataSpiral::getLocalIp(CCurveNE& ip) const noexcept {
  return tangentIntersection(getLocalNE(length_), getLocalTurn(length_), ip);
}

// ---- Placing ------------------------------------------------------------------------------------

CCurveNE COrgAzFrame::curveNE2worldNE(const CCurveNE& local) const noexcept {
  if (std::isnan(startAzimuth_.getDeg())) return kNoPoint;
  const vyn_math::detail::SinCos turn = vyn_math::detail::sinCosDegrees(startAzimuth_.getDeg());
  return {start_.x + local.x * turn.cos - local.y * turn.sin,
          start_.y + local.x * turn.sin + local.y * turn.cos};
}

CMathAngle COrgAzFrame::azimuthAfterTurn(double localTurn) const noexcept {
  return CMathAngle(startAzimuth_.getDeg() + Rad2Deg(localTurn));
}
