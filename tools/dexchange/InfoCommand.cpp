#include <algorithm>
#include <array>
#include <charconv>
#include <map>

#include "Command.h"
#include "ExchangeRun.h"
#include "ieObjects/IEData.h"
#include "ieObjects/IEDataDictionary.h"
#include "ieObjects/IEDataset.h"
#include "ieObjects/IELayers.h"
#include "ieObjects/IEPoints.h"
#include "ieObjects/IERawDataSummary.h"

namespace dexchange_tool {
namespace {

using vyn::ie::DexObject;

const char* kindName(int kind) {
  static const char* const kNames[] = {"design points",   "point-to-line points",
                                       "GNSS raw points", "sheet points",
                                       "polylines",       "areas",
                                       "breaklines",      "arcs",
                                       "surfaces",        "alignments",
                                       "parcels",         "text labels",
                                       "circles",         "regions"};
  return kind >= 0 && kind < static_cast<int>(std::size(kNames)) ? kNames[kind] : "other objects";
}

std::string fixed3(double value) {
  char text[64];
  const auto end = std::to_chars(text, text + sizeof text, value, std::chars_format::fixed, 3).ptr;
  return std::string(text, end);
}

// The smallest and largest of the values seen.
struct Range {
  double low = 0.0;
  double high = 0.0;
  bool any = false;
  void add(double value) {
    low = any ? std::min(low, value) : value;
    high = any ? std::max(high, value) : value;
    any = true;
  }
  std::string text() const { return any ? fixed3(low) + " .. " + fixed3(high) : "-"; }
};

// What a container holds, counted once.
struct Summary {
  std::map<int, int> kinds;
  std::map<std::string, int> codes;
  std::map<std::string, int> layers;
  Range north;
  Range east;
  Range height;

  void add(DexObject& object) {
    ++kinds[object.getType()];
    for (int c = 0; c < object.getNumberOfCodes(); ++c) {
      const auto* description = object.getCode(c)->getDescription();
      if (description != nullptr) ++codes[utf8(description->getName())];
    }
    if (object.getLayer() != nullptr) ++layers[utf8(object.getLayer()->getName())];
    if (const auto* point = dynamic_cast<const vyn::ie::DexDesignPoint*>(&object)) {
      const vyn::ie::DexStation& station = point->getStation();
      if (station.isHorizCoordsDefined()) {
        north.add(station.getX());
        east.add(station.getY());
      }
      if (station.isHeightDefined()) height.add(station.getZ());
    }
  }
};

// One line per kind that has records: the indent, the kind's name and its count.
template <std::size_t N>
void printKinds(std::ostream& out, const char* indent, const char* const (&names)[N],
                const std::array<int, N>& counts) {
  for (std::size_t kind = 0; kind < N; ++kind) {
    if (counts[kind] > 0) out << indent << names[kind] << ": " << counts[kind] << '\n';
  }
}

// The raw observations of a dataset: records by kind, the stations set up and the time range.
void printRawData(std::ostream& out, const vyn::ie::DexRawData& rawData) {
  static const char* const kRawKinds[] = {"total station", "GNSS", "digital level", "notes",
                                          "GNSS and level"};
  static const char* const kShotKinds[] = {"backbearings",  "backsights",      "foresights", "sideshots",
                                           "missing lines", "resection shots", "stations",   "stakeouts"};
  static const char* const kGnssKinds[] = {"GNSS offsets", "GNSS base stations", "GNSS positions"};
  const vyn::ie::DexRawDataSummary summary = vyn::ie::summarizeRawData(rawData);
  out << "    raw data: " << summary.records << " records\n";
  printKinds(out, "      ", kRawKinds, summary.byRawKind);
  if (summary.otherKinds > 0) out << "      other: " << summary.otherKinds << '\n';
  printKinds(out, "        ", kShotKinds, summary.byTotalStationKind);
  printKinds(out, "        ", kGnssKinds, summary.byGnssKind);
  out << "      stations set up: " << summary.stations.GetCount();
  for (int i = 0; i < summary.stations.GetCount(); ++i)
    out << (i == 0 ? " (" : ", ") << utf8(summary.stations.GetAt(i));
  out << (summary.stations.GetCount() > 0 ? ")\n" : "\n");
  if (summary.hasTime) {
    constexpr const wchar_t* kTimeFormat = L"%Y-%m-%d %H:%M:%S";
    out << "      time: " << utf8(summary.firstTime.Format(kTimeFormat)) << " .. "
        << utf8(summary.lastTime.Format(kTimeFormat)) << '\n';
  }
}

void printCounts(std::ostream& out, const std::string& title, const std::map<std::string, int>& counts) {
  out << title << ": " << counts.size() << '\n';
  for (const auto& [name, count] : counts)
    out << "  " << name << std::string(name.size() < 20 ? 20 - name.size() : 1, ' ') << count << '\n';
}

class InfoCommand final : public Command {
 public:
  std::string name() const override { return "info"; }
  std::string summary() const override { return "import a file and show what it holds"; }
  std::string help() const override {
    return "usage: dexchange info FILE [--from FORMAT] [--types LIST] [--fields LIST] [--delimiter C]\n"
           "                          [--units UNIT]\n"
           "\n"
           "Imports FILE through the plug-in of its format (in a worker thread; Ctrl-C stops) and prints\n"
           "its datasets, objects by kind, raw observations (records by kind, stations set up, time\n"
           "range), codes, layers and coordinate extent. The options are those of \"dexchange convert\"\n"
           "for the input side.\n"
           "\n"
           "Exit codes: 0 shown, 1 the import failed, 2 wrong command line, 130 stopped.\n";
  }
  std::set<std::string> valuedOptions() const override {
    return {"from", "types", "fields", "delimiter", "units"};
  }

  int run(const Arguments& arguments, ToolStreams& streams) const override {
    if (arguments.positional().size() != 1) return fail(streams, kExitUsage, "info: give one FILE");
    const std::string& path = arguments.positional().front();
    std::string error;
    const auto from = FormatChoice::find(arguments.value("from"), path, false, error);
    if (!from) return fail(streams, kExitUsage, "info: " + error);
    vyn::ie::DexSettings settings;
    if (!makeSettings(arguments, *from->format(), false, settings, error))
      return fail(streams, kExitUsage, "info: " + error);
    if (!fileExists(path)) return fail(streams, kExitFailure, "info: " + path + " not found");

    vyn::ie::DexParsersLoader loader;
    loader.initIEData(settings);
    const RunOutcome outcome = runInWorker(loader, false, path, *from->format());
    printNotes(streams, outcome);
    if (outcome.result < 0) {
      return fail(streams, exitCodeOf(outcome.result),
                  "info: " + failureText(outcome.result, false, path, from->name(), loader));
    }
    print(streams.out, path, *from, outcome, *loader.getIEData());
    return kExitOk;
  }

 private:
  static void print(std::ostream& out, const std::string& path, const FormatChoice& format,
                    const RunOutcome& outcome, vyn::ie::DexData& data) {
    out << "file:     " << path << '\n';
    out << "format:   " << format.name() << '\n';
    out << "result:   " << outcome.result
        << (outcome.result == vyn::ie::DEX_RESULT_OK ? " (ok)" : " (with remarks)") << '\n';
    out << "datasets: " << data.getNumberOfDatasets() << '\n';
    Summary all;
    for (int d = 0; d < data.getNumberOfDatasets(); ++d) {
      vyn::ie::DexDataset* dataset = data.getDatasetAt(d);
      Summary own;
      const int count = dataset->getNumberOfElements(vyn::ie::OBJECT_TYPE_ALL, 2);
      for (int i = 0; i < count; ++i) {
        if (DexObject* object = dataset->getObjectAt(i)) {
          own.add(*object);
          all.add(*object);
        }
      }
      out << "  \"" << utf8(dataset->getName()) << "\": " << count << " objects\n";
      for (const auto& [kind, number] : own.kinds)
        out << "    " << kindName(kind) << ": " << number << '\n';
      if (const vyn::ie::DexRawData* const rawData = dataset->getRawData();
          rawData != nullptr && rawData->getNumberOfRawData() > 0)
        printRawData(out, *rawData);
    }
    printCounts(out, "codes", all.codes);
    printCounts(out, "layers", all.layers);
    out << "extent:\n";
    out << "  north   " << all.north.text() << '\n';
    out << "  east    " << all.east.text() << '\n';
    out << "  height  " << all.height.text() << '\n';
  }
};

}  // namespace

std::unique_ptr<Command> makeInfoCommand() {
  return std::make_unique<InfoCommand>();
}

}  // namespace dexchange_tool
