// "dexchange formats", run as a user runs it.

#include <gtest/gtest.h>

#include <algorithm>
#include <functional>
#include <string>
#include <vector>

#include "ToolRun.h"
#include "ieDefinitions/IEFormatsData.h"
#include "support/TempDir.h"

using vyn::ie::DexCommonType;
using vyn::ie::DexFlags;

namespace {

using dex_test::linesOf;
using dex_test::ToolRun;

ToolRun runFormats(const std::string& arguments) {
  return dex_test::runApart("formats " + arguments);
}

// The indexes of the table's rows (the lines between the heading and the count).
std::vector<int> listedIndexes(const ToolRun& run) {
  std::vector<int> indexes;
  const std::vector<std::string> lines = linesOf(run.out);
  for (std::size_t i = 1; i + 1 < lines.size(); ++i)
    indexes.push_back(std::stoi(lines[i]));
  return indexes;
}

const vyn::ie::DexFormatsData& registry() {
  return vyn::ie::getIEFormatsData();
}

std::size_t occurrences(const std::string& text, const std::string& part) {
  std::size_t count = 0;
  for (std::size_t at = text.find(part); at != std::string::npos; at = text.find(part, at + 1))
    ++count;
  return count;
}

std::string utf16File(const std::wstring& text) {
  std::string bytes = "\xFF\xFE";
  for (const wchar_t ch : text) {
    bytes += static_cast<char>(ch & 0xFF);
    bytes += static_cast<char>((ch >> 8) & 0xFF);
  }
  return bytes;
}

}  // namespace

// ---- Listing ------------------------------------------------------------------------------------

// The indexes of the formats for which fits holds, in registry order.
std::vector<int> indexesWhere(const std::function<bool(const vyn::ie::DexFormat&)>& fits) {
  std::vector<int> indexes;
  for (unsigned int i = 0; i < registry().getNumberOfFormats(); ++i) {
    if (fits(*registry().getFormatByIndex(i))) indexes.push_back(static_cast<int>(i));
  }
  return indexes;
}

TEST(FormatsCommand, ListsTheWholeRegistryWithAHeadingAndACount) {
  const ToolRun run = runFormats("");
  ASSERT_EQ(0, run.exitCode) << run.err;
  EXPECT_EQ("", run.err);
  const std::vector<std::string> lines = linesOf(run.out);
  ASSERT_EQ(156u, lines.size());
  EXPECT_EQ(0u, lines.front().find("  #  Name"));
  for (const char* column : {"Direction", "Tool", "Ext", "Data kinds", "Units", "Libraries"})
    EXPECT_NE(std::string::npos, lines.front().find(column)) << column;
  EXPECT_EQ("154 formats", lines.back());
  EXPECT_EQ(indexesWhere([](const auto&) { return true; }), listedIndexes(run));
  const std::vector<std::vector<std::string>> rows = {
      {"11", "MapInfo (*.mif)", "both", "-", "mif", "POINTS,LINES,POINT_LISTS,MULTIPLE", "dist any",
       "import ImportParsers; export ExportParsers"},
      {"64", "CSV (Comma delimited) (.csv)", "export", "read, write", "csv", "POINTS,POINT_LISTS", "dist any",
       "export ExportParsers"},
  };
  for (const std::vector<std::string>& row : rows) {
    const std::string& line = lines[static_cast<std::size_t>(std::stoi(row[0])) + 1];
    std::vector<std::string> cells;  // the cells are two blanks or more apart
    for (std::size_t at = line.find_first_not_of(' '); at != std::string::npos;) {
      const std::size_t end = std::min(line.find("  ", at), line.size());
      cells.push_back(line.substr(at, end - at));
      at = line.find_first_not_of(' ', end);
    }
    EXPECT_EQ(row, cells);
  }
}

TEST(FormatsCommand, FiltersAreTheRegistrysQueriesAndTheToolsAbilities) {
  using Configurations = DexFlags<DexCommonType::ESupportedConfigurations>;
  const auto passes = [](DexCommonType::EDataDirections direction, Configurations configurations,
                         DexFlags<DexCommonType::EUsingModes> modes) {
    return [=](const vyn::ie::DexFormat& format) {
      return format.compareCommonData(direction, configurations, modes);
    };
  };
  const auto isShipped = [](const vyn::ie::DexFormat& format) {
    return format.isIdEqual(L"{A9A6A37F-F823-4509-9B41-3AC02B45CAA2}") ||
           format.isIdEqual(L"{5F39DDC1-F0FD-4F27-938A-96EFF426CD60}");
  };
  const Configurations onboardJapan{DexCommonType::ONBOARD, DexCommonType::JAPAN};
  const struct {
    const char* arguments;
    std::function<bool(const vyn::ie::DexFormat&)> fits;
  } cases[] = {
      {"--export --type POINTS",
       [&](const auto& format) {
         return format.isDataTypeSupported(vyn::ie::POINTS) &&
                passes(DexCommonType::EXPORT_ONLY, {}, {})(format);
       }},
      {"--both --config REGULAR,JAPAN --mode EXPORT_IN_JAPAN",
       passes(DexCommonType::IMPORT_AND_EXPORT, {DexCommonType::REGULAR, DexCommonType::JAPAN},
              DexCommonType::EXPORT_IN_JAPAN)},
      {"--import", passes(DexCommonType::IMPORT_ONLY, {}, {})},
      // Without a direction either one passes; a format applying a using mode needs it named.
      {"--config ONBOARD,JAPAN --mode=EXPORT_IN_JAPAN",
       [&](const auto& format) {
         return passes(DexCommonType::IMPORT_ONLY, onboardJapan, DexCommonType::EXPORT_IN_JAPAN)(format) ||
                passes(DexCommonType::EXPORT_ONLY, onboardJapan, DexCommonType::EXPORT_IN_JAPAN)(format);
       }},
      {"--config ONBOARD,JAPAN",
       [&](const auto& format) {
         return passes(DexCommonType::IMPORT_ONLY, onboardJapan, {})(format) ||
                passes(DexCommonType::EXPORT_ONLY, onboardJapan, {})(format);
       }},
      {"--import --type ROAD_STRINGS", [](const auto&) { return false; }},  // no data-kind row of its own
      // What the tool reads and writes, whatever the registry's direction.
      {"--tool", isShipped},
      {"--tool --import", isShipped},
      {"--tool --both --type POINTS", isShipped},
      {"--tool --type LINES", [](const auto&) { return false; }},
  };
  for (const auto& [arguments, fits] : cases) {
    const ToolRun run = runFormats(arguments);
    EXPECT_EQ(0, run.exitCode) << arguments << run.err;
    const std::vector<int> expected = indexesWhere(fits);
    EXPECT_EQ(expected, listedIndexes(run)) << arguments;
    EXPECT_EQ(std::to_string(expected.size()) + " formats", linesOf(run.out).back()) << arguments;
  }
}

TEST(FormatsCommand, PrintsTheListAsJson) {
  const ToolRun run = runFormats("--json");
  ASSERT_EQ(0, run.exitCode) << run.err;
  EXPECT_EQ("[\n", run.out.substr(0, 2));
  EXPECT_EQ("\n]\n", run.out.substr(run.out.size() - 3));
  EXPECT_EQ(154u, occurrences(run.out, "\"index\": "));
  for (const char* part :
       {"\"name\": \"Star*Net (*.dat)\"", "\"guid\": \"{C144E2ED-E0F1-4B21-ACEC-9D5FB675621A}\"",
        "\"distanceUnits\": [\"ANY_UNITS\"]", "\"toolReads\": true"})
    EXPECT_NE(std::string::npos, run.out.find(part)) << part;
  EXPECT_EQ("[]\n", runFormats("--json --export --type ROAD_STRINGS").out);
}

// ---- One format ---------------------------------------------------------------------------------

TEST(FormatsCommand, ShowsOneFormatByGuidOrExtensionOrFailsWithOneLine) {
  const struct {
    const char* arguments;
    int exitCode;
    std::vector<const char*> parts;  // of stdout, or of stderr on failure
  } cases[] = {
      {"--guid '{e1ee3440-4e57-491c-b580-2cc94dfdcd82}'",
       0,
       {"name:           AutoCAD Drawing (*.dwg)\n",
        "guid:           {E1EE3440-4E57-491C-B580-2CC94DFDCD82}\n", "tool:           -\n",
        "import library: DWG_2007Parser\n", "angle units:    DECDEG\n", "unit choice:    yes\n"}},
      {"--ext DXF", 0, {"name:           AutoCAD DXF (*.dxf)\n"}},
      {"--ext .dxf", 0, {"name:           AutoCAD DXF (*.dxf)\n"}},
      {"--guid '{A9A6A37F-F823-4509-9B41-3AC02B45CAA2}'",
       0,
       {"direction:      export\ntool:           read, write\n"}},
      // Parameter 51 has no word.
      {"--guid '{11246CDA-812F-45dc-81D4-35173C9A9FE8}' --json",
       0,
       {"{\n", "\"usingModes\": [\"EXPORT_IN_JAPAN\"]", "\"BULGES_IN_LINEWORK\", \"#51\"]"}},
      {"--guid '{00000000-1111-2222-3333-444444444444}'",
       1,
       {"dexchange: formats: no format with GUID {00000000-1111-2222-3333-444444444444}\n"}},
      {"--guid E1EE3440", 1, {"dexchange: formats: no format with GUID E1EE3440\n"}},
      {"--ext nosuch", 1, {"dexchange: formats: no format with extension nosuch\n"}},
  };
  for (const auto& [arguments, exitCode, parts] : cases) {
    const ToolRun run = runFormats(arguments);
    EXPECT_EQ(exitCode, run.exitCode) << arguments;
    for (const char* part : parts)
      EXPECT_NE(std::string::npos, (exitCode == 0 ? run.out : run.err).find(part))
          << arguments << ": " << part;
    EXPECT_EQ(exitCode == 0, run.err.empty()) << arguments;
  }
}

// ---- Command-line faults ------------------------------------------------------------------------

TEST(FormatsCommand, WrongCommandLinesAreUsageErrors) {
  const std::pair<const char*, const char*> cases[] = {
      {"--import --export", "choose one of --import, --export and --both"},
      {"--config REGULAR,OFFICE", "--config: unknown word OFFICE"},
      {"--config REGULAR,", "--config: empty word in \"REGULAR,\""},
      {"--mode EXPORT", "--mode: unknown word EXPORT"},
      {"--type points", "--type: unknown data kind points"},
      {"--guid '{E1EE3440-4E57-491C-B580-2CC94DFDCD82}' --export",
       "--guid and --ext cannot be combined with filters"},
      {"--guid '{E1EE3440-4E57-491C-B580-2CC94DFDCD82}' --ext dwg", "--guid and --ext cannot be combined"},
      {"points.csv", "unexpected argument points.csv"},
      {"--type", "option --type needs a value"},
      {"--colour", "unknown option --colour"},
  };
  for (const auto& [arguments, message] : cases) {
    const ToolRun run = runFormats(arguments);
    EXPECT_EQ(2, run.exitCode) << arguments;
    EXPECT_EQ("dexchange: formats: " + std::string(message) + "\n", run.err);
    EXPECT_EQ("", run.out) << arguments;
  }
  EXPECT_EQ(0u, runFormats("--help").out.find("usage: dexchange formats"));
}

// ---- A formats data file ------------------------------------------------------------------------

TEST(FormatsCommand, StartsTheRegistryFromAFormatsDataFile) {
  const dex_test::TempDir folder;
  const std::string path = folder.file("IEFormatsData.xml");

  // A missing file is created with the built-in table, which then serves.
  const ToolRun first = runFormats("--formats-file " + path);
  ASSERT_EQ(0, first.exitCode) << first.err;
  EXPECT_EQ("154 formats", linesOf(first.out).back());
  const std::string written = dex_test::readFile(path);
  ASSERT_GT(written.size(), 2u);
  EXPECT_EQ("\xFF\xFE", written.substr(0, 2));

  // The written file is left alone at the next start.
  const ToolRun second = runFormats("--formats-file=" + path);
  EXPECT_EQ(first.out, second.out);
  EXPECT_EQ(written, dex_test::readFile(path));

  // An administrator's file switched to be used replaces the table.
  const std::string own = dex_test::readFile(dex_test::dataFile("formats/two_formats_used.xml"));
  folder.write("IEFormatsData.xml", own);
  const ToolRun fromFile = runFormats("--formats-file " + path + " --json");
  ASSERT_EQ(0, fromFile.exitCode) << fromFile.err;
  EXPECT_EQ(2u, occurrences(fromFile.out, "\"index\": "));
  EXPECT_NE(std::string::npos, fromFile.out.find("\"name\": \"Site Points & Codes (*.spc)\""));
  EXPECT_EQ(own, dex_test::readFile(path));

  // An outdated one is replaced with the built-in table.
  std::string old = own;
  old.replace(old.find("version=\"1.9\""), 13, "version=\"1.8\"");
  folder.write("IEFormatsData.xml", old);
  const ToolRun outdated = runFormats("--formats-file " + path);
  EXPECT_EQ("154 formats", linesOf(outdated.out).back());
  EXPECT_EQ(written, dex_test::readFile(path));
}

TEST(FormatsCommand, ABadFormatsDataFileNeverStopsTheTool) {
  const dex_test::TempDir folder;
  const std::string cases[] = {
      "", "not xml at all", "<IEFormatsData version=\"1.9\" useDataFromFile=\"true\">",
      utf16File(L"<?xml version=\"1.0\" encoding=\"utf-16\"?><IEFormatsData version=\"1.9\" "
                L"useDataFromFile=\"true\"><IEFormats><IEFormat guid=\"")};
  for (const std::string& bytes : cases) {
    const std::string path = folder.write("bad.xml", bytes);
    const ToolRun run = runFormats("--formats-file " + path + " --export --type POINTS");
    EXPECT_EQ(0, run.exitCode) << run.err;
    EXPECT_EQ(listedIndexes(runFormats("--export --type POINTS")), listedIndexes(run));
  }
  // A file that cannot be created is no obstacle either.
  const ToolRun unwritable = runFormats("--formats-file " + folder.file("missing/IEFormatsData.xml"));
  EXPECT_EQ(0, unwritable.exitCode);
  EXPECT_EQ("154 formats", linesOf(unwritable.out).back());
}
