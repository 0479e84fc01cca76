#pragma once

// Error-log records of the attribute descriptions, code descriptions and the code library.
namespace vyn::ie::detail {

inline constexpr const wchar_t* kDataDictionaryLogSource = L"ieObjects\\IEDataDictionary";

// DexAttrDescription::getMaxLength() met a type outside the attribute type table.
inline constexpr int kUnsupportedAttrTypeLine = 401;

}  // namespace vyn::ie::detail
