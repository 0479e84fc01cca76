#pragma once

// Error-log records of the survey objects. Every file of the survey objects logs under the one source
// tag; the lines tell the places apart.
namespace vyn::ie::detail {

inline constexpr const wchar_t* kObjectsLogSource = L"ieObjects\\IEObjects";

// DexObject::getDrawPropertiesByCode() was asked for an object without codes.
inline constexpr int kDrawPropertiesByCodeWithoutCodeLine = 501;
// DexObject::getDrawPropertiesByCodeLayer() was asked for an object without codes.
inline constexpr int kDrawPropertiesByCodeLayerWithoutCodeLine = 502;
// DexPolyLine::getStation() was asked for an index outside the stations.
inline constexpr int kPolyLineStationIndexLine = 503;
// DexPolyLine::getNodeStation() was asked for an index outside the nodes.
inline constexpr int kPolyLineNodeIndexLine = 504;
// DexPolyLine::getNodeStation() met a point entry that refers to no point.
inline constexpr int kPolyLineNodeWithoutPointLine = 505;

}  // namespace vyn::ie::detail
