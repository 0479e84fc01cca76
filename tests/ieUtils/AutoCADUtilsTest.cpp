#include "ieUtils/IEAutoCADUtils.h"

#include <gtest/gtest.h>

#include <array>
#include <climits>
#include <cmath>
#include <limits>
#include <memory>
#include <type_traits>
#include <utility>
#include <vector>

#include "support/LogCapture.h"
#include "support/PrintString.h"

namespace {

using vyn::ie::DexAutoCadUtils;
using vyn::ie::DexDrawLineProperties;
using vyn::ie::EAngleUnits;
using vyn::ie::EDistUnits;
namespace angle = vyn::ie::angle_units;
using String = CVynStringT<wchar_t>;
using DashStyle = DexDrawLineProperties::EDashStyleType;

const std::wstring kSource = L"ieUtils\\IEAutoCADUtils";
constexpr double kNaN = std::numeric_limits<double>::quiet_NaN();
constexpr double kInfinity = std::numeric_limits<double>::infinity();

unsigned long rgb(unsigned long red, unsigned long green, unsigned long blue) {
  return red | (green << 8) | (blue << 16);
}

// The palette as described, computed in floating point: every exact component is a multiple of 1/1200,
// so a nudge of 1e-9 before rounding down repairs representation errors without crossing an integer.
std::array<unsigned long, 256> referencePalette() {
  std::array<unsigned long, 256> palette{};
  const std::array<unsigned long, 10> standard = {
      rgb(0, 0, 0),   rgb(255, 0, 0),   rgb(255, 255, 0), rgb(0, 255, 0),     rgb(0, 255, 255),
      rgb(0, 0, 255), rgb(255, 0, 255), rgb(0, 0, 0),     rgb(128, 128, 128), rgb(192, 192, 192)};
  std::copy(standard.begin(), standard.end(), palette.begin());
  const auto down = [](double value) { return static_cast<unsigned long>(std::floor(value + 1e-9)); };
  for (int group = 0; group < 24; ++group) {
    const double hue = 15.0 * group;
    double r = 0;
    double g = 0;
    double b = 0;
    if (hue <= 60) {
      r = 255, g = 255 * hue / 60;
    } else if (hue <= 120) {
      r = 255 * (120 - hue) / 60, g = 255;
    } else if (hue <= 180) {
      g = 255, b = 255 * (hue - 120) / 60;
    } else if (hue <= 240) {
      g = 255 * (240 - hue) / 60, b = 255;
    } else if (hue <= 300) {
      r = 255 * (hue - 240) / 60, b = 255;
    } else {
      r = 255, b = 255 * (360 - hue) / 60;
    }
    int index = 10 + 10 * group;
    for (const double f : {1.0, 0.8, 0.6, 0.5, 0.3}) {
      palette[index++] = rgb(down(f * r), down(f * g), down(f * b));
      palette[index++] = rgb(down(f * (255 + r) / 2), down(f * (255 + g) / 2), down(f * (255 + b) / 2));
    }
  }
  for (int k = 0; k < 5; ++k) {
    const unsigned long level = down(51 + 40.8 * k);
    palette[250 + k] = rgb(level, level, level);
  }
  palette[255] = rgb(0, 0, 0);
  return palette;
}

std::array<double, 3> toWorld(const DexAutoCadUtils& cad, std::array<double, 3> point,
                              std::array<double, 3> normal) {
  std::array<double, 3> world{};
  cad.convertCPInOcsToWcs(point[0], point[1], point[2], normal[0], normal[1], normal[2], world[0], world[1],
                          world[2]);
  return world;
}

void expectNear(const std::array<double, 3>& actual, const std::array<double, 3>& expected,
                double tolerance) {
  for (std::size_t i = 0; i < 3; ++i)
    EXPECT_NEAR(actual[i], expected[i], tolerance) << "component " << i;
}

}  // namespace

// ---- The class ----------------------------------------------------------------------------------

TEST(DexAutoCadUtils, IsPolymorphicCopyableAndAllocatedByTheHost) {
  static_assert(std::has_virtual_destructor_v<DexAutoCadUtils>);
  static_assert(std::is_copy_constructible_v<DexAutoCadUtils>);
  static_assert(std::is_copy_assignable_v<DexAutoCadUtils>);
  static_assert(sizeof(DexAutoCadUtils::EDexObjectTypeWithName) == 4);
  const std::unique_ptr<DexAutoCadUtils> onHeap(new DexAutoCadUtils);
  ASSERT_NE(onHeap, nullptr);
  EXPECT_EQ(onHeap->convert256ToRgb(1), rgb(255, 0, 0));
}

TEST(DexAutoCadUtils, StartsInRadiansAndMeters) {
  const DexAutoCadUtils cad;
  EXPECT_EQ(cad.getAngleUnits(), vyn::ie::RADIANS);
  EXPECT_EQ(cad.getDistUnits(), vyn::ie::METERS);
}

TEST(DexAutoCadUtils, CopiesAreIndependent) {
  DexAutoCadUtils original;
  original.setAngleUnits(vyn::ie::GRADS_GONS);
  original.setDistUnits(vyn::ie::KILOMETERS);
  DexAutoCadUtils copy(original);
  EXPECT_EQ(copy.getAngleUnits(), vyn::ie::GRADS_GONS);
  EXPECT_EQ(copy.getDistUnits(), vyn::ie::KILOMETERS);
  EXPECT_EQ(copy.convert256ToRgb(110), rgb(0, 255, 127));
  copy.setDistUnits(vyn::ie::MILLIMETERS);
  EXPECT_EQ(original.getDistUnits(), vyn::ie::KILOMETERS);

  DexAutoCadUtils assigned;
  assigned = original;
  EXPECT_EQ(assigned.getAngleUnits(), vyn::ie::GRADS_GONS);
  EXPECT_EQ(assigned.getDistUnits(), vyn::ie::KILOMETERS);
  EXPECT_EQ(assigned.convertRgbTo256(rgb(0, 250, 125)), 110);
}

// ---- Names --------------------------------------------------------------------------------------

TEST(CreateCorrectCadName, EachKindReplacesItsOwnCharacters) {
  const DexAutoCadUtils cad;
  EXPECT_EQ(cad.createCorrectCadName(DexAutoCadUtils::CAD_NAME_STRICT, L"A.B C", true), L"A_B_C");
  EXPECT_EQ(cad.createCorrectCadName(DexAutoCadUtils::CAD_NAME_SYMBOL_TABLE, L"A.B C", true), L"A.B_C");
  EXPECT_EQ(cad.createCorrectCadName(DexAutoCadUtils::CAD_NAME_UNCHANGED, L"A.B C", true), L"A.B C");
  EXPECT_EQ(cad.createCorrectCadName(L"A.B C"), L"A_B_C");
}

TEST(CreateCorrectCadName, TheStrictRuleReplacesItsThirtyFourCharacters) {
  const DexAutoCadUtils cad;
  const String forbidden = L"! .,?%*@#$%^&'\"\\/|~;[]{}()<>`\t\r\n+=";
  ASSERT_EQ(forbidden.GetLength(), 34);
  EXPECT_EQ(cad.createCorrectCadName(DexAutoCadUtils::CAD_NAME_STRICT, forbidden, true), String(L'_', 34));
  EXPECT_EQ(cad.createCorrectCadName(DexAutoCadUtils::CAD_NAME_STRICT, L"Layer-1_a:Ö€", true),
            L"Layer-1_a:Ö€");
}

TEST(CreateCorrectCadName, TheSymbolTableRuleReplacesItsThirteenCharacters) {
  const DexAutoCadUtils cad;
  const String forbidden = L"< >\\/\":?*|,+=";
  ASSERT_EQ(forbidden.GetLength(), 13);
  EXPECT_EQ(cad.createCorrectCadName(DexAutoCadUtils::CAD_NAME_SYMBOL_TABLE, forbidden, true),
            String(L'_', 13));
  EXPECT_EQ(cad.createCorrectCadName(DexAutoCadUtils::CAD_NAME_SYMBOL_TABLE, L".!%#$^&'~;[]{}()`\t", true),
            L".!%#$^&'~;[]{}()`\t");
}

TEST(CreateCorrectCadName, KeepsTheLengthOfLongNames) {
  const DexAutoCadUtils cad;
  String name(L'x', 400);
  name.SetAt(0, L' ');
  name.SetAt(399, L'*');
  const String corrected = cad.createCorrectCadName(name);
  ASSERT_EQ(corrected.GetLength(), 400);
  EXPECT_EQ(corrected[0], L'_');
  EXPECT_EQ(corrected[1], L'x');
  EXPECT_EQ(corrected[399], L'_');
}

TEST(CreateCorrectCadName, AnEmptyNameBecomesZeroOnlyWhenCorrecting) {
  const DexAutoCadUtils cad;
  EXPECT_EQ(cad.createCorrectCadName(L""), L"0");
  EXPECT_EQ(cad.createCorrectCadName(DexAutoCadUtils::CAD_NAME_UNCHANGED, L"", true), L"0");
  EXPECT_EQ(cad.createCorrectCadName(DexAutoCadUtils::CAD_NAME_STRICT, L"", false), L"");
  EXPECT_EQ(cad.createCorrectCadName(DexAutoCadUtils::CAD_NAME_STRICT, L"A.B C", false), L"A.B C");
}

TEST(CreateCorrectCadName, AnUnknownKindIsLoggedAndReplacesNothing) {
  const DexAutoCadUtils cad;
  dex_test::LogCapture log;
  for (const int kind : {3, -1}) {
    EXPECT_EQ(
        cad.createCorrectCadName(static_cast<DexAutoCadUtils::EDexObjectTypeWithName>(kind), L"A.B C", true),
        L"A.B C");
  }
  EXPECT_EQ(log.count(kSource, DexAutoCadUtils::kLogLineUnknownNameKind), 2);
  EXPECT_EQ(log.size(), 2u);
  EXPECT_TRUE(log.records().front().message.empty());
  // Neither an empty name nor a name left alone is checked against the kind.
  log.clear();
  EXPECT_EQ(cad.createCorrectCadName(static_cast<DexAutoCadUtils::EDexObjectTypeWithName>(7), L"", true),
            L"0");
  EXPECT_EQ(cad.createCorrectCadName(static_cast<DexAutoCadUtils::EDexObjectTypeWithName>(7), L"a", false),
            L"a");
  EXPECT_EQ(log.size(), 0u);
}

// ---- Palette ------------------------------------------------------------------------------------

TEST(Convert256ToRgb, GivesTheStandardColours) {
  const DexAutoCadUtils cad;
  EXPECT_EQ(cad.convert256ToRgb(0), rgb(0, 0, 0));
  EXPECT_EQ(cad.convert256ToRgb(1), rgb(255, 0, 0));
  EXPECT_EQ(cad.convert256ToRgb(2), rgb(255, 255, 0));
  EXPECT_EQ(cad.convert256ToRgb(3), rgb(0, 255, 0));
  EXPECT_EQ(cad.convert256ToRgb(4), rgb(0, 255, 255));
  EXPECT_EQ(cad.convert256ToRgb(5), rgb(0, 0, 255));
  EXPECT_EQ(cad.convert256ToRgb(6), rgb(255, 0, 255));
  EXPECT_EQ(cad.convert256ToRgb(7), rgb(0, 0, 0));
  EXPECT_EQ(cad.convert256ToRgb(8), rgb(128, 128, 128));
  EXPECT_EQ(cad.convert256ToRgb(9), rgb(192, 192, 192));
}

TEST(Convert256ToRgb, GivesThePureAndPaleShadesOfAHueGroup) {
  const DexAutoCadUtils cad;
  const std::array<unsigned long, 10> redGroup = {
      rgb(255, 0, 0),   rgb(255, 127, 127), rgb(204, 0, 0),   rgb(204, 102, 102), rgb(153, 0, 0),
      rgb(153, 76, 76), rgb(127, 0, 0),     rgb(127, 63, 63), rgb(76, 0, 0),      rgb(76, 38, 38)};
  for (int i = 0; i < 10; ++i)
    EXPECT_EQ(cad.convert256ToRgb(10 + i), redGroup[static_cast<std::size_t>(i)]) << "index " << 10 + i;
  EXPECT_EQ(cad.convert256ToRgb(110), rgb(0, 255, 127));
  EXPECT_EQ(cad.convert256ToRgb(240), rgb(255, 0, 63));
  EXPECT_EQ(cad.convert256ToRgb(249), rgb(76, 38, 47));
  // Hue 15 degrees: green 63.75 rounds down; its pale shade (255 + 63.75) / 2 = 159.375.
  EXPECT_EQ(cad.convert256ToRgb(20), rgb(255, 63, 0));
  EXPECT_EQ(cad.convert256ToRgb(21), rgb(255, 159, 127));
}

TEST(Convert256ToRgb, GivesTheGreysAndTheFinalBlack) {
  const DexAutoCadUtils cad;
  const std::array<unsigned long, 5> levels = {51, 91, 132, 173, 214};
  for (int k = 0; k < 5; ++k) {
    const unsigned long level = levels[static_cast<std::size_t>(k)];
    EXPECT_EQ(cad.convert256ToRgb(250 + k), rgb(level, level, level));
  }
  EXPECT_EQ(cad.convert256ToRgb(255), rgb(0, 0, 0));
}

TEST(Convert256ToRgb, EveryEntryFollowsTheHueConstruction) {
  const DexAutoCadUtils cad;
  const std::array<unsigned long, 256> reference = referencePalette();
  for (int index = 0; index < 256; ++index)
    EXPECT_EQ(cad.convert256ToRgb(index), reference[static_cast<std::size_t>(index)]) << "index " << index;
}

TEST(Convert256ToRgb, IndexesOutsideThePaletteGiveZero) {
  const DexAutoCadUtils cad;
  EXPECT_EQ(cad.convert256ToRgb(256), 0u);
  EXPECT_EQ(cad.convert256ToRgb(-1), 0u);
  EXPECT_EQ(cad.convert256ToRgb(INT_MAX), 0u);
  EXPECT_EQ(cad.convert256ToRgb(INT_MIN), 0u);
}

// ---- Nearest colour -----------------------------------------------------------------------------

TEST(ConvertRgbTo256, FindsExactHitsAtTheirFirstIndex) {
  const DexAutoCadUtils cad;
  EXPECT_EQ(cad.convertRgbTo256(rgb(255, 0, 0)), 1);  // also at 10
  EXPECT_EQ(cad.convertRgbTo256(rgb(128, 128, 128)), 8);
  EXPECT_EQ(cad.convertRgbTo256(rgb(76, 38, 47)), 249);
  EXPECT_EQ(cad.convertRgbTo256(rgb(214, 214, 214)), 254);
}

TEST(ConvertRgbTo256, FindsTheNearestEntryBySummedDifferences) {
  const DexAutoCadUtils cad;
  EXPECT_EQ(cad.convertRgbTo256(rgb(255, 255, 255)), 254);  // distance 123
  EXPECT_EQ(cad.convertRgbTo256(rgb(0, 250, 125)), 110);
  EXPECT_EQ(cad.convertRgbTo256(rgb(130, 126, 129)), 8);
}

TEST(ConvertRgbTo256, TiesGoToTheLowerIndex) {
  const DexAutoCadUtils cad;
  // One away from both 1 and 10 (both pure red).
  EXPECT_EQ(cad.convertRgbTo256(rgb(255, 0, 1)), 1);
  EXPECT_EQ(cad.convertRgbTo256(rgb(250, 0, 0)), 1);
}

TEST(ConvertRgbTo256, BlackAndColoursNearestToIndexZeroGive250) {
  const DexAutoCadUtils cad;
  EXPECT_EQ(cad.convertRgbTo256(rgb(0, 0, 0)), 250);
  EXPECT_EQ(cad.convertRgbTo256(rgb(10, 10, 10)), 250);
  // One away from 0 and from 7: index 0 wins the tie and becomes 250.
  EXPECT_EQ(cad.convertRgbTo256(rgb(0, 0, 1)), 250);
  // Nearer to the grey 250 itself than to black.
  EXPECT_EQ(cad.convertRgbTo256(rgb(40, 40, 40)), 250);
}

TEST(ConvertRgbTo256, EveryPaletteColourComesBackAtItsFirstIndex) {
  const DexAutoCadUtils cad;
  for (int index = 0; index < 256; ++index) {
    const unsigned long color = cad.convert256ToRgb(index);
    int first = 0;
    while (cad.convert256ToRgb(first) != color)
      ++first;
    EXPECT_EQ(cad.convertRgbTo256(color), first == 0 ? 250 : first) << "index " << index;
  }
}

TEST(ConvertRgbTo256, IgnoresBitsAboveBlue) {
  const DexAutoCadUtils cad;
  EXPECT_EQ(cad.convertRgbTo256(0xFF0000FFul), 1);
  EXPECT_EQ(cad.convertRgbTo256(std::numeric_limits<unsigned long>::max()), 254);
}

// ---- Line types and weights ---------------------------------------------------------------------

TEST(ConvertCustomLineTypeToPredefined, ReadsTheStandardNamesInAnyCase) {
  const DexAutoCadUtils cad;
  EXPECT_EQ(cad.convertCustomLineTypeToPredefined(L"CONTINUOUS"), DexDrawLineProperties::DASH_SOLID);
  EXPECT_EQ(cad.convertCustomLineTypeToPredefined(L"Continuous"), DexDrawLineProperties::DASH_SOLID);
  EXPECT_EQ(cad.convertCustomLineTypeToPredefined(L"dashed"), DexDrawLineProperties::DASH_DASH);
  EXPECT_EQ(cad.convertCustomLineTypeToPredefined(L"Dotted"), DexDrawLineProperties::DASH_DOT);
  EXPECT_EQ(cad.convertCustomLineTypeToPredefined(L"DashDotted"), DexDrawLineProperties::DASH_DASH_DOT);
  EXPECT_EQ(cad.convertCustomLineTypeToPredefined(L"DASHDOTDOTTED"),
            DexDrawLineProperties::DASH_DASH_DOT_DOT);
}

TEST(ConvertCustomLineTypeToPredefined, OtherNamesAreSolid) {
  const DexAutoCadUtils cad;
  for (const wchar_t* name : {L"", L"HIDDEN", L"DASHED2", L" DASHED", L"DASH DOT"})
    EXPECT_EQ(cad.convertCustomLineTypeToPredefined(name), DexDrawLineProperties::DASH_SOLID) << name;
}

TEST(ConvertPredefinedStylesToCadStyles, NamesEachDashStyle) {
  const DexAutoCadUtils cad;
  EXPECT_EQ(cad.convertPredefinedStylesToCadStyles(DexDrawLineProperties::DASH_SOLID), L"Continuous");
  EXPECT_EQ(cad.convertPredefinedStylesToCadStyles(DexDrawLineProperties::DASH_DASH), L"DASHED");
  EXPECT_EQ(cad.convertPredefinedStylesToCadStyles(DexDrawLineProperties::DASH_DOT), L"DOTTED");
  EXPECT_EQ(cad.convertPredefinedStylesToCadStyles(DexDrawLineProperties::DASH_DASH_DOT), L"DASHDOTTED");
  EXPECT_EQ(cad.convertPredefinedStylesToCadStyles(DexDrawLineProperties::DASH_DASH_DOT_DOT),
            L"DASHDOTDOTTED");
  EXPECT_EQ(cad.convertPredefinedStylesToCadStyles(static_cast<DashStyle>(5)), L"Continuous");
  EXPECT_EQ(cad.convertPredefinedStylesToCadStyles(static_cast<DashStyle>(-1)), L"Continuous");
}

TEST(LineTypes, EveryDashStyleSurvivesARoundTrip) {
  const DexAutoCadUtils cad;
  for (int style = 0; style <= 4; ++style) {
    const auto dash = static_cast<DashStyle>(style);
    EXPECT_EQ(cad.convertCustomLineTypeToPredefined(cad.convertPredefinedStylesToCadStyles(dash)), dash);
  }
}

TEST(ConvertLineWeightFromMmtoPixels, StepsAtTheWeightLimits) {
  const DexAutoCadUtils cad;
  const std::vector<std::pair<double, int>> cases = {
      {0, 1},   {30, 1},     {30.5, 2}, {60, 2}, {60.01, 3}, {90, 3},        {90.5, 4},
      {106, 4}, {106.01, 5}, {200, 5},  {-5, 1}, {kNaN, 1},  {kInfinity, 5}, {-kInfinity, 1}};
  for (const auto& [weight, pixels] : cases)
    EXPECT_EQ(cad.convertLineWeightFromMmtoPixels(weight), pixels) << weight;
}

TEST(ConvertLineWeightFromPixelsToMm, GivesTheWeightOfEachWidth) {
  const DexAutoCadUtils cad;
  const std::vector<std::pair<int, int>> cases = {{INT_MIN, 30}, {-1, 30},      {0, 30},  {1, 30},
                                                  {2, 60},       {3, 90},       {4, 106}, {5, 140},
                                                  {6, 200},      {INT_MAX, 200}};
  for (const auto& [pixels, weight] : cases)
    EXPECT_EQ(cad.convertLineWeightFromPixelsToMm(pixels), weight) << pixels;
}

// ---- Units --------------------------------------------------------------------------------------

TEST(SetAngleUnits, StoresMilsAsDecimalDegrees) {
  DexAutoCadUtils cad;
  cad.setAngleUnits(angle::MILS);
  EXPECT_EQ(cad.getAngleUnits(), vyn::ie::DECDEG);
  for (const EAngleUnits units :
       {angle::RADIANS, angle::GRADS_GONS, angle::DECDEG, angle::DDDMMSSS, angle::ANY_UNITS}) {
    cad.setAngleUnits(units);
    EXPECT_EQ(cad.getAngleUnits(), units);
  }
}

TEST(SetDistUnits, StoresFeetAndInchesAsPlainFeet) {
  DexAutoCadUtils cad;
  cad.setDistUnits(vyn::ie::USFEETINCHES);
  EXPECT_EQ(cad.getDistUnits(), vyn::ie::USFEET);
  cad.setDistUnits(vyn::ie::IFEETINCHES);
  EXPECT_EQ(cad.getDistUnits(), vyn::ie::IFEET);
  cad.setDistUnits(vyn::ie::USCHAINS);
  EXPECT_EQ(cad.getDistUnits(), vyn::ie::USCHAINS);
}

TEST(SetAutoCadAngleUnits, ReadsEachCode) {
  DexAutoCadUtils cad;
  const std::vector<std::pair<int, EAngleUnits>> cases = {
      {0, angle::DECDEG}, {1, angle::DDDMMSSS}, {2, angle::GRADS_GONS}, {3, angle::RADIANS}};
  for (const auto& [code, units] : cases) {
    cad.setAutoCadAngleUnits(code, angle::DDDMMSSS);
    EXPECT_EQ(cad.getAngleUnits(), units) << code;
  }
  cad.setAutoCadAngleUnits(4, angle::GRADS_GONS);
  EXPECT_EQ(cad.getAngleUnits(), angle::GRADS_GONS);
  // The fallback is stored as given, mils included.
  cad.setAutoCadAngleUnits(4, angle::MILS);
  EXPECT_EQ(cad.getAngleUnits(), angle::MILS);
}

TEST(SetAutoCadAngleUnits, AnUnknownCodeIsLoggedAndChangesNothing) {
  DexAutoCadUtils cad;
  cad.setAngleUnits(angle::GRADS_GONS);
  const dex_test::LogCapture log;
  cad.setAutoCadAngleUnits(5, angle::DECDEG);
  cad.setAutoCadAngleUnits(-1, angle::DECDEG);
  EXPECT_EQ(cad.getAngleUnits(), angle::GRADS_GONS);
  EXPECT_EQ(log.count(kSource, DexAutoCadUtils::kLogLineUnknownAngleCode), 2);
  EXPECT_EQ(log.size(), 2u);
}

TEST(GetAutoCadAngleUnits, GivesTheCodeOfEachUnit) {
  DexAutoCadUtils cad;
  const std::vector<std::pair<EAngleUnits, int>> cases = {
      {angle::RADIANS, 3}, {angle::GRADS_GONS, 4}, {angle::DECDEG, 0}, {angle::DDDMMSSS, 1}};
  for (const auto& [units, code] : cases) {
    cad.setAngleUnits(units);
    EXPECT_EQ(cad.getAutoCadAngleUnits(), code) << units;
  }
  cad.setAutoCadAngleUnits(4, angle::MILS);
  EXPECT_EQ(cad.getAutoCadAngleUnits(), 0);
}

TEST(GetAutoCadAngleUnits, UnitsWithoutACodeAreLoggedAndGiveZero) {
  DexAutoCadUtils cad;
  const dex_test::LogCapture log;
  cad.setAutoCadAngleUnits(4, angle::ANY_UNITS);
  EXPECT_EQ(cad.getAutoCadAngleUnits(), 0);
  cad.setAngleUnits(static_cast<EAngleUnits>(-3));
  EXPECT_EQ(cad.getAutoCadAngleUnits(), 0);
  EXPECT_EQ(log.count(kSource, DexAutoCadUtils::kLogLineAngleUnitsWithoutCode), 2);
  EXPECT_EQ(log.size(), 2u);
}

TEST(SetAutoCadDistUnits, ReadsEachFixedCode) {
  DexAutoCadUtils cad;
  const std::vector<std::pair<int, int>> cases = {
      {3, 7},   {4, 10},  {5, 11},  {6, 0},   {7, 12},  {8, 13},  {9, 14},  {10, 15}, {11, 17}, {12, 18},
      {13, 19}, {14, 20}, {15, 21}, {16, 22}, {17, 23}, {18, 24}, {19, 25}, {20, 26}, {22, 9}};
  for (const auto& [code, units] : cases) {
    cad.setAutoCadDistUnits(code, vyn::ie::IFEET);
    EXPECT_EQ(cad.getDistUnits(), units) << code;
  }
}

TEST(SetAutoCadDistUnits, InchesAndFeetFollowTheFallback) {
  DexAutoCadUtils cad;
  cad.setAutoCadDistUnits(1, vyn::ie::INCHES);
  EXPECT_EQ(cad.getDistUnits(), vyn::ie::INCHES);
  cad.setAutoCadDistUnits(1, vyn::ie::METERS);
  EXPECT_EQ(cad.getDistUnits(), vyn::ie::USINCHES);
  cad.setAutoCadDistUnits(1, vyn::ie::USINCHES);
  EXPECT_EQ(cad.getDistUnits(), vyn::ie::USINCHES);
  cad.setAutoCadDistUnits(2, vyn::ie::IFEET);
  EXPECT_EQ(cad.getDistUnits(), vyn::ie::IFEET);
  cad.setAutoCadDistUnits(2, vyn::ie::IFEETINCHES);
  EXPECT_EQ(cad.getDistUnits(), vyn::ie::IFEET);
  cad.setAutoCadDistUnits(2, vyn::ie::USFEETINCHES);
  EXPECT_EQ(cad.getDistUnits(), vyn::ie::USFEET);
  cad.setAutoCadDistUnits(2, vyn::ie::METERS);
  EXPECT_EQ(cad.getDistUnits(), vyn::ie::USFEET);
}

TEST(SetAutoCadDistUnits, CodeZeroStoresTheFallbackAsSetDistUnitsDoes) {
  DexAutoCadUtils cad;
  cad.setAutoCadDistUnits(0, vyn::ie::CENTIMETERS);
  EXPECT_EQ(cad.getDistUnits(), vyn::ie::CENTIMETERS);
  cad.setAutoCadDistUnits(0, vyn::ie::USFEETINCHES);
  EXPECT_EQ(cad.getDistUnits(), vyn::ie::USFEET);
  cad.setAutoCadDistUnits(0, vyn::ie::IFEETINCHES);
  EXPECT_EQ(cad.getDistUnits(), vyn::ie::IFEET);
}

TEST(SetAutoCadDistUnits, AnUnknownCodeIsLoggedAndChangesNothing) {
  DexAutoCadUtils cad;
  cad.setDistUnits(vyn::ie::KILOMETERS);
  const dex_test::LogCapture log;
  for (const int code : {21, 23, -1, INT_MAX})
    cad.setAutoCadDistUnits(code, vyn::ie::METERS);
  EXPECT_EQ(cad.getDistUnits(), vyn::ie::KILOMETERS);
  EXPECT_EQ(log.count(kSource, DexAutoCadUtils::kLogLineUnknownDistCode), 4);
  EXPECT_EQ(log.size(), 4u);
}

TEST(GetAutoCadDistUnits, GivesTheCodeOfEachUnit) {
  DexAutoCadUtils cad;
  const std::vector<std::pair<int, int>> cases = {{0, 6},   {27, 6},  {1, 2},   {2, 2},   {7, 3},   {8, 1},
                                                  {9, 22},  {10, 4},  {11, 5},  {12, 7},  {13, 8},  {14, 9},
                                                  {15, 10}, {16, 21}, {17, 11}, {18, 12}, {19, 13}, {20, 14},
                                                  {21, 15}, {22, 16}, {23, 17}, {24, 18}, {25, 19}, {26, 20}};
  const dex_test::LogCapture log;
  for (const auto& [units, code] : cases) {
    cad.setDistUnits(static_cast<EDistUnits>(units));
    EXPECT_EQ(cad.getAutoCadDistUnits(), code) << units;
  }
  EXPECT_EQ(log.size(), 0u);
}

TEST(GetAutoCadDistUnits, UnitsWithoutACodeAreLoggedAndGiveMeters) {
  DexAutoCadUtils cad;
  const dex_test::LogCapture log;
  for (const int units : {5, 6, 28, -1}) {
    cad.setDistUnits(static_cast<EDistUnits>(units));
    EXPECT_EQ(cad.getAutoCadDistUnits(), 6) << units;
  }
  EXPECT_EQ(log.count(kSource, DexAutoCadUtils::kLogLineDistUnitsWithoutCode), 4);
  EXPECT_EQ(log.size(), 4u);
}

TEST(AutoCadDistUnits, CodesSurviveARoundTripExceptWhereTwoCodesShareAUnit) {
  DexAutoCadUtils cad;
  for (int code = 0; code <= 22; ++code) {
    if (code == 21) continue;
    cad.setAutoCadDistUnits(code, vyn::ie::METERS);
    // Code 0 falls back to meters (6); code 1 reads as US inches, whose own code is 22.
    const int expected = code == 0 ? 6 : (code == 1 ? 22 : code);
    EXPECT_EQ(cad.getAutoCadDistUnits(), expected) << code;
  }
}

TEST(AutoCadAngleUnits, CodesSurviveARoundTripExceptTwo) {
  DexAutoCadUtils cad;
  for (int code = 0; code <= 3; ++code) {
    cad.setAutoCadAngleUnits(code, angle::DECDEG);
    // Code 2 reads as grads, which share code 4 with the fallback.
    EXPECT_EQ(cad.getAutoCadAngleUnits(), code == 2 ? 4 : code) << code;
  }
}

// ---- Object coordinate system -------------------------------------------------------------------

TEST(ConvertCPInOcsToWcs, TheStandardNormalLeavesThePointUnchanged) {
  const DexAutoCadUtils cad;
  expectNear(toWorld(cad, {1.5, -2.25, 3.0}, {0, 0, 1}), {1.5, -2.25, 3.0}, 0.0);
}

TEST(ConvertCPInOcsToWcs, TheDownwardNormalMirrorsXAndZ) {
  const DexAutoCadUtils cad;
  expectNear(toWorld(cad, {1, 2, 3}, {0, 0, -1}), {-1, 2, -3}, 0.0);
}

TEST(ConvertCPInOcsToWcs, FollowsTheArbitraryAxisAlgorithm) {
  const DexAutoCadUtils cad;
  // n = (1, 1, 1): x axis (0, 0, 1) x n = (-1, 1, 0) / sqrt 2, y axis n x (x axis) = (-1, -1, 2) / sqrt 6.
  const double s2 = std::sqrt(2.0);
  const double s6 = std::sqrt(6.0);
  const double x = 2.0;
  const double y = -3.0;
  const double z = 0.5;
  expectNear(toWorld(cad, {x, y, z}, {1, 1, 1}), {-x / s2 - y / s6 + z, x / s2 - y / s6 + z, 2 * y / s6 + z},
             1e-12);
  // A normal along x: the object axes are world y and z.
  expectNear(toWorld(cad, {1, 2, 3}, {1, 0, 0}), {3, 1, 2}, 1e-15);
}

TEST(ConvertCPInOcsToWcs, KeepsTheLengthOfThePointForAUnitNormal) {
  const DexAutoCadUtils cad;
  const double length = std::sqrt(0.36 + 0.64);
  const std::array<double, 3> world = toWorld(cad, {3, 4, 12}, {0.6 / length, 0.0, 0.8 / length});
  EXPECT_NEAR(std::hypot(world[0], world[1], world[2]), 13.0, 1e-12);
}

TEST(ConvertCPInOcsToWcs, UsesTheNormalUnnormalisedForZ) {
  const DexAutoCadUtils cad;
  expectNear(toWorld(cad, {1, 2, 3}, {0, 0, 2}), {1, 2, 6}, 0.0);
}

TEST(ConvertCPInOcsToWcs, SwitchesTheReferenceAxisAtOneSixtyFourth) {
  const DexAutoCadUtils cad;
  // At the threshold itself the world z axis is the reference: the x axis becomes world y.
  expectNear(toWorld(cad, {1, 0, 0}, {1.0 / 64, 0, 1}), {0, 1, 0}, 1e-15);
  // Just below it the world y axis is the reference: the x axis stays close to world x.
  const double nx = 1.0 / 64 - 1e-9;
  const double length = std::hypot(1.0, nx);
  expectNear(toWorld(cad, {1, 0, 0}, {nx, 0, 1}), {1 / length, 0, -nx / length}, 1e-12);
}

TEST(ConvertCPInOcsToWcs, AZeroNormalGivesTheOriginWithoutNaN) {
  const DexAutoCadUtils cad;
  expectNear(toWorld(cad, {1, 2, 3}, {0, 0, 0}), {0, 0, 0}, 0.0);
}
