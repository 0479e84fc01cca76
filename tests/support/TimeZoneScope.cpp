#include "support/TimeZoneScope.h"

#include <cstdlib>
#include <ctime>

namespace dex_test {

TimeZoneScope::TimeZoneScope(const char* zone) {
  if (const char* current = std::getenv("TZ")) previous_ = current;
  setenv("TZ", zone, 1);
  tzset();
}

TimeZoneScope::~TimeZoneScope() {
  if (previous_) {
    setenv("TZ", previous_->c_str(), 1);
  } else {
    unsetenv("TZ");
  }
  tzset();
}

}  // namespace dex_test
