#pragma once

#include <string>
#include <string_view>

// Turning fuzz bytes into the wide texts the library reads, and wide texts into the bytes of a file.
namespace dex_fuzz {

// Bytes decoded as lenient UTF-8: well-formed sequences of one to four bytes give their code point,
// including encoded surrogates and overlong forms, so every code point up to 0x1FFFFF can be reached;
// any other byte gives the Latin-1 character of its value. NUL bytes stay NUL characters.
std::wstring decodeLenientUtf8(std::string_view bytes);

// The UTF-16 bytes of text in either byte order. Characters above U+FFFF become surrogate pairs; a
// value above U+10FFFF keeps its low 16 bits, and lone surrogates are written as they are, so the
// bytes can be as broken as a real file.
std::string encodeUtf16(std::wstring_view text, bool littleEndian);

// Whether XML 1.0 can carry the character at all.
constexpr bool isXmlCharacter(wchar_t ch) noexcept {
  const auto code = static_cast<unsigned long>(ch);
  return code == 0x9 || code == 0xA || code == 0xD || (code >= 0x20 && code <= 0xD7FF) ||
         (code >= 0xE000 && code <= 0xFFFD) || (code >= 0x10000 && code <= 0x10FFFF);
}

}  // namespace dex_fuzz
