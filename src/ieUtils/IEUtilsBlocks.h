#pragma once

#include <cstdio>

#include "hostlibs/DexApi.h"
#include "hostlibs/VynString.h"

// Fixed block records. A record carries 128 data characters between STX (0x02) and, after them, the
// sequence digit 0 to 9, the checksum as decimal text of at least three digits, ETX (0x03), CR and LF.
// The checksum is the exclusive or of the 129 characters (data and sequence digit) taken as UTF-16
// code units (a character beyond U+FFFF gives both units of its surrogate pair), so it may need four
// or five digits. The caller holds the pending line between calls:
// its first character is the sequence digit of the record being filled, followed by the data
// collected so far.
namespace vyn::ie::utils {

inline constexpr int kBlockDataLength = 128;
// The pending line of a full record: the sequence digit and the data characters.
inline constexpr int kBlockLineLength = kBlockDataLength + 1;

// Adds text to the pending line and appends every record it fills to out. An empty line starts with
// the sequence digit 0. With final set, the pending data is padded with blanks and emitted as a last
// record even when empty. After each record the line holds only the next sequence digit (9 is followed
// by 0; a first character that is not a digit is followed by 0). A pending line longer than a record
// is emitted in records of the proper length, its excess going ahead of text. Always returns true.
DEX_API bool createBlockString(const CVynStringT<wchar_t>& text, CVynStringT<wchar_t>& line,
                               CVynStringT<wchar_t>& out, bool final);

// Runs createBlockString into an empty text and writes the records with the host's WriteString (in
// UTF-8); answers its result, false for a null file or a failed write. The line moves on either way.
DEX_API bool writeBlockString(FILE* file, const CVynStringT<wchar_t>& text, CVynStringT<wchar_t>& line,
                              bool final);

}  // namespace vyn::ie::utils
