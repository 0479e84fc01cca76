#pragma once

#include <sys/wait.h>

#include <array>
#include <cstdio>
#include <sstream>
#include <string>
#include <vector>

#include "support/TempDir.h"

namespace dex_test {

// A run of the built tool with its stdout and stderr apart.
struct ToolRun {
  int exitCode = -1;
  std::string out;
  std::string err;
};

// Runs "dexchange arguments" (a shell command line tail); environment, when given, holds NAME=value
// assignments for it; stdin is not a terminal.
inline ToolRun runApart(const std::string& arguments, const std::string& environment = "") {
  const TempDir folder;
  const std::string errFile = folder.file("stderr.txt");
  const std::string prefix = environment.empty() ? std::string() : "env " + environment + " ";
  const std::string command =
      prefix + std::string(DEXCHANGE_TOOL_PATH) + " " + arguments + " </dev/null 2>'" + errFile + "'";
  ToolRun run;
  FILE* pipe = ::popen(command.c_str(), "r");
  if (pipe == nullptr) return run;
  std::array<char, 4096> chunk{};
  std::size_t read = 0;
  while ((read = std::fread(chunk.data(), 1, chunk.size(), pipe)) > 0)
    run.out.append(chunk.data(), read);
  const int status = ::pclose(pipe);
  run.exitCode = WIFEXITED(status) ? WEXITSTATUS(status) : -1;
  run.err = readFile(errFile);
  return run;
}

inline std::vector<std::string> linesOf(const std::string& text) {
  std::vector<std::string> lines;
  std::istringstream stream(text);
  for (std::string line; std::getline(stream, line);)
    lines.push_back(line);
  return lines;
}

inline bool contains(const std::string& text, const std::string& part) {
  return text.find(part) != std::string::npos;
}

}  // namespace dex_test
