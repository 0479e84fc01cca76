#include "ieObjects/IECoords.h"

#include <gtest/gtest.h>

#include <cmath>
#include <memory>
#include <numbers>
#include <utility>

#include "support/VtableSlot.h"

namespace {

using vyn::ie::DexNamedPosition2D;
using vyn::ie::DexPosition2D;
using vyn::ie::DexPosition3D;
using vyn::ie::DexPositionWithBulge;
using vyn::ie::kNoHeight;
using vyn::ie::kNoValue;

// Answers fixed flags; counts its destruction so that deletion through the interface is visible.
class FixedCoordInfo : public ICoordInfo {
 public:
  FixedCoordInfo(bool horizontal, bool height, int& deletions)
      : horizontal_(horizontal), height_(height), deletions_(deletions) {}
  ~FixedCoordInfo() override { ++deletions_; }
  bool isHorizCoordsDefined() const override { return horizontal_; }
  bool isHeightDefined() const override { return height_; }

 private:
  bool horizontal_;
  bool height_;
  int& deletions_;
};

// Records the arguments of the shift and leaves the coordinates alone.
class RecordingPosition : public DexPosition3D {
 public:
  void shiftValues(const DexPosition3D& origin, double scaleX, double, double, double rotation) override {
    lastOrigin = origin;
    lastScaleX = scaleX;
    lastRotation = rotation;
  }

  DexPosition3D lastOrigin;
  double lastScaleX = 0.0;
  double lastRotation = 0.0;
};

void expectPosition(const DexPosition3D& position, double x, double y, double z) {
  EXPECT_DOUBLE_EQ(position.getX(), x);
  EXPECT_DOUBLE_EQ(position.getY(), y);
  EXPECT_DOUBLE_EQ(position.getZ(), z);
}

}  // namespace

// ---- No-value markers ---------------------------------------------------------------------------

TEST(NoValueMarkers, AreTheLargestDoubleAndTheSmallestNormalDouble) {
  EXPECT_EQ(kNoValue, 1.7976931348623157e308);
  EXPECT_EQ(kNoHeight, 2.2250738585072014e-308);
}

// ---- ICoordInfo ---------------------------------------------------------------------------------

TEST(ICoordInfo, ItsTwoQueriesPrecedeTheDestructorInTheTable) {
  const auto horizontal = dex_test::vtableEntryOf(&ICoordInfo::isHorizCoordsDefined);
  const auto height = dex_test::vtableEntryOf(&ICoordInfo::isHeightDefined);
  if (!horizontal || !height) GTEST_SKIP() << "virtual table layout not observable on this platform";
  EXPECT_EQ(*horizontal, 0);
  EXPECT_EQ(*height, 1);
}

TEST(ICoordInfo, ObjectsAreQueriedAndDeletedThroughTheInterface) {
  int deletions = 0;
  std::unique_ptr<ICoordInfo> info = std::make_unique<FixedCoordInfo>(true, false, deletions);
  EXPECT_TRUE(info->isHorizCoordsDefined());
  EXPECT_FALSE(info->isHeightDefined());
  info.reset();
  EXPECT_EQ(deletions, 1);
}

// ---- DexPosition2D ------------------------------------------------------------------------------

TEST(DexPosition2D, StartsAtTheOriginWhichIsNotDefined) {
  const DexPosition2D position;
  EXPECT_EQ(position.getX(), 0.0);
  EXPECT_EQ(position.getY(), 0.0);
  EXPECT_FALSE(position.isDefined());
}

TEST(DexPosition2D, IsDefinedUnlessBothCoordinatesAreExactlyZero) {
  EXPECT_TRUE(DexPosition2D(0.0, 5.0).isDefined());
  EXPECT_TRUE(DexPosition2D(5.0, 0.0).isDefined());
  EXPECT_TRUE(DexPosition2D(1e-300, 0.0).isDefined());
  EXPECT_FALSE(DexPosition2D(-0.0, 0.0).isDefined());
}

TEST(DexPosition2D, CoordinatesAreReachedInTheOrderXY) {
  DexPosition2D position(3.0, 4.0);
  const double* coordinates = std::as_const(position).getCoordinates();
  EXPECT_EQ(coordinates[0], 3.0);
  EXPECT_EQ(coordinates[1], 4.0);
  position.getCoordinates()[1] = 7.0;
  EXPECT_EQ(position.getY(), 7.0);
  position.setX(-1.0);
  EXPECT_EQ(position.getCoordinates()[0], -1.0);
}

TEST(DexPosition2D, CoordinatesMatchStrictlyWithinAThousandth) {
  EXPECT_EQ(DexPosition2D(0.0, 5.0), DexPosition2D(0.0009, 5.0));
  EXPECT_EQ(DexPosition2D(0.0, 5.0), DexPosition2D(-0.0009, 5.0));
  EXPECT_NE(DexPosition2D(0.0, 5.0), DexPosition2D(0.001, 5.0));
  EXPECT_NE(DexPosition2D(0.0, 5.0), DexPosition2D(-0.001, 5.0));
  EXPECT_EQ(DexPosition2D(5.0, 0.0), DexPosition2D(5.0, 0.0009));
  EXPECT_NE(DexPosition2D(5.0, 0.0), DexPosition2D(5.0, 0.001));
  EXPECT_FALSE(DexPosition2D(0.0, 0.0) != DexPosition2D(0.0009, -0.0009));
}

TEST(DexPosition2D, ScalingMultipliesBothCoordinates) {
  DexPosition2D position(1.5, -2.0);
  position *= 2.0;
  EXPECT_EQ(position.getX(), 3.0);
  EXPECT_EQ(position.getY(), -4.0);
}

// ---- DexPosition3D ------------------------------------------------------------------------------

TEST(DexPosition3D, StartsAtTheOriginAndResetReturnsThere) {
  DexPosition3D position;
  expectPosition(position, 0.0, 0.0, 0.0);
  position = DexPosition3D(1.0, 2.0, 3.0);
  position.reset();
  expectPosition(position, 0.0, 0.0, 0.0);
}

TEST(DexPosition3D, IndexGivesXYZAndAnIndexPastTheEndGivesZ) {
  DexPosition3D position(1.0, 2.0, 3.0);
  EXPECT_EQ(position[0], 1.0);
  EXPECT_EQ(position[1], 2.0);
  EXPECT_EQ(position[2], 3.0);
  EXPECT_EQ(std::as_const(position)[3], 3.0);
  EXPECT_EQ(std::as_const(position)[4000000000u], 3.0);
  position[1] = 9.0;
  EXPECT_EQ(position.getY(), 9.0);
  position.setZ(4.0);
  EXPECT_EQ(position.getCoordinates()[2], 4.0);
  const double* coordinates = std::as_const(position).getCoordinates();
  EXPECT_EQ(coordinates[0], 1.0);
  EXPECT_EQ(coordinates[1], 9.0);
}

TEST(DexPosition3D, OriginAndNoHeightMarkerAreNotDefined) {
  EXPECT_FALSE(DexPosition3D(0.0, 0.0, 0.0).isDefined());
  EXPECT_FALSE(DexPosition3D(1.0, 2.0, kNoHeight).isDefined());
  EXPECT_FALSE(DexPosition3D(0.0, 0.0, kNoHeight).isDefined());
  EXPECT_TRUE(DexPosition3D(0.0, 0.0, 5.0).isDefined());
  EXPECT_TRUE(DexPosition3D(1.0, 0.0, 0.0).isDefined());
  EXPECT_TRUE(DexPosition3D(1.0, 2.0, kNoValue).isDefined());  // only the height marker counts
}

TEST(DexPosition3D, EqualityMatchesEachCoordinateStrictlyWithin1e12) {
  const DexPosition3D origin(0.0, 0.0, 0.0);
  EXPECT_EQ(origin, DexPosition3D(0.9e-12, 0.0, 0.0));
  EXPECT_EQ(origin, DexPosition3D(0.0, -0.9e-12, 0.9e-12));
  EXPECT_NE(origin, DexPosition3D(1e-12, 0.0, 0.0));
  EXPECT_NE(origin, DexPosition3D(0.0, 1e-12, 0.0));
  EXPECT_NE(origin, DexPosition3D(0.0, 0.0, -1e-12));
  EXPECT_FALSE(origin != DexPosition3D(0.5e-12, 0.5e-12, 0.5e-12));
}

TEST(DexPosition3D, CompareWithPrecisionUsesTheGivenStrictTolerance) {
  const DexPosition3D position(10.0, 20.0, 30.0);
  EXPECT_TRUE(position.compareWithPrecision(DexPosition3D(10.25, 20.0, 30.0), 0.5));
  EXPECT_FALSE(position.compareWithPrecision(DexPosition3D(10.5, 20.0, 30.0), 0.5));
  EXPECT_FALSE(position.compareWithPrecision(DexPosition3D(10.0, 19.5, 30.0), 0.5));
  EXPECT_FALSE(position.compareWithPrecision(DexPosition3D(10.0, 20.0, 30.5), 0.5));
  EXPECT_TRUE(position.compareWithPrecision(DexPosition3D(10.0, 20.0, 30.00005), 0.0001));
}

TEST(DexPosition3D, CompareWithPrecisionOfZeroMatchesNotEvenItself) {
  const DexPosition3D position(1.0, 2.0, 3.0);
  EXPECT_FALSE(position.compareWithPrecision(position, 0.0));
  EXPECT_FALSE(position.compareWithPrecision(position, -1.0));
}

TEST(DexPosition3D, OrderIsLexicographicOnCoordinatesOutsideATenThousandth) {
  EXPECT_TRUE(DexPosition3D(1.0, 9.0, 9.0) < DexPosition3D(2.0, 0.0, 0.0));
  EXPECT_FALSE(DexPosition3D(2.0, 0.0, 0.0) < DexPosition3D(1.0, 9.0, 9.0));
  // x within tolerance: y decides; x and y within tolerance: z decides.
  EXPECT_TRUE(DexPosition3D(0.00009, 5.0, 0.0) < DexPosition3D(0.0, 6.0, 0.0));
  EXPECT_FALSE(DexPosition3D(0.0, 6.0, 0.0) < DexPosition3D(0.00009, 5.0, 0.0));
  EXPECT_TRUE(DexPosition3D(0.0, 0.00009, 1.0) < DexPosition3D(0.00009, 0.0, 2.0));
  // Just outside the tolerance x decides even though y is smaller on the other side.
  EXPECT_TRUE(DexPosition3D(0.0, 9.0, 0.0) < DexPosition3D(0.00011, 0.0, 0.0));
}

TEST(DexPosition3D, PositionsWithinToleranceAreNeitherLessNorGreater) {
  const DexPosition3D a(1.0, 2.0, 3.0);
  const DexPosition3D b(1.00009, 1.99991, 3.00009);
  EXPECT_FALSE(a < b);
  EXPECT_FALSE(b < a);
}

TEST(DexPosition3D, ADifferenceOfExactlyTheToleranceDecidesAndIsNotLess) {
  // 0 and 0.0001 do not match (strict tolerance), so x decides; but 0 is not below 0.0001 - 0.0001.
  const DexPosition3D a(0.0, 1.0, 0.0);
  const DexPosition3D b(0.0001, 2.0, 0.0);
  EXPECT_FALSE(a < b);
  EXPECT_FALSE(b < a);
}

TEST(DexPosition3D, ScalingMultipliesTheThreeCoordinates) {
  DexPosition3D position(1.0, -2.0, 0.5);
  position *= -2.0;
  expectPosition(position, -2.0, 4.0, -1.0);
}

TEST(DexPosition3D, ShiftScalesThenAddsTheOrigin) {
  DexPosition3D position(1.0, 2.0, 3.0);
  position.shiftValues(DexPosition3D(10.0, 20.0, 30.0), 2.0, 3.0, 4.0, 0.0);
  expectPosition(position, 12.0, 26.0, 42.0);
}

TEST(DexPosition3D, ShiftRotatesCounterClockwiseAboutTheOriginAfterScaling) {
  DexPosition3D position(1.0, 0.0, 7.0);
  position.shiftValues(DexPosition3D(10.0, 20.0, 5.0), 1.0, 1.0, 1.0, 90.0);
  // (11, 20) turned a quarter about (10, 20); z only moves by the origin.
  expectPosition(position, 10.0, 21.0, 12.0);
}

TEST(DexPosition3D, ShiftRotationIsInDegrees) {
  DexPosition3D position(2.0, 0.0, 0.0);
  position.shiftValues(DexPosition3D(0.0, 0.0, 0.0), 1.0, 1.0, 1.0, 30.0);
  EXPECT_NEAR(position.getX(), 2.0 * std::cos(std::numbers::pi / 6.0), 1e-12);
  EXPECT_NEAR(position.getY(), 1.0, 1e-12);
  position.shiftValues(DexPosition3D(0.0, 0.0, 0.0), 1.0, 1.0, 1.0, -30.0);
  EXPECT_NEAR(position.getX(), 2.0, 1e-12);
  EXPECT_NEAR(position.getY(), 0.0, 1e-12);
}

TEST(DexPosition3D, ShiftIsTheFirstEntryAfterTheDestructor) {
  const auto entry = dex_test::vtableEntryOf(&DexPosition3D::shiftValues);
  if (!entry) GTEST_SKIP() << "virtual table layout not observable on this platform";
  EXPECT_EQ(*entry, 2);
}

TEST(DexPosition3D, ShiftIsReachedThroughTheBase) {
  RecordingPosition recording;
  DexPosition3D& position = recording;
  position.shiftValues(DexPosition3D(1.0, 2.0, 3.0), 4.0, 5.0, 6.0, 45.0);
  EXPECT_EQ(recording.lastOrigin, DexPosition3D(1.0, 2.0, 3.0));
  EXPECT_EQ(recording.lastScaleX, 4.0);
  EXPECT_EQ(recording.lastRotation, 45.0);
}

// ---- DexNamedPosition2D -------------------------------------------------------------------------

TEST(DexNamedPosition2D, StartsUnnamedAtTheOrigin) {
  const DexNamedPosition2D position;
  EXPECT_TRUE(position.getName().IsEmpty());
  EXPECT_FALSE(position.isDefined());
}

TEST(DexNamedPosition2D, KeepsItsNameUnchanged) {
  DexNamedPosition2D position(L" F1 ", 1.0, 2.0);
  EXPECT_EQ(position.getName(), L" F1 ");
  EXPECT_EQ(position.getX(), 1.0);
  EXPECT_EQ(position.getY(), 2.0);
  position.setName(L"");
  EXPECT_TRUE(position.getName().IsEmpty());
}

TEST(DexNamedPosition2D, CopiesTakePositionAndName) {
  const DexNamedPosition2D original(L"F2", 3.0, 4.0);
  const DexNamedPosition2D copy(original);
  EXPECT_EQ(copy.getName(), L"F2");
  EXPECT_EQ(copy.getX(), 3.0);
  DexNamedPosition2D assigned;
  assigned = original;
  EXPECT_EQ(assigned.getName(), L"F2");
  EXPECT_EQ(assigned.getY(), 4.0);
}

TEST(DexNamedPosition2D, EqualityNeedsThePlaneRuleAndTheExactName) {
  const DexNamedPosition2D position(L"F1", 0.0, 0.0);
  EXPECT_EQ(position, DexNamedPosition2D(L"F1", 0.0009, 0.0));
  EXPECT_NE(position, DexNamedPosition2D(L"F1", 0.001, 0.0));
  EXPECT_NE(position, DexNamedPosition2D(L"f1", 0.0, 0.0));
  EXPECT_NE(position, DexNamedPosition2D(L"F1 ", 0.0, 0.0));
}

TEST(DexNamedPosition2D, IsDeletedThroughItsNameInterface) {
  vyn::ie::IDexNameInterface* const named = new DexNamedPosition2D(L"F3", 1.0, 1.0);
  EXPECT_EQ(named->getName(), L"F3");
  delete named;
}

// ---- DexPositionWithBulge -----------------------------------------------------------------------

TEST(DexPositionWithBulge, KeepsPositionAndBulge) {
  DexPositionWithBulge vertex(1.0, 2.0, 3.0, 0.5);
  expectPosition(vertex, 1.0, 2.0, 3.0);
  EXPECT_EQ(vertex.getBulge(), 0.5);
  vertex.setBulge(-1.0);
  EXPECT_EQ(vertex.getBulge(), -1.0);
  const DexPositionWithBulge copy(vertex);
  EXPECT_EQ(copy.getBulge(), -1.0);
  EXPECT_EQ(DexPositionWithBulge().getBulge(), 0.0);
}

TEST(DexPositionWithBulge, IsDeletedThroughThePosition) {
  DexPosition3D* const position = new DexPositionWithBulge(1.0, 2.0, 3.0, 0.25);
  EXPECT_TRUE(position->isDefined());
  delete position;
}
