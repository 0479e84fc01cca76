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

using namespace vyn::ie;
using vyn::ie::detail::PositionOctree;
using Point3 = vyn_math::TAbstractPoint3<double>;
using Result = PositionOctree::InsertResult;
namespace detail = vyn::ie::detail;

const std::wstring kSource = detail::kSurfaceLogSource;
constexpr double kNaN = std::numeric_limits<double>::quiet_NaN();
constexpr double kInfinity = std::numeric_limits<double>::infinity();

// Adds the positions and checks each is found under its own index.
void expectFoundInOrder(DexSurface& surface, const std::vector<DexPosition3D>& positions) {
  const int first = surface.getNumberOfPositions();
  for (const DexPosition3D& position : positions)
    surface.addPosition(position);
  for (std::size_t i = 0; i < positions.size(); ++i)
    ASSERT_EQ(first + static_cast<int>(i), surface.getPositionIndex(positions[i])) << "position " << i;
}

// Inserts the points in order into index and checks each is found with its number.
void expectInsertedAndFound(PositionOctree& index, const std::vector<std::array<double, 3>>& points) {
  int value = 0;
  for (const auto& point : points)
    ASSERT_EQ(Result::kInserted, index.insert(point[0], point[1], point[2], value++));
  for (std::size_t i = 0; i < points.size(); ++i)
    EXPECT_EQ(static_cast<int>(i), index.find(points[i][0], points[i][1], points[i][2])) << "point " << i;
}

TEST(DexTriangle, SetsCornersOneByOneOrAllThreeIgnoringOthers) {
  DexTriangle triangle;
  EXPECT_TRUE(triangle.getPosition(DexTriangle::FIRST_POSITION) == -1 && triangle.getPosition(2) == -1 &&
              triangle.getPosition(0) == DexSurface::getEmptyIndex());
  triangle.setPosition(3, 9);
  triangle.setPosition(-1, 9);
  triangle.setPositions(nullptr);
  EXPECT_EQ(DexTriangle(), triangle);
  triangle.setPosition(DexTriangle::SECOND_POSITION, 7);
  EXPECT_TRUE(triangle.getPosition(0) == -1 && triangle.getPosition(1) == 7 && triangle.getPosition(3) == -1);
  const int corners[] = {4, 5, 6};
  triangle.setPositions(corners);
  EXPECT_TRUE(triangle.getPosition(0) == 4 && triangle.getPosition(1) == 5 && triangle.getPosition(2) == 6);
}

TEST(DexSurface, FindsPositionsExactlyUnderConsecutiveIndexes) {
  DexSurface surface;
  EXPECT_EQ(-1, surface.getPositionIndex(DexPosition3D(0, 0, 0)));
  expectFoundInOrder(surface, {{1000.0, 2000.0, 50.0},
                               {1000.5, 2000.0, 50.0},
                               {-3.25, 0.0, 0.0},
                               {0.0, 0.0, 0.0},
                               {1e-300, 0.0, 0.0},
                               {2e-300, 0.0, 0.0},
                               {-1e-12, 1e-12, 0.0},
                               {123456.789, -9876543.21, 12.5},
                               {1e15, 1e15, -1e15},
                               {-7e200, 3e150, 1.0},
                               {0.1, 0.2, 0.3},
                               {std::nextafter(0.1, 1.0), 0.2, 0.3},
                               {-0.0, 5.0, 5.0}});
  EXPECT_EQ(13, surface.getNumberOfPositions());
  // A position one part in a billion away is another position; -0.0 equals the 0.0 stored.
  EXPECT_EQ(-1, surface.getPositionIndex(DexPosition3D(1000.000001, 2000.0, 50.0)));
  EXPECT_EQ(-1, surface.getPositionIndex(DexPosition3D(1000.0, 2000.0, 50.0 + 1e-9)));
  EXPECT_EQ(3, surface.getPositionIndex(DexPosition3D(-0.0, 0.0, 0.0)));
  std::mt19937_64 random(42);
  std::uniform_real_distribution<double> coordinate(-5000.0, 5000.0);
  std::vector<DexPosition3D> many;
  for (int i = 0; i < 20000; ++i)
    many.emplace_back(coordinate(random), coordinate(random), coordinate(random) / 100.0);
  for (int i = 0; i < 500; ++i) {  // a tight cluster and a line of points one step apart
    many.emplace_back(1.0 + i * 1e-9, 1.0, 1.0);
    many.emplace_back(200.0, 300.0 + i * 0.25, 10.0);
  }
  expectFoundInOrder(surface, many);
  EXPECT_EQ(-1, surface.getPositionIndex(DexPosition3D(1e7, 0.0, 0.0)));
}

TEST(DexSurface, DuplicateNonFiniteAndFarPositionsAreStoredAndReported) {
  const dex_test::LogCapture log;
  DexSurface surface;
  for (int i = 0; i < 10000; ++i)
    ASSERT_EQ(i, surface.addPosition(DexPosition3D(12.5, -3.25, 7.0)));
  EXPECT_EQ(9999, log.count(kSource, detail::kSurfaceDuplicatePositionLine));
  EXPECT_EQ(9999u, log.size());
  EXPECT_EQ(0, surface.getPositionIndex(DexPosition3D(12.5, -3.25, 7.0)));  // the first
  EXPECT_EQ(10000, surface.addPosition(DexPosition3D(kNaN, 1.0, 1.0)));
  surface.addPosition(DexPosition3D(1.0, kInfinity, 1.0));
  surface.addPosition(DexPosition3D(1.0, 1.0, -kInfinity));
  EXPECT_EQ(3, log.count(kSource, detail::kSurfaceNonFinitePositionLine));
  EXPECT_TRUE(surface.getPositionIndex(DexPosition3D(kNaN, 1.0, 1.0)) == -1 &&
              surface.getPositionIndex(DexPosition3D(1.0, kInfinity, 1.0)) == -1);
  const double largest = std::numeric_limits<double>::max();
  EXPECT_EQ(10003, surface.addPosition(DexPosition3D(largest, 0.0, 0.0)));
  EXPECT_EQ(10004, surface.addPosition(DexPosition3D(1e300, -1e300, 7.0)));
  EXPECT_EQ(1, log.count(kSource, detail::kSurfacePositionOutOfReachLine));
  EXPECT_TRUE(surface.getPositionIndex(DexPosition3D(largest, 0.0, 0.0)) == -1 &&
              surface.getPositionIndex(DexPosition3D(1e300, -1e300, 7.0)) == 10004);
  EXPECT_EQ(10005, surface.getNumberOfPositions());
}

TEST(DexSurface, PositionsAtInvalidIndexesAreReportedAndAScratchPosition) {
  const dex_test::LogCapture log;
  DexSurface surface;
  surface.addPosition(DexPosition3D(1.5, 2.5, 3.5));
  DexPosition3D& scratch = surface.getPositionAt(5);
  EXPECT_EQ(DexPosition3D(0, 0, 0), scratch);
  scratch.x = 99.0;
  EXPECT_EQ(DexPosition3D(0, 0, 0), surface.getPositionAt(-1));
  EXPECT_EQ(DexPosition3D(0, 0, 0), std::as_const(surface).getPositionAt(1));
  EXPECT_EQ(DexPosition3D(1.5, 2.5, 3.5), surface.getPositionAt(0));
  EXPECT_EQ(3, log.count(kSource, detail::kSurfacePositionIndexLine));
  Point3 point(9, 9, 9);
  EXPECT_FALSE(surface.getCoords(1, point) || surface.getCoords(-1, point));
  EXPECT_EQ(Point3(9, 9, 9), point);
  EXPECT_TRUE(surface.getCoords(0, point) && point == Point3(1.5, 2.5, 3.5));
  EXPECT_TRUE(surface.isEqual(0, Point3(1.5, 2.5, 3.5)));
  EXPECT_FALSE(surface.isEqual(0, Point3(1.5, 2.5, 3.5000001)) || surface.isEqual(1, Point3(0, 0, 0)));
}

TEST(DexSurface, ResizingOrChangingInPlaceNeverAnswersAStaleIndex) {
  DexSurface surface;
  expectFoundInOrder(surface, {{1, 1, 1}, {2, 2, 2}, {3, 3, 3}});
  surface.setNumberOfPositions(1);
  EXPECT_TRUE(surface.getNumberOfPositions() == 1 && surface.getPositionIndex(DexPosition3D(1, 1, 1)) == 0 &&
              surface.getPositionIndex(DexPosition3D(3, 3, 3)) == -1);
  // Index 1 is used again by another position; the one cut off is not found under it.
  EXPECT_EQ(1, surface.addPosition(DexPosition3D(4, 4, 4)));
  EXPECT_TRUE(surface.getPositionIndex(DexPosition3D(2, 2, 2)) == -1 &&
              surface.getPositionIndex(DexPosition3D(4, 4, 4)) == 1);
  surface.setNumberOfPositions(4);
  EXPECT_TRUE(surface.getPositionAt(3) == DexPosition3D(0, 0, 0) &&
              surface.getPositionIndex(DexPosition3D(0, 0, 0)) == -1);
  surface.getPositionAt(0).z = 7.0;
  EXPECT_TRUE(surface.getPositionIndex(DexPosition3D(1, 1, 1)) == -1 &&
              surface.getPositionIndex(DexPosition3D(1, 1, 7)) == -1);
  surface.setNumberOfPositions(-5);
  EXPECT_EQ(0, surface.getNumberOfPositions());
}

TEST(DexSurface, OwnsTrianglesAndPropertiesSharesBreaklinesAndCopies) {
  int deletions = 0;
  DexBreakline breakline(L"GROUND");
  auto* const triangle = new DexTriangle();
  auto* const first = new objects_test::Counted<DexDrawLineProperties>(deletions);
  {
    DexSurface surface;
    surface.setName(L"S");
    surface.reserveTriangles(2);
    surface.addTriangle(triangle);
    surface.addTriangle(nullptr);
    surface.addBreakline(&breakline);
    surface.addBreakline(nullptr);
    surface.addPosition(DexPosition3D(1, 2, 3));
    EXPECT_TRUE(surface.getNumberOfTriangles() == 1 && surface.getTriangleAt(0) == triangle &&
                surface.getTriangleAt(1) == nullptr && std::as_const(surface).getTriangleAt(-1) == nullptr);
    EXPECT_TRUE(surface.getNumberOfBreaklines() == 1 && surface.getBreaklineAt(0) == &breakline &&
                surface.getBreaklineAt(1) == nullptr);
    surface.setDrawProperties(first);
    surface.setDrawProperties(first);
    EXPECT_EQ(0, deletions);
    surface.setDrawProperties(objects_test::linePropertiesOf(0xFF));
    EXPECT_EQ(1, deletions);
    DexSurface copy(surface);
    DexSurface assigned;
    assigned = surface;
    EXPECT_TRUE(copy.getName() == L"S" && copy.getPositionIndex(DexPosition3D(1, 2, 3)) == 0 &&
                assigned.getPositionIndex(DexPosition3D(1, 2, 3)) == 0 &&
                assigned.getNumberOfTriangles() == 1);
    EXPECT_EQ(1, copy.addPosition(DexPosition3D(4, 5, 6)));
    EXPECT_EQ(-1, surface.getPositionIndex(DexPosition3D(4, 5, 6)));
    EXPECT_TRUE(copy.getTriangleAt(0) != triangle && copy.getBreaklineAt(0) == &breakline &&
                copy.getDrawProperties() != surface.getDrawProperties());
    EXPECT_EQ(0xFFu, objects_test::colorOf(copy.getDrawProperties()));
    surface.setDrawProperties(new objects_test::Counted<DexDrawLineProperties>(deletions));
  }
  EXPECT_EQ(2, deletions);
  breakline.setName(L"B1");  // deleting the surface left it alive
  EXPECT_EQ(L"B1", breakline.getName());
}

TEST(PositionOctree, ReportsABadCapacityAndSaysWhyItRefusesAPoint) {
  const dex_test::LogCapture log;
  EXPECT_TRUE(PositionOctree(0).capacity() == PositionOctree::kDefaultCapacity &&
              PositionOctree(-3).capacity() == PositionOctree::kDefaultCapacity);
  EXPECT_EQ(2, log.count(kSource, detail::kSurfaceIndexCapacityLine));
  EXPECT_EQ(2u, log.size());
  PositionOctree empty;  // refused first points leave the index empty
  EXPECT_TRUE(empty.find(0, 0, 0) == -1 && empty.depth() == 0);
  EXPECT_EQ(Result::kNotFinite, empty.insert(kInfinity, 0, 0, 0));
  EXPECT_EQ(Result::kOutOfReach, empty.insert(-0x1p1023, 0, 0, 1));
  EXPECT_TRUE(empty.isEmpty() && empty.depth() == 0);
  EXPECT_EQ(Result::kInserted, empty.insert(0x1p1022, -0x1p1022, 0, 2));
  EXPECT_EQ(2, empty.find(0x1p1022, -0x1p1022, 0));
  PositionOctree index(16);
  EXPECT_EQ(Result::kInserted, index.insert(1, 2, 3, 0));
  EXPECT_EQ(Result::kDuplicate, index.insert(1, 2, 3, 1));
  EXPECT_EQ(Result::kNotFinite, index.insert(kNaN, 2, 3, 2));
  EXPECT_EQ(Result::kOutOfReach, index.insert(0x1p1023, 0, 0, 3));
  EXPECT_TRUE(index.size() == 1u && index.find(1, 2, 3) == 0 && index.find(1e9, 0, 0) == -1 &&
              index.find(kNaN, kNaN, kNaN) == -1);
}

TEST(PositionOctree, LeavesSplitAndTheRootGrowsWithoutLosingPoints) {
  EXPECT_EQ(16, DexSurface::kPositionIndexCapacity);  // surface leaves split on the seventeenth point
  PositionOctree index(DexSurface::kPositionIndexCapacity);
  std::vector<std::array<double, 3>> points;
  for (int i = 0; i < 16; ++i)
    points.push_back({i / 32.0, 0.5, 0.5});
  expectInsertedAndFound(index, points);
  EXPECT_EQ(1, index.depth());
  ASSERT_EQ(Result::kInserted, index.insert(-0.5, -0.5, -0.5, 16));
  EXPECT_TRUE(index.depth() == 2 && index.find(-0.5, -0.5, -0.5) == 16 &&
              index.find(15 / 32.0, 0.5, 0.5) == 15);
  PositionOctree borders;  // points on the borders of the root are held after it grows
  expectInsertedAndFound(borders, {{0.5, 0.5, 0.5},
                                   {1.0, 0.0, 0.0},
                                   {-2.0, -2.0, -2.0},
                                   {2.0, 2.0, 2.0},
                                   {-4.0, 4.0, 0.0},
                                   {0.0, -1.0, 1.0}});
  EXPECT_TRUE(borders.find(8.0, 8.0, 8.0) == -1 && borders.find(-0.5, -0.5, -0.5) == -1);
  PositionOctree far(2);
  points.clear();
  for (double scale = 1e-3; scale < 1e300; scale *= 1e7) {
    points.push_back({scale, -scale, scale / 3});
    points.push_back({-scale, scale / 7, -scale});
  }
  expectInsertedAndFound(far, points);
  PositionOctree steps(1);  // points one step apart end in a leaf that no longer splits
  double x = 1e6;
  for (int i = 0; i < 40; ++i) {
    ASSERT_EQ(Result::kInserted, steps.insert(x, 1e6, 1e6, i));
    x = std::nextafter(x, 2e6);
  }
  EXPECT_TRUE(steps.size() == 40u && steps.depth() < 80);
  EXPECT_EQ(39, steps.find(std::nextafter(x, 0.0), 1e6, 1e6));
}

}  // namespace
