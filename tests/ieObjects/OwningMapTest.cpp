#include "ieObjects/IEOwningMap.h"

#include <gtest/gtest.h>

namespace {

using vyn::ie::DexOwningMap;

struct Counted {
  explicit Counted(int& deletions) : deletions_(deletions) {}
  ~Counted() { ++deletions_; }
  int& deletions_;
};

TEST(OwningMap, KeepsTheFirstItemOfAKeyAndLeavesDeclinedItemsWithTheCaller) {
  int deletions = 0;
  {
    DexOwningMap<int, Counted> map;
    auto* const first = new Counted(deletions);
    EXPECT_TRUE(map.add(2, first));
    Counted declined(deletions);
    EXPECT_FALSE(map.add(2, &declined));
    EXPECT_TRUE(map.add(2, first));  // held already: nothing changes
    EXPECT_TRUE(map.add(5, first));  // not even under another key
    EXPECT_FALSE(map.add(3, nullptr));
    EXPECT_TRUE(map.add(1, new Counted(deletions)));
    EXPECT_EQ(2, map.count());
    EXPECT_EQ(first, map.find(2));
    EXPECT_EQ(nullptr, map.find(5));
    EXPECT_TRUE(map.holds(first));
    EXPECT_FALSE(map.holds(&declined));
    EXPECT_EQ(nullptr, map.find(3));
    EXPECT_EQ(1, map.begin()->first);
    EXPECT_EQ(0, deletions);
  }
  EXPECT_EQ(3, deletions);
}

TEST(OwningMap, RemoveAndClearDeleteTheItems) {
  int deletions = 0;
  DexOwningMap<int, Counted> map;
  map.add(1, new Counted(deletions));
  map.add(2, new Counted(deletions));
  EXPECT_TRUE(map.remove(1));
  EXPECT_FALSE(map.remove(1));
  EXPECT_EQ(1, deletions);
  map.clear();
  EXPECT_EQ(2, deletions);
  EXPECT_EQ(0, map.count());
  EXPECT_EQ(map.begin(), map.end());
}

}  // namespace
