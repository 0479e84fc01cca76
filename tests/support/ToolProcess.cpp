#include "support/ToolProcess.h"

#include <sys/wait.h>

#include <array>
#include <cstdio>

namespace dex_test {

namespace {

ToolProcess runCommand(const std::string& command) {
  ToolProcess run;
  FILE* pipe = ::popen((command + " 2>&1").c_str(), "r");
  if (pipe == nullptr) return run;
  std::array<char, 512> chunk{};
  while (std::fgets(chunk.data(), static_cast<int>(chunk.size()), pipe) != nullptr)
    run.output += chunk.data();
  const int status = ::pclose(pipe);
  run.exitCode = WIFEXITED(status) ? WEXITSTATUS(status) : -1;
  return run;
}

std::string quoted(const std::string& text) {
  std::string result = "'";
  for (const char ch : text)
    result += ch == '\'' ? std::string("'\\''") : std::string(1, ch);
  return result + "'";
}

}  // namespace

ToolProcess runTool(const std::string& arguments, const std::string& environment) {
  const std::string prefix = environment.empty() ? std::string() : "env " + environment + " ";
  return runCommand(prefix + std::string(DEXCHANGE_TOOL_PATH) + " " + arguments + " </dev/null");
}

ToolProcess runScript(const std::string& script) {
  return runCommand("DEXCHANGE=" + quoted(DEXCHANGE_TOOL_PATH) + " timeout 60 bash -c " + quoted(script) +
                    " </dev/null");
}

}  // namespace dex_test
