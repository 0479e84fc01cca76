#pragma once

// Error-log records of the parcels.
namespace vyn::ie::detail {

inline constexpr const wchar_t* kParcelLogSource = L"ieObjects\\IEParcel";

// DexParcel::setHAlignment() was given a null alignment.
inline constexpr int kParcelNullAlignmentLine = 711;

}  // namespace vyn::ie::detail
