#pragma once

#include <map>
#include <memory>
#include <optional>
#include <ostream>
#include <set>
#include <string>
#include <vector>

namespace dexchange_tool {

// Exit codes of the tool.
inline constexpr int kExitOk = 0;
inline constexpr int kExitFailure = 1;  // the job itself failed
inline constexpr int kExitUsage = 2;    // the command line was wrong

struct ToolStreams {
  std::ostream& out;
  std::ostream& err;
};

// The parsed words of one command: options ("--name value", "--name=value" or a bare "--flag") and
// positional arguments, checked against what the command declares.
class Arguments {
 public:
  // Parses words; on a word the command does not know, returns nullopt and sets error.
  static std::optional<Arguments> parse(const std::vector<std::string>& words,
                                        const std::set<std::string>& flags,
                                        const std::set<std::string>& valued, std::string& error);

  bool has(const std::string& name) const { return flags_.count(name) > 0 || values_.count(name) > 0; }
  // The value of a valued option, or fallback when it was not given.
  std::string value(const std::string& name, const std::string& fallback = {}) const;
  const std::vector<std::string>& positional() const { return positional_; }

 private:
  std::set<std::string> flags_;
  std::map<std::string, std::string> values_;
  std::vector<std::string> positional_;
};

// One option of a command: "--name" alone (a flag) or "--name VALUE" when value names the value.
struct Option {
  std::string name;
  std::string value;  // the placeholder of the value in the help ("FORMAT"); empty for a flag
  std::string help;   // its help text; a line break starts an indented line
};

// The help lines of options, aligned.
std::string optionsHelp(const std::vector<Option>& options);

// One sub-command of the tool. A command declares its options; the framework answers --help for it
// and turns an unknown option into a one-line usage error.
class Command {
 public:
  virtual ~Command() = default;
  virtual std::string name() const = 0;
  virtual std::string summary() const = 0;
  // The full help text shown by "dexchange <name> --help".
  virtual std::string help() const = 0;
  // The options as a table; flags() and valuedOptions() are read from it unless overridden.
  virtual std::vector<Option> options() const { return {}; }
  virtual std::set<std::string> flags() const;
  virtual std::set<std::string> valuedOptions() const;
  // Runs the command; a failure writes one line to streams.err and answers a non-zero exit code.
  virtual int run(const Arguments& arguments, ToolStreams& streams) const = 0;
};

// Writes "dexchange: <message>" as one line and answers the code.
int fail(ToolStreams& streams, int exitCode, const std::string& message);

// The registered commands, in the order the help lists them.
std::vector<std::unique_ptr<Command>> makeCommands();

// The whole tool: global options, dispatch, per-command help.
int runTool(const std::vector<std::string>& words, ToolStreams& streams);

}  // namespace dexchange_tool
