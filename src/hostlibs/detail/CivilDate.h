#pragma once

#include <cstdint>

// Dates of the proleptic Gregorian calendar as day counts, without the range limits of the C
// library's calendar calls (the days-from-civil algorithms of H. Hinnant).
namespace base::detail {

constexpr bool isLeapYear(std::int64_t year) {
  return year % 4 == 0 && (year % 100 != 0 || year % 400 == 0);
}

// 28 to 31; 0 for a month outside 1..12.
constexpr int daysInMonth(std::int64_t year, int month) {
  constexpr int kDays[] = {31, 28, 31, 30, 31, 30, 31, 31, 30, 31, 30, 31};
  if (month < 1 || month > 12) return 0;
  return month == 2 && isLeapYear(year) ? 29 : kDays[month - 1];
}

// Days since 1970-01-01 of a valid date (negative before it).
constexpr std::int64_t daysFromCivil(std::int64_t year, int month, int day) {
  year -= month <= 2 ? 1 : 0;
  const std::int64_t era = (year >= 0 ? year : year - 399) / 400;
  const std::int64_t yearOfEra = year - era * 400;
  const std::int64_t dayOfYear = (153 * (month > 2 ? month - 3 : month + 9) + 2) / 5 + day - 1;
  const std::int64_t dayOfEra = yearOfEra * 365 + yearOfEra / 4 - yearOfEra / 100 + dayOfYear;
  return era * 146097 + dayOfEra - 719468;
}

struct CivilDate {
  std::int64_t year = 1970;
  int month = 1;
  int day = 1;
};

// The date of a count of days since 1970-01-01.
constexpr CivilDate civilFromDays(std::int64_t days) {
  days += 719468;
  const std::int64_t era = (days >= 0 ? days : days - 146096) / 146097;
  const std::int64_t dayOfEra = days - era * 146097;
  const std::int64_t yearOfEra = (dayOfEra - dayOfEra / 1460 + dayOfEra / 36524 - dayOfEra / 146096) / 365;
  const std::int64_t dayOfYear = dayOfEra - (365 * yearOfEra + yearOfEra / 4 - yearOfEra / 100);
  const std::int64_t shiftedMonth = (5 * dayOfYear + 2) / 153;
  CivilDate date;
  date.day = static_cast<int>(dayOfYear - (153 * shiftedMonth + 2) / 5 + 1);
  date.month = static_cast<int>(shiftedMonth < 10 ? shiftedMonth + 3 : shiftedMonth - 9);
  date.year = yearOfEra + era * 400 + (date.month <= 2 ? 1 : 0);
  return date;
}

// 0 for Sunday to 6 for Saturday (1970-01-01 was a Thursday).
constexpr int dayOfWeek(std::int64_t days) {
  const std::int64_t shifted = (days + 4) % 7;
  return static_cast<int>(shifted < 0 ? shifted + 7 : shifted);
}

static_assert(daysFromCivil(1970, 1, 1) == 0);
static_assert(daysFromCivil(1601, 1, 1) == -134774);
static_assert(civilFromDays(-134774).year == 1601);
static_assert(dayOfWeek(daysFromCivil(1601, 1, 1)) == 1);

}  // namespace base::detail
