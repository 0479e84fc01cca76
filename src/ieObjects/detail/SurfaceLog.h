#pragma once

// Error-log records of the surfaces and their position index. Every record carries the one source tag;
// the lines tell the places apart.
namespace vyn::ie::detail {

inline constexpr const wchar_t* kSurfaceLogSource = L"ieObjects\\IESurface";

// DexSurface::addPosition() stored a position that equals one already indexed in x, y and z.
inline constexpr int kSurfaceDuplicatePositionLine = 701;
// DexSurface::addPosition() stored a position with a NaN or infinite coordinate, which is not indexed.
inline constexpr int kSurfaceNonFinitePositionLine = 702;
// DexSurface::addPosition() stored a position beyond the reach of the largest index box (a coordinate
// near the largest double), which is not indexed.
inline constexpr int kSurfacePositionOutOfReachLine = 703;
// DexSurface::getPositionAt() was asked for an index outside the positions.
inline constexpr int kSurfacePositionIndexLine = 704;
// The position index was created with a capacity of 0 or less.
inline constexpr int kSurfaceIndexCapacityLine = 705;

}  // namespace vyn::ie::detail
