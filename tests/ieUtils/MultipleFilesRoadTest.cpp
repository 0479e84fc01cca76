// The multi-file road bases, run through the loader with the scripted road plug-in (DexTestRoads), in
// the caller's thread and in a worker thread, and driven directly for the export's step rules.

#include <gtest/gtest.h>

#include <filesystem>
#include <memory>
#include <optional>
#include <string>
#include <vector>

#include "hostlibs/VynThread.h"
#include "ieObjects/IEAlignment.h"
#include "ieObjects/IEAlignmentPartsDictionary.h"
#include "ieObjects/IECrossSections.h"
#include "ieObjects/IEData.h"
#include "ieObjects/IEDataset.h"
#include "ieObjects/IEHorizontalAlignment.h"
#include "ieObjects/IEHorizontalElements.h"
#include "ieObjects/IEVerticalAlignment.h"
#include "ieUtils/IEMultipleFilesRoadExporter.h"
#include "ieUtils/IEParsersLoader.h"
#include "ieUtils/RunTestHelpers.h"
#include "ieUtils/detail/RunLog.h"
#include "support/LogCapture.h"
#include "support/TempDir.h"

namespace {

using namespace vyn::ie;  // NOLINT(google-build-using-namespace): the test names many model classes
using dex_test::TempDir;

constexpr DWORD kJoinLimitMs = 120000;
constexpr auto kH = IDexAlignmentPart::HORIZONTAL_ALIGNMENT;
constexpr auto kV = IDexAlignmentPart::VERTICAL_ALIGNMENT;
constexpr auto kX = IDexAlignmentPart::CROSS_SECTION_SET;

enum class RunMode { CALLERS_THREAD, WORKER_THREAD };

std::string modeName(const ::testing::TestParamInfo<RunMode>& info) {
  return info.param == RunMode::CALLERS_THREAD ? "InTheCallersThread" : "InAWorkerThread";
}

// A message box that refuses every overwrite.
class RefusingMessageBox : public IDexMessageBox {
 public:
  IDexMessageBox* clone() const override { return new RefusingMessageBox; }
  int confirmOverwrite(HWND /*parentWindow*/, const wchar_t* /*shortPath*/) const override { return 7; }
};

template <class Part>
Part* named(const wchar_t* name, int items) {
  auto* const part = new Part;
  part->setName(name);
  for (int i = 0; i < items; ++i) {
    if constexpr (std::is_same_v<Part, DexHorizontalAlignment>) part->addSegment(new DexLine2D);
    if constexpr (std::is_same_v<Part, DexVerticalAlignment>) {
      part->addLongSection(new DexLongSection(DexLongSection::LEVEL_POINT));
    }
  }
  return part;
}

DexCrossSectionSet* namedSet(const wchar_t* name, int sections) {
  auto* const set = new DexCrossSectionSet(false);
  set->setName(name);
  for (int i = 0; i < sections; ++i)
    set->addCrossSection(new DexCrossSection(nullptr));
  return set;
}

// Adds an alignment named name with the three parts (given to the parts dictionary) to the dataset.
void addRoad(DexData& data, const wchar_t* name, int items = 1) {
  DexAlignmentPartsDictionary& dictionary = *data.getIEAlignmentPartsDictionary();
  auto* const alignment = new DexAlignment;
  alignment->setName(name);
  for (IDexAlignmentPart* part : std::initializer_list<IDexAlignmentPart*>{
           named<DexHorizontalAlignment>(L"H", items), named<DexVerticalAlignment>(L"V", items),
           namedSet(L"X", items)}) {
    dictionary.addAlignmentPart(part);
    alignment->setAlignmentPart(part);
  }
  data.getCurDataset()->add(alignment);
}

// Data requesting ROADS with a dataset holding roads named names.
std::unique_ptr<DexData> roadsData(std::initializer_list<const wchar_t*> names, const DexSettings& settings) {
  auto data = std::make_unique<DexData>(settings);
  data->addDataset(new DexDataset(L"Roads"));
  for (const wchar_t* name : names)
    addRoad(*data, name);
  return data;
}

class MultipleFilesRoadRun : public ::testing::TestWithParam<RunMode> {
 protected:
  MultipleFilesRoadRun() {
    const std::wstring library = dex_test::testPlugin("DexTestRoads");
    format_.emplace(dex_test::makeFormat(L"{22222222-3333-4444-5555-666666666666}", library, library));
  }

  EDexResult run(bool import, const std::wstring& fileName, DexData& data) {
    if (GetParam() == RunMode::CALLERS_THREAD) {
      return import ? loader_.importInTheSameThread(fileName.c_str(), &*format_, &data)
                    : loader_.exportInTheSameThread(fileName.c_str(), &*format_, &data);
    }
    const HANDLE thread = import ? loader_.startImportInSeparateThread(fileName.c_str(), &*format_, &data)
                                 : loader_.startExportInSeparateThread(fileName.c_str(), &*format_, &data);
    EXPECT_EQ(WAIT_OBJECT_0, WaitForSingleObject(thread, kJoinLimitMs));
    DWORD exitCode = 0;
    EXPECT_TRUE(GetExitCodeThread(thread, &exitCode));
    EXPECT_TRUE(CloseHandle(thread));
    return DexParsersLoader::resultFromExitCode(exitCode);
  }

  bool exists(const std::string& name) const { return std::filesystem::exists(dir_.file(name)); }

  dex_test::StopFlagReset stopFlag_;
  dex_test::LogCapture log_;  // the threaded runs have no notifier: keep their records out of the log
  TempDir dir_;
  DexParsersLoader loader_;
  std::optional<DexFormat> format_;
};

INSTANTIATE_TEST_SUITE_P(BothModes, MultipleFilesRoadRun,
                         ::testing::Values(RunMode::CALLERS_THREAD, RunMode::WORKER_THREAD), modeName);

// ---- Import ---------------------------------------------------------------------------------------

TEST_P(MultipleFilesRoadRun, ImportsTheRequestedPartsAndJoinsThemForRoads) {
  const struct {
    const char* what;
    std::initializer_list<EDexDataType> types;
    const char* hal;  // null: no such file
    const char* tval;
    const char* txs;
    const char* chosen;  // the file handed to the import
    EDexResult result;
    int parts[3];              // horizontal, vertical, cross-section parts in the dictionary
    const wchar_t* alignment;  // null: no alignment added
    double staStart;
    int alignmentParts;
  } cases[] = {
      // clang-format off
      {"all three files", {ROADS}, "R1 2 100", "V1 1", "X1 3", "road.thal", DEX_RESULT_OK, {1, 1, 1}, L"R1", 100, 3},
      {"any of the three chosen", {ROADS}, "R1 2 100", "V1 1", "X1 3", "road.txs", DEX_RESULT_OK, {1, 1, 1}, L"R1", 100, 3},
      {"missing cross sections", {ROADS}, "R1 2", "V1 1", nullptr, "road.thal", DEX_RESULT_WRONG_FORMAT, {1, 1, 0}, nullptr, 0, 0},
      {"empty horizontal file", {ROADS}, "", "V1 1 5", "X1 1", "road.thal", DEX_RESULT_OK, {0, 1, 1}, L"V1", 0, 2},
      {"unreadable horizontal", {ROADS}, "bad", "V1 1", "X1 1", "road.thal", DEX_RESULT_WRONG_FORMAT, {0, 0, 0}, nullptr, 0, 0},
      {"unreadable vertical", {ROADS}, "R1 1", "bad", "X1 1", "road.thal", DEX_RESULT_WRONG_FORMAT, {1, 0, 0}, nullptr, 0, 0},
      {"only cross sections", {ROADS}, nullptr, nullptr, "X1 1", "road.thal", DEX_RESULT_WRONG_FORMAT, {0, 0, 0}, nullptr, 0, 0},
      {"no file at all", {ROADS}, nullptr, nullptr, nullptr, "road.thal", DEX_RESULT_FILE_ERROR, {0, 0, 0}, nullptr, 0, 0},
      {"vertical from the chosen file", {V_ALIGNMENTS}, "R1 1", nullptr, nullptr, "road.thal", DEX_RESULT_OK, {0, 1, 0}, nullptr, 0, 0},
      {"unreadable chosen horizontal", {H_ALIGNMENTS}, "bad", nullptr, nullptr, "road.thal", DEX_RESULT_WRONG_FORMAT, {0, 0, 0}, nullptr, 0, 0},
      {"two kinds from the chosen file", {H_ALIGNMENTS, X_SECTIONS}, "R1 1", "V1 1", nullptr, "road.thal", DEX_RESULT_OK, {1, 0, 1}, nullptr, 0, 0},
      {"no road type requested", {POINTS}, "R1 1", "V1 1", "X1 1", "road.thal", DEX_RESULT_FILE_ERROR, {0, 0, 0}, nullptr, 0, 0},
      // clang-format on
  };
  for (const auto& c : cases) {
    SCOPED_TRACE(c.what);
    const TempDir dir;
    for (const auto& [name, text] :
         {std::pair{"road.thal", c.hal}, {"road.tval", c.tval}, {"road.txs", c.txs}}) {
      if (text != nullptr) dir.write(name, *text != 0 ? std::string(text) + "\n" : std::string());
    }
    DexData data(dex_test::settingsWith(c.types));
    data.addDataset(new DexDataset(L"Roads"));
    EXPECT_EQ(c.result, run(true, dir.wfile(c.chosen), data));
    const DexAlignmentPartsDictionary& dictionary = *data.getIEAlignmentPartsDictionary();
    EXPECT_EQ(c.parts[0], dictionary.getNumberOfElements(kH));
    EXPECT_EQ(c.parts[1], dictionary.getNumberOfElements(kV));
    EXPECT_EQ(c.parts[2], dictionary.getNumberOfElements(kX));
    const DexDataset& dataset = *data.getCurDataset();
    ASSERT_EQ(c.alignment != nullptr ? 1 : 0, dataset.getNumberOfAlignments());
    if (c.alignment == nullptr) continue;
    const DexAlignment& alignment = *dataset.getAlignmentAt(0);
    EXPECT_EQ(CVynStringT<wchar_t>(c.alignment), alignment.getName());
    EXPECT_EQ(c.staStart, alignment.getStaStart());
    EXPECT_EQ(c.alignmentParts, alignment.getNumberOfAlignmentParts());
  }
}

TEST_P(MultipleFilesRoadRun, ImportStoppedWhileReadingAnswersStopped) {
  dir_.write("road.thal", "R1 1\n");
  DexData data(dex_test::settingsWith({H_ALIGNMENTS}));
  DexData::stopProcess_ = true;
  EXPECT_EQ(DEX_RESULT_STOPPED, run(true, dir_.wfile("road.thal"), data));
}

// ---- Export ---------------------------------------------------------------------------------------

TEST_P(MultipleFilesRoadRun, ExportsEachRoadIntoThreeFilesNamedAfterIt) {
  DexData data(dex_test::settingsWith({ROADS}));
  data.addDataset(new DexDataset(L"Roads"));
  addRoad(data, L"R1", 2);
  addRoad(data, L"R2", 1);
  EXPECT_EQ(DEX_RESULT_OK, run(false, dir_.wpath(), data));
  EXPECT_EQ("H 2\n", dex_test::readFile(dir_.file("R1.thal")));
  EXPECT_EQ("V 1\n", dex_test::readFile(dir_.file("R2.tval")));
  EXPECT_EQ("X 2\n", dex_test::readFile(dir_.file("R1.txs")));
  EXPECT_EQ(6, static_cast<int>(data.getExportedFileNames().GetSize()));
}

TEST_P(MultipleFilesRoadRun, ExportsPartsUnderTheirOwnNamesAndSkipsEmptyOnes) {
  DexData data(dex_test::settingsWith({H_ALIGNMENTS, V_ALIGNMENTS}));
  DexAlignmentPartsDictionary& dictionary = *data.getIEAlignmentPartsDictionary();
  dictionary.addAlignmentPart(named<DexHorizontalAlignment>(L"A", 1));
  dictionary.addAlignmentPart(named<DexHorizontalAlignment>(L"Empty", 0));
  dictionary.addAlignmentPart(named<DexVerticalAlignment>(L"B", 1));
  EXPECT_EQ(DEX_RESULT_OK, run(false, dir_.wpath(), data));
  EXPECT_TRUE(exists("A.thal"));
  EXPECT_FALSE(exists("Empty.thal"));
  EXPECT_FALSE(exists("B.tval"));  // the first requested kind decides; an empty part ends the export
}

TEST_P(MultipleFilesRoadRun, StopBetweenStepsDeletesEveryFileWrittenSoFar) {
  const auto owned = roadsData({L"R1", L"R2"}, dex_test::settingsWith({ROADS}));
  DexData& data = *owned;
  const std::string folder = dir_.file("out");
  std::filesystem::create_directory(folder);
  dir_.write("out.script", "stop-after-step 0\n");
  EXPECT_EQ(DEX_RESULT_STOPPED, run(false, dir_.wfile("out"), data));
  for (const char* name : {"out/R1.thal", "out/R1.tval", "out/R1.txs", "out/R2.thal"})
    EXPECT_FALSE(exists(name)) << name;
}

TEST_P(MultipleFilesRoadRun, RefusedOverwriteOfOneFileLeavesItAndWritesTheOtherTwo) {
  DexSettings settings = dex_test::settingsWith({ROADS});
  settings.messageBox = new RefusingMessageBox;
  const auto owned = roadsData({L"R1"}, settings);
  DexData& data = *owned;
  dir_.write("R1.tval", "old\n");
  EXPECT_EQ(DEX_RESULT_FILE_ERROR, run(false, dir_.wpath(), data));
  EXPECT_EQ("old\n", dex_test::readFile(dir_.file("R1.tval")));
  EXPECT_EQ("H 1\n", dex_test::readFile(dir_.file("R1.thal")));
  EXPECT_EQ("X 1\n", dex_test::readFile(dir_.file("R1.txs")));
  EXPECT_EQ(2, static_cast<int>(data.getExportedFileNames().GetSize()));
}

// ---- The export's steps, driven directly ----------------------------------------------------------

// Records what it is asked to write; writes through the base's open operations.
class RecordingExporter : public IDexMultipleFilesRoadExporter {
 public:
  RecordingExporter(DexData* data, const std::wstring& fileName)
      : IDexMultipleFilesRoadExporter(data, fileName.c_str(), nullptr) {}
  using IDexMultipleFilesRoadExporter::exportAlignment;
  using IDexMultipleFilesRoadExporter::getIEResult;
  using IDexMultipleFilesRoadExporter::getNumberOfSteps;
  using IDexMultipleFilesRoadExporter::singleStep;

  std::vector<std::wstring> written;
  bool answer = true;

 protected:
  bool writeHAl(const DexHorizontalAlignment* part) override {
    return note(L"h:", part, openHAlFile(part, L".thal"));
  }
  bool writeVAl(const DexVerticalAlignment* part) override {
    return note(L"v:", part, openVAlFile(part, L".tval"));
  }
  bool writeXSect(const DexCrossSectionSet* part, const DexVerticalAlignment* vertical) override {
    return note(vertical != nullptr ? L"x+v:" : L"x:", part, openXSectFile(part, L".txs"));
  }

 private:
  bool note(const wchar_t* kind, const IDexAlignmentPart* part, bool opened) {
    written.push_back(std::wstring(kind) + std::wstring(part->getName().view()) +
                      (opened ? L"" : L"(closed)"));
    return answer;
  }
};

TEST(MultipleFilesRoadExporter, CountsOneStepPerItemOfTheFirstRequestedKindPlusOne) {
  const struct {
    std::initializer_list<EDexDataType> types;
    int steps;
    bool logged;
  } cases[] = {
      {{ROADS, H_ALIGNMENTS}, 3, false},
      {{H_ALIGNMENTS, X_SECTIONS}, 4, false},
      {{V_ALIGNMENTS}, 3, false},
      {{X_SECTIONS}, 3, false},
      {{POINTS}, 1, true},
  };
  for (const auto& c : cases) {
    dex_test::LogCapture log;
    const auto owned = roadsData({L"R1", L"R2"}, dex_test::settingsWith(c.types));
    DexData& data = *owned;
    data.getIEAlignmentPartsDictionary()->addAlignmentPart(named<DexHorizontalAlignment>(L"H3", 1));
    RecordingExporter exporter(&data, L"/tmp");
    EXPECT_EQ(c.steps, exporter.getNumberOfSteps());
    EXPECT_EQ(c.logged ? 1 : 0,
              log.count(detail::kMultipleFilesRoadExporterLogSource, detail::kNoRoadDataTypeLine));
  }
}

TEST(MultipleFilesRoadExporter, WritesEachAlignmentsPrimaryPartsAndEndsAfterTheLast) {
  const TempDir dir;
  const auto owned = roadsData({L"R1", L"R2"}, dex_test::settingsWith({ROADS}));
  DexData& data = *owned;
  RecordingExporter exporter(&data, dir.wpath());
  EXPECT_TRUE(exporter.singleStep());
  EXPECT_TRUE(exporter.singleStep());
  EXPECT_FALSE(exporter.singleStep());
  EXPECT_EQ(2, exporter.getCurrentStep());
  EXPECT_EQ((std::vector<std::wstring>{L"h:H", L"v:V", L"x+v:X", L"h:H", L"v:V", L"x+v:X"}),
            exporter.written);
  EXPECT_TRUE(std::filesystem::exists(dir.file("R2.txs")));
  EXPECT_TRUE(exporter.exportAlignment(7));  // no such alignment
  const TempDir other;
  RecordingExporter refusing(&data, other.wpath());
  refusing.answer = false;
  EXPECT_FALSE(refusing.exportAlignment(0));  // nothing written ends the export
}

TEST(MultipleFilesRoadExporter, AFileThatCannotBeCreatedSetsTheFileError) {
  const TempDir dir;
  DexData data(dex_test::settingsWith({H_ALIGNMENTS}));
  data.getIEAlignmentPartsDictionary()->addAlignmentPart(named<DexHorizontalAlignment>(L"A", 1));
  RecordingExporter exporter(&data, dir.wfile("missing-folder"));
  exporter.singleStep();
  EXPECT_EQ((std::vector<std::wstring>{L"h:A(closed)"}), exporter.written);
  EXPECT_EQ(DEX_RESULT_FILE_ERROR, exporter.getIEResult());
  EXPECT_EQ(0, static_cast<int>(data.getExportedFileNames().GetSize()));
}

}  // namespace
