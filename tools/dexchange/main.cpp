#include <iostream>
#include <string>
#include <vector>

#include "Command.h"

int main(int argc, char** argv) {
  const std::vector<std::string> words(argv + 1, argv + argc);
  dexchange_tool::ToolStreams streams{std::cout, std::cerr};
  return dexchange_tool::runTool(words, streams);
}
