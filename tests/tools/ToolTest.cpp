// The tool's own options, help and command-line faults.

#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "ToolRun.h"
#include "support/CommaLocale.h"
#include "support/TempDir.h"

namespace {

using dex_test::contains;
using dex_test::runApart;

TEST(Tool, PrintsVersionAndHelp) {
  const struct {
    const char* arguments;
    const char* part;
  } cases[] = {
      {"--version", "dexchange "},
      {"--help", "usage: dexchange"},
      {"version --help", "usage: dexchange version"},
      {"help convert", "--order ORDER      the columns of a point file as an order name: PNEZD, PENZD"},
      {"info --help", "--json             print the report as JSON on stdout"},
  };
  for (const auto& [arguments, part] : cases) {
    const auto run = runApart(arguments);
    EXPECT_EQ(0, run.exitCode) << arguments;
    EXPECT_TRUE(contains(run.out, part)) << arguments << "\n" << run.out;
  }
}

TEST(Tool, WrongCommandLinesFailWithOneLine) {
  const struct {
    const char* arguments;
    const char* message;
  } cases[] = {
      {"", ""},
      {"frobnicate", "dexchange: unknown command frobnicate (see dexchange --help)\n"},
      {"help frobnicate", "dexchange: unknown command frobnicate\n"},
      {"version --bogus", "dexchange: version: unknown option --bogus\n"},
      {"version extra", "dexchange: version: unexpected argument extra\n"},
  };
  for (const auto& [arguments, message] : cases) {
    const auto run = runApart(arguments);
    EXPECT_EQ(2, run.exitCode) << arguments;
    if (message[0] != '\0') {
      EXPECT_EQ(message, run.err) << arguments;
    }
  }
}

// The tool takes the user's locale, as a host application does; what it prints must not change.
TEST(Tool, PrintsTheSameUnderACommaDecimalLocale) {
  const dex_test::CommaLocale comma;  // compiles the locale into the build tree when none is installed
  if (!comma.active()) GTEST_SKIP() << comma.reason();
  const std::string sample = "'" + dex_test::dataFile("pointfiles/geodepy_Site13-134.txt") + "'";
  // glibc's newlocale keeps the LOCPATH search list (built by __argz_add_sep) past exit; the comma
  // locale needs LOCPATH here.
  const dex_test::TempDir folder;
  const std::string glibc = "LSAN_OPTIONS=print_suppressions=0:suppressions='" +
                            folder.write("lsan.txt", "leak:__argz_add_sep\n") + "' ";
  for (const std::string& arguments :
       std::vector<std::string>{"--help", "--version", "frobnicate", "formats", "formats --json",
                                "formats --export --type POINTS --json", "info " + sample + " --order PENZD",
                                "info " + sample + " --json"}) {
    const auto plain = runApart(arguments, glibc + "LC_ALL=C");
    const auto commaRun = runApart(arguments, glibc + comma.environment());
    EXPECT_EQ(commaRun.exitCode, plain.exitCode) << arguments;
    EXPECT_EQ(commaRun.out + commaRun.err, plain.out + plain.err) << arguments;
  }
}

}  // namespace
