#pragma once

#include "hostlibs/DexApi.h"
#include "hostlibs/VynAlloc.h"
#include "hostlibs/vynmath.h"

// The curve elements of the host math library: the straight, the circular arc and the transition
// spiral (clothoid or cubic parabola) of a road's plan, each placed at a start point with a start
// azimuth. The alignment factories (DexLine2D, DexCurve and DexSpiral createSegment) read from them the
// end point and end azimuth, the intersection point of the tangents, the radii and the centre.
//
// Orientation and sign conventions, which every element here and the factories rely on:
// - A point is a (northing, easting) pair: in a CCurveNE the northing is x and the easting y.
// - Azimuths are decimal degrees clockwise from north (0 north, 90 east), held in a CMathAngle and so
//   always in [0, 360). Turns inside an element are radians, clockwise positive.
// - A signed radius is positive for a curve that turns clockwise (to the right, seen in the direction
//   of travel) and negative for one that turns counter-clockwise. A spiral end whose radius is 0 or
//   infinite has no curvature: it is the end on the tangent.
// - Every element is computed in its local frame first: the origin at the start point, the local
//   northing axis along the start tangent, the local easting axis 90 degrees clockwise from it. A curve
//   that turns clockwise bends towards positive local easting, and an arc's centre is at (0, signed
//   radius). curveNE2worldNE turns a local point by the start azimuth and moves it to the start point.
// - Distances along an element run from its start, along the curve; only the cubic parabola measures
//   them along its tangent at the straight end (its abscissa), as its closed form y = x^3 / (6 R X)
//   is written, so that its length is the length of that tangent under it.
// - Nothing fails loudly: degenerate input gives NaN coordinates (an arc of radius 0, a cubic parabola
//   between two arcs, a spiral of an unknown math type) and getCurveIp answers false where the two
//   tangents do not meet ahead of the start (a straight, no turn, a turn of half a circle or more).
//
// Accuracy: the clothoid is integrated with Gauss-Legendre quadrature on pieces over which its
// direction turns by at most half a radian, which leaves only rounding: well under 1e-9 m over 1 km.
// The arc and the cubic parabola are computed from their closed forms.

// A point of the plan: x is the northing, y the easting.
using CCurveNE = vyn_math::TAbstractPoint<double>;

// The spiral constant A of a transition of this length that reaches this radius from the tangent,
// A = sqrt(length * radius) (taken of the magnitudes; an infinite radius gives infinity).
DEX_API double GetSpiralConstant(double length, double radius);

// ---- Element shapes in their local frame --------------------------------------------------------
// Each shape answers getLocalNE(distance), getLocalTurn(distance) and getLocalIp(ip) in the local frame
// described above; COrgAzCurveT places it in the world.

// A straight of a given length.
class DEX_API CCurveDataSegment {
 public:
  VYN_CLASS_ALLOCATOR

  CCurveDataSegment() noexcept = default;
  explicit CCurveDataSegment(double length) noexcept : length_(length) {}

  double getLength() const noexcept { return length_; }
  void setLength(double length) noexcept { length_ = length; }

  // (distance, 0).
  CCurveNE getLocalNE(double distance) const noexcept;
  // 0: a straight does not turn.
  double getLocalTurn(double distance) const noexcept;
  // False: a straight has no intersection point of two tangents.
  bool getLocalIp(CCurveNE& ip) const noexcept;

 private:
  double length_ = 0.0;
};

// A circular arc of a given length and signed radius (positive: turning clockwise). An infinite
// radius makes it a straight; a radius of 0 gives NaN points.
class DEX_API CCurveDataArc {
 public:
  VYN_CLASS_ALLOCATOR

  CCurveDataArc() noexcept = default;
  CCurveDataArc(double length, double signedRadius) noexcept : length_(length), radius_(signedRadius) {}

  double getLength() const noexcept { return length_; }
  void setLength(double length) noexcept { length_ = length; }
  // The signed radius.
  double getRadius() const noexcept { return radius_; }
  void setRadius(double signedRadius) noexcept { radius_ = signedRadius; }
  // The turn of the whole arc, length / radius, in radians (clockwise positive).
  double getDeltaRad() const noexcept { return getLocalTurn(length_); }
  // The centre in the local frame, (0, signed radius); curveNE2worldNE places it.
  CCurveNE getCenterNE() const noexcept { return {0.0, radius_}; }

  CCurveNE getLocalNE(double distance) const noexcept;
  double getLocalTurn(double distance) const noexcept;
  // The intersection point of the tangents at the start and the end, at the tangent length
  // radius * tan(delta / 2) along the start tangent; false when the arc turns by 0 or by half a
  // circle or more.
  bool getLocalIp(CCurveNE& ip) const noexcept;

 private:
  double length_ = 0.0;
  double radius_ = 0.0;
};

// A transition spiral between two curvatures: from the start radius to the end radius (signed; 0 or
// infinite for the end on the tangent) over its length. The clothoid's curvature changes linearly
// with the distance along it; the cubic parabola runs from or to the tangent as y = x^3 / (6 R X),
// with X its length along that tangent.
class DEX_API CCurveDataSpiral {
 public:
  VYN_CLASS_ALLOCATOR

  // The math types of a spiral; other values may be stored and give NaN points.
  enum ESpiralMathType : int {
    CLOTHOID = 1,
    CUBIC_PARABOLA = 2,
  };

  // A clothoid of length 0 with both ends on the tangent.
  CCurveDataSpiral() noexcept = default;
  CCurveDataSpiral(ESpiralMathType mathType, double length, double startRadius, double endRadius) noexcept
      : mathType_(mathType), length_(length), startRadius_(startRadius), endRadius_(endRadius) {}

  int getSpiralMathType() const noexcept { return mathType_; }
  void setSpiralMathType(ESpiralMathType mathType) noexcept { mathType_ = mathType; }
  double getLength() const noexcept { return length_; }
  void setLength(double length) noexcept { length_ = length; }
  double getStartRadius() const noexcept { return startRadius_; }
  double getEndRadius() const noexcept { return endRadius_; }
  void setRadii(double startRadius, double endRadius) noexcept {
    startRadius_ = startRadius;
    endRadius_ = endRadius;
  }

  // From the tangent to a curve: the start has no curvature, the end has.
  bool isTSSC() const noexcept;
  // From a curve to the tangent: the start has curvature, the end has none.
  bool isCSST() const noexcept;
  // The signed radius of the curved end, whose sign tells the turn: the start radius of a spiral to
  // the tangent, the end radius otherwise.
  double getRadius() const noexcept { return isCSST() ? startRadius_ : endRadius_; }
  // The radius that a spiral of this length from the tangent would reach with the same change of
  // curvature, 1 / |1/endRadius - 1/startRadius|: the radius of the curved end for a spiral from or to
  // the tangent. With getLength() it defines the spiral constant.
  double getDefiningRadius() const noexcept;
  // GetSpiralConstant(getLength(), getDefiningRadius()).
  double getSpiralConstant() const noexcept { return GetSpiralConstant(length_, getDefiningRadius()); }

  CCurveNE getLocalNE(double distance) const noexcept;
  double getLocalTurn(double distance) const noexcept;
  // The intersection point of the tangents at the start and the end, on the start tangent; false
  // when the spiral turns by 0 or by half a circle or more, or its points are NaN.
  bool getLocalIp(CCurveNE& ip) const noexcept;

 private:
  int mathType_ = CLOTHOID;
  double length_ = 0.0;
  double startRadius_ = 0.0;
  double endRadius_ = 0.0;
};

// ---- Placing an element -------------------------------------------------------------------------

// The start point and start azimuth of an element, and the change from its local frame to the world.
class DEX_API COrgAzFrame {
 public:
  VYN_CLASS_ALLOCATOR

  COrgAzFrame() noexcept = default;
  COrgAzFrame(double startNorthing, double startEasting, const CMathAngle& startAzimuth) noexcept
      : start_(startNorthing, startEasting), startAzimuth_(startAzimuth) {}

  double getStartNorthing() const noexcept { return start_.x; }
  double getStartEasting() const noexcept { return start_.y; }
  const CCurveNE& getStartNE() const noexcept { return start_; }
  const CMathAngle& getStartAzimut() const noexcept { return startAzimuth_; }
  void setStart(double northing, double easting, const CMathAngle& azimuth) noexcept {
    start_ = {northing, easting};
    startAzimuth_ = azimuth;
  }

  // The world point of a point of the local frame: turned clockwise by the start azimuth, then moved
  // to the start point.
  CCurveNE curveNE2worldNE(const CCurveNE& local) const noexcept;
  // The world azimuth of a direction turned by localTurn radians (clockwise) from the start tangent.
  CMathAngle azimuthAfterTurn(double localTurn) const noexcept;

 private:
  CCurveNE start_;
  CMathAngle startAzimuth_;
};

// An element shape (CCurveDataSegment, CCurveDataArc or CCurveDataSpiral) placed at a start point with
// a start azimuth: the end point and azimuth, any point along it, and the intersection point of its
// tangents in world coordinates. The shape's own accessors (length, radii) stay available.
template <class Data>
class COrgAzCurveT : public Data, public COrgAzFrame {
 public:
  VYN_CLASS_ALLOCATOR

  COrgAzCurveT() noexcept = default;
  COrgAzCurveT(const Data& data, double startNorthing, double startEasting,
               const CMathAngle& startAzimuth) noexcept
      : Data(data), COrgAzFrame(startNorthing, startEasting, startAzimuth) {}

  // ---- Along the element ----------------------------------------------------------------------
  CCurveNE getNEAt(double distance) const noexcept { return curveNE2worldNE(this->getLocalNE(distance)); }
  CMathAngle getAzimutAt(double distance) const noexcept {
    return azimuthAfterTurn(this->getLocalTurn(distance));
  }

  // ---- The end ----------------------------------------------------------------------------------
  CCurveNE getFinalNE() const noexcept { return getNEAt(this->getLength()); }
  double getFinalNorthing() const noexcept { return getFinalNE().x; }
  double getFinalEasting() const noexcept { return getFinalNE().y; }
  CMathAngle getFinalAzimut() const noexcept { return getAzimutAt(this->getLength()); }

  // ---- Intersection point of the tangents -----------------------------------------------------
  // The point where the tangents at the start and the end meet; false (ip unchanged) when they do
  // not meet ahead of the start.
  bool getCurveIp(CCurveNE& ip) const noexcept {
    CCurveNE local;
    if (!this->getLocalIp(local)) return false;
    ip = curveNE2worldNE(local);
    return true;
  }
};

using CCurveSegment = COrgAzCurveT<CCurveDataSegment>;
using CCurveArc = COrgAzCurveT<CCurveDataArc>;
using CCurveSpiral = COrgAzCurveT<CCurveDataSpiral>;
