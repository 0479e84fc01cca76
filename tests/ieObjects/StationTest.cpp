#include "ieObjects/IEStation.h"

#include <gtest/gtest.h>

#include <locale>
#include <sstream>
#include <string>

#include "ieObjects/detail/CoordsLog.h"
#include "support/LogCapture.h"
#include "support/TempDir.h"
#include "support/VtableSlot.h"

namespace {

using namespace vyn::ie;
namespace detail = vyn::ie::detail;

EPointAttrFlags flag(int number) {
  return static_cast<EPointAttrFlags>(number);
}

// Every property of a station in one line: position, height, flags (H: height defined, X: horizontal
// coordinates defined, G: geoid height defined), attributes, kind, scale, bulge and the texts.
std::string describe(const DexStation& s) {
  std::ostringstream out;
  out.imbue(std::locale::classic());
  out << s.getX() << "," << s.getY() << "," << s.getZ() << " h" << s.getHeight() << " g" << s.getGeoidHeight()
      << " " << (s.isHeightDefined() ? "H" : "-") << (s.isHorizCoordsDefined() ? "X" : "-")
      << (s.isGeoidHeightDefined() ? "G" : "-") << " a" << s.getStationAttrs() << " cs" << s.getCSType()
      << " s" << s.getScaleFactor() << " b" << s.getBulge() << " '" << dex_test::narrow(s.getName().view())
      << "' '" << dex_test::narrow(s.getId().view()) << "' '" << dex_test::narrow(s.getNotes().view())
      << "' '" << dex_test::narrow(s.getTimeStamps().view()) << "'";
  return out.str();
}

std::string describe(const DexOffsetStation& s) {
  std::ostringstream out;
  out.imbue(std::locale::classic());
  out << describe(static_cast<const DexStation&>(s)) << " " << s.getFirstValue() << " '"
      << dex_test::narrow(s.getFirstText().view()) << "' " << s.getSecondValue() << " '"
      << dex_test::narrow(s.getSecondText().view()) << "'";
  for (int i = -1; i <= DexOffsetStation::kExtraValueCount; ++i)
    out << " " << s.getExtraValue(i);
  return out.str();
}

// A station with every property set to something other than its default.
DexStation filledStation() {
  DexStation station(1u << 3, CS_GEOGRAPHIC);
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

constexpr const char* kFilled = "1,2,3 h4 g4 H-G a8 cs1 s0.9996 b0.5 'P1' 'id-1' 'note' '2024-03-01 12:00'";

// Counts the calls that reach it through the virtual table.
class CountingStation : public DexStation {
 public:
  void shiftValues(const DexPosition3D& origin, double sx, double sy, double sz, double rotation) override {
    ++shifts;
    DexStation::shiftValues(origin, sx, sy, sz, rotation);
  }
  void reset() override {
    ++resets;
    DexStation::reset();
  }
  int shifts = 0;
  int resets = 0;
};

TEST(DexStation, StartsAtTheOriginWithFlagOneLocalCoordinatesAndScaleOne) {
  EXPECT_EQ("0,0,0 h0 g0 HX- a2 cs5 s1 b0 '' '' '' ''", describe(DexStation()));
  EXPECT_EQ(kFilled, describe(filledStation()));
  EXPECT_EQ("0,0,0 h0 g0 HX- a4026531840 cs42 s1 b0 '' '' '' ''",
            describe(DexStation(0xF0000000u, static_cast<EDexCSType>(42))));
}

TEST(DexStation, NoValueMarkersLeaveCoordinatesUndefinedForGood) {
  DexStation station;
  station.setPosition(kNoValue, 10.0, 5.0);
  EXPECT_FALSE(station.isHorizCoordsDefined());
  station.setPosition(1.0, 2.0, 3.0);  // defined values do not define them again
  EXPECT_EQ("1,2,3 h3 g0 H-- a2 cs5 s1 b0 '' '' '' ''", describe(station));
  DexStation noY;
  noY.setPosition(DexPosition3D(10.0, kNoValue, 5.0));
  EXPECT_FALSE(noY.isHorizCoordsDefined());
  DexStation noZ;
  noZ.setPosition(1.0, 2.0, kNoValue);
  EXPECT_EQ(noZ.getZ(), kNoValue);
  noZ.setPosition(DexPosition3D(1.0, 2.0, 3.0));
  EXPECT_FALSE(noZ.isHeightDefined() || !noZ.isHorizCoordsDefined());
  DexStation noHeight;
  noHeight.setPosition(1.0, 2.0, kNoHeight);
  noHeight.setHeightDefined(true);  // the marker in z wins
  EXPECT_FALSE(noHeight.isHeightDefined());
  noHeight.setZ(0.0);
  EXPECT_TRUE(noHeight.isHeightDefined());
  noHeight.setHeightUndefined();
  noHeight.setHorizCoordsUndefined();
  EXPECT_FALSE(noHeight.isHeightDefined() || noHeight.isHorizCoordsDefined());
  noHeight.setHeightDefined(true);
  noHeight.setHorizCoordsDefined(true);
  EXPECT_TRUE(noHeight.isHeightDefined() && noHeight.isHorizCoordsDefined());
}

TEST(DexStation, HeightIsZUntilAGeoidHeightIsDefined) {
  DexStation station;
  station.setPosition(1.0, 2.0, 3.0);
  station.setGeoidHeight(47.5);
  EXPECT_EQ("1,2,3 h47.5 g47.5 HXG a2 cs5 s1 b0 '' '' '' ''", describe(station));
  station.setGeoidHeightDefined(false);
  EXPECT_EQ(station.getHeight(), 3.0);
  station.setPosition(1.0, 2.0, 3.0, -12.5);
  EXPECT_EQ("1,2,3 h-12.5 g-12.5 HXG a2 cs5 s1 b0 '' '' '' ''", describe(station));
}

TEST(DexStation, PointAttributesAreBitsModulo32AndMoreThanOneExclusiveFlagIsLogged) {
  dex_test::LogCapture log;
  DexStation station;  // flag 1
  station.addPointAttr(flag(1));
  station.addPointAttr(flag(0));
  station.addPointAttr(flag(17));
  EXPECT_EQ(log.size(), 0u);
  EXPECT_EQ(station.getStationAttrs(), (1u << 0) | (1u << 1) | (1u << 17));
  DexStation modulo(0);
  modulo.addPointAttr(flag(35));  // without any exclusive flag: logged
  EXPECT_TRUE(modulo.hasPointAttr(flag(3)) && modulo.hasPointAttr(flag(67)) && !modulo.hasPointAttr(flag(2)));
  modulo.addPointAttr(flag(1));  // a second exclusive flag: logged, both bits kept
  EXPECT_EQ(modulo.getStationAttrs(), (1u << 3) | (1u << 1));
  EXPECT_EQ(log.count(detail::kCoordsLogSource, detail::kExclusivePointAttrsLine), 1);
  modulo.setStationAttrs(1u << 31);
  EXPECT_TRUE(modulo.hasPointAttr(flag(-1)));  // 0xFFFFFFFF modulo 32 is 31
  DexStation none(0);
  none.addPointAttr(flag(5));
  EXPECT_EQ(log.count(detail::kCoordsLogSource, detail::kExclusivePointAttrsLine), 2);
  EXPECT_TRUE(log.records()[0].message.empty());
  EXPECT_EQ(log.records()[0].level, vyn_logging::kErrorLevel);
}

TEST(DexStation, ResetKeepsAttributesKindAndScaleAndShiftMovesTheGeoidHeightToo) {
  CountingStation counting;
  DexStation& station = counting;
  station = filledStation();
  station.setHeightUndefined();
  station.reset();
  EXPECT_EQ("0,0,0 h0 g0 HX- a8 cs1 s0.9996 b0 '' '' '' ''", describe(station));
  station.setPosition(1.0, 2.0, 3.0, 10.0);
  station.shiftCoords(DexPosition3D(100.0, 200.0, 5.0), 2.0, 2.0, 3.0, 0.0);
  EXPECT_EQ("102,204,14 h35 g35 HXG a8 cs1 s0.9996 b0 '' '' '' ''", describe(station));
  EXPECT_EQ(counting.shifts + counting.resets, 2);  // through the virtual table
  DexStation undefinedGeoid;
  undefinedGeoid.setPosition(0.0, 1.0, 2.0);
  undefinedGeoid.shiftCoords(DexPosition3D(5.0, 5.0, 7.0), 1.0, 1.0, 1.0,
                             90.0);  // a quarter turn about (5, 5)
  EXPECT_EQ("4,5,9 h9 g7 HX- a2 cs5 s1 b0 '' '' '' ''", describe(undefinedGeoid));
  const auto shiftValues = dex_test::vtableEntryOf(&DexStation::shiftValues);
  if (!shiftValues) GTEST_SKIP() << "virtual table layout not observable";
  EXPECT_EQ(*shiftValues, 2);  // entries 0 and 1 are the destructor
  EXPECT_EQ(dex_test::vtableEntryOf(&DexStation::reset), 3);
  EXPECT_EQ(dex_test::vtableEntryOf(&DexStation::shiftCoords), 4);
}

TEST(DexStation, CopyTakesEverythingButTheCoordinatesAndCopiesAreIndependent) {
  DexStation target;
  target.setPosition(7.0, 8.0, 9.0);
  target.copy(filledStation());
  EXPECT_EQ("7,8,9 h4 g4 H-G a8 cs1 s0.9996 b0.5 'P1' 'id-1' 'note' '2024-03-01 12:00'", describe(target));
  target.copy(DexStation());  // keeps the geoid height, which the source does not define
  EXPECT_EQ("7,8,9 h9 g4 HX- a2 cs5 s1 b0 '' '' '' ''", describe(target));
  DexStation source = filledStation();
  const DexStation copy(source);
  DexStation assigned;
  assigned = source;
  source.setNotes(L"changed");
  source.reset();
  EXPECT_EQ(kFilled, describe(copy));
  EXPECT_EQ(kFilled, describe(assigned));
  DexStation& alias = assigned;
  assigned = alias;
  EXPECT_EQ(kFilled, describe(assigned));
  DexStation noHeight;
  noHeight.setPosition(1.0, 2.0, kNoHeight);
  target.copy(noHeight);
  target.setZ(5.0);
  EXPECT_FALSE(target.isHeightDefined());  // the source's marker became the target's flag
}

TEST(DexStation, EqualityComparesTextsFlagsHeightsAndBulgeWithin1e12) {
  DexStation b = filledStation();
  b.setId(L"other");
  b.setCSType(CS_GRID);
  b.setScaleFactor(2.0);
  b.setHorizCoordsDefined(true);
  EXPECT_TRUE(filledStation() == b && !(filledStation() != b));  // id, kind, scale and that flag are left out
  const auto differsAfter = [](auto change) {
    DexStation changed = filledStation();
    change(changed);
    return filledStation() != changed && !(filledStation() == changed);
  };
  EXPECT_TRUE(differsAfter([](DexStation& s) { s.setNotes(L"Note"); }));
  EXPECT_TRUE(differsAfter([](DexStation& s) { s.setTimeStamps(L""); }));
  EXPECT_TRUE(differsAfter([](DexStation& s) { s.setName(L"p1"); }));
  EXPECT_TRUE(differsAfter([](DexStation& s) { s.setStationAttrs(0); }));
  EXPECT_TRUE(differsAfter([](DexStation& s) { s.setHeightUndefined(); }));
  EXPECT_TRUE(differsAfter([](DexStation& s) { s.setGeoidHeightDefined(false); }));
  EXPECT_TRUE(differsAfter([](DexStation& s) { s.setGeoidHeight(4.1); }));
  EXPECT_TRUE(differsAfter([](DexStation& s) { s.setBulge(0.5 + 2e-12); }));
  EXPECT_TRUE(differsAfter([](DexStation& s) { s.setX(1.0 + 1e-12); }));
  EXPECT_FALSE(
      differsAfter([](DexStation& s) { s.setGeoidHeight(4.0 + 0.9e-12), s.setBulge(0.5 - 0.9e-12); }));
  DexStation a;
  DexStation c;
  a.setGeoidHeight(1.0);
  c.setGeoidHeight(2.0);
  a.setGeoidHeightDefined(false);
  c.setGeoidHeightDefined(false);
  EXPECT_EQ(a, c);  // undefined geoid heights are not compared
  c.setBulge(-0.9e-12);
  EXPECT_EQ(a, c);
  c.setBulge(-1e-12);  // exactly the tolerance apart
  EXPECT_NE(a, c);
}

TEST(DexOffsetStation, AddsFourteenValuesThatItsOwnCopyTakes) {
  DexOffsetStation source;
  source.setPosition(1.0, 2.0, 3.0);
  source.setName(L"S1");
  source.setFirstValue(1.5);
  source.setFirstText(L"left");
  source.setSecondValue(-2.5);
  source.setSecondText(L"right");
  for (int i = -1; i <= DexOffsetStation::kExtraValueCount; ++i)
    source.setExtraValue(i, 10.0 + i);  // outside the ten, ignored and read as 0
  const std::string values = " 1.5 'left' -2.5 'right' 0 10 11 12 13 14 15 16 17 18 19 0";
  EXPECT_EQ("1,2,3 h3 g0 HX- a2 cs5 s1 b0 'S1' '' '' ''" + values, describe(source));
  DexOffsetStation target;
  target.setName(L"T");
  target.copy(source);  // the added values only
  EXPECT_EQ("0,0,0 h0 g0 HX- a2 cs5 s1 b0 'T' '' '' ''" + values, describe(target));
  DexOffsetStation stationOnly;
  stationOnly.setFirstValue(3.0);
  stationOnly.copy(static_cast<const DexStation&>(source));  // the station's properties only
  EXPECT_EQ("0,0,0 h0 g0 HX- a2 cs5 s1 b0 'S1' '' '' '' 3 '' 0 '' 0 0 0 0 0 0 0 0 0 0 0 0",
            describe(stationOnly));
  DexOffsetStation assigned(0, CS_GROUND);
  assigned = source;
  EXPECT_EQ(describe(source), describe(DexOffsetStation(source)));
  EXPECT_EQ(describe(source), describe(assigned));
  IDexIdInterface* const identified = new DexOffsetStation();  // deleted through any of its interfaces
  identified->setId(L"X");
  delete identified;
  ICoordInfo* const info = new DexStation();
  delete info;
}

}  // namespace
