#pragma once

#include "hostlibs/DexApi.h"
#include "ieObjects/IECoords.h"

// Small geometric helpers of the toolbox: plane direction and distance, the arc through three points,
// interpolation of heights, the ellipsoid-to-ground scale, the turn of a polygon and the orientation of
// a triangle; and the conversion between geodetic and earth-centred coordinates on the WGS-84 ellipsoid.
//
// Plane points are arrays of at least two doubles (x, y); polygon vertices are DexPosition3D, of which
// only x and y are read. Nothing here throws; a null pointer never crashes (see each function).

namespace vyn::ie::utils {

// Error-log line (source "ieUtils\IEUtils", empty message) of getEllToGroundScale meeting an earth
// radius that is neither 0 nor above 6000000 m.
inline constexpr int kLogLineUnusualEarthRadius = 1201;

// ---- Plane direction and distance ---------------------------------------------------------------

// The direction from a to b, atan2(b.y - a.y, b.x - a.x), in radians. 0.0 when either pointer is null.
DEX_API double ctt(const double* a, const double* b);
// The plane distance from a to b. 0.0 when either pointer is null.
DEX_API double dtt(const double* a, const double* b);

// ---- Arcs and heights ---------------------------------------------------------------------------

// The circle through the plane points p1, p2 and p3. On success writes centre[0..2] (x, y and 0, so
// centre must hold three doubles), radius (the distance from p2 to the centre), and angle2 and angle3,
// the directions from p2 and from p3 toward the centre (ctt(p2, centre), ctt(p3, centre)), and returns
// true. Returns false and writes nothing when a pointer is null, when the points lie on one line
// (including two equal points), or when a coordinate or the result is NaN or infinite.
DEX_API bool arcBy3Points(const double* p1, const double* p2, const double* p3, double* centre,
                          double& radius, double& angle2, double& angle3);

// The height at x on the line through (x1, z1) and (x2, z2): z1 + (x - x1)(z2 - z1)/(x2 - x1); z1 when
// x2 equals x1.
DEX_API double getElevationOnLine(double x1, double z1, double x2, double z2, double x);

// The factor from ellipsoid to ground distances at height: height / r + 1, where r is radius, or the
// mean earth radius 6371000 m when radius is 1 or less (or NaN). A radius that is neither 0 nor above
// 6000000 m is suspicious and logged (line kLogLineUnusualEarthRadius), and still used as stated.
DEX_API double getEllToGroundScale(double height, double radius);

// ---- Numbers ------------------------------------------------------------------------------------

// low <= v <= high (false when any of them is NaN).
DEX_API bool isInBorders(double v, double low, double high);
// n is not a multiple of 2; negative odd numbers are odd.
DEX_API bool isOdd(int n);

// ---- Polygon turn -------------------------------------------------------------------------------

// Sums the turn at every vertex, taken cyclically over v[i], v[i+1], v[i+2]: +1 where the cross
// product (v[i+1] - v[i]) x (v[i+2] - v[i+1]) is positive, -1 where it is negative, nothing for 0.
// True when the sum is 0 or more. In x-right, y-up axes a polygon turning left (counter-clockwise on
// screen) is "clockwise" here, as in surveying axes where x points north and y east. No vertices (or a
// null pointer) give true.
DEX_API bool isClockwise(unsigned int count, const DexPosition3D* vertices);

// Brings a triangle, given as 3 vertices or as 4 with a repeated one, into the order isClockwise
// accepts:
// - a count other than 3 or 4 (or a null pointer) changes nothing;
// - with 4 vertices each later vertex whose x and y equal an earlier one's is removed: exchanged with
//   the last vertex and count lowered by 1;
// - when fewer than 3 vertices remain, or the order is already accepted, nothing more changes;
// - otherwise the turn is reversed: with 4 vertices v[0] and v[2] are exchanged, with 3 v[0] and v[1].
// The result is false in every case; callers read the outcome from count and vertices.
DEX_API bool makeSureTriangleIsClockwise(unsigned int& count, DexPosition3D* vertices);

}  // namespace vyn::ie::utils

namespace vyn::ie::math {

// Geodetic to earth-centred coordinates on the WGS-84 ellipsoid (a = 6378137 m, e^2 = 0.00669437999014).
// llh holds latitude (x) and longitude (y) in radians and the ellipsoidal height (z) in meters; xyz
// receives X, Y, Z in meters. Returns 1 on success; returns 0 and leaves xyz unchanged when all three
// values are 0, when the height is kNoHeight, or when a value is NaN or infinite.
DEX_API int _llh2xyz(const DexPosition3D& llh, DexPosition3D& xyz);

// Earth-centred to geodetic coordinates on the WGS-84 ellipsoid; llh receives latitude and longitude in
// radians and the height in meters. A tolerance below 10 refines the latitude until one round changes it
// by no more than tolerance (radians); a tolerance of 10 or more keeps the first estimate. Heights above
// 80 degrees of latitude are taken from Z, elsewhere from the distance to the axis. Returns 1 on
// success; returns 0 and leaves llh unchanged when all three values are 0, when a value is NaN or
// infinite, or when 10 rounds do not reach the tolerance (a negative tolerance never does).
DEX_API int _xyz2llh(const DexPosition3D& xyz, DexPosition3D& llh, double tolerance);

}  // namespace vyn::ie::math
