#pragma once

#include <string>
#include <string_view>

#include "GsiWords.h"
#include "ieUtils/IESettings.h"

namespace vyn::ie {
class DexDesignPoint;
}

namespace vyn::ie::gsi {

// Writes design points as GSI coordinate lines of one variant:
//
//   [*]11BBBB+<point number> 81..1U+<easting> 82..1U+<northing> 83..1U+<height> 71....+<code> ...
//
// BBBB is the block number (the line's number, modulo 10000), U the unit digit of the settings'
// distance unit (feet for IFEET and USFEET and their feet-and-inches forms, meters otherwise) at the
// resolution of the settings' coordinate decimals (3 or fewer: 1 mm or 1/1000 ft; 4: 0.1 mm or
// 1/10000 ft; 5 or more: 0.01 mm, feet staying at 1/10000 ft). A point without height has no word 83,
// one without a plane coordinate no word 81 or 82 for it; each code is a word 71 of its own. Texts are
// zero-padded on the left, numbers right-aligned.
//
// Nothing is cut or wrapped: a value that does not fit the variant's data width (8 or 16 places), a
// point number or code longer than the width, or a text with a blank or a character other than
// printable ASCII makes the line refused, with the reason.
class GsiLineWriter {
 public:
  GsiLineWriter(EVariant variant, const DexSettings& settings);

  // The line of point (without line end) into line: true, or false with problem() set.
  bool write(const DexDesignPoint& point, int block, std::string& line);

  // Why the last write was refused: "point 'P1': the northing 123456.789 m does not fit ...".
  const std::wstring& problem() const noexcept { return problem_; }

 private:
  bool text(std::string& line, std::string_view head, std::wstring_view value, const wchar_t* what);
  bool distance(std::string& line, int index, double meters, const wchar_t* what);
  bool refuse(const std::wstring& why);

  EVariant variant_;
  char unitDigit_;
  double lastPlace_;      // meters
  double metersPerUnit_;  // of the unit the remarks name
  const wchar_t* unitName_;
  int decimals_;
  std::wstring pointName_;
  std::wstring problem_;
  std::wstring codes_;
};

}  // namespace vyn::ie::gsi
