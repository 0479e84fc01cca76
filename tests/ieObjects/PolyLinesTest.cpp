#include "ieObjects/IEPolyLines.h"

#include <gtest/gtest.h>

#include <climits>
#include <initializer_list>
#include <string>
#include <utility>

#include "ObjectsTestHelpers.h"
#include "ieObjects/IEPoints.h"
#include "ieObjects/detail/ObjectsLog.h"
#include "support/LogCapture.h"
#include "support/PrintString.h"
#include "support/VtableSlot.h"

namespace {

using namespace vyn::ie;
using objects_test::codeOf;
using objects_test::Counted;
using objects_test::stationAt;
namespace detail = vyn::ie::detail;

const std::wstring kSource = detail::kObjectsLogSource;

// A station-mode polyline through stations at (x, 0, 0) for each x.
DexPolyLine lineThrough(std::initializer_list<double> xs) {
  DexPolyLine line(false);
  for (const double x : xs)
    line.addStation(stationAt(x, 0.0, 0.0));
  return line;
}

// How many stations remain of two added at (x, y, z) of the given kind.
int stationsOfTwo(DexPosition3D first, DexPosition3D second, EDexCSType firstKind, EDexCSType secondKind) {
  DexPolyLine line(false);
  line.addStation(stationAt(first.getX(), first.getY(), first.getZ(), L"", 0.0, firstKind));
  line.addStation(stationAt(second.getX(), second.getY(), second.getZ(), L"", 0.0, secondKind));
  return line.getNumberOfStations();
}

}  // namespace

static_assert(sizeof(DexBreakline::EDexBreaklineType) == 4);

TEST(DexPolyLine, StartsOpenWithoutVerticesInTheGivenMode) {
  DexPolyLine line(false);
  EXPECT_TRUE(!line.isClosed() && !line.isUsingPoints() && DexPolyLine(true).isUsingPoints());
  EXPECT_TRUE(line.getNumberOfNodes() == 0 && line.getLastStation() == nullptr && line.getId().IsEmpty());
  const DexArea area(false);
  EXPECT_TRUE(area.isClosed() && area.getAreaDrawProperties() == nullptr && DexArea(true).isUsingPoints());
  line.setId(L"guid-1");
  EXPECT_EQ(L"guid-1", line.getId());
  line.reserveNumberOfStations(1000);
  line.reserveNumberOfStations(-5);
  EXPECT_EQ(0, line.getNumberOfStations());
}

TEST(DexPolyLine, ARepeatedLastVertexMergesKeepingTheBulge) {
  DexPolyLine line(false);
  line.addStation(stationAt(1.0, 2.0, 3.0, L"first"));
  line.addStation(stationAt(1.0, 2.0, 3.0, L"first"));
  line.addStation(stationAt(1.0, 2.0, 3.0, L"again", 0.5));  // with a bulge it replaces the last one
  ASSERT_EQ(1, line.getNumberOfStations());
  EXPECT_TRUE(line.getStation(0).getBulge() == 0.5 && line.getStation(0).getName() == L"again");
  line.addStation(stationAt(1.0, 2.0, 3.0, L"third"));  // without, it is dropped
  EXPECT_TRUE(line.getNumberOfStations() == 1 && line.getStation(0).getName() == L"again");
  EXPECT_EQ(3, lineThrough({1.0, 2.0, 1.0}).getNumberOfStations());  // only the last one is compared
}

TEST(DexPolyLine, MergeToleranceIsATenthOfAMillimetreOrNineNanodegrees) {
  const struct {
    DexPosition3D first, second;
    EDexCSType firstKind, secondKind;
    int stations;
  } rows[] = {{{100, 0, 0}, {100.00005, 0, 0}, CS_GRID, CS_GRID, 1},
              {{100, 0, 0}, {100.00005, 0, 0}, CS_GEOGRAPHIC, CS_GEOGRAPHIC, 2},
              {{10, 0, 0}, {10.00005, 0, 0}, CS_GEOGRAPHIC, CS_GRID, 1},  // the added station's kind
              {{0, 0, 0}, {0, 0, 0.0001}, CS_LOCAL, CS_LOCAL, 2},
              {{0, 0, 0}, {0, 0, -0.00011}, CS_LOCAL, CS_LOCAL, 2},
              {{0, 0, 0}, {0, -0.000099, 0}, CS_LOCAL, CS_LOCAL, 1},
              {{48, 11, 500}, {48, 11 + 8e-9, 500}, CS_GEOGRAPHIC, CS_GEOGRAPHIC, 1},
              {{48, 11, 500}, {48, 11 + 1e-8, 500}, CS_GEOGRAPHIC, CS_GEOGRAPHIC, 2},
              {{0, 0, 0}, {9e-9, 0, 0}, CS_GEOGRAPHIC, CS_GEOGRAPHIC, 2}};
  for (const auto& row : rows)
    EXPECT_EQ(row.stations, stationsOfTwo(row.first, row.second, row.firstKind, row.secondKind))
        << row.second.getX() << " " << row.second.getY() << " " << row.second.getZ();
}

TEST(DexPolyLine, StationsOutsideTheListAreLoggedAndTheSharedDefault) {
  DexPolyLine line = lineThrough({1.0, 2.0});
  const DexPolyLine other(true);
  const dex_test::LogCapture log;
  EXPECT_TRUE(line.getStation(0).getX() == 1.0 && std::as_const(line).getLastStation()->getX() == 2.0);
  EXPECT_EQ(0u, log.size());
  const DexStation& past = line.getStation(2);
  EXPECT_TRUE(&past == &line.getStation(-1) && &past == &other.getStation(0));
  EXPECT_TRUE(past == DexPosition3D(0.0, 0.0, 0.0) && past.getName().IsEmpty());
  EXPECT_EQ(3, log.count(kSource, detail::kPolyLineStationIndexLine));
  EXPECT_TRUE(log.size() == 3u && log.records()[0].message.empty());
}

TEST(DexPolyLine, ChangesAndRemovesOnlyExistingStations) {
  DexPolyLine line = lineThrough({1.0, 2.0, 3.0});
  EXPECT_TRUE(line.changeStation(0, stationAt(5.0, 5.0, 5.0, L"X")));
  EXPECT_FALSE(line.changeStation(3, stationAt(6.0, 0.0, 0.0)) ||
               line.changeStation(-1, stationAt(6.0, 0.0, 0.0)));
  EXPECT_TRUE(line.changeLastStation(stationAt(7.0, 0.0, 0.0)));
  EXPECT_TRUE(line.getStation(0).getName() == L"X" && line.getStation(2).getX() == 7.0);
  EXPECT_FALSE(line.removeStation(3) || line.removeStation(-1));
  EXPECT_TRUE(line.removeStation(1));
  EXPECT_TRUE(line.getNumberOfStations() == 2 && line.getStation(1).getX() == 7.0);
  DexPolyLine empty(false);
  EXPECT_FALSE(empty.changeLastStation(stationAt(7.0, 0.0, 0.0)) || empty.removeStation(0));
  EXPECT_EQ(0, empty.getNumberOfStations());
}

TEST(DexPolyLine, PointModeKeepsEveryEntryAndReadsNodesInEitherMode) {
  DexDesignPoint a;
  DexDesignPoint b;
  a.setName(L"A");
  a.setCoords(5.0, 6.0, 7.0);
  DexPolyLine points(true);
  EXPECT_FALSE(points.removePoint(0));
  for (DexDesignPoint* point : {&a, &a, &b, static_cast<DexDesignPoint*>(nullptr)})
    points.addPoint(point, 0.75);
  EXPECT_TRUE(points.getNumberOfNodes() == 4 && points.getNumberOfPoints() == 4 &&
              points.getNumberOfStations() == 0);
  EXPECT_TRUE(points.getPoint(1) == &a && points.getPoint(3) == nullptr &&
              points.getPointEntry(0)->bulge == 0.75);
  for (const int index : {4, -1, INT_MAX})
    EXPECT_TRUE(points.getPoint(index) == nullptr && points.getPointEntry(index) == nullptr) << index;
  EXPECT_TRUE(&points.getNodeStation(0) == &a.getStation() && points.getNodeBulge(0) == 0.75);
  EXPECT_TRUE(points.setNodeBulge(0, -0.5));
  EXPECT_TRUE(points.getPointEntry(0)->bulge == -0.5 && a.getStation().getBulge() == 0.0);
  EXPECT_FALSE(points.removePoint(4));
  EXPECT_TRUE(points.removePoint(0));  // the entry goes, not the point
  EXPECT_TRUE(points.getNumberOfPoints() == 3 && a.getName() == L"A");
  DexPolyLine stations(false);
  stations.addStation(stationAt(1.0, 0.0, 0.0, L"", 0.1));
  EXPECT_TRUE(stations.getNodeStation(0).getX() == 1.0 && stations.getNodeBulge(0) == 0.1 &&
              stations.getNumberOfPoints() == 0);
  EXPECT_TRUE(stations.setNodeBulge(0, 0.2) && stations.getStation(0).getBulge() == 0.2);
  const dex_test::LogCapture log;  // outside the nodes: logged, the default station, no bulge
  const DexStation* const fallback = &stations.getNodeStation(1);
  EXPECT_TRUE(*fallback == DexPosition3D(0.0, 0.0, 0.0) && fallback == &points.getNodeStation(3) &&
              fallback == &stations.getNodeStation(INT_MIN) && points.getNodeStation(2) == *fallback);
  EXPECT_EQ(3, log.count(kSource, detail::kPolyLineNodeIndexLine));
  EXPECT_EQ(1, log.count(kSource, detail::kPolyLineNodeWithoutPointLine));  // the entry without point
  EXPECT_EQ(4u, log.size());
  EXPECT_TRUE(points.getNodeBulge(2) == 0.75 && points.getNodeBulge(3) == 0.0 &&
              stations.getNodeBulge(-1) == 0.0);
  EXPECT_FALSE(points.setNodeBulge(3, 1.0) || stations.setNodeBulge(1, 1.0));
}

TEST(DexPolyLine, ShiftMovesOwnStationsButNotReferencedPoints) {
  DexDesignPoint a;
  a.setCoords(1.0, 1.0, 1.0);
  DexPolyLine line(true);
  line.addPoint(&a, 0.0);
  line.addStation(stationAt(1.0, 1.0, 1.0));
  line.shiftCoords(DexPosition3D(10.0, 10.0, 10.0), 1.0, 1.0, 1.0, 0.0);
  EXPECT_EQ(DexPosition3D(11.0, 11.0, 11.0), line.getStation(0));
  EXPECT_EQ(DexPosition3D(1.0, 1.0, 1.0), a.getStation());
}

TEST(DexPolyLine, DrawPropertiesOfLinesAndAreas) {
  DexPolyLine line(false);
  EXPECT_EQ(nullptr, line.getDrawLineProperties());
  line.setDrawProperties(objects_test::linePropertiesOf(0xFF));
  EXPECT_TRUE(line.getDrawLineProperties() != nullptr &&
              line.getDrawProperties() == std::as_const(line).getDrawLineProperties());
  line.setDrawProperties(new DexDrawPointProperties());  // the line form only
  EXPECT_TRUE(line.getDrawLineProperties() == nullptr &&
              std::as_const(line).getDrawLineProperties() == nullptr);
  int deletions = 0;
  auto* const first = new Counted<DexDrawAreaProperties>(deletions);
  {
    DexArea area(false);
    area.setAreaDrawProperties(first);
    area.setAreaDrawProperties(first);
    EXPECT_TRUE(deletions == 0 && area.getAreaDrawProperties() == first);
    area.setAreaDrawProperties(new Counted<DexDrawAreaProperties>(deletions));
    EXPECT_EQ(1, deletions);
  }
  EXPECT_EQ(2, deletions);
}

TEST(DexBreakline, IsAStationModeLineOfItsSurface) {
  DexBreakline breakline(L"Ground");
  EXPECT_TRUE(!breakline.isUsingPoints() && !breakline.isClosed() &&
              breakline.getSurfaceName() == L"Ground" && breakline.getBreaklineType() == 0);
  breakline.setBreaklineType(DexBreakline::BREAKLINE_SOFT);
  EXPECT_EQ(1, breakline.getBreaklineType());
  breakline.setBreaklineType(42);
  EXPECT_EQ(42, breakline.getBreaklineType());
  // The surface name is the one operation it adds to the virtual table.
  const auto surfaceName = dex_test::vtableEntryOf(&DexBreakline::getSurfaceName);
  const auto lastOfPolyLine = dex_test::vtableEntryOf(&DexPolyLine::getId);
  if (!surfaceName || !lastOfPolyLine) GTEST_SKIP() << "virtual table layout not observable on this platform";
  EXPECT_GT(*surfaceName, dex_test::vtableEntryOf(&DexPolyLine::setDrawProperties).value_or(0));
  EXPECT_EQ(*lastOfPolyLine + 1, *surfaceName);
}

// A point-mode line is a code string when each of its points carries its name as a code string (the
// first may carry it as code name and string); any code of a point may carry it.
TEST(DexPolyLine, PointsCarryingTheNameAsCodeStringMakeACodeString) {
  const DexCodeDescription fence(L"FENCE");
  const DexCodeDescription tree(L"TREE");
  using Strings = std::initializer_list<const wchar_t*>;
  const struct {
    const wchar_t* name;
    Strings first, middle, last;
    bool tree, codeString;
  } rows[] = {{L"A1", {L"A1"}, {L"A1"}, {L"A1"}, false, true},
              {L"A1", {L"A1"}, {L"A2"}, {L"A1"}, false, false},
              {L"A1", {L"B", L"A1"}, {L"B", L"A1"}, {L"B", L"A1"}, true, true},
              {L"FENCE7", {L"7"}, {L"FENCE7"}, {L"FENCE7"}, false, true},
              {L"FENCE7", {L"7"}, {L"FENCE7"}, {L"7"}, false, false},
              {L"A1", {L"a1"}, {L"a1"}, {L"a1"}, false, false},
              {L"A1", {L"A1"}, {}, {L"A1"}, false, false},
              {L"A1", {}, {L"A1"}, {L"A1"}, false, false}};
  int rowNumber = 0;
  for (const auto& row : rows) {
    DexDesignPoint points[3];
    DexPolyLine line(true);
    line.setName(row.name);
    const Strings* const strings[] = {&row.first, &row.middle, &row.last};
    for (int i = 0; i < 3; ++i) {
      if (row.tree) points[i].addCode(codeOf(&tree, {L"X"}));
      if (strings[i]->size() > 0) points[i].addCode(codeOf(&fence, *strings[i]));
      line.addPoint(&points[i], 0.0);
    }
    EXPECT_EQ(row.codeString, line.isCodeString()) << "row " << rowNumber++;
  }
  DexDesignPoint point;  // one point; codes without description and missing points never crash
  point.addCode(codeOf(nullptr, {L"A1"}));
  DexPolyLine line(true);
  line.setName(L"A1");
  line.addPoint(&point, 0.0);
  EXPECT_TRUE(line.isCodeString());
  line.addPoint(nullptr, 0.0);
  EXPECT_FALSE(line.isCodeString());
  DexPolyLine nullFirst(true);
  nullFirst.setName(L"A1");
  nullFirst.addPoint(nullptr, 0.0);
  nullFirst.addPoint(&point, 0.0);
  EXPECT_FALSE(nullFirst.isCodeString() || DexPolyLine(true).isCodeString() ||
               lineThrough({1.0}).isCodeString());
}
