#include "ieObjects/IEDatasetProperties.h"

#include <gtest/gtest.h>

#include <initializer_list>
#include <utility>

#include "ieObjects/IENoValue.h"
#include "ieObjects/IEStation.h"
#include "support/PrintString.h"

namespace {

using namespace vyn::ie;
using cs_utils::DexCoordinateSystemInfo;

DexStation stationAt(double x, double y, double z) {
  DexStation station;
  station.setPosition(x, y, z);
  return station;
}

// Properties whose extent runs from (minX, minY, 0) to (maxX, maxY, 0).
DexDatasetProperties extentOf(double minX, double minY, double maxX, double maxY) {
  DexDatasetProperties properties;
  properties.updateBorders(stationAt(minX, minY, 0.0));
  properties.updateBorders(stationAt(maxX, maxY, 0.0));
  return properties;
}

TEST(DexDatasetProperties, TheFirstStationWithHorizontalCoordinatesSetsTheBordersAndLaterOnesWidenThem) {
  DexDatasetProperties properties;
  EXPECT_FALSE(properties.isMinMaxDefined());
  properties.updateBorders(stationAt(kNoValue, 20, 30));
  EXPECT_FALSE(properties.isMinMaxDefined());
  properties.updateBorders(stationAt(10, 20, 30));
  EXPECT_TRUE(properties.isMinMaxDefined());
  EXPECT_EQ(DexPosition3D(10, 20, 30), properties.getBorder(DexDatasetProperties::MIN_BORDER));
  DexStation undefinedHeight = stationAt(12, 22, -4);  // the height counts even when not defined
  undefinedHeight.setHeightUndefined();
  for (const DexStation& station : {stationAt(5, 25, 30), undefinedHeight, stationAt(kNoValue, 100, 100)})
    properties.updateBorders(station);
  EXPECT_EQ(DexPosition3D(5, 20, -4), properties.getBorder(0));
  EXPECT_EQ(DexPosition3D(12, 25, 30), properties.getBorder(DexDatasetProperties::MAX_BORDER));
  EXPECT_TRUE(properties.getBorder(2) == DexPosition3D() && properties.getBorder(-1) == DexPosition3D());
  properties.setExtraValue(2, 7);
  properties.setExtraValue(3, 9);  // outside: ignored
  EXPECT_TRUE(properties.getExtraValue(2) == 7 && properties.getExtraValue(3) == 0);
  DexDatasetProperties target;
  target.clone(properties);
  EXPECT_TRUE(target.isMinMaxDefined() && target.getBorder(1) == DexPosition3D(12, 25, 30) &&
              target.getExtraValue(2) == 7);
  properties.reset();  // forgets the extent, keeps the borders until the next station
  EXPECT_FALSE(properties.isMinMaxDefined());
  EXPECT_EQ(0, properties.getExtraValue(2));
  EXPECT_EQ(DexPosition3D(12, 25, 30), properties.getBorder(1));
  properties.updateBorders(stationAt(3, 3, 3));
  EXPECT_EQ(DexPosition3D(3, 3, 3), properties.getBorder(0));
}

TEST(DexDatasetProperties, TextSymbolAndDashSizesFollowTheLargestExtentLeavingOutFarBorders) {
  EXPECT_DOUBLE_EQ(0.2, DexDatasetProperties().calcAutoTextSize());
  for (const auto& [properties, size] : std::initializer_list<std::pair<DexDatasetProperties, double>>{
           {extentOf(0, 0, 1000, 400), 1.0},
           {extentOf(0, 0, 400, 1000), 1.0},
           {extentOf(0, 0, 1500, 10), 1.5},
           {extentOf(0, 0, 90000, 10), 1.5},
           {extentOf(5, 5, 5, 5), 0.0},
           {extentOf(-1e11, -1e11, 1e11, 1e11), 0.0}})
    EXPECT_DOUBLE_EQ(size, properties.calcAutoTextSize());
  double size = -7.0;
  DexDatasetProperties().calcAutoSymbolSize(size);  // left alone without an extent
  EXPECT_EQ(-7.0, size);
  extentOf(0, 0, 1000, 200).calcAutoSymbolSize(size);
  EXPECT_DOUBLE_EQ(15.0, size);
  extentOf(-1e10, 0, 100, 200).calcAutoSymbolSize(size);  // a far x border: only the y extent counts
  EXPECT_DOUBLE_EQ(200 * 0.015, size);
  extentOf(0, 0, 100, 2e10).calcAutoSymbolSize(size);
  EXPECT_DOUBLE_EQ(100 * 0.015, size);
  extentOf(0, -3e10, 100, 5000).calcAutoSymbolSize(size);
  EXPECT_DOUBLE_EQ(100 * 0.015, size);
  double dash = -1.0;
  double second = -1.0;
  double third = -1.0;
  DexDatasetProperties().calcAutoDashSize(dash, second, third);
  EXPECT_TRUE(dash == -1.0 && second == -1.0 && third == -1.0);
  extentOf(0, 0, 10, 6).calcAutoDashSize(dash, second, third);
  EXPECT_DOUBLE_EQ(0.5, dash);
  EXPECT_DOUBLE_EQ(1.0 / 3.0, second);
  EXPECT_DOUBLE_EQ(-0.5 / 3.0, third);
  extentOf(0, 0, 1000, 6).calcAutoDashSize(dash, second, third);  // up to one
  EXPECT_DOUBLE_EQ(1.0, dash);
  EXPECT_DOUBLE_EQ(-1.0 / 3.0, third);
}

TEST(DexCoordinateSystemInfo, IsKindFourWithEmptyTextsAndCopiesEveryMember) {
  DexCoordinateSystemInfo info;
  EXPECT_TRUE(info.kind == 4 && info.value == 0);
  for (const auto& text : info.texts)
    EXPECT_TRUE(text.IsEmpty());
  info.kind = DexCoordinateSystemInfo::kGeographicKind;
  info.texts[4] = L"WGS 84";
  info.value = 12345;
  const DexCoordinateSystemInfo copy = info;
  EXPECT_TRUE(copy.kind == 1 && copy.texts[4] == L"WGS 84" && copy.value == 12345);
}

}  // namespace
