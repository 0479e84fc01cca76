#pragma once

// Error-log records of the raw observations: one source tag per family of records, the lines telling
// the places apart.
namespace vyn::ie::detail {

inline constexpr const wchar_t* kTSRawDataLogSource = L"ieObjects\\IETSRawData";

// DexTSRawSS: an image type other than 0 or 1.
inline constexpr int kTSImageCountLine = 677;
inline constexpr int kTSImageGetLine = 697;
inline constexpr int kTSImageAddLine = 707;
inline constexpr int kTSImageRemoveLine = 717;
// DexTSRawStakeout::getStation() was asked for a station type of 4 or more.
inline constexpr int kTSStakeoutStationLine = 1083;

inline constexpr const wchar_t* kGPSRawDataLogSource = L"ieObjects\\IEGPSRawData";

// DexGpsDop::setCombinedDops(): the combined value cannot hold the components present.
inline constexpr int kGpsPdopTooSmallLine = 385;
inline constexpr int kGpsGdopTooSmallLine = 412;
inline constexpr int kGpsGdopNotAboveTdopLine = 428;

}  // namespace vyn::ie::detail
