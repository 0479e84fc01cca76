#include "hostlibs/VynTime.h"

#include <cstdint>
#include <cwchar>
#include <limits>
#include <string>

#include "hostlibs/detail/CLocale.h"
#include "hostlibs/detail/CivilDate.h"

namespace {

using base::detail::civilFromDays;
using base::detail::dayOfWeek;
using base::detail::daysFromCivil;
using base::detail::daysInMonth;

constexpr std::int64_t kSecondsPerDay = 86400;
constexpr std::int64_t kTicksPerSecond = 10'000'000;  // FILETIME counts 100 ns
constexpr std::int64_t kTicksPerMillisecond = 10'000;
constexpr std::int64_t kTicksPerDay = kSecondsPerDay * kTicksPerSecond;
constexpr std::int64_t kDaysFrom1601To1970 = 134774;
constexpr std::int64_t kSecondsFrom1601To1970 = kDaysFrom1601To1970 * kSecondsPerDay;
constexpr std::int64_t kMaxFileTimeTicks = std::numeric_limits<std::int64_t>::max();
constexpr int kMinSystemYear = 1601;
constexpr int kMaxSystemYear = 30827;

std::int64_t saturatedSum(std::int64_t a, std::int64_t b) {
  std::int64_t sum = 0;
  if (!__builtin_add_overflow(a, b, &sum)) return sum;
  return b > 0 ? std::numeric_limits<std::int64_t>::max() : std::numeric_limits<std::int64_t>::min();
}

std::int64_t saturatedDifference(std::int64_t a, std::int64_t b) {
  std::int64_t difference = 0;
  if (!__builtin_sub_overflow(a, b, &difference)) return difference;
  return b < 0 ? std::numeric_limits<std::int64_t>::max() : std::numeric_limits<std::int64_t>::min();
}

// ---- Calendar fields ----------------------------------------------------------------------------

bool isValidCalendar(int year, int month, int day, int hour, int minute, int second) {
  return year >= kMinSystemYear && year <= kMaxSystemYear && month >= 1 && month <= 12 && day >= 1 &&
         day <= daysInMonth(year, month) && hour >= 0 && hour <= 23 && minute >= 0 && minute <= 59 &&
         second >= 0 && second <= 59;
}

bool isValidSystemTime(const SYSTEMTIME& time) {
  return isValidCalendar(time.wYear, time.wMonth, time.wDay, time.wHour, time.wMinute, time.wSecond) &&
         time.wMilliseconds <= 999;
}

// Seconds since 1970 of local calendar fields (mktime); false when the C library cannot place them.
bool localFieldsToSeconds(int year, int month, int day, int hour, int minute, int second, int dst,
                          std::int64_t& seconds) {
  std::tm fields{};
  fields.tm_year = year - 1900;
  fields.tm_mon = month - 1;
  fields.tm_mday = day;
  fields.tm_hour = hour;
  fields.tm_min = minute;
  fields.tm_sec = second;
  fields.tm_isdst = dst > 0 ? 1 : (dst == 0 ? 0 : -1);
  fields.tm_wday = -1;  // mktime sets it on success; -1 is also a valid result, one second before 1970
  const std::time_t result = std::mktime(&fields);
  if (fields.tm_wday == -1) return false;
  seconds = result;
  return true;
}

// localtime_r reads the time zone once; tzset first follows a TZ changed since.
bool localBreakdown(std::int64_t seconds, std::tm& fields) {
  tzset();
  const std::time_t time = static_cast<std::time_t>(seconds);
  return localtime_r(&time, &fields) != nullptr;
}

bool utcBreakdown(std::int64_t seconds, std::tm& fields) {
  const std::time_t time = static_cast<std::time_t>(seconds);
  return gmtime_r(&time, &fields) != nullptr;
}

// ---- FILETIME -----------------------------------------------------------------------------------

std::int64_t ticksOf(const FILETIME& fileTime) {
  const std::uint64_t ticks =
      (static_cast<std::uint64_t>(fileTime.dwHighDateTime) << 32) | fileTime.dwLowDateTime;
  return ticks > static_cast<std::uint64_t>(kMaxFileTimeTicks) ? -1 : static_cast<std::int64_t>(ticks);
}

FILETIME fileTimeOf(std::int64_t ticks) {
  FILETIME fileTime;
  fileTime.dwLowDateTime = static_cast<DWORD>(static_cast<std::uint64_t>(ticks) & 0xFFFFFFFFu);
  fileTime.dwHighDateTime = static_cast<DWORD>(static_cast<std::uint64_t>(ticks) >> 32);
  return fileTime;
}

// Seconds since 1970 of a FILETIME tick count (rounded down) and back.
std::int64_t unixSecondsOfTicks(std::int64_t ticks) {
  return ticks / kTicksPerSecond - kSecondsFrom1601To1970;
}

// The offset of local time from UTC at an instant, in seconds.
bool localOffsetAt(std::int64_t unixSeconds, std::int64_t& offset) {
  std::tm fields{};
  if (!localBreakdown(unixSeconds, fields)) return false;
  offset = fields.tm_gmtoff;
  return true;
}

// FILETIME ticks of seconds since 1970 plus a fraction of a second in ticks; false outside the
// FILETIME range.
bool ticksOfUnixSeconds(std::int64_t unixSeconds, std::int64_t fractionTicks, std::int64_t& ticks) {
  std::int64_t seconds = 0;
  std::int64_t wholeTicks = 0;
  return !__builtin_add_overflow(unixSeconds, kSecondsFrom1601To1970, &seconds) &&
         !__builtin_mul_overflow(seconds, kTicksPerSecond, &wholeTicks) &&
         !__builtin_add_overflow(wholeTicks, fractionTicks, &ticks) && ticks >= 0;
}

}  // namespace

// ---- Windows time calls -------------------------------------------------------------------------

BOOL FileTimeToSystemTime(const FILETIME* fileTime, SYSTEMTIME* systemTime) {
  if (fileTime == nullptr || systemTime == nullptr) return 0;
  const std::int64_t ticks = ticksOf(*fileTime);
  if (ticks < 0) return 0;
  const std::int64_t days = ticks / kTicksPerDay - kDaysFrom1601To1970;
  const std::int64_t ticksOfDay = ticks % kTicksPerDay;
  const std::int64_t secondsOfDay = ticksOfDay / kTicksPerSecond;
  const base::detail::CivilDate date = civilFromDays(days);
  systemTime->wYear = static_cast<WORD>(date.year);
  systemTime->wMonth = static_cast<WORD>(date.month);
  systemTime->wDay = static_cast<WORD>(date.day);
  systemTime->wDayOfWeek = static_cast<WORD>(dayOfWeek(days));
  systemTime->wHour = static_cast<WORD>(secondsOfDay / 3600);
  systemTime->wMinute = static_cast<WORD>(secondsOfDay / 60 % 60);
  systemTime->wSecond = static_cast<WORD>(secondsOfDay % 60);
  systemTime->wMilliseconds = static_cast<WORD>(ticksOfDay % kTicksPerSecond / kTicksPerMillisecond);
  return 1;
}

BOOL SystemTimeToFileTime(const SYSTEMTIME* systemTime, FILETIME* fileTime) {
  if (systemTime == nullptr || fileTime == nullptr || !isValidSystemTime(*systemTime)) return 0;
  const std::int64_t days =
      daysFromCivil(systemTime->wYear, systemTime->wMonth, systemTime->wDay) + kDaysFrom1601To1970;
  const std::int64_t seconds = days * kSecondsPerDay + std::int64_t{systemTime->wHour} * 3600 +
                               std::int64_t{systemTime->wMinute} * 60 + systemTime->wSecond;
  *fileTime = fileTimeOf(seconds * kTicksPerSecond + systemTime->wMilliseconds * kTicksPerMillisecond);
  return 1;
}

BOOL FileTimeToLocalFileTime(const FILETIME* utc, FILETIME* local) {
  if (utc == nullptr || local == nullptr) return 0;
  const std::int64_t ticks = ticksOf(*utc);
  std::int64_t offset = 0;
  if (ticks < 0 || !localOffsetAt(unixSecondsOfTicks(ticks), offset)) return 0;
  std::int64_t localTicks = 0;
  if (!ticksOfUnixSeconds(unixSecondsOfTicks(ticks) + offset, ticks % kTicksPerSecond, localTicks)) return 0;
  *local = fileTimeOf(localTicks);
  return 1;
}

BOOL LocalFileTimeToFileTime(const FILETIME* local, FILETIME* utc) {
  if (local == nullptr || utc == nullptr) return 0;
  const std::int64_t ticks = ticksOf(*local);
  std::tm fields{};
  if (ticks < 0 || !utcBreakdown(unixSecondsOfTicks(ticks), fields)) return 0;
  std::int64_t utcSeconds = 0;
  if (!localFieldsToSeconds(fields.tm_year + 1900, fields.tm_mon + 1, fields.tm_mday, fields.tm_hour,
                            fields.tm_min, fields.tm_sec, -1, utcSeconds)) {
    return 0;
  }
  std::int64_t utcTicks = 0;
  if (!ticksOfUnixSeconds(utcSeconds, ticks % kTicksPerSecond, utcTicks)) return 0;
  *utc = fileTimeOf(utcTicks);
  return 1;
}

BOOL SystemTimeToTzSpecificLocalTime(const void* timeZone, const SYSTEMTIME* utc, SYSTEMTIME* local) {
  if (timeZone != nullptr || utc == nullptr || local == nullptr) return 0;
  FILETIME utcFileTime;
  FILETIME localFileTime;
  SYSTEMTIME result;
  if (!SystemTimeToFileTime(utc, &utcFileTime) || !FileTimeToLocalFileTime(&utcFileTime, &localFileTime) ||
      !FileTimeToSystemTime(&localFileTime, &result)) {
    return 0;
  }
  *local = result;
  return 1;
}

namespace {

FILETIME currentFileTime() {
  timespec now{};
  clock_gettime(CLOCK_REALTIME, &now);
  std::int64_t ticks = 0;
  ticksOfUnixSeconds(now.tv_sec, now.tv_nsec / 100, ticks);
  return fileTimeOf(ticks);
}

}  // namespace

void GetSystemTime(SYSTEMTIME* systemTime) {
  if (systemTime == nullptr) return;
  const FILETIME now = currentFileTime();
  FileTimeToSystemTime(&now, systemTime);
}

void GetLocalTime(SYSTEMTIME* systemTime) {
  if (systemTime == nullptr) return;
  const FILETIME now = currentFileTime();
  FILETIME local;
  if (FileTimeToLocalFileTime(&now, &local)) FileTimeToSystemTime(&local, systemTime);
}

namespace base {

// ---- CTimeSpan ----------------------------------------------------------------------------------

CTimeSpan CTimeSpan::operator+(CTimeSpan other) const noexcept {
  return saturatedSum(seconds_, other.seconds_);
}

CTimeSpan CTimeSpan::operator-(CTimeSpan other) const noexcept {
  return saturatedDifference(seconds_, other.seconds_);
}

CTimeSpan& CTimeSpan::operator+=(CTimeSpan other) noexcept {
  return *this = *this + other;
}

CTimeSpan& CTimeSpan::operator-=(CTimeSpan other) noexcept {
  return *this = *this - other;
}

CTimeSpan CTimeSpan::operator-() const noexcept {
  return saturatedDifference(0, seconds_);
}

// ---- CTime --------------------------------------------------------------------------------------

namespace {

// wcsftime answers 0 both for a buffer too small and for an empty result; a bounded number of larger
// buffers tells the two apart.
CVynStringT<wchar_t> formatFields(const wchar_t* format, const std::tm& fields) {
  if (format == nullptr || *format == L'\0') return {};
  const vyn_text::detail::CLocaleScope cLocale;
  std::wstring buffer;
  for (std::size_t size = 128; size <= 65536; size *= 4) {
    buffer.assign(size, L'\0');
    const std::size_t written = std::wcsftime(buffer.data(), buffer.size(), format, &fields);
    if (written > 0) return CVynStringT<wchar_t>(buffer.data(), static_cast<int>(written));
  }
  return {};
}

}  // namespace

CTime::CTime(int year, int month, int day, int hour, int minute, int second, int dst) noexcept {
  std::int64_t seconds = 0;
  if (isValidCalendar(year, month, day, hour, minute, second) &&
      localFieldsToSeconds(year, month, day, hour, minute, second, dst, seconds)) {
    time_ = seconds;
  }
}

CTime::CTime(const SYSTEMTIME& localTime, int dst) noexcept
    : CTime(localTime.wYear, localTime.wMonth, localTime.wDay, localTime.wHour, localTime.wMinute,
            localTime.wSecond, dst) {}

CTime::CTime(const FILETIME& fileTime, int /*dst*/) noexcept {
  const std::int64_t ticks = ticksOf(fileTime);
  if (ticks >= 0) time_ = unixSecondsOfTicks(ticks);
}

CTime CTime::GetCurrentTime() noexcept {
  return CTime(static_cast<__int64>(std::time(nullptr)));
}

int CTime::GetYear() const noexcept {
  std::tm fields{};
  return localBreakdown(time_, fields) ? fields.tm_year + 1900 : 0;
}

int CTime::GetMonth() const noexcept {
  std::tm fields{};
  return localBreakdown(time_, fields) ? fields.tm_mon + 1 : 0;
}

int CTime::GetDay() const noexcept {
  std::tm fields{};
  return localBreakdown(time_, fields) ? fields.tm_mday : 0;
}

int CTime::GetHour() const noexcept {
  std::tm fields{};
  return localBreakdown(time_, fields) ? fields.tm_hour : 0;
}

int CTime::GetMinute() const noexcept {
  std::tm fields{};
  return localBreakdown(time_, fields) ? fields.tm_min : 0;
}

int CTime::GetSecond() const noexcept {
  std::tm fields{};
  return localBreakdown(time_, fields) ? fields.tm_sec : 0;
}

int CTime::GetDayOfWeek() const noexcept {
  std::tm fields{};
  return localBreakdown(time_, fields) ? fields.tm_wday + 1 : 0;
}

struct tm* CTime::GetGmtTm(struct tm* result) const noexcept {
  return result != nullptr && utcBreakdown(time_, *result) ? result : nullptr;
}

struct tm* CTime::GetLocalTm(struct tm* result) const noexcept {
  return result != nullptr && localBreakdown(time_, *result) ? result : nullptr;
}

bool CTime::GetAsSystemTime(SYSTEMTIME& localTime) const noexcept {
  std::tm fields{};
  if (!localBreakdown(time_, fields)) return false;
  const int year = fields.tm_year + 1900;
  if (year < kMinSystemYear || year > kMaxSystemYear) return false;
  localTime.wYear = static_cast<WORD>(year);
  localTime.wMonth = static_cast<WORD>(fields.tm_mon + 1);
  localTime.wDayOfWeek = static_cast<WORD>(fields.tm_wday);
  localTime.wDay = static_cast<WORD>(fields.tm_mday);
  localTime.wHour = static_cast<WORD>(fields.tm_hour);
  localTime.wMinute = static_cast<WORD>(fields.tm_min);
  localTime.wSecond = static_cast<WORD>(fields.tm_sec);
  localTime.wMilliseconds = 0;
  return true;
}

CVynStringT<wchar_t> CTime::Format(const wchar_t* format) const {
  std::tm fields{};
  return localBreakdown(time_, fields) ? formatFields(format, fields) : CVynStringT<wchar_t>();
}

CVynStringT<wchar_t> CTime::FormatGmt(const wchar_t* format) const {
  std::tm fields{};
  return utcBreakdown(time_, fields) ? formatFields(format, fields) : CVynStringT<wchar_t>();
}

CTime& CTime::operator+=(CTimeSpan span) noexcept {
  time_ = saturatedSum(time_, span.GetTimeSpan());
  return *this;
}

CTime& CTime::operator-=(CTimeSpan span) noexcept {
  time_ = saturatedDifference(time_, span.GetTimeSpan());
  return *this;
}

CTime CTime::operator+(CTimeSpan span) const noexcept {
  return CTime(*this) += span;
}

CTime CTime::operator-(CTimeSpan span) const noexcept {
  return CTime(*this) -= span;
}

CTimeSpan CTime::operator-(CTime other) const noexcept {
  return saturatedDifference(time_, other.time_);
}

}  // namespace base
