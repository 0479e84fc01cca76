#include "ieObjects/IEStationEquations.h"

#include <gtest/gtest.h>

#include <limits>
#include <memory>
#include <optional>
#include <string>
#include <vector>

namespace {

using vyn::ie::DexStaEquation;
using vyn::ie::DexStaEquationSet;
using vyn::ie::DexStaEquationSetDictionary;

constexpr double kNaN = std::numeric_limits<double>::quiet_NaN();

// One equation as a test writes it: running chainage, station back (when given), station ahead, name.
struct Eq {
  double chainage;
  std::optional<double> back;
  std::optional<double> ahead;
  const wchar_t* name = L"";
};

DexStaEquation equationOf(const Eq& eq) {
  DexStaEquation equation;
  equation.setData(DexStaEquation::RUNNING_CHAINAGE, eq.chainage);
  if (eq.back) equation.setData(DexStaEquation::STATION_BACK, *eq.back);
  if (eq.ahead) equation.setData(DexStaEquation::STATION_AHEAD, *eq.ahead);
  equation.setName(eq.name);
  return equation;
}

DexStaEquationSet* newSet(const std::vector<Eq>& equations, const wchar_t* name = L"SET") {
  auto* const set = new DexStaEquationSet(name);
  for (const Eq& eq : equations) {
    const DexStaEquation equation = equationOf(eq);
    EXPECT_TRUE(set->addEquation(&equation));
  }
  return set;
}

TEST(StaEquation, EqualityComparesValuesAndNamesButNotMarks) {
  const DexStaEquation base = equationOf({100.0, {}, 1000.0, L"A"});
  EXPECT_TRUE(base == equationOf({100.0, 0.0, 1000.0, L"A"}));  // a set 0.0 back equals an unset one
  EXPECT_FALSE(base == equationOf({100.0, {}, 1000.0, L"a"}));
  EXPECT_FALSE(base == equationOf({100.5, {}, 1000.0, L"A"}));
  const DexStaEquation withNaN = equationOf({kNaN, {}, 1000.0});
  EXPECT_FALSE(withNaN == withNaN);
  EXPECT_FALSE(base.isDataSet(DexStaEquation::STATION_BACK));
  EXPECT_FALSE(base.isDataSet(3));
  EXPECT_TRUE(std::unique_ptr<DexStaEquation>(base.clone())->isDataSet(DexStaEquation::STATION_AHEAD));
}

TEST(StaEquationSet, AddsCopiesOfEquationsWithChainageAndStationAheadOnly) {
  DexStaEquationSet set;
  const DexStaEquation withoutBack = equationOf({10.0, {}, 50.0});
  EXPECT_TRUE(set.addEquation(&withoutBack));
  EXPECT_NE(&withoutBack, set.getEquationAt(0));
  EXPECT_FALSE(set.addEquation(nullptr));
  for (const Eq& refused : {Eq{20.0, 5.0, {}}, Eq{10.0, {}, 70.0}}) {  // no ahead; a chainage taken
    const DexStaEquation equation = equationOf(refused);
    EXPECT_FALSE(set.addEquation(&equation));
  }
  DexStaEquation noChainage;
  noChainage.setData(DexStaEquation::STATION_AHEAD, 10.0);
  EXPECT_FALSE(set.addEquation(&noChainage));
  EXPECT_EQ(1, set.getNumberOfEquations());
  EXPECT_EQ(nullptr, set.getEquationAt(1));
}

// What validate() answers for a set, and the stations back and names it leaves, in chainage order.
struct ValidateCase {
  std::vector<Eq> equations;
  bool valid;
  std::vector<double> backs;
  std::vector<std::wstring> names;
};

TEST(StaEquationSet, ValidateSortsCompletesAndChecksInPlace) {
  const ValidateCase cases[] = {
      {{{200, {}, 2000}, {100, {}, 1000}}, true, {100, 1100}, {L"1", L"2"}},
      {{{0, {}, 1000}, {100, 1100.0, 1500}}, true, {0, 1100}, {}},
      {{{0, {}, 1000}, {100, 1100.0 + 1e-10, 1500}}, false, {0}, {L"", L""}},
      {{{0, 5.0, 1000}, {100, {}, 1500}}, false, {5}, {}},
      {{{0, {}, 5}, {1e-13, 5.0, 9}}, false, {}, {}},  // within the tolerance, but not above the ahead
      {{{0, {}, 5}, {10, kNaN, 9}}, false, {}, {}},
      {{{kNaN, {}, 5}, {10, {}, 9}}, false, {}, {}},
      {{{0, {}, 0}, {10, {}, 10, L"2"}, {20, {}, 20}}, true, {}, {L"1", L"2", L"3"}},
      {{{0, {}, 0}, {10, {}, 10}, {20, {}, 20, L"1"}}, true, {}, {L"2", L"3", L"1"}},
      {{{0, {}, 0, L"A"}, {10, {}, 10, L"A"}}, false, {0, 10}, {L"A", L"A"}},
      {{}, false, {}, {}},
  };
  for (const ValidateCase& c : cases) {
    const std::unique_ptr<DexStaEquationSet> set(newSet(c.equations));
    EXPECT_EQ(c.valid, set->validate()) << c.equations.size();
    for (std::size_t i = 0; i < c.backs.size(); ++i)
      EXPECT_EQ(c.backs[i], set->getEquationAt(static_cast<int>(i))->getData(DexStaEquation::STATION_BACK));
    for (std::size_t i = 0; i < c.names.size(); ++i)
      EXPECT_EQ(c.names[i], set->getEquationAt(static_cast<int>(i))->getName().view());
  }
}

TEST(StaEquationSet, FindsTheLastEqualEquationAndComparesSetsWhateverTheOrder) {
  const std::unique_ptr<DexStaEquationSet> set(newSet({{0, {}, 10}, {5, {}, 20}}, L"ONE"));
  const DexStaEquation second = equationOf({5, {}, 20});
  EXPECT_EQ(1, set->findEquation(&second));
  EXPECT_EQ(-1, set->findEquation(nullptr));
  EXPECT_TRUE(*set == *std::unique_ptr<DexStaEquationSet>(newSet({{5, {}, 20}, {0, {}, 10}}, L"TWO")));
  const std::unique_ptr<DexStaEquationSet> longer(newSet({{5, {}, 20}, {0, {}, 10}, {9, {}, 30}}));
  EXPECT_FALSE(*set == *longer);
  EXPECT_FALSE(*longer == *set);
  EXPECT_FALSE(*set == *std::unique_ptr<DexStaEquationSet>(newSet({{5, {}, 20}, {0, {}, 11}})));
}

TEST(StaEquationSetDictionary, AcceptsOnlyValidSetsUnlikeThoseItHolds) {
  DexStaEquationSetDictionary dictionary;
  EXPECT_FALSE(dictionary.addStaEquationSet(nullptr));
  const std::unique_ptr<DexStaEquationSet> invalid(newSet({{0, 3.0, 10}}));
  EXPECT_FALSE(dictionary.addStaEquationSet(invalid.get()));
  DexStaEquationSet* const held = newSet({{100, {}, 200}, {0, {}, 10}}, L"A");
  ASSERT_TRUE(dictionary.addStaEquationSet(held));
  EXPECT_EQ(L"1", held->getEquationAt(0)->getName());  // validated in place

  const std::unique_ptr<DexStaEquationSet> same(newSet({{0, {}, 10}, {100, {}, 200}}, L"B"));
  EXPECT_FALSE(dictionary.addStaEquationSet(same.get()));
  EXPECT_EQ(L"1", same->getEquationAt(0)->getName());  // completed before it was refused
  EXPECT_TRUE(dictionary.addStaEquationSet(held));     // held already: nothing changes
  EXPECT_EQ(1, dictionary.getNumberOfElements());
  EXPECT_EQ(0, dictionary.findStaEquationSet(same.get()));
  EXPECT_EQ(-1, dictionary.findStaEquationSet(invalid.get()));
}

TEST(StaEquationSetDictionary, FindsTheLastSetOfANameAndNeverAnEmptyName) {
  DexStaEquationSetDictionary dictionary;
  DexStaEquationSet* const last = newSet({{0, {}, 2}}, L"ROAD");
  for (DexStaEquationSet* set : {newSet({{0, {}, 1}}, L"ROAD"), last, newSet({{0, {}, 3}}, L"")})
    ASSERT_TRUE(dictionary.addStaEquationSet(set));
  EXPECT_EQ(last, dictionary.findStaEquationSet(L"ROAD"));
  EXPECT_EQ(nullptr, dictionary.findStaEquationSet(L"road"));
  EXPECT_EQ(nullptr, dictionary.findStaEquationSet(L""));
  EXPECT_EQ(nullptr, dictionary.getStaEquationSetAt(3));
}

}  // namespace
