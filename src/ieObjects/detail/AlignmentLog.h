#pragma once

// Error-log records of the alignments.
namespace vyn::ie::detail {

inline constexpr const wchar_t* kAlignmentLogSource = L"ieObjects\\IEAlignment";

// DexAlignment::setAlignmentPart() was given a null part.
inline constexpr int kAlignmentNullPartLine = 741;
// DexAlignment::getAlignmentPart() was asked for a part kind outside 0 to 3.
inline constexpr int kAlignmentPartTypeLine = 742;

}  // namespace vyn::ie::detail
