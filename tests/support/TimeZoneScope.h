#pragma once

#include <optional>
#include <string>

namespace dex_test {

// Sets the process time zone (the TZ environment variable, then tzset) for the life of the object and
// restores the previous one afterwards. POSIX rule texts need no time zone database:
// "CET-1CEST,M3.5.0,M10.5.0/3" is Central European time, "UTC0" is UTC.
class TimeZoneScope {
 public:
  explicit TimeZoneScope(const char* zone);
  ~TimeZoneScope();
  TimeZoneScope(const TimeZoneScope&) = delete;
  TimeZoneScope& operator=(const TimeZoneScope&) = delete;

 private:
  std::optional<std::string> previous_;
};

// Central European time with its daylight saving rules (UTC+1, in summer UTC+2).
inline constexpr const char* kCentralEuropeanZone = "CET-1CEST,M3.5.0,M10.5.0/3";

}  // namespace dex_test
