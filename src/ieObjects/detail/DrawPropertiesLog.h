#pragma once

// Error-log records of the drawing-property classes: one source tag and one line per style table, so
// that a host can tell which table met a value outside it.
namespace vyn::ie::detail {

inline constexpr const wchar_t* kDrawPropertiesLogSource = L"ieObjects\\IEDrawProperties";

inline constexpr int kUnknownMarkStyleLine = 101;
inline constexpr int kUnknownDashStyleLine = 102;
inline constexpr int kUnknownFillStyleLine = 103;

}  // namespace vyn::ie::detail
