#pragma once

#include <string>
#include <string_view>
#include <unordered_map>
#include <utility>
#include <vector>

#include "PointLayout.h"
#include "hostlibs/VynArray.h"
#include "hostlibs/VynString.h"
#include "ieUtils/IEAsciiFields.h"

// Splitting the lines of a point file into values and reading numbers from them, without a heap
// block per line: the splitter keeps its buffers from one line to the next.
namespace vyn::ie::point_files {

// Splits lines by a layout. Delimited lines: values are trimmed of blanks and tabs; a value in
// double quotes may hold the delimiter and writes a quote as two; with the blank as delimiter a run
// of blanks and tabs separates two values. Fixed-width lines go through parseValuesByFixFmt; what
// stands after the last column is one more value (when it is not blank).
class LineSplitter {
 public:
  explicit LineSplitter(const PointLayout& layout);

  // The values of line; they stay valid until the next call.
  const std::vector<std::wstring_view>& split(const CVynStringT<wchar_t>& line);
  // The same with another delimiter (for trying delimiters on the first lines).
  const std::vector<std::wstring_view>& split(std::wstring_view line, wchar_t delimiter);

 private:
  void splitDelimited(std::wstring_view line, wchar_t delimiter);
  void splitFixed(const CVynStringT<wchar_t>& line);
  const std::vector<std::wstring_view>& values();

  const PointLayout& layout_;
  std::size_t fixedLength_ = 0;  // the widths of the fixed columns together
  const DexUserAsciiSettingsData fixedLayout_;
  CVynArray<CVynStringT<wchar_t>, const CVynStringT<wchar_t>&> fixedValues_;
  std::wstring text_;                                       // the values one after another
  std::vector<std::pair<std::size_t, std::size_t>> spans_;  // offset and length of each in text_
  std::vector<std::wstring_view> values_;
};

// Reads the whole text as a decimal number ("12.5", "-3", "+1e3"), independently of the locale.
// With decimalComma, one comma stands for the decimal point in a text without one ("12,5").
// False for an empty text, for anything else after the number, and for infinities and NaN.
bool parseNumber(std::wstring_view text, double& value, bool decimalComma = false);

// True when text is blank (blanks, tabs and line ends only).
bool isBlankText(std::wstring_view text);

// A map by text that is searched with a view, so that a look-up makes no heap block.
struct TextHash {
  using is_transparent = void;
  std::size_t operator()(std::wstring_view text) const noexcept {
    return std::hash<std::wstring_view>{}(text);
  }
};
struct TextEqual {
  using is_transparent = void;
  bool operator()(std::wstring_view a, std::wstring_view b) const noexcept { return a == b; }
};
template <class T>
using TextMap = std::unordered_map<std::wstring, T, TextHash, TextEqual>;

}  // namespace vyn::ie::point_files
