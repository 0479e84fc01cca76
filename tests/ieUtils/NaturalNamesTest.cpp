#include "ieUtils/IENaturalNames.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <climits>
#include <cstdint>
#include <initializer_list>
#include <random>
#include <set>
#include <string>
#include <vector>

#include "support/LogCapture.h"

using String = CVynStringT<wchar_t>;
using vyn::ie::utils::FreeNumericNames;
using vyn::ie::utils::StringNatural;

namespace {

const std::wstring kUtilsSource = L"ieUtils\\IEUtils";

std::wstring naturalOf(const wchar_t* text) {
  return std::wstring(StringNatural(String(text)).get().view());
}

std::wstring incremented(const wchar_t* text) {
  StringNatural number{String(text)};
  ++number;
  return std::wstring(number.get().view());
}

bool isLess(const wchar_t* a, const wchar_t* b) {
  return StringNatural(String(a)) < StringNatural(String(b));
}

// Hands out names for `count` objects whose names are not numeric.
std::vector<std::wstring> handOut(FreeNumericNames& names, int count) {
  std::vector<std::wstring> result;
  for (int i = 0; i < count; ++i)
    result.emplace_back(names.getNameFor(L"P-old").view());
  return result;
}

void addObjectsToRename(FreeNumericNames& names, int count) {
  for (int i = 0; i < count; ++i)
    names.addObject(-1);
}

// Names initialised over these used numbers and this many objects to rename.
FreeNumericNames initialised(std::initializer_list<int> used, int objectsToRename) {
  FreeNumericNames names;
  for (const int number : used)
    names.addObject(number);
  addObjectsToRename(names, objectsToRename);
  names.init();
  return names;
}

// Used numbers `first`, first + step, first + 2 step, ... up to `last`, so that every gap between them
// holds step - 1 free numbers.
void addEvenlySpaced(FreeNumericNames& names, int first, int step, int last) {
  for (std::int64_t number = first; number <= last; number += step)
    names.addObject(static_cast<int>(number));
}

}  // namespace

// --- StringNatural ---

TEST(StringNatural, DropsLeadingZeros) {
  EXPECT_EQ(L"120", naturalOf(L"000120"));
  EXPECT_EQ(L"7", naturalOf(L"7"));
  EXPECT_EQ(L"12345678901234567890", naturalOf(L"0012345678901234567890"));
}

TEST(StringNatural, TextThatIsNotAllDigitsIsZero) {
  EXPECT_EQ(L"0", naturalOf(L""));
  EXPECT_EQ(L"0", naturalOf(L"000"));
  EXPECT_EQ(L"0", naturalOf(L"12a"));
  EXPECT_EQ(L"0", naturalOf(L" 7"));
  EXPECT_EQ(L"0", naturalOf(L"7 "));
  EXPECT_EQ(L"0", naturalOf(L"-5"));
  EXPECT_EQ(L"0", naturalOf(L"+5"));
  EXPECT_EQ(L"0", naturalOf(L"\x0663"));  // an Arabic-Indic digit is not 0 to 9
}

TEST(StringNatural, IsZeroByDefaultAndDecimalFromUnsigned) {
  EXPECT_EQ(L"0", StringNatural().get());
  EXPECT_EQ(L"0", StringNatural(0u).get());
  EXPECT_EQ(L"1", StringNatural(1u).get());
  EXPECT_EQ(L"4294967295", StringNatural(UINT_MAX).get());
}

TEST(StringNatural, IncrementCarriesIntoNewDigits) {
  EXPECT_EQ(L"1", incremented(L"0"));
  EXPECT_EQ(L"10", incremented(L"9"));
  EXPECT_EQ(L"1000", incremented(L"999"));
  EXPECT_EQ(L"1100", incremented(L"1099"));
  EXPECT_EQ(L"2147483648", incremented(L"2147483647"));
  EXPECT_EQ(L"4294967296", incremented(L"4294967295"));
  EXPECT_EQ(L"100000000000000000000", incremented(L"99999999999999999999"));

  StringNatural number;
  for (int i = 0; i < 1000; ++i)
    ++number;
  EXPECT_EQ(L"1000", number.get());
}

TEST(StringNatural, OrdersNumerically) {
  EXPECT_TRUE(isLess(L"99", L"100"));
  EXPECT_TRUE(isLess(L"100", L"101"));
  EXPECT_FALSE(isLess(L"5", L"5"));
  EXPECT_FALSE(isLess(L"101", L"100"));
  EXPECT_FALSE(isLess(L"100", L"99"));
  EXPECT_TRUE(isLess(L"2147483647", L"10000000000"));
  EXPECT_TRUE(isLess(L"007", L"10"));  // leading zeros are dropped first
}

TEST(StringNatural, ToIntClampsAboveThe32BitRange) {
  EXPECT_EQ(0, StringNatural().toInt());
  EXPECT_EQ(120, StringNatural(String(L"000120")).toInt());
  EXPECT_EQ(INT_MAX, StringNatural(static_cast<unsigned int>(INT_MAX)).toInt());
  EXPECT_EQ(INT_MAX, StringNatural(String(L"2147483648")).toInt());
  EXPECT_EQ(INT_MAX, StringNatural(String(L"99999999999999999999")).toInt());
}

TEST(StringNatural, CopiesAreIndependent) {
  StringNatural original(41u);
  StringNatural copy(original);
  ++copy;
  EXPECT_EQ(L"41", original.get());
  EXPECT_EQ(L"42", copy.get());
  original = copy;
  ++copy;
  EXPECT_EQ(L"42", original.get());
  EXPECT_EQ(L"43", copy.get());
}

// --- FreeNumericNames: a new object and init() ---

TEST(FreeNumericNames, NewObjectHandsOutNamesFromOne) {
  FreeNumericNames names;
  EXPECT_EQ(L"1", names.getFirstAvailableName());
  EXPECT_EQ(1, names.getFirstAvailableNumber());
  EXPECT_EQ(0, names.getObjectsToRename());
  EXPECT_EQ(0, names.getLastObject());
  EXPECT_EQ((std::vector<std::wstring>{L"1", L"2", L"3"}), handOut(names, 3));
  EXPECT_EQ(4, names.getFirstAvailableNumber());
}

TEST(FreeNumericNames, NamesStartAboveTheHighestUsedName) {
  FreeNumericNames names;
  names.addObject(L"1");
  names.addObject(L"3");
  names.addObject(L"2");
  names.addObject(L"Top");
  names.addObject(L"Base 2");
  names.init();
  EXPECT_EQ(2, names.getObjectsToRename());
  EXPECT_EQ(L"4", names.getFirstAvailableName());
  EXPECT_EQ(4, names.getFirstAvailableNumber());
  EXPECT_EQ(5, names.getLastObject());
  EXPECT_EQ(L"4", names.getNameFor(L"Top"));
  EXPECT_EQ(L"5", names.getNameFor(L"Base 2"));
  EXPECT_EQ(L"6", names.getFirstAvailableName());
}

TEST(FreeNumericNames, LastObjectCountsAboveTheHighestUsedNumber) {
  FreeNumericNames names = initialised({1, 5}, 2);
  EXPECT_EQ(6, names.getFirstAvailableNumber());
  EXPECT_EQ(7, names.getLastObject());
}

TEST(FreeNumericNames, WithoutUsedNumbersOnlyTheNameIsTracked) {
  FreeNumericNames names;
  names.addObject(L"A");
  names.addObject(L"B");
  names.addObject(L"C");
  names.init();
  EXPECT_EQ(INT_MAX, names.getFirstAvailableNumber());
  EXPECT_EQ(L"1", names.getFirstAvailableName());
  EXPECT_EQ(3, names.getLastObject());
  EXPECT_EQ((std::vector<std::wstring>{L"1", L"2", L"3"}), handOut(names, 3));
  EXPECT_EQ(INT_MAX, names.getFirstAvailableNumber());
}

TEST(FreeNumericNames, InitKeepsWhatWasAddedBefore) {
  FreeNumericNames names;
  names.addObject(1);
  names.addObject(2);
  names.init();
  EXPECT_EQ(L"3", names.getFirstAvailableName());
  names.addObject(L"3");
  names.addObject(L"X");
  names.init();
  EXPECT_EQ(L"4", names.getFirstAvailableName());
  EXPECT_EQ(1, names.getObjectsToRename());
}

// --- Counting objects to rename ---

TEST(FreeNumericNames, NegativeNumbersAreCountedToRename) {
  FreeNumericNames names;
  names.addObject(-1);
  names.addObject(-100);
  names.addObject(INT_MIN);
  names.addObject(0);
  names.init();
  EXPECT_EQ(3, names.getObjectsToRename());
  EXPECT_EQ(L"1", names.getFirstAvailableName());
  EXPECT_EQ(3, names.getLastObject());
}

TEST(FreeNumericNames, NamesThatAreNotPlainNumbersAreCountedToRename) {
  const std::vector<const wchar_t*> invalid = {L"07", L" 7", L"7a", L"",  L"2147483647", L"00",
                                               L"-5", L"+5", L"7 ", L" ", L"99999999999"};
  FreeNumericNames names;
  for (const wchar_t* name : invalid)
    names.addObject(name);
  names.init();
  EXPECT_EQ(static_cast<int>(invalid.size()), names.getObjectsToRename());
  EXPECT_EQ(INT_MAX, names.getFirstAvailableNumber());  // none was recorded as used
}

TEST(FreeNumericNames, NumericNamesAreRecordedAsUsed) {
  FreeNumericNames names;
  names.addObject(L"0");
  names.addObject(L"7");
  names.addObject(L"2147483645");
  names.init();
  EXPECT_EQ(0, names.getObjectsToRename());
  EXPECT_EQ(2147483646, names.getFirstAvailableNumber());
}

TEST(FreeNumericNames, ValidNumericNamesPassUnchanged) {
  FreeNumericNames names;
  names.init();
  for (const wchar_t* name : {L"0", L"7", L"10", L"2147483646"}) {
    EXPECT_EQ(name, names.getNameFor(name));
  }
  EXPECT_EQ(L"1", names.getFirstAvailableName());  // the candidate did not move
}

TEST(FreeNumericNames, InvalidNamesReceiveFreshNames) {
  FreeNumericNames names;
  names.init();
  EXPECT_EQ(L"1", names.getNameFor(L"07"));
  EXPECT_EQ(L"2", names.getNameFor(L" 7"));
  EXPECT_EQ(L"3", names.getNameFor(L"7a"));
  EXPECT_EQ(L"4", names.getNameFor(L""));
  EXPECT_EQ(L"5", names.getNameFor(L"2147483647"));
  EXPECT_EQ(L"6", names.getNameFor(L"00"));
}

// --- Walking the gaps between used numbers ---

TEST(FreeNumericNames, GapsAreWalkedWhenTheRenamedObjectsDoNotFitAboveTheHighestNumber) {
  FreeNumericNames names = initialised({2, 2147483640}, 8);
  EXPECT_EQ(L"3", names.getFirstAvailableName());
  EXPECT_EQ(3, names.getFirstAvailableNumber());
  EXPECT_EQ(10, names.getLastObject());
  EXPECT_EQ((std::vector<std::wstring>{L"3", L"4", L"5", L"6", L"7", L"8", L"9", L"10"}), handOut(names, 8));
}

TEST(FreeNumericNames, TheGapBelowTheLowestNumberIsUsedWhenItFits) {
  FreeNumericNames names = initialised({5, 2147483646}, 4);
  EXPECT_EQ(1, names.getFirstAvailableNumber());
  EXPECT_EQ(4, names.getLastObject());
  EXPECT_EQ((std::vector<std::wstring>{L"1", L"2", L"3", L"4", L"6", L"7"}), handOut(names, 6));
}

TEST(FreeNumericNames, AGapOfExactlyTheCountToRenameFits) {
  FreeNumericNames names = initialised({1, 4, 2147483646}, 2);
  EXPECT_EQ(2, names.getFirstAvailableNumber());
  EXPECT_EQ(3, names.getLastObject());
  EXPECT_EQ((std::vector<std::wstring>{L"2", L"3", L"5"}), handOut(names, 3));
}

TEST(FreeNumericNames, LastObjectAfterHandingOutCountsAFilledGapUpToItsUsedNumber) {
  FreeNumericNames names = initialised({1, 4, 2147483646}, 2);
  EXPECT_EQ(L"2", names.getNameFor(L"A"));
  // From the candidate 3, two objects would receive 3 and 5; the count fills the gap up to 4 and
  // takes 4 as the second.
  EXPECT_EQ(4, names.getLastObject());
}

TEST(FreeNumericNames, HandingOutPastTheGapSkipsUsedNumbers) {
  FreeNumericNames names = initialised({1, 4, 5, 7, 2147483646}, 2);
  EXPECT_EQ(2, names.getFirstAvailableNumber());
  EXPECT_EQ(3, names.getLastObject());
  EXPECT_EQ((std::vector<std::wstring>{L"2", L"3", L"6", L"8", L"9"}), handOut(names, 5));
  EXPECT_EQ(10, names.getFirstAvailableNumber());
}

TEST(FreeNumericNames, DuplicateUsedNumbersAreSkippedOnce) {
  FreeNumericNames names;
  names.addObject(L"3");
  names.addObject(L"3");
  names.addObject(4);
  names.addObject(4);
  names.addObject(6);
  names.addObject(6);
  names.addObject(2147483646);
  names.addObject(L"X");
  names.addObject(L"Y");
  names.init();
  EXPECT_EQ(1, names.getFirstAvailableNumber());
  EXPECT_EQ(2, names.getLastObject());
  EXPECT_EQ((std::vector<std::wstring>{L"1", L"2", L"5", L"7", L"8"}), handOut(names, 5));
}

TEST(FreeNumericNames, WithoutAFittingGapNamesGoBeyondThe32BitRange) {
  FreeNumericNames names;
  // Every gap holds 65535 free numbers, one fewer than the objects to rename.
  addEvenlySpaced(names, 1, 65536, 2147483646);
  names.addObject(2147483646);
  addObjectsToRename(names, 65536);
  names.init();
  EXPECT_EQ(INT_MAX, names.getFirstAvailableNumber());
  EXPECT_EQ(L"2147483647", names.getFirstAvailableName());
  EXPECT_EQ(INT_MAX, names.getLastObject());
  EXPECT_EQ((std::vector<std::wstring>{L"2147483647", L"2147483648", L"2147483649"}), handOut(names, 3));
}

TEST(FreeNumericNames, WithoutAFittingGapATooSmallGapBelowTheLowestNumberIsNotTaken) {
  FreeNumericNames names;
  addEvenlySpaced(names, 2, 65536, 2147483646);
  names.addObject(2147483646);
  addObjectsToRename(names, 65536);
  names.init();
  // Starting at 1 would hand out 2, a used number, once the walk has passed it.
  EXPECT_EQ(INT_MAX, names.getFirstAvailableNumber());
  EXPECT_EQ(L"2147483647", names.getFirstAvailableName());
  EXPECT_EQ((std::vector<std::wstring>{L"2147483647", L"2147483648", L"2147483649"}), handOut(names, 3));
}

TEST(FreeNumericNames, WithoutAFittingGapAUsedLimitIsNotHandedOut) {
  FreeNumericNames names;
  addEvenlySpaced(names, 1, 65536, 2147483646);
  names.addObject(2147483646);
  names.addObject(INT_MAX);
  addObjectsToRename(names, 65536);
  names.init();
  EXPECT_EQ(INT_MAX, names.getFirstAvailableNumber());
  EXPECT_EQ((std::vector<std::wstring>{L"2147483648", L"2147483649"}), handOut(names, 2));
}

// --- The end of the 32-bit range ---

TEST(FreeNumericNames, NamesContinueAsDecimalTextPast2147483647) {
  FreeNumericNames names;
  names.addObject(2147483645);
  names.init();
  EXPECT_EQ(2147483646, names.getFirstAvailableNumber());
  EXPECT_EQ(2147483645, names.getLastObject());
  EXPECT_EQ((std::vector<std::wstring>{L"2147483646", L"2147483647", L"2147483648", L"2147483649"}),
            handOut(names, 4));
  EXPECT_EQ(INT_MAX, names.getFirstAvailableNumber());
  EXPECT_EQ(L"2147483650", names.getFirstAvailableName());
  EXPECT_EQ(INT_MAX, names.getLastObject());
}

TEST(FreeNumericNames, AHighestUsedName2147483646StartsAt2147483647) {
  FreeNumericNames names;
  names.addObject(L"2147483646");
  names.init();
  EXPECT_EQ(INT_MAX, names.getFirstAvailableNumber());
  EXPECT_EQ(L"2147483647", names.getFirstAvailableName());
  EXPECT_EQ((std::vector<std::wstring>{L"2147483647", L"2147483648"}), handOut(names, 2));
}

TEST(FreeNumericNames, AUsedNumber2147483647IsSkippedIntoDecimalNames) {
  FreeNumericNames names;
  // Gaps of 65535 free numbers, then one of 131069 below the used number 2147483647.
  addEvenlySpaced(names, 1, 65536, 2147352577);
  names.addObject(INT_MAX);
  addObjectsToRename(names, 65536);
  names.init();
  ASSERT_EQ(2147352578, names.getFirstAvailableNumber());
  EXPECT_EQ(2147352578 + 65536 - 1, names.getLastObject());
  const std::vector<std::wstring> gap = handOut(names, 131069);
  EXPECT_EQ(L"2147483646", gap.back());
  EXPECT_EQ((std::vector<std::wstring>{L"2147483648", L"2147483649"}), handOut(names, 2));
  EXPECT_EQ(INT_MAX, names.getFirstAvailableNumber());
}

TEST(FreeNumericNames, LastObjectPastThe32BitRangeAnswersTheLimit) {
  FreeNumericNames names = initialised({2147483000}, 500);
  EXPECT_EQ(2147483500, names.getLastObject());
  handOut(names, 100);
  EXPECT_EQ(2147483600, names.getLastObject());  // counted from the current candidate
  handOut(names, 100);
  EXPECT_EQ(INT_MAX, names.getLastObject());
}

// --- Asked before init() ---

TEST(FreeNumericNames, NameAskedBeforeInitIsLoggedAndEmpty) {
  const dex_test::LogCapture log;
  FreeNumericNames names;
  names.addObject(L"A");
  EXPECT_EQ(L"", names.getFirstAvailableName());
  ASSERT_EQ(1u, log.size());
  EXPECT_EQ(kUtilsSource, log.records()[0].source);
  EXPECT_EQ(FreeNumericNames::kLogLineNameBeforeInit, log.records()[0].line);
  EXPECT_TRUE(log.records()[0].message.empty());
}

TEST(FreeNumericNames, NumberAskedBeforeInitIsLoggedAndZero) {
  const dex_test::LogCapture log;
  FreeNumericNames names;
  names.addObject(12);
  EXPECT_EQ(0, names.getFirstAvailableNumber());
  EXPECT_EQ(1, log.count(kUtilsSource, FreeNumericNames::kLogLineNumberBeforeInit));
  EXPECT_EQ(1u, log.size());
  EXPECT_NE(FreeNumericNames::kLogLineNameBeforeInit, FreeNumericNames::kLogLineNumberBeforeInit);
}

TEST(FreeNumericNames, NameForAnObjectBeforeInitIsEmptyAndKeepsTheCandidate) {
  const dex_test::LogCapture log;
  FreeNumericNames names;
  names.addObject(3);
  EXPECT_EQ(L"", names.getNameFor(L"A"));
  EXPECT_EQ(L"", names.getNameFor(L"B"));
  EXPECT_EQ(2, log.count(kUtilsSource, FreeNumericNames::kLogLineNameBeforeInit));
  EXPECT_EQ(L"12", names.getNameFor(L"12"));  // a numeric name needs no candidate
  EXPECT_EQ(0, names.getLastObject());
  EXPECT_EQ(2u, log.size());

  names.init();
  EXPECT_EQ(L"4", names.getNameFor(L"A"));
  EXPECT_EQ(2u, log.size());
}

// --- Copying ---

TEST(FreeNumericNames, CopiesHandOutTheSameNamesIndependently) {
  FreeNumericNames original = initialised({1, 4, 5, 2147483646}, 2);
  EXPECT_EQ(L"2", original.getNameFor(L"A"));

  FreeNumericNames copy(original);
  EXPECT_EQ((std::vector<std::wstring>{L"3", L"6", L"7"}), handOut(copy, 3));
  EXPECT_EQ((std::vector<std::wstring>{L"3", L"6"}), handOut(original, 2));
  EXPECT_EQ(2, copy.getObjectsToRename());

  FreeNumericNames assigned;
  assigned = original;
  EXPECT_EQ(L"7", assigned.getNameFor(L"B"));
  EXPECT_EQ(L"7", original.getNameFor(L"B"));
  EXPECT_EQ(8, assigned.getFirstAvailableNumber());
}

// --- Against a brute-force model ---

namespace {

struct RandomCase {
  std::vector<int> used;
  int objectsToRename = 0;
};

// The lowest number that starts a run of free numbers (at 1 or just above a used number) below the
// highest used number and long enough for every object to rename; 0 when there is none.
std::int64_t firstFittingGap(const std::set<int>& used, int objectsToRename) {
  std::set<std::int64_t> runStarts = {1};
  for (const int number : used)
    runStarts.insert(std::int64_t{number} + 1);
  for (const std::int64_t runStart : runStarts) {
    const auto nextUsed = used.lower_bound(static_cast<int>(std::min<std::int64_t>(runStart, INT_MAX)));
    if (nextUsed == used.end() || *nextUsed == runStart) continue;
    if (*nextUsed - runStart >= objectsToRename) return runStart;
  }
  return 0;
}

// The first name the model hands out.
std::int64_t modelStart(const RandomCase& randomCase) {
  const std::set<int> used(randomCase.used.begin(), randomCase.used.end());
  if (used.empty()) return 1;
  const int highest = *used.rbegin();
  if (std::int64_t{INT_MAX} - 1 - highest >= randomCase.objectsToRename) return std::int64_t{highest} + 1;
  const std::int64_t gap = firstFittingGap(used, randomCase.objectsToRename);
  if (gap != 0) return gap;
  return INT_MAX;
}

std::vector<std::int64_t> freeNumbersFrom(std::int64_t start, const std::vector<int>& used, int count) {
  std::vector<std::int64_t> result;
  for (std::int64_t number = start; static_cast<int>(result.size()) < count; ++number) {
    if (std::find(used.begin(), used.end(), number) == used.end()) result.push_back(number);
  }
  return result;
}

RandomCase makeRandomCase(std::mt19937& random) {
  RandomCase randomCase;
  const int usedCount = std::uniform_int_distribution<int>(0, 25)(random);
  std::uniform_int_distribution<int> smallNumber(0, 60);
  for (int i = 0; i < usedCount; ++i)
    randomCase.used.push_back(smallNumber(random));
  // A number near the top of the range forces a walk of the gaps when the objects to rename do not fit.
  if (std::bernoulli_distribution(0.6)(random)) {
    randomCase.used.push_back(INT_MAX - 1 - std::uniform_int_distribution<int>(0, 6)(random));
  }
  randomCase.objectsToRename = std::uniform_int_distribution<int>(0, 12)(random);
  return randomCase;
}

void fill(FreeNumericNames& names, const RandomCase& randomCase, std::mt19937& random) {
  std::vector<int> order(randomCase.used);
  std::shuffle(order.begin(), order.end(), random);
  for (const int number : order) {
    if (std::bernoulli_distribution(0.5)(random)) {
      names.addObject(number);
    } else {
      names.addObject(String(std::to_wstring(number).c_str()));
    }
  }
  for (int i = 0; i < randomCase.objectsToRename; ++i) {
    if (std::bernoulli_distribution(0.5)(random)) {
      names.addObject(-1 - i);
    } else {
      names.addObject(String((L"P" + std::to_wstring(i)).c_str()));
    }
  }
}

}  // namespace

TEST(FreeNumericNames, HandsOutTheSmallestFreeNumbersFromItsStart) {
  std::mt19937 random(20240611);
  int checkedCases = 0;
  for (int trial = 0; trial < 3000; ++trial) {
    const RandomCase randomCase = makeRandomCase(random);
    const std::int64_t start = modelStart(randomCase);
    if (start == 0) continue;
    ++checkedCases;
    SCOPED_TRACE("trial " + std::to_string(trial));

    FreeNumericNames names;
    fill(names, randomCase, random);
    names.init();
    ASSERT_EQ(randomCase.objectsToRename, names.getObjectsToRename());
    const int requested = randomCase.objectsToRename + std::uniform_int_distribution<int>(0, 10)(random);
    const std::vector<std::int64_t> expected = freeNumbersFrom(start, randomCase.used, requested);
    if (randomCase.objectsToRename > 0) {
      const std::int64_t lastRenamed = expected[static_cast<std::size_t>(randomCase.objectsToRename - 1)];
      EXPECT_EQ(std::min<std::int64_t>(lastRenamed, INT_MAX), names.getLastObject());
    }

    std::int64_t previous = -1;
    for (const std::int64_t number : expected) {
      const String name = names.getNameFor(L"renamed");
      ASSERT_EQ(std::to_wstring(number), name.view());
      ASSERT_LT(previous, number);
      previous = number;
    }
  }
  EXPECT_GT(checkedCases, 2500);
}
