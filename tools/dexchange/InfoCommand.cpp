#include "Command.h"
#include "ExchangeRun.h"
#include "RoadsSummary.h"
#include "RunReport.h"
#include "ToolText.h"
#include "ieObjects/IEData.h"
#include "ieUtils/IEUtilsUnitWords.h"

namespace dexchange_tool {
namespace {

class InfoCommand final : public Command {
 public:
  std::string name() const override { return "info"; }
  std::string summary() const override { return "import a file and show what it holds"; }
  std::string help() const override {
    return "usage: dexchange info FILE [--from FORMAT] [--types LIST] [--fields LIST | --order ORDER]\n"
           "                          [--delimiter C] [--units UNIT] [--json]\n"
           "\n"
           "Imports FILE through the plug-in of its format (in a worker thread; Ctrl-C stops) and prints\n"
           "its datasets, objects by kind, raw observations (records by kind, stations set up, time\n"
           "range), codes, layers and coordinate extent; for a point file also the columns and the\n"
           "delimiter it was read by and how many lines were skipped or kept extra values, and for a\n"
           "file with roads its alignments, their parts and the station-equation sets.\n"
           "A header line that names the columns decides them; otherwise --fields or --order, otherwise\n"
           "Name, Northing, Easting, Ht, FullCodes (PNEZD), and a note says so.\n"
           "\n" +
           optionsHelp(options()) +
           "\n"
           "Exit codes: 0 shown, 1 the import failed, 2 wrong command line, 130 stopped.\n";
  }
  std::vector<Option> options() const override {
    std::vector<Option> all = inputOptions();
    all.push_back(jsonOption());
    return all;
  }

  int run(const Arguments& arguments, ToolStreams& streams) const override {
    if (arguments.positional().size() != 1) return fail(streams, kExitUsage, "info: give one FILE");
    RunReport report;
    report.command = "info";
    report.input.file = arguments.positional().front();
    std::string error;
    const auto from = FormatChoice::find(arguments.value("from"), report.input.file, false, error);
    if (!from) return fail(streams, kExitUsage, "info: " + error);
    report.input.format = from.get();
    vyn::ie::DexSettings settings;
    if (!makeSettings(arguments, *from->format(), false, settings, error))
      return fail(streams, kExitUsage, "info: " + error);
    if (!fileExists(report.input.file))
      return fail(streams, kExitFailure, "info: " + report.input.file + " not found");

    vyn::ie::DexParsersLoader loader;
    loader.initIEData(settings);
    report.data = loader.getIEData();
    report.units = utf8(vyn::ie::utils::keywordFromDistUnits(settings.distUnits));
    report.input.finish(runInWorker(loader, false, report.input.file, *from->format()));
    printNotes(streams, report.input.outcome);
    const vyn::ie::EDexResult result = report.input.outcome.result;
    report.exitCode = exitCodeOf(result);
    if (result < 0)
      report.error = "info: " + failureText(result, false, report.input.file, from->name(), loader);
    if (arguments.has("json")) {
      streams.out << jsonReport(report);
    } else if (result >= 0) {
      printInfo(streams.out, report);
      printRoads(streams.out, *report.data);
    }
    return report.error.empty() ? kExitOk : fail(streams, report.exitCode, report.error);
  }
};

}  // namespace

std::unique_ptr<Command> makeInfoCommand() {
  return std::make_unique<InfoCommand>();
}

}  // namespace dexchange_tool
