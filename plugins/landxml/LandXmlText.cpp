#include "LandXmlText.h"

#include <algorithm>
#include <array>
#include <charconv>
#include <cmath>

#include "hostlibs/XmlParser.h"
#include "pointfiles/LineValues.h"

namespace vyn::ie::landxml {

namespace {

// Numbers of this magnitude and more are written in the shortest form that reads back exactly.
constexpr double kLargestFixed = 1e15;

constexpr bool isBlank(wchar_t ch) noexcept {
  return ch == L' ' || ch == L'\t' || ch == L'\r' || ch == L'\n';
}

// Characters written as they are: printable ASCII other than the markup characters. Anything else goes
// through the library's escaping, so that what the reader cannot carry is replaced as it would be.
constexpr bool isPlain(wchar_t ch) noexcept {
  return ch >= 0x20 && ch < 0x7F && ch != L'&' && ch != L'<' && ch != L'>' && ch != L'"';
}

}  // namespace

bool Words::next(std::wstring_view& word) noexcept {
  std::size_t start = 0;
  while (start < rest_.size() && isBlank(rest_[start]))
    ++start;
  if (start == rest_.size()) {
    rest_ = {};
    return false;
  }
  std::size_t end = start;
  while (end < rest_.size() && !isBlank(rest_[end]))
    ++end;
  word = rest_.substr(start, end - start);
  rest_.remove_prefix(end);
  return true;
}

int readNumbers(std::wstring_view text, double* values, int capacity) {
  Words words(text);
  std::wstring_view word;
  int count = 0;
  while (words.next(word)) {
    if (count == capacity) return capacity + 1;
    if (!point_files::parseNumber(word, values[count])) return -1;
    ++count;
  }
  return count;
}

bool readNumberList(std::wstring_view text, std::vector<double>& values) {
  Words words(text);
  std::wstring_view word;
  while (words.next(word)) {
    double value = 0.0;
    if (!point_files::parseNumber(word, value)) return false;
    values.push_back(value);
  }
  return true;
}

bool readPositiveInteger(std::wstring_view text, std::int64_t& value) {
  constexpr std::size_t kLongest = 19;
  if (text.empty() || text.size() > kLongest) return false;
  std::int64_t parsed = 0;
  for (const wchar_t ch : text) {
    if (ch < L'0' || ch > L'9') return false;
    parsed = parsed * 10 + (ch - L'0');
  }
  if (parsed <= 0) return false;
  value = parsed;
  return true;
}

void XmlText::start(std::string_view name) {
  bytes_ += '<';
  bytes_ += name;
}

void XmlText::end(std::string_view name) {
  bytes_ += "</";
  bytes_ += name;
  bytes_ += '>';
}

void XmlText::newLine(int indent) {
  bytes_ += '\n';
  bytes_.append(static_cast<std::size_t>(std::max(indent, 0)), ' ');
}

void XmlText::attribute(std::string_view name, std::wstring_view value) {
  bytes_ += ' ';
  bytes_ += name;
  bytes_ += "=\"";
  escaped(value, true);
  bytes_ += '"';
}

void XmlText::attribute(std::string_view name, std::string_view asciiValue) {
  bytes_ += ' ';
  bytes_ += name;
  bytes_ += "=\"";
  bytes_ += asciiValue;
  bytes_ += '"';
}

void XmlText::attribute(std::string_view name, std::int64_t value) {
  bytes_ += ' ';
  bytes_ += name;
  bytes_ += "=\"";
  integer(value);
  bytes_ += '"';
}

void XmlText::attribute(std::string_view name, double value, int decimals) {
  bytes_ += ' ';
  bytes_ += name;
  bytes_ += "=\"";
  number(value, decimals);
  bytes_ += '"';
}

void XmlText::text(std::wstring_view value) {
  escaped(value, false);
}

void XmlText::number(double value, int decimals) {
  if (!std::isfinite(value)) {  // the lexical forms of xs:double, which no reader takes for a coordinate
    bytes_ += std::isnan(value) ? "NaN" : value > 0 ? "INF" : "-INF";
    return;
  }
  std::array<char, 64> digits{};
  // Beyond survey magnitudes fixed notation would write hundreds of digits: the shortest exact form.
  const auto written = std::fabs(value) < kLargestFixed
                           ? std::to_chars(digits.data(), digits.data() + digits.size(), value,
                                           std::chars_format::fixed, decimals)
                           : std::to_chars(digits.data(), digits.data() + digits.size(), value);
  bytes_.append(digits.data(), written.ptr);
}

void XmlText::integer(std::int64_t value) {
  std::array<char, 24> digits{};
  const auto written = std::to_chars(digits.data(), digits.data() + digits.size(), value);
  bytes_.append(digits.data(), written.ptr);
}

void XmlText::escaped(std::wstring_view value, bool inAttribute) {
  if (std::all_of(value.begin(), value.end(), isPlain)) {
    for (const wchar_t ch : value)
      bytes_ += static_cast<char>(ch);
    return;
  }
  const CVynStringT<wchar_t> text(value);
  const CVynStringT<wchar_t> escapedText =
      inAttribute ? CXmlParserBase::FormAttrib(L"a", text.GetString()).Mid(4)  // ` a="...` without `"`
                  : CXmlParserBase::EscapeText(text.GetString());
  std::wstring_view view = escapedText.view();
  if (inAttribute) view.remove_suffix(1);
  vyn_text::appendUtf8(bytes_, view);
}

}  // namespace vyn::ie::landxml
