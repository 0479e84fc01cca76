#include "support/FuzzCheck.h"

#include <cstdio>
#include <cstdlib>

#include "hostlibs/VynLogging.h"

namespace dex_fuzz {

void failCheck(const char* condition, const char* file, int line) {
  std::fprintf(stderr, "%s:%d: fuzz check failed: %s\n", file, line, condition);
  std::fflush(stderr);
  std::abort();
}

void silenceLogs() {
  static const bool silenced = (vyn_logging::setLogSink([](const vyn_logging::LogRecord&) {}), true);
  (void)silenced;
}

}  // namespace dex_fuzz
