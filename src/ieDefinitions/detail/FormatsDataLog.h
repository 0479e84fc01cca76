#pragma once

// The error-log source and line numbers of the formats registry and its data file. The numbers are
// identifiers of the records that hosts and their support staff know, not lines of any file here.
namespace vyn::ie::detail {

inline constexpr const wchar_t* kFormatsDataLogSource = L"ieDefinitions\\IEFormatsData";

// Lookups.
inline constexpr int kLogFormatIndexOutOfRange = 1988;
inline constexpr int kLogDataTypeNotRegistered = 2039;

// Writing the data file.
inline constexpr int kLogNullFormatNotWritten = 2117;
inline constexpr int kLogConfigurationWithoutWord = 2161;
inline constexpr int kLogUsingModeWithoutWord = 2179;
inline constexpr int kLogDataTypeWithoutWord = 2217;
inline constexpr int kLogDistanceUnitsWithoutWord = 2265;
inline constexpr int kLogAngleUnitsWithoutWord = 2292;
inline constexpr int kLogParameterWithoutWord = 2360;

// Reading the data file.
inline constexpr int kLogUnknownFormatChild = 2486;
inline constexpr int kLogUnknownConfigurationWord = 2506;
inline constexpr int kLogUnknownUsingModeWord = 2519;
inline constexpr int kLogUnknownDataTypeWord = 2552;
inline constexpr int kLogUnknownDistanceUnitsWord = 2591;
inline constexpr int kLogUnknownAngleUnitsWord = 2607;
inline constexpr int kLogUnknownParameterWord = 2668;

}  // namespace vyn::ie::detail
