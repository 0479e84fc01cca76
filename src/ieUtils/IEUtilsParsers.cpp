#include "ieUtils/IEUtilsParsers.h"

#include <cstddef>
#include <string>
#include <string_view>
#include <utility>

#include "ieUtils/detail/FieldText.h"

namespace vyn::ie::utils {

namespace {

using String = CVynStringT<wchar_t>;
using detail::kBlank;
using detail::kDoubleQuote;

constexpr int kApaValueCount = 5;
constexpr int kSimaValueCount = 6;

// The scan behind parseValuesInQuotes. It collects the characters of one value and remembers where
// the last character that counts as content stands and how many double quotes the value holds, which
// together tell whether a value that begins with a quote has been closed.
class QuotedValueScanner {
 public:
  QuotedValueScanner(StringArray& values, wchar_t delimiter) : values_(values), delimiter_(delimiter) {}

  void scan(std::wstring_view line) {
    for (const wchar_t ch : line) {
      if (ch == delimiter_) {
        atDelimiter();
      } else {
        take(ch);
      }
    }
    atEndOfLine();
  }

 private:
  void take(wchar_t ch) {
    if (ch == kBlank && value_.empty()) return;
    value_.push_back(ch);
    // Line ends are removed from every value, so they never count as content: otherwise the CR LF of a
    // line would hide the closing quote of its last value.
    if (ch != kBlank && !detail::isLineEnd(ch)) last_ = static_cast<std::ptrdiff_t>(value_.size()) - 1;
    if (ch == kDoubleQuote) ++quotes_;
  }

  void atDelimiter() {
    if (isOpenQuotedValue()) {
      value_.push_back(delimiter_);
      return;
    }
    emit();
  }

  void atEndOfLine() {
    if (value_.empty() || isOpenQuotedValue()) return;
    emit();
  }

  bool beginsWithQuote() const { return !value_.empty() && value_.front() == kDoubleQuote; }
  bool isClosed() const {
    return last_ > 0 && value_[static_cast<std::size_t>(last_)] == kDoubleQuote && quotes_ % 2 == 0;
  }
  bool isOpenQuotedValue() const { return beginsWithQuote() && !isClosed(); }

  void emit() {
    const std::wstring_view collected(value_);
    const std::size_t end = static_cast<std::size_t>(last_ + 1);
    const std::wstring_view field =
        beginsWithQuote() ? collected.substr(1, end - 2) : collected.substr(0, end);
    detail::appendValue(values_, detail::cleanValue(field));
    value_.clear();
    last_ = -1;
    quotes_ = 0;
  }

  StringArray& values_;
  const wchar_t delimiter_;
  std::wstring value_;
  std::ptrdiff_t last_ = -1;
  int quotes_ = 0;
};

// line without blanks at its ends and with every run of blanks turned into one.
std::wstring collapseBlanks(std::wstring_view line) {
  std::wstring collapsed;
  collapsed.reserve(line.size());
  bool blankPending = false;
  for (const wchar_t ch : line) {
    if (ch == kBlank) {
      blankPending = !collapsed.empty();
      continue;
    }
    if (blankPending) collapsed.push_back(kBlank);
    blankPending = false;
    collapsed.push_back(ch);
  }
  return collapsed;
}

// Appends at most maxCount comma-separated values from the start of line.
void parseLeadingCommaValues(std::wstring_view line, StringArray& values, int maxCount) {
  std::size_t pos = 0;
  for (int count = 0; count < maxCount && pos < line.size(); ++count) {
    const std::size_t comma = line.find(L',', pos);
    const std::size_t end = comma == std::wstring_view::npos ? line.size() : comma;
    detail::appendValue(values, detail::cleanValue(line.substr(pos, end - pos)));
    pos = end + 1;
  }
}

}  // namespace

// The text arguments are taken by value as the plug-ins' interface declares them.
// NOLINTBEGIN(performance-unnecessary-value-param)
bool parseValues(const String& line, StringArray& values, wchar_t delimiter, String forbidden) {
  const std::wstring_view text = line.view();
  const std::wstring_view forbiddenCharacters = forbidden.view();
  std::size_t pos = 0;
  for (;;) {
    const std::size_t found = text.find(delimiter, pos);
    const std::size_t end = found == std::wstring_view::npos ? text.size() : found;
    String value = detail::cleanValue(text.substr(pos, end - pos));
    if (!forbiddenCharacters.empty() &&
        value.view().find_first_of(forbiddenCharacters) != std::wstring_view::npos) {
      return false;
    }
    detail::appendValue(values, std::move(value));
    if (found == std::wstring_view::npos) return true;
    pos = found + 1;
  }
}

void parseValuesInQuotes(const String& line, StringArray& values, wchar_t delimiter) {
  QuotedValueScanner(values, delimiter).scan(line.view());
}

void parseSpacedValuesInQuotes(const String& line, StringArray& values) {
  QuotedValueScanner(values, kBlank).scan(collapseBlanks(line.view()));
}

bool parseValuesForApaFormat(const String& line, StringArray& values, char /*delimiter*/,
                             String /*forbidden*/) {
  parseLeadingCommaValues(line.view(), values, kApaValueCount);
  return true;
}

bool parseValuesForSimaFormat(const String& line, StringArray& values, char /*delimiter*/,
                              String /*forbidden*/) {
  parseLeadingCommaValues(line.view(), values, kSimaValueCount);
  return true;
}
// NOLINTEND(performance-unnecessary-value-param)

void removeBorderQuotes(String& text) {
  if (text.IsEmpty() || text[0] != kDoubleQuote) return;
  text.Delete(0);
  const int quote = text.Find(kDoubleQuote);
  if (quote >= 0 && quote == text.GetLength() - 1) text.Delete(quote);
}

void removeUnnecessaryDelimiters(String& text, wchar_t delimiter) {
  std::wstring reduced;
  reduced.reserve(static_cast<std::size_t>(text.GetLength()));
  for (const wchar_t ch : text.view()) {
    if (ch == delimiter && !reduced.empty() && reduced.back() == delimiter) continue;
    reduced.push_back(ch);
  }
  if (!reduced.empty() && reduced.front() == delimiter) reduced.erase(0, 1);
  if (!reduced.empty() && reduced.back() == delimiter) reduced.pop_back();
  text = String(std::wstring_view(reduced));
}

}  // namespace vyn::ie::utils
