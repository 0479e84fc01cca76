#include "ieUtils/IEUtilsGeometry.h"

#include <cmath>
#include <utility>

#include "hostlibs/VynLogging.h"
#include "ieObjects/IENoValue.h"
#include "ieUtils/detail/UtilsLog.h"

namespace vyn::ie::utils {
namespace {

constexpr double kMeanEarthRadius = 6371000.0;
// Radii at or below this are not earth radii; 0 is the caller's "use the mean radius" and not logged.
constexpr double kLowestPlausibleEarthRadius = 6000000.0;

bool isFinite(const double* point) noexcept {
  return std::isfinite(point[0]) && std::isfinite(point[1]);
}

// The sign of the turn at b on the way a -> b -> c: +1 left, -1 right, 0 straight (in x-right, y-up
// axes).
int turnAt(const DexPosition3D& a, const DexPosition3D& b, const DexPosition3D& c) noexcept {
  const double cross = (b.x - a.x) * (c.y - b.y) - (c.x - b.x) * (b.y - a.y);
  return (cross > 0.0) - (cross < 0.0);
}

bool samePlanePosition(const DexPosition3D& a, const DexPosition3D& b) noexcept {
  return a.x == b.x && a.y == b.y;
}

// Removes every vertex whose plane position repeats an earlier one by exchanging it with the last.
void removeRepeatedVertices(unsigned int& count, DexPosition3D* vertices) noexcept {
  unsigned int later = 1;
  while (later < count) {
    bool repeated = false;
    for (unsigned int earlier = 0; earlier < later && !repeated; ++earlier)
      repeated = samePlanePosition(vertices[earlier], vertices[later]);
    if (repeated) {
      std::swap(vertices[later], vertices[count - 1]);
      --count;  // the vertex moved into `later` is examined next
    } else {
      ++later;
    }
  }
}

}  // namespace

double ctt(const double* a, const double* b) {
  if (a == nullptr || b == nullptr) return 0.0;
  return std::atan2(b[1] - a[1], b[0] - a[0]);
}

double dtt(const double* a, const double* b) {
  if (a == nullptr || b == nullptr) return 0.0;
  return std::hypot(b[0] - a[0], b[1] - a[1]);
}

bool arcBy3Points(const double* p1, const double* p2, const double* p3, double* centre, double& radius,
                  double& angle2, double& angle3) {
  if (p1 == nullptr || p2 == nullptr || p3 == nullptr || centre == nullptr) return false;
  if (!isFinite(p1) || !isFinite(p2) || !isFinite(p3)) return false;

  const double d = 2.0 * ((p2[0] - p1[0]) * (p3[1] - p2[1]) - (p3[0] - p2[0]) * (p2[1] - p1[1]));
  if (d == 0.0) return false;

  const double a = p2[0] * p2[0] + p2[1] * p2[1] - p1[0] * p1[0] - p1[1] * p1[1];
  const double b = p3[0] * p3[0] + p3[1] * p3[1] - p2[0] * p2[0] - p2[1] * p2[1];
  const double found[3] = {(a * (p3[1] - p2[1]) - (p2[1] - p1[1]) * b) / d,
                           ((p2[0] - p1[0]) * b - (p3[0] - p2[0]) * a) / d, 0.0};
  // Nearly collinear points put the centre beyond the range of a double.
  if (!isFinite(found)) return false;

  const double foundRadius = dtt(p2, found);
  if (!std::isfinite(foundRadius)) return false;
  centre[0] = found[0];
  centre[1] = found[1];
  centre[2] = found[2];
  radius = foundRadius;
  angle2 = ctt(p2, found);
  angle3 = ctt(p3, found);
  return true;
}

double getElevationOnLine(double x1, double z1, double x2, double z2, double x) {
  if (x2 == x1) return z1;
  return z1 + (x - x1) * (z2 - z1) / (x2 - x1);
}

double getEllToGroundScale(double height, double radius) {
  if (radius != 0.0 && !(radius > kLowestPlausibleEarthRadius))
    vyn_logging::vyn_err_log(detail::kUtilsLogSource, kLogLineUnusualEarthRadius, L"");
  const double earthRadius = (radius <= 1.0 || std::isnan(radius)) ? kMeanEarthRadius : radius;
  return height / earthRadius + 1.0;
}

bool isInBorders(double v, double low, double high) {
  return low <= v && v <= high;
}

bool isOdd(int n) {
  return n % 2 != 0;
}

bool isClockwise(unsigned int count, const DexPosition3D* vertices) {
  if (vertices == nullptr) return true;
  int turns = 0;
  for (unsigned int i = 0; i < count; ++i)
    turns += turnAt(vertices[i], vertices[(i + 1) % count], vertices[(i + 2) % count]);
  return turns >= 0;
}

bool makeSureTriangleIsClockwise(unsigned int& count, DexPosition3D* vertices) {
  if ((count != 3 && count != 4) || vertices == nullptr) return false;
  if (count == 4) removeRepeatedVertices(count, vertices);
  if (count < 3 || isClockwise(count, vertices)) return false;
  if (count == 4)
    std::swap(vertices[0], vertices[2]);
  else
    std::swap(vertices[0], vertices[1]);
  return false;
}

}  // namespace vyn::ie::utils

namespace vyn::ie::math {
namespace {

// WGS-84.
constexpr double kSemiMajorAxis = 6378137.0;
constexpr double kEccentricitySquared = 0.00669437999014;
constexpr double kOneMinusEccentricitySquared = 0.9933056200098587;
// The same ratio as it seeds the latitude of the inverse conversion.
constexpr double kLatitudeSeedRatio = 0.99330562000986;
// Above 80 degrees the height is taken from Z, where cos(latitude) no longer carries it well.
constexpr double kPolarLatitude = 1.3962634015954636;
constexpr int kMaxLatitudeRounds = 10;
constexpr double kNoRefinement = 10.0;

// The radius of curvature in the prime vertical at latitude.
double primeVerticalRadius(double latitude) noexcept {
  const double sine = std::sin(latitude);
  return kSemiMajorAxis / std::sqrt(1.0 - kEccentricitySquared * sine * sine);
}

bool isFinite(const DexPosition3D& position) noexcept {
  return std::isfinite(position.x) && std::isfinite(position.y) && std::isfinite(position.z);
}

bool isOrigin(const DexPosition3D& position) noexcept {
  return position.x == 0.0 && position.y == 0.0 && position.z == 0.0;
}

}  // namespace

int _llh2xyz(const DexPosition3D& llh, DexPosition3D& xyz) {
  if (isOrigin(llh) || llh.z == kNoHeight || !isFinite(llh)) return 0;
  const double latitude = llh.x;
  const double longitude = llh.y;
  const double height = llh.z;
  const double n = primeVerticalRadius(latitude);
  xyz.x = (n + height) * std::cos(latitude) * std::cos(longitude);
  xyz.y = (n + height) * std::cos(latitude) * std::sin(longitude);
  xyz.z = (n * kOneMinusEccentricitySquared + height) * std::sin(latitude);
  return 1;
}

int _xyz2llh(const DexPosition3D& xyz, DexPosition3D& llh, double tolerance) {
  if (isOrigin(xyz) || !isFinite(xyz)) return 0;
  const double p = std::hypot(xyz.x, xyz.y);
  double latitude = std::atan2(xyz.z, p * kLatitudeSeedRatio);
  if (tolerance < kNoRefinement) {
    bool reached = false;
    for (int round = 0; round < kMaxLatitudeRounds && !reached; ++round) {
      const double previous = latitude;
      const double n = primeVerticalRadius(previous);
      latitude = std::atan2(xyz.z + n * kEccentricitySquared * std::sin(previous), p);
      reached = std::fabs(latitude - previous) <= tolerance;
    }
    if (!reached) return 0;
  }
  const double n = primeVerticalRadius(latitude);
  const double height = std::fabs(latitude) > kPolarLatitude
                            ? xyz.z / std::sin(latitude) - n + n * kEccentricitySquared
                            : p / std::cos(latitude) - n;
  llh.x = latitude;
  llh.y = std::atan2(xyz.y, xyz.x);
  llh.z = height;
  return 1;
}

}  // namespace vyn::ie::math
