#pragma once

#include "hostlibs/DexApi.h"
#include "hostlibs/VynAlloc.h"

// The host math library: angle units, the packed degrees-minutes-seconds and feet-and-inches forms,
// the feet, wrapping into a range, points and the angle type.
//
// Conventions shared by every function here:
// - Angles are in decimal degrees unless a name says otherwise.
// - NaN and infinite inputs never hang or crash: the result is NaN or the input itself.
// - Nothing clamps an overflow to the largest double, so the no-value marker 1.7976931348623157e308
//   comes out only when it went in (the library's callers test for it before converting).

// ---- Angle units --------------------------------------------------------------------------------
// A turn is 360 degrees = 2 pi radians = 400 grads (gons) = 6400 mils (the NATO mil).
// normalize: false converts the value as it is (what the library always passes); true wraps the
// result into one turn of the target unit, [0, turn).
DEX_API double Deg2Rad(double degrees, bool normalize = false);
DEX_API double Rad2Deg(double radians, bool normalize = false);
DEX_API double Deg2Grad(double degrees, bool normalize = false);
DEX_API double Grad2Deg(double grads, bool normalize = false);
DEX_API double Deg2Mil(double degrees, bool normalize = false);
DEX_API double Mil2Deg(double mils, bool normalize = false);

// ---- Packed degrees-minutes-seconds DDD.MMSSsss -------------------------------------------------
// 12°30'15.5" is packed as 12.30155: two digits of minutes and two of seconds after the point, then
// the decimals of the seconds. The sign belongs to the whole value (-0°30' is -0.3).

// Decimal degrees to the packed form, rounded half away from zero to `decimals` decimals of the packed
// value: 4 rounds to whole seconds, more to decimals of a second, 3 to tens of seconds, 2 to minutes,
// 1 to tens of minutes, 0 to degrees. Rounding carries (10°59'59.99999" with 4 decimals is 11.0000).
// The result is the double nearest to the packed decimal value, so that printing it with `decimals`
// fixed decimals shows exactly the packed digits. decimals is taken into 0..15 (15 gives seconds to
// 11 decimals, beyond the resolution of a double). normalize true first wraps the angle into
// [0, 360). A result of zero is +0.
DEX_API double Deg2DDDMMSS(double degrees, int decimals, bool normalize = false);

// The packed form to decimal degrees. The value is read by its shortest decimal text, the digits a
// person typed, so that binary fractions do no harm: 12.3 is 12°30' = 12.5 exactly, 12.03055 is
// 12°03'05.5". Missing digits count as trailing zeros. Minutes and seconds of 60 or more are not
// rejected; they add what they say (12.75 is 12° + 75' = 13.25).
DEX_API double DDDMMSS2Deg(double packed);

// ---- Feet ---------------------------------------------------------------------------------------
// A US survey foot is 1200/3937 m, an international foot 0.3048 m.
DEX_API double Meter2USFeet(double meters);
DEX_API double USFeet2Meter(double usFeet);
DEX_API double Meter2IFeet(double meters);
DEX_API double IFeet2Meter(double internationalFeet);

// Packed feet and inches FFF.IIiii: the whole feet, then after the point two digits of inches (0 to
// 11) and the decimals of the inch. 5 ft 6.5 in is 5.065, 3 ft 11 in is 3.11. The sign belongs to the
// whole value. us selects the US survey foot, otherwise the international foot.
// Meter2FFFII rounds the inches to 1e-9 inch, carrying 12 inches into the next foot, and gives the
// double nearest to the packed decimal value. FFFII2Meter reads the value by its shortest decimal text
// as DDDMMSS2Deg does (5.1 is 5 ft 10 in); inches of 12 or more add what they say.
DEX_API double Meter2FFFII(double meters, bool us);
DEX_API double FFFII2Meter(double packed, bool us);

// ---- Ranges -------------------------------------------------------------------------------------
// Wraps value periodically into [low, high): toRange(-90, 0, 360) is 270, toRange(540, -180, 180) is
// -180. A value already inside is returned unchanged. NaN, infinite values and an empty or invalid
// range (high not above low) return the value unchanged.
DEX_API double toRange(double value, double low, double high);

// ---- Points -------------------------------------------------------------------------------------
namespace vyn_math {

// A plain 2D point of the math library. Equality is exact.
template <typename T>
struct TAbstractPoint {
  T x{};
  T y{};

  constexpr TAbstractPoint() = default;
  constexpr TAbstractPoint(T xValue, T yValue) : x(xValue), y(yValue) {}

  friend constexpr bool operator==(const TAbstractPoint&, const TAbstractPoint&) = default;
};

// A plain 3D point of the math library. Equality is exact.
template <typename T>
struct TAbstractPoint3 {
  T x{};
  T y{};
  T z{};

  constexpr TAbstractPoint3() = default;
  constexpr TAbstractPoint3(T xValue, T yValue, T zValue) : x(xValue), y(yValue), z(zValue) {}

  friend constexpr bool operator==(const TAbstractPoint3&, const TAbstractPoint3&) = default;
};

}  // namespace vyn_math

// ---- Angle type ---------------------------------------------------------------------------------
// An angle held in decimal degrees and always normalised into [0, 360): -90 becomes 270, 720 becomes
// 0. A NaN or infinite value is kept as NaN.
class DEX_API CMathAngle {
 public:
  VYN_CLASS_ALLOCATOR

  CMathAngle() noexcept = default;
  explicit CMathAngle(double degrees) noexcept;

  double getDeg() const noexcept { return degrees_; }
  double getRad() const noexcept;
  void setDeg(double degrees) noexcept;

  // Rotates point about centre by this angle counter-clockwise in the mathematical sense (x to the
  // right, y up: 90 degrees turns (1, 0) into (0, 1)) and writes the result to out (which may be the
  // same object as point or centre). Multiples of 90 degrees rotate exactly.
  void RotatePoint(const vyn_math::TAbstractPoint<double>& centre,
                   const vyn_math::TAbstractPoint<double>& point,
                   vyn_math::TAbstractPoint<double>& out) const noexcept;

 private:
  double degrees_ = 0.0;
};
