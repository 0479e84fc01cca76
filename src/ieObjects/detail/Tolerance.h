#pragma once

// The one tolerance rule of the coordinate comparisons: values match when their difference lies
// strictly inside (-tolerance, tolerance). A difference of exactly the tolerance, a NaN or a tolerance of
// 0 or below never matches.
namespace vyn::ie::detail {

inline bool matchesWithin(double value, double other, double tolerance) noexcept {
  const double difference = value - other;
  return -tolerance < difference && difference < tolerance;
}

}  // namespace vyn::ie::detail
