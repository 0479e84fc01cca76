#include "hostlibs/VynTime.h"

#include <gtest/gtest.h>

#include <cstdint>
#include <limits>
#include <string>
#include <utility>

#include "support/CommaLocale.h"
#include "support/PrintString.h"
#include "support/Rows.h"
#include "support/SystemTime.h"
#include "support/TimeZoneScope.h"

namespace {

using base::CTime;
using base::CTimeSpan;
using dex_test::systemTime;
using Seconds = std::pair<__int64, __int64>;

constexpr std::uint64_t kTicksPerSecond = 10'000'000;
constexpr std::uint64_t kTicksAt1970 = 116444736000000000ull;
constexpr __int64 kLargest = std::numeric_limits<__int64>::max();
constexpr __int64 kSmallest = std::numeric_limits<__int64>::min();
// 2021-07-01 10:00:00 UTC (12:00 summer time in Central Europe), 2021-01-15 11:00:00 UTC (12:00 winter).
constexpr __int64 kSummerNoonCest = 1625133600;
constexpr __int64 kWinterNoonCet = 1610708400;

FILETIME fileTime(std::uint64_t ticks) {
  return FILETIME{static_cast<DWORD>(ticks & 0xFFFFFFFFu), static_cast<DWORD>(ticks >> 32)};
}

std::uint64_t ticksOf(const FILETIME& time) {
  return (static_cast<std::uint64_t>(time.dwHighDateTime) << 32) | time.dwLowDateTime;
}

std::uint64_t ticksAt(__int64 seconds) {
  return kTicksAt1970 + static_cast<std::uint64_t>(seconds) * kTicksPerSecond;
}

// The fields as "Y-M-D h:m:s.ms dW".
std::string fieldsOf(const SYSTEMTIME& t) {
  return std::to_string(t.wYear) + "-" + std::to_string(t.wMonth) + "-" + std::to_string(t.wDay) + " " +
         std::to_string(t.wHour) + ":" + std::to_string(t.wMinute) + ":" + std::to_string(t.wSecond) + "." +
         std::to_string(t.wMilliseconds) + " d" + std::to_string(t.wDayOfWeek);
}

std::string systemTimeOf(std::uint64_t ticks) {
  SYSTEMTIME time;
  const FILETIME file = fileTime(ticks);
  return FileTimeToSystemTime(&file, &time) ? fieldsOf(time) : "refused";
}

// Local times are tested in Central European time, whatever zone the machine is set to.
class LocalTime : public ::testing::Test {
 private:
  dex_test::TimeZoneScope zone_{dex_test::kCentralEuropeanZone};
};

TEST(FileTime, CountsFrom1601AndRoundTripsThroughSystemTimeToTheMillisecond) {
  const std::pair<std::string, const char*> rows[] = {
      {systemTimeOf(0), "1601-1-1 0:0:0.0 d1"},
      {systemTimeOf(kTicksAt1970), "1970-1-1 0:0:0.0 d4"},
      {systemTimeOf(kTicksAt1970 + 1234567), "1970-1-1 0:0:0.123 d4"},
      {systemTimeOf(0x7FFFFFFFFFFFFFFFull).substr(0, 5), "30828"},
      {systemTimeOf(0x8000000000000000ull), "refused"}};
  dex_test::expectRows(rows);
  for (const SYSTEMTIME& start : {systemTime(2024, 2, 29, 13, 45, 30, 250), systemTime(1601, 1, 1),
                                  systemTime(30827, 12, 31, 23, 59, 59, 999),
                                  systemTime(1969, 12, 31, 23, 59, 59), systemTime(2000, 2, 29)}) {
    FILETIME file;
    ASSERT_TRUE(SystemTimeToFileTime(&start, &file));
    EXPECT_EQ(systemTimeOf(ticksOf(file)).substr(0, fieldsOf(start).size() - 3),
              fieldsOf(start).substr(0, fieldsOf(start).size() - 3));
  }
  FILETIME epoch;
  const SYSTEMTIME start = systemTime(1970, 1, 1);
  ASSERT_TRUE(SystemTimeToFileTime(&start, &epoch));
  EXPECT_EQ(ticksOf(epoch), kTicksAt1970);
}

TEST(SystemTime, InvalidFieldsAndNullArgumentsAreRefusedAndLeaveTheTargetUnchanged) {
  for (const SYSTEMTIME& time :
       {systemTime(2021, 0, 1), systemTime(2021, 13, 1), systemTime(2021, 1, 0), systemTime(2021, 1, 32),
        systemTime(2023, 2, 29), systemTime(1900, 2, 29), systemTime(2021, 4, 31), systemTime(2021, 1, 1, 24),
        systemTime(2021, 1, 1, 0, 60), systemTime(2021, 1, 1, 0, 0, 60),
        systemTime(2021, 1, 1, 0, 0, 0, 1000), systemTime(1600, 12, 31), systemTime(30828, 1, 1)}) {
    FILETIME file = fileTime(42);
    EXPECT_FALSE(SystemTimeToFileTime(&time, &file)) << fieldsOf(time);
    EXPECT_EQ(ticksOf(file), 42u);
  }
  SYSTEMTIME time;
  FILETIME file;
  EXPECT_FALSE(FileTimeToSystemTime(nullptr, &time) || FileTimeToSystemTime(&file, nullptr) ||
               SystemTimeToFileTime(nullptr, &file) || FileTimeToLocalFileTime(nullptr, &file) ||
               LocalFileTimeToFileTime(&file, nullptr) ||
               SystemTimeToTzSpecificLocalTime(nullptr, nullptr, &time));
  GetSystemTime(nullptr);
  GetLocalTime(nullptr);
}

TEST_F(LocalTime, FileAndSystemTimesShiftByTheOffsetOfTheirDate) {
  const auto expectShift = [](std::uint64_t utc, std::uint64_t offset) {
    FILETIME local;
    FILETIME back;
    const FILETIME start = fileTime(utc);
    ASSERT_TRUE(FileTimeToLocalFileTime(&start, &local));
    EXPECT_EQ(ticksOf(local), utc + offset * kTicksPerSecond);
    ASSERT_TRUE(LocalFileTimeToFileTime(&local, &back));
    EXPECT_EQ(ticksOf(back), utc);
  };
  expectShift(ticksAt(kWinterNoonCet) + 5, 3600);
  expectShift(ticksAt(kSummerNoonCest), 7200);
  const FILETIME beforeTheFirstTick = fileTime(0);
  FILETIME untouched = fileTime(42);
  EXPECT_FALSE(LocalFileTimeToFileTime(&beforeTheFirstTick, &untouched));
  EXPECT_EQ(ticksOf(untouched), 42u);

  const SYSTEMTIME utc = systemTime(2015, 12, 31, 23, 30, 0);
  SYSTEMTIME local;
  ASSERT_TRUE(SystemTimeToTzSpecificLocalTime(nullptr, &utc, &local));
  EXPECT_EQ(fieldsOf(local), "2016-1-1 0:30:0.0 d5");
  const int zoneInformation = 0;
  EXPECT_FALSE(SystemTimeToTzSpecificLocalTime(&zoneInformation, &utc, &local));
  const SYSTEMTIME invalid = systemTime(2015, 13, 1);
  EXPECT_FALSE(SystemTimeToTzSpecificLocalTime(nullptr, &invalid, &local));

  SYSTEMTIME utcNow;
  SYSTEMTIME localNow;
  GetSystemTime(&utcNow);
  GetLocalTime(&localNow);
  FILETIME utcFile;
  FILETIME localFile;
  ASSERT_TRUE(SystemTimeToFileTime(&utcNow, &utcFile) && SystemTimeToFileTime(&localNow, &localFile));
  EXPECT_NEAR(static_cast<double>(CTime(utcFile).GetTime()),
              static_cast<double>(CTime::GetCurrentTime().GetTime()), 2.0);
  const __int64 offset = CTime(localFile).GetTime() - CTime(utcFile).GetTime();
  EXPECT_TRUE(offset >= 3599 && offset <= 7201) << offset;
}

TEST(CTimeSpan, SplitsCountsAndStopsAtTheEndsOfTheRange) {
  const CTimeSpan span(1, 2, 3, 4);
  CTimeSpan edited(0, 1, 0, 0);
  edited += CTimeSpan(30);
  edited -= CTimeSpan(0, 0, 1, 0);
  const Seconds rows[] = {{span.GetTimeSpan(), 93784},
                          {span.GetDays(), 1},
                          {span.GetHours(), 2},
                          {span.GetMinutes(), 3},
                          {span.GetSeconds(), 4},
                          {span.GetTotalHours(), 26},
                          {span.GetTotalMinutes(), 1563},
                          {(-span).GetDays(), -1},
                          {(-span).GetHours(), -2},
                          {(-span).GetSeconds(), -4},
                          {edited.GetTotalSeconds(), 3570},
                          {(CTimeSpan(5) + CTimeSpan(7)).GetTimeSpan(), 12},
                          {(CTimeSpan(5) - CTimeSpan(7)).GetTimeSpan(), -2},
                          {(CTimeSpan(kLargest) + CTimeSpan(1)).GetTimeSpan(), kLargest},
                          {(-CTimeSpan(kLargest) - CTimeSpan(5)).GetTimeSpan(), kSmallest},
                          {(-CTimeSpan(kSmallest)).GetTimeSpan(), kLargest}};
  dex_test::expectRows(rows);
  EXPECT_LT(CTimeSpan(1), CTimeSpan(2));
}

TEST(CTime, ComparesCountsInSecondsAndStopsAtTheEndsOfTheRange) {
  CTime time(1000);
  time += CTimeSpan(0, 0, 1, 0);
  time -= CTimeSpan(10);
  CTime largest(kLargest - 1);
  largest += CTimeSpan(10);
  const Seconds rows[] = {{CTime().GetTime(), 0},
                          {time.GetTime(), 1050},
                          {(time + CTimeSpan(50)).GetTime(), 1100},
                          {(time - CTimeSpan(50)).GetTime(), 1000},
                          {(CTime(1100) - CTime(1000)).GetTimeSpan(), 100},
                          {(CTime(1000) - CTime(1100)).GetTimeSpan(), -100},
                          {largest.GetTime(), kLargest},
                          {(CTime(kSmallest) - CTime(1)).GetTimeSpan(), kSmallest}};
  dex_test::expectRows(rows);
  EXPECT_TRUE(CTime(1) < CTime(2) && CTime(2) > CTime(1) && CTime(2) >= CTime(2) && CTime(2) <= CTime(2));
  EXPECT_TRUE(CTime(2) != CTime(3) && !(CTime(2) == CTime(3)) && CTime() == CTime(0));
}

// Calendar fields are local time (invalid ones give the empty time); a file time names an instant in UTC.
TEST_F(LocalTime, CalendarFieldsAreLocalTimeAndFileTimesUtc) {
  const Seconds rows[] = {{CTime(2021, 7, 1, 12, 0, 0).GetTime(), kSummerNoonCest},
                          {CTime(2021, 7, 1, 12, 0, 0, 1).GetTime(), kSummerNoonCest},
                          {CTime(2021, 7, 1, 12, 0, 0, 0).GetTime(), kSummerNoonCest + 3600},
                          {CTime(2021, 1, 15, 12, 0, 0, -1).GetTime(), kWinterNoonCet},
                          {CTime(2021, 13, 1, 0, 0, 0).GetTime(), 0},
                          {CTime(2021, 0, 1, 0, 0, 0).GetTime(), 0},
                          {CTime(2021, 2, 29, 0, 0, 0).GetTime(), 0},
                          {CTime(2021, 1, 1, 24, 0, 0).GetTime(), 0},
                          {CTime(2021, 1, 1, 0, -1, 0).GetTime(), 0},
                          {CTime(2021, 1, 1, 0, 0, 60).GetTime(), 0},
                          {CTime(1500, 1, 1, 0, 0, 0).GetTime(), 0},
                          {CTime(systemTime(2021, 4, 31)).GetTime(), 0},
                          {CTime(fileTime(ticksAt(kSummerNoonCest) + 9999999)).GetTime(), kSummerNoonCest},
                          {CTime(fileTime(ticksAt(kSummerNoonCest)), 0).GetTime(), kSummerNoonCest},
                          {CTime(fileTime(ticksAt(kSummerNoonCest)), 1).GetTime(), kSummerNoonCest},
                          {CTime(fileTime(0x8000000000000000ull)).GetTime(), 0},
                          {CTime(fileTime(ticksAt(86400))).GetTime(), 86400}};
  dex_test::expectRows(rows);

  const CTime time(kSummerNoonCest + 5 * 60 + 6);
  const std::pair<int, int> fields[] = {{time.GetYear(), 2021},  {time.GetMonth(), 7},  {time.GetDay(), 1},
                                        {time.GetHour(), 12},    {time.GetMinute(), 5}, {time.GetSecond(), 6},
                                        {time.GetDayOfWeek(), 5}};
  dex_test::expectRows(fields);
  std::tm parts{};
  ASSERT_EQ(time.GetGmtTm(&parts), &parts);
  EXPECT_EQ(parts.tm_hour, 10);
  ASSERT_EQ(time.GetLocalTm(&parts), &parts);
  EXPECT_EQ(parts.tm_hour, 12);
  EXPECT_EQ(time.GetLocalTm(nullptr), nullptr);

  const CTime newYear(systemTime(2016, 1, 1, 0, 30, 15, 999));
  EXPECT_EQ(newYear, CTime(2016, 1, 1, 0, 30, 15));
  SYSTEMTIME back;
  ASSERT_TRUE(newYear.GetAsSystemTime(back));
  EXPECT_EQ(fieldsOf(back), "2016-1-1 0:30:15.0 d5");
  SYSTEMTIME untouched = systemTime(2000, 1, 1);
  EXPECT_FALSE(CTime(static_cast<__int64>(40000 - 1970) * 365 * 86400).GetAsSystemTime(untouched));
  EXPECT_EQ(untouched.wYear, 2000);
}

TEST_F(LocalTime, FormatsLocalTimeAndUtcWithTheCLocaleNames) {
  const CTime time(2021, 7, 1, 12, 0, 5);
  const std::wstring longFormat(300, L'x');
  const std::pair<CVynStringT<wchar_t>, CVynStringT<wchar_t>> rows[] = {
      {time.Format(L"%Y-%m-%d"), L"2021-07-01"},
      {time.Format(L"%H:%M:%S"), L"12:00:05"},
      {time.FormatGmt(L"%H:%M:%S"), L"10:00:05"},
      {time.Format(L"%A %B"), L"Thursday July"},
      {time.Format(L"%p"), L"PM"},
      {time.Format(L""), L""},
      {time.Format(nullptr), L""},
      {CTime(kWinterNoonCet).Format((longFormat + L"%Y").c_str()), (longFormat + L"2021").c_str()}};
  dex_test::expectRows(rows);
  const dex_test::CommaLocale comma;
  if (!comma.active()) GTEST_SKIP() << comma.reason();
  EXPECT_EQ(time.Format(L"%A %d %B %Y"), L"Thursday 01 July 2021");
}

TEST(CTime, ATimeTheCLibraryCannotBreakDownAnswersZerosAndEmptyTexts) {
  const CTime huge(kLargest);
  EXPECT_EQ(huge.GetYear() + huge.GetDayOfWeek(), 0);
  EXPECT_TRUE(huge.Format(L"%Y").IsEmpty() && huge.FormatGmt(L"%Y").IsEmpty());
  std::tm fields{};
  EXPECT_EQ(huge.GetGmtTm(&fields), nullptr);
  SYSTEMTIME system = systemTime(2000, 1, 1);
  EXPECT_FALSE(huge.GetAsSystemTime(system));
  EXPECT_EQ(system.wYear, 2000);
}

}  // namespace
