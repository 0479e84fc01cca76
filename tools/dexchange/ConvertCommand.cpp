#include <unistd.h>

#include <iostream>

#include "Command.h"
#include "ExchangeRun.h"
#include "RunReport.h"
#include "ToolText.h"
#include "ieObjects/IEData.h"
#include "ieObjects/IEDataset.h"
#include "ieUtils/IELinework.h"
#include "ieUtils/IEUtilsUnitWords.h"

namespace dexchange_tool {
namespace {

// Whether OUT may be overwritten: --force, or a yes on a terminal. False with the reason otherwise.
bool mayOverwrite(const Arguments& arguments, const std::string& path, std::string& error) {
  if (!fileExists(path) || arguments.has("force")) return true;
  if (::isatty(STDIN_FILENO) == 0 || ::isatty(STDERR_FILENO) == 0) {
    error = path + " already exists (use --force to overwrite it)";
    return false;
  }
  std::cerr << "dexchange: " << path << " already exists. Overwrite? [y/N] " << std::flush;
  std::string answer;
  std::getline(std::cin, answer);
  if (answer == "y" || answer == "Y" || answer == "yes") return true;
  error = path + " already exists and was not overwritten";
  return false;
}

class ConvertCommand final : public Command {
 public:
  std::string name() const override { return "convert"; }
  std::string summary() const override { return "convert a file from one exchange format to another"; }
  std::string help() const override {
    return "usage: dexchange convert IN OUT [--from FORMAT] [--to FORMAT] [--types LIST]\n"
           "                        [--fields LIST | --order ORDER] [--delimiter C] [--units UNIT]\n"
           "                        [--linework] [--force] [--json]\n"
           "\n"
           "Imports IN into a data container through the plug-in of its format, then exports the\n"
           "container to OUT, each run in a worker thread (a progress bar on a terminal; Ctrl-C stops\n"
           "the run, and a stopped export leaves no file behind). --fields, --order and --delimiter\n"
           "describe IN when it is a point file (a header line that names its columns decides them)\n"
           "and OUT when it is a customizable ASCII point file; CSV files are written in the CSV\n"
           "columns.\n"
           "\n" +
           optionsHelp(options()) +
           "\n"
           "Exit codes: 0 converted (notes on stderr tell of skipped lines), 1 the import or export\n"
           "failed, 2 wrong command line, 130 stopped.\n";
  }
  std::vector<Option> options() const override {
    std::vector<Option> all = inputOptions();
    all.insert(all.begin() + 1,
               {"to", "FORMAT", "the format of OUT, as --from (default: the extension of OUT)"});
    all.push_back({"linework", "",
                   "join the points whose codes carry code strings (EP:1, KERB:L) into one\n"
                   "polyline per code and string before the export, and export lines"});
    all.push_back(
        {"force", "", "overwrite OUT when it exists (on a terminal the tool asks; otherwise it\nrefuses)"});
    all.push_back(jsonOption());
    return all;
  }

  int run(const Arguments& arguments, ToolStreams& streams) const override {
    if (arguments.positional().size() != 2) return fail(streams, kExitUsage, "convert: give IN and OUT");
    RunReport report;
    report.command = "convert";
    report.input.file = arguments.positional()[0];
    report.output.file = arguments.positional()[1];
    std::string error;
    const auto from = FormatChoice::find(arguments.value("from"), report.input.file, false, error);
    if (!from) return fail(streams, kExitUsage, "convert: " + error);
    const auto to = FormatChoice::find(arguments.value("to"), report.output.file, true, error);
    if (!to) return fail(streams, kExitUsage, "convert: " + error);
    report.input.format = from.get();
    report.output.format = to.get();
    vyn::ie::DexSettings settings;
    if (!makeSettings(arguments, *from->format(), true, settings, error))
      return fail(streams, kExitUsage, "convert: " + error);
    const bool linework = arguments.has("linework");
    if (linework) settings.addDataType(vyn::ie::LINES);
    if (!fileExists(report.input.file))
      return fail(streams, kExitFailure, "convert: " + report.input.file + " not found");
    if (!mayOverwrite(arguments, report.output.file, error))
      return fail(streams, kExitFailure, "convert: " + error);

    vyn::ie::DexParsersLoader loader;
    loader.initIEData(settings);
    report.data = loader.getIEData();
    report.units = utf8(vyn::ie::utils::keywordFromDistUnits(settings.distUnits));
    if (runSide(loader, report.input, false, report)) {
      if (linework) report.lineworkPolylines = createLinework(*report.data);
      runSide(loader, report.output, true, report);
    }
    printSummary(streams, arguments.has("json"), report);
    return report.error.empty() ? kExitOk : fail(streams, report.exitCode, report.error);
  }

 private:
  static int createLinework(vyn::ie::DexData& data) {
    int polylines = 0;
    for (int i = 0; i < data.getNumberOfDatasets(); ++i)
      polylines += vyn::ie::utils::createLineworkFromCodes(*data.getDatasetAt(i));
    return polylines;
  }

  // One run with its notes; false (with the report's error) when it failed.
  static bool runSide(vyn::ie::DexParsersLoader& loader, RunSide& side, bool exportRun, RunReport& report) {
    side.finish(runInWorker(loader, exportRun, side.file, *side.format->format()));
    report.exitCode = exitCodeOf(side.outcome.result);
    if (side.outcome.result >= 0) return true;
    report.error =
        "convert: " + failureText(side.outcome.result, exportRun, side.file, side.format->name(), loader);
    return false;
  }

  static void printSummary(ToolStreams& streams, bool json, const RunReport& report) {
    for (const RunSide* side : {&report.input, &report.output}) {
      if (side->ran) printNotes(streams, side->outcome);
    }
    if (json) {
      streams.out << jsonReport(report);
    } else if (report.error.empty()) {
      if (report.lineworkPolylines >= 0)
        streams.out << "linework: " << report.lineworkPolylines << " polylines from point codes\n";
      streams.out << "converted " << report.data->getNumberOfObjectsInAllDatasets() << " objects from "
                  << report.input.file << " (" << report.input.format->name() << ") to " << report.output.file
                  << " (" << report.output.format->name() << ")\n";
    }
  }
};

}  // namespace

std::unique_ptr<Command> makeConvertCommand() {
  return std::make_unique<ConvertCommand>();
}

}  // namespace dexchange_tool
