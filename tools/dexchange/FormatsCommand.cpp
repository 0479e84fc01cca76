#include <algorithm>
#include <functional>

#include "Command.h"
#include "FormatChoice.h"
#include "Json.h"
#include "ToolText.h"
#include "hostlibs/VynString.h"
#include "ieDefinitions/IEFormatWords.h"
#include "ieDefinitions/IEFormatsData.h"
#include "ieUtils/IEUtilsUnitWords.h"

namespace dexchange_tool {
namespace {

using vyn::ie::DexCommonType;
using vyn::ie::DexFlags;
using vyn::ie::DexFormat;
using vyn::ie::DexFormatsData;
using WideString = CVynStringT<wchar_t>;

// ---- Words --------------------------------------------------------------------------------------

// The words of a set's members in value order; a member without a word is shown as "#<value>".
template <class E>
std::vector<std::string> wordsOf(DexFlags<E> set, const std::function<WideString(E)>& wordOf) {
  std::vector<std::string> words;
  for (int value = 0; value < DexFlags<E>::kCapacity; ++value) {
    if (!set.has(static_cast<E>(value))) continue;
    const WideString word = wordOf(static_cast<E>(value));
    words.push_back(word.IsEmpty() ? "#" + std::to_string(value) : utf8(word));
  }
  return words;
}

std::string joined(const std::vector<std::string>& words, const std::string& separator) {
  std::string text;
  for (const std::string& word : words)
    text += (text.empty() ? "" : separator) + word;
  return text;
}

// Parses "WORD,WORD" into a set; false (with the bad word in error) for a word the lookup rejects.
template <class E>
bool parseWordList(const std::string& list, const std::function<bool(const WideString&, E&)>& lookup,
                   DexFlags<E>& set, std::string& error) {
  for (const std::string& word : commaItems(list)) {
    E value{};
    if (!lookup(wide(word), value)) {
      error = word.empty() ? "empty word in \"" + list + "\"" : "unknown word " + word;
      return false;
    }
    set.add(value);
  }
  return true;
}

std::string directionText(DexCommonType::EDataDirections direction) {
  switch (direction) {
    case DexCommonType::IMPORT_ONLY:
      return "import";
    case DexCommonType::EXPORT_ONLY:
      return "export";
    default:
      return "both";
  }
}

// ---- One format ---------------------------------------------------------------------------------

// Everything the listing shows of one format, as texts.
struct FormatView {
  unsigned int index = 0;
  std::string guid;
  std::string name;
  std::string direction;
  std::string tool;  // what the tool does with it through the shipped plug-ins
  std::string title;
  std::string extension;
  std::string filter;
  std::string importLibrary;
  std::string exportLibrary;
  std::vector<std::string> configurations;
  std::vector<std::string> usingModes;
  std::vector<std::string> dataKinds;
  std::vector<std::string> distanceUnits;
  std::vector<std::string> angleUnits;
  std::vector<std::string> parameters;
  bool hasUnitsToSelect = false;
};

FormatView viewOf(unsigned int index, const DexFormat& format) {
  FormatView view;
  view.index = index;
  view.guid = utf8(format.getGuidAsString());
  view.name = utf8(format.getName());
  view.direction = directionText(format.getDataDirections());
  view.tool = toolReads(format)    ? (toolWrites(format) ? "read, write" : "read")
              : toolWrites(format) ? "write"
                                   : "";
  view.title = utf8(format.getTitle());
  view.extension = utf8(format.getExtension(false));
  view.filter = utf8(format.getFilterExtension());
  view.importLibrary = utf8(format.getDllName(false));
  view.exportLibrary = utf8(format.getDllName(true));
  view.configurations = wordsOf<DexCommonType::ESupportedConfigurations>(format.getConfigurations(),
                                                                         vyn::ie::keywordFromConfiguration);
  view.usingModes =
      wordsOf<DexCommonType::EUsingModes>(format.getUsingModes(), vyn::ie::keywordFromUsingMode);
  view.dataKinds = wordsOf<vyn::ie::EDexDataType>(format.getDataTypes(), vyn::ie::keywordFromDataType);
  view.distanceUnits =
      wordsOf<vyn::ie::EDistUnits>(format.getDistanceUnits(), vyn::ie::utils::keywordFromDistUnits);
  view.angleUnits =
      wordsOf<vyn::ie::EAngleUnits>(format.getAngleUnits(), vyn::ie::utils::keywordFromAngleUnits);
  view.parameters = wordsOf<DexFormat::EParameterName>(format.getParameters(), vyn::ie::keywordFromParameter);
  view.hasUnitsToSelect = format.hasUnitsToSelect();
  return view;
}

std::string orDash(const std::string& text) {
  return text.empty() ? "-" : text;
}

// A unit set for the table: "any" for the any-unit value, the words of up to three units, or a count.
std::string unitSummary(const std::vector<std::string>& units) {
  if (std::find(units.begin(), units.end(), "ANY_UNITS") != units.end()) return "any";
  if (units.size() <= 3) return joined(units, ",");
  return std::to_string(units.size()) + " units";
}

std::string unitsCell(const FormatView& view) {
  std::vector<std::string> parts;
  if (!view.distanceUnits.empty()) parts.push_back("dist " + unitSummary(view.distanceUnits));
  if (!view.angleUnits.empty()) parts.push_back("angle " + unitSummary(view.angleUnits));
  return parts.empty() ? "-" : joined(parts, "; ");
}

// The data kinds for the table; a long list is cut after a few words, with the count of the rest.
std::string dataKindsCell(const FormatView& view) {
  constexpr std::size_t kShown = 6;
  if (view.dataKinds.size() <= kShown) return orDash(joined(view.dataKinds, ","));
  const std::vector<std::string> first(view.dataKinds.begin(), view.dataKinds.begin() + kShown - 1);
  return joined(first, ",") + ",+" + std::to_string(view.dataKinds.size() - first.size()) + " more";
}

std::string librariesCell(const FormatView& view) {
  std::vector<std::string> parts;
  if (!view.importLibrary.empty()) parts.push_back("import " + view.importLibrary);
  if (!view.exportLibrary.empty()) parts.push_back("export " + view.exportLibrary);
  return parts.empty() ? "-" : joined(parts, "; ");
}

// ---- Output -------------------------------------------------------------------------------------

void printTable(std::ostream& out, const std::vector<FormatView>& views) {
  std::vector<std::vector<std::string>> rows;
  rows.push_back({"#", "Name", "Direction", "Tool", "Ext", "Data kinds", "Units", "Libraries"});
  for (const FormatView& view : views) {
    rows.push_back({std::to_string(view.index), view.name, view.direction, orDash(view.tool),
                    orDash(view.extension), dataKindsCell(view), unitsCell(view), librariesCell(view)});
  }
  std::vector<std::size_t> widths(rows.front().size(), 0);
  for (const auto& row : rows) {
    for (std::size_t column = 0; column < row.size(); ++column)
      widths[column] = std::max(widths[column], row[column].size());
  }
  for (const auto& row : rows) {
    std::string line;
    for (std::size_t column = 0; column < row.size(); ++column) {
      const bool last = column + 1 == row.size();
      // The index is right-aligned, the texts left-aligned.
      const std::string padding(widths[column] - row[column].size(), ' ');
      line += column == 0 ? padding + row[column] : row[column] + (last ? "" : padding);
      if (!last) line += "  ";
    }
    out << line << '\n';
  }
  out << views.size() << (views.size() == 1 ? " format" : " formats") << '\n';
}

void printDetails(std::ostream& out, const FormatView& view) {
  const auto field = [&out](const std::string& label, const std::string& text) {
    out << label << ':' << std::string(15 - label.size(), ' ') << orDash(text) << '\n';
  };
  field("index", std::to_string(view.index));
  field("guid", view.guid);
  field("name", view.name);
  field("direction", view.direction);
  field("tool", view.tool);
  field("title", view.title);
  field("extension", view.extension);
  field("filter", view.filter);
  field("import library", view.importLibrary);
  field("export library", view.exportLibrary);
  field("configurations", joined(view.configurations, ", "));
  field("using modes", joined(view.usingModes, ", "));
  field("data kinds", joined(view.dataKinds, ", "));
  field("distance units", joined(view.distanceUnits, ", "));
  field("angle units", joined(view.angleUnits, ", "));
  field("parameters", joined(view.parameters, ", "));
  field("unit choice", view.hasUnitsToSelect ? "yes" : "no");
}

void writeJson(JsonWriter& json, const FormatView& view) {
  json.beginObject().key("index").value(static_cast<int>(view.index)).key("guid").value(view.guid);
  json.key("name").value(view.name).key("direction").value(view.direction);
  json.key("toolReads").value(view.tool.find("read") != std::string::npos);
  json.key("toolWrites").value(view.tool.find("write") != std::string::npos);
  json.key("title").value(view.title).key("extension").value(view.extension);
  json.key("filterExtension").value(view.filter).key("importLibrary").value(view.importLibrary);
  json.key("exportLibrary").value(view.exportLibrary).key("configurations").texts(view.configurations);
  json.key("usingModes").texts(view.usingModes).key("dataTypes").texts(view.dataKinds);
  json.key("distanceUnits").texts(view.distanceUnits).key("angleUnits").texts(view.angleUnits);
  json.key("parameters").texts(view.parameters).key("hasUnitsToSelect").value(view.hasUnitsToSelect);
  json.endObject();
}

void printJson(std::ostream& out, const std::vector<FormatView>& views) {
  JsonWriter json;
  json.beginArray();
  for (const FormatView& view : views)
    writeJson(json, view);
  out << json.endArray().text();
}

// ---- The command --------------------------------------------------------------------------------

// What the listing is asked to show.
struct Query {
  bool filtered = false;  // any of the direction, configuration, mode and type options was given
  std::vector<DexCommonType::EDataDirections> directions;
  DexFlags<DexCommonType::ESupportedConfigurations> configurations;
  DexFlags<DexCommonType::EUsingModes> modes;
  bool byType = false;
  vyn::ie::EDexDataType type = vyn::ie::POINTS;
  bool byTool = false;  // what the tool reads or writes, in place of the registry's directions
};

// Whether the tool serves the format in the direction (either one when none is named).
bool toolServes(const DexFormat& format, const std::vector<DexCommonType::EDataDirections>& directions) {
  const bool reads = toolReads(format);
  const bool writes = toolWrites(format);
  if (directions.empty()) return reads || writes;
  switch (directions.front()) {
    case DexCommonType::IMPORT_ONLY:
      return reads;
    case DexCommonType::EXPORT_ONLY:
      return writes;
    default:
      return reads && writes;
  }
}

class FormatsCommand final : public Command {
 public:
  std::string name() const override { return "formats"; }
  std::string summary() const override { return "list the exchange formats of the registry"; }
  std::string help() const override {
    return "usage: dexchange formats [--import | --export | --both] [--config LIST] [--mode LIST]\n"
           "                         [--type KIND] [--tool] [--formats-file PATH] [--json]\n"
           "       dexchange formats (--guid GUID | --ext EXTENSION) [--formats-file PATH] [--json]\n"
           "\n"
           "Lists the formats registry as a table: index, name, direction, what the tool reads and\n"
           "writes with the shipped plug-ins (Tool), extension, data kinds, units and plug-in libraries.\n"
           "The shipped plug-ins read and write CSV (Comma delimited) and Customizable ASCII Point Files\n"
           "both ways, although the registry lists each for one direction. Without a filter every format\n"
           "is listed. With one, the registry's own queries answer, as for the host's dialogs:\n"
           "  --import, --export   formats that can be imported (exported): one-way and two-way formats\n"
           "  --both               two-way formats only\n"
           "  --config LIST        formats offered in every configuration named (REGULAR,ONBOARD,JAPAN)\n"
           "  --mode LIST          using modes the caller names (EXPORT_IN_JAPAN,ONBOARD_WITH_SCANNING);\n"
           "                       a format that applies a mode is listed only when the mode is named\n"
           "  --type KIND          formats that carry the data kind (POINTS, LINES, ...); kinds without\n"
           "                       a data-kind row of their own (ROAD_STRINGS, STA_EQUATION_SETS) list\n"
           "                       nothing\n"
           "  --tool               formats the tool reads or writes; with --import, --export or --both\n"
           "                       those it reads, writes or both, whatever the registry's direction\n"
           "Without --import, --export or --both a filter accepts formats of any direction.\n"
           "\n"
           "  --guid GUID          shows the first format with the braced GUID\n"
           "  --ext EXTENSION      shows the first format with the extension, case ignored (\".dxf\" or\n"
           "                       \"dxf\")\n"
           "  --formats-file PATH  starts the registry from a formats data file instead of the built-in\n"
           "                       table (the file is written with the built-in table when it is missing\n"
           "                       or unusable)\n"
           "  --json               prints the formats as JSON\n"
           "\n"
           "Exit codes: 0 listed, 1 no format with that GUID or extension, 2 wrong command line.\n";
  }
  std::set<std::string> flags() const override { return {"import", "export", "both", "tool", "json"}; }
  std::set<std::string> valuedOptions() const override {
    return {"config", "mode", "type", "guid", "ext", "formats-file"};
  }

  int run(const Arguments& arguments, ToolStreams& streams) const override {
    if (!arguments.positional().empty()) {
      return fail(streams, kExitUsage, "formats: unexpected argument " + arguments.positional().front());
    }
    Query query;
    std::string error;
    if (!parseQuery(arguments, query, error)) return fail(streams, kExitUsage, "formats: " + error);
    const bool single = arguments.has("guid") || arguments.has("ext");
    if (arguments.has("guid") && arguments.has("ext")) {
      return fail(streams, kExitUsage, "formats: --guid and --ext cannot be combined");
    }
    if (single && query.filtered) {
      return fail(streams, kExitUsage, "formats: --guid and --ext cannot be combined with filters");
    }

    if (arguments.has("formats-file"))
      vyn::ie::intializeIEformatsDataFromFile(wide(arguments.value("formats-file")));
    const DexFormatsData& registry = vyn::ie::getIEFormatsData();
    const bool json = arguments.has("json");
    if (single) return showOne(registry, arguments, json, streams);

    std::vector<FormatView> views;
    for (const unsigned int index : selectedIndexes(registry, query))
      views.push_back(viewOf(index, *registry.getFormatByIndex(index)));
    if (json) {
      printJson(streams.out, views);
    } else {
      printTable(streams.out, views);
    }
    return kExitOk;
  }

 private:
  static bool parseQuery(const Arguments& arguments, Query& query, std::string& error) {
    const std::pair<const char*, DexCommonType::EDataDirections> directionFlags[] = {
        {"import", DexCommonType::IMPORT_ONLY},
        {"export", DexCommonType::EXPORT_ONLY},
        {"both", DexCommonType::IMPORT_AND_EXPORT}};
    for (const auto& [flag, direction] : directionFlags) {
      if (arguments.has(flag)) query.directions.push_back(direction);
    }
    if (query.directions.size() > 1) {
      error = "choose one of --import, --export and --both";
      return false;
    }
    if (arguments.has("config") &&
        !parseWordList<DexCommonType::ESupportedConfigurations>(
            arguments.value("config"), vyn::ie::configurationFromKeyword, query.configurations, error)) {
      error = "--config: " + error;
      return false;
    }
    if (arguments.has("mode") &&
        !parseWordList<DexCommonType::EUsingModes>(arguments.value("mode"), vyn::ie::usingModeFromKeyword,
                                                   query.modes, error)) {
      error = "--mode: " + error;
      return false;
    }
    if (arguments.has("type")) {
      query.byType = true;
      if (!vyn::ie::dataTypeFromKeyword(wide(arguments.value("type")), query.type)) {
        error = "--type: unknown data kind " + arguments.value("type");
        return false;
      }
    }
    query.byTool = arguments.has("tool");
    query.filtered = !query.directions.empty() || arguments.has("config") || arguments.has("mode") ||
                     query.byType || query.byTool;
    return true;
  }

  // The indexes the query selects, in registry order. Without a direction a format passes when it
  // passes for import or for export, which every direction does.
  static std::vector<unsigned int> selectedIndexes(const DexFormatsData& registry, const Query& query) {
    std::vector<unsigned int> indexes;
    if (!query.filtered) {
      for (unsigned int i = 0; i < registry.getNumberOfFormats(); ++i)
        indexes.push_back(i);
      return indexes;
    }
    const std::vector<DexCommonType::EDataDirections> directions =
        query.directions.empty() || query.byTool
            ? std::vector<DexCommonType::EDataDirections>{DexCommonType::IMPORT_ONLY,
                                                          DexCommonType::EXPORT_ONLY}
            : query.directions;
    vyn_vector<int> found;
    for (const DexCommonType::EDataDirections direction : directions) {
      if (query.byType) {
        registry.getSupportedFormatsByDataType(found, query.type, direction, query.configurations,
                                               query.modes);
      } else {
        registry.getSupportedFormats(found, direction, query.configurations, query.modes);
      }
    }
    std::sort(found.begin(), found.end());
    found.erase(std::unique(found.begin(), found.end()), found.end());
    for (const int index : found) {
      const DexFormat& format = *registry.getFormatByIndex(static_cast<unsigned int>(index));
      if (!query.byTool || toolServes(format, query.directions))
        indexes.push_back(static_cast<unsigned int>(index));
    }
    return indexes;
  }

  static int showOne(const DexFormatsData& registry, const Arguments& arguments, bool json,
                     ToolStreams& streams) {
    const DexFormat* format = nullptr;
    std::string wanted;
    if (arguments.has("guid")) {
      wanted = "GUID " + arguments.value("guid");
      format = registry.getFormatById(wide(arguments.value("guid")));
    } else {
      const std::string extension = arguments.value("ext");
      wanted = "extension " + extension;
      const bool withDot = !extension.empty() && extension.front() == '.';
      format = registry.getFormatByExtension(wide(extension), withDot);
    }
    if (format == nullptr) return fail(streams, kExitFailure, "formats: no format with " + wanted);
    unsigned int index = 0;
    while (registry.getFormatByIndex(index) != format)
      ++index;
    const FormatView view = viewOf(index, *format);
    if (json) {
      JsonWriter writer;
      writeJson(writer, view);
      streams.out << writer.text();
    } else {
      printDetails(streams.out, view);
    }
    return kExitOk;
  }
};

}  // namespace

std::unique_ptr<Command> makeFormatsCommand() {
  return std::make_unique<FormatsCommand>();
}

}  // namespace dexchange_tool
