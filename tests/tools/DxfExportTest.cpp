// The DXF exporter of libExportParsers.so through the loader: round trips, units, the overwrite
// question and the stop flag, and what independent readers (ezdxf, GDAL) make of the files.

#include <gtest/gtest.h>

#include <cstdlib>
#include <fstream>
#include <sstream>

#include "DxfTestModel.h"
#include "hostlibs/winport.h"
#include "ieObjects/IEData.h"
#include "ieObjects/IEDataset.h"
#include "ieObjects/IEPoints.h"
#include "support/TempDir.h"
#include "support/ToolProcess.h"

namespace {

using namespace vyn::ie;
using dex_test::TempDir;

const std::string kPeers = std::string(DEXCHANGE_TEST_DATA_DIR) + "/../tools/dxf_peers.py";

class AnswerBox final : public IDexMessageBox {
 public:
  explicit AnswerBox(int answer) : answer_(answer) {}
  IDexMessageBox* clone() const override { return new AnswerBox(answer_); }
  int confirmOverwrite(HWND, const wchar_t*) override { return answer_; }

 private:
  int answer_;
};

class DxfExport : public ::testing::Test {
 protected:
  void SetUp() override { DexData::stopProcess_ = false; }
  void TearDown() override { DexData::stopProcess_ = false; }

  // The drawing model written to name, and the loader holding it.
  std::unique_ptr<DexParsersLoader> written(const std::string& name,
                                            DexSettings settings = dxf_test::drawingSettings()) {
    auto loader = dxf_test::loaderWith(settings);
    dxf_test::fillDrawing(*loader->getIEData());
    EXPECT_EQ(DEX_RESULT_OK, dxf_test::exportDxf(*loader, dir_.file(name)));
    return loader;
  }

  std::unique_ptr<DexParsersLoader> readBack(const std::string& path,
                                             DexSettings settings = dxf_test::drawingSettings()) {
    auto loader = dxf_test::loaderWith(settings);
    EXPECT_EQ(DEX_RESULT_OK, dxf_test::importDxf(*loader, path));
    return loader;
  }

  TempDir dir_;
};

// The counts the peer script gives, as "reader kind|layer=n" lines (empty when it cannot run).
std::string peerCounts(const std::string& path) {
  const dex_test::ToolProcess run =
      dex_test::runScript("/usr/bin/python3 '" + kPeers + "' count '" + path + "'");
  std::istringstream json(run.output);
  std::string text;
  std::getline(json, text);
  return text;
}

bool peersAvailable() {
  return dex_test::runScript("/usr/bin/python3 -c 'import ezdxf' && command -v ogr2ogr").exitCode == 0;
}

// The counts of the model as the peer script writes them: {"point|PTS": 3, ...}.
std::string asJson(const std::map<std::string, int>& counts) {
  std::string text = "{";
  for (const auto& [key, count] : counts)
    text += (text.size() > 1 ? ", \"" : "\"") + key + "\": " + std::to_string(count);
  return text + "}";
}

TEST_F(DxfExport, ARoundTripKeepsEveryObjectLayerCodeAndColour) {
  const auto original = written("drawing.dxf");
  const auto back = readBack(dir_.file("drawing.dxf"));
  EXPECT_EQ(dxf_test::describe(*original->getIEData()), dxf_test::describe(*back->getIEData()));
}

TEST_F(DxfExport, CoordinatesAreWrittenInTheSettingsUnitAndReadBackToMeters) {
  struct Case {
    EDistUnits units;
    const char* insUnits;
  };
  for (const Case& unit : {Case{METERS, "6"}, Case{IFEET, "2"}, Case{USFEET, "2"}, Case{MILLIMETERS, "4"},
                           Case{USFEETINCHES, "2"}, Case{USCHAINS, "6"}}) {
    DexSettings settings = dxf_test::drawingSettings();
    settings.distUnits = unit.units;
    const std::string name = "units" + std::to_string(unit.units) + ".dxf";
    const auto original = written(name, settings);
    const std::string text = dex_test::readFile(dir_.file(name));
    EXPECT_NE(std::string::npos, text.find(std::string("$INSUNITS\n 70\n") + unit.insUnits + "\n"))
        << unit.units;
    const auto back = readBack(dir_.file(name), settings);
    EXPECT_EQ(dxf_test::describe(*original->getIEData()), dxf_test::describe(*back->getIEData()))
        << unit.units;
  }
  // The first point in US feet: X the easting, Y the northing.
  DexSettings feet = dxf_test::drawingSettings();
  feet.distUnits = USFEET;
  written("feet.dxf", feet);
  const std::string text = dex_test::readFile(dir_.file("feet.dxf"));
  EXPECT_NE(std::string::npos, text.find("AcDbPoint\n 10\n6563.307\n 20\n16404.577\n"));
}

TEST_F(DxfExport, TheDataTypesOfTheSettingsChooseWhatIsWritten) {
  struct Case {
    EDexDataType type;
    std::vector<std::string> kinds;  // what is read back
  };
  for (const Case& chosen : {Case{POINTS, {"point", "text"}}, Case{LINES, {"line", "arc", "circle", "text"}},
                             Case{AREAS, {"line"}}, Case{SURFACES, {"face"}}}) {
    DexSettings settings;
    settings.addDataType(chosen.type);
    const std::string name = "chosen" + std::to_string(chosen.type) + ".dxf";
    written(name, settings);
    const auto back = readBack(dir_.file(name));
    for (const auto& [key, count] : dxf_test::countByKindAndLayer(*back->getIEData())) {
      const std::string kind = key.substr(0, key.find('|'));
      EXPECT_NE(chosen.kinds.end(), std::find(chosen.kinds.begin(), chosen.kinds.end(), kind)) << key;
    }
  }
}

TEST_F(DxfExport, AnExistingFileIsKeptWithoutAYesAndAStoppedExportLeavesNoFile) {
  const std::string before = "keep me";
  for (const int answer : {IDNO, IDYES}) {
    const std::string path = dir_.write("existing.dxf", before);
    DexSettings settings = dxf_test::drawingSettings();
    settings.messageBox = new AnswerBox(answer);
    auto loader = dxf_test::loaderWith(settings);
    dxf_test::fillDrawing(*loader->getIEData());
    EXPECT_EQ(answer == IDYES ? DEX_RESULT_OK : DEX_RESULT_FILE_ERROR, dxf_test::exportDxf(*loader, path));
    EXPECT_EQ(answer == IDNO, dex_test::readFile(path) == before);
  }
  auto loader = dxf_test::loaderWith();
  dxf_test::fillDrawing(*loader->getIEData());
  EXPECT_EQ(DEX_RESULT_FILE_ERROR, dxf_test::exportDxf(*loader, dir_.file("no/such/folder.dxf")));
  DexData::stopProcess_ = true;
  EXPECT_EQ(DEX_RESULT_STOPPED, dxf_test::exportDxf(*loader, dir_.file("stopped.dxf")));
  EXPECT_FALSE(std::ifstream(dir_.file("stopped.dxf")).good());
}

TEST_F(DxfExport, EzdxfAuditsTheFilesCleanAndEzdxfAndGdalCountWhatTheModelHeld) {
  if (!peersAvailable())
    GTEST_SKIP() << "python3-ezdxf or gdal-bin is not installed (scripts/deps.sh installs them)";
  const auto original = written("drawing.dxf");
  std::map<std::string, int> expected = dxf_test::countByKindAndLayer(*original->getIEData());
  for (const auto& [key, count] : dxf_test::countByKindAndLayer(*original->getIEData())) {
    if (key.rfind("point|", 0) == 0) expected["insert" + key.substr(5)] = count;
  }
  const std::string counts = peerCounts(dir_.file("drawing.dxf"));
  EXPECT_NE(std::string::npos, counts.find("\"errors\": 0,")) << counts;
  EXPECT_NE(std::string::npos, counts.find("\"ezdxf\": " + asJson(expected))) << counts;
  // GDAL does not report inserts whose block holds nothing but attributes.
  std::erase_if(expected, [](const auto& entry) { return entry.first.rfind("insert|", 0) == 0; });
  EXPECT_NE(std::string::npos, counts.find("\"gdal\": " + asJson(expected))) << counts;
}

TEST_F(DxfExport, DrawingsEzdxfAndGdalWriteFromTheModelAreReadWithTheSameCounts) {
  if (!peersAvailable())
    GTEST_SKIP() << "python3-ezdxf or gdal-bin is not installed (scripts/deps.sh installs them)";
  const auto original = written("drawing.dxf");
  const std::map<std::string, int> expected = dxf_test::countByKindAndLayer(*original->getIEData());
  for (const char* version : {"R12", "R2000", "R2018"}) {
    const std::string path = dir_.file(std::string("ezdxf_") + version + ".dxf");
    const dex_test::ToolProcess run =
        dex_test::runScript("/usr/bin/python3 '" + kPeers + "' ezdxf " + version + " '" +
                            dir_.file("drawing.dxf") + "' '" + path + "'");
    ASSERT_EQ(0, run.exitCode) << run.output;
    const auto back = readBack(path);
    EXPECT_EQ(expected, dxf_test::countByKindAndLayer(*back->getIEData())) << version;
  }
  // GDAL writes arcs and circles as polylines and the triangles as hatches, which the model cannot hold.
  const std::string path = dir_.file("gdal.dxf");
  ASSERT_EQ(0, dex_test::runScript("/usr/bin/python3 '" + kPeers + "' gdal '" + dir_.file("drawing.dxf") +
                                   "' '" + path + "'")
                   .exitCode);
  std::map<std::string, int> flattened;
  for (const auto& [key, count] : expected) {
    const std::string kind = key.substr(0, key.find('|'));
    if (kind == "face") continue;
    flattened[(kind == "arc" || kind == "circle" ? "line" : kind) + key.substr(key.find('|'))] += count;
  }
  auto loader = dxf_test::loaderWith();
  dxf_test::importDxf(*loader, path);
  EXPECT_EQ(flattened, dxf_test::countByKindAndLayer(*loader->getIEData()));
}

TEST_F(DxfExport, TheToolDrawsTheSurveyWithItsLineworkFromCodes) {
  const std::string out = dir_.file("survey.dxf");
  const dex_test::ToolProcess run = dex_test::runTool(
      "convert '" + dex_test::dataFile("../../samples/survey.csv") + "' '" + out + "' --linework --force");
  ASSERT_EQ(0, run.exitCode) << run.output;
  EXPECT_NE(std::string::npos, run.output.find("linework: 8 polylines from point codes")) << run.output;
  const auto back = readBack(out);
  int lines = 0;
  for (const auto& [key, count] : dxf_test::countByKindAndLayer(*back->getIEData()))
    lines += key.rfind("line|", 0) == 0 ? count : 0;
  EXPECT_EQ(8, lines);
}

}  // namespace
