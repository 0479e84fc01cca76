#include "LineValues.h"

#include <algorithm>
#include <array>
#include <charconv>
#include <cmath>

namespace vyn::ie::point_files {

namespace {

constexpr wchar_t kQuote = L'"';

bool isSpace(wchar_t ch) {
  return ch == L' ' || ch == L'\t' || ch == L'\r' || ch == L'\n';
}

std::wstring_view trimmed(std::wstring_view text) {
  while (!text.empty() && isSpace(text.front()))
    text.remove_prefix(1);
  while (!text.empty() && isSpace(text.back()))
    text.remove_suffix(1);
  return text;
}

}  // namespace

LineSplitter::LineSplitter(const PointLayout& layout)
    : layout_(layout), fixedLayout_(toAsciiSettings(layout)) {
  for (const ascii_fields::DexFieldFormat& field : layout.fields)
    fixedLength_ += static_cast<std::size_t>(std::max(field.width, 0));
}

const std::vector<std::wstring_view>& LineSplitter::split(const CVynStringT<wchar_t>& line) {
  text_.clear();
  spans_.clear();
  if (layout_.fixedWidth) {
    splitFixed(line);
  } else {
    splitDelimited(line.view(), layout_.delimiter);
  }
  return values();
}

const std::vector<std::wstring_view>& LineSplitter::split(std::wstring_view line, wchar_t delimiter) {
  text_.clear();
  spans_.clear();
  splitDelimited(line, delimiter);
  return values();
}

const std::vector<std::wstring_view>& LineSplitter::values() {
  values_.clear();
  for (const auto& [offset, length] : spans_)
    values_.emplace_back(text_.data() + offset, length);
  return values_;
}

void LineSplitter::splitFixed(const CVynStringT<wchar_t>& line) {
  parseValuesByFixFmt(&fixedLayout_, line, fixedValues_);
  for (int i = 0; i < fixedValues_.GetSize(); ++i) {
    const std::wstring_view value = fixedValues_.GetAt(i).view();
    spans_.emplace_back(text_.size(), value.size());
    text_ += value;
  }
  const std::wstring_view rest =
      line.GetLength() > static_cast<int>(fixedLength_) ? trimmed(line.view().substr(fixedLength_)) : L"";
  if (!rest.empty()) {
    spans_.emplace_back(text_.size(), rest.size());
    text_ += rest;
  }
}

void LineSplitter::splitDelimited(std::wstring_view line, wchar_t delimiter) {
  const bool blankDelimited = delimiter == L' ';
  if (blankDelimited) line = trimmed(line);
  // The end of the value that starts at position: the next delimiter, or with the blank as delimiter
  // the next blank or tab.
  const auto nextDelimiter = [&line, delimiter, blankDelimited](std::size_t position) {
    if (!blankDelimited) return std::min(line.find(delimiter, position), line.size());
    return std::min(line.find_first_of(L" \t", position), line.size());
  };
  std::size_t position = 0;
  while (true) {
    // Leading blanks of a value (the run of blanks that delimits it when the blank is the delimiter).
    while (position < line.size() && (blankDelimited || line[position] != delimiter) &&
           isSpace(line[position]))
      ++position;
    const std::size_t start = text_.size();
    if (position < line.size() && line[position] == kQuote) {
      ++position;
      while (position < line.size()) {
        if (line[position] == kQuote) {
          if (position + 1 < line.size() && line[position + 1] == kQuote) {
            text_ += kQuote;
            position += 2;
            continue;
          }
          ++position;
          break;
        }
        text_ += line[position++];
      }
    }
    // The value up to the delimiter; after a closing quote, whatever stands before the delimiter too.
    const std::size_t end = nextDelimiter(position);
    text_ += trimmed(line.substr(position, end - position));
    position = end;
    spans_.emplace_back(start, text_.size() - start);
    if (position >= line.size()) break;
    ++position;  // the delimiter
  }
}

bool parseNumber(std::wstring_view text, double& value, bool decimalComma) {
  std::array<char, 64> narrow{};
  if (text.empty() || text.size() >= narrow.size()) return false;
  const bool commaIsPoint =
      decimalComma && text.find(L'.') == std::wstring_view::npos && text.find(L',') == text.rfind(L',');
  std::size_t length = 0;
  for (const wchar_t ch : text) {
    if (ch > 0x7F) return false;
    narrow[length++] = ch == L',' && commaIsPoint ? '.' : static_cast<char>(ch);
  }
  const char* first = narrow.data();
  const char* last = first + length;
  if (*first == '+') {
    ++first;
    if (first == last || *first == '+' || *first == '-') return false;
  }
  double parsed = 0.0;
  const auto [end, error] = std::from_chars(first, last, parsed);
  if (error != std::errc() || end != last || !std::isfinite(parsed)) return false;
  value = parsed;
  return true;
}

bool isBlankText(std::wstring_view text) {
  return trimmed(text).empty();
}

}  // namespace vyn::ie::point_files
