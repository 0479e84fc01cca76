#pragma once

#include <compare>
#include <ctime>

#include "hostlibs/DexApi.h"
#include "hostlibs/VynAlloc.h"
#include "hostlibs/VynString.h"
#include "hostlibs/winport.h"

namespace base {

// A length of time in whole seconds (64-bit), positive or negative. Arithmetic that would leave the
// 64-bit range stops at its ends.
class DEX_API CTimeSpan {
 public:
  VYN_CLASS_ALLOCATOR

  constexpr CTimeSpan() noexcept = default;
  constexpr CTimeSpan(__int64 seconds) noexcept : seconds_(seconds) {}  // NOLINT(google-explicit-constructor)
  constexpr CTimeSpan(LONG days, int hours, int minutes, int seconds) noexcept
      : seconds_(((static_cast<__int64>(days) * 24 + hours) * 60 + minutes) * 60 + seconds) {}

  // The whole length, and its parts: whole days, then the hours (-23..23), minutes and seconds
  // (-59..59) that remain; the parts carry the sign of the span.
  constexpr __int64 GetTimeSpan() const noexcept { return seconds_; }
  constexpr __int64 GetDays() const noexcept { return seconds_ / 86400; }
  constexpr int GetHours() const noexcept { return static_cast<int>(seconds_ / 3600 % 24); }
  constexpr int GetMinutes() const noexcept { return static_cast<int>(seconds_ / 60 % 60); }
  constexpr int GetSeconds() const noexcept { return static_cast<int>(seconds_ % 60); }
  constexpr __int64 GetTotalHours() const noexcept { return seconds_ / 3600; }
  constexpr __int64 GetTotalMinutes() const noexcept { return seconds_ / 60; }
  constexpr __int64 GetTotalSeconds() const noexcept { return seconds_; }

  CTimeSpan operator+(CTimeSpan other) const noexcept;
  CTimeSpan operator-(CTimeSpan other) const noexcept;
  CTimeSpan& operator+=(CTimeSpan other) noexcept;
  CTimeSpan& operator-=(CTimeSpan other) noexcept;
  CTimeSpan operator-() const noexcept;

  friend constexpr bool operator==(const CTimeSpan&, const CTimeSpan&) = default;
  friend constexpr auto operator<=>(const CTimeSpan&, const CTimeSpan&) = default;

 private:
  __int64 seconds_ = 0;
};

// A moment in time: a 64-bit count of seconds since 1970-01-01 00:00:00 UTC. 0, the default, is the
// empty time; every constructor that is given an invalid date answers it. The calendar constructors
// and the calendar accessors work in the local time zone of the process (the TZ environment variable
// is followed). Arithmetic that would leave the 64-bit range stops at its ends.
class DEX_API CTime {
 public:
  VYN_CLASS_ALLOCATOR

  // ---- Construction ---------------------------------------------------------------------------
  constexpr CTime() noexcept = default;
  constexpr CTime(__int64 time) noexcept : time_(time) {}  // NOLINT(google-explicit-constructor)
  // A local date and time. dst as tm_isdst of mktime: above 0 daylight saving time is in effect, 0 it
  // is not, below 0 the time zone rules decide. Valid fields are years 1601 to 30827, months 1 to 12,
  // days that exist in that month, hours 0 to 23, minutes and seconds 0 to 59; anything else gives
  // the empty time.
  CTime(int year, int month, int day, int hour, int minute, int second, int dst = -1) noexcept;
  // A local time given as SYSTEMTIME (its milliseconds and day of the week are not used).
  CTime(const SYSTEMTIME& localTime, int dst = -1) noexcept;  // NOLINT(google-explicit-constructor)
  // A FILETIME names an instant in UTC, so dst changes nothing; the fraction of a second is dropped.
  // A FILETIME beyond the Windows range (the top bit set) gives the empty time.
  CTime(const FILETIME& fileTime, int dst = -1) noexcept;  // NOLINT(google-explicit-constructor)

  // The system clock, to the second.
  static CTime GetCurrentTime() noexcept;

  // ---- Access ---------------------------------------------------------------------------------
  constexpr __int64 GetTime() const noexcept { return time_; }

  // Local calendar fields; 0 for a time that the C library cannot break down.
  int GetYear() const noexcept;
  int GetMonth() const noexcept;      // 1..12
  int GetDay() const noexcept;        // 1..31
  int GetHour() const noexcept;       // 0..23
  int GetMinute() const noexcept;     // 0..59
  int GetSecond() const noexcept;     // 0..59
  int GetDayOfWeek() const noexcept;  // 1 Sunday .. 7 Saturday

  // The UTC or local breakdown written to result; result, or null when result is null or the time
  // cannot be broken down.
  struct tm* GetGmtTm(struct tm* result) const noexcept;
  struct tm* GetLocalTm(struct tm* result) const noexcept;
  // The local time as SYSTEMTIME (milliseconds 0); false, leaving it unchanged, outside years 1601 to
  // 30827.
  bool GetAsSystemTime(SYSTEMTIME& localTime) const noexcept;

  // strftime (as wcsftime) with the C locale's names and conventions on the local time (Format) or
  // on UTC (FormatGmt): Format(L"%Y-%m-%d") gives "2024-03-01". An empty or null format, or a time that
  // cannot be broken down, gives the empty text.
  CVynStringT<wchar_t> Format(const wchar_t* format) const;
  CVynStringT<wchar_t> FormatGmt(const wchar_t* format) const;

  // ---- Arithmetic and comparison --------------------------------------------------------------
  CTime& operator+=(CTimeSpan span) noexcept;
  CTime& operator-=(CTimeSpan span) noexcept;
  CTime operator+(CTimeSpan span) const noexcept;
  CTime operator-(CTimeSpan span) const noexcept;
  CTimeSpan operator-(CTime other) const noexcept;

  friend constexpr bool operator==(const CTime&, const CTime&) = default;
  friend constexpr auto operator<=>(const CTime&, const CTime&) = default;

 private:
  __int64 time_ = 0;
};

}  // namespace base
