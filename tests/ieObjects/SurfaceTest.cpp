#include "ieObjects/IESurface.h"

#include <gtest/gtest.h>

#include <array>
#include <cmath>
#include <limits>
#include <random>
#include <string>
#include <utility>
#include <vector>

#include "ObjectsTestHelpers.h"
#include "ieObjects/IEPolyLines.h"
#include "ieObjects/detail/PositionOctree.h"
#include "ieObjects/detail/SurfaceLog.h"
#include "support/LogCapture.h"

namespace {

using objects_test::CountedLineProperties;
using vyn::ie::DexBreakline;
using vyn::ie::DexDrawLineProperties;
using vyn::ie::DexPosition3D;
using vyn::ie::DexSurface;
using vyn::ie::DexTriangle;
using vyn::ie::detail::PositionOctree;
using Point3 = vyn_math::TAbstractPoint3<double>;
namespace detail = vyn::ie::detail;

const std::wstring kSource = detail::kSurfaceLogSource;
constexpr double kNaN = std::numeric_limits<double>::quiet_NaN();
constexpr double kInfinity = std::numeric_limits<double>::infinity();

// ---- DexTriangle --------------------------------------------------------------------------------

TEST(DexTriangle, NewTriangleHasNoCorners) {
  const DexTriangle triangle;
  EXPECT_EQ(-1, triangle.getPosition(DexTriangle::FIRST_POSITION));
  EXPECT_EQ(-1, triangle.getPosition(DexTriangle::SECOND_POSITION));
  EXPECT_EQ(-1, triangle.getPosition(DexTriangle::THIRD_POSITION));
  EXPECT_EQ(DexSurface::getEmptyIndex(), triangle.getPosition(0));
}

TEST(DexTriangle, SetsCornersOneByOneOrAllThree) {
  DexTriangle triangle;
  triangle.setPosition(DexTriangle::SECOND_POSITION, 7);
  EXPECT_EQ(-1, triangle.getPosition(0));
  EXPECT_EQ(7, triangle.getPosition(1));

  const int corners[] = {4, 5, 6};
  triangle.setPositions(corners);
  EXPECT_EQ(4, triangle.getPosition(0));
  EXPECT_EQ(5, triangle.getPosition(1));
  EXPECT_EQ(6, triangle.getPosition(2));
}

TEST(DexTriangle, IgnoresCornersOutsideTheThreeAndNullArrays) {
  DexTriangle triangle;
  triangle.setPosition(3, 9);
  triangle.setPosition(-1, 9);
  triangle.setPositions(nullptr);
  EXPECT_EQ(DexTriangle(), triangle);
  EXPECT_EQ(-1, triangle.getPosition(3));
  EXPECT_EQ(-1, triangle.getPosition(-1));
}

// ---- Positions and their index ------------------------------------------------------------------

TEST(DexSurface, SurfaceWithoutPositionsFindsNothing) {
  const DexSurface surface;
  EXPECT_EQ(0, surface.getNumberOfPositions());
  EXPECT_EQ(-1, surface.getPositionIndex(DexPosition3D(0, 0, 0)));
  EXPECT_EQ(-1, surface.getPositionIndex(DexPosition3D(1, 2, 3)));
}

TEST(DexSurface, AddPositionAnswersConsecutiveIndexesAndFindsThemExactly) {
  DexSurface surface;
  EXPECT_EQ(0, surface.addPosition(DexPosition3D(1000.0, 2000.0, 50.0)));
  EXPECT_EQ(1, surface.addPosition(DexPosition3D(1000.5, 2000.0, 50.0)));
  EXPECT_EQ(2, surface.addPosition(DexPosition3D(-3.25, 0.0, 0.0)));
  EXPECT_EQ(3, surface.getNumberOfPositions());

  EXPECT_EQ(0, surface.getPositionIndex(DexPosition3D(1000.0, 2000.0, 50.0)));
  EXPECT_EQ(1, surface.getPositionIndex(DexPosition3D(1000.5, 2000.0, 50.0)));
  EXPECT_EQ(2, surface.getPositionIndex(DexPosition3D(-3.25, 0.0, 0.0)));
  // Exact lookup: a position one part in a billion away is another position.
  EXPECT_EQ(-1, surface.getPositionIndex(DexPosition3D(1000.000001, 2000.0, 50.0)));
  EXPECT_EQ(-1, surface.getPositionIndex(DexPosition3D(1000.0, 2000.0, 50.0 + 1e-9)));
}

TEST(DexSurface, SamePositionTwiceGivesTwoIndexesOneReportAndFindsTheFirst) {
  const dex_test::LogCapture log;
  DexSurface surface;
  surface.addPosition(DexPosition3D(5, 5, 5));
  EXPECT_EQ(1, surface.addPosition(DexPosition3D(1, 2, 3)));
  EXPECT_EQ(2, surface.addPosition(DexPosition3D(1, 2, 3)));

  EXPECT_EQ(3, surface.getNumberOfPositions());
  EXPECT_EQ(1, log.count(kSource, detail::kSurfaceDuplicatePositionLine));
  EXPECT_EQ(1u, log.size());
  EXPECT_EQ(1, surface.getPositionIndex(DexPosition3D(1, 2, 3)));
}

TEST(DexSurface, NonFinitePositionsAreStoredAndReportedButNotIndexed) {
  const dex_test::LogCapture log;
  DexSurface surface;
  EXPECT_EQ(0, surface.addPosition(DexPosition3D(kNaN, 1.0, 1.0)));
  EXPECT_EQ(1, surface.addPosition(DexPosition3D(1.0, kInfinity, 1.0)));
  EXPECT_EQ(2, surface.addPosition(DexPosition3D(1.0, 1.0, -kInfinity)));
  EXPECT_EQ(3, surface.addPosition(DexPosition3D(1.0, 1.0, 1.0)));

  EXPECT_EQ(3, log.count(kSource, detail::kSurfaceNonFinitePositionLine));
  EXPECT_EQ(4, surface.getNumberOfPositions());
  EXPECT_EQ(-1, surface.getPositionIndex(DexPosition3D(kNaN, 1.0, 1.0)));
  EXPECT_EQ(-1, surface.getPositionIndex(DexPosition3D(1.0, kInfinity, 1.0)));
  EXPECT_EQ(3, surface.getPositionIndex(DexPosition3D(1.0, 1.0, 1.0)));
}

TEST(DexSurface, CoordinatesBeyondEveryIndexBoxAreStoredAndReported) {
  const dex_test::LogCapture log;
  DexSurface surface;
  surface.addPosition(DexPosition3D(-1.0, 0.0, 0.0));
  const double largest = std::numeric_limits<double>::max();
  EXPECT_EQ(1, surface.addPosition(DexPosition3D(largest, 0.0, 0.0)));
  EXPECT_EQ(2, surface.addPosition(DexPosition3D(1e300, -1e300, 7.0)));

  EXPECT_EQ(1, log.count(kSource, detail::kSurfacePositionOutOfReachLine));
  EXPECT_EQ(-1, surface.getPositionIndex(DexPosition3D(largest, 0.0, 0.0)));
  EXPECT_EQ(2, surface.getPositionIndex(DexPosition3D(1e300, -1e300, 7.0)));
  EXPECT_EQ(0, surface.getPositionIndex(DexPosition3D(-1.0, 0.0, 0.0)));
}

TEST(DexSurface, FindsPositionsOfEveryScaleAndSign) {
  DexSurface surface;
  const std::vector<DexPosition3D> positions = {{0.0, 0.0, 0.0},
                                                {1e-300, 0.0, 0.0},
                                                {2e-300, 0.0, 0.0},
                                                {-1e-12, 1e-12, 0.0},
                                                {123456.789, -9876543.21, 12.5},
                                                {1e15, 1e15, -1e15},
                                                {-7e200, 3e150, 1.0},
                                                {0.1, 0.2, 0.3},
                                                {std::nextafter(0.1, 1.0), 0.2, 0.3},
                                                {-0.0, 5.0, 5.0}};
  for (const DexPosition3D& position : positions)
    surface.addPosition(position);
  for (int i = 0; i < static_cast<int>(positions.size()); ++i)
    EXPECT_EQ(i, surface.getPositionIndex(positions[static_cast<std::size_t>(i)])) << "position " << i;
  // -0.0 equals the 0.0 stored first.
  EXPECT_EQ(0, surface.getPositionIndex(DexPosition3D(-0.0, 0.0, 0.0)));
}

TEST(DexSurface, FindsEveryOneOfManyPositions) {
  DexSurface surface;
  std::mt19937_64 random(42);
  std::uniform_real_distribution<double> coordinate(-5000.0, 5000.0);
  std::vector<DexPosition3D> positions;
  for (int i = 0; i < 20000; ++i)
    positions.emplace_back(coordinate(random), coordinate(random), coordinate(random) / 100.0);
  // A tight cluster and a line of points one step apart.
  for (int i = 0; i < 500; ++i) {
    positions.emplace_back(1.0 + i * 1e-9, 1.0, 1.0);
    positions.emplace_back(200.0, 300.0 + i * 0.25, 10.0);
  }
  for (const DexPosition3D& position : positions)
    surface.addPosition(position);
  for (std::size_t i = 0; i < positions.size(); ++i)
    ASSERT_EQ(static_cast<int>(i), surface.getPositionIndex(positions[i])) << "position " << i;
  EXPECT_EQ(-1, surface.getPositionIndex(DexPosition3D(1e7, 0.0, 0.0)));
}

TEST(DexSurface, PositionAtAnInvalidIndexIsReportedAndAScratchPosition) {
  const dex_test::LogCapture log;
  DexSurface surface;
  surface.addPosition(DexPosition3D(1, 2, 3));

  DexPosition3D& scratch = surface.getPositionAt(5);
  EXPECT_EQ(DexPosition3D(0, 0, 0), scratch);
  scratch.x = 99.0;
  EXPECT_EQ(DexPosition3D(0, 0, 0), surface.getPositionAt(-1));
  const DexSurface& constSurface = surface;
  EXPECT_EQ(DexPosition3D(0, 0, 0), constSurface.getPositionAt(1));
  EXPECT_EQ(3, log.count(kSource, detail::kSurfacePositionIndexLine));

  EXPECT_EQ(DexPosition3D(1, 2, 3), surface.getPositionAt(0));
  EXPECT_EQ(3, log.count(kSource, detail::kSurfacePositionIndexLine));
}

TEST(DexSurface, CoordsAndEqualityOfAnIndex) {
  DexSurface surface;
  surface.addPosition(DexPosition3D(1.5, 2.5, 3.5));
  Point3 point(9, 9, 9);
  EXPECT_FALSE(surface.getCoords(1, point));
  EXPECT_FALSE(surface.getCoords(-1, point));
  EXPECT_EQ(Point3(9, 9, 9), point);
  EXPECT_TRUE(surface.getCoords(0, point));
  EXPECT_EQ(Point3(1.5, 2.5, 3.5), point);

  EXPECT_TRUE(surface.isEqual(0, Point3(1.5, 2.5, 3.5)));
  EXPECT_FALSE(surface.isEqual(0, Point3(1.5, 2.5, 3.5000001)));
  EXPECT_FALSE(surface.isEqual(1, Point3(0, 0, 0)));
}

TEST(DexSurface, ResizingKeepsTheIndexButNeverAnswersAStaleIndex) {
  DexSurface surface;
  surface.addPosition(DexPosition3D(1, 1, 1));
  surface.addPosition(DexPosition3D(2, 2, 2));
  surface.addPosition(DexPosition3D(3, 3, 3));

  surface.setNumberOfPositions(1);
  EXPECT_EQ(1, surface.getNumberOfPositions());
  EXPECT_EQ(0, surface.getPositionIndex(DexPosition3D(1, 1, 1)));
  EXPECT_EQ(-1, surface.getPositionIndex(DexPosition3D(3, 3, 3)));

  // Index 1 is used again by another position; the one cut off is not found under it.
  EXPECT_EQ(1, surface.addPosition(DexPosition3D(4, 4, 4)));
  EXPECT_EQ(-1, surface.getPositionIndex(DexPosition3D(2, 2, 2)));
  EXPECT_EQ(1, surface.getPositionIndex(DexPosition3D(4, 4, 4)));

  surface.setNumberOfPositions(4);
  EXPECT_EQ(DexPosition3D(0, 0, 0), surface.getPositionAt(3));
  EXPECT_EQ(-1, surface.getPositionIndex(DexPosition3D(0, 0, 0)));
  surface.setNumberOfPositions(-5);
  EXPECT_EQ(0, surface.getNumberOfPositions());
}

TEST(DexSurface, PositionChangedInPlaceIsNoLongerFoundUnderItsOldCoordinates) {
  DexSurface surface;
  surface.addPosition(DexPosition3D(1, 1, 1));
  surface.getPositionAt(0).z = 7.0;
  EXPECT_EQ(-1, surface.getPositionIndex(DexPosition3D(1, 1, 1)));
  EXPECT_EQ(-1, surface.getPositionIndex(DexPosition3D(1, 1, 7)));
}

// ---- Triangles, breaklines and properties -------------------------------------------------------

TEST(DexSurface, OwnsItsTrianglesAndAnswersNullOutsideTheList) {
  DexSurface surface;
  surface.reserveTriangles(2);
  auto* const triangle = new DexTriangle();
  surface.addTriangle(triangle);
  surface.addTriangle(nullptr);
  EXPECT_EQ(1, surface.getNumberOfTriangles());
  EXPECT_EQ(triangle, surface.getTriangleAt(0));
  EXPECT_EQ(nullptr, surface.getTriangleAt(1));
  EXPECT_EQ(nullptr, std::as_const(surface).getTriangleAt(-1));
}

TEST(DexSurface, DeletingASurfaceLeavesItsBreaklinesAlive) {
  DexBreakline breakline(L"GROUND");
  breakline.setName(L"B1");
  {
    DexSurface surface;
    surface.addBreakline(&breakline);
    surface.addBreakline(nullptr);
    EXPECT_EQ(1, surface.getNumberOfBreaklines());
    EXPECT_EQ(&breakline, surface.getBreaklineAt(0));
    EXPECT_EQ(nullptr, surface.getBreaklineAt(1));
  }
  EXPECT_EQ(L"B1", breakline.getName());
}

TEST(DexSurface, ReplacingDrawPropertiesDeletesTheOldOnesOnce) {
  int deletions = 0;
  auto* const first = new CountedLineProperties(deletions);
  {
    DexSurface surface;
    surface.setDrawProperties(first);
    surface.setDrawProperties(first);
    EXPECT_EQ(0, deletions);
    surface.setDrawProperties(new DexDrawLineProperties());
    EXPECT_EQ(1, deletions);
    surface.setDrawProperties(new CountedLineProperties(deletions));
  }
  EXPECT_EQ(2, deletions);
}

TEST(DexSurface, CopyDuplicatesWhatItOwnsAndSharesBreaklinesAndLayer) {
  DexBreakline breakline(L"S");
  DexSurface surface;
  surface.setName(L"S");
  surface.addPosition(DexPosition3D(1, 2, 3));
  surface.addTriangle(new DexTriangle());
  surface.addBreakline(&breakline);
  surface.setDrawProperties(objects_test::linePropertiesOf(0xFF));

  DexSurface copy(surface);
  EXPECT_EQ(L"S", copy.getName());
  EXPECT_EQ(0, copy.getPositionIndex(DexPosition3D(1, 2, 3)));
  EXPECT_EQ(1, copy.addPosition(DexPosition3D(4, 5, 6)));
  EXPECT_EQ(-1, surface.getPositionIndex(DexPosition3D(4, 5, 6)));
  EXPECT_NE(surface.getTriangleAt(0), copy.getTriangleAt(0));
  EXPECT_EQ(&breakline, copy.getBreaklineAt(0));
  ASSERT_NE(nullptr, copy.getDrawProperties());
  EXPECT_NE(surface.getDrawProperties(), copy.getDrawProperties());
  EXPECT_EQ(0xFFu, objects_test::colorOf(copy.getDrawProperties()));

  DexSurface assigned;
  assigned = surface;
  EXPECT_EQ(0, assigned.getPositionIndex(DexPosition3D(1, 2, 3)));
  EXPECT_EQ(1, assigned.getNumberOfTriangles());
}

// ---- The position index itself ------------------------------------------------------------------

TEST(PositionOctree, CapacityOfZeroOrLessIsReportedAndReplaced) {
  const dex_test::LogCapture log;
  const PositionOctree zero(0);
  const PositionOctree negative(-3);
  EXPECT_EQ(2, log.count(kSource, detail::kSurfaceIndexCapacityLine));
  EXPECT_EQ(PositionOctree::kDefaultCapacity, zero.capacity());
  EXPECT_EQ(PositionOctree::kDefaultCapacity, negative.capacity());
  EXPECT_EQ(2u, log.size());
}

TEST(PositionOctree, SaysWhyItRefusesAPoint) {
  PositionOctree index(16);
  EXPECT_EQ(PositionOctree::InsertResult::kInserted, index.insert(1, 2, 3, 0));
  EXPECT_EQ(PositionOctree::InsertResult::kDuplicate, index.insert(1, 2, 3, 1));
  EXPECT_EQ(PositionOctree::InsertResult::kNotFinite, index.insert(kNaN, 2, 3, 2));
  EXPECT_EQ(PositionOctree::InsertResult::kOutOfReach, index.insert(0x1p1023, 0, 0, 3));
  EXPECT_EQ(1u, index.size());
  EXPECT_EQ(0, index.find(1, 2, 3));
}

TEST(PositionOctree, RootGrowsToHoldFarPointsWithoutLosingNearOnes) {
  PositionOctree index(2);
  int value = 0;
  std::vector<std::array<double, 3>> points;
  for (double scale = 1e-3; scale < 1e300; scale *= 1e7) {
    points.push_back({scale, -scale, scale / 3});
    points.push_back({-scale, scale / 7, -scale});
  }
  for (const auto& point : points)
    ASSERT_EQ(PositionOctree::InsertResult::kInserted, index.insert(point[0], point[1], point[2], value++));
  for (std::size_t i = 0; i < points.size(); ++i)
    EXPECT_EQ(static_cast<int>(i), index.find(points[i][0], points[i][1], points[i][2]));
}

TEST(PositionOctree, PointsOneStepApartEndInALeafThatNoLongerSplits) {
  PositionOctree index(1);
  double x = 1e6;
  for (int i = 0; i < 40; ++i) {
    ASSERT_EQ(PositionOctree::InsertResult::kInserted, index.insert(x, 1e6, 1e6, i));
    x = std::nextafter(x, 2e6);
  }
  EXPECT_EQ(40u, index.size());
  EXPECT_LT(index.depth(), 80);
  EXPECT_EQ(39, index.find(x = std::nextafter(x, 0.0), 1e6, 1e6));
}

TEST(PositionOctree, EmptyIndexAndPointsOutsideTheRootFindNothing) {
  PositionOctree index;
  EXPECT_EQ(-1, index.find(0, 0, 0));
  EXPECT_EQ(0, index.depth());
  index.insert(0.5, 0.5, 0.5, 7);
  EXPECT_EQ(-1, index.find(1e9, 0, 0));
  EXPECT_EQ(-1, index.find(kNaN, kNaN, kNaN));
  EXPECT_EQ(7, index.find(0.5, 0.5, 0.5));
}

}  // namespace
