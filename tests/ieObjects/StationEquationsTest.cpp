#include "ieObjects/IEStationEquations.h"

#include <gtest/gtest.h>

namespace {

using vyn::ie::DexStaEquationSet;
using vyn::ie::DexStaEquationSetDictionary;

// A set that counts its deletions.
class CountedSet : public DexStaEquationSet {
 public:
  CountedSet(const wchar_t* name, int& deletions) : DexStaEquationSet(name), deletions_(deletions) {}
  ~CountedSet() override { ++deletions_; }

 private:
  int& deletions_;
};

TEST(StaEquationSetDictionary, FindsTheLastSetOfANameAndNeverAnEmptyName) {
  DexStaEquationSetDictionary dictionary;
  auto* const first = new DexStaEquationSet(L"ROAD");
  auto* const last = new DexStaEquationSet(L"ROAD");
  auto* const unnamed = new DexStaEquationSet();
  EXPECT_TRUE(dictionary.addStaEquationSet(first));
  EXPECT_TRUE(dictionary.addStaEquationSet(last));
  EXPECT_TRUE(dictionary.addStaEquationSet(unnamed));
  EXPECT_EQ(3, dictionary.getNumberOfElements());
  EXPECT_EQ(last, dictionary.findStaEquationSet(L"ROAD"));
  EXPECT_EQ(nullptr, dictionary.findStaEquationSet(L"road"));
  EXPECT_EQ(nullptr, dictionary.findStaEquationSet(L""));
  EXPECT_EQ(first, dictionary.getStaEquationSetAt(0));
  EXPECT_EQ(nullptr, dictionary.getStaEquationSetAt(3));
}

TEST(StaEquationSetDictionary, DeclinesNullAndTakesAHeldSetOnlyOnce) {
  int deletions = 0;
  {
    DexStaEquationSetDictionary dictionary;
    EXPECT_FALSE(dictionary.addStaEquationSet(nullptr));
    auto* const set = new CountedSet(L"A", deletions);
    EXPECT_TRUE(dictionary.addStaEquationSet(set));
    EXPECT_TRUE(dictionary.addStaEquationSet(set));
    EXPECT_EQ(1, dictionary.getNumberOfElements());
  }
  EXPECT_EQ(1, deletions);
}

}  // namespace
