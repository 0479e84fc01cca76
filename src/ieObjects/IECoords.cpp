#include "ieObjects/IECoords.h"

#include "hostlibs/vynmath.h"
#include "ieObjects/detail/Tolerance.h"

namespace {

using vyn::ie::detail::matchesWithin;

constexpr double kPlaneTolerance = 0.001;
constexpr double kSpatialTolerance = 1e-12;
constexpr double kOrderTolerance = 0.0001;

}  // namespace

// Out of line so that each class has one virtual table and type identity, in the library.
ICoordInfo::~ICoordInfo() = default;

namespace vyn::ie {

// ---- DexPosition2D ------------------------------------------------------------------------------

DexPosition2D::~DexPosition2D() = default;

bool DexPosition2D::isDefined() const noexcept {
  return getX() != 0.0 || getY() != 0.0;
}

bool DexPosition2D::operator==(const DexPosition2D& other) const noexcept {
  return matchesWithin(getX(), other.getX(), kPlaneTolerance) &&
         matchesWithin(getY(), other.getY(), kPlaneTolerance);
}

DexPosition2D& DexPosition2D::operator*=(double factor) noexcept {
  x *= factor;
  y *= factor;
  return *this;
}

// ---- DexPosition3D ------------------------------------------------------------------------------

DexPosition3D::~DexPosition3D() = default;

void DexPosition3D::shiftValues(const DexPosition3D& origin, double scaleX, double scaleY, double scaleZ,
                                double rotation) {
  setX(getX() * scaleX + origin.getX());
  setY(getY() * scaleY + origin.getY());
  setZ(getZ() * scaleZ + origin.getZ());
  if (rotation == 0.0) return;

  const vyn_math::TAbstractPoint<double> centre(origin.getX(), origin.getY());
  vyn_math::TAbstractPoint<double> turned(getX(), getY());
  CMathAngle(rotation).RotatePoint(centre, turned, turned);
  setX(turned.x);
  setY(turned.y);
}

void DexPosition3D::reset() noexcept {
  x = 0.0;
  y = 0.0;
  z = 0.0;
}

bool DexPosition3D::isDefined() const noexcept {
  if (getX() == 0.0 && getY() == 0.0 && getZ() == 0.0) return false;
  return getZ() != kNoHeight;
}

bool DexPosition3D::operator==(const DexPosition3D& other) const noexcept {
  return compareWithPrecision(other, kSpatialTolerance);
}

bool DexPosition3D::compareWithPrecision(const DexPosition3D& other, double tolerance) const noexcept {
  for (unsigned int i = 0; i < 3; ++i) {
    if (!matchesWithin((*this)[i], other[i], tolerance)) return false;
  }
  return true;
}

bool DexPosition3D::operator<(const DexPosition3D& other) const noexcept {
  for (unsigned int i = 0; i < 3; ++i) {
    if (!matchesWithin((*this)[i], other[i], kOrderTolerance)) {
      return (*this)[i] < other[i] - kOrderTolerance;
    }
  }
  return false;
}

DexPosition3D& DexPosition3D::operator*=(double factor) noexcept {
  x *= factor;
  y *= factor;
  z *= factor;
  return *this;
}

// ---- DexNamedPosition2D -------------------------------------------------------------------------

DexNamedPosition2D::DexNamedPosition2D(const CVynStringT<wchar_t>& name, double x, double y)
    : DexPosition2D(x, y), name_(name) {}

DexNamedPosition2D::DexNamedPosition2D(const DexNamedPosition2D& other)
    : DexPosition2D(other), IDexNameInterface(other) {
  setName(other.getName());
}

DexNamedPosition2D::~DexNamedPosition2D() = default;

void DexNamedPosition2D::setName(const CVynStringT<wchar_t>& name) {
  name_ = name;
}

const CVynStringT<wchar_t>& DexNamedPosition2D::getName() const {
  return name_;
}

bool DexNamedPosition2D::operator==(const DexNamedPosition2D& other) const {
  return DexPosition2D::operator==(other) && name_ == other.name_;
}

// ---- DexPositionWithBulge -----------------------------------------------------------------------

DexPositionWithBulge::~DexPositionWithBulge() = default;

}  // namespace vyn::ie
