#include "support/FuzzCheck.h"

#include <cstdio>
#include <cstdlib>

namespace dex_fuzz {

void failCheck(const char* condition, const char* file, int line) {
  std::fprintf(stderr, "%s:%d: fuzz check failed: %s\n", file, line, condition);
  std::fflush(stderr);
  std::abort();
}

}  // namespace dex_fuzz
