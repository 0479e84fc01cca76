#include "ieObjects/IEStation.h"

#include <gtest/gtest.h>

#include <memory>
#include <string>

#include "ieObjects/detail/CoordsLog.h"
#include "support/LogCapture.h"
#include "support/VtableSlot.h"

namespace {

using vyn::ie::DexOffsetStation;
using vyn::ie::DexPosition3D;
using vyn::ie::DexStation;
using vyn::ie::EDexCSType;
using vyn::ie::EPointAttrFlags;
using vyn::ie::kNoHeight;
using vyn::ie::kNoValue;
namespace detail = vyn::ie::detail;

const std::wstring kSource = detail::kCoordsLogSource;

EPointAttrFlags flag(int number) {
  return static_cast<EPointAttrFlags>(number);
}

// A station with every property set to something other than its default.
DexStation filledStation() {
  DexStation station(1u << 3, vyn::ie::CS_GEOGRAPHIC);
  station.setPosition(1.0, 2.0, 3.0, 4.0);
  station.setNotes(L"note");
  station.setTimeStamps(L"2024-03-01 12:00");
  station.setName(L"P1");
  station.setId(L"id-1");
  station.setBulge(0.5);
  station.setScaleFactor(0.9996);
  station.setHorizCoordsUndefined();
  return station;
}

// Every property that copy() takes, compared one by one (operator== leaves some of them out).
void expectSameProperties(const DexStation& actual, const DexStation& expected) {
  EXPECT_EQ(actual.getNotes(), expected.getNotes());
  EXPECT_EQ(actual.getTimeStamps(), expected.getTimeStamps());
  EXPECT_EQ(actual.getName(), expected.getName());
  EXPECT_EQ(actual.getId(), expected.getId());
  EXPECT_EQ(actual.getStationAttrs(), expected.getStationAttrs());
  EXPECT_EQ(actual.isHeightDefined(), expected.isHeightDefined());
  EXPECT_EQ(actual.isHorizCoordsDefined(), expected.isHorizCoordsDefined());
  EXPECT_EQ(actual.isGeoidHeightDefined(), expected.isGeoidHeightDefined());
  EXPECT_EQ(actual.getGeoidHeight(), expected.getGeoidHeight());
  EXPECT_EQ(actual.getBulge(), expected.getBulge());
  EXPECT_EQ(actual.getCSType(), expected.getCSType());
  EXPECT_EQ(actual.getScaleFactor(), expected.getScaleFactor());
}

void expectPosition(const DexPosition3D& position, double x, double y, double z) {
  EXPECT_DOUBLE_EQ(position.getX(), x);
  EXPECT_DOUBLE_EQ(position.getY(), y);
  EXPECT_DOUBLE_EQ(position.getZ(), z);
}

// Counts the calls that reach it through the virtual table and shifts as a station does.
class CountingStation : public DexStation {
 public:
  void shiftValues(const DexPosition3D& origin, double scaleX, double scaleY, double scaleZ,
                   double rotation) override {
    ++shifts;
    DexStation::shiftValues(origin, scaleX, scaleY, scaleZ, rotation);
  }
  void reset() override {
    ++resets;
    DexStation::reset();
  }

  int shifts = 0;
  int resets = 0;
};

}  // namespace

static_assert(sizeof(EDexCSType) == 4 && sizeof(EPointAttrFlags) == 4);
static_assert(vyn::ie::CS_GEOGRAPHIC == 1 && vyn::ie::CS_LOCAL == 5);
static_assert(vyn::ie::POINT_ATTR_DESIGN == 1 && vyn::ie::POINT_ATTR_ENTERED == 2 &&
              vyn::ie::POINT_ATTR_MEASURED == 3 && vyn::ie::POINT_ATTR_COMPUTED == 4);

// ---- Construction -------------------------------------------------------------------------------

TEST(DexStation, StartsWithFlagOneLocalCoordinatesAndScaleFactorOne) {
  const DexStation station;
  expectPosition(station, 0.0, 0.0, 0.0);
  EXPECT_EQ(station.getStationAttrs(), 2u);
  EXPECT_TRUE(station.hasPointAttr(vyn::ie::POINT_ATTR_DESIGN));
  EXPECT_EQ(station.getCSType(), 5);
  EXPECT_TRUE(station.getNotes().IsEmpty());
  EXPECT_TRUE(station.getTimeStamps().IsEmpty());
  EXPECT_TRUE(station.getName().IsEmpty());
  EXPECT_TRUE(station.getId().IsEmpty());
  EXPECT_TRUE(station.isHeightDefined());
  EXPECT_TRUE(station.isHorizCoordsDefined());
  EXPECT_FALSE(station.isGeoidHeightDefined());
  EXPECT_EQ(station.getGeoidHeight(), 0.0);
  EXPECT_EQ(station.getBulge(), 0.0);
  EXPECT_EQ(station.getScaleFactor(), 1.0);
}

TEST(DexStation, TakesAttributeFlagsAndCoordinateKindAsGiven) {
  const DexStation station(0xF0000000u, static_cast<EDexCSType>(42));
  EXPECT_EQ(station.getStationAttrs(), 0xF0000000u);
  EXPECT_EQ(station.getCSType(), 42);
}

TEST(DexStation, NameAndIdAreStoredUnchanged) {
  DexStation station;
  station.setName(L"  p 1\t");
  station.setId(L"");
  EXPECT_EQ(station.getName(), L"  p 1\t");
  EXPECT_TRUE(station.getId().IsEmpty());
  station.setId(L"ID");
  EXPECT_EQ(station.getId(), L"ID");
}

// ---- Definedness and positions ------------------------------------------------------------------

TEST(DexStation, NoValueInXMarksHorizontalCoordinatesUndefinedForGood) {
  DexStation station;
  station.setPosition(kNoValue, 10.0, 5.0);
  EXPECT_FALSE(station.isHorizCoordsDefined());
  EXPECT_TRUE(station.isHeightDefined());
  EXPECT_EQ(station.getX(), kNoValue);
  station.setPosition(1.0, 2.0, 3.0);
  EXPECT_FALSE(station.isHorizCoordsDefined());
  expectPosition(station, 1.0, 2.0, 3.0);
}

TEST(DexStation, NoValueInYMarksHorizontalCoordinatesUndefined) {
  DexStation station;
  station.setPosition(10.0, kNoValue, 5.0);
  EXPECT_FALSE(station.isHorizCoordsDefined());
  EXPECT_TRUE(station.isHeightDefined());
}

TEST(DexStation, NoValueInZMarksTheHeightUndefinedAndIsStored) {
  DexStation station;
  station.setPosition(1.0, 2.0, kNoValue);
  EXPECT_TRUE(station.isHorizCoordsDefined());
  EXPECT_FALSE(station.isHeightDefined());
  EXPECT_EQ(station.getZ(), kNoValue);
  station.setPosition(DexPosition3D(1.0, 2.0, 3.0));
  EXPECT_FALSE(station.isHeightDefined());
}

TEST(DexStation, PositionFromA3DPositionFollowsTheSameRule) {
  DexStation station;
  station.setPosition(DexPosition3D(kNoValue, 2.0, 3.0));
  EXPECT_FALSE(station.isHorizCoordsDefined());
  EXPECT_EQ(station.getY(), 2.0);
}

TEST(DexStation, NoHeightMarkerInZLeavesTheHeightUndefined) {
  DexStation station;
  station.setPosition(1.0, 2.0, kNoHeight);
  EXPECT_FALSE(station.isHeightDefined());
  station.setHeightDefined(true);
  EXPECT_FALSE(station.isHeightDefined());
  station.setZ(0.0);
  EXPECT_TRUE(station.isHeightDefined());
}

TEST(DexStation, FlagSettersSetTheFlags) {
  DexStation station;
  station.setHeightUndefined();
  station.setHorizCoordsUndefined();
  EXPECT_FALSE(station.isHeightDefined());
  EXPECT_FALSE(station.isHorizCoordsDefined());
  station.setHeightDefined(true);
  station.setHorizCoordsDefined(true);
  EXPECT_TRUE(station.isHeightDefined());
  EXPECT_TRUE(station.isHorizCoordsDefined());
  station.setGeoidHeightDefined(true);
  EXPECT_TRUE(station.isGeoidHeightDefined());
  station.setGeoidHeightDefined(false);
  EXPECT_FALSE(station.isGeoidHeightDefined());
}

TEST(DexStation, HeightIsZUntilAGeoidHeightIsSet) {
  DexStation station;
  station.setPosition(1.0, 2.0, 3.0);
  EXPECT_EQ(station.getHeight(), 3.0);
  station.setGeoidHeight(47.5);
  EXPECT_TRUE(station.isGeoidHeightDefined());
  EXPECT_EQ(station.getHeight(), 47.5);
  EXPECT_EQ(station.getZ(), 3.0);
  station.setGeoidHeightDefined(false);
  EXPECT_EQ(station.getHeight(), 3.0);
}

TEST(DexStation, PositionWithGeoidHeightSetsBoth) {
  DexStation station;
  station.setPosition(1.0, 2.0, 3.0, -12.5);
  expectPosition(station, 1.0, 2.0, 3.0);
  EXPECT_TRUE(station.isGeoidHeightDefined());
  EXPECT_EQ(station.getHeight(), -12.5);
}

// ---- Point attribute flags ----------------------------------------------------------------------

TEST(DexStation, PointAttributesAreBitsTakenModulo32) {
  DexStation station(0);
  station.addPointAttr(flag(35));
  EXPECT_EQ(station.getStationAttrs(), 1u << 3);
  EXPECT_TRUE(station.hasPointAttr(flag(3)));
  EXPECT_TRUE(station.hasPointAttr(flag(67)));
  EXPECT_FALSE(station.hasPointAttr(flag(2)));
  station.setStationAttrs(1u << 31);
  EXPECT_TRUE(station.hasPointAttr(flag(31)));
  EXPECT_TRUE(station.hasPointAttr(flag(-1)));  // 0xFFFFFFFF modulo 32 is 31
}

TEST(DexStation, AddingASecondExclusiveFlagLogsOnceAndKeepsBothBits) {
  dex_test::LogCapture log;
  DexStation station(0);
  station.addPointAttr(flag(1));
  EXPECT_EQ(log.size(), 0u);
  station.addPointAttr(flag(3));
  EXPECT_TRUE(station.hasPointAttr(flag(1)));
  EXPECT_TRUE(station.hasPointAttr(flag(3)));
  ASSERT_EQ(log.size(), 1u);
  EXPECT_EQ(log.count(kSource, detail::kExclusivePointAttrsLine), 1);
  EXPECT_TRUE(log.records()[0].message.empty());
  EXPECT_EQ(log.records()[0].level, vyn_logging::kErrorLevel);
}

TEST(DexStation, KeepingOneExclusiveFlagLogsNothing) {
  dex_test::LogCapture log;
  DexStation station;  // flag 1
  station.addPointAttr(flag(1));
  station.addPointAttr(flag(0));
  station.addPointAttr(flag(17));
  EXPECT_EQ(log.size(), 0u);
  EXPECT_EQ(station.getStationAttrs(), (1u << 0) | (1u << 1) | (1u << 17));
}

TEST(DexStation, AddingAFlagWithoutAnyExclusiveFlagLogs) {
  dex_test::LogCapture log;
  DexStation station(0);
  station.addPointAttr(flag(5));
  EXPECT_TRUE(station.hasPointAttr(flag(5)));
  EXPECT_EQ(log.count(kSource, detail::kExclusivePointAttrsLine), 1);
}

// ---- Reset and shift ----------------------------------------------------------------------------

TEST(DexStation, ResetKeepsAttributesCoordinateKindAndScaleFactor) {
  DexStation station = filledStation();
  station.setHeightUndefined();
  station.reset();
  expectPosition(station, 0.0, 0.0, 0.0);
  EXPECT_TRUE(station.getNotes().IsEmpty());
  EXPECT_TRUE(station.getTimeStamps().IsEmpty());
  EXPECT_TRUE(station.getName().IsEmpty());
  EXPECT_TRUE(station.getId().IsEmpty());
  EXPECT_TRUE(station.isHeightDefined());
  EXPECT_TRUE(station.isHorizCoordsDefined());
  EXPECT_FALSE(station.isGeoidHeightDefined());
  EXPECT_EQ(station.getGeoidHeight(), 0.0);
  EXPECT_EQ(station.getBulge(), 0.0);
  EXPECT_EQ(station.getStationAttrs(), 1u << 3);
  EXPECT_EQ(station.getCSType(), vyn::ie::CS_GEOGRAPHIC);
  EXPECT_EQ(station.getScaleFactor(), 0.9996);
}

TEST(DexStation, ShiftMovesTheGeoidHeightWithTheHeight) {
  DexStation station;
  station.setPosition(1.0, 2.0, 3.0, 10.0);
  station.shiftCoords(DexPosition3D(100.0, 200.0, 5.0), 2.0, 2.0, 3.0, 0.0);
  expectPosition(station, 102.0, 204.0, 14.0);
  EXPECT_EQ(station.getGeoidHeight(), 35.0);
  EXPECT_EQ(station.getHeight(), 35.0);
}

TEST(DexStation, ShiftMovesAnUndefinedGeoidHeightToo) {
  DexStation station;
  station.shiftCoords(DexPosition3D(0.0, 0.0, 7.0), 1.0, 1.0, 1.0, 0.0);
  EXPECT_FALSE(station.isGeoidHeightDefined());
  EXPECT_EQ(station.getGeoidHeight(), 7.0);
}

TEST(DexStation, ShiftRotatesAboutTheOriginCounterClockwise) {
  DexStation station;
  station.setPosition(0.0, 1.0, 2.0);
  station.shiftCoords(DexPosition3D(5.0, 5.0, 0.0), 1.0, 1.0, 1.0, 90.0);
  // (5, 6) turned a quarter about (5, 5).
  expectPosition(station, 4.0, 5.0, 2.0);
}

TEST(DexStation, ShiftGoesThroughTheVirtualShiftOfTheDynamicType) {
  CountingStation counting;
  DexStation& station = counting;
  station.setPosition(1.0, 1.0, 1.0);
  station.shiftCoords(DexPosition3D(), 2.0, 2.0, 2.0, 0.0);
  EXPECT_EQ(counting.shifts, 1);
  expectPosition(station, 2.0, 2.0, 2.0);
  station.reset();
  EXPECT_EQ(counting.resets, 1);
}

TEST(DexStation, ResetAndShiftFollowTheInheritedEntriesInTheTable) {
  const auto shiftValues = dex_test::vtableEntryOf(&DexStation::shiftValues);
  const auto reset = dex_test::vtableEntryOf(&DexStation::reset);
  const auto shiftCoords = dex_test::vtableEntryOf(&DexStation::shiftCoords);
  if (!shiftValues || !reset || !shiftCoords) GTEST_SKIP() << "virtual table layout not observable";
  // Entries 0 and 1 are the destructor (complete and deleting).
  EXPECT_EQ(*shiftValues, 2);
  EXPECT_EQ(*reset, 3);
  EXPECT_EQ(*shiftCoords, 4);
}

TEST(DexStation, IsDeletedThroughEachOfItsInterfaces) {
  ICoordInfo* const info = new DexStation();
  EXPECT_TRUE(info->isHeightDefined());
  delete info;
  vyn::ie::IDexIdInterface* const identified = new DexOffsetStation();
  identified->setId(L"X");
  delete identified;
  DexPosition3D* const position = new DexStation();
  delete position;
}

// ---- Copy ---------------------------------------------------------------------------------------

TEST(DexStation, CopyTakesEverythingButTheCoordinates) {
  const DexStation source = filledStation();
  DexStation target;
  target.setPosition(7.0, 8.0, 9.0);
  target.copy(source);
  expectPosition(target, 7.0, 8.0, 9.0);
  expectSameProperties(target, source);
}

// Stations without notes, time stamps or id keep none of their own; a copy from one empties them.
TEST(DexStation, CopyFromAStationWithoutTextsEmptiesThemAndCopiesAreIndependent) {
  DexStation target = filledStation();
  target.copy(DexStation());
  EXPECT_EQ(target.getNotes(), L"");
  EXPECT_EQ(target.getTimeStamps(), L"");
  EXPECT_EQ(target.getId(), L"");
  EXPECT_EQ(target, DexStation(target));

  DexStation source = filledStation();
  const DexStation copy(source);
  source.setNotes(L"changed");
  source.setId(L"");
  EXPECT_EQ(copy.getNotes(), L"note");
  EXPECT_EQ(copy.getId(), L"id-1");
  source.reset();
  EXPECT_EQ(source.getTimeStamps(), L"");
  EXPECT_EQ(copy.getTimeStamps(), L"2024-03-01 12:00");
}

TEST(DexStation, CopyOfAStationWithoutGeoidHeightKeepsTheTargetsValue) {
  DexStation source;
  DexStation target;
  target.setGeoidHeight(12.0);
  target.copy(source);
  EXPECT_FALSE(target.isGeoidHeightDefined());
  EXPECT_EQ(target.getGeoidHeight(), 12.0);
}

TEST(DexStation, CopyTakesTheHeightAsDefinedByZToo) {
  DexStation source;
  source.setPosition(1.0, 2.0, kNoHeight);
  DexStation target;
  target.copy(source);
  target.setZ(5.0);
  EXPECT_FALSE(target.isHeightDefined());  // the source's marker became the target's flag
}

TEST(DexStation, CopyConstructorAndAssignmentTakeTheCoordinatesToo) {
  const DexStation source = filledStation();
  const DexStation constructed(source);
  expectPosition(constructed, 1.0, 2.0, 3.0);
  expectSameProperties(constructed, source);

  DexStation assigned;
  assigned = source;
  expectPosition(assigned, 1.0, 2.0, 3.0);
  expectSameProperties(assigned, source);
}

TEST(DexStation, SelfAssignmentChangesNothing) {
  DexStation station = filledStation();
  const DexStation before(station);
  DexStation& alias = station;
  station = alias;
  expectPosition(station, 1.0, 2.0, 3.0);
  expectSameProperties(station, before);
}

// ---- Comparison ---------------------------------------------------------------------------------

TEST(DexStation, EqualityIgnoresIdCoordinateKindScaleFactorAndHorizontalFlag) {
  const DexStation a = filledStation();
  DexStation b = filledStation();
  b.setId(L"other");
  b.setCSType(vyn::ie::CS_GRID);
  b.setScaleFactor(2.0);
  b.setHorizCoordsDefined(true);
  EXPECT_EQ(a, b);
  EXPECT_FALSE(a != b);
}

TEST(DexStation, EqualityComparesTextsFlagsHeightsAndBulge) {
  const DexStation a = filledStation();
  auto differsAfter = [&a](auto change) {
    DexStation b = filledStation();
    change(b);
    return a != b && !(a == b);
  };
  EXPECT_TRUE(differsAfter([](DexStation& s) { s.setNotes(L"Note"); }));
  EXPECT_TRUE(differsAfter([](DexStation& s) { s.setTimeStamps(L""); }));
  EXPECT_TRUE(differsAfter([](DexStation& s) { s.setName(L"p1"); }));
  EXPECT_TRUE(differsAfter([](DexStation& s) { s.setStationAttrs(0); }));
  EXPECT_TRUE(differsAfter([](DexStation& s) { s.setHeightUndefined(); }));
  EXPECT_TRUE(differsAfter([](DexStation& s) { s.setGeoidHeightDefined(false); }));
  EXPECT_TRUE(differsAfter([](DexStation& s) { s.setGeoidHeight(4.1); }));
  EXPECT_TRUE(differsAfter([](DexStation& s) { s.setBulge(0.25); }));
  EXPECT_TRUE(differsAfter([](DexStation& s) { s.setX(1.5); }));
}

TEST(DexStation, GeoidHeightsAndBulgesMatchStrictlyWithin1e12) {
  DexStation a;
  a.setGeoidHeight(0.0);
  DexStation b(a);
  b.setGeoidHeight(0.9e-12);
  b.setBulge(-0.9e-12);
  EXPECT_EQ(a, b);
  b.setGeoidHeight(1e-12);
  EXPECT_NE(a, b);
  b.setGeoidHeight(0.0);
  b.setBulge(-1e-12);
  EXPECT_NE(a, b);
  b.setBulge(0.0);
  b.setZ(1e-12);
  EXPECT_NE(a, b);
}

TEST(DexStation, UndefinedGeoidHeightsAreNotCompared) {
  DexStation a;
  DexStation b;
  a.setGeoidHeight(1.0);
  b.setGeoidHeight(2.0);
  a.setGeoidHeightDefined(false);
  b.setGeoidHeightDefined(false);
  EXPECT_EQ(a, b);
}

// ---- DexOffsetStation ---------------------------------------------------------------------------

namespace {

DexOffsetStation filledOffsetStation() {
  DexOffsetStation station;
  station.setPosition(1.0, 2.0, 3.0);
  station.setName(L"S1");
  station.setFirstValue(1.5);
  station.setFirstText(L"left");
  station.setSecondValue(-2.5);
  station.setSecondText(L"right");
  for (int i = 0; i < DexOffsetStation::kExtraValueCount; ++i)
    station.setExtraValue(i, 10.0 + i);
  return station;
}

void expectSameAddedValues(const DexOffsetStation& actual, const DexOffsetStation& expected) {
  EXPECT_EQ(actual.getFirstValue(), expected.getFirstValue());
  EXPECT_EQ(actual.getFirstText(), expected.getFirstText());
  EXPECT_EQ(actual.getSecondValue(), expected.getSecondValue());
  EXPECT_EQ(actual.getSecondText(), expected.getSecondText());
  for (int i = 0; i < DexOffsetStation::kExtraValueCount; ++i) {
    EXPECT_EQ(actual.getExtraValue(i), expected.getExtraValue(i)) << "extra value " << i;
  }
}

}  // namespace

TEST(DexOffsetStation, StartsAsAStationWithZeroValuesAndEmptyTexts) {
  const DexOffsetStation station;
  EXPECT_EQ(station.getStationAttrs(), 2u);
  EXPECT_EQ(station.getCSType(), vyn::ie::CS_LOCAL);
  EXPECT_EQ(station.getScaleFactor(), 1.0);
  EXPECT_EQ(station.getFirstValue(), 0.0);
  EXPECT_TRUE(station.getFirstText().IsEmpty());
  EXPECT_EQ(station.getSecondValue(), 0.0);
  EXPECT_TRUE(station.getSecondText().IsEmpty());
  for (int i = 0; i < DexOffsetStation::kExtraValueCount; ++i)
    EXPECT_EQ(station.getExtraValue(i), 0.0);

  const DexOffsetStation given(0, vyn::ie::CS_GROUND);
  EXPECT_EQ(given.getStationAttrs(), 0u);
  EXPECT_EQ(given.getCSType(), vyn::ie::CS_GROUND);
}

TEST(DexOffsetStation, ExtraValueOutsideTheTenReadsZeroAndIsIgnored) {
  DexOffsetStation station;
  station.setExtraValue(10, 5.0);
  station.setExtraValue(-1, 5.0);
  EXPECT_EQ(station.getExtraValue(10), 0.0);
  EXPECT_EQ(station.getExtraValue(-1), 0.0);
  for (int i = 0; i < DexOffsetStation::kExtraValueCount; ++i)
    EXPECT_EQ(station.getExtraValue(i), 0.0);
}

TEST(DexOffsetStation, CopyTakesTheFourteenAddedValuesOnly) {
  const DexOffsetStation source = filledOffsetStation();
  DexOffsetStation target;
  target.setName(L"T");
  target.copy(source);
  expectSameAddedValues(target, source);
  EXPECT_EQ(target.getName(), L"T");
  expectPosition(target, 0.0, 0.0, 0.0);
}

TEST(DexOffsetStation, StationCopyLeavesTheAddedValues) {
  DexOffsetStation target;
  target.setFirstValue(3.0);
  target.copy(static_cast<const DexStation&>(filledOffsetStation()));
  EXPECT_EQ(target.getName(), L"S1");
  EXPECT_EQ(target.getFirstValue(), 3.0);
}

TEST(DexOffsetStation, CopyConstructorAndAssignmentTakeEverything) {
  const DexOffsetStation source = filledOffsetStation();
  const DexOffsetStation constructed(source);
  expectSameAddedValues(constructed, source);
  expectSameProperties(constructed, source);
  expectPosition(constructed, 1.0, 2.0, 3.0);

  DexOffsetStation assigned;
  assigned = source;
  expectSameAddedValues(assigned, source);
  expectSameProperties(assigned, source);
  expectPosition(assigned, 1.0, 2.0, 3.0);

  DexOffsetStation& alias = assigned;
  assigned = alias;
  expectSameAddedValues(assigned, source);
}

TEST(DexOffsetStation, IsDeletedThroughTheStation) {
  std::unique_ptr<DexStation> station(new DexOffsetStation(2, vyn::ie::CS_LOCAL));
  station->reset();
  EXPECT_EQ(station->getStationAttrs(), 2u);
}
