#include "ieObjects/IEStationEquations.h"

#include <gtest/gtest.h>

#include <cctype>
#include <cmath>
#include <limits>
#include <memory>
#include <optional>
#include <string>
#include <vector>

#include "ieObjects/IEData.h"

namespace {

using vyn::ie::DexStaEquation;
using vyn::ie::DexStaEquationSet;
using vyn::ie::DexStaEquationSetDictionary;

constexpr double kNaN = std::numeric_limits<double>::quiet_NaN();

// One equation as a test writes it: running chainage, station back (when given), station ahead, name.
struct Eq {
  double chainage;
  std::optional<double> back;
  double ahead;
  const wchar_t* name = L"";
};

DexStaEquation equationOf(const Eq& eq) {
  DexStaEquation equation;
  equation.setData(DexStaEquation::RUNNING_CHAINAGE, eq.chainage);
  if (eq.back) equation.setData(DexStaEquation::STATION_BACK, *eq.back);
  equation.setData(DexStaEquation::STATION_AHEAD, eq.ahead);
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

// Counts the deletions of the sets it makes.
class CountedSet : public DexStaEquationSet {
 public:
  explicit CountedSet(int& deletions) : deletions_(deletions) {}
  ~CountedSet() override { ++deletions_; }

 private:
  int& deletions_;
};

TEST(StaEquation, KeepsThreeValuesWithTheirMarksAndIgnoresOtherKinds) {
  DexStaEquation equation;
  equation.setData(DexStaEquation::STATION_BACK, 0.0);
  equation.setData(3, 9.0);
  equation.setData(-1, 9.0);
  EXPECT_TRUE(equation.isDataSet(DexStaEquation::STATION_BACK));
  EXPECT_FALSE(equation.isDataSet(DexStaEquation::RUNNING_CHAINAGE));
  EXPECT_FALSE(equation.isDataSet(3));
  EXPECT_EQ(0.0, equation.getData(3));
  equation.setName(L"E1");
  const std::unique_ptr<DexStaEquation> clone(equation.clone());
  EXPECT_TRUE(clone->isDataSet(DexStaEquation::STATION_BACK));
  EXPECT_EQ(L"E1", clone->getName());
}

TEST(StaEquation, EqualityComparesValuesAndNamesButNotMarks) {
  const DexStaEquation base = equationOf({100.0, std::nullopt, 1000.0, L"A"});
  struct Case {
    Eq other;
    bool equal;
  };
  const Case cases[] = {
      {{100.0, std::nullopt, 1000.0, L"A"}, true},
      {{100.0, 0.0, 1000.0, L"A"}, true},  // back 0.0 unset vs set
      {{100.0, std::nullopt, 1000.0, L"a"}, false},
      {{100.5, std::nullopt, 1000.0, L"A"}, false},
      {{100.0, 1.0, 1000.0, L"A"}, false},
  };
  for (const Case& c : cases)
    EXPECT_EQ(c.equal, base == equationOf(c.other)) << c.other.chainage;
  const DexStaEquation withNaN = equationOf({kNaN, std::nullopt, 1000.0, L"A"});
  EXPECT_FALSE(withNaN == withNaN);
}

TEST(StaEquationSet, AddsCopiesOfCompleteEquationsOnly) {
  DexStaEquationSet set;
  EXPECT_FALSE(set.addEquation(nullptr));
  DexStaEquation noAhead;
  noAhead.setData(DexStaEquation::RUNNING_CHAINAGE, 10.0);
  EXPECT_FALSE(set.addEquation(&noAhead));
  DexStaEquation noChainage;
  noChainage.setData(DexStaEquation::STATION_AHEAD, 10.0);
  EXPECT_FALSE(set.addEquation(&noChainage));
  const DexStaEquation withoutBack = equationOf({10.0, std::nullopt, 50.0});
  EXPECT_TRUE(set.addEquation(&withoutBack));
  const DexStaEquation sameChainage = equationOf({10.0, std::nullopt, 70.0});
  EXPECT_FALSE(set.addEquation(&sameChainage));
  ASSERT_EQ(1, set.getNumberOfEquations());
  EXPECT_NE(&withoutBack, set.getEquationAt(0));
  EXPECT_EQ(nullptr, set.getEquationAt(1));
  EXPECT_EQ(nullptr, set.getEquationAt(-1));
}

// What validate() answers for a set, and the stations back and names it leaves, in chainage order.
struct ValidateCase {
  const char* what;
  std::vector<Eq> equations;
  bool valid;
  std::vector<double> backs;
  std::vector<std::wstring> names;
};

class StaEquationSetValidate : public testing::TestWithParam<ValidateCase> {};

TEST_P(StaEquationSetValidate, SortsCompletesAndChecksInPlace) {
  const ValidateCase& c = GetParam();
  const std::unique_ptr<DexStaEquationSet> set(newSet(c.equations));
  EXPECT_EQ(c.valid, set->validate());
  for (std::size_t i = 0; i < c.backs.size(); ++i)
    EXPECT_EQ(c.backs[i], set->getEquationAt(static_cast<int>(i))->getData(DexStaEquation::STATION_BACK))
        << i;
  for (std::size_t i = 0; i < c.names.size(); ++i)
    EXPECT_EQ(c.names[i], set->getEquationAt(static_cast<int>(i))->getName().view()) << i;
}

const double k1100 = 1100.0;

INSTANTIATE_TEST_SUITE_P(
    Cases, StaEquationSetValidate,
    testing::Values(
        ValidateCase{
            "sorted by chainage", {{200, {}, 2000}, {100, {}, 1000}}, true, {100, 1100}, {L"1", L"2"}},
        ValidateCase{"backs completed", {{0, {}, 1000}, {100, {}, 1500}}, true, {0, 1100}, {}},
        ValidateCase{"back given exactly", {{0, {}, 1000}, {100, k1100, 1500}}, true, {0, 1100}, {}},
        ValidateCase{"back 1e-10 off", {{0, {}, 1000}, {100, k1100 + 1e-10, 1500}}, false, {0}, {L"", L""}},
        ValidateCase{"first back not its chainage", {{0, 5.0, 1000}, {100, {}, 1500}}, false, {5}, {}},
        ValidateCase{"back not above the ahead before", {{0, {}, 5}, {1e-13, 5.0, 9}}, false, {}, {}},
        ValidateCase{"NaN back", {{0, {}, 5}, {10, kNaN, 9}}, false, {}, {}},
        ValidateCase{"NaN chainage", {{kNaN, {}, 5}, {10, {}, 9}}, false, {}, {}},
        ValidateCase{"names around a given one",
                     {{0, {}, 0}, {10, {}, 10, L"2"}, {20, {}, 20}},
                     true,
                     {},
                     {L"1", L"2", L"3"}},
        ValidateCase{"counter shared across the pass",
                     {{0, {}, 0}, {10, {}, 10}, {20, {}, 20, L"1"}},
                     true,
                     {},
                     {L"2", L"3", L"1"}},
        ValidateCase{"repeated name", {{0, {}, 0, L"A"}, {10, {}, 10, L"A"}}, false, {0, 10}, {L"A", L"A"}},
        ValidateCase{"empty set", {}, false, {}, {}}),
    [](const testing::TestParamInfo<ValidateCase>& info) {
      std::string name;
      for (const char* c = info.param.what; *c != '\0'; ++c)
        name += std::isalnum(static_cast<unsigned char>(*c)) ? *c : '_';
      return name;
    });

TEST(StaEquationSet, FindsTheLastEqualEquation) {
  const std::unique_ptr<DexStaEquationSet> set(newSet({{0, {}, 10, L"A"}, {5, {}, 20, L"B"}}));
  const DexStaEquation b = equationOf({5, {}, 20, L"B"});
  EXPECT_EQ(1, set->findEquation(&b));
  const DexStaEquation other = equationOf({5, {}, 21, L"B"});
  EXPECT_EQ(-1, set->findEquation(&other));
  EXPECT_EQ(-1, set->findEquation(nullptr));
}

TEST(StaEquationSet, SetsAreEqualWhateverTheirOrderAndNames) {
  const std::unique_ptr<DexStaEquationSet> set(newSet({{0, {}, 10}, {5, {}, 20}}, L"ONE"));
  const std::unique_ptr<DexStaEquationSet> reordered(newSet({{5, {}, 20}, {0, {}, 10}}, L"TWO"));
  const std::unique_ptr<DexStaEquationSet> longer(newSet({{5, {}, 20}, {0, {}, 10}, {9, {}, 30}}));
  const std::unique_ptr<DexStaEquationSet> different(newSet({{5, {}, 20}, {0, {}, 11}}));
  EXPECT_TRUE(*set == *reordered);
  EXPECT_FALSE(*set == *longer);
  EXPECT_FALSE(*longer == *set);
  EXPECT_FALSE(*set == *different);
}

TEST(StaEquationSetDictionary, AcceptsOnlyValidSetsUnlikeThoseItHolds) {
  DexStaEquationSetDictionary dictionary;
  EXPECT_FALSE(dictionary.addStaEquationSet(nullptr));
  const std::unique_ptr<DexStaEquationSet> invalid(newSet({{0, 3.0, 10}}));
  EXPECT_FALSE(dictionary.addStaEquationSet(invalid.get()));

  DexStaEquationSet* const held = newSet({{100, {}, 200}, {0, {}, 10}}, L"A");
  ASSERT_TRUE(dictionary.addStaEquationSet(held));
  EXPECT_EQ(0.0, held->getEquationAt(0)->getData(DexStaEquation::RUNNING_CHAINAGE));  // validated in place
  EXPECT_EQ(L"1", held->getEquationAt(0)->getName());

  const std::unique_ptr<DexStaEquationSet> same(newSet({{0, {}, 10}, {100, {}, 200}}, L"B"));
  EXPECT_FALSE(dictionary.addStaEquationSet(same.get()));
  EXPECT_EQ(L"1", same->getEquationAt(0)->getName());  // completed before it was refused
  EXPECT_TRUE(dictionary.addStaEquationSet(held));     // held already: nothing changes
  EXPECT_EQ(1, dictionary.getNumberOfElements());
  EXPECT_EQ(0, dictionary.findStaEquationSet(same.get()));
  EXPECT_EQ(-1, dictionary.findStaEquationSet(invalid.get()));
  EXPECT_EQ(-1, dictionary.findStaEquationSet(static_cast<const DexStaEquationSet*>(nullptr)));
}

TEST(StaEquationSetDictionary, FindsTheLastSetOfANameAndNeverAnEmptyName) {
  DexStaEquationSetDictionary dictionary;
  DexStaEquationSet* const first = newSet({{0, {}, 1}}, L"ROAD");
  DexStaEquationSet* const last = newSet({{0, {}, 2}}, L"ROAD");
  DexStaEquationSet* const unnamed = newSet({{0, {}, 3}}, L"");
  for (DexStaEquationSet* set : {first, last, unnamed})
    ASSERT_TRUE(dictionary.addStaEquationSet(set));
  EXPECT_EQ(last, dictionary.findStaEquationSet(L"ROAD"));
  EXPECT_EQ(nullptr, dictionary.findStaEquationSet(L"road"));
  EXPECT_EQ(nullptr, dictionary.findStaEquationSet(L""));
  EXPECT_EQ(first, dictionary.getStaEquationSetAt(0));
  EXPECT_EQ(nullptr, dictionary.getStaEquationSetAt(3));
}

TEST(StaEquationSetDictionary, DeletesItsSetsWithItself) {
  int deletions = 0;
  {
    DexStaEquationSetDictionary dictionary;
    for (double ahead : {1.0, 2.0}) {
      auto* const set = new CountedSet(deletions);
      const DexStaEquation equation = equationOf({0, {}, ahead});
      set->addEquation(&equation);
      ASSERT_TRUE(dictionary.addStaEquationSet(set));
    }
  }
  EXPECT_EQ(2, deletions);
}

TEST(StaEquationSetDictionary, ContainerRefusesASecondSetOfAName) {
  vyn::ie::DexData data{vyn::ie::DexSettings()};
  EXPECT_FALSE(data.addIEStaEquationSetToDictionary(nullptr));
  ASSERT_TRUE(data.addIEStaEquationSetToDictionary(newSet({{0, {}, 1}}, L"S")));
  const std::unique_ptr<DexStaEquationSet> sameName(newSet({{0, {}, 2}}, L"S"));
  EXPECT_FALSE(data.addIEStaEquationSetToDictionary(sameName.get()));
  EXPECT_TRUE(data.addIEStaEquationSetToDictionary(newSet({{0, {}, 2}}, L"")));
  EXPECT_TRUE(data.addIEStaEquationSetToDictionary(newSet({{0, {}, 3}}, L"")));
  EXPECT_EQ(3, data.getIEStaEquationSetDictionary()->getNumberOfElements());
}

}  // namespace
