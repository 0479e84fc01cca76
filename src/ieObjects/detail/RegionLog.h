#pragma once

// Error-log records of the regions.
namespace vyn::ie::detail {

inline constexpr const wchar_t* kRegionLogSource = L"ieObjects\\IERegion";

// DexRegion::getVertexAt() was asked for an index at or past the end of the vertices.
inline constexpr int kRegionVertexIndexLine = 721;

}  // namespace vyn::ie::detail
