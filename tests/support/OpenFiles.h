#pragma once

#include <filesystem>

namespace dex_test {

// Number of file descriptors the process holds, to show that a reader closes what it opened.
inline int openFileDescriptors() {
  int count = 0;
  for ([[maybe_unused]] const auto& entry : std::filesystem::directory_iterator("/proc/self/fd"))
    ++count;
  return count;
}

}  // namespace dex_test
