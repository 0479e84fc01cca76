#pragma once

#include <string>

namespace dex_test {

// What a run of the dexchange tool gave.
struct ToolProcess {
  int exitCode = -1;
  std::string output;  // stdout and stderr together
};

// Runs the built tool with arguments (a shell command line tail) and waits for it; stdin is not a
// terminal. environment, when given, holds NAME=value assignments for it.
ToolProcess runTool(const std::string& arguments, const std::string& environment = "");

// Runs a shell script (bash) in which $DEXCHANGE names the built tool.
ToolProcess runScript(const std::string& script);

}  // namespace dex_test
