#include "ieObjects/IEArcs.h"

#include <gtest/gtest.h>

#include <climits>

#include "ObjectsTestHelpers.h"
#include "support/PrintString.h"

namespace {

using objects_test::stationAt;
using vyn::ie::DexArc;
using vyn::ie::DexCircle;
using vyn::ie::DexPosition3D;
using vyn::ie::kNoValue;

// An arc centred on (10, 20, 5) with radius 3 and directions 10 and 100 degrees.
DexArc sampleArc() {
  DexArc arc;
  arc.setCenter(10.0, 20.0, 5.0);
  arc.setData(DexArc::ARC_RADIUS, 3.0);
  arc.setData(DexArc::ARC_START_ANGLE, 10.0);
  arc.setData(DexArc::ARC_END_ANGLE, 100.0);
  return arc;
}

}  // namespace

static_assert(sizeof(DexArc::EADataType) == 4 && sizeof(DexCircle::ECDataType) == 4);

// ---- Arcs ---------------------------------------------------------------------------------------

TEST(DexArc, StartsWithZerosAndNoOptionalValues) {
  const DexArc arc;
  EXPECT_EQ(0.0, arc.getData(0));
  EXPECT_EQ(0.0, arc.getData(1));
  EXPECT_EQ(0.0, arc.getData(2));
  EXPECT_EQ(kNoValue, arc.getData(3));
  EXPECT_EQ(kNoValue, arc.getData(4));
  EXPECT_FALSE(arc.isClockwise());
  EXPECT_EQ(nullptr, arc.getDrawProperties());
  EXPECT_EQ(2u, arc.getStation().getStationAttrs());
  EXPECT_EQ(5, arc.getStation().getCSType());
}

TEST(DexArc, DataPastTheFifthReadsZeroAndIsIgnored) {
  DexArc arc;
  arc.setData(5, 9.0);
  arc.setData(-1, 9.0);
  EXPECT_EQ(0.0, arc.getData(5));
  EXPECT_EQ(0.0, arc.getData(INT_MAX));
  EXPECT_EQ(0.0, arc.getData(-1));
  EXPECT_EQ(0.0, arc.getData(DexArc::ARC_RADIUS));
}

TEST(DexArc, OnlyOptionalValuesCanBeDefined) {
  DexArc arc;
  arc.setData(0, 10.0);
  EXPECT_FALSE(arc.isDataDefined(0));
  EXPECT_FALSE(arc.isDataDefined(3));
  arc.setData(3, 1.5);
  EXPECT_TRUE(arc.isDataDefined(3));
  EXPECT_FALSE(arc.isDataDefined(4));
  arc.setData(4, 0.0);
  EXPECT_TRUE(arc.isDataDefined(DexArc::ARC_OPTIONAL_VALUE_2));
  arc.setData(3, kNoValue);
  EXPECT_FALSE(arc.isDataDefined(3));
  EXPECT_FALSE(arc.isDataDefined(5));
  EXPECT_FALSE(arc.isDataDefined(-1));
}

TEST(DexArc, SetCenterStoresCoordinatesWithoutNoValueTests) {
  DexArc arc;
  arc.setCenter(kNoValue, 2.0, kNoValue);
  EXPECT_EQ(kNoValue, arc.getStation().getX());
  EXPECT_TRUE(arc.getStation().isHorizCoordsDefined());
  EXPECT_TRUE(arc.getStation().isHeightDefined());
  arc.setCenter(1.0, 2.0, 3.0, 4.0);
  EXPECT_EQ(DexPosition3D(1.0, 2.0, 3.0), arc.getStation());
  EXPECT_TRUE(arc.getStation().isGeoidHeightDefined());
  EXPECT_EQ(4.0, arc.getStation().getHeight());
}

TEST(DexArc, KeepsItsNameInItsStationAndTheNameOnUnnamedStations) {
  DexArc arc;
  arc.setName(L"ARC1");
  EXPECT_EQ(L"ARC1", arc.getStation().getName());
  arc.setStation(stationAt(1.0, 2.0, 3.0));
  EXPECT_EQ(L"ARC1", arc.getName());
  EXPECT_EQ(1.0, arc.getStation().getX());
  arc.setStation(stationAt(1.0, 2.0, 3.0, L"ARC2"));
  EXPECT_EQ(L"ARC2", arc.getName());
}

TEST(DexArc, KeepsItsDirection) {
  DexArc arc;
  arc.setDirection(true);
  EXPECT_TRUE(arc.isClockwise());
  arc.setDirection(false);
  EXPECT_FALSE(arc.isClockwise());
}

TEST(DexArc, UniformShiftTurnsTheDirectionsIntoTheFullCircle) {
  DexArc arc = sampleArc();
  arc.shiftCoords(DexPosition3D(0.0, 0.0, 0.0), 1.0, 1.0, 1.0, 30.0);
  EXPECT_DOUBLE_EQ(340.0, arc.getData(DexArc::ARC_START_ANGLE));
  EXPECT_DOUBLE_EQ(70.0, arc.getData(DexArc::ARC_END_ANGLE));
  EXPECT_EQ(3.0, arc.getData(DexArc::ARC_RADIUS));
  EXPECT_EQ(1, arc.getStateType());
}

TEST(DexArc, UniformShiftMovesTheCentreAndScalesTheRadius) {
  DexArc arc = sampleArc();
  arc.setData(3, 7.0);
  arc.shiftCoords(DexPosition3D(100.0, 200.0, 1.0), 2.0, 2.0, 2.0, 0.0);
  EXPECT_EQ(DexPosition3D(120.0, 240.0, 11.0), arc.getStation());
  EXPECT_EQ(6.0, arc.getData(DexArc::ARC_RADIUS));
  EXPECT_EQ(10.0, arc.getData(DexArc::ARC_START_ANGLE));
  EXPECT_EQ(7.0, arc.getData(3));
}

TEST(DexArc, NegativeRotationKeepsDirectionsBelowThreeSixty) {
  DexArc arc = sampleArc();
  arc.setData(DexArc::ARC_END_ANGLE, 350.0);
  arc.shiftCoords(DexPosition3D(0.0, 0.0, 0.0), 1.0, 1.0, 1.0, -20.0);
  EXPECT_DOUBLE_EQ(30.0, arc.getData(DexArc::ARC_START_ANGLE));
  EXPECT_DOUBLE_EQ(10.0, arc.getData(DexArc::ARC_END_ANGLE));
}

TEST(DexArc, NonUniformShiftOnlyDeactivatesTheArc) {
  DexArc arc = sampleArc();
  arc.shiftCoords(DexPosition3D(5.0, 5.0, 5.0), 1.0, 2.0, 1.0, 30.0);
  EXPECT_EQ(0, arc.getStateType());
  EXPECT_EQ(DexPosition3D(10.0, 20.0, 5.0), arc.getStation());
  EXPECT_EQ(10.0, arc.getData(DexArc::ARC_START_ANGLE));
  EXPECT_EQ(100.0, arc.getData(DexArc::ARC_END_ANGLE));
  EXPECT_EQ(3.0, arc.getData(DexArc::ARC_RADIUS));
  DexArc heightOnly = sampleArc();
  heightOnly.shiftCoords(DexPosition3D(0.0, 0.0, 0.0), 1.0, 1.0, 1.5, 0.0);
  EXPECT_EQ(0, heightOnly.getStateType());
}

// ---- Circles ------------------------------------------------------------------------------------

TEST(DexCircle, HasOnlyARadius) {
  DexCircle circle;
  EXPECT_EQ(0.0, circle.getData(DexCircle::CIRCLE_RADIUS));
  circle.setData(0, 4.5);
  circle.setData(1, 9.0);
  circle.setData(-1, 9.0);
  EXPECT_EQ(4.5, circle.getData(0));
  EXPECT_EQ(0.0, circle.getData(1));
  EXPECT_EQ(0.0, circle.getData(-1));
}

TEST(DexCircle, KeepsItsNameInItsStation) {
  DexCircle circle;
  circle.setName(L"C1");
  circle.setStation(stationAt(1.0, 2.0, 3.0));
  EXPECT_EQ(L"C1", circle.getName());
  circle.setCenter(4.0, 5.0, 6.0, 7.0);
  EXPECT_EQ(DexPosition3D(4.0, 5.0, 6.0), circle.getStation());
  EXPECT_EQ(7.0, circle.getStation().getHeight());
  circle.setCenter(kNoValue, 0.0, 0.0);
  EXPECT_TRUE(circle.getStation().isHorizCoordsDefined());
}

TEST(DexCircle, UniformShiftMovesTheCentreAndScalesTheRadius) {
  DexCircle circle;
  circle.setCenter(1.0, 0.0, 0.0);
  circle.setData(0, 2.0);
  circle.shiftCoords(DexPosition3D(0.0, 0.0, 0.0), 3.0, 3.0, 3.0, 90.0);
  EXPECT_NEAR(0.0, circle.getStation().getX(), 1e-12);
  EXPECT_NEAR(3.0, circle.getStation().getY(), 1e-12);
  EXPECT_EQ(6.0, circle.getData(0));
  EXPECT_EQ(1, circle.getStateType());
}

TEST(DexCircle, NonUniformShiftOnlyDeactivatesTheCircle) {
  DexCircle circle;
  circle.setCenter(1.0, 0.0, 0.0);
  circle.setData(0, 2.0);
  circle.shiftCoords(DexPosition3D(9.0, 9.0, 9.0), 2.0, 1.0, 1.0, 0.0);
  EXPECT_EQ(0, circle.getStateType());
  EXPECT_EQ(DexPosition3D(1.0, 0.0, 0.0), circle.getStation());
  EXPECT_EQ(2.0, circle.getData(0));
}
