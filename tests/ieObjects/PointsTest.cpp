// Points of every kind, arcs and circles.
#include "ieObjects/IEPoints.h"

#include <gtest/gtest.h>

#include <climits>
#include <memory>
#include <utility>

#include "ObjectsTestHelpers.h"
#include "ieObjects/IEArcs.h"
#include "support/PrintString.h"

namespace {

using namespace vyn::ie;
using objects_test::stationAt;

DexOffsetStation* offsetStationAt(double x, const wchar_t* text = L"") {
  auto* const station = new DexOffsetStation();
  station->setPosition(x, 0.0, 0.0);
  station->setFirstText(text);
  return station;
}

TEST(DexDesignPoint, KeepsItsNameInItsStationAndTakesTheNameOfANamedStation) {
  DexDesignPoint point;
  EXPECT_TRUE(point.isUsedInSurface() && point.getStation().getStationAttrs() == 2u &&
              point.getUserStrings().GetSize() == 0);
  DexStation unnamed = stationAt(1.0, 2.0, 3.0);  // an unnamed point takes the whole station
  unnamed.setId(L"id-7");
  unnamed.setHeightUndefined();
  point.setStation(unnamed);
  EXPECT_TRUE(point.getName().IsEmpty() && point.getStation().getId() == L"id-7" && !point.isHeightDefined());
  point.setName(L"P1");
  EXPECT_EQ(L"P1", point.getStation().getName());
  DexStation station = stationAt(10.0, 20.0, 30.0);
  station.setNotes(L"kerb");
  point.setStation(station);  // an unnamed station keeps the point's name
  EXPECT_TRUE(point.getName() == L"P1" && point.getStation() == DexPosition3D(10, 20, 30) &&
              point.getStation().getNotes() == L"kerb");
  point.setStation(stationAt(1.0, 2.0, 3.0, L"P2"));
  EXPECT_EQ(L"P2", point.getName());
  point.setCoords(1.0, 2.0, kNoValue);
  EXPECT_TRUE(point.isHorizCoordsDefined() && !point.isHeightDefined());
  point.setCoords(kNoValue, 2.0, 3.0);
  EXPECT_FALSE(point.isHorizCoordsDefined());
  point.setCoords(1.0, 0.0, 2.0, 3.0);
  EXPECT_TRUE(point.getStation().isGeoidHeightDefined() && point.getStation().getHeight() == 3.0 &&
              point.getStation().getZ() == 2.0);
  point.shiftCoords(DexPosition3D(100.0, 200.0, 10.0), 2.0, 2.0, 2.0, 90.0);
  EXPECT_NEAR(100.0, point.getStation().getX(), 1e-9);
  EXPECT_NEAR(202.0, point.getStation().getY(), 1e-9);
  EXPECT_TRUE(point.getStation().getZ() == 14.0 && point.getStation().getGeoidHeight() == 16.0);
  point.setUsedInSurface(false);
  point.getUserStrings().Add(L"one");
  EXPECT_FALSE(point.isUsedInSurface());
  EXPECT_EQ(L"one", std::as_const(point).getUserStrings().GetAt(0));
}

TEST(DexPtlPoint, TakesItsReferenceLineFromTheConstructorOrSetPtlParams) {
  const DexPtlPoint plain;
  EXPECT_TRUE(plain.getFirstReferencePointIds().IsEmpty() &&
              plain.getCoordType() == DexPtlPoint::PTL_COORDS_STATION_OFFSET);
  DexPtlPoint point(L"A", L"B", 0);
  EXPECT_TRUE(point.getFirstReferencePointIds() == L"A" && point.getSecondReferencePointIds() == L"B" &&
              point.getCoordType() == DexPtlPoint::PTL_COORDS_GRID);
  point.setPtlParams(L"C", L"D", 7);
  EXPECT_TRUE(point.getFirstReferencePointIds() == L"C" && point.getSecondReferencePointIds() == L"D" &&
              point.getCoordType() == 7);
}

TEST(DexSheetPoint, OwnsItsStationsInOrderAndChangesOrRemovesThemByIndex) {
  int deletions = 0;
  {
    DexSheetPoint sheet;
    EXPECT_TRUE(sheet.getStation(0) == nullptr && !sheet.removeStation(0));
    auto* const first = offsetStationAt(1.0, L"old");
    first->setName(L"S-1");
    sheet.addStation(first);
    sheet.addStation(new objects_test::CountedOffsetStation(deletions));
    sheet.addStation(offsetStationAt(3.0));
    sheet.addStation(nullptr);
    sheet.setName(L"SHEET");  // apart from its stations' names
    EXPECT_TRUE(sheet.getName() == L"SHEET" && sheet.getStation(0)->getName() == L"S-1" &&
                sheet.getNumberOfStations() == 3);
    for (const int index : {3, -1, INT_MAX})
      EXPECT_TRUE(sheet.getStation(index) == nullptr && std::as_const(sheet).getStation(index) == nullptr);
    const std::unique_ptr<DexOffsetStation> replacement(offsetStationAt(9.0, L"new"));
    EXPECT_TRUE(sheet.changeStation(0, replacement.get()));  // copied into the station held
    EXPECT_TRUE(sheet.getStation(0) == first && first->getX() == 9.0 && first->getFirstText() == L"new");
    EXPECT_FALSE(sheet.changeStation(3, replacement.get()) || sheet.changeStation(-1, replacement.get()) ||
                 sheet.changeStation(0, nullptr));
    EXPECT_FALSE(sheet.removeStation(3) || sheet.removeStation(-1));
    EXPECT_TRUE(sheet.removeStation(1));
    EXPECT_EQ(1, deletions);
    EXPECT_EQ(3.0, std::as_const(sheet).getStation(1)->getX());
    sheet.shiftCoords(DexPosition3D(10.0, 20.0, 30.0), 3.0, 1.0, 1.0, 0.0);
    EXPECT_TRUE(*sheet.getStation(0) == DexPosition3D(37.0, 20.0, 30.0) &&
                *sheet.getStation(1) == DexPosition3D(19.0, 20.0, 30.0));
    sheet.addStation(new objects_test::CountedOffsetStation(deletions));
  }
  EXPECT_EQ(2, deletions);
}

// An arc centred on (10, 20, 5) with radius 3 and directions 10 and 100 degrees.
DexArc sampleArc() {
  DexArc arc;
  arc.setCenter(10.0, 20.0, 5.0);
  arc.setData(DexArc::ARC_RADIUS, 3.0);
  arc.setData(DexArc::ARC_START_ANGLE, 10.0);
  arc.setData(DexArc::ARC_END_ANGLE, 100.0);
  return arc;
}

TEST(DexArc, HoldsFiveValuesOfWhichOnlyTheOptionalOnesCanBeDefined) {
  DexArc arc;
  EXPECT_TRUE(arc.getData(0) == 0.0 && arc.getData(2) == 0.0 && arc.getData(3) == kNoValue &&
              arc.getData(4) == kNoValue);
  EXPECT_FALSE(arc.isClockwise());
  arc.setData(5, 9.0);  // past the fifth: ignored, read as 0
  arc.setData(-1, 9.0);
  arc.setData(0, 10.0);
  EXPECT_TRUE(arc.getData(5) == 0.0 && arc.getData(INT_MAX) == 0.0 && arc.getData(-1) == 0.0 &&
              !arc.isDataDefined(0));
  arc.setData(3, 1.5);
  arc.setData(4, 0.0);
  EXPECT_TRUE(arc.isDataDefined(3) && arc.isDataDefined(DexArc::ARC_OPTIONAL_VALUE_2));
  arc.setData(3, kNoValue);
  EXPECT_FALSE(arc.isDataDefined(3) || arc.isDataDefined(5) || arc.isDataDefined(-1));
  arc.setCenter(kNoValue, 2.0, kNoValue);  // stored without no-value tests
  EXPECT_TRUE(arc.getStation().getX() == kNoValue && arc.getStation().isHorizCoordsDefined() &&
              arc.getStation().isHeightDefined());
  arc.setCenter(1.0, 2.0, 3.0, 4.0);
  EXPECT_TRUE(arc.getStation() == DexPosition3D(1.0, 2.0, 3.0) && arc.getStation().getHeight() == 4.0);
  arc.setName(L"ARC1");
  arc.setStation(stationAt(1.0, 2.0, 3.0));
  EXPECT_EQ(L"ARC1", arc.getName());
  arc.setStation(stationAt(1.0, 2.0, 3.0, L"ARC2"));
  EXPECT_EQ(L"ARC2", arc.getName());
  arc.setDirection(true);
  EXPECT_TRUE(arc.isClockwise());
}

TEST(DexArc, AUniformShiftMovesTheCentreScalesTheRadiusAndTurnsTheDirectionsWithinOneTurn) {
  DexArc arc = sampleArc();
  arc.setData(3, 7.0);
  arc.shiftCoords(DexPosition3D(100.0, 200.0, 1.0), 2.0, 2.0, 2.0, 0.0);
  EXPECT_TRUE(arc.getStation() == DexPosition3D(120.0, 240.0, 11.0) &&
              arc.getData(DexArc::ARC_RADIUS) == 6.0 && arc.getData(DexArc::ARC_START_ANGLE) == 10.0 &&
              arc.getData(3) == 7.0);
  arc = sampleArc();
  arc.shiftCoords(DexPosition3D(0.0, 0.0, 0.0), 1.0, 1.0, 1.0, 30.0);
  EXPECT_DOUBLE_EQ(340.0, arc.getData(DexArc::ARC_START_ANGLE));
  EXPECT_DOUBLE_EQ(70.0, arc.getData(DexArc::ARC_END_ANGLE));
  arc = sampleArc();
  arc.setData(DexArc::ARC_END_ANGLE, 350.0);
  arc.shiftCoords(DexPosition3D(0.0, 0.0, 0.0), 1.0, 1.0, 1.0, -20.0);
  EXPECT_DOUBLE_EQ(30.0, arc.getData(DexArc::ARC_START_ANGLE));
  EXPECT_DOUBLE_EQ(10.0, arc.getData(DexArc::ARC_END_ANGLE));
  EXPECT_EQ(1, arc.getStateType());
  // A non-uniform shift only deactivates the arc, also when only the height scale differs.
  for (const double scaleY : {2.0, 1.0}) {
    arc = sampleArc();
    arc.shiftCoords(DexPosition3D(5.0, 5.0, 5.0), 1.0, scaleY, scaleY == 1.0 ? 1.5 : 1.0, 30.0);
    EXPECT_TRUE(arc.getStateType() == 0 && arc.getStation() == DexPosition3D(10.0, 20.0, 5.0) &&
                arc.getData(DexArc::ARC_START_ANGLE) == 10.0 && arc.getData(DexArc::ARC_RADIUS) == 3.0);
  }
}

TEST(DexCircle, HasOnlyARadiusAndAUniformShiftMovesItsCentreWhileOthersDeactivateIt) {
  DexCircle circle;
  circle.setData(0, 4.5);
  circle.setData(1, 9.0);
  circle.setData(-1, 9.0);
  EXPECT_TRUE(circle.getData(DexCircle::CIRCLE_RADIUS) == 4.5 && circle.getData(1) == 0.0 &&
              circle.getData(-1) == 0.0);
  circle.setName(L"C1");
  circle.setStation(stationAt(1.0, 2.0, 3.0));
  EXPECT_EQ(L"C1", circle.getName());
  circle.setCenter(4.0, 5.0, 6.0, 7.0);
  EXPECT_TRUE(circle.getStation() == DexPosition3D(4.0, 5.0, 6.0) && circle.getStation().getHeight() == 7.0);
  circle.setCenter(kNoValue, 0.0, 0.0);
  EXPECT_TRUE(circle.getStation().isHorizCoordsDefined());
  circle.setCenter(1.0, 0.0, 0.0);
  circle.setData(0, 2.0);
  circle.shiftCoords(DexPosition3D(9.0, 9.0, 9.0), 2.0, 1.0, 1.0, 0.0);
  EXPECT_TRUE(circle.getStateType() == 0 && circle.getStation() == DexPosition3D(1.0, 0.0, 0.0) &&
              circle.getData(0) == 2.0);
  circle.setStateType(IDexStateInterface::ACTIVE_STATE);
  circle.shiftCoords(DexPosition3D(0.0, 0.0, 0.0), 3.0, 3.0, 3.0, 90.0);
  EXPECT_NEAR(0.0, circle.getStation().getX(), 1e-12);
  EXPECT_NEAR(3.0, circle.getStation().getY(), 1e-12);
  EXPECT_TRUE(circle.getData(0) == 6.0 && circle.getStateType() == 1);
}

}  // namespace
