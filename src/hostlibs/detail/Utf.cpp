#include "hostlibs/detail/Utf.h"

#include <algorithm>
#include <array>

namespace vyn_text::detail {
namespace {

// Length of the well-formed UTF-8 sequence at the start of bytes, or 0 when it is not one.
std::size_t wellFormedLength(std::string_view bytes, char32_t& decoded) {
  const auto byte = [&](std::size_t i) { return static_cast<unsigned char>(bytes[i]); };
  const unsigned char lead = byte(0);
  if (lead < 0x80) {
    decoded = lead;
    return 1;
  }
  std::size_t length = 0;
  char32_t value = 0;
  char32_t minimum = 0;
  if ((lead & 0xE0) == 0xC0) {
    length = 2, value = lead & 0x1F, minimum = 0x80;
  } else if ((lead & 0xF0) == 0xE0) {
    length = 3, value = lead & 0x0F, minimum = 0x800;
  } else if ((lead & 0xF8) == 0xF0) {
    length = 4, value = lead & 0x07, minimum = 0x10000;
  } else {
    return 0;
  }
  if (bytes.size() < length) return 0;
  for (std::size_t i = 1; i < length; ++i) {
    if ((byte(i) & 0xC0) != 0x80) return 0;
    value = (value << 6) | (byte(i) & 0x3F);
  }
  if (value < minimum || !isScalarValue(value)) return 0;
  decoded = value;
  return length;
}

constexpr std::array<char16_t, 32> kCp1252High = {
    0x20AC, 0x0081, 0x201A, 0x0192, 0x201E, 0x2026, 0x2020, 0x2021, 0x02C6, 0x2030, 0x0160,
    0x2039, 0x0152, 0x008D, 0x017D, 0x008F, 0x0090, 0x2018, 0x2019, 0x201C, 0x201D, 0x2022,
    0x2013, 0x2014, 0x02DC, 0x2122, 0x0161, 0x203A, 0x0153, 0x009D, 0x017E, 0x0178};

}  // namespace

void appendUtf8(std::wstring& out, std::string_view bytes) {
  out.reserve(out.size() + bytes.size());
  while (!bytes.empty()) {
    // The common case: a run of ASCII, one byte a character.
    std::size_t run = 0;
    while (run < bytes.size() && static_cast<unsigned char>(bytes[run]) < 0x80)
      ++run;
    if (run > 0) {
      const std::size_t at = out.size();
      out.resize(at + run);
      std::copy(bytes.begin(), bytes.begin() + static_cast<std::ptrdiff_t>(run),
                out.begin() + static_cast<std::ptrdiff_t>(at));
      bytes.remove_prefix(run);
      continue;
    }
    char32_t decoded = 0;
    std::size_t used = wellFormedLength(bytes, decoded);
    if (used == 0) {
      decoded = static_cast<unsigned char>(bytes.front());
      used = 1;
    }
    out.push_back(static_cast<wchar_t>(decoded));
    bytes.remove_prefix(used);
  }
}

std::wstring fromUtf8(std::string_view bytes) {
  std::wstring out;
  appendUtf8(out, bytes);
  return out;
}

std::wstring fromCp1252(std::string_view bytes) {
  std::wstring out;
  out.reserve(bytes.size());
  for (const char c : bytes) {
    const auto byte = static_cast<unsigned char>(c);
    out.push_back(byte >= 0x80 && byte < 0xA0 ? static_cast<wchar_t>(kCp1252High[byte - 0x80])
                                              : static_cast<wchar_t>(byte));
  }
  return out;
}

void appendUtf8(std::string& out, wchar_t ch) {
  auto value = static_cast<char32_t>(ch);
  if (!isScalarValue(value)) value = kReplacementCharacter;
  const auto put = [&](char32_t bits) { out.push_back(static_cast<char>(bits)); };
  if (value < 0x80) {
    put(value);
  } else if (value < 0x800) {
    put(0xC0 | (value >> 6));
    put(0x80 | (value & 0x3F));
  } else if (value < 0x10000) {
    put(0xE0 | (value >> 12));
    put(0x80 | ((value >> 6) & 0x3F));
    put(0x80 | (value & 0x3F));
  } else {
    put(0xF0 | (value >> 18));
    put(0x80 | ((value >> 12) & 0x3F));
    put(0x80 | ((value >> 6) & 0x3F));
    put(0x80 | (value & 0x3F));
  }
}

std::string toUtf8(std::wstring_view text) {
  std::string out;
  out.reserve(text.size());
  for (const wchar_t ch : text)
    appendUtf8(out, ch);
  return out;
}

std::u16string toUtf16(std::wstring_view text) {
  std::u16string out;
  out.reserve(text.size());
  for (const wchar_t ch : text) {
    auto value = static_cast<char32_t>(ch);
    if (!isScalarValue(value)) value = kReplacementCharacter;
    if (value < 0x10000) {
      out.push_back(static_cast<char16_t>(value));
    } else {
      value -= 0x10000;
      out.push_back(static_cast<char16_t>(0xD800 + (value >> 10)));
      out.push_back(static_cast<char16_t>(0xDC00 + (value & 0x3FF)));
    }
  }
  return out;
}

std::wstring fromUtf16(std::u16string_view units) {
  std::wstring out;
  out.reserve(units.size());
  for (std::size_t i = 0; i < units.size(); ++i) {
    const char16_t unit = units[i];
    const bool high = unit >= 0xD800 && unit <= 0xDBFF;
    const bool low = unit >= 0xDC00 && unit <= 0xDFFF;
    if (high && i + 1 < units.size() && units[i + 1] >= 0xDC00 && units[i + 1] <= 0xDFFF) {
      const char32_t value = 0x10000 + ((static_cast<char32_t>(unit) - 0xD800) << 10) +
                             (static_cast<char32_t>(units[i + 1]) - 0xDC00);
      out.push_back(static_cast<wchar_t>(value));
      ++i;
    } else if (high || low) {
      out.push_back(kReplacementCharacter);
    } else {
      out.push_back(static_cast<wchar_t>(unit));
    }
  }
  return out;
}

}  // namespace vyn_text::detail
