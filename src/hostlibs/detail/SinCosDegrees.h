#pragma once

#include <algorithm>
#include <cmath>

#include "hostlibs/vynmath.h"

namespace vyn_math::detail {

struct SinCos {
  double sin = 0.0;
  double cos = 1.0;
};

// Sine and cosine of an angle in [0, 360), exact at the multiples of 90 degrees, so that elements and
// rotations along the axes stay on them.
inline SinCos sinCosDegrees(double degrees) {
  const int quadrant = std::clamp(static_cast<int>(degrees / 90.0), 0, 3);
  const double rest = Deg2Rad(degrees - 90.0 * quadrant);
  const SinCos inQuadrant = rest == 0.0 ? SinCos{} : SinCos{std::sin(rest), std::cos(rest)};
  switch (quadrant) {
    case 1:
      return {inQuadrant.cos, -inQuadrant.sin};
    case 2:
      return {-inQuadrant.sin, -inQuadrant.cos};
    case 3:
      return {-inQuadrant.cos, inQuadrant.sin};
    default:
      return inQuadrant;
  }
}

}  // namespace vyn_math::detail
