#include <clocale>
#include <iostream>
#include <string>
#include <vector>

#include "Command.h"

int main(int argc, char** argv) {
  // The user's locale, as in any host application; the library's number texts do not depend on it.
  std::setlocale(LC_ALL, "");
  const std::vector<std::string> words(argv + 1, argv + argc);
  dexchange_tool::ToolStreams streams{std::cout, std::cerr};
  return dexchange_tool::runTool(words, streams);
}
