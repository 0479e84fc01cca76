#pragma once

// Error-log records of the positions and stations. The source tag is the same for every file of the
// coordinate types.
namespace vyn::ie::detail {

inline constexpr const wchar_t* kCoordsLogSource = L"ieObjects\\IECoords";

// addPointAttr left none, or more than one, of the mutually exclusive point attribute flags 1 to 4 set.
inline constexpr int kExclusivePointAttrsLine = 201;

}  // namespace vyn::ie::detail
