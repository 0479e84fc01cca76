#pragma once

#include <cstddef>
#include <cstdint>
#include <string>
#include <string_view>
#include <vector>

#include "hostlibs/VynString.h"

// The texts of LandXML elements read and written: blank-separated numbers ("northing easting
// elevation", point lists, face corners) and names, and the UTF-8 text of the written document.
namespace vyn::ie::landxml {

// The blank-separated words of an element's text (XML blanks: space, TAB, CR, LF).
class Words {
 public:
  explicit Words(std::wstring_view text) noexcept : rest_(text) {}
  // The next word; false after the last.
  bool next(std::wstring_view& word) noexcept;

 private:
  std::wstring_view rest_;
};

// Reads the numbers of text into values[0 .. capacity): answers how many words there are when every
// word is a number and they fit, -1 when a word is not a number (infinities and NaN included) and
// capacity + 1 when there are more words than fit.
int readNumbers(std::wstring_view text, double* values, int capacity);
// Appends every number of text to values; false when a word is not a number (the numbers before it
// stay appended).
bool readNumberList(std::wstring_view text, std::vector<double>& values);
// Reads text as one whole number above 0 (an id or a face corner); false otherwise.
bool readPositiveInteger(std::wstring_view text, std::int64_t& value);

// The UTF-8 text of a document under construction, written out in blocks by its owner. Names of
// elements and attributes are the writer's own ASCII words; values and texts are escaped.
class XmlText {
 public:
  std::string& bytes() noexcept { return bytes_; }
  std::size_t size() const noexcept { return bytes_.size(); }
  void clear() noexcept { bytes_.clear(); }

  // "<name"; then attributes; then endStart() (">") or endEmpty() ("/>").
  void start(std::string_view name);
  void endStart() { bytes_ += '>'; }
  void endEmpty() { bytes_ += "/>"; }
  void end(std::string_view name);  // "</name>"
  void newLine(int indent);

  // ` name="value"`; the empty value is written too.
  void attribute(std::string_view name, std::wstring_view value);
  void attribute(std::string_view name, std::string_view asciiValue);
  void attribute(std::string_view name, std::int64_t value);
  void attribute(std::string_view name, double value, int decimals);

  // Element content: escaped text, a number with decimals (fixed notation) and a blank.
  void text(std::wstring_view value);
  void number(double value, int decimals);
  void blank() { bytes_ += ' '; }
  void integer(std::int64_t value);

 private:
  void escaped(std::wstring_view value, bool inAttribute);

  std::string bytes_;
};

}  // namespace vyn::ie::landxml
