#include "Command.h"

namespace dexchange_tool {

std::optional<Arguments> Arguments::parse(const std::vector<std::string>& words,
                                          const std::set<std::string>& flags,
                                          const std::set<std::string>& valued, std::string& error) {
  Arguments parsed;
  bool optionsEnded = false;
  for (std::size_t i = 0; i < words.size(); ++i) {
    const std::string& word = words[i];
    if (optionsEnded || word.size() < 2 || word.compare(0, 2, "--") != 0) {
      parsed.positional_.push_back(word);
      continue;
    }
    if (word == "--") {
      optionsEnded = true;
      continue;
    }
    const std::size_t equals = word.find('=');
    const std::string name = word.substr(2, equals == std::string::npos ? std::string::npos : equals - 2);
    if (valued.count(name) > 0) {
      if (equals != std::string::npos) {
        parsed.values_[name] = word.substr(equals + 1);
      } else if (i + 1 < words.size()) {
        parsed.values_[name] = words[++i];
      } else {
        error = "option --" + name + " needs a value";
        return std::nullopt;
      }
    } else if (flags.count(name) > 0 && equals == std::string::npos) {
      parsed.flags_.insert(name);
    } else {
      error = "unknown option " + word;
      return std::nullopt;
    }
  }
  return parsed;
}

std::string Arguments::value(const std::string& name, const std::string& fallback) const {
  const auto found = values_.find(name);
  return found == values_.end() ? fallback : found->second;
}

std::string optionsHelp(const std::vector<Option>& options) {
  constexpr std::size_t kHelpColumn = 21;
  std::string text;
  for (const Option& option : options) {
    std::string head = "  --" + option.name + (option.value.empty() ? "" : " " + option.value);
    head += head.size() + 1 < kHelpColumn ? std::string(kHelpColumn - head.size(), ' ')
                                          : "\n" + std::string(kHelpColumn, ' ');
    std::string help = option.help;
    for (std::size_t at = help.find('\n'); at != std::string::npos; at = help.find('\n', at + 1))
      help.insert(at + 1, std::string(kHelpColumn, ' '));
    text += head + help + "\n";
  }
  return text;
}

std::set<std::string> Command::flags() const {
  std::set<std::string> names;
  for (const Option& option : options()) {
    if (option.value.empty()) names.insert(option.name);
  }
  return names;
}

std::set<std::string> Command::valuedOptions() const {
  std::set<std::string> names;
  for (const Option& option : options()) {
    if (!option.value.empty()) names.insert(option.name);
  }
  return names;
}

int fail(ToolStreams& streams, int exitCode, const std::string& message) {
  streams.err << "dexchange: " << message << '\n';
  return exitCode;
}

}  // namespace dexchange_tool
