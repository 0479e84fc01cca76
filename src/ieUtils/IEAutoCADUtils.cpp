#include "ieUtils/IEAutoCADUtils.h"

#include <array>
#include <cmath>
#include <cstdlib>
#include <string_view>

#include "hostlibs/VynLogging.h"

namespace vyn::ie {
namespace {

using String = CVynStringT<wchar_t>;
using PaletteEntry = DexAutoCadUtils::PaletteEntry;

constexpr const wchar_t* kLogSource = L"ieUtils\\IEAutoCADUtils";

void logError(int line) {
  vyn_logging::vyn_err_log(kLogSource, line, L"");
}

// ---- Palette ------------------------------------------------------------------------------------

// Indexes 0 to 9: black, the six primaries and secondaries, black again and two greys.
constexpr std::array<PaletteEntry, 10> kStandardColors = {{
    {0, 0, 0},
    {255, 0, 0},
    {255, 255, 0},
    {0, 255, 0},
    {0, 255, 255},
    {0, 0, 255},
    {255, 0, 255},
    {0, 0, 0},
    {128, 128, 128},
    {192, 192, 192},
}};

constexpr int kHueGroups = 24;
constexpr int kHueStep = 15;  // degrees between groups
constexpr int kFullComponent = 255;
// A hue component is held multiplied by 60 (the degrees of one sextant of the colour wheel), so that
// the shades below are computed exactly in integers and floored by integer division.
constexpr int kSextant = 60;
// The shade factors in tenths: 1, 0.8, 0.6, 0.5, 0.3.
constexpr std::array<int, 5> kShadeTenths = {10, 8, 6, 5, 3};
constexpr int kGreyLevels = 5;

// The colour of hue (degrees, 0 to 359) at full saturation and value 255, each component times 60.
std::array<int, 3> hueColorTimesSextant(int hue) {
  const int position = hue % kSextant;
  const int full = kFullComponent * kSextant;
  const int rising = kFullComponent * position;
  const int falling = kFullComponent * (kSextant - position);
  switch (hue / kSextant) {
    case 0:
      return {full, rising, 0};
    case 1:
      return {falling, full, 0};
    case 2:
      return {0, full, rising};
    case 3:
      return {0, falling, full};
    case 4:
      return {rising, 0, full};
    default:
      return {full, 0, falling};
  }
}

// floor(tenths / 10 * component / 60).
std::int32_t pureShade(int tenths, int componentTimesSextant) {
  return tenths * componentTimesSextant / (10 * kSextant);
}

// floor(tenths / 10 * (255 + component / 60) / 2): the shade mixed half with white.
std::int32_t paleShade(int tenths, int componentTimesSextant) {
  return tenths * (kFullComponent * kSextant + componentTimesSextant) / (2 * 10 * kSextant);
}

void appendHueGroup(vyn_vector<PaletteEntry>& palette, int hue) {
  const std::array<int, 3> c = hueColorTimesSextant(hue);
  for (const int tenths : kShadeTenths) {
    palette.push_back({pureShade(tenths, c[0]), pureShade(tenths, c[1]), pureShade(tenths, c[2])});
    palette.push_back({paleShade(tenths, c[0]), paleShade(tenths, c[1]), paleShade(tenths, c[2])});
  }
}

// floor(51 + 40.8 k), in tenths.
std::int32_t greyLevel(int k) {
  return (510 + 408 * k) / 10;
}

vyn_vector<PaletteEntry> makePalette() {
  vyn_vector<PaletteEntry> palette(kStandardColors.begin(), kStandardColors.end());
  palette.reserve(DexAutoCadUtils::kPaletteSize);
  for (int group = 0; group < kHueGroups; ++group)
    appendHueGroup(palette, kHueStep * group);
  for (int k = 0; k < kGreyLevels; ++k)
    palette.push_back({greyLevel(k), greyLevel(k), greyLevel(k)});
  palette.push_back({0, 0, 0});
  return palette;
}

PaletteEntry unpackRgb(unsigned long rgb) {
  return {static_cast<std::int32_t>(rgb & 0xFFu), static_cast<std::int32_t>((rgb >> 8) & 0xFFu),
          static_cast<std::int32_t>((rgb >> 16) & 0xFFu)};
}

unsigned long packRgb(const PaletteEntry& color) {
  return static_cast<unsigned long>(color.red) | (static_cast<unsigned long>(color.green) << 8) |
         (static_cast<unsigned long>(color.blue) << 16);
}

int colorDistance(const PaletteEntry& a, const PaletteEntry& b) {
  return std::abs(a.red - b.red) + std::abs(a.green - b.green) + std::abs(a.blue - b.blue);
}

// ---- Names --------------------------------------------------------------------------------------

constexpr std::wstring_view kStrictForbidden = L"! .,?%*@#$%^&'\"\\/|~;[]{}()<>`\t\r\n+=";
constexpr std::wstring_view kSymbolTableForbidden = L"< >\\/\":?*|,+=";

// ---- Line types and weights ---------------------------------------------------------------------

// Line-type names by dash style 0 to 4, as AutoCAD spells its standard types; writing gives the
// solid style its own spelling.
constexpr std::array<const wchar_t*, 5> kLineTypeNames = {L"CONTINUOUS", L"DASHED", L"DOTTED", L"DASHDOTTED",
                                                          L"DASHDOTDOTTED"};
constexpr const wchar_t* kContinuousName = L"Continuous";

// Upper bounds (inclusive) of the weights drawn 1, 2, 3 and 4 pixels wide; heavier ones are 5.
constexpr std::array<double, 4> kWeightLimits = {30.0, 60.0, 90.0, 106.0};
// Line weights by width in pixels 1 to 5; 0 and less count as 1, 6 and more weigh kHeaviestWeight.
constexpr std::array<int, 5> kWeightOfPixels = {30, 60, 90, 106, 140};
constexpr int kHeaviestWeight = 200;

// ---- Units --------------------------------------------------------------------------------------

constexpr int kNoCode = -1;
constexpr int kNoUnits = -1;

// AutoCAD angle codes (AUNITS) 0 to 3; code 4 stands for the caller's fallback.
constexpr std::array<EAngleUnits, 4> kAngleUnitsOfCode = {DECDEG, DDDMMSSS, GRADS_GONS, RADIANS};
constexpr int kAngleFallbackCode = 4;
// By EAngleUnits 0 to 4.
constexpr std::array<int, 5> kAngleCodeOfUnits = {3, 4, 0, 0, 1};

// AutoCAD length codes (INSUNITS) 0 to 22 as EDistUnits. Codes 0 (the fallback), 1 (inches) and
// 2 (feet) depend on the fallback; 21 (US survey feet in AutoCAD's own list) has no entry.
constexpr int kDistFallbackCode = 0;
constexpr int kInchesCode = 1;
constexpr int kFeetCode = 2;
// clang-format off
constexpr std::array<int, 23> kDistUnitsOfCode = {
    kNoUnits,    kNoUnits,    kNoUnits,           MILE,         //  0 to  3
    MILLIMETERS, CENTIMETERS, METERS,             KILOMETERS,   //  4 to  7
    MICROINCHES, EDistUnits::MILS, IYARDS,        ANGSTROMS,    //  8 to 11
    NANOMETERS,  MICRONS,     DECIMETERS,         DECAMETERS,   // 12 to 15
    HECTOMETER,  GIGAMETERS,  ASTRONOMICAL_UNITS, LIGHT_YEARS,  // 16 to 19
    PARSECS,     kNoUnits,    USINCHES};                        // 20 to 22
// By EDistUnits 0 to 27; feet and inches and the chains have no code.
constexpr std::array<int, 28> kDistCodeOfUnits = {
    6,  2,  2,  kNoCode, kNoCode, kNoCode, kNoCode, 3,  // METERS to MILE
    1,  22, 4,  5,  7,  8,  9,  10,                     // INCHES to IYARDS
    21, 11, 12, 13, 14, 15, 16, 17,                     // USYARDS to GIGAMETERS
    18, 19, 20, 6};                                     // ASTRONOMICAL_UNITS to ANY_UNITS
// clang-format on

template <std::size_t N>
int lookUp(const std::array<int, N>& table, int index, int missing) {
  return index >= 0 && static_cast<std::size_t>(index) < N ? table[static_cast<std::size_t>(index)] : missing;
}

EDistUnits withoutInches(EDistUnits units) {
  if (units == USFEETINCHES) return USFEET;
  if (units == IFEETINCHES) return IFEET;
  return units;
}

// ---- Object coordinate system -------------------------------------------------------------------

// Below this both horizontal components, the extrusion counts as nearly vertical (DXF arbitrary axis).
constexpr double kArbitraryAxisLimit = 1.0 / 64.0;

struct Vector3 {
  double x;
  double y;
  double z;
};

Vector3 cross(const Vector3& a, const Vector3& b) {
  return {a.y * b.z - a.z * b.y, a.z * b.x - a.x * b.z, a.x * b.y - a.y * b.x};
}

Vector3 normalised(const Vector3& v) {
  const double length = std::sqrt(v.x * v.x + v.y * v.y + v.z * v.z);
  if (length == 0.0) return v;
  return {v.x / length, v.y / length, v.z / length};
}

}  // namespace

// ---- Construction -------------------------------------------------------------------------------

DexAutoCadUtils::DexAutoCadUtils() : palette_(makePalette()) {}

DexAutoCadUtils::DexAutoCadUtils(const DexAutoCadUtils& other) = default;

DexAutoCadUtils& DexAutoCadUtils::operator=(const DexAutoCadUtils& other) = default;

DexAutoCadUtils::~DexAutoCadUtils() = default;

// ---- Names --------------------------------------------------------------------------------------

String DexAutoCadUtils::createCorrectCadName(EDexObjectTypeWithName kind, const String& name,
                                             bool correct) const {
  if (!correct) return name;
  if (name.IsEmpty()) return String(L"0");

  std::wstring_view forbidden;
  switch (kind) {
    case CAD_NAME_STRICT:
      forbidden = kStrictForbidden;
      break;
    case CAD_NAME_SYMBOL_TABLE:
      forbidden = kSymbolTableForbidden;
      break;
    case CAD_NAME_UNCHANGED:
      break;
    default:
      logError(kLogLineUnknownNameKind);
      break;
  }
  String corrected = name;
  for (int i = 0; i < corrected.GetLength(); ++i) {
    if (forbidden.find(corrected[i]) != std::wstring_view::npos) corrected.SetAt(i, L'_');
  }
  return corrected;
}

String DexAutoCadUtils::createCorrectCadName(const String& name) const {
  return createCorrectCadName(CAD_NAME_STRICT, name, true);
}

// ---- Colours ------------------------------------------------------------------------------------

int DexAutoCadUtils::convertRgbTo256(unsigned long rgb) const {
  if (palette_.empty()) return kBlackIndex;
  const PaletteEntry wanted = unpackRgb(rgb);
  int bestDistance = 17000000;
  int bestIndex = 0;
  for (std::size_t i = 0; i < palette_.size() && bestDistance != 0; ++i) {
    const int distance = colorDistance(wanted, palette_[i]);
    if (distance < bestDistance) {
      bestDistance = distance;
      bestIndex = static_cast<int>(i);
    }
  }
  // Index 0 is "by block" in AutoCAD, not a colour; black is drawn with the darkest grey.
  return bestIndex == 0 ? kBlackIndex : bestIndex;
}

unsigned long DexAutoCadUtils::convert256ToRgb(int index) const {
  if (index < 0 || static_cast<std::size_t>(index) >= palette_.size()) return 0;
  return packRgb(palette_[static_cast<std::size_t>(index)]);
}

// ---- Line types and weights ---------------------------------------------------------------------

DexDrawLineProperties::EDashStyleType DexAutoCadUtils::convertCustomLineTypeToPredefined(
    const String& name) const {
  for (std::size_t style = 0; style < kLineTypeNames.size(); ++style) {
    if (name.CompareNoCase(kLineTypeNames[style]) == 0)
      return static_cast<DexDrawLineProperties::EDashStyleType>(style);
  }
  return DexDrawLineProperties::DASH_SOLID;
}

String DexAutoCadUtils::convertPredefinedStylesToCadStyles(
    DexDrawLineProperties::EDashStyleType style) const {
  if (style <= DexDrawLineProperties::DASH_SOLID || static_cast<std::size_t>(style) >= kLineTypeNames.size())
    return String(kContinuousName);
  return String(kLineTypeNames[static_cast<std::size_t>(style)]);
}

int DexAutoCadUtils::convertLineWeightFromMmtoPixels(double weight) const {
  int pixels = 1;
  for (const double limit : kWeightLimits) {
    if (weight > limit) ++pixels;
  }
  return pixels;
}

int DexAutoCadUtils::convertLineWeightFromPixelsToMm(int pixels) const {
  if (pixels <= 1) return kWeightOfPixels.front();
  return lookUp(kWeightOfPixels, pixels - 1, kHeaviestWeight);
}

// ---- Units --------------------------------------------------------------------------------------

void DexAutoCadUtils::setAngleUnits(EAngleUnits units) {
  angleUnits_ = units == angle_units::MILS ? DECDEG : units;
}

void DexAutoCadUtils::setDistUnits(EDistUnits units) {
  distUnits_ = withoutInches(units);
}

int DexAutoCadUtils::getAutoCadAngleUnits() const {
  const int code = lookUp(kAngleCodeOfUnits, angleUnits_, kNoCode);
  if (code != kNoCode) return code;
  logError(kLogLineAngleUnitsWithoutCode);
  return 0;
}

int DexAutoCadUtils::getAutoCadDistUnits() const {
  constexpr int kMetersCode = 6;
  const int code = lookUp(kDistCodeOfUnits, distUnits_, kNoCode);
  if (code != kNoCode) return code;
  logError(kLogLineDistUnitsWithoutCode);
  return kMetersCode;
}

void DexAutoCadUtils::setAutoCadAngleUnits(int code, EAngleUnits fallback) {
  if (code == kAngleFallbackCode) {
    angleUnits_ = fallback;
  } else if (code >= 0 && static_cast<std::size_t>(code) < kAngleUnitsOfCode.size()) {
    angleUnits_ = kAngleUnitsOfCode[static_cast<std::size_t>(code)];
  } else {
    logError(kLogLineUnknownAngleCode);
  }
}

void DexAutoCadUtils::setAutoCadDistUnits(int code, EDistUnits fallback) {
  switch (code) {
    case kDistFallbackCode:
      setDistUnits(fallback);
      return;
    case kInchesCode:
      distUnits_ = fallback == INCHES ? INCHES : USINCHES;
      return;
    case kFeetCode:
      distUnits_ = fallback == IFEET || fallback == IFEETINCHES ? IFEET : USFEET;
      return;
    default:
      break;
  }
  const int units = lookUp(kDistUnitsOfCode, code, kNoUnits);
  if (units == kNoUnits) {
    logError(kLogLineUnknownDistCode);
    return;
  }
  distUnits_ = static_cast<EDistUnits>(units);
}

// ---- Object coordinate system -------------------------------------------------------------------

void DexAutoCadUtils::convertCPInOcsToWcs(double x, double y, double z, double nx, double ny, double nz,
                                          double& wx, double& wy, double& wz) const {
  const Vector3 normal{nx, ny, nz};
  const bool nearlyVertical = std::fabs(nx) < kArbitraryAxisLimit && std::fabs(ny) < kArbitraryAxisLimit;
  const Vector3 worldAxis = nearlyVertical ? Vector3{0.0, 1.0, 0.0} : Vector3{0.0, 0.0, 1.0};
  const Vector3 xAxis = normalised(cross(worldAxis, normal));
  const Vector3 yAxis = normalised(cross(normal, xAxis));
  wx = x * xAxis.x + y * yAxis.x + z * normal.x;
  wy = x * xAxis.y + y * yAxis.y + z * normal.y;
  wz = x * xAxis.z + y * yAxis.z + z * normal.z;
}

}  // namespace vyn::ie
