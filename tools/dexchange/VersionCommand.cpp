#include "Command.h"
#include "ieUtils/IEVersion.h"

namespace dexchange_tool {
namespace {

class VersionCommand final : public Command {
 public:
  std::string name() const override { return "version"; }
  std::string summary() const override { return "print the library version"; }
  std::string help() const override {
    return "usage: dexchange version\n"
           "\n"
           "Prints the version of libdexchange that the tool runs with.\n";
  }
  int run(const Arguments& arguments, ToolStreams& streams) const override {
    if (!arguments.positional().empty()) {
      return fail(streams, kExitUsage, "version: unexpected argument " + arguments.positional().front());
    }
    streams.out << vyn::ie::getLibraryVersionString() << '\n';
    return kExitOk;
  }
};

}  // namespace

std::unique_ptr<Command> makeVersionCommand() {
  return std::make_unique<VersionCommand>();
}

}  // namespace dexchange_tool
