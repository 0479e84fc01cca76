#include "LandXmlWords.h"

#include <algorithm>
#include <array>

namespace vyn::ie::landxml {

namespace {

struct LinearWord {
  std::wstring_view word;
  EDistUnits units;
  bool imperial;
};

constexpr std::array<LinearWord, 8> kLinearWords{{
    {L"meter", METERS, false},
    {L"millimeter", MILLIMETERS, false},
    {L"centimeter", CENTIMETERS, false},
    {L"kilometer", KILOMETERS, false},
    {L"foot", IFEET, true},
    {L"USSurveyFoot", USFEET, true},
    {L"inch", INCHES, true},
    {L"mile", MILE, true},
}};

struct AngularWord {
  std::wstring_view word;
  EAngleUnits units;
};

constexpr std::array<AngularWord, 4> kAngularWords{{
    {L"radians", RADIANS},
    {L"grads", GRADS_GONS},
    {L"decimal degrees", DECDEG},
    {L"decimal dd.mm.ss", DDDMMSSS},
}};

constexpr std::array<std::wstring_view, 4> kStateWords{L"abandoned", L"destroyed", L"existing", L"proposed"};

struct BreaklineWord {
  std::wstring_view word;
  int type;
};

constexpr std::array<BreaklineWord, 4> kBreaklineWords{{
    {L"standard", 0},
    {L"wall", 2},
    {L"proximity", 3},
    {L"nondestructive", 4},
}};

constexpr std::array<std::wstring_view, 23> kDerivedAttributes{
    L"length",   L"dir",    L"radius",  L"chord",   L"delta",    L"dirStart", L"dirEnd",      L"tangent",
    L"external", L"midOrd", L"crvType", L"area",    L"elevMax",  L"elevMin",  L"area2DSurf",  L"area3DSurf",
    L"theta",    L"totalX", L"totalY",  L"tanLong", L"tanShort", L"staStart", L"staIncrement"};

constexpr unsigned stateMask() {
  unsigned mask = 0;
  for (unsigned i = 0; i < kStateWords.size(); ++i)
    mask |= 1u << (kFirstStateFlag + i);
  return mask;
}

template <class Table, class Key>
auto findIn(const Table& table, const Key& key) {
  return std::find_if(table.begin(), table.end(), key);
}

}  // namespace

bool isLandXmlFormat(const DexFormat* format) {
  return format != nullptr && format->isIdEqual(kFormatId);
}

bool isDerivedAttribute(std::wstring_view name) {
  return std::find(kDerivedAttributes.begin(), kDerivedAttributes.end(), name) != kDerivedAttributes.end();
}

bool isFramingAttribute(std::wstring_view name) {
  return name == attribute::kVersion || name == attribute::kDate || name == attribute::kTime ||
         name == attribute::kLanguage || name == attribute::kReadOnly || name == L"xmlns" ||
         name.rfind(L"xmlns:", 0) == 0 || name.rfind(L"xsi:", 0) == 0;
}

bool linearUnitFromWord(std::wstring_view word, EDistUnits& units) {
  const auto found = findIn(kLinearWords, [word](const LinearWord& entry) { return entry.word == word; });
  if (found == kLinearWords.end()) return false;
  units = found->units;
  return true;
}

bool angularUnitFromWord(std::wstring_view word, EAngleUnits& units) {
  const auto found = findIn(kAngularWords, [word](const AngularWord& entry) { return entry.word == word; });
  if (found == kAngularWords.end()) return false;
  units = found->units;
  return true;
}

std::wstring_view wordOfLinearUnit(EDistUnits units) {
  const auto found = findIn(kLinearWords, [units](const LinearWord& entry) { return entry.units == units; });
  return found == kLinearWords.end() ? std::wstring_view() : found->word;
}

std::wstring_view wordOfAngularUnit(EAngleUnits units) {
  const auto found =
      findIn(kAngularWords, [units](const AngularWord& entry) { return entry.units == units; });
  return found == kAngularWords.end() ? std::wstring_view() : found->word;
}

bool isImperialUnit(EDistUnits units) {
  const auto found = findIn(kLinearWords, [units](const LinearWord& entry) { return entry.units == units; });
  return found != kLinearWords.end() && found->imperial;
}

bool isUnitOfUnreadValues(std::wstring_view attribute) {
  return attribute.size() > 4 && attribute.substr(attribute.size() - 4) == L"Unit" &&
         attribute != attribute::kLinearUnit && attribute != attribute::kAngularUnit &&
         attribute != attribute::kDirectionUnit;
}

bool stateFlagFromWord(std::wstring_view word, unsigned& flag) {
  const auto found = std::find(kStateWords.begin(), kStateWords.end(), word);
  if (found == kStateWords.end()) return false;
  flag = kFirstStateFlag + static_cast<unsigned>(found - kStateWords.begin());
  return true;
}

std::wstring_view wordOfStateFlags(unsigned stationAttrs) {
  for (unsigned i = 0; i < kStateWords.size(); ++i) {
    if ((stationAttrs & (1u << (kFirstStateFlag + i))) != 0) return kStateWords[i];
  }
  return {};
}

unsigned withoutStateFlags(unsigned stationAttrs) {
  return stationAttrs & ~stateMask();
}

bool breaklineTypeFromWord(std::wstring_view word, int& type) {
  const auto found =
      findIn(kBreaklineWords, [word](const BreaklineWord& entry) { return entry.word == word; });
  if (found == kBreaklineWords.end()) return false;
  type = found->type;
  return true;
}

std::wstring_view wordOfBreaklineType(int type) {
  const auto found =
      findIn(kBreaklineWords, [type](const BreaklineWord& entry) { return entry.type == type; });
  return found == kBreaklineWords.end() ? std::wstring_view() : found->word;
}

}  // namespace vyn::ie::landxml
