#include "Command.h"

namespace dexchange_tool {

std::unique_ptr<Command> makeConvertCommand();
std::unique_ptr<Command> makeFormatsCommand();
std::unique_ptr<Command> makeInfoCommand();
std::unique_ptr<Command> makeVersionCommand();

std::vector<std::unique_ptr<Command>> makeCommands() {
  std::vector<std::unique_ptr<Command>> commands;
  commands.push_back(makeFormatsCommand());
  commands.push_back(makeInfoCommand());
  commands.push_back(makeConvertCommand());
  commands.push_back(makeVersionCommand());
  return commands;
}

}  // namespace dexchange_tool
