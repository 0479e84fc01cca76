#pragma once

#include <array>
#include <string>
#include <string_view>
#include <vector>

#include "GsiReader.h"
#include "hostlibs/VynString.h"
#include "ieObjects/IENoValue.h"
#include "pointfiles/CodeText.h"

namespace vyn::ie {
class DexData;
class DexDataset;
class DexRawData;
}  // namespace vyn::ie

namespace vyn::ie::gsi {

// What became of the lines so far, and the words left out.
struct GsiTally {
  int stations = 0;
  int backsights = 0;
  int sideshots = 0;
  int points = 0;
  int notes = 0;
  int unknownWords = 0;
  std::vector<int> unknownIndexes;  // each index once, in the order met
  int badWords = 0;
  int emptyLines = 0;  // lines of nothing but bad words
};

// Turns the words of one line into the records of the model, in recording order:
//  - a line with station coordinates (84 to 86), or an instrument height (88) without observations,
//    is a set-up (DexTSRawStn): its coordinates as northing, easting and height (CONTENTS_NEU), the
//    instrument height as its target height; a reflector height (87) on it holds for the shots after;
//  - a line with angles or distances (21, 22, 31 to 33) is a shot: the first one after a set-up, and
//    every later shot of that set-up to the same point, a backsight (DexTSRawBS); the others
//    sideshots (DexTSRawSS). Values: horizontal and vertical angle and slope distance (CONTENTS_HVS)
//    when there is a slope distance, horizontal angle, horizontal distance and height difference
//    (CONTENTS_HVD) otherwise, or the two angles (CONTENTS_HV); a sideshot with both keeps the second
//    form as its second data. The target height is the line's reflector height or the last one met;
//    the prism constant is stored with the values;
//  - a line with a coordinate (81 to 83) gives a design point (and a shot its computed coordinates);
//  - any other line with text (a code block without a point) is kept as a raw note of its words.
// Codes (41, 71) become code values (of a point, a sideshot or a station; a backsight's in its note);
// information and attributes (42 to 49, 72 to 79) and the ppm are kept in the record's note or the
// point's notes as "word=text" joined by "; ". Absent values are kNoValue. Raw records are made when
// withRaw, design points when withPoints.
class GsiRecordBuilder {
 public:
  GsiRecordBuilder(DexData& data, DexDataset& dataset, bool withRaw, bool withPoints, double metersPerFoot);

  // Takes the words of one line; the words whose values cannot be read are added to bad (and left
  // out). False when no record came of the line.
  bool add(const std::vector<GsiWord>& words, std::vector<GsiBadWord>& bad);

  const GsiTally& tally() const noexcept { return tally_; }

 private:
  void collect(const GsiWord& word, std::vector<GsiBadWord>& bad);
  bool has(int index) const { return values_[static_cast<std::size_t>(index)] != kNoValue; }
  double value(int index) const { return values_[static_cast<std::size_t>(index)]; }
  void keepText(std::wstring_view label, std::wstring_view text);
  void countUnknown(int index);

  void addStation();
  void addShot();
  void addPoint();
  void addNote(const std::vector<GsiWord>& words);
  DexRawData& rawData();
  void readCodes(DexCodesDataInterface& target);

  DexData& data_;
  DexDataset& dataset_;
  bool withRaw_;
  bool withPoints_;
  double metersPerFoot_;
  point_files::CodeReader codes_;
  GsiTally tally_;

  // The line being read.
  std::array<double, 100> values_{};
  std::wstring_view name_;
  bool named_ = false;
  std::vector<std::wstring_view> codeTexts_;
  std::wstring kept_;
  std::wstring rejected_;
  CVynStringT<wchar_t> text_;

  // The set-up the shots belong to.
  bool awaitingBacksight_ = false;
  std::wstring backsightName_;
  double reflectorHeight_ = 0.0;
};

}  // namespace vyn::ie::gsi
