#include "RunReport.h"

#include <algorithm>
#include <map>

#include "Json.h"
#include "RawDataPrint.h"
#include "ToolText.h"
#include "ieDefinitions/IEFormatsData.h"
#include "ieObjects/IEData.h"
#include "ieObjects/IEDataDictionary.h"
#include "ieObjects/IEDataset.h"
#include "ieObjects/IELayers.h"
#include "ieObjects/IEPoints.h"

namespace dexchange_tool {

using vyn::ie::DexObject;
using vyn::ie::point_files::ESource;
using vyn::ie::point_files::ImportFindings;
using vyn::ie::point_files::LineTally;

void RunSide::finish(const RunOutcome& runOutcome) {
  ran = true;
  outcome = runOutcome;
  for (const std::string& note : outcome.notes)
    vyn::ie::point_files::readNote(wide(file).view(), wide(note).view(), findings);
}

namespace {

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
  struct Dataset {
    std::string name;
    int objects = 0;
    std::map<std::string, int> kinds;
  };
  std::vector<Dataset> datasets;
  std::map<std::string, int> kinds;
  std::map<std::string, int> codes;
  std::map<std::string, int> layers;
  Range north;
  Range east;
  Range height;

  explicit Summary(vyn::ie::DexData& data) {
    for (int d = 0; d < data.getNumberOfDatasets(); ++d) {
      vyn::ie::DexDataset& dataset = *data.getDatasetAt(d);
      Dataset own{utf8(dataset.getName()), dataset.getNumberOfElements(vyn::ie::OBJECT_TYPE_ALL, 2), {}};
      for (int i = 0; i < own.objects; ++i) {
        if (DexObject* object = dataset.getObjectAt(i)) {
          ++own.kinds[kindName(object->getType())];
          add(*object);
        }
      }
      // Surfaces are held beside the objects, but a surveyor counts them with them.
      const int surfaces = dataset.getNumberOfSurfaces();
      if (surfaces > 0) {
        own.objects += surfaces;
        own.kinds[kindName(vyn::ie::OBJECT_TYPE_SURFACE)] += surfaces;
        kinds[kindName(vyn::ie::OBJECT_TYPE_SURFACE)] += surfaces;
      }
      datasets.push_back(own);
    }
  }

 private:
  // getType() is not const.
  void add(DexObject& object) {
    ++kinds[kindName(object.getType())];
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

// ---- Text ---------------------------------------------------------------------------------------

void printCounts(std::ostream& out, const std::string& title, const std::map<std::string, int>& counts) {
  out << title << ": " << counts.size() << '\n';
  for (const auto& [name, count] : counts)
    out << "  " << name << std::string(name.size() < 20 ? 20 - name.size() : 1, ' ') << count << '\n';
}

void printLines(std::ostream& out, const ImportFindings& findings) {
  out << "lines:    " << findings.skipped.count << " skipped (no name or no coordinates), "
      << findings.extra.count << " with values after the last column, " << findings.unreadable.count
      << " with values not read as their column (both kept in the points' notes)\n";
}

// ---- JSON ---------------------------------------------------------------------------------------

const char* sourceWord(ESource source) {
  switch (source) {
    case ESource::HEADER:
      return "header";
    case ESource::FOUND:
      return "found";
    case ESource::ASSUMED:
      return "assumed";
    default:
      return "given";
  }
}

void writeTally(JsonWriter& json, const std::string& name, const LineTally& tally, const char* reason) {
  json.key(name).beginObject().key("count").value(tally.count).key("first").beginArray();
  for (const LineTally::Entry& entry : tally.first) {
    json.beginObject().key("line").value(entry.line);
    json.key("reason").value(entry.reason.empty() ? std::string(reason) : utf8(entry.reason)).endObject();
  }
  json.endArray().endObject();
}

void writeLayout(JsonWriter& json, const ImportFindings& findings) {
  json.key("layout");
  if (!findings.layoutKnown) {
    json.null();
    return;
  }
  std::vector<std::string> columns;
  for (const std::wstring& column : findings.columns)
    columns.push_back(utf8(column));
  json.beginObject().key("columns").texts(columns).key("order").value(utf8(findings.order));
  json.key("columnsFrom")
      .value(sourceWord(findings.columnsFrom))
      .key("headerLine")
      .value(findings.headerLine);
  json.key("delimiter")
      .value(utf8(findings.delimiter))
      .key("delimiterFrom")
      .value(sourceWord(findings.delimiterFrom));
  json.endObject();
}

void writeLines(JsonWriter& json, const ImportFindings& findings) {
  json.key("lines");
  if (!findings.layoutKnown) {
    json.null();
    return;
  }
  json.beginObject();
  writeTally(json, "skipped", findings.skipped, "");
  writeTally(json, "keptExtra", findings.extra, "values after the last column");
  writeTally(json, "keptUnreadable", findings.unreadable, "");
  json.endObject();
}

void writeSide(JsonWriter& json, const std::string& name, const RunSide& side, bool importSide) {
  json.key(name);
  if (!side.ran) {
    json.null();
    return;
  }
  json.beginObject().key("file").value(side.file).key("format").beginObject();
  json.key("index").value(static_cast<int>(side.format->index())).key("name").value(side.format->name());
  json.key("guid").value(utf8(side.format->format()->getGuidAsString())).endObject();
  json.key("result").value(static_cast<int>(side.outcome.result));
  if (importSide) {
    writeLayout(json, side.findings);
    writeLines(json, side.findings);
  }
  json.key("notes").texts(side.outcome.notes).endObject();
}

void writeCounts(JsonWriter& json, const std::string& name, const std::map<std::string, int>& counts) {
  json.key(name).beginObject();
  for (const auto& [key, count] : counts)
    json.key(key).value(count);
  json.endObject();
}

void writeRange(JsonWriter& json, const std::string& name, const Range& range) {
  json.key(name);
  if (!range.any) {
    json.null();
    return;
  }
  json.beginObject().key("min").value(range.low).key("max").value(range.high).endObject();
}

void writeContents(JsonWriter& json, const Summary& summary) {
  json.key("datasets").beginArray();
  for (const Summary::Dataset& dataset : summary.datasets) {
    json.beginObject().key("name").value(dataset.name).key("objects").value(dataset.objects);
    writeCounts(json, "kinds", dataset.kinds);
    json.endObject();
  }
  json.endArray();
  writeCounts(json, "objects", summary.kinds);
  writeCounts(json, "codes", summary.codes);
  writeCounts(json, "layers", summary.layers);
  json.key("extent").beginObject();
  writeRange(json, "north", summary.north);
  writeRange(json, "east", summary.east);
  writeRange(json, "height", summary.height);
  json.endObject();
}

}  // namespace

void printInfo(std::ostream& out, const RunReport& report) {
  const RunSide& input = report.input;
  const Summary summary(*report.data);
  out << "file:     " << input.file << '\n';
  out << "format:   " << input.format->name() << '\n';
  if (input.findings.layoutKnown) {
    out << "layout:   " << utf8(vyn::ie::point_files::layoutText(input.findings)) << '\n';
    printLines(out, input.findings);
  }
  out << "result:   " << input.outcome.result
      << (input.outcome.result == vyn::ie::DEX_RESULT_OK ? " (ok)" : " (with remarks)") << '\n';
  out << "datasets: " << summary.datasets.size() << '\n';
  for (std::size_t d = 0; d < summary.datasets.size(); ++d) {
    const Summary::Dataset& dataset = summary.datasets[d];
    out << "  \"" << dataset.name << "\": " << dataset.objects << " objects\n";
    for (const auto& [kind, number] : dataset.kinds)
      out << "    " << kind << ": " << number << '\n';
    const vyn::ie::DexRawData* const rawData = report.data->getDatasetAt(static_cast<int>(d))->getRawData();
    if (rawData != nullptr && rawData->getNumberOfRawData() > 0) printRawData(out, *rawData);
  }
  printCounts(out, "codes", summary.codes);
  printCounts(out, "layers", summary.layers);
  out << "extent:   (" << report.units << ")\n";
  out << "  north   " << summary.north.text() << '\n';
  out << "  east    " << summary.east.text() << '\n';
  out << "  height  " << summary.height.text() << '\n';
}

std::string jsonReport(const RunReport& report) {
  JsonWriter json;
  json.beginObject().key("version").value(1).key("command").value(report.command);
  writeSide(json, "input", report.input, true);
  if (report.command == "convert") writeSide(json, "output", report.output, false);
  json.key("units").value(report.units);
  if (report.data != nullptr) writeContents(json, Summary(*report.data));
  if (report.lineworkPolylines >= 0) json.key("linework").value(report.lineworkPolylines);
  json.key("exitCode").value(report.exitCode).key("error");
  if (report.error.empty()) {
    json.null();
  } else {
    json.value(report.error);
  }
  return json.endObject().text();
}

}  // namespace dexchange_tool
