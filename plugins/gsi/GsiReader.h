#pragma once

#include <string_view>
#include <vector>

#include "GsiWords.h"

// Reading GSI lines into words and words into values.
namespace vyn::ie::gsi {

// What a word holds, by its index.
enum class EWordKind { TEXT, ANGLE, DISTANCE, PRISM_CONSTANT, PPM, UNKNOWN };

EWordKind kindOf(int index);

// One word as it stands in its line; data points into the line.
struct GsiWord {
  int index = 0;
  wchar_t unitDigit = L'.';
  bool negative = false;
  std::wstring_view data;
  int column = 0;  // one-based, of the word's first character
};

// A word the reader could not take, with why.
struct GsiBadWord {
  int column = 0;
  const wchar_t* reason = nullptr;
};

// Splits one line into its words. The variant comes from the line's own first character (a '*' for
// GSI-16), so a file may mix them line by line. A word must have the variant's width, a two-digit
// index and a sign; any other is a bad word and the reader goes on at the next blank. A text word
// (point number, codes, information, attributes) may hold blanks when it has the full width.
class GsiLineReader {
 public:
  // Reads line (without its line end); false when it holds no word at all (blank).
  bool read(std::wstring_view line);

  EVariant variant() const noexcept { return variant_; }
  const std::vector<GsiWord>& words() const noexcept { return words_; }
  const std::vector<GsiBadWord>& badWords() const noexcept { return bad_; }

 private:
  // Reads the word at start; answers where the next one may start.
  std::size_t readWord(std::wstring_view line, std::size_t start);
  std::size_t refuse(std::wstring_view line, std::size_t start, const wchar_t* reason);

  EVariant variant_ = EVariant::GSI8;
  std::vector<GsiWord> words_;
  std::vector<GsiBadWord> bad_;
};

// The value of an angle word in decimal degrees: null, or why it has none (a non-digit, a unit digit
// that is no angle unit, minutes or seconds of 60 or more).
const wchar_t* angleOf(const GsiWord& word, double& degrees);

// The value of a distance or coordinate word in meters; feet are foot meters each. Null, or why it
// has none (a non-digit, a unit digit that is no distance unit).
const wchar_t* distanceOf(const GsiWord& word, double foot, double& meters);

// The value of a prism-constant word in meters: its data is millimeters to the last place of the unit
// digit (0.1 mm for 6, 0.01 mm for 8, 1 mm otherwise). Null, or why it has none.
const wchar_t* prismConstantOf(const GsiWord& word, double& meters);

// The value of a ppm word (tenths of ppm). Null, or why it has none.
const wchar_t* ppmOf(const GsiWord& word, double& ppm);

// The text of a text word: blanks around it and the leading zeros of the padding removed ("0" for a
// word of zeros).
std::wstring_view textOf(const GsiWord& word);

}  // namespace vyn::ie::gsi
