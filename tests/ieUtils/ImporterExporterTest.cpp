// The importer and exporter bases, the overwrite question, and the run functions called directly.

#include <gtest/gtest.h>

#include <filesystem>
#include <memory>
#include <string>
#include <vector>

#include "hostlibs/FileFuncs.h"
#include "hostlibs/VynUi.h"
#include "ieObjects/IEData.h"
#include "ieObjects/IEDataset.h"
#include "ieUtils/IEParsersLoader.h"
#include "ieUtils/IERunProgress.h"
#include "ieUtils/IExporter.h"
#include "ieUtils/IImporter.h"
#include "ieUtils/RunTestHelpers.h"
#include "support/LogCapture.h"
#include "support/TempDir.h"
#include "support/VtableSlot.h"

namespace {

using namespace vyn::ie;
using dex_test::LogCapture;
using dex_test::TempDir;

const std::wstring kImporterSource = L"ieUtils\\IImporter";
const std::wstring kExporterSource = L"ieUtils\\IExporter";

// ---- Importers ----------------------------------------------------------------------------------------

class PlainImporter : public DexImporterImpl {
 public:
  PlainImporter(DexData* data, const CVynStringT<wchar_t>& fileName, const DexFormat* format)
      : DexImporterImpl(data, fileName, format) {}
  ~PlainImporter() override = default;

  static std::optional<std::ptrdiff_t> doImportSlot() {
    return dex_test::vtableEntryOf(&PlainImporter::doImport);
  }

 protected:
  EDexResult doImport() override { return DEX_RESULT_OK; }
};

TEST(ImporterExporterImporter, AddsTheImportDatasetToAnEmptyContainerWhenPointsAreRequested) {
  DexData data(dex_test::settingsWith({POINTS}));
  const PlainImporter importer(&data, L"in.txt", nullptr);
  ASSERT_EQ(1, data.getNumberOfDatasets());
  EXPECT_EQ(L"Import dataset", std::wstring(data.getDatasetAt(0)->getName().view()));
}

TEST(ImporterExporterImporter, AddsNoDatasetWhenOnlyCodesAreRequested) {
  DexData data(dex_test::settingsWith({CODES}));
  const PlainImporter importer(&data, L"in.txt", nullptr);
  EXPECT_EQ(0, data.getNumberOfDatasets());
}

TEST(ImporterExporterImporter, EveryKindOfObjectDataGetsTheImportDataset) {
  for (const EDexDataType type : {POINTS, LINES, AREAS, PARCELS, ROADS, SURFACES, POINT_LISTS, ROAD_SURVEY,
                                  SCANNING_DATA, JOB_HISTORY, RAW_DATA, MULTIPLE}) {
    DexData data(dex_test::settingsWith({type}));
    const PlainImporter importer(&data, L"in.txt", nullptr);
    EXPECT_EQ(1, data.getNumberOfDatasets()) << "data type " << type;
  }
  for (const EDexDataType type :
       {CODES, H_ALIGNMENTS, X_SECTION_TEMPLATES, LOCALIZATION, STA_EQUATION_SETS}) {
    DexData data(dex_test::settingsWith({type}));
    const PlainImporter importer(&data, L"in.txt", nullptr);
    EXPECT_EQ(0, data.getNumberOfDatasets()) << "data type " << type;
  }
}

TEST(ImporterExporterImporter, AddsNoDatasetToAContainerThatHasDatasets) {
  DexData data(dex_test::settingsWith({POINTS}));
  data.addDataset(new DexDataset(L"first", 0, false));
  data.addDataset(new DexDataset(L"second", 0, false));
  const PlainImporter importer(&data, L"in.txt", nullptr);
  EXPECT_EQ(2, data.getNumberOfDatasets());
}

TEST(ImporterExporterImporter, ANullContainerIsLeftAlone) {
  const PlainImporter importer(nullptr, L"in.txt", nullptr);
  EXPECT_EQ(nullptr, importer.getData());
  EXPECT_EQ(L"in.txt", std::wstring(importer.getFileName().view()));
}

TEST(ImporterExporterImporter, CopiesShareTheContainerAndTheFormat) {
  DexData data(dex_test::settingsWith({POINTS}));
  const DexFormat format = dex_test::scriptedFormat();
  const PlainImporter importer(&data, L"in.txt", &format);
  const PlainImporter copy(importer);
  EXPECT_EQ(&data, copy.getData());
  EXPECT_EQ(&format, copy.getFormat());
  EXPECT_EQ(1, data.getNumberOfDatasets());  // copying prepares nothing again
}

TEST(ImporterExporterImporter, DoImportFollowsTheDestructorInTheVirtualTable) {
  if (const auto slot = PlainImporter::doImportSlot()) {
    EXPECT_EQ(2, *slot);
  }
}

// ---- Exporters: the step driver ---------------------------------------------------------------------------

// An exporter that answers singleStep() from a list, advancing currentStep when told to, and may set the
// stop flag during a given step.
class StepExporter : public DexExporterImpl {
 public:
  StepExporter(DexData* data, std::vector<bool> answers, bool advance = true)
      : DexExporterImpl(data, L"out.txt", nullptr), answers_(std::move(answers)), advance_(advance) {}
  ~StepExporter() override = default;

  using DexExporterImpl::doExport;
  using DexExporterImpl::getIEResult;

  int stopAtCall = -1;
  EDexResult resultAtLastStep = DEX_RESULT_OK;
  int calls = 0;

  static std::optional<std::ptrdiff_t> slotOf(int which) {
    switch (which) {
      case 0:
        return dex_test::vtableEntryOf(&StepExporter::doExport);
      case 1:
        return dex_test::vtableEntryOf(&StepExporter::getNumberOfSteps);
      case 2:
        return dex_test::vtableEntryOf(&StepExporter::singleStep);
      default:
        return dex_test::vtableEntryOf(&StepExporter::getIEResult);
    }
  }

 protected:
  int getNumberOfSteps() override { return static_cast<int>(answers_.size()); }
  bool singleStep() override {
    const int call = calls++;
    if (advance_) currentStep = call;
    if (call == stopAtCall) DexData::stopProcess_ = true;
    const bool more = call < static_cast<int>(answers_.size()) && answers_[call];
    if (!more) ieResult = resultAtLastStep;
    return more;
  }

 private:
  std::vector<bool> answers_;
  bool advance_;
};

class ImporterExporterDriver : public ::testing::Test {
 protected:
  dex_test::StopFlagReset stopFlag_;
  DexData data_{dex_test::settingsWith({POINTS})};
};

TEST_F(ImporterExporterDriver, StepsUntilTheLastAndReportsOk) {
  StepExporter exporter(&data_, {true, true, false});
  EXPECT_EQ(DEX_RESULT_OK, exporter.doExport());
  EXPECT_EQ(3, exporter.calls);
  EXPECT_EQ(2, exporter.getCurrentStep());
}

TEST_F(ImporterExporterDriver, AnExporterThatNeverAdvancesReportsAFileError) {
  StepExporter exporter(&data_, {false}, false);
  EXPECT_EQ(DEX_RESULT_FILE_ERROR, exporter.doExport());
  EXPECT_EQ(1, exporter.calls);
  EXPECT_EQ(-2, exporter.getCurrentStep());
}

TEST_F(ImporterExporterDriver, TheResultSetBeforeTheLastStepIsReported) {
  StepExporter exporter(&data_, {true, false});
  exporter.resultAtLastStep = static_cast<EDexResult>(5);
  EXPECT_EQ(5, exporter.doExport());
  StepExporter failing(&data_, {false});
  failing.resultAtLastStep = DEX_RESULT_WRONG_FORMAT;
  EXPECT_EQ(DEX_RESULT_WRONG_FORMAT, failing.doExport());
}

TEST_F(ImporterExporterDriver, TheStopFlagEndsTheExportRightAfterTheRunningStep) {
  StepExporter exporter(&data_, {true, true, true, true, false});
  exporter.stopAtCall = 1;
  EXPECT_EQ(DEX_RESULT_STOPPED, exporter.doExport());
  EXPECT_EQ(2, exporter.calls);
}

TEST_F(ImporterExporterDriver, TheStopFlagWinsOverTheLastStepsResult) {
  StepExporter exporter(&data_, {false});
  exporter.stopAtCall = 0;
  exporter.resultAtLastStep = static_cast<EDexResult>(5);
  EXPECT_EQ(DEX_RESULT_STOPPED, exporter.doExport());
}

TEST_F(ImporterExporterDriver, PublishesEveryStepToTheProgressRecord) {
  data_.getProgress().begin(DexRunProgress::EXPORT_RUN);
  StepExporter exporter(&data_, {true, true, false});
  exporter.doExport();
  const DexRunProgress::Snapshot figures = data_.getProgress().get();
  EXPECT_EQ(exporter.getCurrentStep(), figures.currentStep);
  EXPECT_EQ(3, figures.numberOfSteps);
  EXPECT_DOUBLE_EQ(1.0, data_.getProgress().getFraction());
}

TEST_F(ImporterExporterDriver, AnExporterWithoutContainerStillRuns) {
  StepExporter exporter(nullptr, {true, false});
  EXPECT_EQ(DEX_RESULT_OK, exporter.doExport());
}

TEST_F(ImporterExporterDriver, StartsAtStepMinusTwoWithAnOkResult) {
  const StepExporter exporter(&data_, {});
  EXPECT_EQ(-2, exporter.getCurrentStep());
  EXPECT_EQ(DEX_RESULT_OK, exporter.getIEResult());
}

TEST_F(ImporterExporterDriver, CopiesTakeAllFiveFields) {
  StepExporter exporter(&data_, {true, false});
  exporter.resultAtLastStep = static_cast<EDexResult>(9);
  exporter.doExport();
  const StepExporter copy(exporter);
  EXPECT_EQ(&data_, copy.getData());
  EXPECT_EQ(exporter.getCurrentStep(), copy.getCurrentStep());
  EXPECT_EQ(9, copy.getIEResult());
  EXPECT_EQ(L"out.txt", std::wstring(copy.getFileName().view()));
}

TEST_F(ImporterExporterDriver, TheVirtualOperationsKeepTheirSlots) {
  const int expected[] = {2, 3, 4, 5};
  for (int which = 0; which < 4; ++which) {
    if (const auto slot = StepExporter::slotOf(which)) {
      EXPECT_EQ(expected[which], *slot) << which;
    }
  }
}

// ---- The overwrite question -------------------------------------------------------------------------------

// The host message service, answering a given button and recording the questions.
class RecordingMsgUi : public vyn_ui::IMsgUi {
 public:
  explicit RecordingMsgUi(int answer) : answer_(answer) { vyn_ui::setMsgUi(this); }
  ~RecordingMsgUi() override { vyn_ui::setMsgUi(nullptr); }
  int question(const wchar_t* text, unsigned flags) override {
    questions.emplace_back(text);
    lastFlags = flags;
    return answer_;
  }
  std::vector<std::wstring> questions;
  unsigned lastFlags = 99;

 private:
  int answer_;
};

// A message box that implements only the plain form, as hosts do.
class RecordingMessageBox : public IDexMessageBox {
 public:
  explicit RecordingMessageBox(int answer, bool throws = false) : answer_(answer), throws_(throws) {}
  int confirmOverwrite(HWND parentWindow, const wchar_t* shortPath) override {
    ++calls;
    window = parentWindow;
    path = shortPath;
    if (throws_) throw std::runtime_error("message box failure");
    return answer_;
  }
  int calls = 0;
  HWND window = nullptr;
  std::wstring path;

 private:
  int answer_;
  bool throws_;
};

class ImporterExporterOverwrite : public ::testing::Test {
 protected:
  TempDir dir_;
  HWND window_ = reinterpret_cast<HWND>(0x1234);
};

TEST_F(ImporterExporterOverwrite, AMissingFileMayBeWrittenWithoutAQuestion) {
  RecordingMsgUi ui(IDNO);
  RecordingMessageBox box(IDNO);
  EXPECT_TRUE(utils::isExportFileWithSameName(dir_.wfile("missing.txt").c_str(), nullptr, window_));
  EXPECT_TRUE(utils::isExportFileWithSameName(dir_.wfile("missing.txt").c_str(), &box, window_));
  EXPECT_TRUE(ui.questions.empty());
  EXPECT_EQ(0, box.calls);
}

TEST_F(ImporterExporterOverwrite, WithoutAMessageBoxTheHostServiceIsAskedTheFormattedQuestion) {
  const std::string file = dir_.write("job.txt", "old");
  {
    RecordingMsgUi ui(IDYES);
    EXPECT_TRUE(utils::isExportFileWithSameName(dex_test::widen(file).c_str(), nullptr, window_));
    ASSERT_EQ(1u, ui.questions.size());
    const std::wstring shortPath(FileFuncs::CompactPath(window_, dex_test::widen(file).c_str(), true).view());
    EXPECT_EQ(L"File " + shortPath + L" already exists. Overwrite?", ui.questions[0]);
    EXPECT_EQ(0u, ui.lastFlags);
  }
  RecordingMsgUi ui(IDNO);
  EXPECT_FALSE(utils::isExportFileWithSameName(dex_test::widen(file).c_str(), nullptr, window_));
}

TEST_F(ImporterExporterOverwrite, OnlyTheYesAnswerAllowsTheOverwrite) {
  const std::string file = dir_.write("job.txt", "old");
  for (const int answer : {IDOK, IDCANCEL, IDNO, 0, -1}) {
    RecordingMsgUi ui(answer);
    EXPECT_FALSE(utils::isExportFileWithSameName(dex_test::widen(file).c_str(), nullptr, window_)) << answer;
  }
}

TEST_F(ImporterExporterOverwrite, AMessageBoxIsAskedWithTheWindowAndTheShortPath) {
  std::filesystem::create_directories(dir_.file("a-rather-long-folder-name/another-long-folder-name"));
  const std::string file = dir_.write("a-rather-long-folder-name/another-long-folder-name/job.txt", "old");
  const std::wstring wideFile = dex_test::widen(file);
  RecordingMsgUi ui(IDYES);
  RecordingMessageBox yes(IDYES);
  EXPECT_TRUE(utils::isExportFileWithSameName(wideFile.c_str(), &yes, window_));
  EXPECT_EQ(1, yes.calls);
  EXPECT_EQ(window_, yes.window);
  EXPECT_EQ(std::wstring(FileFuncs::CompactPath(window_, wideFile.c_str(), true).view()), yes.path);
  EXPECT_LT(yes.path.size(), wideFile.size());
  EXPECT_TRUE(ui.questions.empty());

  RecordingMessageBox no(IDNO);
  EXPECT_FALSE(utils::isExportFileWithSameName(wideFile.c_str(), &no, window_));
}

TEST_F(ImporterExporterOverwrite, AMessageBoxThatThrowsRefusesTheOverwrite) {
  const std::string file = dir_.write("job.txt", "old");
  RecordingMessageBox box(IDYES, true);
  EXPECT_FALSE(utils::isExportFileWithSameName(dex_test::widen(file).c_str(), &box, window_));
  EXPECT_EQ(1, box.calls);
}

TEST_F(ImporterExporterOverwrite, AnExistingFolderCountsAsAnExistingFile) {
  RecordingMsgUi ui(IDNO);
  EXPECT_FALSE(utils::isExportFileWithSameName(dir_.wpath().c_str(), nullptr, window_));
  EXPECT_EQ(1u, ui.questions.size());
}

// ---- The run functions called directly --------------------------------------------------------------------

IDexImporter* makeNoImporter(DexData*, const CVynStringT<wchar_t>&, const DexFormat*) {
  return nullptr;
}

IDexExporter* makeNoExporter(DexData*, const CVynStringT<wchar_t>&, const DexFormat*) {
  return nullptr;
}

IDexImporter* makePlainImporter(DexData* data, const CVynStringT<wchar_t>& fileName,
                                const DexFormat* format) {
  return new PlainImporter(data, fileName, format);
}

DexParserThreadParams* newParams(DexData* data, const DexFormat* format, DexMakeParser makeParser,
                                 bool ownThread) {
  auto* params = new DexParserThreadParams();
  params->data = data;
  params->fileName = L"file.txt";
  params->format = format;
  params->makeParser = makeParser;
  params->ownThread = ownThread;
  return params;
}

class ImporterExporterRunFunctions : public ::testing::Test {
 protected:
  dex_test::StopFlagReset stopFlag_;
  dex_test::RecordedSettings recorded_;
  DexData data_{recorded_.settings};
  DexFormat format_ = dex_test::scriptedFormat();
};

TEST_F(ImporterExporterRunFunctions, ANullBlockFails) {
  EXPECT_EQ(DEX_RESULT_FAILED, ImportFunction(nullptr));
  EXPECT_EQ(DEX_RESULT_FAILED, exportFunction(nullptr));
}

TEST_F(ImporterExporterRunFunctions, NoDataFailsAndNoFormatHasNoParser) {
  EXPECT_EQ(DEX_RESULT_FAILED, ImportFunction(newParams(nullptr, &format_, &makePlainImporter, false)));
  EXPECT_EQ(DEX_RESULT_NO_PARSER, ImportFunction(newParams(&data_, nullptr, &makePlainImporter, false)));
  EXPECT_EQ(DEX_RESULT_FAILED, exportFunction(newParams(nullptr, &format_, &makeNoExporter, false)));
  EXPECT_EQ(DEX_RESULT_NO_PARSER, exportFunction(newParams(&data_, nullptr, &makeNoExporter, false)));
}

TEST_F(ImporterExporterRunFunctions, AnEntryPointOfTheOtherDirectionCountsAsNone) {
  EXPECT_EQ(DEX_RESULT_NO_PARSER, ImportFunction(newParams(&data_, &format_, &makeNoExporter, false)));
  EXPECT_EQ(DEX_RESULT_NO_PARSER, exportFunction(newParams(&data_, &format_, &makePlainImporter, false)));
  EXPECT_EQ(DEX_RESULT_NO_PARSER, ImportFunction(newParams(&data_, &format_, {}, false)));
  EXPECT_EQ(DEX_RESULT_NO_PARSER,
            ImportFunction(newParams(&data_, &format_, MakeImporterFunction{nullptr}, false)));
}

TEST_F(ImporterExporterRunFunctions, RunsAnImporterAndNotifiesOnlyForAThreadOfItsOwn) {
  EXPECT_EQ(DEX_RESULT_OK, ImportFunction(newParams(&data_, &format_, &makePlainImporter, false)));
  EXPECT_EQ(0, recorded_.imports->calls);
  EXPECT_EQ(DEX_RESULT_OK, ImportFunction(newParams(&data_, &format_, &makePlainImporter, true)));
  EXPECT_EQ(1, recorded_.imports->calls);
  EXPECT_EQ(DEX_RESULT_OK, recorded_.imports->result);
  EXPECT_EQ(0, recorded_.exports->calls);
}

TEST_F(ImporterExporterRunFunctions, AFailedRunInAThreadOfItsOwnIsNotifiedToo) {
  EXPECT_EQ(DEX_RESULT_NO_PARSER, exportFunction(newParams(&data_, &format_, &makeNoExporter, true)));
  EXPECT_EQ(1, recorded_.exports->calls);
  EXPECT_EQ(DEX_RESULT_NO_PARSER, recorded_.exports->result);
  EXPECT_EQ(DEX_RESULT_NO_PARSER, ImportFunction(newParams(&data_, &format_, &makeNoImporter, true)));
  EXPECT_EQ(DEX_RESULT_NO_PARSER, recorded_.imports->result);
}

TEST_F(ImporterExporterRunFunctions, AMissingNotifierLeavesItsLogLineOnly) {
  DexData bare(dex_test::settingsWith({POINTS}));
  LogCapture capture;
  EXPECT_EQ(DEX_RESULT_OK, ImportFunction(newParams(&bare, &format_, &makePlainImporter, true)));
  EXPECT_EQ(1, capture.count(kImporterSource, 92));
  EXPECT_EQ(DEX_RESULT_NO_PARSER, exportFunction(newParams(&bare, &format_, &makeNoExporter, true)));
  EXPECT_EQ(1, capture.count(kExporterSource, 141));
  // Without data there are no settings to hold a notifier.
  EXPECT_EQ(DEX_RESULT_FAILED, ImportFunction(newParams(nullptr, &format_, &makePlainImporter, true)));
  EXPECT_EQ(2, capture.count(kImporterSource, 92));
  EXPECT_EQ(3u, capture.size());
}

TEST_F(ImporterExporterRunFunctions, ANotifierThatThrowsLeavesTheResultAsItWas) {
  recorded_.imports->throws = true;
  recorded_.exports->throws = true;
  LogCapture capture;
  EXPECT_EQ(DEX_RESULT_OK, ImportFunction(newParams(&data_, &format_, &makePlainImporter, true)));
  EXPECT_EQ(1, capture.count(kImporterSource, 902));
  EXPECT_EQ(DEX_RESULT_NO_PARSER, exportFunction(newParams(&data_, &format_, &makeNoExporter, true)));
  EXPECT_EQ(1, capture.count(kExporterSource, 902));
}

TEST_F(ImporterExporterRunFunctions, AnImportStartsTheProgressRecordOfItsData) {
  data_.getProgress().begin(DexRunProgress::EXPORT_RUN);
  data_.getProgress().setExportStep(3, 4);
  ImportFunction(newParams(&data_, &format_, &makePlainImporter, false));
  EXPECT_EQ(DexRunProgress::IMPORT_RUN, data_.getProgress().get().kind);
  EXPECT_EQ(-2, data_.getProgress().get().currentStep);
}

TEST_F(ImporterExporterRunFunctions, ThreadFunctionsAnswerTheResultAsExitCode) {
  const unsigned code = ImportThreadFunction(newParams(&data_, nullptr, &makePlainImporter, false));
  EXPECT_EQ(DEX_RESULT_NO_PARSER, DexParsersLoader::resultFromExitCode(code));
  const unsigned exportCode = exportThreadFunction(newParams(nullptr, &format_, &makeNoExporter, false));
  EXPECT_EQ(DEX_RESULT_FAILED, DexParsersLoader::resultFromExitCode(exportCode));
}

}  // namespace
