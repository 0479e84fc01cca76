#include "support/FuzzText.h"

#include <string>

namespace dex_fuzz {

namespace {

// Length of the sequence a lead byte announces; 0 for a byte that leads nothing.
int sequenceLength(unsigned char lead) noexcept {
  if (lead < 0x80) return 1;
  if (lead >= 0xC0 && lead < 0xE0) return 2;
  if (lead >= 0xE0 && lead < 0xF0) return 3;
  if (lead >= 0xF0 && lead < 0xF8) return 4;
  return 0;
}

bool isContinuation(unsigned char byte) noexcept {
  return (byte & 0xC0) == 0x80;
}

}  // namespace

std::wstring decodeLenientUtf8(std::string_view bytes) {
  std::wstring text;
  text.reserve(bytes.size());
  static constexpr unsigned char kLeadMasks[] = {0, 0x7F, 0x1F, 0x0F, 0x07};
  for (std::size_t at = 0; at < bytes.size();) {
    const auto lead = static_cast<unsigned char>(bytes[at]);
    const int length = sequenceLength(lead);
    bool whole = length > 0 && at + static_cast<std::size_t>(length) <= bytes.size();
    for (int i = 1; whole && i < length; ++i)
      whole = isContinuation(static_cast<unsigned char>(bytes[at + static_cast<std::size_t>(i)]));
    if (!whole) {
      text.push_back(static_cast<wchar_t>(lead));
      ++at;
      continue;
    }
    unsigned code = lead & kLeadMasks[length];
    for (int i = 1; i < length; ++i)
      code = (code << 6) | (static_cast<unsigned char>(bytes[at + static_cast<std::size_t>(i)]) & 0x3Fu);
    text.push_back(static_cast<wchar_t>(code));
    at += static_cast<std::size_t>(length);
  }
  return text;
}

namespace {

void appendUnit(std::string& out, unsigned unit, bool littleEndian) {
  const auto low = static_cast<char>(unit & 0xFFu);
  const auto high = static_cast<char>((unit >> 8) & 0xFFu);
  out += littleEndian ? low : high;
  out += littleEndian ? high : low;
}

}  // namespace

std::string encodeUtf16(std::wstring_view text, bool littleEndian) {
  std::string bytes;
  bytes.reserve(text.size() * 2);
  for (const wchar_t ch : text) {
    const auto code = static_cast<unsigned long>(ch);
    if (code >= 0x10000 && code <= 0x10FFFF) {
      const unsigned long offset = code - 0x10000;
      appendUnit(bytes, 0xD800u + static_cast<unsigned>(offset >> 10), littleEndian);
      appendUnit(bytes, 0xDC00u + static_cast<unsigned>(offset & 0x3FFu), littleEndian);
    } else {
      appendUnit(bytes, static_cast<unsigned>(code & 0xFFFFu), littleEndian);
    }
  }
  return bytes;
}

}  // namespace dex_fuzz
