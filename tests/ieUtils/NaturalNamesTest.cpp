#include "ieUtils/IENaturalNames.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <climits>
#include <cstdint>
#include <random>
#include <set>
#include <sstream>
#include <string>
#include <vector>

#include "support/Cases.h"
#include "support/LogCapture.h"
#include "support/PrintString.h"

namespace {

using String = CVynStringT<wchar_t>;
using vyn::ie::utils::FreeNumericNames;
using vyn::ie::utils::StringNatural;

// The next count names handed out, space-separated.
std::wstring handOut(FreeNumericNames& names, int count) {
  std::wstring handed;
  for (int i = 0; i < count; ++i)
    handed += (i > 0 ? L" " : L"") + std::wstring(names.getNameFor(L"P-old").view());
  return handed;
}

// Used numbers first, first + step, ... up to last (every gap holds step - 1 free numbers), then the
// objects to rename.
FreeNumericNames spaced(int first, int step, std::int64_t last, std::initializer_list<int> more,
                        int toRename) {
  FreeNumericNames names;
  for (std::int64_t number = first; number <= last; number += step)
    names.addObject(static_cast<int>(number));
  for (const int number : more)
    names.addObject(number);
  for (int i = 0; i < toRename; ++i)
    names.addObject(-1);
  names.init();
  return names;
}

TEST(NaturalNames, NumbersAndFreeNamesAreAsTheCasesGive) {
  dex_test::forEachCase("naturalnames.txt", [](const dex_test::Case& c) {
    const StringNatural natural{String(c.text(1).c_str())};
    if (c[0] == "natural") {
      EXPECT_EQ(natural.get(), String(c.text(2).c_str()));
    }
    if (c[0] == "toInt") {
      EXPECT_EQ(natural.toInt(), c.integer(2));
    }
    if (c[0] == "less") {
      EXPECT_EQ(natural < StringNatural(String(c.text(2).c_str())), c[3] == "1");
    }
    if (c[0] == "increment") {
      StringNatural next = natural;
      ++next;
      EXPECT_EQ(next.get(), String(c.text(2).c_str()));
    }
    if (c[0] != "names") return;
    FreeNumericNames names;
    std::istringstream objects(c[1]);
    std::string object;
    for (int i = 0; objects >> object; ++i) {  // numbers alternately as numbers and as names
      if (object == "-")
        names.addObject(L"renamed");
      else if (i % 2 == 0)
        names.addObject(String(dex_test::widen(object).c_str()));
      else
        names.addObject(std::stoi(object));
    }
    names.init();
    EXPECT_EQ(names.getObjectsToRename(), c.integer(2));
    EXPECT_EQ(names.getFirstAvailableNumber(), c.integer(3));
    if (c[4] != "*") {
      EXPECT_EQ(names.getLastObject(), c.integer(4));
    }
    EXPECT_EQ(handOut(names, static_cast<int>(std::count(c[5].begin(), c[5].end(), ' ')) + 1), c.text(5));
  });
  EXPECT_EQ(L"4294967295", StringNatural(UINT_MAX).get());
  EXPECT_EQ(INT_MAX, StringNatural(static_cast<unsigned int>(INT_MAX)).toInt());
  StringNatural counted;
  for (int i = 0; i < 1000; ++i)
    ++counted;
  StringNatural copy(counted);
  ++copy;
  EXPECT_EQ(L"1000", counted.get());
  counted = copy;
  ++copy;
  EXPECT_TRUE(counted.get() == L"1001" && copy.get() == L"1002");
}

TEST(FreeNumericNames, InvalidNamesAreRenamedValidOnesKeptAndInitKeepsWhatWasAdded) {
  FreeNumericNames names;
  const wchar_t* const invalid[] = {L"07", L" 7", L"7a", L"",   L"2147483647",
                                    L"00", L"-5", L"+5", L"7 ", L"99999999999"};
  for (const wchar_t* name : invalid)
    names.addObject(name);
  names.init();
  EXPECT_EQ(10, names.getObjectsToRename());
  EXPECT_EQ(INT_MAX, names.getFirstAvailableNumber());  // none was recorded as used
  for (const wchar_t* name : {L"0", L"7", L"10", L"2147483646"})
    EXPECT_EQ(name, names.getNameFor(name));
  EXPECT_EQ(L"1", names.getNameFor(L"07"));
  EXPECT_EQ(L"2", names.getNameFor(L"2147483647"));
  FreeNumericNames again;
  again.addObject(1);
  again.addObject(2);
  again.init();
  again.addObject(L"3");
  again.addObject(L"X");
  again.init();
  EXPECT_EQ(L"4", again.getFirstAvailableName());
  EXPECT_EQ(1, again.getObjectsToRename());
}

TEST(FreeNumericNames, WithoutAFittingGapNamesGoBeyondThe32BitRange) {
  FreeNumericNames names = spaced(1, 65536, 2147483646, {2147483646}, 65536);  // gaps one short
  EXPECT_EQ(INT_MAX, names.getFirstAvailableNumber());
  EXPECT_EQ(INT_MAX, names.getLastObject());
  EXPECT_EQ(L"2147483647 2147483648 2147483649", handOut(names, 3));
  // A too small gap below the lowest number is not taken; a used limit is not handed out.
  FreeNumericNames low = spaced(2, 65536, 2147483646, {2147483646}, 65536);
  EXPECT_EQ(L"2147483647", low.getFirstAvailableName());
  FreeNumericNames limit = spaced(1, 65536, 2147483646, {2147483646, INT_MAX}, 65536);
  EXPECT_EQ(L"2147483648 2147483649", handOut(limit, 2));
  // Gaps of 65535, then one of 131069 below the used number 2147483647.
  FreeNumericNames top = spaced(1, 65536, 2147352577, {INT_MAX}, 65536);
  ASSERT_EQ(2147352578, top.getFirstAvailableNumber());
  EXPECT_EQ(2147352578 + 65536 - 1, top.getLastObject());
  EXPECT_EQ(L"2147483646", handOut(top, 131069).substr(131068 * 11));
  EXPECT_EQ(L"2147483648 2147483649", handOut(top, 2));
  FreeNumericNames last = spaced(2147483000, 1, 2147483000, {}, 500);
  EXPECT_EQ(2147483500, last.getLastObject());
  handOut(last, 100);
  EXPECT_EQ(2147483600, last.getLastObject());  // counted from the current candidate
  handOut(last, 100);
  EXPECT_EQ(INT_MAX, last.getLastObject());
  FreeNumericNames filled = spaced(1, 3, 4, {2147483646}, 2);
  EXPECT_EQ(L"2", filled.getNameFor(L"A"));
  EXPECT_EQ(4, filled.getLastObject());  // from 3, two objects fill the gap up to 4
}

TEST(FreeNumericNames, AnythingAskedBeforeInitIsLoggedAndEmpty) {
  const dex_test::LogCapture log;
  FreeNumericNames names;
  names.addObject(3);
  EXPECT_EQ(L"", names.getFirstAvailableName());
  EXPECT_EQ(0, names.getFirstAvailableNumber());
  EXPECT_EQ(L"", names.getNameFor(L"A"));
  EXPECT_EQ(L"12", names.getNameFor(L"12"));  // a numeric name needs no candidate
  EXPECT_EQ(0, names.getLastObject());
  EXPECT_EQ(2, log.count(L"ieUtils\\IEUtils", FreeNumericNames::kLogLineNameBeforeInit));
  EXPECT_EQ(1, log.count(L"ieUtils\\IEUtils", FreeNumericNames::kLogLineNumberBeforeInit));
  EXPECT_EQ(3u, log.size());
  EXPECT_TRUE(log.records()[0].message.empty());
  names.init();
  EXPECT_EQ(L"4", names.getNameFor(L"A"));
  EXPECT_EQ(3u, log.size());
}

TEST(FreeNumericNames, CopiesHandOutTheSameNamesIndependently) {
  FreeNumericNames original = spaced(1, 3, 4, {5, 2147483646}, 2);
  EXPECT_EQ(L"2", original.getNameFor(L"A"));
  FreeNumericNames copy(original);
  EXPECT_EQ(L"3 6 7", handOut(copy, 3));
  EXPECT_EQ(L"3 6", handOut(original, 2));
  FreeNumericNames assigned;
  assigned = original;
  EXPECT_EQ(L"7", assigned.getNameFor(L"B"));
  EXPECT_EQ(L"7", original.getNameFor(L"B"));
}

// The lowest number starting a run of free numbers (at 1 or above a used number) below the highest
// used number and long enough for every object to rename; 0 when there is none.
std::int64_t firstFittingGap(const std::set<int>& used, int toRename) {
  std::set<std::int64_t> runStarts = {1};
  for (const int number : used)
    runStarts.insert(std::int64_t{number} + 1);
  for (const std::int64_t runStart : runStarts) {
    const auto nextUsed = used.lower_bound(static_cast<int>(std::min<std::int64_t>(runStart, INT_MAX)));
    if (nextUsed != used.end() && *nextUsed != runStart && *nextUsed - runStart >= toRename) return runStart;
  }
  return 0;
}

TEST(FreeNumericNames, HandsOutTheSmallestFreeNumbersFromWhereABruteForceModelStarts) {
  std::mt19937 random(20240611);
  int checked = 0;
  for (int trial = 0; trial < 3000; ++trial) {
    std::vector<int> used(std::uniform_int_distribution<int>(0, 25)(random));
    for (int& number : used)
      number = std::uniform_int_distribution<int>(0, 60)(random);
    // A number near the top forces a walk of the gaps when the objects to rename do not fit.
    if (std::bernoulli_distribution(0.6)(random))
      used.push_back(INT_MAX - 1 - std::uniform_int_distribution<int>(0, 6)(random));
    const int toRename = std::uniform_int_distribution<int>(0, 12)(random);
    const std::set<int> usedSet(used.begin(), used.end());
    std::int64_t start = 1;
    if (!usedSet.empty()) {
      const int highest = *usedSet.rbegin();
      start = std::int64_t{INT_MAX} - 1 - highest >= toRename ? std::int64_t{highest} + 1
                                                              : firstFittingGap(usedSet, toRename);
      if (start == 0 && std::int64_t{INT_MAX} - 1 - highest < toRename) start = INT_MAX;
    }
    FreeNumericNames names;
    std::shuffle(used.begin(), used.end(), random);
    for (const int number : used)
      std::bernoulli_distribution(0.5)(random) ? names.addObject(number)
                                               : names.addObject(String(std::to_wstring(number).c_str()));
    for (int i = 0; i < toRename; ++i)
      std::bernoulli_distribution(0.5)(random) ? names.addObject(-1 - i) : names.addObject(L"P");
    names.init();
    ASSERT_EQ(toRename, names.getObjectsToRename());
    ++checked;
    int given = 0;
    for (std::int64_t number = start; given < toRename + 10; ++number) {
      if (usedSet.count(static_cast<int>(std::min<std::int64_t>(number, INT_MAX))) != 0 && number <= INT_MAX)
        continue;
      ++given;
      ASSERT_EQ(std::to_wstring(number), names.getNameFor(L"renamed").view()) << "trial " << trial;
    }
  }
  EXPECT_EQ(checked, 3000);
}

}  // namespace
