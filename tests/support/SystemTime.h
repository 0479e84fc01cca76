#pragma once

#include "hostlibs/winport.h"

namespace dex_test {

// A calendar time as the host hands it over, fields unchecked (tests give invalid ones on purpose).
inline SYSTEMTIME systemTime(int year, int month, int day, int hour = 0, int minute = 0, int second = 0,
                             int ms = 0) {
  SYSTEMTIME time{};
  time.wYear = static_cast<WORD>(year);
  time.wMonth = static_cast<WORD>(month);
  time.wDay = static_cast<WORD>(day);
  time.wHour = static_cast<WORD>(hour);
  time.wMinute = static_cast<WORD>(minute);
  time.wSecond = static_cast<WORD>(second);
  time.wMilliseconds = static_cast<WORD>(ms);
  return time;
}

}  // namespace dex_test
