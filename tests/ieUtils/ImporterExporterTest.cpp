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

TEST(ImporterExporterImporter, AddsTheImportDatasetToAnEmptyContainerForObjectData) {
  for (const EDexDataType type : {POINTS, LINES, AREAS, PARCELS, ROADS, SURFACES, POINT_LISTS, ROAD_SURVEY,
                                  SCANNING_DATA, JOB_HISTORY, RAW_DATA, MULTIPLE}) {
    DexData data(dex_test::settingsWith({type}));
    const PlainImporter importer(&data, L"in.txt", nullptr);
    ASSERT_EQ(1, data.getNumberOfDatasets()) << "data type " << type;
    EXPECT_EQ(L"Import dataset", std::wstring(data.getDatasetAt(0)->getName().view()));
  }
  for (const EDexDataType type :
       {CODES, H_ALIGNMENTS, X_SECTION_TEMPLATES, LOCALIZATION, STA_EQUATION_SETS}) {
    DexData data(dex_test::settingsWith({type}));
    const PlainImporter importer(&data, L"in.txt", nullptr);
    EXPECT_EQ(0, data.getNumberOfDatasets()) << "data type " << type;
  }
  DexData data(dex_test::settingsWith({POINTS}));  // nor to a container that has datasets
  data.addDataset(new DexDataset(L"first", 0, false));
  data.addDataset(new DexDataset(L"second", 0, false));
  const PlainImporter importer(&data, L"in.txt", nullptr);
  EXPECT_EQ(2, data.getNumberOfDatasets());
  const PlainImporter alone(nullptr, L"in.txt", nullptr);  // a null container is left alone
  EXPECT_TRUE(alone.getData() == nullptr && alone.getFileName() == L"in.txt");
}

TEST(ImporterExporterImporter, CopiesShareTheContainerAndTheFormat) {
  DexData data(dex_test::settingsWith({POINTS}));
  const DexFormat format = dex_test::scriptedFormat();
  const PlainImporter importer(&data, L"in.txt", &format);
  const PlainImporter copy(importer);
  EXPECT_TRUE(copy.getData() == &data && copy.getFormat() == &format);
  EXPECT_EQ(1, data.getNumberOfDatasets());  // copying prepares nothing again
  if (const auto slot = PlainImporter::doImportSlot()) {
    EXPECT_EQ(2, *slot);  // after the destructor
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

TEST_F(ImporterExporterDriver, StepsUntilTheLastAndReportsTheResultSetThen) {
  const StepExporter fresh(&data_, {});
  EXPECT_TRUE(fresh.getCurrentStep() == -2 && fresh.getIEResult() == DEX_RESULT_OK);
  data_.getProgress().begin(DexRunProgress::EXPORT_RUN);
  StepExporter exporter(&data_, {true, true, false});
  EXPECT_EQ(DEX_RESULT_OK, exporter.doExport());
  EXPECT_TRUE(exporter.calls == 3 && exporter.getCurrentStep() == 2);
  const DexRunProgress::Snapshot figures = data_.getProgress().get();  // every step is published
  EXPECT_TRUE(figures.currentStep == 2 && figures.numberOfSteps == 3);
  EXPECT_DOUBLE_EQ(1.0, data_.getProgress().getFraction());
  StepExporter never(&data_, {false}, false);  // one that never advances reports a file error
  EXPECT_EQ(DEX_RESULT_FILE_ERROR, never.doExport());
  EXPECT_TRUE(never.calls == 1 && never.getCurrentStep() == -2);
  StepExporter five(nullptr, {true, false});  // even without container
  five.resultAtLastStep = static_cast<EDexResult>(5);
  EXPECT_EQ(5, five.doExport());
  StepExporter failing(&data_, {false});
  failing.resultAtLastStep = DEX_RESULT_WRONG_FORMAT;
  EXPECT_EQ(DEX_RESULT_WRONG_FORMAT, failing.doExport());
  const StepExporter copy(five);  // copies take all five fields
  EXPECT_TRUE(copy.getData() == nullptr && copy.getCurrentStep() == five.getCurrentStep() &&
              copy.getIEResult() == 5 && copy.getFileName() == L"out.txt");
  const int expected[] = {2, 3, 4, 5};  // the virtual operations keep their slots
  for (int which = 0; which < 4; ++which)
    if (const auto slot = StepExporter::slotOf(which)) {
      EXPECT_EQ(expected[which], *slot) << which;
    }
}

TEST_F(ImporterExporterDriver, TheStopFlagEndsTheExportRightAfterTheRunningStep) {
  StepExporter exporter(&data_, {true, true, true, true, false});
  exporter.stopAtCall = 1;
  EXPECT_EQ(DEX_RESULT_STOPPED, exporter.doExport());
  EXPECT_EQ(2, exporter.calls);
  DexData::stopProcess_ = false;
  StepExporter last(&data_, {false});  // and wins over the last step's result
  last.stopAtCall = 0;
  last.resultAtLastStep = static_cast<EDexResult>(5);
  EXPECT_EQ(DEX_RESULT_STOPPED, last.doExport());
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

TEST_F(ImporterExporterOverwrite, AMissingFileNeedsNoQuestionAnExistingOneTheHostsYes) {
  RecordingMessageBox box(IDNO);
  {
    RecordingMsgUi ui(IDNO);
    EXPECT_TRUE(utils::isExportFileWithSameName(dir_.wfile("missing.txt").c_str(), nullptr, window_));
    EXPECT_TRUE(utils::isExportFileWithSameName(dir_.wfile("missing.txt").c_str(), &box, window_));
    EXPECT_TRUE(ui.questions.empty() && box.calls == 0);
    EXPECT_FALSE(utils::isExportFileWithSameName(dir_.wpath().c_str(), nullptr, window_));  // a folder too
    EXPECT_EQ(1u, ui.questions.size());
  }
  const std::wstring file = dex_test::widen(dir_.write("job.txt", "old"));
  {
    RecordingMsgUi ui(IDYES);  // without a message box the host service is asked
    EXPECT_TRUE(utils::isExportFileWithSameName(file.c_str(), nullptr, window_));
    ASSERT_EQ(1u, ui.questions.size());
    const std::wstring shortPath(FileFuncs::CompactPath(window_, file.c_str(), true).view());
    EXPECT_EQ(L"File " + shortPath + L" already exists. Overwrite?", ui.questions[0]);
    EXPECT_EQ(0u, ui.lastFlags);
  }
  for (const int answer : {IDOK, IDCANCEL, IDNO, 0, -1}) {  // only yes allows the overwrite
    RecordingMsgUi ui(answer);
    EXPECT_FALSE(utils::isExportFileWithSameName(file.c_str(), nullptr, window_)) << answer;
  }
  RecordingMessageBox throwing(IDYES, true);  // a message box that throws refuses it
  EXPECT_FALSE(utils::isExportFileWithSameName(file.c_str(), &throwing, window_));
  EXPECT_EQ(1, throwing.calls);
}

TEST_F(ImporterExporterOverwrite, AMessageBoxIsAskedWithTheWindowAndTheShortPath) {
  std::filesystem::create_directories(dir_.file("a-rather-long-folder-name/another-long-folder-name"));
  const std::wstring file =
      dex_test::widen(dir_.write("a-rather-long-folder-name/another-long-folder-name/job.txt", "old"));
  RecordingMsgUi ui(IDYES);
  RecordingMessageBox yes(IDYES);
  EXPECT_TRUE(utils::isExportFileWithSameName(file.c_str(), &yes, window_));
  EXPECT_TRUE(yes.calls == 1 && yes.window == window_ && ui.questions.empty());
  EXPECT_EQ(std::wstring(FileFuncs::CompactPath(window_, file.c_str(), true).view()), yes.path);
  EXPECT_LT(yes.path.size(), file.size());
  RecordingMessageBox no(IDNO);
  EXPECT_FALSE(utils::isExportFileWithSameName(file.c_str(), &no, window_));
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

TEST_F(ImporterExporterRunFunctions, NoBlockOrDataFailsAndNoFormatOrEntryPointHasNoParser) {
  EXPECT_TRUE(ImportFunction(nullptr) == DEX_RESULT_FAILED && exportFunction(nullptr) == DEX_RESULT_FAILED);
  EXPECT_EQ(DEX_RESULT_FAILED, ImportFunction(newParams(nullptr, &format_, &makePlainImporter, false)));
  EXPECT_EQ(DEX_RESULT_NO_PARSER, ImportFunction(newParams(&data_, nullptr, &makePlainImporter, false)));
  EXPECT_EQ(DEX_RESULT_FAILED, exportFunction(newParams(nullptr, &format_, &makeNoExporter, false)));
  EXPECT_EQ(DEX_RESULT_NO_PARSER, exportFunction(newParams(&data_, nullptr, &makeNoExporter, false)));
  // An entry point of the other direction counts as none.
  EXPECT_EQ(DEX_RESULT_NO_PARSER, ImportFunction(newParams(&data_, &format_, &makeNoExporter, false)));
  EXPECT_EQ(DEX_RESULT_NO_PARSER, exportFunction(newParams(&data_, &format_, &makePlainImporter, false)));
  EXPECT_EQ(DEX_RESULT_NO_PARSER, ImportFunction(newParams(&data_, &format_, {}, false)));
  EXPECT_EQ(DEX_RESULT_NO_PARSER,
            ImportFunction(newParams(&data_, &format_, MakeImporterFunction{nullptr}, false)));
  // The thread functions answer the result as exit code.
  const unsigned code = ImportThreadFunction(newParams(&data_, nullptr, &makePlainImporter, false));
  EXPECT_EQ(DEX_RESULT_NO_PARSER, DexParsersLoader::resultFromExitCode(code));
  const unsigned exportCode = exportThreadFunction(newParams(nullptr, &format_, &makeNoExporter, false));
  EXPECT_EQ(DEX_RESULT_FAILED, DexParsersLoader::resultFromExitCode(exportCode));
}

TEST_F(ImporterExporterRunFunctions, NotifiesSuccessAndFailureOnlyForAThreadOfItsOwn) {
  data_.getProgress().begin(DexRunProgress::EXPORT_RUN);
  data_.getProgress().setExportStep(3, 4);
  EXPECT_EQ(DEX_RESULT_OK, ImportFunction(newParams(&data_, &format_, &makePlainImporter, false)));
  EXPECT_EQ(0, recorded_.imports->calls);
  // An import starts the progress record of its data.
  EXPECT_TRUE(data_.getProgress().get().kind == DexRunProgress::IMPORT_RUN &&
              data_.getProgress().get().currentStep == -2);
  EXPECT_EQ(DEX_RESULT_OK, ImportFunction(newParams(&data_, &format_, &makePlainImporter, true)));
  EXPECT_TRUE(recorded_.imports->calls == 1 && recorded_.imports->result == DEX_RESULT_OK &&
              recorded_.exports->calls == 0);
  EXPECT_EQ(DEX_RESULT_NO_PARSER, exportFunction(newParams(&data_, &format_, &makeNoExporter, true)));
  EXPECT_TRUE(recorded_.exports->calls == 1 && recorded_.exports->result == DEX_RESULT_NO_PARSER);
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
