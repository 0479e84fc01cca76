#include <gtest/gtest.h>

#include <cstdio>
#include <string>

#include "support/TestLocale.h"

// The main of every GoogleTest program: runs the tests under the locale DEXCHANGE_TEST_LOCALE names,
// if any (see TestLocale.h), and fails at once when that locale cannot be set.
int main(int argc, char** argv) {
  testing::InitGoogleTest(&argc, argv);
  std::string problem;
  if (!dex_test::applyTestLocale(problem)) {
    std::fprintf(stderr, "%s\n", problem.c_str());
    return 2;
  }
  return RUN_ALL_TESTS();
}
