#include <algorithm>

#include "Command.h"
#include "ieUtils/IEVersion.h"

namespace dexchange_tool {
namespace {

std::string overview(const std::vector<std::unique_ptr<Command>>& commands) {
  std::string text =
      "dexchange: list survey exchange formats and convert survey files\n"
      "\n"
      "usage: dexchange [--help | --version]\n"
      "       dexchange <command> [options] [arguments]\n"
      "       dexchange <command> --help\n"
      "\n"
      "commands:\n";
  std::size_t width = 0;
  for (const auto& command : commands)
    width = std::max(width, command->name().size());
  for (const auto& command : commands) {
    text += "  " + command->name() + std::string(width + 2 - command->name().size(), ' ') +
            command->summary() + "\n";
  }
  return text;
}

const Command* findCommand(const std::vector<std::unique_ptr<Command>>& commands, const std::string& name) {
  for (const auto& command : commands) {
    if (command->name() == name) return command.get();
  }
  return nullptr;
}

}  // namespace

int runTool(const std::vector<std::string>& words, ToolStreams& streams) {
  const auto commands = makeCommands();
  if (words.empty()) {
    streams.err << overview(commands);
    return kExitUsage;
  }
  const std::string& first = words.front();
  if (first == "--help" || first == "-h" || first == "help") {
    if (first == "help" && words.size() > 1) {
      const Command* command = findCommand(commands, words[1]);
      if (command == nullptr) return fail(streams, kExitUsage, "unknown command " + words[1]);
      streams.out << command->help();
      return kExitOk;
    }
    streams.out << overview(commands);
    return kExitOk;
  }
  if (first == "--version") {
    streams.out << "dexchange " << vyn::ie::getLibraryVersionString() << '\n';
    return kExitOk;
  }
  const Command* command = findCommand(commands, first);
  if (command == nullptr) {
    return fail(streams, kExitUsage, "unknown command " + first + " (see dexchange --help)");
  }
  const std::vector<std::string> rest(words.begin() + 1, words.end());
  if (std::find(rest.begin(), rest.end(), "--help") != rest.end()) {
    streams.out << command->help();
    return kExitOk;
  }
  std::string error;
  const auto arguments = Arguments::parse(rest, command->flags(), command->valuedOptions(), error);
  if (!arguments) return fail(streams, kExitUsage, command->name() + ": " + error);
  return command->run(*arguments, streams);
}

}  // namespace dexchange_tool
