#pragma once

#include <cstddef>

#include "hostlibs/DexApi.h"
#include "hostlibs/File.h"
#include "hostlibs/VynString.h"

// Conversions between wide text and the ANSI code page, which is UTF-8 on this platform. They do not
// depend on the process locale. A character that UTF-8 cannot carry (a lone surrogate, a value above
// U+10FFFF) is converted as U+FFFD, three bytes. A null destination makes a function write nothing;
// a null source counts as the empty text.
namespace vyn::ie::utils {

// The bytes of the ANSI form of text, without a terminating zero.
DEX_API int getMbcsLength(const CVynStringT<wchar_t>& text);

// Removes from text and returns its longest leading part whose ANSI form fits in maxBytes (a character
// is never cut in two), and sets spare to maxBytes less the bytes of that part.
DEX_API CVynStringT<wchar_t> strExtractToFitMbcsBytes(CVynStringT<wchar_t>& text, int maxBytes, int& spare);

// As the runtime's wcstombs: with a null dst, answers the bytes of the ANSI form of src. Otherwise writes
// whole characters while they fit in n bytes, then a terminating zero when there is room for it, and
// answers the bytes written without the zero.
DEX_API std::size_t tcs2Mbs(char* dst, const wchar_t* src, std::size_t n);

// Writes the low byte of each of the first min(length, max) characters and a terminating zero; dst must
// hold max + 1 bytes. A negative max counts as 0.
DEX_API void string2Ascii(const CVynStringT<wchar_t>& text, char* dst, int max);

// Writes the ANSI form of the leading characters of text whose bytes fit in max, and a terminating
// zero after them; dst must hold max + 1 bytes. So a text whose ANSI form needs at most max bytes is
// written whole, and a longer one is cut before the first character that would not fit. A negative max
// counts as 0.
DEX_API void string2Char(const CVynStringT<wchar_t>& text, char* dst, int max);

// The ANSI form of src with its terminating zero; dst must hold getMbcsLength(src) + 1 bytes.
DEX_API void tsTChar2Char(const wchar_t* src, char* dst);

// Plain copies of src up to and including its terminating zero; dst must hold them.
DEX_API void tsTChar2WChar(const wchar_t* src, wchar_t* dst);
DEX_API void tsWChar2TChar(const wchar_t* src, wchar_t* dst);

// When file is open, writes the UTF-16 code units of text, 2 bytes each in little-endian order, without
// a terminator or byte-order mark.
DEX_API void writeUnicodeString(base::CFile& file, const CVynStringT<wchar_t>& text);

}  // namespace vyn::ie::utils
