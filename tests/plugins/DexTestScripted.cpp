// A scripted parser plug-in for the loader tests. Every importer and exporter does what a small script
// says, so that one library plays every kind of plug-in: one that makes nothing, one that throws, one
// that answers a given result or remark, writes and records files, stops, waits for the test, or tells
// which thread it runs in.
//
// Scripts are text files, one command a line, words separated by blanks; a line may begin with "@K" to
// run its command at export step K instead of step 0 (exporters only). An importer's script is the file
// it imports; an exporter's is the file named like its target plus ".script" (no script: defaults).
//
// Both directions:
//   make-null          the entry point answers null
//   make-throw         the entry point throws
//   result N           the run answers N (default 22)
//   throw              the run throws
//   wait-release       creates <file>.started, then waits until <file>.release exists
//   wait-stop          creates <file>.started, then waits until DexData::stopProcess_ is set and
//                      answers DEX_RESULT_STOPPED
//   report-thread      writes "<thread name> <stack size>" to <file>.thread
// Importers:
//   point NAME [CODE ...]   adds a design point with those codes to the current dataset
//   progress READ TOTAL     publishes the read position
// Exporters (the target is written and recorded at step 0 with a line "name code ..." per object of
// the current dataset, unless fail-first):
//   steps N            the export takes N steps (default 1)
//   fail-first         the first step fails before it advances
//   write NAME         also writes and records the file NAME beside the target
//   record NAME        records NAME beside the target without writing it
//   stop               sets DexData::stopProcess_, as a user would
//
// The <file>.started / <file>.release files keep the test and the worker in step through the file
// system only, so no memory is shared between them.

#include <pthread.h>

#include <chrono>
#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <optional>
#include <sstream>
#include <stdexcept>
#include <string>
#include <thread>
#include <type_traits>
#include <vector>

#include "hostlibs/VynString.h"
#include "ieObjects/IECodesDataInterface.h"
#include "ieObjects/IEData.h"
#include "ieObjects/IEDataDictionary.h"
#include "ieObjects/IEDataset.h"
#include "ieObjects/IEPoints.h"
#include "ieUtils/IERunProgress.h"
#include "ieUtils/IExporter.h"
#include "ieUtils/IImporter.h"

namespace {

using vyn::ie::DexData;
using vyn::ie::DexFormat;
using vyn::ie::EDexResult;

// A test that goes wrong must not hang the suite: waits give up after this long.
constexpr auto kWaitLimit = std::chrono::seconds(60);
constexpr auto kPollInterval = std::chrono::milliseconds(2);

struct Command {
  int step = 0;
  std::vector<std::string> words;

  const std::string& name() const { return words.front(); }
  const std::string& argument(std::size_t i) const {
    static const std::string none;
    return i + 1 < words.size() ? words[i + 1] : none;
  }
  long number(std::size_t i) const { return std::strtol(argument(i).c_str(), nullptr, 10); }
};

class Script {
 public:
  static Script read(const std::string& path) {
    Script script;
    std::ifstream in(path);
    script.found_ = static_cast<bool>(in);
    std::string line;
    while (std::getline(in, line)) {
      std::istringstream words(line);
      Command command;
      std::string word;
      while (words >> word) {
        if (command.words.empty() && word.size() > 1 && word[0] == '@') {
          command.step = std::atoi(word.c_str() + 1);
          continue;
        }
        command.words.push_back(word);
      }
      if (!command.words.empty()) script.commands_.push_back(command);
    }
    return script;
  }

  bool found() const { return found_; }
  const std::vector<Command>& commands() const { return commands_; }
  const Command* find(const std::string& name) const {
    for (const Command& command : commands_) {
      if (command.name() == name) return &command;
    }
    return nullptr;
  }
  bool has(const std::string& name) const { return find(name) != nullptr; }

 private:
  bool found_ = false;
  std::vector<Command> commands_;
};

std::string utf8(const CVynStringT<wchar_t>& text) {
  return vyn_text::toUtf8(text.view());
}

CVynStringT<wchar_t> wide(const std::string& text) {
  return CVynStringT<wchar_t>(text.c_str(), vyn_text::CP_UTF8);
}

std::string besideFile(const std::string& file, const std::string& name) {
  return (std::filesystem::path(file).parent_path() / name).string();
}

void touch(const std::string& path) {
  std::ofstream(path) << "\n";
}

template <class Condition>
bool waitUntil(Condition condition) {
  const auto limit = std::chrono::steady_clock::now() + kWaitLimit;
  while (!condition()) {
    if (std::chrono::steady_clock::now() > limit) return false;
    std::this_thread::sleep_for(kPollInterval);
  }
  return true;
}

void reportThread(const std::string& file) {
  char name[32] = {};
  pthread_getname_np(pthread_self(), name, sizeof name);
  std::size_t stackSize = 0;
  pthread_attr_t attributes;
  if (pthread_getattr_np(pthread_self(), &attributes) == 0) {
    pthread_attr_getstacksize(&attributes, &stackSize);
    pthread_attr_destroy(&attributes);
  }
  std::ofstream(file + ".thread") << name << ' ' << stackSize << '\n';
}

// The commands both directions know. Answers the result that ends the run at once, if any.
std::optional<EDexResult> runCommonCommand(const Command& command, const std::string& file) {
  const std::string& name = command.name();
  if (name == "throw") throw std::runtime_error("scripted failure");
  if (name == "report-thread") reportThread(file);
  if (name == "wait-release") {
    touch(file + ".started");
    if (!waitUntil([&file] { return std::filesystem::exists(file + ".release"); }))
      return vyn::ie::DEX_RESULT_FAILED;
  }
  if (name == "wait-stop") {
    touch(file + ".started");
    return waitUntil([] { return DexData::stopProcess_.load(); }) ? vyn::ie::DEX_RESULT_STOPPED
                                                                  : vyn::ie::DEX_RESULT_FAILED;
  }
  return std::nullopt;
}

// ---- Importer ---------------------------------------------------------------------------------------

class ScriptedImporter : public vyn::ie::DexImporterImpl {
 public:
  ScriptedImporter(DexData* data, const CVynStringT<wchar_t>& fileName, const DexFormat* format,
                   Script script)
      : DexImporterImpl(data, fileName, format), script_(std::move(script)) {}

 protected:
  EDexResult doImport() override {
    if (!script_.found()) return vyn::ie::DEX_RESULT_FILE_ERROR;
    EDexResult result = vyn::ie::DEX_RESULT_OK;
    const std::string file = utf8(fileName);
    for (const Command& command : script_.commands()) {
      if (const std::optional<EDexResult> end = runCommonCommand(command, file)) return *end;
      if (command.name() == "result") result = static_cast<EDexResult>(command.number(0));
      if (command.name() == "point") addPoint(command);
      if (command.name() == "progress")
        data->getProgress().setImportPosition(static_cast<std::uint64_t>(command.number(0)),
                                              static_cast<std::uint64_t>(command.number(1)));
    }
    return result;
  }

 private:
  void addPoint(const Command& command) {
    auto* point = new vyn::ie::DexDesignPoint();
    point->setName(wide(command.argument(0)));
    for (std::size_t i = 2; i < command.words.size(); ++i) {
      const CVynStringT<wchar_t> code = wide(command.words[i]);
      auto* description = new vyn::ie::DexCodeDescription(code);
      if (!data->addCodeToIEDataDictionary(description)) delete description;
      point->addCode(new vyn::ie::DexCodeValues(data->getIEDataDictionary()->findCodeDiscription(code)));
    }
    data->getCurDataset()->add(point);
  }

  Script script_;
};

// ---- Exporter ---------------------------------------------------------------------------------------

class ScriptedExporter : public vyn::ie::DexExporterImpl {
 public:
  ScriptedExporter(DexData* data, const CVynStringT<wchar_t>& fileName, const DexFormat* format,
                   Script script)
      : DexExporterImpl(data, fileName, format), script_(std::move(script)) {
    if (const Command* steps = script_.find("steps")) steps_ = static_cast<int>(steps->number(0));
  }

 protected:
  int getNumberOfSteps() override { return steps_; }

  bool singleStep() override {
    if (script_.has("fail-first")) return false;
    currentStep = currentStep < 0 ? 0 : currentStep + 1;
    if (currentStep == 0 && !writeTarget()) {
      ieResult = vyn::ie::DEX_RESULT_FILE_ERROR;
      return false;
    }
    for (const Command& command : script_.commands()) {
      if (command.step != currentStep) continue;
      if (const std::optional<EDexResult> end = runCommonCommand(command, target())) {
        ieResult = *end;
        return false;
      }
      runExportCommand(command);
    }
    return currentStep + 1 < steps_;
  }

 private:
  std::string target() const { return utf8(fileName); }

  void runExportCommand(const Command& command) {
    const std::string& name = command.name();
    if (name == "result") ieResult = static_cast<EDexResult>(command.number(0));
    if (name == "stop") DexData::stopProcess_ = true;
    if (name == "write") {
      const std::string extra = besideFile(target(), command.argument(0));
      std::ofstream(extra) << "extra\n";
      data->addFileNameToExported(wide(extra));
    }
    if (name == "record") data->addFileNameToExported(wide(besideFile(target(), command.argument(0))));
  }

  // One line per object of the current dataset: its name and codes.
  bool writeTarget() {
    std::ofstream out(target());
    if (!out) return false;
    data->addFileNameToExported(fileName);
    const vyn::ie::DexDataset* const dataset = data->getCurDataset();
    for (int i = 0; dataset != nullptr && i < dataset->getNumberOfElements(-1, 2, false, false); ++i) {
      const vyn::ie::DexObject* const object = dataset->getObjectAt(i);
      if (object == nullptr) continue;
      out << utf8(object->getName());
      for (int k = 0; k < object->getNumberOfCodes(); ++k) {
        const vyn::ie::DexCodeValues* const code = object->getCode(k);
        if (code != nullptr && code->getDescription() != nullptr)
          out << ' ' << utf8(code->getDescription()->getName());
      }
      out << '\n';
    }
    return static_cast<bool>(out);
  }

  Script script_;
  int steps_ = 1;
};

}  // namespace

DEX_MAKE_IMPORTER(data, fileName, format) {
  Script script = Script::read(utf8(fileName));
  if (script.has("make-null")) return nullptr;
  if (script.has("make-throw")) throw std::runtime_error("scripted failure");
  return new ScriptedImporter(data, fileName, format, std::move(script));
}

DEX_MAKE_EXPORTER(data, fileName, format) {
  Script script = Script::read(utf8(fileName) + ".script");
  if (script.has("make-null")) return nullptr;
  if (script.has("make-throw")) throw std::runtime_error("scripted failure");
  return new ScriptedExporter(data, fileName, format, std::move(script));
}

static_assert(std::is_same_v<decltype(&MakeImporter), vyn::ie::MakeImporterFunction>);
static_assert(std::is_same_v<decltype(&MakeExporter), vyn::ie::MakeExporterFunction>);
