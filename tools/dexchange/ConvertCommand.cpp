#include <unistd.h>

#include <iostream>

#include "Command.h"
#include "ExchangeRun.h"
#include "ieObjects/IEData.h"
#include "ieObjects/IEDataset.h"
#include "ieUtils/IELinework.h"

namespace dexchange_tool {
namespace {

const char* const kOptionsHelp =
    "  --from FORMAT      the format of IN: a braced GUID, a format name or title, or an extension\n"
    "                     (default: the extension of IN)\n"
    "  --to FORMAT        the format of OUT, likewise (default: the extension of OUT)\n"
    "  --types LIST       the data kinds to exchange (POINTS,LINES,...; default: those of the IN format)\n"
    "  --fields LIST      the columns of a customizable ASCII point file, as point field names\n"
    "                     (\"Name,Northing,Easting,Ht,Codes&Strings\"); NAME:WIDTH gives a column width\n"
    "                     and makes the lines fixed-width\n"
    "  --delimiter C      the delimiter of a customizable ASCII point file: one character, or tab,\n"
    "                     space, comma, semicolon, pipe (default: comma)\n"
    "  --units UNIT       the distance unit of the files (METERS, USFEET, IFEET, ...; default: meters)\n";

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

int countObjects(vyn::ie::DexData& data) {
  int count = 0;
  for (int i = 0; i < data.getNumberOfDatasets(); ++i)
    count += data.getDatasetAt(i)->getNumberOfElements(vyn::ie::OBJECT_TYPE_ALL, 2);
  return count;
}

class ConvertCommand final : public Command {
 public:
  std::string name() const override { return "convert"; }
  std::string summary() const override { return "convert a file from one exchange format to another"; }
  std::string help() const override {
    return std::string(
               "usage: dexchange convert IN OUT [--from FORMAT] [--to FORMAT] [--types LIST]\n"
               "                        [--fields LIST] [--delimiter C] [--units UNIT] [--linework]\n"
               "                        [--force]\n"
               "\n"
               "Imports IN into a data container through the plug-in of its format, then exports the\n"
               "container to OUT, each run in a worker thread (a progress bar on a terminal; Ctrl-C stops\n"
               "the run, and a stopped export leaves no file behind).\n") +
           kOptionsHelp +
           "  --linework         join the points whose codes carry code strings (EP:1, KERB:L) into one\n"
           "                     polyline per code and string before the export, and export lines\n"
           "  --force            overwrite OUT when it exists (on a terminal the tool asks; otherwise it\n"
           "                     refuses)\n"
           "\n"
           "Exit codes: 0 converted (notes on stderr tell of skipped lines), 1 the import or export\n"
           "failed, 2 wrong command line, 130 stopped.\n";
  }
  std::set<std::string> flags() const override { return {"force", "linework"}; }
  std::set<std::string> valuedOptions() const override {
    return {"from", "to", "types", "fields", "delimiter", "units"};
  }

  int run(const Arguments& arguments, ToolStreams& streams) const override {
    if (arguments.positional().size() != 2) return fail(streams, kExitUsage, "convert: give IN and OUT");
    const std::string& in = arguments.positional()[0];
    const std::string& out = arguments.positional()[1];
    std::string error;
    const auto from = FormatChoice::find(arguments.value("from"), in, false, error);
    if (!from) return fail(streams, kExitUsage, "convert: " + error);
    const auto to = FormatChoice::find(arguments.value("to"), out, true, error);
    if (!to) return fail(streams, kExitUsage, "convert: " + error);
    vyn::ie::DexSettings settings;
    if (!makeSettings(arguments, *from->format(), true, settings, error))
      return fail(streams, kExitUsage, "convert: " + error);
    if (arguments.has("linework")) settings.addDataType(vyn::ie::LINES);
    if (!fileExists(in)) return fail(streams, kExitFailure, "convert: " + in + " not found");
    if (!mayOverwrite(arguments, out, error)) return fail(streams, kExitFailure, "convert: " + error);

    vyn::ie::DexParsersLoader loader;
    loader.initIEData(settings);
    const RunOutcome imported = runInWorker(loader, false, in, *from->format());
    printNotes(streams, imported);
    if (imported.result < 0) {
      return fail(streams, exitCodeOf(imported.result),
                  "convert: " + failureText(imported.result, false, in, from->name(), loader));
    }
    if (arguments.has("linework")) {
      vyn::ie::DexData& data = *loader.getIEData();
      int lines = 0;
      for (int i = 0; i < data.getNumberOfDatasets(); ++i)
        lines += vyn::ie::utils::createLineworkFromCodes(*data.getDatasetAt(i));
      streams.out << "linework: " << lines << " polylines from point codes\n";
    }
    const RunOutcome exported = runInWorker(loader, true, out, *to->format());
    printNotes(streams, exported);
    if (exported.result < 0) {
      return fail(streams, exitCodeOf(exported.result),
                  "convert: " + failureText(exported.result, true, out, to->name(), loader));
    }
    streams.out << "converted " << countObjects(*loader.getIEData()) << " objects from " << in << " ("
                << from->name() << ") to " << out << " (" << to->name() << ")\n";
    return kExitOk;
  }
};

}  // namespace

std::unique_ptr<Command> makeConvertCommand() {
  return std::make_unique<ConvertCommand>();
}

}  // namespace dexchange_tool
