// The shipped point-file plug-ins (libImportParsers.so, libExportParsers.so) run through the loader,
// on real point files and on made-up ones.

#include <gtest/gtest.h>

#include <charconv>
#include <cmath>
#include <cstdio>
#include <fstream>
#include <iomanip>
#include <locale>
#include <memory>
#include <sstream>
#include <string>
#include <vector>

#include "hostlibs/winport.h"
#include "ieDefinitions/IEFormatsData.h"
#include "ieObjects/IEData.h"
#include "ieObjects/IEDataDictionary.h"
#include "ieObjects/IEDataset.h"
#include "ieObjects/IELayers.h"
#include "ieObjects/IEPoints.h"
#include "ieUtils/IEParsersLoader.h"
#include "ieUtils/IESettings.h"
#include "pointfiles/CodeText.h"
#include "pointfiles/PointLayout.h"
#include "support/LogCapture.h"
#include "support/TempDir.h"

namespace {

using namespace vyn::ie;
using dex_test::TempDir;
using point_files::kResultLinesSkipped;

// The registry lists CSV for export and the customizable ASCII points for import only; the plug-ins
// serve both directions, so the tests use a copy that names both libraries.
std::unique_ptr<DexFormat> bothWays(const wchar_t* id) {
  const DexFormat& format = *getIEFormatsData().getFormatById(id);
  return std::make_unique<DexFormat>(
      format.getGuid(), format.getName(), DexFormat::IMPORT_AND_EXPORT, L"ExportParsers", L"ImportParsers",
      format.getTitle(), format.getExtension(false), format.getFilterExtension(), format.getConfigurations(),
      format.getUsingModes(), format.getDataTypes(), format.getDistanceUnits(), format.getAngleUnits(),
      format.getParameters());
}

class AnswerBox final : public IDexMessageBox {
 public:
  explicit AnswerBox(int answer) : answer_(answer) {}
  IDexMessageBox* clone() const override { return new AnswerBox(answer_); }
  int confirmOverwrite(HWND, const wchar_t*) override { return answer_; }

 private:
  int answer_;
};

// Settings for points; fields (custom ASCII field names), when given, with the delimiter and flag.
DexSettings pointSettings(const wchar_t* fields = nullptr, wchar_t delimiter = point_files::kDelimiterToFind,
                          bool header = false) {
  DexSettings settings;
  settings.addDataType(POINTS);
  if (fields == nullptr && delimiter == point_files::kDelimiterToFind) return settings;
  settings.userAsciiSettings = new DexUserAsciiSettingsData();
  if (fields != nullptr) {
    EXPECT_TRUE(
        ascii_fields::stringToFields(fields, settings.userAsciiSettings->fields, ascii_fields::OWNER_POINTS));
  }
  settings.userAsciiSettings->delimiter = delimiter;
  settings.userAsciiSettings->headerLine = header;
  return settings;
}

std::unique_ptr<DexParsersLoader> loaderWith(const DexSettings& settings) {
  auto loader = std::make_unique<DexParsersLoader>();
  loader->initIEData(settings);
  return loader;
}

const DexDesignPoint& pointAt(DexData& data, int index) {
  return dynamic_cast<const DexDesignPoint&>(*data.getCurDataset()->getObjectAt(index));
}

int pointCount(DexData& data) {
  return data.getNumberOfDatasets() == 0 ? 0 : data.getCurDataset()->getNumberOfElements(OBJECT_TYPE_ALL, 2);
}

std::wstring number(bool defined, double value) {
  if (!defined) return L"-";
  std::wostringstream text;  // not swprintf: the suite also runs under a comma-decimal locale
  text.imbue(std::locale::classic());
  text << std::fixed << std::setprecision(3) << value;
  return text.str();
}

// A point as one comparable text: name|north|east|height|codes|notes.
std::wstring textOf(const DexDesignPoint& point) {
  const DexStation& station = point.getStation();
  std::wstring codes;
  point_files::appendCodesText(point, true, true, codes);
  return std::wstring(point.getName().view()) + L"|" +
         number(station.isHorizCoordsDefined(), station.getX()) + L"|" +
         number(station.isHorizCoordsDefined(), station.getY()) + L"|" +
         number(station.isHeightDefined(), station.getZ()) + L"|" + codes + L"|" +
         std::wstring(station.getNotes().view());
}

// A number of a file as C reads it, whatever the locale (std::stod would follow a comma locale).
double valueOf(const std::string& text) {
  double value = std::nan("");
  std::from_chars(text.data(), text.data() + text.size(), value);
  return value;
}

// The values of a line split at delimiter (runs of blanks for the blank).
std::vector<std::string> valuesOf(const std::string& line, char delimiter) {
  std::vector<std::string> values;
  std::istringstream stream(line);
  if (delimiter == ' ') {
    for (std::string value; stream >> value;)
      values.push_back(value);
    return values;
  }
  for (std::string value; std::getline(stream, value, delimiter);)
    values.push_back(value);
  return values;
}

class PointFiles : public ::testing::Test {
 protected:
  void SetUp() override { DexData::stopProcess_ = false; }
  void TearDown() override { DexData::stopProcess_ = false; }

  // Imports the file through a fresh loader; the notes of the run are kept in notes_.
  std::unique_ptr<DexParsersLoader> import(const std::string& path, const DexSettings& settings,
                                           EDexResult expected, const DexFormat* format = nullptr) {
    const dex_test::LogCapture log;
    auto loader = loaderWith(settings);
    EXPECT_EQ(expected, loader->importInTheSameThread(dex_test::widen(path).c_str(),
                                                      format == nullptr ? ascii_.get() : format, nullptr))
        << path;
    notes_.clear();
    for (const vyn_logging::LogRecord& record : log.records())
      notes_ += record.message + L"\n";
    return loader;
  }

  bool noted(const std::wstring& part) const { return notes_.find(part) != std::wstring::npos; }

  std::unique_ptr<DexFormat> csv_ = bothWays(point_files::kCsvFormatId);
  std::unique_ptr<DexFormat> ascii_ = bothWays(point_files::kCustomAsciiFormatId);
  TempDir dir_;
  std::wstring notes_;
};

// ---- Reading ------------------------------------------------------------------------------------

TEST_F(PointFiles, RealFilesGiveEveryPointWithTheCoordinatesOfItsLine) {
  const struct {
    const char* file;
    const wchar_t* fields;  // the columns given, or null for the header's
    char delimiter;
    int headerLines;
    int name, east, north, height;  // indexes of the values; name -1: the points are numbered
    int points;
    int extraLines;
    const wchar_t* layout;
  } cases[] = {
      {"geodepy_Site13-134.txt", L"Name,Easting,Northing,Ht,FullCodes", ',', 0, 0, 1, 2, 3, 27, 25,
       L"columns Name, Easting, Northing, Ht, FullCodes (PENZD, as given); delimiter comma (found in the "
       L"first lines)"},
      {"geodepy_Site01-152.txt", L"Name,Easting,Northing,Ht,FullCodes", ',', 0, 0, 1, 2, 3, 25, 23,
       L"columns Name, Easting, Northing, Ht, FullCodes (PENZD, as given)"},
      {"pdal_utm17_1.txt", nullptr, ',', 1, -1, 0, 1, 2, 10, 0,
       L"columns X, Y, Z (ENZ, named by the header line 1); delimiter comma (found in the first lines)"},
      {"pdal_file1.txt", nullptr, ' ', 1, -1, 0, 1, 2, 9, 0,
       L"columns X, Y, Z (ENZ, named by the header line 1); delimiter blanks (found in the first lines)"},
  };
  for (const auto& real : cases) {
    SCOPED_TRACE(real.file);
    const std::string path = dex_test::dataFile(std::string("pointfiles/") + real.file);
    const auto loader = import(path, pointSettings(real.fields), DEX_RESULT_OK);
    DexData& data = *loader->getIEData();
    EXPECT_TRUE(noted(real.layout)) << notes_;
    ASSERT_EQ(real.points, pointCount(data));
    std::ifstream file(path);
    std::string line;
    for (int i = 0; i < real.headerLines; ++i)
      std::getline(file, line);
    for (int i = 0; std::getline(file, line); ++i) {
      const std::vector<std::string> values = valuesOf(line, real.delimiter);
      const DexStation& station = pointAt(data, i).getStation();
      EXPECT_EQ(real.name < 0 ? std::to_string(i + 1) : values[static_cast<std::size_t>(real.name)],
                dex_test::narrow(pointAt(data, i).getName().view()));
      EXPECT_EQ(valueOf(values[static_cast<std::size_t>(real.north)]), station.getX()) << line;
      EXPECT_EQ(valueOf(values[static_cast<std::size_t>(real.east)]), station.getY()) << line;
      EXPECT_EQ(valueOf(values[static_cast<std::size_t>(real.height)]), station.getZ()) << line;
    }
    EXPECT_EQ(real.extraLines > 0,
              noted(std::to_wstring(real.extraLines) + L" lines with values after the last column"));
  }
}

TEST_F(PointFiles, TheRealJobKeepsItsDatesInTheNotesAndItsCodeTexts) {
  const std::string path = dex_test::dataFile("pointfiles/geodepy_Site13-134.txt");
  const auto loader = import(path, pointSettings(L"Name,Easting,Northing,Ht,FullCodes"), DEX_RESULT_OK);
  DexData& data = *loader->getIEData();
  EXPECT_EQ(L"13|7001264.043|294137.723|394.008||", textOf(pointAt(data, 0)));
  EXPECT_EQ(L"1306|7001228.563|293989.194|397.534|chk1302 from 13|DATE:05-14-2018; TIME:15:45:49",
            textOf(pointAt(data, 4)));
  EXPECT_TRUE(
      noted(L"25 lines with values after the last column, kept in the points' notes (lines 3, 4, 5, 6, "
            L"7, 8, 9, 10, 11, 12, ...)"))
      << notes_;
}

TEST_F(PointFiles, MadeUpFilesAreReadByTheirHeaderOrderDelimiterAndExtraValues) {
  const struct {
    const char* text;
    const wchar_t* fields;
    wchar_t delimiter;
    EDexResult result;
    int points;
    const wchar_t* last;  // the last point
    const wchar_t* note;
  } cases[] = {
      {"Point,Northing,Easting,Elevation,Description\n1,100.5,200.5,10.1,CP\n", nullptr, L'\0', DEX_RESULT_OK,
       1, L"1|100.500|200.500|10.100|CP|", L"named by the header line 1); delimiter comma (found"},
      {"PtNo,E,N,Z,D\r\nA7,200.5,100.5,,EP:1 KERB\r\n", nullptr, L'\0', DEX_RESULT_OK, 1,
       L"A7|100.500|200.500|-|EP:1 KERB|", L"(PENZD, named by the header line 1)"},
      {"Name;Y;X;H\nA;5000,25;2000,5;10,75\n", nullptr, L'\0', DEX_RESULT_OK, 1,
       L"A|5000.250|2000.500|10.750||", L"delimiter semicolon (found"},
      {"Id\tN\tE\tZ\tCode\nT1\t1\t2\t3\tEP:1\n", nullptr, L'\0', DEX_RESULT_OK, 1,
       L"T1|1.000|2.000|3.000|EP:1|", L"delimiter tab (found"},
      {"100.5  200.5 10\n101 201 11\n", L"Easting,Northing,Ht", L'\0', DEX_RESULT_OK, 2,
       L"2|201.000|101.000|11.000||", L"(ENZ, as given); delimiter blanks"},
      {"7,1,2,3,CP,DATE:x,,TIME:y\n", L"Name,Northing,Easting,Ht,FullCodes", L',', DEX_RESULT_OK, 1,
       L"7|1.000|2.000|3.000|CP|DATE:x; TIME:y",
       L"1 line with values after the last column, kept in the points' notes (line 1)"},
      {"7,1,2,3,CP\n", nullptr, L'\0', DEX_RESULT_OK, 1, L"7|1.000|2.000|3.000|CP|",
       L"(PNEZD, assumed: no header line names them)"},
      {"Point,N,E,Z,Code,Description,Date\n1,1,2,3,EP,edge of pavement,2024-01-01\n", nullptr, L'\0',
       DEX_RESULT_OK, 1, L"1|1.000|2.000|3.000|EP|Description=edge of pavement; Date=2024-01-01",
       L"columns Name, Northing, Easting, Z, Codes, \"Description\", \"Date\""},
      {"1,1,2,abc\n", L"Name,Northing,Easting,Ht", L',', DEX_RESULT_OK, 1, L"1|1.000|2.000|-||Ht=abc",
       L"(1): height is not a number, kept in the point's notes"},
      {"1,1,2,3,seen,EP;Surface B\n", L"Name,Northing,Easting,Ht,Notes,FullCodes", L',', DEX_RESULT_OK, 1,
       L"1|1.000|2.000|3.000|B|seen; FullCodes=EP;Surface", L"1 line with values not read as their column"},
      {"Name,Code\nA,CP\n1,1,2,3,CP\n", nullptr, L'\0', kResultLinesSkipped, 1, L"1|1.000|2.000|3.000|CP|",
       L"(1): line skipped, northing is not a number"},
      {"Job 12\n\nPoint,E,N\n1,5,6\n", nullptr, L'\0', kResultLinesSkipped, 1, L"1|6.000|5.000|-||",
       L"named by the header line 3)"},
      {"X,Y,Z\n1,2,3\n", L"Name,Northing,Easting", L',', DEX_RESULT_OK, 1, L"1|2.000|1.000|3.000||",
       L"the header line 1 names other columns than the settings give; read by the header"},
      {"1\t2\t3\t4\n", nullptr, L';', DEX_RESULT_WRONG_FORMAT, 0, L"",
       L"no line gave a point with the delimiter semicolon; the first lines look delimited by tab"},
  };
  for (const auto& made : cases) {
    SCOPED_TRACE(made.text);
    const std::string path = dir_.write("made.txt", made.text);
    const auto loader = import(path, pointSettings(made.fields, made.delimiter), made.result);
    DexData& data = *loader->getIEData();
    ASSERT_EQ(made.points, pointCount(data)) << notes_;
    if (made.points > 0) {
      EXPECT_EQ(made.last, textOf(pointAt(data, made.points - 1)));
    }
    EXPECT_TRUE(noted(made.note)) << notes_;
  }
}

TEST_F(PointFiles, OnlyLinesWithoutANameOrCoordinatesAreDroppedAndEachIsNamed) {
  const auto loader = import(dex_test::dataFile("pointfiles/malformed_lines.csv"), pointSettings(),
                             kResultLinesSkipped, csv_.get());
  DexData& data = *loader->getIEData();
  ASSERT_EQ(5, pointCount(data));
  EXPECT_EQ(L"5|104.000|204.000|10.500|EP:1|FullCodes=;=bad", textOf(pointAt(data, 2)));
  EXPECT_EQ(L"6|105.000|205.000|10.600|GND|extra", textOf(pointAt(data, 3)));
  for (const wchar_t* note :
       {L"malformed_lines.csv(2): line skipped, northing is not a number",
        L"(5): line skipped, no point name", L"(6): line skipped, no easting",
        L"3 lines skipped (no name or no coordinates), 5 points read",
        L"(7): malformed code, kept in the point's notes", L"1 line with values after the last column"})
    EXPECT_TRUE(noted(note)) << note << "\n" << notes_;
  import(dex_test::dataFile("pointfiles/no_points.csv"), pointSettings(), DEX_RESULT_WRONG_FORMAT,
         csv_.get());
  EXPECT_TRUE(noted(L"2 lines skipped")) << notes_;
  import(dir_.file("missing.csv"), pointSettings(), DEX_RESULT_FILE_ERROR, csv_.get());
}

TEST_F(PointFiles, UnnamedPointsAreNumberedAfterTheNumbersInUse) {
  const std::string path = dir_.write("xyz.txt", "X Y Z\n1 2 3\n4 5 6\n");
  const auto loader = loaderWith(pointSettings());
  for (int run = 0; run < 2; ++run)
    ASSERT_EQ(DEX_RESULT_OK,
              loader->importInTheSameThread(dex_test::widen(path).c_str(), ascii_.get(), nullptr));
  DexData& data = *loader->getIEData();
  ASSERT_EQ(4, pointCount(data));
  EXPECT_EQ(L"4|5.000|4.000|6.000||", textOf(pointAt(data, 3)));
}

// ---- Writing and reading back -------------------------------------------------------------------

// CSV quotes only what needs quotes; the custom layout writes its header line in its order.
TEST_F(PointFiles, CsvToCustomAsciiToCsvKeepsEveryPointCodeAndCoordinate) {
  const DexSettings settings = pointSettings(L"Ht,FullCodes,Easting,Northing,Name", L'\t', true);
  const auto first =
      import(dex_test::dataFile("pointfiles/coded_points.csv"), settings, DEX_RESULT_OK, csv_.get());
  const std::wstring asciiFile = dir_.wfile("points.txt");
  ASSERT_EQ(DEX_RESULT_OK, first->exportInTheSameThread(asciiFile.c_str(), ascii_.get(), nullptr));
  EXPECT_EQ(
      0u,
      dex_test::readFile(dex_test::narrow(asciiFile)).rfind("Ht\tFullCodes\tEasting\tNorthing\tName\r\n", 0));
  const auto second = import(dex_test::narrow(asciiFile), settings, DEX_RESULT_OK);
  const std::wstring csvFile = dir_.wfile("again.csv");
  ASSERT_EQ(DEX_RESULT_OK, second->exportInTheSameThread(csvFile.c_str(), csv_.get(), nullptr));
  EXPECT_EQ(
      "100,5000.000,2000.000,101.250,CP\r\n"
      "101,5010.125,2003.500,101.300,EP:1 KERB:L\r\n"
      "102,5020.250,2007.000,,EP:1;Surface=Asphalt\r\n"
      "\"Gate, north\",5030.375,2010.500,99.875,FENCE:A:B GATE;Width=4.5;Material=Steel\r\n"
      "104,-12.500,0.001,0.000,\r\n"
      "\xC3\x9C-7,5040.000,2014.000,100.000,TREE;Species=Oak\r\n",
      dex_test::readFile(dex_test::narrow(csvFile)));
  const auto third = import(dex_test::narrow(csvFile), pointSettings(), DEX_RESULT_OK, csv_.get());
  ASSERT_EQ(6, pointCount(*third->getIEData()));
  for (int i = 0; i < 6; ++i)
    EXPECT_EQ(textOf(pointAt(*first->getIEData(), i)), textOf(pointAt(*third->getIEData(), i)));
  EXPECT_EQ(first->getIEData()->getIEDataDictionary()->getSize(),
            third->getIEData()->getIEDataDictionary()->getSize());
}

TEST_F(PointFiles, FixedWidthColumnsAreWrittenAndReadByTheirWidths) {
  DexSettings settings = pointSettings(L"Name,Northing,Easting,Ht,Codes&Strings", L',');
  const int widths[] = {6, 12, 12, 9, 12};
  for (std::size_t i = 0; i < settings.userAsciiSettings->fields.size(); ++i) {
    settings.userAsciiSettings->fields[i].width = widths[i];
    settings.userAsciiSettings->fields[i].alignment = i == 0 || i == 4 ? 1 : 0;
  }
  const auto first =
      import(dex_test::dataFile("pointfiles/coded_points.csv"), settings, DEX_RESULT_OK, csv_.get());
  const std::wstring file = dir_.wfile("fixed.txt");
  ASSERT_EQ(DEX_RESULT_OK, first->exportInTheSameThread(file.c_str(), ascii_.get(), nullptr));
  const std::string text = dex_test::readFile(dex_test::narrow(file));
  EXPECT_EQ(0u, text.rfind("100       5000.000    2000.000  101.250CP          \r\n", 0)) << text;
  const auto second = import(dex_test::narrow(file), settings, DEX_RESULT_OK);
  ASSERT_EQ(6, pointCount(*second->getIEData()));
  EXPECT_EQ(L"101|5010.125|2003.500|101.300|EP:1 KERB:L|", textOf(pointAt(*second->getIEData(), 1)));
  EXPECT_TRUE(noted(L"(PNEZD, as given); fixed-width columns")) << notes_;
}

TEST_F(PointFiles, CoordinatesAreReadAndWrittenInTheSettingsUnit) {
  DexSettings settings = pointSettings();
  settings.distUnits = IFEET;
  settings.coordDecimals = {2, 2, 1};
  const auto loader =
      import(dir_.write("feet.csv", "P1,1000,-250.5,10,\r\n"), settings, DEX_RESULT_OK, csv_.get());
  EXPECT_EQ(L"P1|304.800|-76.352|3.048||", textOf(pointAt(*loader->getIEData(), 0)));
  const std::wstring out = dir_.wfile("feet-out.csv");
  ASSERT_EQ(DEX_RESULT_OK, loader->exportInTheSameThread(out.c_str(), csv_.get(), nullptr));
  EXPECT_EQ("P1,1000.00,-250.50,10.0,\r\n", dex_test::readFile(dex_test::narrow(out)));
}

TEST_F(PointFiles, LayerNamesBecomeLayersOfTheDrawDictionary) {
  const DexSettings settings = pointSettings(L"Name,Northing,Easting,Layer Name", L',');
  const auto loader = import(dir_.write("layers.txt", "P1,1,2,Walls\nP2,3,4,Walls\nP3,5,6,Roads\nP4,7,8,\n"),
                             settings, DEX_RESULT_OK);
  DexData& data = *loader->getIEData();
  ASSERT_EQ(2, data.getIEDrawDictionary()->getNumberOfLayers());
  EXPECT_EQ(data.getIEDrawDictionary()->findLayer(L"Walls"), pointAt(data, 1).getLayer());
  EXPECT_EQ(nullptr, pointAt(data, 3).getLayer());
  const std::wstring out = dir_.wfile("layers-out.txt");
  ASSERT_EQ(DEX_RESULT_OK, loader->exportInTheSameThread(out.c_str(), ascii_.get(), nullptr));
  EXPECT_EQ("P1,1.000,2.000,Walls\r\nP2,3.000,4.000,Walls\r\nP3,5.000,6.000,Roads\r\nP4,7.000,8.000,\r\n",
            dex_test::readFile(dex_test::narrow(out)));
}

// ---- Refusals and stops -------------------------------------------------------------------------

TEST_F(PointFiles, AnExportOntoAnExistingFileWithoutAYesLeavesItByteIdentical) {
  const std::string before = "keep me\r\n\x01\x02 exactly";
  const std::string path = dir_.write("existing.csv", before);
  for (const int answer : {0, IDNO, IDYES}) {
    DexSettings settings = pointSettings();
    if (answer != 0) settings.messageBox = new AnswerBox(answer);
    const auto loader =
        import(dex_test::dataFile("pointfiles/coded_points.csv"), settings, DEX_RESULT_OK, csv_.get());
    EXPECT_EQ(answer == IDYES ? DEX_RESULT_OK : DEX_RESULT_FILE_ERROR,
              loader->exportInTheSameThread(dex_test::widen(path).c_str(), csv_.get(), nullptr));
    EXPECT_EQ(answer == IDYES, dex_test::readFile(path) != before);
  }
}

TEST_F(PointFiles, TheStopFlagEndsAnImportAndAStoppedExportLeavesNoFile) {
  const std::string path = dir_.writeRepeated("many.csv", "", "7,1.0,2.0,3.0,GND\r\n", 5000, "");
  DexData::stopProcess_ = true;
  const auto loader = import(path, pointSettings(), DEX_RESULT_STOPPED, csv_.get());
  EXPECT_LT(pointCount(*loader->getIEData()), 5000);
  DexData::stopProcess_ = false;
  ASSERT_EQ(DEX_RESULT_OK, loader->importInTheSameThread(dex_test::widen(path).c_str(), csv_.get(), nullptr));
  const std::wstring out = dir_.wfile("stopped.txt");
  DexData::stopProcess_ = true;
  EXPECT_EQ(DEX_RESULT_STOPPED, loader->exportInTheSameThread(out.c_str(), ascii_.get(), nullptr));
  EXPECT_FALSE(std::ifstream(dex_test::narrow(out)).good());
}

TEST_F(PointFiles, WorkerThreadRunsGiveTheSameResults) {
  const dex_test::LogCapture log;
  const auto loader = loaderWith(pointSettings());
  const auto run = [](HANDLE thread) {
    EXPECT_EQ(WAIT_OBJECT_0, WaitForSingleObject(thread, INFINITE));
    DWORD exitCode = 0;
    EXPECT_TRUE(GetExitCodeThread(thread, &exitCode));
    CloseHandle(thread);
    return DexParsersLoader::resultFromExitCode(exitCode);
  };
  EXPECT_EQ(kResultLinesSkipped,
            run(loader->startImportInSeparateThread(
                dex_test::widen(dex_test::dataFile("pointfiles/malformed_lines.csv")).c_str(), csv_.get(),
                nullptr)));
  EXPECT_EQ(5, pointCount(*loader->getIEData()));
  EXPECT_DOUBLE_EQ(1.0, loader->getIEData()->getProgress().getFraction());
  const std::wstring out = dir_.wfile("threaded.csv");
  EXPECT_EQ(DEX_RESULT_OK, run(loader->startExportInSeparateThread(out.c_str(), csv_.get(), nullptr)));
  EXPECT_EQ(8, log.countMessage(L"malformed_lines.csv"));
  EXPECT_EQ(0u,
            dex_test::readFile(dex_test::narrow(out)).rfind("1,100.000,200.000,10.000,CP\r\n3,101.000,", 0));
}

TEST_F(PointFiles, ThePlugInsMakeNoParserForOtherFormatsAndReadNothingWithoutPoints) {
  // "Vyn XML" names the same two libraries.
  const DexFormat* other = getIEFormatsData().getFormatById(L"{E653FE2B-C46A-400E-BA60-864A221BE19F}");
  ASSERT_NE(nullptr, other);
  const std::string path = dex_test::dataFile("pointfiles/coded_points.csv");
  const auto loader = import(path, pointSettings(), DEX_RESULT_NO_PARSER, other);
  const std::wstring out = dir_.wfile("none.vxml");
  EXPECT_EQ(DEX_RESULT_NO_PARSER, loader->exportInTheSameThread(out.c_str(), other, nullptr));
  EXPECT_FALSE(std::ifstream(dex_test::narrow(out)).good());
  DexSettings codesOnly;
  codesOnly.addDataType(CODES);
  EXPECT_EQ(0, pointCount(*import(path, codesOnly, DEX_RESULT_OK, csv_.get())->getIEData()));
}

}  // namespace
