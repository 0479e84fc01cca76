#include "ieObjects/IEDatasetProperties.h"

#include <gtest/gtest.h>

#include "ieObjects/IENoValue.h"
#include "ieObjects/IEStation.h"

namespace {

using vyn::ie::DexDatasetProperties;
using vyn::ie::DexPosition3D;
using vyn::ie::DexStation;
using vyn::ie::cs_utils::DexCoordinateSystemInfo;

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

TEST(DexDatasetProperties, NewPropertiesHaveNoExtent) {
  const DexDatasetProperties properties;
  EXPECT_FALSE(properties.isMinMaxDefined());
  EXPECT_EQ(DexPosition3D(0, 0, 0), properties.getBorder(DexDatasetProperties::MIN_BORDER));
  EXPECT_EQ(DexPosition3D(0, 0, 0), properties.getBorder(DexDatasetProperties::MAX_BORDER));
  EXPECT_EQ(0, properties.getExtraValue(0));
}

TEST(DexDatasetProperties, FirstStationSetsBothBordersAndLaterOnesWidenThem) {
  DexDatasetProperties properties;
  properties.updateBorders(stationAt(10, 20, 30));
  EXPECT_TRUE(properties.isMinMaxDefined());
  EXPECT_EQ(DexPosition3D(10, 20, 30), properties.getBorder(0));
  EXPECT_EQ(DexPosition3D(10, 20, 30), properties.getBorder(1));

  properties.updateBorders(stationAt(5, 25, 30));
  properties.updateBorders(stationAt(12, 22, -4));
  EXPECT_EQ(DexPosition3D(5, 20, -4), properties.getBorder(0));
  EXPECT_EQ(DexPosition3D(12, 25, 30), properties.getBorder(1));
}

TEST(DexDatasetProperties, StationsWithoutHorizontalCoordinatesChangeNothing) {
  DexDatasetProperties properties;
  properties.updateBorders(stationAt(vyn::ie::kNoValue, 20, 30));
  EXPECT_FALSE(properties.isMinMaxDefined());
  properties.updateBorders(stationAt(1, 1, 1));
  properties.updateBorders(stationAt(vyn::ie::kNoValue, 100, 100));
  EXPECT_EQ(DexPosition3D(1, 1, 1), properties.getBorder(1));
}

TEST(DexDatasetProperties, HeightCountsEvenWhenNotDefined) {
  DexDatasetProperties properties;
  DexStation station = stationAt(1, 1, 50);
  station.setHeightUndefined();
  properties.updateBorders(stationAt(0, 0, 0));
  properties.updateBorders(station);
  EXPECT_EQ(50.0, properties.getBorder(DexDatasetProperties::MAX_BORDER).z);
}

TEST(DexDatasetProperties, ResetForgetsTheExtentButKeepsTheBorders) {
  DexDatasetProperties properties = extentOf(0, 0, 10, 10);
  properties.setExtraValue(2, 7);
  properties.reset();
  EXPECT_FALSE(properties.isMinMaxDefined());
  EXPECT_EQ(0, properties.getExtraValue(2));
  EXPECT_EQ(DexPosition3D(10, 10, 0), properties.getBorder(1));

  // The next station starts a new extent.
  properties.updateBorders(stationAt(3, 3, 3));
  EXPECT_EQ(DexPosition3D(3, 3, 3), properties.getBorder(0));
}

TEST(DexDatasetProperties, CloneTakesEveryValue) {
  DexDatasetProperties source = extentOf(0, 0, 10, 20);
  source.setExtraValue(0, 5);
  DexDatasetProperties target;
  target.clone(source);
  EXPECT_TRUE(target.isMinMaxDefined());
  EXPECT_EQ(DexPosition3D(10, 20, 0), target.getBorder(1));
  EXPECT_EQ(5, target.getExtraValue(0));
}

TEST(DexDatasetProperties, KindsAndIndexesOutsideTheirRangeReadAsNeutral) {
  DexDatasetProperties properties = extentOf(1, 1, 2, 2);
  EXPECT_EQ(DexPosition3D(0, 0, 0), properties.getBorder(2));
  EXPECT_EQ(DexPosition3D(0, 0, 0), properties.getBorder(-1));
  properties.setExtraValue(3, 9);
  EXPECT_EQ(0, properties.getExtraValue(3));
}

TEST(DexDatasetProperties, TextSizeFollowsTheLargestExtentUpToItsMaximum) {
  EXPECT_DOUBLE_EQ(0.2, DexDatasetProperties().calcAutoTextSize());
  EXPECT_DOUBLE_EQ(1.0, extentOf(0, 0, 1000, 400).calcAutoTextSize());
  EXPECT_DOUBLE_EQ(1.0, extentOf(0, 0, 400, 1000).calcAutoTextSize());
  EXPECT_DOUBLE_EQ(1.5, extentOf(0, 0, 1500, 10).calcAutoTextSize());
  EXPECT_DOUBLE_EQ(1.5, extentOf(0, 0, 90000, 10).calcAutoTextSize());
  EXPECT_DOUBLE_EQ(0.0, extentOf(5, 5, 5, 5).calcAutoTextSize());
}

TEST(DexDatasetProperties, SymbolSizeIsLeftAloneWithoutAnExtent) {
  double size = -7.0;
  DexDatasetProperties().calcAutoSymbolSize(size);
  EXPECT_EQ(-7.0, size);
  extentOf(0, 0, 1000, 200).calcAutoSymbolSize(size);
  EXPECT_DOUBLE_EQ(15.0, size);
}

TEST(DexDatasetProperties, DashSizesFollowTheExtentUpToOne) {
  double dash = -1.0;
  double second = -1.0;
  double third = -1.0;
  DexDatasetProperties().calcAutoDashSize(dash, second, third);
  EXPECT_EQ(-1.0, dash);
  EXPECT_EQ(-1.0, second);
  EXPECT_EQ(-1.0, third);

  extentOf(0, 0, 10, 6).calcAutoDashSize(dash, second, third);
  EXPECT_DOUBLE_EQ(0.5, dash);
  EXPECT_DOUBLE_EQ(1.0 / 3.0, second);
  EXPECT_DOUBLE_EQ(-0.5 / 3.0, third);

  extentOf(0, 0, 1000, 6).calcAutoDashSize(dash, second, third);
  EXPECT_DOUBLE_EQ(1.0, dash);
  EXPECT_DOUBLE_EQ(2.0 / 3.0, second);
  EXPECT_DOUBLE_EQ(-1.0 / 3.0, third);
}

TEST(DexDatasetProperties, FarBordersTakeNoPartInTheWidth) {
  double size = 0.0;
  // A far x border: only the y extent counts.
  extentOf(-1e10, 0, 100, 200).calcAutoSymbolSize(size);
  EXPECT_DOUBLE_EQ(200 * 0.015, size);
  // A far maximum y border: only the x extent counts.
  extentOf(0, 0, 100, 2e10).calcAutoSymbolSize(size);
  EXPECT_DOUBLE_EQ(100 * 0.015, size);
  // A far minimum y border: only the x extent counts.
  extentOf(0, -3e10, 100, 5000).calcAutoSymbolSize(size);
  EXPECT_DOUBLE_EQ(100 * 0.015, size);
  // Far borders everywhere: width 0.
  EXPECT_DOUBLE_EQ(0.0, extentOf(-1e11, -1e11, 1e11, 1e11).calcAutoTextSize());
}

TEST(DexCoordinateSystemInfo, NewRecordIsKindFourWithEmptyTexts) {
  const DexCoordinateSystemInfo info;
  EXPECT_EQ(4, info.kind);
  for (const auto& text : info.texts)
    EXPECT_TRUE(text.IsEmpty());
  EXPECT_EQ(0, info.value);
}

TEST(DexCoordinateSystemInfo, CopiesEveryMember) {
  DexCoordinateSystemInfo info;
  info.kind = DexCoordinateSystemInfo::kGeographicKind;
  info.texts[4] = L"WGS 84";
  info.value = 12345;
  const DexCoordinateSystemInfo copy = info;
  EXPECT_EQ(1, copy.kind);
  EXPECT_EQ(L"WGS 84", copy.texts[4]);
  EXPECT_EQ(12345, copy.value);
}

}  // namespace
