#include "ieUtils/IEUtilsCodePages.h"

#include <algorithm>
#include <climits>
#include <cstring>
#include <string>
#include <string_view>

#include "hostlibs/detail/Utf.h"

namespace vyn::ie::utils {

namespace {

using String = CVynStringT<wchar_t>;

// The ANSI bytes of one character; at most four, so the string stays in its inline buffer.
std::string ansiBytes(wchar_t ch) {
  std::string bytes;
  vyn_text::detail::appendUtf8(bytes, ch);
  return bytes;
}

// Writes the ANSI form of the leading characters of text that fit in capacity bytes to dst; answers
// the bytes written.
std::size_t writeFittingAnsi(std::wstring_view text, char* dst, std::size_t capacity) {
  std::size_t written = 0;
  for (const wchar_t ch : text) {
    const std::string bytes = ansiBytes(ch);
    if (bytes.size() > capacity - written) break;
    std::copy(bytes.begin(), bytes.end(), dst + written);
    written += bytes.size();
  }
  return written;
}

std::size_t ansiLength(std::wstring_view text) {
  std::size_t length = 0;
  for (const wchar_t ch : text)
    length += ansiBytes(ch).size();
  return length;
}

std::size_t nonNegative(int value) {
  return value > 0 ? static_cast<std::size_t>(value) : 0;
}

std::wstring_view textOf(const wchar_t* src) {
  return src == nullptr ? std::wstring_view() : std::wstring_view(src);
}

}  // namespace

int getMbcsLength(const String& text) {
  return static_cast<int>(std::min<std::size_t>(ansiLength(text.view()), INT_MAX));
}

String strExtractToFitMbcsBytes(String& text, int maxBytes, int& spare) {
  int used = 0;
  int count = 0;
  for (const wchar_t ch : text.view()) {
    const int bytes = static_cast<int>(ansiBytes(ch).size());
    if (bytes > maxBytes - used) break;
    used += bytes;
    ++count;
  }
  spare = maxBytes - used;
  String head = text.Left(count);
  text = text.Mid(count);
  return head;
}

std::size_t tcs2Mbs(char* dst, const wchar_t* src, std::size_t n) {
  const std::wstring_view text = textOf(src);
  if (dst == nullptr) return ansiLength(text);
  const std::size_t written = writeFittingAnsi(text, dst, n);
  if (written < n) dst[written] = '\0';
  return written;
}

void string2Ascii(const String& text, char* dst, int max) {
  if (dst == nullptr) return;
  const std::wstring_view characters = text.view().substr(0, nonNegative(max));
  std::size_t i = 0;
  for (const wchar_t ch : characters)
    dst[i++] = static_cast<char>(static_cast<unsigned char>(ch & 0xFF));
  dst[i] = '\0';
}

void string2Char(const String& text, char* dst, int max) {
  if (dst == nullptr) return;
  dst[writeFittingAnsi(text.view(), dst, nonNegative(max))] = '\0';
}

void tsTChar2Char(const wchar_t* src, char* dst) {
  if (dst == nullptr) return;
  const std::string bytes = vyn_text::detail::toUtf8(textOf(src));
  std::memcpy(dst, bytes.c_str(), bytes.size() + 1);
}

void tsTChar2WChar(const wchar_t* src, wchar_t* dst) {
  if (dst == nullptr) return;
  const std::wstring_view text = textOf(src);
  std::copy(text.begin(), text.end(), dst);
  dst[text.size()] = L'\0';
}

void tsWChar2TChar(const wchar_t* src, wchar_t* dst) {
  tsTChar2WChar(src, dst);
}

void writeUnicodeString(base::CFile& file, const String& text) {
  if (!file.Opened()) return;
  std::string bytes;
  for (const char16_t unit : vyn_text::detail::toUtf16(text.view())) {
    bytes.push_back(static_cast<char>(unit & 0xFF));
    bytes.push_back(static_cast<char>(unit >> 8));
  }
  file.Write(bytes.data(), bytes.size());
}

}  // namespace vyn::ie::utils
