#include "ieUtils/IEAutoCADUtils.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <array>
#include <cmath>
#include <sstream>
#include <string>

#include "support/Cases.h"
#include "support/LogCapture.h"
#include "support/PrintString.h"

namespace {

using namespace vyn::ie;
using String = CVynStringT<wchar_t>;
using dex_test::Case;

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
void check(const Case& c, DexAutoCadUtils& cad) {
  const std::string& op = c[0];
  const dex_test::LogCapture log;
  const bool none = c.integer(op == "distCode" || op == "angleCode" ? 3 : 2) == -1;
  if (op == "name") {
    const auto kind = static_cast<DexAutoCadUtils::EDexObjectTypeWithName>(c.integer(1));
    EXPECT_EQ(String(c.text(4).c_str()), cad.createCorrectCadName(kind, c.text(3).c_str(), c[2] == "1"));
  } else if (op == "rgb") {
    EXPECT_EQ(rgbOf(c, 2), cad.convert256ToRgb(c.integer(1)));
  } else if (op == "nearest") {
    EXPECT_EQ(c.integer(2), cad.convertRgbTo256(rgbOf(c, 1)));
  } else if (op == "lineType") {
    EXPECT_EQ(c.integer(2), cad.convertCustomLineTypeToPredefined(c.text(1).c_str()));
  } else if (op == "cadLineType") {
    const auto style = static_cast<DexDrawLineProperties::EDashStyleType>(c.integer(1));
    EXPECT_EQ(String(c.text(2).c_str()), cad.convertPredefinedStylesToCadStyles(style));
  } else if (op == "pixels") {
    EXPECT_EQ(c.integer(2), cad.convertLineWeightFromMmtoPixels(c.number(1)));
  } else if (op == "weight") {
    EXPECT_EQ(c.integer(2), cad.convertLineWeightFromPixelsToMm(c.integer(1)));
  } else if (op == "distCode") {
    cad.setDistUnits(KILOMETERS);
    cad.setAutoCadDistUnits(c.integer(1), static_cast<EDistUnits>(c.integer(2)));
    EXPECT_EQ(none ? KILOMETERS : c.integer(3), cad.getDistUnits());
    EXPECT_EQ(none ? 1 : 0, log.count(kSource, DexAutoCadUtils::kLogLineUnknownDistCode));
  } else if (op == "codeOfDist") {
    cad.setDistUnits(static_cast<EDistUnits>(c.integer(1)));
    EXPECT_EQ(none ? 6 : c.integer(2), cad.getAutoCadDistUnits());
    EXPECT_EQ(none ? 1 : 0, log.count(kSource, DexAutoCadUtils::kLogLineDistUnitsWithoutCode));
  } else if (op == "angleCode") {
    cad.setAngleUnits(GRADS_GONS);
    cad.setAutoCadAngleUnits(c.integer(1), static_cast<EAngleUnits>(c.integer(2)));
    EXPECT_EQ(none ? GRADS_GONS : c.integer(3), cad.getAngleUnits());
    EXPECT_EQ(none ? 1 : 0, log.count(kSource, DexAutoCadUtils::kLogLineUnknownAngleCode));
  } else if (op == "codeOfAngle") {
    cad.setAngleUnits(static_cast<EAngleUnits>(c.integer(1)));
    EXPECT_EQ(none ? 0 : c.integer(2), cad.getAutoCadAngleUnits());
    EXPECT_EQ(none ? 1 : 0, log.count(kSource, DexAutoCadUtils::kLogLineAngleUnitsWithoutCode));
  } else {
    ASSERT_EQ("ocs", op);  // object coordinates to world coordinates
    const std::vector<double> v = c.numbers(1);
    const std::vector<double> expected = c.numbers(2);
    double w[3] = {7, 7, 7};
    cad.convertCPInOcsToWcs(v[0], v[1], v[2], v[3], v[4], v[5], w[0], w[1], w[2]);
    for (std::size_t i = 0; i < 3; ++i)
      EXPECT_NEAR(expected[i], w[i], c.number(3)) << i;
  }
}

TEST(DexAutoCadUtils, NamesColoursLineStylesAndUnitCodesAreAsTheCasesGive) {
  DexAutoCadUtils cad;
  dex_test::forEachCase("autocad.txt", [&cad](const Case& c) { check(c, cad); });
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

TEST(DexAutoCadUtils, ObjectCoordinatesKeepTheirLengthInWorldCoordinates) {
  const DexAutoCadUtils cad;
  double w[3] = {};
  cad.convertCPInOcsToWcs(3, 4, 12, 0.6, 0.0, 0.8, w[0], w[1], w[2]);
  EXPECT_NEAR(13.0, std::hypot(w[0], w[1], w[2]), 1e-12);
}

}  // namespace
