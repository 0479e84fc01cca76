#pragma once

// Error-log records of the per-object code lists, the code values and the code text rendering.
namespace vyn::ie::detail {

inline constexpr const wchar_t* kCodesDataInterfaceLogSource = L"ieObjects\\IECodesDataInterface";

// DexCodeValues::getCodeStringAt() was asked for an index outside the code strings.
inline constexpr int kCodeStringIndexLine = 301;
// DexCodesDataInterface::getCodesAsCodeStyle() met a field type that has no part in a code text.
inline constexpr int kUnknownCodeStyleFieldLine = 302;

}  // namespace vyn::ie::detail
