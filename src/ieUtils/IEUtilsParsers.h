#pragma once

#include "hostlibs/DexApi.h"
#include "hostlibs/VynString.h"
#include "ieUtils/IEUtilsStringArray.h"

// Splitting a line of an exchange file into values. Every parser appends to the list it is given and
// never clears it. A value is trimmed of blanks, tabs and line ends at both ends, and any CR or LF left
// inside it is removed. Nothing here throws or logs.
namespace vyn::ie::utils {

// Splits line at every delimiter. An empty line gives one empty value and a trailing delimiter an
// empty last value. Returns false as soon as a value holds a character of forbidden (an empty
// forbidden allows all); the values appended before it stay in the list.
DEX_API bool parseValues(const CVynStringT<wchar_t>& line, StringArray& values, wchar_t delimiter,
                         CVynStringT<wchar_t> forbidden);

// Splits line at every delimiter outside double quotes. A value written in double quotes loses its
// outer quotes and may hold the delimiter; doubled quotes inside it stay as they are. Leading blanks
// of a value are skipped. Empty values between two delimiters are kept; a trailing delimiter adds no
// empty value, and an empty line adds nothing. A quoted value still open at the end of the line is
// dropped. Line ends after a closing quote do not reopen the value, so a line read with its CR LF
// keeps its last quoted value.
DEX_API void parseValuesInQuotes(const CVynStringT<wchar_t>& line, StringArray& values, wchar_t delimiter);

// As parseValuesInQuotes with the blank as delimiter, after dropping the blanks at both ends of line
// and turning every run of blanks (inside quotes too) into one blank.
DEX_API void parseSpacedValuesInQuotes(const CVynStringT<wchar_t>& line, StringArray& values);

// The first 5 (APA) or 6 (SIMA) comma-separated values of line; text after them is ignored and a
// trailing comma adds no empty value. delimiter and forbidden are not consulted. Both return true.
DEX_API bool parseValuesForApaFormat(const CVynStringT<wchar_t>& line, StringArray& values, char delimiter,
                                     CVynStringT<wchar_t> forbidden);
DEX_API bool parseValuesForSimaFormat(const CVynStringT<wchar_t>& line, StringArray& values, char delimiter,
                                      CVynStringT<wchar_t> forbidden);

// When text begins with a double quote, removes it, and then the first double quote left too when that
// is the last character. Other texts are left alone.
DEX_API void removeBorderQuotes(CVynStringT<wchar_t>& text);

// Turns every run of delimiter into one, then removes one delimiter at the start and one at the end.
DEX_API void removeUnnecessaryDelimiters(CVynStringT<wchar_t>& text, wchar_t delimiter);

}  // namespace vyn::ie::utils
