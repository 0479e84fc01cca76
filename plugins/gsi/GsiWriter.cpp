#include "GsiWriter.h"

#include <algorithm>
#include <cmath>
#include <cstdint>
#include <cstdio>

#include "ieObjects/IENoValue.h"
#include "ieObjects/IEPoints.h"
#include "ieUtils/IEUtilsUnits.h"
#include "pointfiles/CodeText.h"

namespace vyn::ie::gsi {

namespace {

constexpr int kBlockNumbers = 10000;

bool isFeet(EDistUnits units) {
  return units == IFEET || units == USFEET || units == IFEETINCHES || units == USFEETINCHES;
}

// 10 to the power places: the first whole number the data cannot hold.
double limitOf(std::size_t places) {
  return std::pow(10.0, static_cast<double>(places));
}

bool isPrintableAscii(wchar_t c) {
  return c > L' ' && c < 0x7F;
}

}  // namespace

GsiLineWriter::GsiLineWriter(EVariant variant, const DexSettings& settings) : variant_(variant) {
  int decimals = 0;
  for (const int d : settings.coordDecimals)
    decimals = std::max(decimals, d);
  if (isFeet(settings.distUnits)) {
    metersPerUnit_ = metersPerFoot(settings.distUnits);
    unitName_ = L"ft";
    const bool fine = decimals >= 4;
    unitDigit_ = fine ? '7' : '1';
    decimals_ = fine ? 4 : 3;
  } else {
    metersPerUnit_ = 1.0;
    unitName_ = L"m";
    unitDigit_ = decimals >= 5 ? '8' : decimals == 4 ? '6' : '0';
    decimals_ = decimals >= 5 ? 5 : decimals == 4 ? 4 : 3;
  }
  lastPlace_ = metersPerUnit_ * std::pow(10.0, -decimals_);
}

bool GsiLineWriter::write(const DexDesignPoint& point, int block, std::string& line) {
  line.clear();
  pointName_.assign(point.getName().view());
  if (pointName_.empty()) return refuse(L"a point without name has no point number");
  if (variant_ == EVariant::GSI16) line += kGsi16Mark;
  char head[2 * kHeadWidth];
  std::snprintf(head, sizeof head, "%02d%04d+", word::kPointNumber, block % kBlockNumbers);
  if (!text(line, head, pointName_, L"point number")) return false;
  const DexStation& station = point.getStation();
  // A point may know one plane coordinate only (a GSI line with 81 or 82 alone): that one is written.
  const bool plane = station.isHorizCoordsDefined();
  if ((plane || station.getY() != kNoValue) && !distance(line, word::kEasting, station.getY(), L"easting"))
    return false;
  if ((plane || station.getX() != kNoValue) && !distance(line, word::kNorthing, station.getX(), L"northing"))
    return false;
  if (station.isHeightDefined() && !distance(line, word::kHeight, station.getZ(), L"height")) return false;
  codes_.clear();
  point_files::appendCodesText(point, false, false, codes_);
  std::wstring_view codes = codes_;
  while (!codes.empty()) {
    const std::size_t end = std::min(codes.find(L' '), codes.size());
    if (end > 0 && !text(line, "71....+", codes.substr(0, end), L"code")) return false;
    codes.remove_prefix(std::min(end + 1, codes.size()));
  }
  return true;
}

bool GsiLineWriter::text(std::string& line, std::string_view head, std::wstring_view value,
                         const wchar_t* what) {
  const std::size_t width = dataWidth(variant_);
  if (value.size() > width)
    return refuse(std::wstring(L"the ") + what + L" '" + std::wstring(value) + L"' is longer than " +
                  std::to_wstring(width) + L" characters");
  for (const wchar_t c : value) {
    if (!isPrintableAscii(c))
      return refuse(std::wstring(L"the ") + what + L" '" + std::wstring(value) +
                    L"' holds a character GSI cannot carry (a blank or other than printable ASCII)");
  }
  if (line.size() > 1 || (line.size() == 1 && line[0] != kGsi16Mark)) line += ' ';
  line += head;
  line.append(width - value.size(), '0');
  for (const wchar_t c : value)
    line += static_cast<char>(c);
  return true;
}

bool GsiLineWriter::distance(std::string& line, int index, double meters, const wchar_t* what) {
  const std::size_t width = dataWidth(variant_);
  const double places = std::round(meters / lastPlace_);
  if (!std::isfinite(places) || std::fabs(places) >= limitOf(width)) {
    const double most = (limitOf(width) - 1.0) * lastPlace_ / metersPerUnit_;
    return refuse(std::wstring(L"the ") + what + L" " +
                  utils::doubleToString(meters / metersPerUnit_, decimals_).GetString() + L" " + unitName_ +
                  L" does not fit in a " + (variant_ == EVariant::GSI16 ? L"GSI-16" : L"GSI-8") +
                  L" word (at most " + utils::doubleToString(most, decimals_).GetString() + L" " + unitName_ +
                  L")");
  }
  char word[kHeadWidth + kGsi16DataWidth + 2];
  std::snprintf(word, sizeof word, " %02d..1%c%c%0*llu", index, unitDigit_, places < 0 ? '-' : '+',
                static_cast<int>(width), static_cast<unsigned long long>(std::fabs(places)));
  line += word;
  return true;
}

bool GsiLineWriter::refuse(const std::wstring& why) {
  problem_ = L"point '" + pointName_ + L"': " + why;
  return false;
}

}  // namespace vyn::ie::gsi
