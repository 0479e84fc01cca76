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

using objects_test::codeOf;
using objects_test::CountedAreaProperties;
using objects_test::linePropertiesOf;
using objects_test::stationAt;
using vyn::ie::CS_GEOGRAPHIC;
using vyn::ie::CS_GRID;
using vyn::ie::DexArea;
using vyn::ie::DexBreakline;
using vyn::ie::DexCodeDescription;
using vyn::ie::DexDesignPoint;
using vyn::ie::DexDrawAreaProperties;
using vyn::ie::DexDrawPointProperties;
using vyn::ie::DexPolyLine;
using vyn::ie::DexPosition3D;
using vyn::ie::DexStation;
namespace detail = vyn::ie::detail;

const std::wstring kSource = detail::kObjectsLogSource;

// A station-mode polyline through stations at (x, 0, 0) for each x.
DexPolyLine lineThrough(std::initializer_list<double> xs) {
  DexPolyLine line(false);
  for (const double x : xs)
    line.addStation(stationAt(x, 0.0, 0.0));
  return line;
}

// A design point carrying one code (of description, may be null) with the given code strings.
void addCode(DexDesignPoint& point, const DexCodeDescription* description,
             std::initializer_list<const wchar_t*> codeStrings) {
  point.addCode(codeOf(description, codeStrings));
}

// Three design points and a point-mode polyline named A1 through them.
struct CodeStringFixture {
  DexCodeDescription fence{L"FENCE"};
  DexDesignPoint points[3];
  DexPolyLine line{true};

  CodeStringFixture() {
    line.setName(L"A1");
    for (DexDesignPoint& point : points)
      line.addPoint(&point, 0.0);
  }
};

}  // namespace

static_assert(sizeof(DexBreakline::EDexBreaklineType) == 4);

// ---- Modes and defaults -------------------------------------------------------------------------

TEST(DexPolyLine, StartsOpenWithoutVerticesInTheGivenMode) {
  const DexPolyLine stations(false);
  const DexPolyLine points(true);
  EXPECT_FALSE(stations.isClosed());
  EXPECT_FALSE(stations.isUsingPoints());
  EXPECT_TRUE(points.isUsingPoints());
  EXPECT_EQ(0, stations.getNumberOfNodes());
  EXPECT_EQ(nullptr, stations.getLastStation());
  EXPECT_TRUE(stations.getName().IsEmpty());
  EXPECT_TRUE(stations.getId().IsEmpty());
}

TEST(DexArea, StartsClosed) {
  const DexArea area(false);
  EXPECT_TRUE(area.isClosed());
  EXPECT_EQ(nullptr, area.getAreaDrawProperties());
  EXPECT_TRUE(DexArea(true).isUsingPoints());
}

TEST(DexPolyLine, KeepsNameIdAndCloseStatus) {
  DexPolyLine line(false);
  line.setName(L"L1");
  line.setId(L"guid-1");
  line.setCloseStatus(true);
  EXPECT_EQ(L"L1", line.getName());
  EXPECT_EQ(L"guid-1", line.getId());
  EXPECT_TRUE(line.isClosed());
}

// ---- Adding stations ----------------------------------------------------------------------------

TEST(DexPolyLine, AddingTheSameStationTwiceKeepsOneVertex) {
  DexPolyLine line(false);
  line.addStation(stationAt(1.0, 2.0, 3.0));
  line.addStation(stationAt(1.0, 2.0, 3.0));
  EXPECT_EQ(1, line.getNumberOfStations());
}

TEST(DexPolyLine, ARepeatedVertexWithABulgeReplacesTheLastOne) {
  DexPolyLine line(false);
  line.addStation(stationAt(1.0, 2.0, 3.0, L"first"));
  line.addStation(stationAt(1.0, 2.0, 3.0, L"again", 0.5));
  ASSERT_EQ(1, line.getNumberOfStations());
  EXPECT_EQ(0.5, line.getStation(0).getBulge());
  EXPECT_EQ(L"again", line.getStation(0).getName());
}

TEST(DexPolyLine, ARepeatedVertexWithoutBulgeIsDroppedKeepingTheLastOnesBulge) {
  DexPolyLine line(false);
  line.addStation(stationAt(1.0, 2.0, 3.0, L"first", 0.25));
  line.addStation(stationAt(1.0, 2.0, 3.0, L"again"));
  ASSERT_EQ(1, line.getNumberOfStations());
  EXPECT_EQ(0.25, line.getStation(0).getBulge());
  EXPECT_EQ(L"first", line.getStation(0).getName());
}

TEST(DexPolyLine, OnlyTheLastStationIsComparedWhenAdding) {
  const DexPolyLine line = lineThrough({1.0, 2.0, 1.0});
  EXPECT_EQ(3, line.getNumberOfStations());
}

TEST(DexPolyLine, StationsCloserThanAMillimetreTenthMergeUnlessGeographic) {
  DexPolyLine grid(false);
  grid.addStation(stationAt(100.0, 0.0, 0.0, L"", 0.0, CS_GRID));
  grid.addStation(stationAt(100.00005, 0.0, 0.0, L"", 0.0, CS_GRID));
  EXPECT_EQ(1, grid.getNumberOfStations());

  DexPolyLine geographic(false);
  geographic.addStation(stationAt(100.0, 0.0, 0.0, L"", 0.0, CS_GEOGRAPHIC));
  geographic.addStation(stationAt(100.00005, 0.0, 0.0, L"", 0.0, CS_GEOGRAPHIC));
  EXPECT_EQ(2, geographic.getNumberOfStations());
}

TEST(DexPolyLine, MergeToleranceFollowsTheAddedStationsKind) {
  DexPolyLine line(false);
  line.addStation(stationAt(10.0, 0.0, 0.0, L"", 0.0, CS_GEOGRAPHIC));
  line.addStation(stationAt(10.00005, 0.0, 0.0, L"", 0.0, CS_GRID));
  EXPECT_EQ(1, line.getNumberOfStations());
}

TEST(DexPolyLine, StationsJustOutsideTheToleranceStayApart) {
  for (const double dz : {0.0001, 0.00011, -0.00011}) {
    DexPolyLine line(false);
    line.addStation(stationAt(0.0, 0.0, 0.0));
    line.addStation(stationAt(0.0, 0.0, dz));
    EXPECT_EQ(2, line.getNumberOfStations()) << dz;
  }
  DexPolyLine inside(false);
  inside.addStation(stationAt(0.0, 0.0, 0.0));
  inside.addStation(stationAt(0.0, -0.000099, 0.0));
  EXPECT_EQ(1, inside.getNumberOfStations());
}

TEST(DexPolyLine, GeographicStationsMergeOnlyWithinNineNanodegrees) {
  DexPolyLine inside(false);
  inside.addStation(stationAt(48.0, 11.0, 500.0, L"", 0.0, CS_GEOGRAPHIC));
  inside.addStation(stationAt(48.0, 11.0 + 8e-9, 500.0, L"", 0.0, CS_GEOGRAPHIC));
  EXPECT_EQ(1, inside.getNumberOfStations());

  DexPolyLine outside(false);
  outside.addStation(stationAt(48.0, 11.0, 500.0, L"", 0.0, CS_GEOGRAPHIC));
  outside.addStation(stationAt(48.0, 11.0 + 1e-8, 500.0, L"", 0.0, CS_GEOGRAPHIC));
  EXPECT_EQ(2, outside.getNumberOfStations());

  DexPolyLine onTheTolerance(false);
  onTheTolerance.addStation(stationAt(0.0, 0.0, 0.0, L"", 0.0, CS_GEOGRAPHIC));
  onTheTolerance.addStation(stationAt(9e-9, 0.0, 0.0, L"", 0.0, CS_GEOGRAPHIC));
  EXPECT_EQ(2, onTheTolerance.getNumberOfStations());
}

// ---- Station access -----------------------------------------------------------------------------

TEST(DexPolyLine, GetStationOutsideTheListLogsAndAnswersTheSharedDefaultStation) {
  const DexPolyLine line = lineThrough({1.0, 2.0});
  const DexPolyLine other(true);
  const dex_test::LogCapture log;
  const DexStation& past = line.getStation(2);
  const DexStation& negative = line.getStation(-1);
  const DexStation& fromOther = other.getStation(0);
  EXPECT_EQ(&past, &negative);
  EXPECT_EQ(&past, &fromOther);
  EXPECT_EQ(DexPosition3D(0.0, 0.0, 0.0), past);
  EXPECT_TRUE(past.getName().IsEmpty());
  EXPECT_EQ(3, log.count(kSource, detail::kPolyLineStationIndexLine));
  EXPECT_EQ(3u, log.size());
  EXPECT_TRUE(log.records()[0].message.empty());
}

TEST(DexPolyLine, GetStationInsideTheListDoesNotLog) {
  const DexPolyLine line = lineThrough({1.0, 2.0});
  const dex_test::LogCapture log;
  EXPECT_EQ(1.0, line.getStation(0).getX());
  EXPECT_EQ(2.0, line.getStation(1).getX());
  EXPECT_EQ(0u, log.size());
}

TEST(DexPolyLine, LastStationIsTheLastAdded) {
  DexPolyLine line = lineThrough({1.0, 2.0});
  ASSERT_NE(nullptr, line.getLastStation());
  EXPECT_EQ(2.0, line.getLastStation()->getX());
  EXPECT_EQ(2.0, std::as_const(line).getLastStation()->getX());
}

TEST(DexPolyLine, ChangeStationAssignsOnlyExistingStations) {
  DexPolyLine line = lineThrough({1.0, 2.0});
  EXPECT_TRUE(line.changeStation(0, stationAt(5.0, 5.0, 5.0, L"X")));
  EXPECT_EQ(L"X", line.getStation(0).getName());
  EXPECT_FALSE(line.changeStation(2, stationAt(6.0, 0.0, 0.0)));
  EXPECT_FALSE(line.changeStation(-1, stationAt(6.0, 0.0, 0.0)));
  EXPECT_TRUE(line.changeLastStation(stationAt(7.0, 0.0, 0.0)));
  EXPECT_EQ(7.0, line.getStation(1).getX());
  EXPECT_EQ(2, line.getNumberOfStations());

  DexPolyLine empty(false);
  EXPECT_FALSE(empty.changeLastStation(stationAt(7.0, 0.0, 0.0)));
  EXPECT_EQ(0, empty.getNumberOfStations());
}

TEST(DexPolyLine, RemoveStationClosesTheGapAndRefusesBadIndexes) {
  DexPolyLine line = lineThrough({1.0, 2.0, 3.0});
  EXPECT_FALSE(line.removeStation(3));
  EXPECT_FALSE(line.removeStation(-1));
  EXPECT_TRUE(line.removeStation(1));
  ASSERT_EQ(2, line.getNumberOfStations());
  EXPECT_EQ(3.0, line.getStation(1).getX());

  DexPolyLine empty(false);
  EXPECT_FALSE(empty.removeStation(0));
}

TEST(DexPolyLine, ReservingRoomAddsNoStation) {
  DexPolyLine line(false);
  line.reserveNumberOfStations(1000);
  line.reserveNumberOfStations(-5);
  EXPECT_EQ(0, line.getNumberOfStations());
}

// ---- Point mode ---------------------------------------------------------------------------------

TEST(DexPolyLine, NodesFollowTheMode) {
  DexDesignPoint a;
  DexDesignPoint b;
  DexDesignPoint c;
  DexPolyLine line(true);
  line.addPoint(&a, 0.0);
  line.addPoint(&b, 0.5);
  line.addPoint(&c, 0.0);
  EXPECT_EQ(3, line.getNumberOfNodes());
  EXPECT_EQ(3, line.getNumberOfPoints());
  EXPECT_EQ(0, line.getNumberOfStations());

  const DexPolyLine stations = lineThrough({1.0, 2.0});
  EXPECT_EQ(2, stations.getNumberOfNodes());
  EXPECT_EQ(0, stations.getNumberOfPoints());
}

TEST(DexPolyLine, PointEntriesAreNeverMerged) {
  DexDesignPoint a;
  DexPolyLine line(true);
  line.addPoint(&a, 0.0);
  line.addPoint(&a, 0.0);
  line.addPoint(nullptr, 0.0);
  EXPECT_EQ(3, line.getNumberOfPoints());
  EXPECT_EQ(&a, line.getPoint(1));
  EXPECT_EQ(nullptr, line.getPoint(2));
}

TEST(DexPolyLine, PointAccessOutsideTheListAnswersNull) {
  DexDesignPoint a;
  DexPolyLine line(true);
  line.addPoint(&a, 0.25);
  EXPECT_EQ(&a, line.getPoint(0));
  ASSERT_NE(nullptr, line.getPointEntry(0));
  EXPECT_EQ(0.25, line.getPointEntry(0)->bulge);
  for (const int index : {1, -1, INT_MAX}) {
    EXPECT_EQ(nullptr, line.getPoint(index));
    EXPECT_EQ(nullptr, line.getPointEntry(index));
  }
}

TEST(DexPolyLine, RemovePointRemovesTheEntryButNotThePoint) {
  DexDesignPoint a;
  DexDesignPoint b;
  a.setName(L"A");
  DexPolyLine line(true);
  EXPECT_FALSE(line.removePoint(0));
  line.addPoint(&a, 0.0);
  line.addPoint(&b, 0.0);
  EXPECT_FALSE(line.removePoint(2));
  EXPECT_TRUE(line.removePoint(0));
  EXPECT_EQ(1, line.getNumberOfPoints());
  EXPECT_EQ(&b, line.getPoint(0));
  EXPECT_EQ(L"A", a.getName());
}

TEST(DexPolyLine, NodeStationsAndBulgesReadEitherMode) {
  DexDesignPoint a;
  a.setCoords(5.0, 6.0, 7.0);
  DexPolyLine points(true);
  points.addPoint(&a, 0.75);
  EXPECT_EQ(&a.getStation(), &points.getNodeStation(0));
  EXPECT_EQ(0.75, points.getNodeBulge(0));
  EXPECT_TRUE(points.setNodeBulge(0, -0.5));
  EXPECT_EQ(-0.5, points.getPointEntry(0)->bulge);
  EXPECT_EQ(0.0, a.getStation().getBulge());

  DexPolyLine stations(false);
  stations.addStation(stationAt(1.0, 0.0, 0.0, L"", 0.1));
  EXPECT_EQ(1.0, stations.getNodeStation(0).getX());
  EXPECT_EQ(0.1, stations.getNodeBulge(0));
  EXPECT_TRUE(stations.setNodeBulge(0, 0.2));
  EXPECT_EQ(0.2, stations.getStation(0).getBulge());
}

TEST(DexPolyLine, NodeAccessOutsideTheNodesNeverCrashes) {
  DexDesignPoint a;
  DexPolyLine points(true);
  points.addPoint(&a, 0.0);
  points.addStation(stationAt(1.0, 0.0, 0.0));
  DexPolyLine stations = lineThrough({1.0});
  const dex_test::LogCapture log;
  const DexStation* const defaultStation = &points.getNodeStation(1);
  EXPECT_EQ(DexPosition3D(0.0, 0.0, 0.0), *defaultStation);
  EXPECT_EQ(defaultStation, &stations.getNodeStation(1));
  EXPECT_EQ(defaultStation, &stations.getNodeStation(INT_MIN));
  EXPECT_EQ(3, log.count(kSource, detail::kPolyLineNodeIndexLine));
  EXPECT_EQ(3u, log.size());
  EXPECT_EQ(0.0, points.getNodeBulge(1));
  EXPECT_EQ(0.0, stations.getNodeBulge(-1));
  EXPECT_FALSE(points.setNodeBulge(1, 1.0));
  EXPECT_FALSE(stations.setNodeBulge(1, 1.0));
}

TEST(DexPolyLine, NodeStationOfAnEntryWithoutPointIsLoggedAndTheDefault) {
  DexPolyLine line(true);
  line.addPoint(nullptr, 0.5);
  const dex_test::LogCapture log;
  const DexStation& station = line.getNodeStation(0);
  EXPECT_EQ(DexPosition3D(0.0, 0.0, 0.0), station);
  EXPECT_EQ(1, log.count(kSource, detail::kPolyLineNodeWithoutPointLine));
  EXPECT_EQ(0.5, line.getNodeBulge(0));
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

// ---- Drawing properties -------------------------------------------------------------------------

TEST(DexPolyLine, DrawLinePropertiesReadTheLineFormOnly) {
  DexPolyLine line(false);
  EXPECT_EQ(nullptr, line.getDrawLineProperties());
  line.setDrawProperties(linePropertiesOf(0xFF));
  ASSERT_NE(nullptr, line.getDrawLineProperties());
  EXPECT_EQ(line.getDrawProperties(), std::as_const(line).getDrawLineProperties());
  line.setDrawProperties(new DexDrawPointProperties());
  EXPECT_EQ(nullptr, line.getDrawLineProperties());
  EXPECT_EQ(nullptr, std::as_const(line).getDrawLineProperties());
}

TEST(DexArea, AreaDrawPropertiesAreOwnedAndReplacedOnesDeleted) {
  int deletions = 0;
  auto* const first = new CountedAreaProperties(deletions);
  {
    DexArea area(false);
    area.setAreaDrawProperties(first);
    area.setAreaDrawProperties(first);
    EXPECT_EQ(0, deletions);
    EXPECT_EQ(first, area.getAreaDrawProperties());
    area.setAreaDrawProperties(new CountedAreaProperties(deletions));
    EXPECT_EQ(1, deletions);
  }
  EXPECT_EQ(2, deletions);
}

// ---- Breaklines ---------------------------------------------------------------------------------

TEST(DexBreakline, IsAStationModeLineOfItsSurface) {
  DexBreakline breakline(L"Ground");
  EXPECT_FALSE(breakline.isUsingPoints());
  EXPECT_FALSE(breakline.isClosed());
  EXPECT_EQ(L"Ground", breakline.getSurfaceName());
  EXPECT_EQ(0, breakline.getBreaklineType());
  breakline.setBreaklineType(DexBreakline::BREAKLINE_SOFT);
  EXPECT_EQ(1, breakline.getBreaklineType());
  breakline.setBreaklineType(42);
  EXPECT_EQ(42, breakline.getBreaklineType());
}

TEST(DexBreakline, SurfaceNameIsTheOneOperationItAddsToTheVirtualTable) {
  const auto surfaceName = dex_test::vtableEntryOf(&DexBreakline::getSurfaceName);
  const auto lastOfPolyLine = dex_test::vtableEntryOf(&DexPolyLine::getId);
  if (!surfaceName || !lastOfPolyLine) GTEST_SKIP() << "virtual table layout not observable on this platform";
  EXPECT_GT(*surfaceName, dex_test::vtableEntryOf(&DexPolyLine::setDrawProperties).value_or(0));
  EXPECT_EQ(*lastOfPolyLine + 1, *surfaceName);
}

// ---- Code strings -------------------------------------------------------------------------------

TEST(DexPolyLine, PointsCarryingTheNameAsCodeStringMakeACodeString) {
  CodeStringFixture fixture;
  for (DexDesignPoint& point : fixture.points)
    addCode(point, &fixture.fence, {L"A1"});
  EXPECT_TRUE(fixture.line.isCodeString());
}

TEST(DexPolyLine, AMiddlePointWithAnotherCodeStringBreaksTheCodeString) {
  CodeStringFixture fixture;
  addCode(fixture.points[0], &fixture.fence, {L"A1"});
  addCode(fixture.points[1], &fixture.fence, {L"A2"});
  addCode(fixture.points[2], &fixture.fence, {L"A1"});
  EXPECT_FALSE(fixture.line.isCodeString());
}

TEST(DexPolyLine, AnyCodeOfAPointMayCarryTheCodeString) {
  CodeStringFixture fixture;
  const DexCodeDescription tree(L"TREE");
  for (DexDesignPoint& point : fixture.points) {
    addCode(point, &tree, {L"X"});
    addCode(point, &fixture.fence, {L"B", L"A1"});
  }
  EXPECT_TRUE(fixture.line.isCodeString());
}

TEST(DexPolyLine, TheFirstPointMayCarryTheNameAsCodeNameAndStringButNotTheOthers) {
  CodeStringFixture fixture;
  fixture.line.setName(L"FENCE7");
  addCode(fixture.points[0], &fixture.fence, {L"7"});
  addCode(fixture.points[1], &fixture.fence, {L"FENCE7"});
  addCode(fixture.points[2], &fixture.fence, {L"FENCE7"});
  EXPECT_TRUE(fixture.line.isCodeString());
  fixture.points[2].removeAllCodes();
  addCode(fixture.points[2], &fixture.fence, {L"7"});
  EXPECT_FALSE(fixture.line.isCodeString());
}

TEST(DexPolyLine, CodeStringsCompareExactly) {
  CodeStringFixture fixture;
  for (DexDesignPoint& point : fixture.points)
    addCode(point, &fixture.fence, {L"a1"});
  EXPECT_FALSE(fixture.line.isCodeString());
}

TEST(DexPolyLine, APointWithoutCodesBreaksTheCodeString) {
  CodeStringFixture fixture;
  addCode(fixture.points[0], &fixture.fence, {L"A1"});
  addCode(fixture.points[2], &fixture.fence, {L"A1"});
  EXPECT_FALSE(fixture.line.isCodeString());
  CodeStringFixture firstWithout;
  addCode(firstWithout.points[1], &firstWithout.fence, {L"A1"});
  addCode(firstWithout.points[2], &firstWithout.fence, {L"A1"});
  EXPECT_FALSE(firstWithout.line.isCodeString());
}

TEST(DexPolyLine, ASinglePointCarryingTheNameIsACodeString) {
  DexDesignPoint point;
  const DexCodeDescription fence(L"FENCE");
  addCode(point, &fence, {L"A1"});
  DexPolyLine line(true);
  line.setName(L"A1");
  line.addPoint(&point, 0.0);
  EXPECT_TRUE(line.isCodeString());
}

TEST(DexPolyLine, StationModeOrNoPointsIsNoCodeString) {
  DexPolyLine stations(false);
  stations.addStation(stationAt(1.0, 0.0, 0.0));
  EXPECT_FALSE(stations.isCodeString());
  const DexPolyLine empty(true);
  EXPECT_FALSE(empty.isCodeString());
}

TEST(DexPolyLine, MissingPointsAndCodesWithoutDescriptionNeverCrashTheCodeStringTest) {
  DexDesignPoint point;
  addCode(point, nullptr, {L"A1"});
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
  EXPECT_FALSE(nullFirst.isCodeString());
}
