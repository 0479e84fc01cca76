#pragma once

#include <limits>

#include "ieUtils/IEUtilsUnits.h"

// The two markers by which numeric fields of the data model say "no value". They are part of the
// contract with every plug-in: importers write them, exporters test for them, and both compare exactly.
//
// kNoValue, the largest finite double 1.7976931348623157e308, is the toolbox's marker of a numeric
// field without a value (ieUtils/IEUtilsUnits.h); given to a station's setPosition it marks the
// horizontal coordinates or the height as undefined.
namespace vyn::ie {

// The smallest positive normal double, 2.2250738585072014e-308: the height of a position that has
// none (a 3D position whose z is this value is not defined) and an unset tolerance value.
inline constexpr double kNoHeight = std::numeric_limits<double>::min();

}  // namespace vyn::ie
