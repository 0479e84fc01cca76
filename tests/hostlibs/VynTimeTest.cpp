#include "hostlibs/VynTime.h"

#include <gtest/gtest.h>

#include <cstdint>
#include <limits>
#include <string>

#include "support/CommaLocale.h"
#include "support/TimeZoneScope.h"

namespace {

using base::CTime;
using base::CTimeSpan;

constexpr std::uint64_t kTicksPerSecond = 10'000'000;
constexpr std::uint64_t kTicksAt1970 = 116444736000000000ull;
// 2021-07-01 10:00:00 UTC (12:00 summer time in Central Europe) and 2021-01-15 11:00:00 UTC (12:00
// winter time).
constexpr __int64 kSummerNoonCest = 1625133600;
constexpr __int64 kWinterNoonCet = 1610708400;

FILETIME fileTime(std::uint64_t ticks) {
  FILETIME result;
  result.dwLowDateTime = static_cast<DWORD>(ticks & 0xFFFFFFFFu);
  result.dwHighDateTime = static_cast<DWORD>(ticks >> 32);
  return result;
}

std::uint64_t ticksOf(const FILETIME& time) {
  return (static_cast<std::uint64_t>(time.dwHighDateTime) << 32) | time.dwLowDateTime;
}

SYSTEMTIME systemTime(int year, int month, int day, int hour = 0, int minute = 0, int second = 0,
                      int ms = 0) {
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

void expectFields(const SYSTEMTIME& time, int year, int month, int day, int hour, int minute, int second,
                  int ms) {
  EXPECT_EQ(time.wYear, year);
  EXPECT_EQ(time.wMonth, month);
  EXPECT_EQ(time.wDay, day);
  EXPECT_EQ(time.wHour, hour);
  EXPECT_EQ(time.wMinute, minute);
  EXPECT_EQ(time.wSecond, second);
  EXPECT_EQ(time.wMilliseconds, ms);
}

// Local times are tested in Central European time, whatever zone the machine is set to.
class LocalTime : public ::testing::Test {
 private:
  dex_test::TimeZoneScope zone_{dex_test::kCentralEuropeanZone};
};

// ---- FILETIME and SYSTEMTIME --------------------------------------------------------------------

TEST(FileTime, StartsOnMonday1601January1) {
  SYSTEMTIME time;
  const FILETIME zero = fileTime(0);
  ASSERT_TRUE(FileTimeToSystemTime(&zero, &time));
  expectFields(time, 1601, 1, 1, 0, 0, 0, 0);
  EXPECT_EQ(time.wDayOfWeek, 1);
}

TEST(FileTime, ReachesThe1970EpochAfter11644473600Seconds) {
  SYSTEMTIME time;
  const FILETIME epoch = fileTime(kTicksAt1970);
  ASSERT_TRUE(FileTimeToSystemTime(&epoch, &time));
  expectFields(time, 1970, 1, 1, 0, 0, 0, 0);
  EXPECT_EQ(time.wDayOfWeek, 4);

  FILETIME back;
  const SYSTEMTIME start = systemTime(1970, 1, 1);
  ASSERT_TRUE(SystemTimeToFileTime(&start, &back));
  EXPECT_EQ(ticksOf(back), kTicksAt1970);
}

TEST(FileTime, RoundTripsThroughSystemTimeToTheMillisecond) {
  for (const SYSTEMTIME& start :
       {systemTime(2024, 2, 29, 13, 45, 30, 250), systemTime(1601, 1, 1),
        systemTime(30827, 12, 31, 23, 59, 59, 999), systemTime(1969, 12, 31, 23, 59, 59)}) {
    FILETIME file;
    SYSTEMTIME back;
    ASSERT_TRUE(SystemTimeToFileTime(&start, &file));
    ASSERT_TRUE(FileTimeToSystemTime(&file, &back));
    expectFields(back, start.wYear, start.wMonth, start.wDay, start.wHour, start.wMinute, start.wSecond,
                 start.wMilliseconds);
  }
}

TEST(FileTime, DropsTheFractionOfAMillisecond) {
  SYSTEMTIME time;
  const FILETIME file = fileTime(kTicksAt1970 + 1234567);
  ASSERT_TRUE(FileTimeToSystemTime(&file, &time));
  EXPECT_EQ(time.wMilliseconds, 123);
}

TEST(FileTime, RejectsTimesWithTheTopBitSet) {
  SYSTEMTIME time = systemTime(2000, 1, 1);
  const FILETIME largest = fileTime(0x7FFFFFFFFFFFFFFFull);
  ASSERT_TRUE(FileTimeToSystemTime(&largest, &time));
  EXPECT_EQ(time.wYear, 30828);

  time = systemTime(2000, 1, 1);
  const FILETIME beyond = fileTime(0x8000000000000000ull);
  EXPECT_FALSE(FileTimeToSystemTime(&beyond, &time));
  EXPECT_EQ(time.wYear, 2000);
}

TEST(SystemTime, InvalidFieldsAreRejectedAndLeaveTheTargetUnchanged) {
  const SYSTEMTIME invalid[] = {
      systemTime(2021, 0, 1),
      systemTime(2021, 13, 1),
      systemTime(2021, 1, 0),
      systemTime(2021, 1, 32),
      systemTime(2023, 2, 29),
      systemTime(1900, 2, 29),
      systemTime(2021, 4, 31),
      systemTime(2021, 1, 1, 24),
      systemTime(2021, 1, 1, 0, 60),
      systemTime(2021, 1, 1, 0, 0, 60),
      systemTime(2021, 1, 1, 0, 0, 0, 1000),
      systemTime(1600, 12, 31),
      systemTime(30828, 1, 1),
  };
  for (const SYSTEMTIME& time : invalid) {
    FILETIME file = fileTime(42);
    EXPECT_FALSE(SystemTimeToFileTime(&time, &file)) << time.wYear << "-" << time.wMonth << "-" << time.wDay;
    EXPECT_EQ(ticksOf(file), 42u);
  }
  const SYSTEMTIME leapDay = systemTime(2000, 2, 29);
  FILETIME file;
  EXPECT_TRUE(SystemTimeToFileTime(&leapDay, &file));
}

TEST(SystemTime, NullArgumentsAnswerZero) {
  SYSTEMTIME time;
  FILETIME file;
  EXPECT_FALSE(FileTimeToSystemTime(nullptr, &time));
  EXPECT_FALSE(FileTimeToSystemTime(&file, nullptr));
  EXPECT_FALSE(SystemTimeToFileTime(nullptr, &file));
  EXPECT_FALSE(FileTimeToLocalFileTime(nullptr, &file));
  EXPECT_FALSE(LocalFileTimeToFileTime(&file, nullptr));
  EXPECT_FALSE(SystemTimeToTzSpecificLocalTime(nullptr, nullptr, &time));
  GetSystemTime(nullptr);
  GetLocalTime(nullptr);
}

TEST_F(LocalTime, FileTimesShiftByTheOffsetOfTheirDate) {
  const std::uint64_t winter =
      kTicksAt1970 + static_cast<std::uint64_t>(kWinterNoonCet) * kTicksPerSecond + 5;
  const std::uint64_t summer = kTicksAt1970 + static_cast<std::uint64_t>(kSummerNoonCest) * kTicksPerSecond;
  FILETIME local;
  FILETIME utc;

  FILETIME start = fileTime(winter);
  ASSERT_TRUE(FileTimeToLocalFileTime(&start, &local));
  EXPECT_EQ(ticksOf(local), winter + 3600 * kTicksPerSecond);
  ASSERT_TRUE(LocalFileTimeToFileTime(&local, &utc));
  EXPECT_EQ(ticksOf(utc), winter);

  start = fileTime(summer);
  ASSERT_TRUE(FileTimeToLocalFileTime(&start, &local));
  EXPECT_EQ(ticksOf(local), summer + 7200 * kTicksPerSecond);
  ASSERT_TRUE(LocalFileTimeToFileTime(&local, &utc));
  EXPECT_EQ(ticksOf(utc), summer);
}

TEST_F(LocalTime, ALocalFileTimeBeforeTheFirstUtcTickIsRejected) {
  const FILETIME local = fileTime(0);
  FILETIME utc = fileTime(42);
  EXPECT_FALSE(LocalFileTimeToFileTime(&local, &utc));
  EXPECT_EQ(ticksOf(utc), 42u);
}

TEST_F(LocalTime, SystemTimeToTzSpecificLocalTimeUsesTheCurrentZone) {
  const SYSTEMTIME utc = systemTime(2015, 12, 31, 23, 30, 0);
  SYSTEMTIME local;
  ASSERT_TRUE(SystemTimeToTzSpecificLocalTime(nullptr, &utc, &local));
  expectFields(local, 2016, 1, 1, 0, 30, 0, 0);
  EXPECT_EQ(local.wDayOfWeek, 5);

  const int zoneInformation = 0;
  EXPECT_FALSE(SystemTimeToTzSpecificLocalTime(&zoneInformation, &utc, &local));
  const SYSTEMTIME invalid = systemTime(2015, 13, 1);
  EXPECT_FALSE(SystemTimeToTzSpecificLocalTime(nullptr, &invalid, &local));
}

TEST_F(LocalTime, CurrentSystemAndLocalTimesAgreeWithTheClock) {
  SYSTEMTIME utc;
  SYSTEMTIME local;
  GetSystemTime(&utc);
  GetLocalTime(&local);
  FILETIME utcFile;
  FILETIME localFile;
  ASSERT_TRUE(SystemTimeToFileTime(&utc, &utcFile));
  ASSERT_TRUE(SystemTimeToFileTime(&local, &localFile));
  const __int64 now = CTime::GetCurrentTime().GetTime();
  EXPECT_NEAR(static_cast<double>(CTime(utcFile).GetTime()), static_cast<double>(now), 2.0);
  const __int64 offset = CTime(localFile).GetTime() - CTime(utcFile).GetTime();
  EXPECT_TRUE(offset >= 3599 && offset <= 7201) << offset;
}

// ---- CTimeSpan ----------------------------------------------------------------------------------

TEST(CTimeSpan, SplitsIntoDaysHoursMinutesAndSeconds) {
  const CTimeSpan span(1, 2, 3, 4);
  EXPECT_EQ(span.GetTimeSpan(), 93784);
  EXPECT_EQ(span.GetDays(), 1);
  EXPECT_EQ(span.GetHours(), 2);
  EXPECT_EQ(span.GetMinutes(), 3);
  EXPECT_EQ(span.GetSeconds(), 4);
  EXPECT_EQ(span.GetTotalHours(), 26);
  EXPECT_EQ(span.GetTotalMinutes(), 1563);
  EXPECT_EQ(span.GetTotalSeconds(), 93784);

  const CTimeSpan negative = -span;
  EXPECT_EQ(negative.GetDays(), -1);
  EXPECT_EQ(negative.GetHours(), -2);
  EXPECT_EQ(negative.GetSeconds(), -4);
}

TEST(CTimeSpan, AddsSubtractsAndCompares) {
  CTimeSpan span(0, 1, 0, 0);
  span += CTimeSpan(30);
  EXPECT_EQ(span.GetTotalSeconds(), 3630);
  span -= CTimeSpan(0, 0, 1, 0);
  EXPECT_EQ(span, CTimeSpan(3570));
  EXPECT_LT(CTimeSpan(1), CTimeSpan(2));
  EXPECT_EQ(CTimeSpan(5) + CTimeSpan(7), CTimeSpan(12));
  EXPECT_EQ(CTimeSpan(5) - CTimeSpan(7), CTimeSpan(-2));
}

TEST(CTimeSpan, StopsAtTheEndsOfTheRange) {
  const CTimeSpan largest(std::numeric_limits<__int64>::max());
  EXPECT_EQ(largest + CTimeSpan(1), largest);
  EXPECT_EQ((-largest - CTimeSpan(5)).GetTimeSpan(), std::numeric_limits<__int64>::min());
  EXPECT_EQ((-CTimeSpan(std::numeric_limits<__int64>::min())).GetTimeSpan(),
            std::numeric_limits<__int64>::max());
}

// ---- CTime --------------------------------------------------------------------------------------

TEST(CTime, DefaultIsTheEmptyTime) {
  EXPECT_EQ(CTime().GetTime(), 0);
  EXPECT_EQ(CTime(), CTime(0));
}

TEST_F(LocalTime, CalendarConstructorTakesLocalTimeWithTheDaylightSavingFlag) {
  EXPECT_EQ(CTime(2021, 7, 1, 12, 0, 0).GetTime(), kSummerNoonCest);
  EXPECT_EQ(CTime(2021, 7, 1, 12, 0, 0, 1).GetTime(), kSummerNoonCest);
  EXPECT_EQ(CTime(2021, 7, 1, 12, 0, 0, 0).GetTime(), kSummerNoonCest + 3600);
  EXPECT_EQ(CTime(2021, 1, 15, 12, 0, 0, -1).GetTime(), kWinterNoonCet);
}

TEST_F(LocalTime, InvalidCalendarFieldsGiveTheEmptyTime) {
  EXPECT_EQ(CTime(2021, 13, 1, 0, 0, 0).GetTime(), 0);
  EXPECT_EQ(CTime(2021, 0, 1, 0, 0, 0).GetTime(), 0);
  EXPECT_EQ(CTime(2021, 2, 29, 0, 0, 0).GetTime(), 0);
  EXPECT_EQ(CTime(2021, 1, 1, 24, 0, 0).GetTime(), 0);
  EXPECT_EQ(CTime(2021, 1, 1, 0, -1, 0).GetTime(), 0);
  EXPECT_EQ(CTime(2021, 1, 1, 0, 0, 60).GetTime(), 0);
  EXPECT_EQ(CTime(1500, 1, 1, 0, 0, 0).GetTime(), 0);
  EXPECT_EQ(CTime(systemTime(2021, 4, 31)).GetTime(), 0);
}

TEST_F(LocalTime, GivesTheLocalCalendarFields) {
  const CTime time(kSummerNoonCest + 5 * 60 + 6);
  EXPECT_EQ(time.GetYear(), 2021);
  EXPECT_EQ(time.GetMonth(), 7);
  EXPECT_EQ(time.GetDay(), 1);
  EXPECT_EQ(time.GetHour(), 12);
  EXPECT_EQ(time.GetMinute(), 5);
  EXPECT_EQ(time.GetSecond(), 6);
  EXPECT_EQ(time.GetDayOfWeek(), 5);  // Thursday

  std::tm fields{};
  ASSERT_EQ(time.GetGmtTm(&fields), &fields);
  EXPECT_EQ(fields.tm_hour, 10);
  ASSERT_EQ(time.GetLocalTm(&fields), &fields);
  EXPECT_EQ(fields.tm_hour, 12);
  EXPECT_EQ(time.GetLocalTm(nullptr), nullptr);
}

TEST_F(LocalTime, SystemTimeRoundTripsAsLocalTime) {
  const CTime time(systemTime(2016, 1, 1, 0, 30, 15, 999));
  EXPECT_EQ(time, CTime(2016, 1, 1, 0, 30, 15));
  SYSTEMTIME back;
  ASSERT_TRUE(time.GetAsSystemTime(back));
  expectFields(back, 2016, 1, 1, 0, 30, 15, 0);
  EXPECT_EQ(back.wDayOfWeek, 5);
}

TEST_F(LocalTime, FileTimeNamesAnInstantInUtc) {
  const FILETIME file =
      fileTime(kTicksAt1970 + static_cast<std::uint64_t>(kSummerNoonCest) * kTicksPerSecond + 9999999);
  EXPECT_EQ(CTime(file).GetTime(), kSummerNoonCest);
  EXPECT_EQ(CTime(file, 0).GetTime(), kSummerNoonCest);
  EXPECT_EQ(CTime(file, 1).GetTime(), kSummerNoonCest);
  EXPECT_EQ(CTime(fileTime(0x8000000000000000ull)).GetTime(), 0);
  EXPECT_EQ(CTime(fileTime(kTicksAt1970 + 86400 * kTicksPerSecond)).GetTime(), 86400);
}

TEST_F(LocalTime, FormatsLocalTimeAndUtc) {
  const CTime time(2021, 7, 1, 12, 0, 5);
  EXPECT_EQ(time.Format(L"%Y-%m-%d"), L"2021-07-01");
  EXPECT_EQ(time.Format(L"%H:%M:%S"), L"12:00:05");
  EXPECT_EQ(time.FormatGmt(L"%H:%M:%S"), L"10:00:05");
  EXPECT_EQ(time.Format(L"%A %B"), L"Thursday July");
  EXPECT_EQ(time.Format(L"%p"), L"PM");
  EXPECT_TRUE(time.Format(L"").IsEmpty());
  EXPECT_TRUE(time.Format(nullptr).IsEmpty());
}

TEST_F(LocalTime, FormatsLongTexts) {
  const std::wstring format(300, L'x');
  EXPECT_EQ(CTime(kWinterNoonCet).Format((format + L"%Y").c_str()), (format + L"2021").c_str());
}

TEST_F(LocalTime, FormatUsesTheCLocaleNamesWhateverTheProcessLocale) {
  const dex_test::CommaLocale comma;
  if (!comma.active()) GTEST_SKIP() << comma.reason();
  EXPECT_EQ(CTime(2021, 7, 1, 12, 0, 5).Format(L"%A %d %B %Y"), L"Thursday 01 July 2021");
}

TEST(CTime, ComparesAndCountsInSeconds) {
  CTime time(1000);
  time += CTimeSpan(0, 0, 1, 0);
  EXPECT_EQ(time.GetTime(), 1060);
  time -= CTimeSpan(10);
  EXPECT_EQ(time.GetTime(), 1050);
  EXPECT_EQ((time + CTimeSpan(50)).GetTime(), 1100);
  EXPECT_EQ((time - CTimeSpan(50)).GetTime(), 1000);
  EXPECT_EQ(CTime(1100) - CTime(1000), CTimeSpan(100));
  EXPECT_EQ(CTime(1000) - CTime(1100), CTimeSpan(-100));

  EXPECT_TRUE(CTime(1) < CTime(2));
  EXPECT_TRUE(CTime(2) > CTime(1));
  EXPECT_TRUE(CTime(2) >= CTime(2));
  EXPECT_TRUE(CTime(2) <= CTime(2));
  EXPECT_TRUE(CTime(2) != CTime(3));
  EXPECT_FALSE(CTime(2) == CTime(3));
}

TEST(CTime, ArithmeticStopsAtTheEndsOfTheRange) {
  CTime time(std::numeric_limits<__int64>::max() - 1);
  time += CTimeSpan(10);
  EXPECT_EQ(time.GetTime(), std::numeric_limits<__int64>::max());
  EXPECT_EQ((CTime(std::numeric_limits<__int64>::min()) - CTime(1)).GetTimeSpan(),
            std::numeric_limits<__int64>::min());
}

TEST(CTime, ATimeTheCLibraryCannotBreakDownAnswersZerosAndEmptyTexts) {
  const CTime huge(std::numeric_limits<__int64>::max());
  EXPECT_EQ(huge.GetYear(), 0);
  EXPECT_EQ(huge.GetDayOfWeek(), 0);
  EXPECT_TRUE(huge.Format(L"%Y").IsEmpty());
  EXPECT_TRUE(huge.FormatGmt(L"%Y").IsEmpty());
  std::tm fields{};
  EXPECT_EQ(huge.GetGmtTm(&fields), nullptr);
  SYSTEMTIME system = systemTime(2000, 1, 1);
  EXPECT_FALSE(huge.GetAsSystemTime(system));
  EXPECT_EQ(system.wYear, 2000);
}

TEST_F(LocalTime, TimesOutsideTheSystemTimeYearsAreNotGivenAsSystemTime) {
  SYSTEMTIME system = systemTime(2000, 1, 1);
  const CTime farFuture(static_cast<__int64>(40000 - 1970) * 365 * 86400);
  EXPECT_FALSE(farFuture.GetAsSystemTime(system));
  EXPECT_EQ(system.wYear, 2000);
}

}  // namespace
