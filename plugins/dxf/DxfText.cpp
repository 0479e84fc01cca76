#include "DxfText.h"

#include <algorithm>
#include <array>
#include <cstdint>
#include <cwctype>

#include "hostlibs/VynString.h"

namespace vyn::ie::dxf {

namespace {

constexpr std::size_t kEscapeLength = 7;  // "\U+XXXX"
constexpr wchar_t kDegree = 0x00B0;
constexpr wchar_t kPlusMinus = 0x00B1;
constexpr wchar_t kDiameter = 0x00D8;

bool isAscii(std::string_view bytes) {
  return std::all_of(bytes.begin(), bytes.end(),
                     [](char ch) { return static_cast<unsigned char>(ch) < 0x80; });
}

// Whether bytes are well-formed UTF-8 (overlong forms and surrogates refused).
bool isUtf8(std::string_view bytes) {
  std::size_t i = 0;
  while (i < bytes.size()) {
    const auto lead = static_cast<unsigned char>(bytes[i]);
    std::size_t length = 1;
    unsigned low = 0x80;
    unsigned high = 0xBF;
    if (lead >= 0xC2 && lead <= 0xDF) {
      length = 2;
    } else if (lead >= 0xE0 && lead <= 0xEF) {
      length = 3;
      if (lead == 0xE0) low = 0xA0;
      if (lead == 0xED) high = 0x9F;
    } else if (lead >= 0xF0 && lead <= 0xF4) {
      length = 4;
      if (lead == 0xF0) low = 0x90;
      if (lead == 0xF4) high = 0x8F;
    } else if (lead >= 0x80) {
      return false;
    }
    if (i + length > bytes.size()) return false;
    for (std::size_t k = 1; k < length; ++k) {
      const auto next = static_cast<unsigned char>(bytes[i + k]);
      if (next < (k == 1 ? low : 0x80) || next > (k == 1 ? high : 0xBF)) return false;
    }
    i += length;
  }
  return true;
}

int hexValue(wchar_t ch) {
  if (ch >= L'0' && ch <= L'9') return ch - L'0';
  if (ch >= L'a' && ch <= L'f') return ch - L'a' + 10;
  if (ch >= L'A' && ch <= L'F') return ch - L'A' + 10;
  return -1;
}

// The UTF-16 unit of a "\U+XXXX" escape at text[at], or -1.
int escapedUnit(std::wstring_view text, std::size_t at) {
  if (at + kEscapeLength > text.size() || text[at] != L'\\' ||
      (text[at + 1] != L'U' && text[at + 1] != L'u') || text[at + 2] != L'+')
    return -1;
  int unit = 0;
  for (std::size_t k = 3; k < kEscapeLength; ++k) {
    const int digit = hexValue(text[at + k]);
    if (digit < 0) return -1;
    unit = unit * 16 + digit;
  }
  return unit;
}

bool isHighSurrogate(int unit) {
  return unit >= 0xD800 && unit <= 0xDBFF;
}
bool isLowSurrogate(int unit) {
  return unit >= 0xDC00 && unit <= 0xDFFF;
}

// Appends the character of the escape at text[at] (joined with a following low surrogate) and answers
// how many characters it used; 0 when there is no escape there.
std::size_t appendEscape(std::wstring_view text, std::size_t at, std::wstring& out) {
  const int unit = escapedUnit(text, at);
  if (unit < 0) return 0;
  if (isHighSurrogate(unit)) {
    const int low = escapedUnit(text, at + kEscapeLength);
    if (isLowSurrogate(low)) {
      out += static_cast<wchar_t>(0x10000 + ((unit - 0xD800) << 10) + (low - 0xDC00));
      return 2 * kEscapeLength;
    }
  }
  out += isHighSurrogate(unit) || isLowSurrogate(unit) ? wchar_t{0xFFFD} : static_cast<wchar_t>(unit);
  return kEscapeLength;
}

void appendEscaped(std::string& out, unsigned unit) {
  static constexpr char kDigits[] = "0123456789ABCDEF";
  out += "\\U+";
  for (int shift = 12; shift >= 0; shift -= 4)
    out += kDigits[(unit >> shift) & 0xFu];
}

void appendCharacter(std::string& out, wchar_t ch) {
  const auto value = static_cast<std::uint32_t>(static_cast<char32_t>(ch));
  if (value < 0x20 || value == 0x7F) {
    out += ' ';
  } else if (value < 0x7F) {
    out += static_cast<char>(value);
  } else if (value > 0xFFFF && value <= 0x10FFFF) {
    appendEscaped(out, 0xD800 + ((value - 0x10000) >> 10));
    appendEscaped(out, 0xDC00 + ((value - 0x10000) & 0x3FFu));
  } else {
    appendEscaped(out, value > 0x10FFFF ? 0xFFFDu : value);
  }
}

}  // namespace

void DxfTextDecoder::decodeBytes(std::string_view bytes) {
  decoded_.clear();
  if (isAscii(bytes)) {
    decoded_.assign(bytes.begin(), bytes.end());
    return;
  }
  bytes_.assign(bytes);
  const bool utf8 = utf8_ || isUtf8(bytes);
  const CVynStringT<wchar_t> text(bytes_.c_str(), utf8 ? vyn_text::CP_UTF8 : vyn_text::CP_WINDOWS_1252);
  decoded_.assign(text.view());
}

void DxfTextDecoder::resolveEscapes() {
  result_.clear();
  const std::wstring_view text = decoded_;
  for (std::size_t i = 0; i < text.size();) {
    const std::size_t used = text[i] == L'\\' ? appendEscape(text, i, result_) : 0;
    if (used > 0) {
      i += used;
    } else {
      result_ += text[i++];
    }
  }
}

const std::wstring& DxfTextDecoder::plain(std::string_view bytes) {
  decodeBytes(bytes);
  if (decoded_.find(L'\\') == std::wstring::npos) return decoded_;
  resolveEscapes();
  return result_;
}

const std::wstring& DxfTextDecoder::text(std::string_view bytes) {
  const std::wstring& plainText = plain(bytes);
  if (plainText.find(L"%%") == std::wstring::npos) return plainText;
  const std::wstring source = plainText;
  result_.clear();
  for (std::size_t i = 0; i < source.size(); ++i) {
    if (source[i] != L'%' || i + 2 >= source.size() || source[i + 1] != L'%') {
      result_ += source[i];
      continue;
    }
    const wchar_t code = static_cast<wchar_t>(std::towlower(static_cast<wint_t>(source[i + 2])));
    i += 2;
    if (code == L'd') {
      result_ += kDegree;
    } else if (code == L'p') {
      result_ += kPlusMinus;
    } else if (code == L'c') {
      result_ += kDiameter;
    } else if (code == L'%') {
      result_ += L'%';
    } else if (code >= L'0' && code <= L'9') {
      int value = 0;
      std::size_t k = i;
      for (; k < source.size() && k < i + 3 && source[k] >= L'0' && source[k] <= L'9'; ++k)
        value = value * 10 + (source[k] - L'0');
      result_ += static_cast<wchar_t>(value);
      i = k - 1;
    } else if (code != L'u' && code != L'o' && code != L'k') {
      result_ += L"%%";
      result_ += source[i];
    }
  }
  return result_;
}

const std::wstring& DxfTextDecoder::mtext(std::string_view bytes) {
  decodeBytes(bytes);
  result_.clear();
  const std::wstring_view text = decoded_;
  const auto skipToSemicolon = [&text](std::size_t from) {
    const std::size_t semicolon = text.find(L';', from);
    return semicolon == std::wstring_view::npos ? text.size() : semicolon + 1;
  };
  std::size_t i = 0;
  while (i < text.size()) {
    const wchar_t ch = text[i];
    if (ch == L'{' || ch == L'}') {
      ++i;
      continue;
    }
    if (ch != L'\\' || i + 1 >= text.size()) {
      result_ += ch;
      ++i;
      continue;
    }
    if (const std::size_t used = appendEscape(text, i, result_); used > 0) {
      i += used;
      continue;
    }
    const wchar_t command = text[i + 1];
    switch (command) {
      case L'P':
      case L'N':
        result_ += L'\n';
        i += 2;
        break;
      case L'~':
        result_ += L' ';
        i += 2;
        break;
      case L'L':
      case L'l':
      case L'O':
      case L'o':
      case L'K':
      case L'k':
        i += 2;
        break;
      case L'S': {
        const std::size_t end = skipToSemicolon(i + 2);
        for (std::size_t k = i + 2; k < end && text[k] != L';'; ++k)
          result_ += text[k] == L'^' || text[k] == L'#' ? L'/' : text[k];
        i = end;
        break;
      }
      case L'f':
      case L'F':
      case L'H':
      case L'h':
      case L'W':
      case L'w':
      case L'Q':
      case L'q':
      case L'T':
      case L't':
      case L'A':
      case L'a':
      case L'C':
      case L'c':
      case L'p':
        i = skipToSemicolon(i + 2);
        break;
      default:  // "\\", "\{", "\}" and anything unknown: the character itself
        result_ += command;
        i += 2;
        break;
    }
  }
  return result_;
}

void appendEncoded(std::string& out, std::wstring_view text) {
  for (const wchar_t ch : text)
    appendCharacter(out, ch);
}

std::wstring withControlCodesEscaped(std::wstring_view text) {
  std::wstring escaped(text);
  for (std::size_t at = escaped.find(L"%%"); at != std::wstring::npos; at = escaped.find(L"%%", at + 6))
    escaped.replace(at, 2, L"%%%%%%");
  return escaped;
}

void appendMTextEncoded(std::string& out, std::wstring_view text) {
  for (const wchar_t ch : text) {
    if (ch == L'\n') {
      out += "\\P";
    } else if (ch == L'\r') {
      continue;
    } else {
      if (ch == L'\\' || ch == L'{' || ch == L'}') out += '\\';
      appendCharacter(out, ch);
    }
  }
}

}  // namespace vyn::ie::dxf
