#include "GsiReader.h"

#include <cstdint>

namespace vyn::ie::gsi {

namespace {

constexpr double kGonToDegrees = 0.9;
constexpr double kMilToDegrees = 360.0 / 6400.0;
constexpr int kMinutesPerDegree = 60;

bool isDigit(wchar_t c) {
  return c >= L'0' && c <= L'9';
}

bool isBlank(wchar_t c) {
  return c == L' ' || c == L'\t' || c == L'\r';
}

// The data as a whole number; false when it holds anything but digits.
bool wholeNumber(std::wstring_view data, std::uint64_t& number) {
  if (data.empty()) return false;
  number = 0;
  for (const wchar_t c : data) {
    if (!isDigit(c)) return false;
    number = number * 10 + static_cast<std::uint64_t>(c - L'0');
  }
  return true;
}

double signedValue(const GsiWord& word, double magnitude) {
  return word.negative ? -magnitude : magnitude;
}

// Degrees of DDDMMSSs (tenths of seconds in the last place); false for minutes or seconds of 60 or more.
bool sexagesimal(std::uint64_t number, double& degrees) {
  const auto tenths = static_cast<double>(number % 10);
  const std::uint64_t seconds = (number / 10) % 100;
  const std::uint64_t minutes = (number / 1000) % 100;
  const std::uint64_t wholeDegrees = number / 100000;
  if (seconds >= kMinutesPerDegree || minutes >= kMinutesPerDegree) return false;
  degrees = static_cast<double>(wholeDegrees) + static_cast<double>(minutes) / 60.0 +
            (static_cast<double>(seconds) + tenths / 10.0) / 3600.0;
  return true;
}

const wchar_t* kNonDigit = L"a non-digit in the value";

// The data times lastPlace, signed.
const wchar_t* scaledOf(const GsiWord& word, double lastPlace, double& value) {
  std::uint64_t number = 0;
  if (!wholeNumber(word.data, number)) return kNonDigit;
  value = signedValue(word, static_cast<double>(number) * lastPlace);
  return nullptr;
}

}  // namespace

EWordKind kindOf(int index) {
  using namespace word;
  if (index == kPointNumber || (index >= kCode && index <= kLastInfo) ||
      (index >= kPointCode && index <= kLastAttribute))
    return EWordKind::TEXT;
  if (index == kHorizontalAngle || index == kVerticalAngle) return EWordKind::ANGLE;
  if ((index >= kSlopeDistance && index <= kHeightDifference) ||
      (index >= kEasting && index <= kInstrumentHeight))
    return EWordKind::DISTANCE;
  if (index == kPrismConstant) return EWordKind::PRISM_CONSTANT;
  if (index == kPpm) return EWordKind::PPM;
  return EWordKind::UNKNOWN;
}

bool GsiLineReader::read(std::wstring_view line) {
  words_.clear();
  bad_.clear();
  std::size_t at = 0;
  variant_ = EVariant::GSI8;
  if (!line.empty() && line.front() == kGsi16Mark) {
    variant_ = EVariant::GSI16;
    at = 1;
  }
  while (true) {
    while (at < line.size() && isBlank(line[at]))
      ++at;
    if (at >= line.size()) break;
    at = readWord(line, at);
  }
  return !words_.empty() || !bad_.empty();
}

std::size_t GsiLineReader::readWord(std::wstring_view line, std::size_t start) {
  const std::size_t width = kHeadWidth + dataWidth(variant_);
  std::size_t end = start;
  while (end < line.size() && !isBlank(line[end]))
    ++end;
  if (end - start < kHeadWidth) return refuse(line, start, L"a short word");
  const std::wstring_view head = line.substr(start, kHeadWidth);
  if (!isDigit(head[0]) || !isDigit(head[1])) return refuse(line, start, L"a word index that is no number");
  const wchar_t sign = head[kSignPlace];
  if (sign != L'+' && sign != L'-') return refuse(line, start, L"a word without sign");
  GsiWord word;
  word.index = (head[0] - L'0') * 10 + (head[1] - L'0');
  word.unitDigit = head[kUnitPlace];
  word.negative = sign == L'-';
  word.column = static_cast<int>(start) + 1;
  if (end - start != width) {
    // A text may hold blanks: the full width, ended by a blank or the line's end, is taken as it is.
    const bool fullText = kindOf(word.index) == EWordKind::TEXT && end - start < width &&
                          start + width <= line.size() &&
                          (start + width == line.size() || isBlank(line[start + width]));
    if (!fullText) return refuse(line, start, end - start < width ? L"a short word" : L"a long word");
    end = start + width;
  }
  word.data = line.substr(start + kHeadWidth, dataWidth(variant_));
  words_.push_back(word);
  return end;
}

std::size_t GsiLineReader::refuse(std::wstring_view line, std::size_t start, const wchar_t* reason) {
  bad_.push_back({static_cast<int>(start) + 1, reason});
  while (start < line.size() && !isBlank(line[start]))
    ++start;
  return start;
}

const wchar_t* angleOf(const GsiWord& word, double& degrees) {
  std::uint64_t number = 0;
  if (!wholeNumber(word.data, number)) return kNonDigit;
  const auto value = static_cast<double>(number);
  switch (word.unitDigit) {
    case L'2':
      degrees = signedValue(word, value * 1e-5 * kGonToDegrees);
      return nullptr;
    case L'3':
      degrees = signedValue(word, value * 1e-5);
      return nullptr;
    case L'4':
      if (!sexagesimal(number, degrees)) return L"minutes or seconds of 60 or more";
      degrees = signedValue(word, degrees);
      return nullptr;
    case L'5':
      degrees = signedValue(word, value * 1e-4 * kMilToDegrees);
      return nullptr;
    default:
      return L"a unit digit that is no angle unit";
  }
}

const wchar_t* distanceOf(const GsiWord& word, double foot, double& meters) {
  double lastPlace = 0.0;
  switch (word.unitDigit) {
    case L'0':
      lastPlace = 1e-3;
      break;
    case L'1':
      lastPlace = 1e-3 * foot;
      break;
    case L'6':
      lastPlace = 1e-4;
      break;
    case L'7':
      lastPlace = 1e-4 * foot;
      break;
    case L'8':
      lastPlace = 1e-5;
      break;
    default:
      return L"a unit digit that is no distance unit";
  }
  return scaledOf(word, lastPlace, meters);
}

const wchar_t* prismConstantOf(const GsiWord& word, double& meters) {
  const double lastPlace = word.unitDigit == L'6' ? 1e-4 : word.unitDigit == L'8' ? 1e-5 : 1e-3;
  return scaledOf(word, lastPlace, meters);
}

const wchar_t* ppmOf(const GsiWord& word, double& ppm) {
  return scaledOf(word, 0.1, ppm);
}

std::wstring_view textOf(const GsiWord& word) {
  std::wstring_view text = word.data;
  while (!text.empty() && isBlank(text.front()))
    text.remove_prefix(1);
  while (!text.empty() && isBlank(text.back()))
    text.remove_suffix(1);
  while (text.size() > 1 && text.front() == L'0')
    text.remove_prefix(1);
  return text;
}

}  // namespace vyn::ie::gsi
