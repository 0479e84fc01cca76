#include "ieDefinitions/IEFlags.h"

#include <gtest/gtest.h>

#include <cstdint>

#include "ieDefinitions/IEDataType.h"

using vyn::ie::DexFlags;
using vyn::ie::EDexDataType;

TEST(DexFlags, ValueVIsBitV) {
  EXPECT_EQ(0u, DexFlags<EDexDataType>().getMask());
  EXPECT_EQ(std::uint64_t{1}, DexFlags<EDexDataType>(vyn::ie::POINTS).getMask());
  EXPECT_EQ(std::uint64_t{1} << 22, DexFlags<EDexDataType>(vyn::ie::MULTIPLE).getMask());
  const DexFlags<EDexDataType> set{vyn::ie::LINES, vyn::ie::SURFACES};
  EXPECT_EQ((std::uint64_t{1} << 2) | (std::uint64_t{1} << 10), set.getMask());
  EXPECT_EQ(set, DexFlags<EDexDataType>::fromMask(set.getMask()));
}

TEST(DexFlags, SetsJoinWithBitwiseOrAndCountTheirMembers) {
  const DexFlags<EDexDataType> joined = DexFlags<EDexDataType>(vyn::ie::POINTS) | vyn::ie::LINES;
  EXPECT_TRUE(joined.has(vyn::ie::POINTS));
  EXPECT_TRUE(joined.has(vyn::ie::LINES));
  EXPECT_FALSE(joined.has(vyn::ie::AREAS));
  EXPECT_EQ(2, joined.count());

  DexFlags<EDexDataType> grown;
  EXPECT_TRUE(grown.isEmpty());
  grown |= joined;
  grown.add(vyn::ie::LINES).add(vyn::ie::MULTIPLE);
  EXPECT_EQ(3, grown.count());
  grown.remove(vyn::ie::POINTS).remove(vyn::ie::AREAS);
  EXPECT_EQ((DexFlags<EDexDataType>{vyn::ie::LINES, vyn::ie::MULTIPLE}), grown);
  grown.clear();
  EXPECT_TRUE(grown.isEmpty());
}

TEST(DexFlags, ValuesOutsideTheMaskAreNeverMembers) {
  const auto negative = static_cast<EDexDataType>(-1);
  const auto tooLarge = static_cast<EDexDataType>(64);
  DexFlags<EDexDataType> set(negative);
  EXPECT_TRUE(set.isEmpty());
  set.add(tooLarge).add(static_cast<EDexDataType>(63));
  EXPECT_EQ(1, set.count());
  EXPECT_TRUE(set.has(static_cast<EDexDataType>(63)));
  EXPECT_FALSE(set.has(negative));
  EXPECT_FALSE(set.has(tooLarge));
  set.remove(negative);
  EXPECT_EQ(1, set.count());
}

TEST(DexFlags, IsAPlainValueUsableInConstantExpressions) {
  constexpr DexFlags<EDexDataType> kPoints{vyn::ie::POINTS, vyn::ie::POINT_LISTS};
  static_assert(kPoints.count() == 2);
  static_assert(kPoints.has(vyn::ie::POINT_LISTS));
  static_assert(sizeof(DexFlags<EDexDataType>) == sizeof(std::uint64_t));
}
