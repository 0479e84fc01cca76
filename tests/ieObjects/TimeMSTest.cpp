#include "ieObjects/IETimeMS.h"

#include <gtest/gtest.h>

#include <memory>

#include "support/TimeZoneScope.h"

namespace {

using base::CTime;
using vyn::ie::DexTimeMS;

// 2024-07-01 10:00:00 UTC: noon summer time in Central Europe.
constexpr __int64 kSummerNoonCest = 1719828000;
// 2024-03-01 12:30:15 UTC.
constexpr __int64 kMarchAfternoonUtc = 1709296215;

void expectTime(const DexTimeMS& time, __int64 seconds, short ms) {
  EXPECT_EQ(time.GetTime(), seconds);
  EXPECT_EQ(time.getMS(), ms);
}

SYSTEMTIME systemTime(int year, int month, int day, int hour, int minute, int second, int ms) {
  SYSTEMTIME result;
  result.wYear = static_cast<WORD>(year);
  result.wMonth = static_cast<WORD>(month);
  result.wDay = static_cast<WORD>(day);
  result.wHour = static_cast<WORD>(hour);
  result.wMinute = static_cast<WORD>(minute);
  result.wSecond = static_cast<WORD>(second);
  result.wMilliseconds = static_cast<WORD>(ms);
  return result;
}

class CentralEuropeanTime : public ::testing::Test {
 private:
  dex_test::TimeZoneScope zone_{dex_test::kCentralEuropeanZone};
};

}  // namespace

// ---- Construction -------------------------------------------------------------------------------

TEST(DexTimeMS, DefaultIsTheEmptyTimeWithoutMilliseconds) {
  expectTime(DexTimeMS(), 0, 0);
}

TEST(DexTimeMS, TakesSecondsOrAHostTimeWithMilliseconds) {
  expectTime(DexTimeMS(1234567890, 250), 1234567890, 250);
  expectTime(DexTimeMS(CTime(42), 999), 42, 999);
}

TEST(DexTimeMS, CalendarFieldsAreReadAsLocalTime) {
  const dex_test::TimeZoneScope utc("UTC0");
  expectTime(DexTimeMS(2024, 3, 1, 12, 30, 15, 125, -1), kMarchAfternoonUtc, 125);
  expectTime(DexTimeMS(systemTime(2024, 3, 1, 12, 30, 15, 0), 7, 0), kMarchAfternoonUtc, 7);
}

TEST_F(CentralEuropeanTime, CalendarConstructorHandsTheDaylightSavingFlagOn) {
  expectTime(DexTimeMS(2024, 7, 1, 12, 0, 0, 1, 1), kSummerNoonCest, 1);
  expectTime(DexTimeMS(2024, 7, 1, 12, 0, 0, 1, -1), kSummerNoonCest, 1);
  expectTime(DexTimeMS(2024, 7, 1, 12, 0, 0, 1, 0), kSummerNoonCest + 3600, 1);
  for (const int dst : {-1, 0, 1}) {
    EXPECT_EQ(DexTimeMS(2024, 1, 15, 8, 5, 0, 0, dst).GetTime(), CTime(2024, 1, 15, 8, 5, 0, dst).GetTime());
  }
}

TEST_F(CentralEuropeanTime, SystemTimeConstructorHandsTheDaylightSavingFlagOnAndIgnoresItsMilliseconds) {
  const SYSTEMTIME summerNoon = systemTime(2024, 7, 1, 12, 0, 0, 999);
  expectTime(DexTimeMS(summerNoon, 5, 1), kSummerNoonCest, 5);
  expectTime(DexTimeMS(summerNoon, 5, 0), kSummerNoonCest + 3600, 5);
}

TEST(DexTimeMS, InvalidCalendarFieldsGiveTheEmptyTimeButKeepTheMilliseconds) {
  expectTime(DexTimeMS(2023, 2, 29, 0, 0, 0, 300, -1), 0, 300);
  expectTime(DexTimeMS(systemTime(2023, 13, 1, 0, 0, 0, 0), 300, -1), 0, 300);
}

// ---- Access, copy and comparison ----------------------------------------------------------------

TEST(DexTimeMS, AssignmentCopiesBothParts) {
  DexTimeMS time(5, 5);
  time = DexTimeMS(10, 600);
  expectTime(time, 10, 600);
  time.setMS(-3);  // stored as given
  EXPECT_EQ(time.getMS(), -3);
}

TEST(DexTimeMS, ComparesTheMillisecondsToo) {
  EXPECT_EQ(DexTimeMS(10, 600), DexTimeMS(10, 600));
  EXPECT_NE(DexTimeMS(10, 600), DexTimeMS(10, 601));
  EXPECT_LT(DexTimeMS(10, 999), DexTimeMS(11, 0));
  EXPECT_LT(DexTimeMS(10, 1), DexTimeMS(10, 2));
}

TEST(DexTimeMS, IsDeletedThroughItsOwnType) {
  std::unique_ptr<DexTimeMS> time(new DexTimeMS(1, 2));
  EXPECT_EQ(time->getMS(), 2);
}

// ---- Arithmetic ---------------------------------------------------------------------------------

TEST(DexTimeMS, AddingCarriesASecondWhenTheMillisecondsReachAThousand) {
  DexTimeMS time(10, 600);
  time += DexTimeMS(2, 500);
  expectTime(time, 13, 100);

  DexTimeMS exact(10, 500);
  exact += DexTimeMS(0, 500);
  expectTime(exact, 11, 0);
}

TEST(DexTimeMS, AddingWithoutCarryAddsBothParts) {
  DexTimeMS time(10, 100);
  time += DexTimeMS(2, 899);
  expectTime(time, 12, 999);
}

TEST(DexTimeMS, SubtractingBorrowsASecondWhenTheMillisecondsFallBelowZero) {
  DexTimeMS time(10, 200);
  time -= DexTimeMS(2, 500);
  expectTime(time, 7, 700);

  DexTimeMS justBelow(10, 0);
  justBelow -= DexTimeMS(0, 1);
  expectTime(justBelow, 9, 999);
}

TEST(DexTimeMS, SubtractingEqualMillisecondsDoesNotBorrow) {
  DexTimeMS time(10, 500);
  time -= DexTimeMS(3, 500);
  expectTime(time, 7, 0);
}

TEST(DexTimeMS, AddingATimeToItselfDoublesIt) {
  DexTimeMS time(10, 600);
  const DexTimeMS& same = time;
  time += same;
  expectTime(time, 21, 200);
  time -= same;
  expectTime(time, 0, 0);
}

TEST(DexTimeMS, ArithmeticBringsOutOfRangeMillisecondsIntoZeroTo999) {
  DexTimeMS negative(10, -5);
  negative += DexTimeMS(0, 0);
  expectTime(negative, 9, 995);

  DexTimeMS large(10, 2500);
  large += DexTimeMS(1, 600);
  expectTime(large, 14, 100);

  DexTimeMS borrowing(10, 0);
  borrowing -= DexTimeMS(0, 1500);
  expectTime(borrowing, 8, 500);
}
