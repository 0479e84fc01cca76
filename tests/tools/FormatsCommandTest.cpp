// "dexchange formats", run as a user runs it.

#include <gtest/gtest.h>

#include <algorithm>
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

std::vector<int> asInts(const vyn_vector<int>& found) {
  return std::vector<int>(found.begin(), found.end());
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

TEST(FormatsCommand, ListsTheWholeRegistryWithoutAFilter) {
  const ToolRun run = runFormats("");
  ASSERT_EQ(0, run.exitCode) << run.err;
  EXPECT_EQ("", run.err);
  const std::vector<std::string> lines = linesOf(run.out);
  ASSERT_EQ(156u, lines.size());
  EXPECT_EQ(0u, lines.front().find("  #  Name"));
  for (const char* column : {"Direction", "Tool", "Ext", "Data kinds", "Units", "Libraries"})
    EXPECT_NE(std::string::npos, lines.front().find(column)) << column;
  EXPECT_EQ("154 formats", lines.back());
  std::vector<int> all(154);
  for (int i = 0; i < 154; ++i)
    all[static_cast<std::size_t>(i)] = i;
  EXPECT_EQ(all, listedIndexes(run));
  EXPECT_NE(std::string::npos, run.out.find("MapInfo (*.mif)"));
}

TEST(FormatsCommand, ShowsDirectionToolExtensionKindsUnitsAndLibrariesOfARow) {
  const ToolRun run = runFormats("");
  ASSERT_EQ(0, run.exitCode);
  const std::vector<std::vector<std::string>> rows = {
      {"11", "MapInfo (*.mif)", "both", "-", "mif", "POINTS,LINES,POINT_LISTS,MULTIPLE", "dist any",
       "import ImportParsers; export ExportParsers"},
      {"64", "CSV (Comma delimited) (.csv)", "export", "read, write", "csv", "POINTS,POINT_LISTS", "dist any",
       "export ExportParsers"},
  };
  for (const std::vector<std::string>& row : rows) {
    const std::string line = linesOf(run.out)[static_cast<std::size_t>(std::stoi(row[0])) + 1];
    std::vector<std::string> cells;  // the cells are two blanks or more apart
    for (std::size_t at = line.find_first_not_of(' '); at != std::string::npos;) {
      const std::size_t end = std::min(line.find("  ", at), line.size());
      cells.push_back(line.substr(at, end - at));
      at = line.find_first_not_of(' ', end);
    }
    EXPECT_EQ(row, cells);
  }
}

TEST(FormatsCommand, ListsWhatTheToolReadsAndWritesWhateverTheRegistrysDirection) {
  const vyn::ie::DexFormatsData& formats = registry();
  const std::vector<int> shipped = {
      static_cast<int>(formats.getIndexFormatById(L"{A9A6A37F-F823-4509-9B41-3AC02B45CAA2}")),
      static_cast<int>(formats.getIndexFormatById(L"{5F39DDC1-F0FD-4F27-938A-96EFF426CD60}"))};
  for (const char* arguments :
       {"--tool", "--tool --import", "--tool --export", "--tool --both --type POINTS"})
    EXPECT_EQ(shipped, listedIndexes(runFormats(arguments))) << arguments;
  EXPECT_TRUE(listedIndexes(runFormats("--tool --type LINES")).empty());
  const ToolRun json = runFormats("--guid '{A9A6A37F-F823-4509-9B41-3AC02B45CAA2}' --json");
  EXPECT_NE(std::string::npos,
            json.out.find("\"direction\": \"export\",\n  \"toolReads\": true,\n  \"toolWrites\": true"));
}

TEST(FormatsCommand, ExportFormatsForPointsAreTheRegistrysAnswer) {
  const ToolRun run = runFormats("--export --type POINTS");
  ASSERT_EQ(0, run.exitCode) << run.err;
  vyn_vector<int> expected;
  registry().getSupportedFormatsByDataType(expected, vyn::ie::POINTS, DexCommonType::EXPORT_ONLY, {}, {});
  ASSERT_FALSE(expected.empty());
  EXPECT_EQ(asInts(expected), listedIndexes(run));
  EXPECT_EQ(std::to_string(expected.size()) + " formats", linesOf(run.out).back());
}

TEST(FormatsCommand, FiltersByDirectionConfigurationAndMode) {
  const ToolRun run = runFormats("--both --config REGULAR,JAPAN --mode EXPORT_IN_JAPAN");
  ASSERT_EQ(0, run.exitCode) << run.err;
  vyn_vector<int> expected;
  registry().getSupportedFormats(expected, DexCommonType::IMPORT_AND_EXPORT,
                                 {DexCommonType::REGULAR, DexCommonType::JAPAN},
                                 DexCommonType::EXPORT_IN_JAPAN);
  EXPECT_EQ(asInts(expected), listedIndexes(run));

  const ToolRun imports = runFormats("--import");
  vyn_vector<int> importIndexes;
  registry().getSupportedFormats(importIndexes, DexCommonType::IMPORT_ONLY, {}, {});
  EXPECT_EQ(asInts(importIndexes), listedIndexes(imports));
}

TEST(FormatsCommand, AFilterWithoutDirectionAcceptsEitherDirection) {
  const ToolRun run = runFormats("--config ONBOARD,JAPAN --mode=EXPORT_IN_JAPAN");
  ASSERT_EQ(0, run.exitCode) << run.err;
  const DexFlags<DexCommonType::ESupportedConfigurations> onboardJapan{DexCommonType::ONBOARD,
                                                                       DexCommonType::JAPAN};
  std::vector<int> expected;
  for (unsigned int i = 0; i < registry().getNumberOfFormats(); ++i) {
    const vyn::ie::DexFormat* format = registry().getFormatByIndex(i);
    if (format->compareCommonData(DexCommonType::IMPORT_ONLY, onboardJapan, DexCommonType::EXPORT_IN_JAPAN) ||
        format->compareCommonData(DexCommonType::EXPORT_ONLY, onboardJapan, DexCommonType::EXPORT_IN_JAPAN))
      expected.push_back(static_cast<int>(i));
  }
  EXPECT_EQ(expected, listedIndexes(run));
  // The formats restricted to a using mode are hidden unless it is named.
  const ToolRun unnamed = runFormats("--config ONBOARD,JAPAN");
  EXPECT_LT(listedIndexes(unnamed).size(), expected.size());
}

TEST(FormatsCommand, ADataKindWithoutItsOwnRowListsNothing) {
  const ToolRun run = runFormats("--import --type ROAD_STRINGS");
  EXPECT_EQ(0, run.exitCode);
  EXPECT_EQ(2u, linesOf(run.out).size());
  EXPECT_EQ("0 formats", linesOf(run.out).back());
}

TEST(FormatsCommand, PrintsTheListAsJson) {
  const ToolRun run = runFormats("--json");
  ASSERT_EQ(0, run.exitCode) << run.err;
  EXPECT_EQ("[\n", run.out.substr(0, 2));
  EXPECT_EQ("\n]\n", run.out.substr(run.out.size() - 3));
  EXPECT_EQ(154u, occurrences(run.out, "\"index\": "));
  EXPECT_NE(std::string::npos, run.out.find("\"name\": \"Star*Net (*.dat)\""));
  EXPECT_NE(std::string::npos, run.out.find("\"guid\": \"{C144E2ED-E0F1-4B21-ACEC-9D5FB675621A}\""));
  EXPECT_NE(std::string::npos, run.out.find("\"distanceUnits\": [\"ANY_UNITS\"]"));

  const ToolRun none = runFormats("--json --export --type ROAD_STRINGS");
  EXPECT_EQ("[]\n", none.out);
}

// ---- One format ---------------------------------------------------------------------------------

TEST(FormatsCommand, FindsOneFormatByGuidOrExtension) {
  const ToolRun byGuid = runFormats("--guid '{e1ee3440-4e57-491c-b580-2cc94dfdcd82}'");
  ASSERT_EQ(0, byGuid.exitCode) << byGuid.err;
  EXPECT_NE(std::string::npos, byGuid.out.find("name:           AutoCAD Drawing (*.dwg)\n"));
  EXPECT_NE(std::string::npos, byGuid.out.find("guid:           {E1EE3440-4E57-491C-B580-2CC94DFDCD82}\n"));
  EXPECT_NE(std::string::npos, byGuid.out.find("import library: DWG_2007Parser\n"));
  EXPECT_NE(std::string::npos, byGuid.out.find("angle units:    DECDEG\n"));
  EXPECT_NE(std::string::npos, byGuid.out.find("unit choice:    yes\n"));

  const ToolRun byExtension = runFormats("--ext DXF");
  ASSERT_EQ(0, byExtension.exitCode);
  EXPECT_NE(std::string::npos, byExtension.out.find("name:           AutoCAD DXF (*.dxf)\n"));
  EXPECT_EQ(byExtension.out, runFormats("--ext .dxf").out);

  const ToolRun landXml = runFormats("--guid '{11246CDA-812F-45dc-81D4-35173C9A9FE8}' --json");
  ASSERT_EQ(0, landXml.exitCode);
  EXPECT_EQ("{\n", landXml.out.substr(0, 2));
  EXPECT_NE(std::string::npos, landXml.out.find("\"usingModes\": [\"EXPORT_IN_JAPAN\"]"));
  // Parameter 51 has no word.
  EXPECT_NE(std::string::npos, landXml.out.find("\"BULGES_IN_LINEWORK\", \"#51\"]"));
}

TEST(FormatsCommand, AFormatThatIsNotThereFailsWithOneLine) {
  const ToolRun guid = runFormats("--guid '{00000000-1111-2222-3333-444444444444}'");
  EXPECT_EQ(1, guid.exitCode);
  EXPECT_EQ("dexchange: formats: no format with GUID {00000000-1111-2222-3333-444444444444}\n", guid.err);
  EXPECT_EQ("", guid.out);

  const ToolRun text = runFormats("--guid E1EE3440");
  EXPECT_EQ(1, text.exitCode);

  const ToolRun extension = runFormats("--ext nosuch");
  EXPECT_EQ(1, extension.exitCode);
  EXPECT_EQ("dexchange: formats: no format with extension nosuch\n", extension.err);
}

// ---- Command-line faults ------------------------------------------------------------------------

TEST(FormatsCommand, WrongCommandLinesAreUsageErrors) {
  const std::pair<const char*, const char*> cases[] = {
      {"--import --export", "dexchange: formats: choose one of --import, --export and --both\n"},
      {"--config REGULAR,OFFICE", "dexchange: formats: --config: unknown word OFFICE\n"},
      {"--config REGULAR,", "dexchange: formats: --config: empty word in \"REGULAR,\"\n"},
      {"--mode EXPORT", "dexchange: formats: --mode: unknown word EXPORT\n"},
      {"--type points", "dexchange: formats: --type: unknown data kind points\n"},
      {"--guid '{E1EE3440-4E57-491C-B580-2CC94DFDCD82}' --export",
       "dexchange: formats: --guid and --ext cannot be combined with filters\n"},
      {"--guid '{E1EE3440-4E57-491C-B580-2CC94DFDCD82}' --ext dwg",
       "dexchange: formats: --guid and --ext cannot be combined\n"},
      {"points.csv", "dexchange: formats: unexpected argument points.csv\n"},
      {"--type", "dexchange: formats: option --type needs a value\n"},
      {"--colour", "dexchange: formats: unknown option --colour\n"},
  };
  for (const auto& [arguments, message] : cases) {
    SCOPED_TRACE(arguments);
    const ToolRun run = runFormats(arguments);
    EXPECT_EQ(2, run.exitCode);
    EXPECT_EQ(message, run.err);
    EXPECT_EQ("", run.out);
  }
}

TEST(FormatsCommand, HasHelp) {
  const ToolRun run = runFormats("--help");
  EXPECT_EQ(0, run.exitCode);
  EXPECT_EQ(0u, run.out.find("usage: dexchange formats"));
  EXPECT_NE(std::string::npos, run.out.find("--formats-file PATH"));
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
    vyn_vector<int> expected;
    registry().getSupportedFormatsByDataType(expected, vyn::ie::POINTS, DexCommonType::EXPORT_ONLY, {}, {});
    EXPECT_EQ(asInts(expected), listedIndexes(run));
  }
  // A file that cannot be created is no obstacle either.
  const ToolRun unwritable = runFormats("--formats-file " + folder.file("missing/IEFormatsData.xml"));
  EXPECT_EQ(0, unwritable.exitCode);
  EXPECT_EQ("154 formats", linesOf(unwritable.out).back());
}
