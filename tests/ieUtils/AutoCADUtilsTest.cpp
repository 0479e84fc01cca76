#include "ieUtils/IEAutoCADUtils.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <array>
#include <cmath>
#include <functional>
#include <map>
#include <sstream>
#include <string>

#include "support/Cases.h"
#include "support/LogCapture.h"
#include "support/PrintString.h"

namespace {

using namespace vyn::ie;
using String = CVynStringT<wchar_t>;
using dex_test::Case;
using Point = std::array<double, 3>;

const std::wstring kSource = L"ieUtils\\IEAutoCADUtils";

unsigned long rgb(unsigned long red, unsigned long green, unsigned long blue) {
  return red | (green << 8) | (blue << 16);
}

unsigned long rgbOf(const Case& c, std::size_t i) {
  std::istringstream parts(c[i]);
  unsigned long red = 0;
  unsigned long green = 0;
  unsigned long blue = 0;
  parts >> red >> green >> blue;
  return rgb(red, green, blue);
}

// Checks one case of tests/data/cases/autocad.txt; unit and code checks that expect -1 expect a log
// record and no change.
const std::map<std::string, std::function<void(const Case&, DexAutoCadUtils&)>> kChecks = {
    {"name",
     [](const Case& c, DexAutoCadUtils& cad) {
       const auto kind = static_cast<DexAutoCadUtils::EDexObjectTypeWithName>(c.integer(1));
       EXPECT_EQ(cad.createCorrectCadName(kind, c.text(3).c_str(), c[2] == "1"), String(c.text(4).c_str()));
     }},
    {"rgb",
     [](const Case& c, DexAutoCadUtils& cad) { EXPECT_EQ(cad.convert256ToRgb(c.integer(1)), rgbOf(c, 2)); }},
    {"nearest",
     [](const Case& c, DexAutoCadUtils& cad) { EXPECT_EQ(cad.convertRgbTo256(rgbOf(c, 1)), c.integer(2)); }},
    {"lineType",
     [](const Case& c, DexAutoCadUtils& cad) {
       EXPECT_EQ(cad.convertCustomLineTypeToPredefined(c.text(1).c_str()), c.integer(2));
     }},
    {"cadLineType",
     [](const Case& c, DexAutoCadUtils& cad) {
       const auto style = static_cast<DexDrawLineProperties::EDashStyleType>(c.integer(1));
       EXPECT_EQ(cad.convertPredefinedStylesToCadStyles(style), String(c.text(2).c_str()));
     }},
    {"pixels",
     [](const Case& c, DexAutoCadUtils& cad) {
       EXPECT_EQ(cad.convertLineWeightFromMmtoPixels(c.number(1)), c.integer(2));
     }},
    {"weight",
     [](const Case& c, DexAutoCadUtils& cad) {
       EXPECT_EQ(cad.convertLineWeightFromPixelsToMm(c.integer(1)), c.integer(2));
     }},
    {"distCode",
     [](const Case& c, DexAutoCadUtils& cad) {
       cad.setDistUnits(KILOMETERS);
       const dex_test::LogCapture log;
       cad.setAutoCadDistUnits(c.integer(1), static_cast<EDistUnits>(c.integer(2)));
       const bool unknown = c.integer(3) == -1;
       EXPECT_EQ(cad.getDistUnits(), unknown ? KILOMETERS : c.integer(3));
       EXPECT_EQ(log.count(kSource, DexAutoCadUtils::kLogLineUnknownDistCode), unknown ? 1 : 0);
     }},
    {"codeOfDist",
     [](const Case& c, DexAutoCadUtils& cad) {
       cad.setDistUnits(static_cast<EDistUnits>(c.integer(1)));
       const dex_test::LogCapture log;
       const bool none = c.integer(2) == -1;
       EXPECT_EQ(cad.getAutoCadDistUnits(), none ? 6 : c.integer(2));
       EXPECT_EQ(log.count(kSource, DexAutoCadUtils::kLogLineDistUnitsWithoutCode), none ? 1 : 0);
     }},
    {"angleCode",
     [](const Case& c, DexAutoCadUtils& cad) {
       cad.setAngleUnits(GRADS_GONS);
       const dex_test::LogCapture log;
       cad.setAutoCadAngleUnits(c.integer(1), static_cast<EAngleUnits>(c.integer(2)));
       const bool unknown = c.integer(3) == -1;
       EXPECT_EQ(cad.getAngleUnits(), unknown ? GRADS_GONS : c.integer(3));
       EXPECT_EQ(log.count(kSource, DexAutoCadUtils::kLogLineUnknownAngleCode), unknown ? 1 : 0);
     }},
    {"codeOfAngle", [](const Case& c, DexAutoCadUtils& cad) {
       cad.setAngleUnits(static_cast<EAngleUnits>(c.integer(1)));
       const dex_test::LogCapture log;
       const bool none = c.integer(2) == -1;
       EXPECT_EQ(cad.getAutoCadAngleUnits(), none ? 0 : c.integer(2));
       EXPECT_EQ(log.count(kSource, DexAutoCadUtils::kLogLineAngleUnitsWithoutCode), none ? 1 : 0);
     }}};

TEST(DexAutoCadUtils, NamesColoursLineStylesAndUnitCodesAreAsTheCasesGive) {
  DexAutoCadUtils cad;
  dex_test::forEachCase("autocad.txt", [&cad](const Case& c) { kChecks.at(c[0])(c, cad); });
  const dex_test::LogCapture log;  // an unknown name kind is logged and replaces nothing
  EXPECT_EQ(cad.createCorrectCadName(static_cast<DexAutoCadUtils::EDexObjectTypeWithName>(3), L"A.B C", true),
            L"A.B C");
  EXPECT_EQ(log.count(kSource, DexAutoCadUtils::kLogLineUnknownNameKind), 1);
  EXPECT_TRUE(log.records().front().message.empty());
  EXPECT_EQ(cad.createCorrectCadName(L"A.B C"), L"A_B_C");
  String name(L'x', 400);  // long names keep their length
  name.SetAt(0, L' ');
  EXPECT_EQ(cad.createCorrectCadName(name), L"_" + String(L'x', 399));
  EXPECT_EQ(cad.convertRgbTo256(0xFF0000FFul), 1);  // bits above blue are ignored
}

TEST(DexAutoCadUtils, EveryPaletteEntryFollowsTheHueConstructionAndComesBackAtItsFirstIndex) {
  std::array<unsigned long, 256> palette{
      rgb(0, 0, 0),   rgb(255, 0, 0),   rgb(255, 255, 0), rgb(0, 255, 0),     rgb(0, 255, 255),
      rgb(0, 0, 255), rgb(255, 0, 255), rgb(0, 0, 0),     rgb(128, 128, 128), rgb(192, 192, 192)};
  // Every exact component is a multiple of 1/1200: a nudge of 1e-9 before rounding down repairs
  // representation errors without crossing an integer.
  const auto down = [](double value) { return static_cast<unsigned long>(std::floor(value + 1e-9)); };
  for (int group = 0; group < 24; ++group) {
    const double hue = 15.0 * group;
    const double r = hue <= 60 || hue > 300
                         ? 255
                         : (hue <= 120 ? 255 * (120 - hue) / 60 : (hue > 240 ? 255 * (hue - 240) / 60 : 0));
    const double g =
        hue <= 60 ? 255 * hue / 60 : (hue <= 180 ? 255 : (hue <= 240 ? 255 * (240 - hue) / 60 : 0));
    const double b =
        hue <= 120 ? 0 : (hue <= 180 ? 255 * (hue - 120) / 60 : (hue <= 300 ? 255 : 255 * (360 - hue) / 60));
    int index = 10 + 10 * group;
    for (const double f : {1.0, 0.8, 0.6, 0.5, 0.3}) {
      palette[index++] = rgb(down(f * r), down(f * g), down(f * b));
      palette[index++] = rgb(down(f * (255 + r) / 2), down(f * (255 + g) / 2), down(f * (255 + b) / 2));
    }
  }
  for (int k = 0; k < 5; ++k)
    palette[250 + k] = rgb(down(51 + 40.8 * k), down(51 + 40.8 * k), down(51 + 40.8 * k));
  const DexAutoCadUtils cad;
  for (int index = 0; index < 256; ++index) {
    EXPECT_EQ(cad.convert256ToRgb(index), palette[index]) << index;
    const int first =
        static_cast<int>(std::find(palette.begin(), palette.end(), palette[index]) - palette.begin());
    EXPECT_EQ(cad.convertRgbTo256(palette[index]), first == 0 ? 250 : first) << index;
  }
}

TEST(DexAutoCadUtils, UnitsDefaultToRadiansAndMetersAndCopiesAreIndependent) {
  DexAutoCadUtils original;
  EXPECT_TRUE(original.getAngleUnits() == RADIANS && original.getDistUnits() == METERS);
  original.setAngleUnits(angle_units::MILS);  // stored as decimal degrees
  EXPECT_EQ(original.getAngleUnits(), DECDEG);
  original.setDistUnits(IFEETINCHES);  // stored as plain feet
  EXPECT_EQ(original.getDistUnits(), IFEET);
  original.setAngleUnits(GRADS_GONS);
  original.setDistUnits(KILOMETERS);
  DexAutoCadUtils copy(original);
  copy.setDistUnits(MILLIMETERS);
  DexAutoCadUtils assigned;
  assigned = original;
  EXPECT_TRUE(copy.getAngleUnits() == GRADS_GONS && original.getDistUnits() == KILOMETERS);
  EXPECT_TRUE(assigned.getAngleUnits() == GRADS_GONS && assigned.getDistUnits() == KILOMETERS);
  for (int style = 0; style <= 4; ++style) {
    const auto dash = static_cast<DexDrawLineProperties::EDashStyleType>(style);
    EXPECT_EQ(copy.convertCustomLineTypeToPredefined(copy.convertPredefinedStylesToCadStyles(dash)), dash);
  }
  for (int code = 0; code <= 22; ++code) {  // codes survive a round trip but where two codes share a unit
    if (code == 21) continue;
    copy.setAutoCadDistUnits(code, METERS);
    EXPECT_EQ(copy.getAutoCadDistUnits(), code == 0 ? 6 : (code == 1 ? 22 : code)) << code;
  }
  for (int code = 0; code <= 3; ++code) {
    copy.setAutoCadAngleUnits(code, DECDEG);
    EXPECT_EQ(copy.getAutoCadAngleUnits(), code == 2 ? 4 : code) << code;
  }
}

TEST(DexAutoCadUtils, ObjectCoordinatesGoToWorldCoordinatesByTheArbitraryAxisAlgorithm) {
  const DexAutoCadUtils cad;
  const auto world = [&cad](Point p, Point n) {
    Point w{};
    cad.convertCPInOcsToWcs(p[0], p[1], p[2], n[0], n[1], n[2], w[0], w[1], w[2]);
    return w;
  };
  const auto expectNear = [](const Point& actual, const Point& expected, double tolerance) {
    for (std::size_t i = 0; i < 3; ++i)
      EXPECT_NEAR(actual[i], expected[i], tolerance) << "component " << i;
  };
  expectNear(world({1.5, -2.25, 3.0}, {0, 0, 1}), {1.5, -2.25, 3.0}, 0.0);
  expectNear(world({1, 2, 3}, {0, 0, -1}), {-1, 2, -3}, 0.0);
  expectNear(world({1, 2, 3}, {0, 0, 2}), {1, 2, 6}, 0.0);  // z takes the normal unnormalised
  expectNear(world({1, 2, 3}, {0, 0, 0}), {0, 0, 0}, 0.0);  // a zero normal gives the origin, no NaN
  // n = (1, 1, 1): x axis (0, 0, 1) x n = (-1, 1, 0) / sqrt 2, y axis n x (x axis) = (-1, -1, 2) / sqrt 6.
  const double s2 = std::sqrt(2.0);
  const double s6 = std::sqrt(6.0);
  expectNear(world({2.0, -3.0, 0.5}, {1, 1, 1}),
             {-2.0 / s2 + 3.0 / s6 + 0.5, 2.0 / s2 + 3.0 / s6 + 0.5, -6.0 / s6 + 0.5}, 1e-12);
  expectNear(world({1, 2, 3}, {1, 0, 0}), {3, 1, 2}, 1e-15);
  const Point unit = world({3, 4, 12}, {0.6, 0.0, 0.8});
  EXPECT_NEAR(std::hypot(unit[0], unit[1], unit[2]), 13.0, 1e-12);
  // At one sixty-fourth the world z axis is the reference; just below it the world y axis.
  expectNear(world({1, 0, 0}, {1.0 / 64, 0, 1}), {0, 1, 0}, 1e-15);
  const double nx = 1.0 / 64 - 1e-9;
  expectNear(world({1, 0, 0}, {nx, 0, 1}), {1 / std::hypot(1.0, nx), 0, -nx / std::hypot(1.0, nx)}, 1e-12);
}

}  // namespace
