#include "hostlibs/vynmath.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <cmath>
#include <functional>
#include <limits>
#include <map>
#include <string>
#include <utility>
#include <vector>

#include "hostlibs/VynFormats.h"
#include "support/Cases.h"
#include "support/PrintString.h"

namespace {

using Point = vyn_math::TAbstractPoint<double>;
using Arguments = std::vector<double>;

bool wrap(const Arguments& a, std::size_t at) {
  return a.size() > at && a[at] != 0.0;
}

// The functions of tests/data/cases/vynmath.txt by name.
const std::map<std::string, std::function<double(const Arguments&)>> kFunctions = {
    {"Deg2Rad", [](const Arguments& a) { return Deg2Rad(a[0], wrap(a, 1)); }},
    {"Rad2Deg", [](const Arguments& a) { return Rad2Deg(a[0], wrap(a, 1)); }},
    {"Deg2Grad", [](const Arguments& a) { return Deg2Grad(a[0], wrap(a, 1)); }},
    {"Grad2Deg", [](const Arguments& a) { return Grad2Deg(a[0], wrap(a, 1)); }},
    {"Deg2Mil", [](const Arguments& a) { return Deg2Mil(a[0], wrap(a, 1)); }},
    {"Mil2Deg", [](const Arguments& a) { return Mil2Deg(a[0], wrap(a, 1)); }},
    {"toRange", [](const Arguments& a) { return toRange(a[0], a[1], a[2]); }},
    {"Deg2DDDMMSS", [](const Arguments& a) { return Deg2DDDMMSS(a[0], static_cast<int>(a[1]), wrap(a, 2)); }},
    {"DDDMMSS2Deg", [](const Arguments& a) { return DDDMMSS2Deg(a[0]); }},
    {"Meter2USFeet", [](const Arguments& a) { return Meter2USFeet(a[0]); }},
    {"USFeet2Meter", [](const Arguments& a) { return USFeet2Meter(a[0]); }},
    {"Meter2IFeet", [](const Arguments& a) { return Meter2IFeet(a[0]); }},
    {"IFeet2Meter", [](const Arguments& a) { return IFeet2Meter(a[0]); }},
    {"Meter2FFFII", [](const Arguments& a) { return Meter2FFFII(a[0], wrap(a, 1)); }},
    {"FFFII2Meter", [](const Arguments& a) { return FFFII2Meter(a[0], wrap(a, 1)); }},
    {"IFeet2FFFII", [](const Arguments& a) { return Meter2FFFII(IFeet2Meter(a[0]), wrap(a, 1)); }},
    {"FFFII2IFeet", [](const Arguments& a) { return Meter2IFeet(FFFII2Meter(a[0], wrap(a, 1))); }}};

TEST(VynMath, ConvertsAnglesFeetAndPackedDegreesAsTheCasesGive) {
  dex_test::forEachCase("vynmath.txt", [](const dex_test::Case& c) {
    dex_test::expectNumber(kFunctions.at(c[0])(c.numbers(1)), c, 2, 3);
  });
  EXPECT_FALSE(std::signbit(Deg2DDDMMSS(-1e-9, 4, false)));
  const double angle = 1.0 + 2.0 / 60.0 + 3.123456789 / 3600.0;
  EXPECT_EQ(Deg2DDDMMSS(angle, 40, false), Deg2DDDMMSS(angle, 15, false));
}

TEST(VynMath, PackedTextShowsExactlyThePackedDigits) {
  const std::pair<double, int> angles[] = {{12.5, 12}, {12.5, 4}, {75.25, 9}, {-0.5, 4}, {12.9999999, 12}};
  const wchar_t* const texts[] = {L"12.300000000000", L"12.3000", L"75.150000000", L"-0.3000",
                                  L"12.595999964000"};
  for (std::size_t i = 0; i < std::size(angles); ++i) {
    const auto [degrees, decimals] = angles[i];
    EXPECT_EQ(vyn_formats::DoubleToString(Deg2DDDMMSS(degrees, decimals, false), decimals), texts[i]);
  }
}

TEST(VynMath, ConversionsRoundTrip) {
  for (const double degrees : {0.1, 12.345678, 359.123456789, -45.5}) {
    EXPECT_NEAR(Rad2Deg(Deg2Rad(degrees)), degrees, 1e-12);
    EXPECT_NEAR(Grad2Deg(Deg2Grad(degrees)), degrees, 1e-12);
    EXPECT_NEAR(Mil2Deg(Deg2Mil(degrees)), degrees, 1e-12);
    EXPECT_NEAR(DDDMMSS2Deg(Deg2DDDMMSS(degrees, 12, false)), degrees, 1e-11) << degrees;
  }
  const std::pair<double, int> packed[] = {
      {12.3, 1},   {0.0001, 4},   {359.5959, 4}, {45.0, 0},           {123.455989, 6},
      {-75.15, 4}, {12.30155, 5}, {-0.0030, 4},  {89.5959999999, 10}, {179.000000000001, 12}};
  for (const auto& [value, decimals] : packed)
    EXPECT_EQ(Deg2DDDMMSS(DDDMMSS2Deg(value), decimals, false), value) << value;
  for (const double meters : {0.001, 123.456, -98765.4321}) {
    EXPECT_NEAR(USFeet2Meter(Meter2USFeet(meters)), meters, 1e-12 * std::max(1.0, std::abs(meters)));
    EXPECT_NEAR(IFeet2Meter(Meter2IFeet(meters)), meters, 1e-12 * std::max(1.0, std::abs(meters)));
  }
  for (const bool us : {true, false}) {
    for (const double value : {0.01, 1.0, 12.115, 100.065, 5.0000001, -7.0912})
      EXPECT_EQ(Meter2FFFII(FFFII2Meter(value, us), us), value) << value << (us ? " US" : " international");
  }
}

TEST(CMathAngle, NormalisesIntoOneTurnAndRotatesCounterClockwise) {
  CMathAngle set(10.0);
  set.setDeg(-10.0);
  EXPECT_EQ(set.getDeg(), 350.0);
  for (const auto& [degrees, normalised] : std::initializer_list<std::pair<double, double>>{
           {-90.0, 270.0}, {720.0, 0.0}, {360.0, 0.0}, {-720.5, 359.5}})
    EXPECT_EQ(CMathAngle(degrees).getDeg(), normalised);
  EXPECT_EQ(CMathAngle(180.0).getRad(), std::acos(-1.0));
  EXPECT_TRUE(std::isnan(CMathAngle(std::numeric_limits<double>::infinity()).getDeg()));
  const auto rotated = [](double degrees, Point centre, Point point) {
    Point out;
    CMathAngle(degrees).RotatePoint(centre, point, out);
    return out;
  };
  EXPECT_EQ(rotated(90, {10, 20}, {11, 20}), Point(10, 21));  // quarter turns are exact
  EXPECT_EQ(rotated(180, {0, 0}, {1, 2}), Point(-1, -2));
  EXPECT_EQ(rotated(-90, {0, 0}, {1, 0}), Point(0, -1));
  EXPECT_NEAR(rotated(45, {1, 1}, {2, 1}).y, 1.0 + std::sqrt(0.5), 1e-15);
  EXPECT_NEAR(rotated(210, {0, 0}, {2, 0}).x, -std::sqrt(3.0), 1e-15);
  EXPECT_TRUE(std::isnan(rotated(std::nan(""), {0, 0}, {1, 0}).x));
  Point point(3.0, 4.0);
  CMathAngle(270.0).RotatePoint({1.0, 1.0}, point, point);
  EXPECT_EQ(point, Point(4.0, -1.0));
  EXPECT_NE(Point(1.0, 2.0), Point(1.0, 2.0000001));
  EXPECT_NE(vyn_math::TAbstractPoint3<double>(1, 2, 3), vyn_math::TAbstractPoint3<double>(1, 2, 3.5));
}

}  // namespace
