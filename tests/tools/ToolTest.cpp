#include <gtest/gtest.h>

#include <array>
#include <cstdio>
#include <string>

#include "support/CommaLocale.h"

namespace {

struct ToolRun {
  int exitCode = -1;
  std::string output;  // stdout and stderr together
};

// Runs the tool with arguments; environment, when given, holds NAME=value assignments for it.
ToolRun runTool(const std::string& arguments, const std::string& environment = "") {
  ToolRun run;
  const std::string prefix = environment.empty() ? std::string() : "env " + environment + " ";
  const std::string command = prefix + std::string(DEXCHANGE_TOOL_PATH) + " " + arguments + " 2>&1";
  FILE* pipe = ::popen(command.c_str(), "r");
  if (pipe == nullptr) return run;
  std::array<char, 512> chunk{};
  while (std::fgets(chunk.data(), chunk.size(), pipe) != nullptr)
    run.output += chunk.data();
  const int status = ::pclose(pipe);
  run.exitCode = WIFEXITED(status) ? WEXITSTATUS(status) : -1;
  return run;
}

}  // namespace

TEST(Tool, PrintsVersionAndHelp) {
  const ToolRun version = runTool("--version");
  EXPECT_EQ(0, version.exitCode);
  EXPECT_EQ(0u, version.output.rfind("dexchange ", 0));

  const ToolRun help = runTool("--help");
  EXPECT_EQ(0, help.exitCode);
  EXPECT_NE(std::string::npos, help.output.find("usage: dexchange"));
  EXPECT_NE(std::string::npos, help.output.find("version"));

  const ToolRun commandHelp = runTool("version --help");
  EXPECT_EQ(0, commandHelp.exitCode);
  EXPECT_NE(std::string::npos, commandHelp.output.find("usage: dexchange version"));
}

TEST(Tool, WrongCommandLinesFailWithOneLine) {
  const ToolRun none = runTool("");
  EXPECT_EQ(2, none.exitCode);

  const ToolRun unknown = runTool("frobnicate");
  EXPECT_EQ(2, unknown.exitCode);
  EXPECT_EQ("dexchange: unknown command frobnicate (see dexchange --help)\n", unknown.output);

  const ToolRun badOption = runTool("version --bogus");
  EXPECT_EQ(2, badOption.exitCode);
  EXPECT_EQ("dexchange: version: unknown option --bogus\n", badOption.output);

  const ToolRun extra = runTool("version extra");
  EXPECT_EQ(2, extra.exitCode);
}

// The tool takes the user's locale, as a host application does; what it prints must not change.
TEST(Tool, PrintsTheSameUnderACommaDecimalLocale) {
  const dex_test::CommaLocale comma;  // compiles the locale into the build tree when none is installed
  if (!comma.active()) GTEST_SKIP() << comma.reason();
  for (const char* arguments :
       {"--help", "--version", "version --help", "frobnicate", "formats", "formats --json",
        "formats --export --type POINTS --json", "formats --help"}) {
    const ToolRun plain = runTool(arguments, "LC_ALL=C");
    const ToolRun commaRun = runTool(arguments, comma.environment());
    EXPECT_EQ(commaRun.exitCode, plain.exitCode) << arguments;
    EXPECT_EQ(commaRun.output, plain.output) << arguments;
  }
}
