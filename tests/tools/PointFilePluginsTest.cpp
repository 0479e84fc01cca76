// The shipped point-file plug-ins (libImportParsers.so, libExportParsers.so) run through the loader.

#include <gtest/gtest.h>

#include <fstream>
#include <memory>
#include <string>

#include "hostlibs/winport.h"
#include "ieDefinitions/IEFormatsData.h"
#include "ieObjects/IEData.h"
#include "ieObjects/IEDataDictionary.h"
#include "ieObjects/IEDataset.h"
#include "ieObjects/IELayers.h"
#include "ieObjects/IEPoints.h"
#include "ieUtils/IEParsersLoader.h"
#include "ieUtils/IESettings.h"
#include "support/LogCapture.h"
#include "support/TempDir.h"

namespace {

using namespace vyn::ie;
using dex_test::TempDir;

constexpr const wchar_t* kCsvId = L"{A9A6A37F-F823-4509-9B41-3AC02B45CAA2}";
constexpr const wchar_t* kAsciiId = L"{5F39DDC1-F0FD-4F27-938A-96EFF426CD60}";
constexpr EDexResult kLinesSkipped = static_cast<EDexResult>(23);

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

DexSettings pointSettings() {
  DexSettings settings;
  settings.addDataType(POINTS);
  return settings;
}

// A user layout of the customizable ASCII format.
DexUserAsciiSettingsData* asciiLayout(const wchar_t* fields, wchar_t delimiter, bool header = false) {
  auto* ascii = new DexUserAsciiSettingsData();
  EXPECT_TRUE(ascii_fields::stringToFields(fields, ascii->fields, ascii_fields::OWNER_POINTS));
  ascii->delimiter = delimiter;
  ascii->headerLine = header;
  return ascii;
}

// A loader with its own container of these settings.
std::unique_ptr<DexParsersLoader> loaderWith(const DexSettings& settings) {
  auto loader = std::make_unique<DexParsersLoader>();
  loader->initIEData(settings);
  return loader;
}

const DexDesignPoint* pointAt(DexData& data, int index) {
  return dynamic_cast<const DexDesignPoint*>(data.getCurDataset()->getObjectAt(index));
}

int pointCount(DexData& data) {
  return data.getNumberOfDatasets() == 0 ? 0 : data.getCurDataset()->getNumberOfElements(OBJECT_TYPE_ALL, 2);
}

// The codes of a point as one comparable text: name, code strings and attribute values.
std::wstring codesOf(const DexDesignPoint& point) {
  std::wstring text;
  for (int c = 0; c < point.getNumberOfCodes(); ++c) {
    const DexCodeValues* code = point.getCode(c);
    text += L"[" + std::wstring(code->getDescription()->getName().view());
    for (int s = 0; s < code->getNumberOfTheCodeStrings(); ++s)
      text += L":" + std::wstring(code->getCodeStringAt(s).view());
    for (int a = 0; a < code->getDescription()->getSize(); ++a) {
      text += L";" + std::wstring(code->getDescription()->getAttrDescriptionAt(a)->getName().view()) + L"=" +
              std::wstring(code->getAttrAt(a).view());
    }
    text += L"]";
  }
  return text;
}

class PointFiles : public ::testing::Test {
 protected:
  void SetUp() override { DexData::stopProcess_ = false; }
  void TearDown() override { DexData::stopProcess_ = false; }

  std::unique_ptr<DexFormat> csv_ = bothWays(kCsvId);
  std::unique_ptr<DexFormat> ascii_ = bothWays(kAsciiId);
  TempDir dir_;
};

TEST_F(PointFiles, CsvToCustomAsciiToCsvKeepsEveryPointCodeAndCoordinate) {
  DexSettings settings = pointSettings();
  settings.userAsciiSettings = asciiLayout(L"Ht,FullCodes,Easting,Northing,Name", L'\t', true);
  const auto first = loaderWith(settings);
  ASSERT_EQ(DEX_RESULT_OK, first->importInTheSameThread(
                               dex_test::widen(dex_test::dataFile("pointfiles/coded_points.csv")).c_str(),
                               csv_.get(), nullptr));
  const std::wstring asciiFile = dir_.wfile("points.txt");
  ASSERT_EQ(DEX_RESULT_OK, first->exportInTheSameThread(asciiFile.c_str(), ascii_.get(), nullptr));

  const auto second = loaderWith(settings);
  ASSERT_EQ(DEX_RESULT_OK, second->importInTheSameThread(asciiFile.c_str(), ascii_.get(), nullptr));
  const std::wstring csvFile = dir_.wfile("again.csv");
  ASSERT_EQ(DEX_RESULT_OK, second->exportInTheSameThread(csvFile.c_str(), csv_.get(), nullptr));
  const auto third = loaderWith(settings);
  ASSERT_EQ(DEX_RESULT_OK, third->importInTheSameThread(csvFile.c_str(), csv_.get(), nullptr));

  DexData& original = *first->getIEData();
  DexData& final = *third->getIEData();
  ASSERT_EQ(6, pointCount(original));
  ASSERT_EQ(6, pointCount(final));
  for (int i = 0; i < 6; ++i) {
    const DexDesignPoint& a = *pointAt(original, i);
    const DexDesignPoint& b = *pointAt(final, i);
    EXPECT_EQ(a.getName(), b.getName());
    EXPECT_NEAR(a.getStation().getX(), b.getStation().getX(), 5e-4);
    EXPECT_NEAR(a.getStation().getY(), b.getStation().getY(), 5e-4);
    EXPECT_EQ(a.isHeightDefined(), b.isHeightDefined());
    if (a.isHeightDefined()) {
      EXPECT_NEAR(a.getStation().getZ(), b.getStation().getZ(), 5e-4);
    }
    EXPECT_EQ(codesOf(a), codesOf(b));
  }
  EXPECT_EQ(L"Gate, north", pointAt(final, 3)->getName());
  EXPECT_EQ(L"[FENCE:A:B][GATE;Width=4.5;Material=Steel]", codesOf(*pointAt(final, 3)));
  EXPECT_EQ(L"Ü-7", pointAt(final, 5)->getName());
  EXPECT_FALSE(pointAt(final, 2)->isHeightDefined());
  EXPECT_EQ(0, pointAt(final, 4)->getNumberOfCodes());
  EXPECT_EQ(original.getIEDataDictionary()->getSize(), final.getIEDataDictionary()->getSize());
  // The header line names the user's columns in the user's order.
  EXPECT_EQ(
      0u,
      dex_test::readFile(dex_test::narrow(asciiFile)).rfind("Ht\tFullCodes\tEasting\tNorthing\tName\r\n", 0));
}

TEST_F(PointFiles, CsvLinesQuoteOnlyWhatNeedsQuotes) {
  const auto loader = loaderWith(pointSettings());
  ASSERT_EQ(DEX_RESULT_OK, loader->importInTheSameThread(
                               dex_test::widen(dex_test::dataFile("pointfiles/coded_points.csv")).c_str(),
                               csv_.get(), nullptr));
  const std::wstring file = dir_.wfile("out.csv");
  ASSERT_EQ(DEX_RESULT_OK, loader->exportInTheSameThread(file.c_str(), csv_.get(), nullptr));
  EXPECT_EQ(
      "100,5000.000,2000.000,101.250,CP\r\n"
      "101,5010.125,2003.500,101.300,EP:1 KERB:L\r\n"
      "102,5020.250,2007.000,,EP:1;Surface=Asphalt\r\n"
      "\"Gate, north\",5030.375,2010.500,99.875,FENCE:A:B GATE;Width=4.5;Material=Steel\r\n"
      "104,-12.500,0.001,0.000,\r\n"
      "\xC3\x9C-7,5040.000,2014.000,100.000,TREE;Species=Oak\r\n",
      dex_test::readFile(dex_test::narrow(file)));
}

TEST_F(PointFiles, FixedWidthColumnsAreWrittenAndReadByTheirWidths) {
  DexSettings settings = pointSettings();
  settings.userAsciiSettings = asciiLayout(L"Name,Northing,Easting,Ht,Codes&Strings", L',');
  const int widths[] = {6, 12, 12, 9, 12};
  for (std::size_t i = 0; i < settings.userAsciiSettings->fields.size(); ++i) {
    settings.userAsciiSettings->fields[i].width = widths[i];
    settings.userAsciiSettings->fields[i].alignment = i == 0 || i == 4 ? 1 : 0;
  }
  const auto first = loaderWith(settings);
  ASSERT_EQ(DEX_RESULT_OK, first->importInTheSameThread(
                               dex_test::widen(dex_test::dataFile("pointfiles/coded_points.csv")).c_str(),
                               csv_.get(), nullptr));
  const std::wstring file = dir_.wfile("fixed.txt");
  ASSERT_EQ(DEX_RESULT_OK, first->exportInTheSameThread(file.c_str(), ascii_.get(), nullptr));
  const std::string text = dex_test::readFile(dex_test::narrow(file));
  EXPECT_EQ(0u, text.rfind("100       5000.000    2000.000  101.250CP          \r\n", 0)) << text;

  const auto second = loaderWith(settings);
  ASSERT_EQ(DEX_RESULT_OK, second->importInTheSameThread(file.c_str(), ascii_.get(), nullptr));
  ASSERT_EQ(6, pointCount(*second->getIEData()));
  EXPECT_EQ(L"[EP:1][KERB:L]", codesOf(*pointAt(*second->getIEData(), 1)));
  EXPECT_NEAR(-12.5, pointAt(*second->getIEData(), 4)->getStation().getX(), 1e-9);
}

TEST_F(PointFiles, MalformedLinesImportTheGoodLinesAndReportTheSkippedOnes) {
  const dex_test::LogCapture log;
  const auto loader = loaderWith(pointSettings());
  const std::string path = dex_test::dataFile("pointfiles/malformed_lines.csv");
  EXPECT_EQ(kLinesSkipped, loader->importInTheSameThread(dex_test::widen(path).c_str(), csv_.get(), nullptr));
  DexData& data = *loader->getIEData();
  ASSERT_EQ(3, pointCount(data));
  EXPECT_EQ(L"1", pointAt(data, 0)->getName());
  EXPECT_EQ(L"3", pointAt(data, 1)->getName());
  EXPECT_EQ(L"7", pointAt(data, 2)->getName());
  EXPECT_EQ(1, log.countMessage(L"(2): line skipped, northing is not a number"));
  EXPECT_EQ(1, log.countMessage(L"(5): line skipped, no point name"));
  EXPECT_EQ(1, log.countMessage(L"(6): line skipped, no easting"));
  EXPECT_EQ(1, log.countMessage(L"(7): line skipped, malformed code"));
  EXPECT_EQ(1, log.countMessage(L"(8): line skipped, more values than columns"));
  EXPECT_EQ(1, log.countMessage(L"5 malformed lines skipped, 3 points read"));
}

TEST_F(PointFiles, FilesWithoutAnyPointAreWrongAndMissingFilesCannotBeOpened) {
  const dex_test::LogCapture log;
  const auto loader = loaderWith(pointSettings());
  EXPECT_EQ(
      DEX_RESULT_WRONG_FORMAT,
      loader->importInTheSameThread(dex_test::widen(dex_test::dataFile("pointfiles/no_points.csv")).c_str(),
                                    csv_.get(), nullptr));
  EXPECT_EQ(DEX_RESULT_FILE_ERROR,
            loader->importInTheSameThread(dir_.wfile("missing.csv").c_str(), csv_.get(), nullptr));
  EXPECT_EQ(0, pointCount(*loader->getIEData()));
}

TEST_F(PointFiles, AnExportOntoAnExistingFileWithoutAYesLeavesItByteIdentical) {
  const std::string before = "keep me\r\n\x01\x02 exactly";
  const std::string path = dir_.write("existing.csv", before);
  for (const bool withMessageBox : {false, true}) {
    DexSettings settings = pointSettings();
    if (withMessageBox) settings.messageBox = new AnswerBox(IDNO);
    const auto loader = loaderWith(settings);
    ASSERT_EQ(DEX_RESULT_OK, loader->importInTheSameThread(
                                 dex_test::widen(dex_test::dataFile("pointfiles/coded_points.csv")).c_str(),
                                 csv_.get(), nullptr));
    EXPECT_EQ(DEX_RESULT_FILE_ERROR,
              loader->exportInTheSameThread(dex_test::widen(path).c_str(), csv_.get(), nullptr));
    EXPECT_EQ(before, dex_test::readFile(path));
  }
  DexSettings settings = pointSettings();
  settings.messageBox = new AnswerBox(IDYES);
  const auto loader = loaderWith(settings);
  ASSERT_EQ(DEX_RESULT_OK, loader->importInTheSameThread(
                               dex_test::widen(dex_test::dataFile("pointfiles/coded_points.csv")).c_str(),
                               csv_.get(), nullptr));
  EXPECT_EQ(DEX_RESULT_OK, loader->exportInTheSameThread(dex_test::widen(path).c_str(), csv_.get(), nullptr));
  EXPECT_EQ(0u, dex_test::readFile(path).rfind("100,5000.000", 0));
}

TEST_F(PointFiles, TheStopFlagEndsAnImportAndAStoppedExportLeavesNoFile) {
  const std::string path = dir_.writeRepeated("many.csv", "", "7,1.0,2.0,3.0,GND\r\n", 5000, "");
  const auto loader = loaderWith(pointSettings());
  DexData::stopProcess_ = true;
  EXPECT_EQ(DEX_RESULT_STOPPED,
            loader->importInTheSameThread(dex_test::widen(path).c_str(), csv_.get(), nullptr));
  EXPECT_LT(pointCount(*loader->getIEData()), 5000);

  DexData::stopProcess_ = false;
  ASSERT_EQ(DEX_RESULT_OK, loader->importInTheSameThread(dex_test::widen(path).c_str(), csv_.get(), nullptr));
  const std::wstring out = dir_.wfile("stopped.txt");
  DexData::stopProcess_ = true;
  EXPECT_EQ(DEX_RESULT_STOPPED, loader->exportInTheSameThread(out.c_str(), ascii_.get(), nullptr));
  EXPECT_EQ("", dex_test::readFile(dex_test::narrow(out)));
  EXPECT_FALSE(std::ifstream(dex_test::narrow(out)).good());
}

TEST_F(PointFiles, WorkerThreadRunsGiveTheSameResults) {
  const dex_test::LogCapture log;
  const auto loader = loaderWith(pointSettings());
  const HANDLE importRun = loader->startImportInSeparateThread(
      dex_test::widen(dex_test::dataFile("pointfiles/malformed_lines.csv")).c_str(), csv_.get(), nullptr);
  ASSERT_NE(nullptr, importRun);
  ASSERT_EQ(WAIT_OBJECT_0, WaitForSingleObject(importRun, INFINITE));
  DWORD exitCode = 0;
  ASSERT_TRUE(GetExitCodeThread(importRun, &exitCode));
  CloseHandle(importRun);
  EXPECT_EQ(kLinesSkipped, DexParsersLoader::resultFromExitCode(exitCode));
  EXPECT_EQ(3, pointCount(*loader->getIEData()));
  EXPECT_DOUBLE_EQ(1.0, loader->getIEData()->getProgress().getFraction());

  const std::wstring out = dir_.wfile("threaded.csv");
  const HANDLE exportRun = loader->startExportInSeparateThread(out.c_str(), csv_.get(), nullptr);
  ASSERT_EQ(WAIT_OBJECT_0, WaitForSingleObject(exportRun, INFINITE));
  ASSERT_TRUE(GetExitCodeThread(exportRun, &exitCode));
  CloseHandle(exportRun);
  EXPECT_EQ(DEX_RESULT_OK, DexParsersLoader::resultFromExitCode(exitCode));
  EXPECT_EQ(6, log.countMessage(L"malformed_lines.csv"));
  EXPECT_EQ(
      "1,100.000,200.000,10.000,CP\r\n3,101.000,201.000,10.200,EP:1\r\n7,106.000,206.000,10.700,GND\r\n",
      dex_test::readFile(dex_test::narrow(out)));
}

TEST_F(PointFiles, CoordinatesAreReadAndWrittenInTheSettingsUnit) {
  DexSettings settings = pointSettings();
  settings.distUnits = IFEET;
  settings.coordDecimals = {2, 2, 1};
  const auto loader = loaderWith(settings);
  const std::string path = dir_.write("feet.csv", "P1,1000,-250.5,10,\r\n");
  ASSERT_EQ(DEX_RESULT_OK, loader->importInTheSameThread(dex_test::widen(path).c_str(), csv_.get(), nullptr));
  const DexStation& station = pointAt(*loader->getIEData(), 0)->getStation();
  EXPECT_NEAR(304.8, station.getX(), 1e-9);
  EXPECT_NEAR(-76.3524, station.getY(), 1e-9);
  EXPECT_NEAR(3.048, station.getZ(), 1e-9);
  const std::wstring out = dir_.wfile("feet-out.csv");
  ASSERT_EQ(DEX_RESULT_OK, loader->exportInTheSameThread(out.c_str(), csv_.get(), nullptr));
  EXPECT_EQ("P1,1000.00,-250.50,10.0,\r\n", dex_test::readFile(dex_test::narrow(out)));
}

TEST_F(PointFiles, ThePlugInsMakeNoParserForOtherFormats) {
  // "Vyn XML" names the same two libraries.
  const DexFormat* other = getIEFormatsData().getFormatById(L"{E653FE2B-C46A-400E-BA60-864A221BE19F}");
  ASSERT_NE(nullptr, other);
  const auto loader = loaderWith(pointSettings());
  EXPECT_EQ(DEX_RESULT_NO_PARSER,
            loader->importInTheSameThread(
                dex_test::widen(dex_test::dataFile("pointfiles/coded_points.csv")).c_str(), other, nullptr));
  const std::wstring out = dir_.wfile("none.vxml");
  EXPECT_EQ(DEX_RESULT_NO_PARSER, loader->exportInTheSameThread(out.c_str(), other, nullptr));
  EXPECT_FALSE(std::ifstream(dex_test::narrow(out)).good());
}

TEST_F(PointFiles, LayerNamesBecomeLayersOfTheDrawDictionary) {
  DexSettings settings = pointSettings();
  settings.userAsciiSettings = asciiLayout(L"Name,Northing,Easting,Layer Name", L',');
  const auto loader = loaderWith(settings);
  const std::string path = dir_.write("layers.txt", "P1,1,2,Walls\nP2,3,4,Walls\nP3,5,6,Roads\nP4,7,8,\n");
  ASSERT_EQ(DEX_RESULT_OK,
            loader->importInTheSameThread(dex_test::widen(path).c_str(), ascii_.get(), nullptr));
  DexData& data = *loader->getIEData();
  ASSERT_EQ(2, data.getIEDrawDictionary()->getNumberOfLayers());
  EXPECT_EQ(data.getIEDrawDictionary()->findLayer(L"Walls"), pointAt(data, 1)->getLayer());
  EXPECT_EQ(nullptr, pointAt(data, 3)->getLayer());
  const std::wstring out = dir_.wfile("layers-out.txt");
  ASSERT_EQ(DEX_RESULT_OK, loader->exportInTheSameThread(out.c_str(), ascii_.get(), nullptr));
  EXPECT_EQ("P1,1.000,2.000,Walls\r\nP2,3.000,4.000,Walls\r\nP3,5.000,6.000,Roads\r\nP4,7.000,8.000,\r\n",
            dex_test::readFile(dex_test::narrow(out)));
}

TEST_F(PointFiles, SettingsWithoutPointsReadAndWriteNoPoint) {
  DexSettings settings;
  settings.addDataType(CODES);
  const auto loader = loaderWith(settings);
  EXPECT_EQ(DEX_RESULT_OK, loader->importInTheSameThread(
                               dex_test::widen(dex_test::dataFile("pointfiles/coded_points.csv")).c_str(),
                               csv_.get(), nullptr));
  EXPECT_EQ(0, pointCount(*loader->getIEData()));
}

}  // namespace
