#include "MemoryTuning.h"

#include <unistd.h>

#include <cstdlib>

namespace dexchange_tool {

namespace {
constexpr const char* kTunablesVariable = "GLIBC_TUNABLES";
constexpr const char* kTunables = "glibc.malloc.hugetlb=1:glibc.malloc.arena_max=1";
}  // namespace

void restartWithMemoryTuning(char** argv) {
  if (argv == nullptr || argv[0] == nullptr || std::getenv(kTunablesVariable) != nullptr) return;
  if (setenv(kTunablesVariable, kTunables, 0) != 0) return;
  execv("/proc/self/exe", argv);
  unsetenv(kTunablesVariable);
}

}  // namespace dexchange_tool
