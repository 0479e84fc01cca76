#include "ieObjects/IECoords.h"

#include <gtest/gtest.h>

#include <cmath>
#include <memory>
#include <numbers>
#include <utility>

#include "support/VtableSlot.h"

namespace {

using namespace vyn::ie;
using P2 = DexPosition2D;
using P3 = DexPosition3D;

// Answers fixed flags; counts its destruction so that deletion through the interface is visible.
class FixedCoordInfo : public ICoordInfo {
 public:
  explicit FixedCoordInfo(int& deletions) : deletions_(deletions) {}
  ~FixedCoordInfo() override { ++deletions_; }
  bool isHorizCoordsDefined() const override { return true; }
  bool isHeightDefined() const override { return false; }

 private:
  int& deletions_;
};

// Records the arguments of the shift and leaves the coordinates alone.
class RecordingPosition : public P3 {
 public:
  void shiftValues(const P3& origin, double scaleX, double, double, double rotation) override {
    lastOrigin = origin;
    lastScaleX = scaleX;
    lastRotation = rotation;
  }

  P3 lastOrigin;
  double lastScaleX = 0.0;
  double lastRotation = 0.0;
};

void expectPosition(const P3& position, double x, double y, double z) {
  EXPECT_NEAR(position.getX(), x, 1e-12);
  EXPECT_NEAR(position.getY(), y, 1e-12);
  EXPECT_NEAR(position.getZ(), z, 1e-12);
}

TEST(ICoordInfo, IsQueriedAndDeletedThroughTheInterfaceWhoseQueriesComeFirst) {
  EXPECT_TRUE(kNoValue == 1.7976931348623157e308 && kNoHeight == 2.2250738585072014e-308);
  int deletions = 0;
  std::unique_ptr<ICoordInfo> info = std::make_unique<FixedCoordInfo>(deletions);
  EXPECT_TRUE(info->isHorizCoordsDefined() && !info->isHeightDefined());
  info.reset();
  EXPECT_EQ(1, deletions);
  const auto horizontal = dex_test::vtableEntryOf(&ICoordInfo::isHorizCoordsDefined);
  const auto height = dex_test::vtableEntryOf(&ICoordInfo::isHeightDefined);
  if (!horizontal || !height) GTEST_SKIP() << "virtual table layout not observable on this platform";
  EXPECT_TRUE(*horizontal == 0 && *height == 1);
}

TEST(DexPosition2D, IsDefinedOffTheOriginAndMatchesStrictlyWithinAThousandth) {
  EXPECT_TRUE(P2().getX() == 0.0 && P2().getY() == 0.0 && !P2().isDefined() && !P2(-0.0, 0.0).isDefined());
  EXPECT_TRUE(P2(0.0, 5.0).isDefined() && P2(5.0, 0.0).isDefined() && P2(1e-300, 0.0).isDefined());
  const std::pair<P2, bool> rows[] = {{{0.0009, 5.0}, true},  {{-0.0009, 5.0}, true}, {{0.001, 5.0}, false},
                                      {{-0.001, 5.0}, false}, {{0.0, 5.0009}, true},  {{0.0, 5.001}, false}};
  for (const auto& [other, equal] : rows) {
    EXPECT_EQ(equal, P2(0.0, 5.0) == other) << other.getX() << " " << other.getY();
    EXPECT_EQ(!equal, P2(0.0, 5.0) != other) << other.getX() << " " << other.getY();
  }
  P2 position(3.0, 4.0);
  const double* coordinates = std::as_const(position).getCoordinates();
  EXPECT_TRUE(coordinates[0] == 3.0 && coordinates[1] == 4.0);
  position.getCoordinates()[1] = 7.0;
  position.setX(-1.0);
  position *= 2.0;
  EXPECT_TRUE(position.getCoordinates()[0] == -2.0 && position.getY() == 14.0);
}

TEST(DexPosition3D, IndexesDefinitionAndScaling) {
  P3 position(1.0, 2.0, 3.0);
  EXPECT_TRUE(position[0] == 1.0 && position[1] == 2.0 && position[2] == 3.0);
  EXPECT_TRUE(std::as_const(position)[3] == 3.0 && std::as_const(position)[4000000000u] == 3.0);  // past: z
  position[1] = 9.0;
  position.setZ(4.0);
  const double* coordinates = std::as_const(position).getCoordinates();
  EXPECT_TRUE(coordinates[0] == 1.0 && coordinates[1] == 9.0 && position.getCoordinates()[2] == 4.0);
  position *= -2.0;
  expectPosition(position, -2.0, -18.0, -8.0);
  position.reset();
  expectPosition(position, 0.0, 0.0, 0.0);
  // Neither the origin nor the no-height marker is defined; only the height marker counts.
  EXPECT_FALSE(P3(0, 0, 0).isDefined() || P3(1, 2, kNoHeight).isDefined() || P3(0, 0, kNoHeight).isDefined());
  EXPECT_TRUE(P3(0, 0, 5).isDefined() && P3(1, 0, 0).isDefined() && P3(1, 2, kNoValue).isDefined());
}

TEST(DexPosition3D, EqualityPrecisionAndOrderUseStrictTolerances) {
  const P3 origin(0.0, 0.0, 0.0);
  const std::pair<P3, bool> equal[] = {{{0.9e-12, 0, 0}, true}, {{0, -0.9e-12, 0.9e-12}, true},
                                       {{1e-12, 0, 0}, false},  {{0, 1e-12, 0}, false},
                                       {{0, 0, -1e-12}, false}, {{0.5e-12, 0.5e-12, 0.5e-12}, true}};
  for (const auto& [other, same] : equal) {
    EXPECT_EQ(same, origin == other) << other.getX() << " " << other.getY() << " " << other.getZ();
    EXPECT_EQ(!same, origin != other) << other.getX() << " " << other.getY() << " " << other.getZ();
  }
  const P3 position(10.0, 20.0, 30.0);
  const std::pair<P3, bool> close[] = {
      {{10.25, 20, 30}, true}, {{10.5, 20, 30}, false}, {{10, 19.5, 30}, false}, {{10, 20, 30.5}, false}};
  for (const auto& [other, near] : close)
    EXPECT_EQ(near, position.compareWithPrecision(other, 0.5)) << other.getX() << " " << other.getZ();
  EXPECT_TRUE(position.compareWithPrecision(P3(10.0, 20.0, 30.00005), 0.0001));
  EXPECT_FALSE(position.compareWithPrecision(position, 0.0) || position.compareWithPrecision(position, -1.0));
  // Lexicographic outside a ten-thousandth: x, then y, then z; exactly the tolerance decides but is not less.
  const struct {
    P3 a, b;
    bool less, greater;
  } order[] = {{{1, 9, 9}, {2, 0, 0}, true, false},
               {{0.00009, 5, 0}, {0, 6, 0}, true, false},
               {{0, 0.00009, 1}, {0.00009, 0, 2}, true, false},
               {{0, 9, 0}, {0.00011, 0, 0}, true, false},
               {{1, 2, 3}, {1.00009, 1.99991, 3.00009}, false, false},
               {{0, 1, 0}, {0.0001, 2, 0}, false, false}};
  for (const auto& row : order) {
    EXPECT_EQ(row.less, row.a < row.b) << row.a.getX() << " " << row.b.getX();
    EXPECT_EQ(row.greater, row.b < row.a) << row.a.getX() << " " << row.b.getX();
  }
}

TEST(DexPosition3D, ShiftScalesRotatesInDegreesCounterClockwiseThenAddsTheOrigin) {
  P3 position(1.0, 2.0, 3.0);
  position.shiftValues(P3(10.0, 20.0, 30.0), 2.0, 3.0, 4.0, 0.0);
  expectPosition(position, 12.0, 26.0, 42.0);
  position = P3(1.0, 0.0, 7.0);
  position.shiftValues(P3(10.0, 20.0, 5.0), 1.0, 1.0, 1.0, 90.0);
  expectPosition(position, 10.0, 21.0, 12.0);  // (11, 20) turned a quarter about (10, 20)
  position = P3(2.0, 0.0, 0.0);
  position.shiftValues(P3(), 1.0, 1.0, 1.0, 30.0);
  expectPosition(position, 2.0 * std::cos(std::numbers::pi / 6.0), 1.0, 0.0);
  position.shiftValues(P3(), 1.0, 1.0, 1.0, -30.0);
  expectPosition(position, 2.0, 0.0, 0.0);
  RecordingPosition recording;  // reached through the base, the first entry after the destructor
  static_cast<P3&>(recording).shiftValues(P3(1.0, 2.0, 3.0), 4.0, 5.0, 6.0, 45.0);
  EXPECT_TRUE(recording.lastOrigin == P3(1.0, 2.0, 3.0) && recording.lastScaleX == 4.0 &&
              recording.lastRotation == 45.0);
  const auto entry = dex_test::vtableEntryOf(&P3::shiftValues);
  if (!entry) GTEST_SKIP() << "virtual table layout not observable on this platform";
  EXPECT_EQ(2, *entry);
}

TEST(DexNamedPosition2D, KeepsItsNameAndComparesItExactly) {
  EXPECT_TRUE(DexNamedPosition2D().getName().IsEmpty() && !DexNamedPosition2D().isDefined());
  const DexNamedPosition2D position(L" F1 ", 0.0, 2.0);
  DexNamedPosition2D assigned;
  assigned = position;
  const DexNamedPosition2D copy(position);
  EXPECT_TRUE(copy.getName() == L" F1 " && copy.getY() == 2.0 && assigned.getName() == L" F1 " &&
              assigned.getY() == 2.0);
  EXPECT_EQ(position, DexNamedPosition2D(L" F1 ", 0.0009, 2.0));
  EXPECT_NE(position, DexNamedPosition2D(L" F1 ", 0.001, 2.0));
  EXPECT_NE(position, DexNamedPosition2D(L" f1 ", 0.0, 2.0));
  EXPECT_NE(position, DexNamedPosition2D(L" F1", 0.0, 2.0));
  IDexNameInterface* const named = new DexNamedPosition2D(L"F3", 1.0, 1.0);  // deleted through it
  named->setName(L"");
  EXPECT_TRUE(named->getName().IsEmpty());
  delete named;
}

TEST(DexPositionWithBulge, KeepsPositionAndBulge) {
  DexPositionWithBulge vertex(1.0, 2.0, 3.0, 0.5);
  expectPosition(vertex, 1.0, 2.0, 3.0);
  EXPECT_EQ(0.5, vertex.getBulge());
  vertex.setBulge(-1.0);
  EXPECT_TRUE(DexPositionWithBulge(vertex).getBulge() == -1.0 && DexPositionWithBulge().getBulge() == 0.0);
  P3* const position = new DexPositionWithBulge(1.0, 2.0, 3.0, 0.25);  // deleted through the position
  EXPECT_TRUE(position->isDefined());
  delete position;
}

}  // namespace
