#include "ieObjects/IETypedValues.h"

#include <gtest/gtest.h>

#include <cfloat>
#include <cmath>
#include <limits>
#include <type_traits>

namespace {

using vyn::ie::DexTypedArray;
using vyn::ie::DexTypedPositions;
using vyn::ie::DexTypedValues;

enum ESampleKind : int { FIRST = 0, SECOND = 1, THIRD = 2, FOURTH = 3 };

// Positions of the model are polymorphic records; the variant must work with them.
struct SamplePosition {
  SamplePosition() = default;
  SamplePosition(double x, double y) : x(x), y(y) {}
  SamplePosition(const SamplePosition&) = default;
  SamplePosition& operator=(const SamplePosition&) = default;
  virtual ~SamplePosition() = default;
  bool operator==(const SamplePosition& other) const { return x == other.x && y == other.y; }
  double x = 0.0;
  double y = 0.0;
};

ESampleKind kindFromNumber(int number) {
  return static_cast<ESampleKind>(number);
}

}  // namespace

static_assert(std::is_trivially_copyable_v<DexTypedValues<ESampleKind, 4>>, "a value record copies by value");
static_assert(sizeof(DexTypedValues<ESampleKind, 4>) == 4 * sizeof(double), "a value record holds no heap");

TEST(DexTypedValues, ReadsZeroForEveryKindAfterConstruction) {
  const DexTypedValues<ESampleKind, 4> values;
  for (int kind = 0; kind < 4; ++kind)
    EXPECT_EQ(0.0, values.get(kindFromNumber(kind)));
  EXPECT_EQ(4, values.size());
}

TEST(DexTypedValues, StoresEachKindSeparately) {
  DexTypedValues<ESampleKind, 4> values;
  EXPECT_TRUE(values.set(SECOND, 2.5));
  EXPECT_TRUE(values.set(FOURTH, -7.25));
  EXPECT_EQ(0.0, values.get(FIRST));
  EXPECT_EQ(2.5, values.get(SECOND));
  EXPECT_EQ(0.0, values.get(THIRD));
  EXPECT_EQ(-7.25, values.get(FOURTH));
}

TEST(DexTypedValues, KindPastTheEndReadsZeroAndIsIgnoredBySet) {
  DexTypedValues<ESampleKind, 3> values;
  values.set(THIRD, 3.0);
  EXPECT_FALSE(values.set(FOURTH, 99.0));
  EXPECT_EQ(0.0, values.get(FOURTH));
  EXPECT_EQ(3.0, values.get(THIRD));
  EXPECT_FALSE(values.contains(FOURTH));
  EXPECT_TRUE(values.contains(THIRD));
}

TEST(DexTypedValues, NegativeAndHugeKindsCastFromNumbersAreOutsideTheArray) {
  DexTypedValues<ESampleKind, 4> values;
  EXPECT_FALSE(values.set(kindFromNumber(-1), 1.0));
  EXPECT_FALSE(values.set(kindFromNumber(std::numeric_limits<int>::max()), 1.0));
  EXPECT_FALSE(values.set(kindFromNumber(std::numeric_limits<int>::min()), 1.0));
  EXPECT_EQ(0.0, values.get(kindFromNumber(-1)));
  EXPECT_EQ(0.0, values.get(kindFromNumber(std::numeric_limits<int>::min())));
  for (int kind = 0; kind < 4; ++kind)
    EXPECT_EQ(0.0, values.get(kindFromNumber(kind)));
}

TEST(DexTypedValues, UnsignedKindsWrapToOutsideTheArray) {
  DexTypedValues<unsigned, 2> values;
  EXPECT_FALSE(values.set(static_cast<unsigned>(-1), 4.0));
  EXPECT_EQ(0.0, values.get(static_cast<unsigned>(-1)));
}

TEST(DexTypedValues, InitialValueFillsEveryKindButNotTheOutsideAnswer) {
  const DexTypedValues<ESampleKind, 2> markers(DBL_MAX);
  EXPECT_EQ(DBL_MAX, markers.get(FIRST));
  EXPECT_EQ(DBL_MAX, markers.get(SECOND));
  EXPECT_EQ(0.0, markers.get(THIRD));

  const DexTypedValues<ESampleKind, 2> unset(std::numeric_limits<double>::quiet_NaN());
  EXPECT_TRUE(std::isnan(unset.get(FIRST)));
  EXPECT_EQ(0.0, unset.get(FOURTH));
}

TEST(DexTypedValues, CopiesAreIndependent) {
  DexTypedValues<ESampleKind, 3> original;
  original.set(FIRST, 1.0);
  DexTypedValues<ESampleKind, 3> copy = original;
  copy.set(FIRST, 2.0);
  EXPECT_EQ(1.0, original.get(FIRST));
  EXPECT_EQ(2.0, copy.get(FIRST));
  EXPECT_FALSE(copy == original);
  copy = original;
  EXPECT_TRUE(copy == original);
}

TEST(DexTypedValues, DataGivesTheValuesInKindOrder) {
  DexTypedValues<ESampleKind, 3> values;
  values.set(FIRST, 1.0);
  values.set(THIRD, 3.0);
  const double* raw = values.data();
  EXPECT_EQ(1.0, raw[0]);
  EXPECT_EQ(0.0, raw[1]);
  EXPECT_EQ(3.0, raw[2]);
}

TEST(DexTypedValues, MarksReadFalseOutsideTheArray) {
  DexTypedArray<ESampleKind, 3, bool> marks;
  marks.set(SECOND, true);
  marks.set(FOURTH, true);
  EXPECT_FALSE(marks.get(FIRST));
  EXPECT_TRUE(marks.get(SECOND));
  EXPECT_FALSE(marks.get(FOURTH));
}

TEST(DexTypedPositions, KindOutsideReadsTheOriginAndIsIgnoredBySet) {
  DexTypedPositions<ESampleKind, 2, SamplePosition> positions;
  EXPECT_TRUE(positions.set(SECOND, SamplePosition(10.0, 20.0)));
  EXPECT_FALSE(positions.set(THIRD, SamplePosition(5.0, 5.0)));
  EXPECT_EQ(SamplePosition(10.0, 20.0), positions.get(SECOND));
  EXPECT_EQ(SamplePosition(), positions.get(FIRST));
  EXPECT_EQ(SamplePosition(), positions.get(THIRD));
  EXPECT_EQ(SamplePosition(), positions.get(kindFromNumber(-3)));
}

TEST(DexTypedPositions, CopiesAreIndependent) {
  DexTypedPositions<ESampleKind, 2, SamplePosition> original;
  original.set(FIRST, SamplePosition(1.0, 2.0));
  auto copy = original;
  copy.set(FIRST, SamplePosition(3.0, 4.0));
  EXPECT_EQ(SamplePosition(1.0, 2.0), original.get(FIRST));
  EXPECT_EQ(SamplePosition(3.0, 4.0), copy.get(FIRST));
}
