#include "ieObjects/IEPoints.h"

#include <gtest/gtest.h>

#include <climits>
#include <memory>
#include <utility>

#include "ObjectsTestHelpers.h"
#include "support/LogCapture.h"
#include "support/PrintString.h"

namespace {

using objects_test::CountedOffsetStation;
using objects_test::stationAt;
using vyn::ie::DexDesignPoint;
using vyn::ie::DexOffsetStation;
using vyn::ie::DexPosition3D;
using vyn::ie::DexPtlPoint;
using vyn::ie::DexSheetPoint;
using vyn::ie::DexStation;
using vyn::ie::kNoValue;

// A new offset station at (x, 0, 0) with the given first text; the caller owns it.
DexOffsetStation* offsetStationAt(double x, const wchar_t* text = L"") {
  auto* const station = new DexOffsetStation();
  station->setPosition(x, 0.0, 0.0);
  station->setFirstText(text);
  return station;
}

}  // namespace

static_assert(sizeof(DexPtlPoint::ECoordType) == 4);
static_assert(DexPtlPoint::PTL_COORDS_STATION_OFFSET == 1);

// ---- Design points ------------------------------------------------------------------------------

TEST(DexDesignPoint, StartsWithADefaultStationUsedInSurfaces) {
  const DexDesignPoint point;
  EXPECT_EQ(2u, point.getStation().getStationAttrs());
  EXPECT_EQ(5, point.getStation().getCSType());
  EXPECT_EQ(DexPosition3D(0.0, 0.0, 0.0), point.getStation());
  EXPECT_TRUE(point.isUsedInSurface());
  EXPECT_TRUE(point.getName().IsEmpty());
  EXPECT_EQ(0, point.getUserStrings().GetSize());
}

TEST(DexDesignPoint, KeepsItsNameInItsStation) {
  DexDesignPoint point;
  point.setName(L"P100");
  EXPECT_EQ(L"P100", point.getName());
  EXPECT_EQ(L"P100", point.getStation().getName());
}

TEST(DexDesignPoint, SetStationWithAnUnnamedStationKeepsThePointsName) {
  DexDesignPoint point;
  point.setName(L"P1");
  DexStation station = stationAt(10.0, 20.0, 30.0);
  station.setNotes(L"kerb");
  point.setStation(station);
  EXPECT_EQ(L"P1", point.getName());
  EXPECT_EQ(DexPosition3D(10.0, 20.0, 30.0), point.getStation());
  EXPECT_EQ(L"kerb", point.getStation().getNotes());
}

TEST(DexDesignPoint, SetStationWithANamedStationTakesItsName) {
  DexDesignPoint point;
  point.setName(L"P1");
  point.setStation(stationAt(1.0, 2.0, 3.0, L"P2"));
  EXPECT_EQ(L"P2", point.getName());
}

TEST(DexDesignPoint, SetStationOnAnUnnamedPointTakesTheWholeStation) {
  DexDesignPoint point;
  DexStation station = stationAt(1.0, 2.0, 3.0);
  station.setId(L"id-7");
  station.setHeightUndefined();
  point.setStation(station);
  EXPECT_TRUE(point.getName().IsEmpty());
  EXPECT_EQ(L"id-7", point.getStation().getId());
  EXPECT_FALSE(point.isHeightDefined());
}

TEST(DexDesignPoint, SetCoordsMarksNoValueCoordinatesUndefined) {
  DexDesignPoint point;
  point.setCoords(1.0, 2.0, kNoValue);
  EXPECT_TRUE(point.isHorizCoordsDefined());
  EXPECT_FALSE(point.isHeightDefined());
  point.setCoords(kNoValue, 2.0, 3.0);
  EXPECT_FALSE(point.isHorizCoordsDefined());
}

TEST(DexDesignPoint, SetCoordsWithGeoidHeightSetsIt) {
  DexDesignPoint point;
  point.setCoords(1.0, 2.0, 3.0, 45.5);
  EXPECT_TRUE(point.getStation().isGeoidHeightDefined());
  EXPECT_EQ(45.5, point.getStation().getHeight());
  EXPECT_EQ(3.0, point.getStation().getZ());
}

TEST(DexDesignPoint, ShiftsItsStation) {
  DexDesignPoint point;
  point.setCoords(1.0, 0.0, 2.0, 3.0);
  point.shiftCoords(DexPosition3D(100.0, 200.0, 10.0), 2.0, 2.0, 2.0, 90.0);
  EXPECT_NEAR(100.0, point.getStation().getX(), 1e-9);
  EXPECT_NEAR(202.0, point.getStation().getY(), 1e-9);
  EXPECT_EQ(14.0, point.getStation().getZ());
  EXPECT_EQ(16.0, point.getStation().getGeoidHeight());
}

TEST(DexDesignPoint, KeepsTheSurfaceFlagAndUserStrings) {
  DexDesignPoint point;
  point.setUsedInSurface(false);
  point.getUserStrings().Add(L"one");
  EXPECT_FALSE(point.isUsedInSurface());
  ASSERT_EQ(1, std::as_const(point).getUserStrings().GetSize());
  EXPECT_EQ(L"one", point.getUserStrings().GetAt(0));
}

// ---- Point-to-line points -----------------------------------------------------------------------

TEST(DexPtlPoint, StartsWithoutReferencesAndCoordinateTypeOne) {
  const DexPtlPoint point;
  EXPECT_TRUE(point.getFirstReferencePointIds().IsEmpty());
  EXPECT_TRUE(point.getSecondReferencePointIds().IsEmpty());
  EXPECT_EQ(1, point.getCoordType());
  EXPECT_TRUE(point.isUsedInSurface());
}

TEST(DexPtlPoint, TakesItsReferenceLineFromTheConstructorAndSetPtlParams) {
  DexPtlPoint point(L"A", L"B", 0);
  EXPECT_EQ(L"A", point.getFirstReferencePointIds());
  EXPECT_EQ(L"B", point.getSecondReferencePointIds());
  EXPECT_EQ(DexPtlPoint::PTL_COORDS_GRID, point.getCoordType());
  point.setPtlParams(L"C", L"D", 7);
  EXPECT_EQ(L"C", point.getFirstReferencePointIds());
  EXPECT_EQ(L"D", point.getSecondReferencePointIds());
  EXPECT_EQ(7, point.getCoordType());
}

// ---- Sheet points -------------------------------------------------------------------------------

TEST(DexSheetPoint, KeepsItsOwnNameApartFromItsStations) {
  DexSheetPoint sheet;
  auto* const station = offsetStationAt(1.0);
  station->setName(L"S-1");
  sheet.addStation(station);
  sheet.setName(L"SHEET");
  EXPECT_EQ(L"SHEET", sheet.getName());
  EXPECT_EQ(L"S-1", sheet.getStation(0)->getName());
}

TEST(DexSheetPoint, StationsAreKeptInOrderAndNullOutsideTheList) {
  DexSheetPoint sheet;
  EXPECT_EQ(nullptr, sheet.getStation(0));
  sheet.addStation(offsetStationAt(1.0));
  sheet.addStation(offsetStationAt(2.0));
  sheet.addStation(nullptr);
  ASSERT_EQ(2, sheet.getNumberOfStations());
  EXPECT_EQ(1.0, sheet.getStation(0)->getX());
  EXPECT_EQ(2.0, std::as_const(sheet).getStation(1)->getX());
  for (const int index : {2, -1, INT_MAX}) {
    EXPECT_EQ(nullptr, sheet.getStation(index));
    EXPECT_EQ(nullptr, std::as_const(sheet).getStation(index));
  }
}

TEST(DexSheetPoint, ChangeStationCopiesIntoTheStationAndLeavesTheArgumentToTheCaller) {
  DexSheetPoint sheet;
  sheet.addStation(offsetStationAt(1.0, L"old"));
  const DexOffsetStation* const held = sheet.getStation(0);
  const std::unique_ptr<DexOffsetStation> replacement(offsetStationAt(9.0, L"new"));
  EXPECT_TRUE(sheet.changeStation(0, replacement.get()));
  EXPECT_EQ(held, sheet.getStation(0));
  EXPECT_EQ(9.0, sheet.getStation(0)->getX());
  EXPECT_EQ(L"new", sheet.getStation(0)->getFirstText());
}

TEST(DexSheetPoint, ChangeStationOutsideTheListOrWithNullChangesNothing) {
  DexSheetPoint sheet;
  const std::unique_ptr<DexOffsetStation> replacement(offsetStationAt(9.0));
  EXPECT_FALSE(sheet.changeStation(0, replacement.get()));
  sheet.addStation(offsetStationAt(1.0));
  EXPECT_FALSE(sheet.changeStation(1, replacement.get()));
  EXPECT_FALSE(sheet.changeStation(-1, replacement.get()));
  EXPECT_FALSE(sheet.changeStation(0, nullptr));
  EXPECT_EQ(1.0, sheet.getStation(0)->getX());
}

TEST(DexSheetPoint, RemoveStationDeletesItAndClosesTheGap) {
  int deletions = 0;
  DexSheetPoint sheet;
  EXPECT_FALSE(sheet.removeStation(0));
  sheet.addStation(offsetStationAt(1.0));
  sheet.addStation(new CountedOffsetStation(deletions));
  sheet.addStation(offsetStationAt(3.0));
  EXPECT_FALSE(sheet.removeStation(3));
  EXPECT_FALSE(sheet.removeStation(-1));
  EXPECT_TRUE(sheet.removeStation(1));
  EXPECT_EQ(1, deletions);
  ASSERT_EQ(2, sheet.getNumberOfStations());
  EXPECT_EQ(3.0, sheet.getStation(1)->getX());
}

TEST(DexSheetPoint, DeletesItsStationsWithItself) {
  int deletions = 0;
  {
    DexSheetPoint sheet;
    sheet.addStation(new CountedOffsetStation(deletions));
    sheet.addStation(new CountedOffsetStation(deletions));
  }
  EXPECT_EQ(2, deletions);
}

TEST(DexSheetPoint, ShiftsEveryStation) {
  DexSheetPoint sheet;
  sheet.addStation(offsetStationAt(1.0));
  sheet.addStation(offsetStationAt(2.0));
  sheet.shiftCoords(DexPosition3D(10.0, 20.0, 30.0), 3.0, 1.0, 1.0, 0.0);
  EXPECT_EQ(DexPosition3D(13.0, 20.0, 30.0), *sheet.getStation(0));
  EXPECT_EQ(DexPosition3D(16.0, 20.0, 30.0), *sheet.getStation(1));
}
