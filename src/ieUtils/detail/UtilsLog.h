#pragma once

// The error-log source tag of the toolbox functions in vyn::ie::utils, whichever file they live in.
namespace vyn::ie::utils::detail {

inline constexpr const wchar_t* kUtilsLogSource = L"ieUtils\\IEUtils";

}  // namespace vyn::ie::utils::detail
