#pragma once

// Error-log records of the datasets.
namespace vyn::ie::detail {

inline constexpr const wchar_t* kDatasetLogSource = L"ieObjects\\IEDataset";

// DexDataset::findRawPoint() was asked of a dataset without raw data.
inline constexpr int kDatasetFindRawPointWithoutRawDataLine = 731;
// DexDataset::getNextRawPointName() met a raw record of a kind it does not walk (a note, for example).
inline constexpr int kDatasetUnexpectedRawRecordLine = 732;

}  // namespace vyn::ie::detail
