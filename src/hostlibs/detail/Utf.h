#pragma once

#include <cstddef>
#include <string>
#include <string_view>

// Text codecs shared by the string class, the text file reader and the XML layer. Nothing here fails:
// invalid input is mapped to a defined character so that no byte of a field file is silently dropped.
namespace vyn_text::detail {

inline constexpr wchar_t kReplacementCharacter = 0xFFFD;

// UTF-8 to wide text. A byte that does not start a well-formed sequence (overlong forms, surrogates and
// values above U+10FFFF included) is taken as the Latin-1 character of the same value.
void appendUtf8(std::wstring& out, std::string_view bytes);
std::wstring fromUtf8(std::string_view bytes);

// Windows-1252 to wide text; the five unassigned bytes map to the C1 control of the same value.
std::wstring fromCp1252(std::string_view bytes);

// Wide text to UTF-8; a lone surrogate or a value outside Unicode becomes U+FFFD.
void appendUtf8(std::string& out, wchar_t ch);
std::string toUtf8(std::wstring_view text);

// Wide text to UTF-16 code units (surrogate pairs above the BMP; invalid values become U+FFFD).
std::u16string toUtf16(std::wstring_view text);

// UTF-16 code units to wide text; lone surrogates become U+FFFD.
std::wstring fromUtf16(std::u16string_view units);

// True when ch is a code point that UTF-8/UTF-16 can carry (no surrogate, at most U+10FFFF).
constexpr bool isScalarValue(char32_t ch) {
  return ch < 0xD800 || (ch > 0xDFFF && ch <= 0x10FFFF);
}

}  // namespace vyn_text::detail
