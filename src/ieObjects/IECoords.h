#pragma once

#include "hostlibs/DexApi.h"
#include "hostlibs/VynAlloc.h"
#include "hostlibs/VynString.h"
#include "ieObjects/IEInterfaces.h"
#include "ieObjects/IENoValue.h"

// The coordinate value types of the data model: plane and spatial positions, a named plane position and
// a polyline vertex with its bulge. Importers fill them and exporters read them, so their tolerances and
// no-value rules below are part of the plug-in contract. Stations are in IEStation.h.
//
// All comparisons use strict tolerances: two values match when their difference d satisfies
// -t < d < t, so a difference of exactly t does not match.

// Tells whether an object's coordinates carry values. It lives in the global namespace and, unlike the
// other interfaces, has its destructor last in its table: that order is the plug-in ABI.
class DEX_API ICoordInfo {
 public:
  ICoordInfo() = default;
  ICoordInfo(const ICoordInfo&) = default;
  ICoordInfo& operator=(const ICoordInfo&) = default;

  virtual bool isHorizCoordsDefined() const = 0;
  virtual bool isHeightDefined() const = 0;
  virtual ~ICoordInfo();
};

namespace vyn::ie {

// A plane position (x, y), by value. (0, 0) counts as "no position".
class DEX_API DexPosition2D {
 public:
  VYN_CLASS_ALLOCATOR

  // ---- Construction ---------------------------------------------------------------------------
  DexPosition2D() noexcept = default;  // (0, 0)
  DexPosition2D(double xValue, double yValue) noexcept : x(xValue), y(yValue) {}
  DexPosition2D(const DexPosition2D&) noexcept = default;
  DexPosition2D& operator=(const DexPosition2D&) noexcept = default;
  virtual ~DexPosition2D();

  // ---- Access ---------------------------------------------------------------------------------
  double getX() const noexcept { return x; }
  double getY() const noexcept { return y; }
  void setX(double value) noexcept { x = value; }
  void setY(double value) noexcept { y = value; }
  // The two coordinates in the order x, y (the fields are adjacent).
  const double* getCoordinates() const noexcept { return &x; }
  double* getCoordinates() noexcept { return &x; }

  // False only when x and y are both exactly 0.
  bool isDefined() const noexcept;

  // ---- Comparison and scaling -----------------------------------------------------------------
  // x and y each within 0.001 (strict).
  bool operator==(const DexPosition2D& other) const noexcept;
  bool operator!=(const DexPosition2D& other) const noexcept { return !(*this == other); }
  // Multiplies both coordinates by factor.
  DexPosition2D& operator*=(double factor) noexcept;

  // The coordinates, public as plug-ins read and write them directly.
  double x = 0.0;
  double y = 0.0;
};

// A spatial position (x, y, z), by value. (0, 0, 0) counts as "no position", and a z equal to kNoHeight
// as a position without height.
class DEX_API DexPosition3D {
 public:
  VYN_CLASS_ALLOCATOR

  // ---- Construction ---------------------------------------------------------------------------
  DexPosition3D() noexcept { reset(); }
  DexPosition3D(double xValue, double yValue, double zValue) noexcept : x(xValue), y(yValue), z(zValue) {}
  DexPosition3D(const DexPosition3D&) noexcept = default;
  DexPosition3D& operator=(const DexPosition3D&) noexcept = default;
  virtual ~DexPosition3D();

  // Scales each coordinate and adds the origin's (x * scaleX + origin.x and so on); then, unless
  // rotation is exactly 0, turns (x, y) about (origin.x, origin.y) by rotation degrees counter-clockwise
  // (CMathAngle::RotatePoint). z is not rotated. The coordinate shift of every model object builds on it.
  virtual void shiftValues(const DexPosition3D& origin, double scaleX, double scaleY, double scaleZ,
                           double rotation);

  // Sets x, y and z to 0. Not virtual here: a station's own reset() is reached only through a station
  // (through a DexPosition3D reference only the coordinates are reset).
  void reset() noexcept;

  // ---- Access ---------------------------------------------------------------------------------
  double getX() const noexcept { return x; }
  double getY() const noexcept { return y; }
  double getZ() const noexcept { return z; }
  void setX(double value) noexcept { x = value; }
  void setY(double value) noexcept { y = value; }
  void setZ(double value) noexcept { z = value; }
  // x, y, z for index 0, 1, 2; an index above 2 gives z.
  double& operator[](unsigned int index) noexcept { return index == 0 ? x : (index == 1 ? y : z); }
  const double& operator[](unsigned int index) const noexcept {
    return index == 0 ? x : (index == 1 ? y : z);
  }
  // The three coordinates in the order x, y, z (the fields are adjacent).
  const double* getCoordinates() const noexcept { return &x; }
  double* getCoordinates() noexcept { return &x; }

  // False when x, y and z are all exactly 0, or when z is kNoHeight; true otherwise.
  bool isDefined() const noexcept;

  // ---- Comparison and scaling -----------------------------------------------------------------
  // x, y and z each within 1e-12 (strict).
  bool operator==(const DexPosition3D& other) const noexcept;
  bool operator!=(const DexPosition3D& other) const noexcept { return !(*this == other); }
  // x, y and z each within tolerance (strict; a tolerance of 0 matches nothing).
  bool compareWithPrecision(const DexPosition3D& other, double tolerance) const noexcept;
  // Lexicographic on x, y, z where coordinates within 0.0001 count as equal: the first coordinate that
  // does not match decides, and it is "less" when it lies below the other's minus 0.0001. Positions that
  // match in all three are neither less nor greater.
  bool operator<(const DexPosition3D& other) const noexcept;
  // Multiplies the three coordinates by factor.
  DexPosition3D& operator*=(double factor) noexcept;

  // The coordinates, public as plug-ins read and write them directly.
  double x = 0.0;
  double y = 0.0;
  double z = 0.0;
};

// A plane position with a name (fiducial marks and image points of the imaging data).
class DEX_API DexNamedPosition2D : public DexPosition2D, public IDexNameInterface {
 public:
  VYN_CLASS_ALLOCATOR

  DexNamedPosition2D() = default;  // (0, 0), empty name
  DexNamedPosition2D(const CVynStringT<wchar_t>& name, double x, double y);
  // Copies the position, then takes the name through setName.
  DexNamedPosition2D(const DexNamedPosition2D& other);
  DexNamedPosition2D& operator=(const DexNamedPosition2D&) = default;
  ~DexNamedPosition2D() override;

  // Stored and returned unchanged.
  void setName(const CVynStringT<wchar_t>& name) override;
  const CVynStringT<wchar_t>& getName() const override;

  // Positions equal by the plane rule (0.001) and names exactly equal (case-sensitive).
  bool operator==(const DexNamedPosition2D& other) const;
  bool operator!=(const DexNamedPosition2D& other) const { return !(*this == other); }

 private:
  CVynStringT<wchar_t> name_;
};

// A vertex of a polyline, area or region: its position and the bulge of the arc from this vertex to
// the next one (0 for a straight segment).
class DEX_API DexPositionWithBulge : public DexPosition3D {
 public:
  VYN_CLASS_ALLOCATOR

  DexPositionWithBulge() noexcept = default;  // (0, 0, 0), bulge 0
  DexPositionWithBulge(double x, double y, double z, double bulge) noexcept
      : DexPosition3D(x, y, z), bulge_(bulge) {}
  DexPositionWithBulge(const DexPositionWithBulge&) noexcept = default;
  DexPositionWithBulge& operator=(const DexPositionWithBulge&) noexcept = default;
  ~DexPositionWithBulge() override;

  double getBulge() const noexcept { return bulge_; }
  void setBulge(double bulge) noexcept { bulge_ = bulge; }

 private:
  double bulge_ = 0.0;
};

}  // namespace vyn::ie
