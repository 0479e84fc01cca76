// The parsers loader with the scripted test plug-ins (tests/plugins/DexTestScripted.cpp describes the
// scripts). The runs go twice: in the caller's thread and in a worker thread, whose handle is joined
// and whose exit code is read.
#include "ieUtils/IEParsersLoader.h"

#include <dlfcn.h>
#include <gtest/gtest.h>

#include <chrono>
#include <filesystem>
#include <fstream>
#include <string>
#include <thread>

#include "hostlibs/VynLibrary.h"
#include "hostlibs/VynThread.h"
#include "ieObjects/IECodesDataInterface.h"
#include "ieObjects/IEData.h"
#include "ieObjects/IEDataDictionary.h"
#include "ieObjects/IEDataset.h"
#include "ieObjects/IEPoints.h"
#include "ieUtils/IERunProgress.h"
#include "ieUtils/RunTestHelpers.h"
#include "support/LogCapture.h"
#include "support/TempDir.h"

namespace {

using namespace vyn::ie;
using dex_test::LogCapture;
using dex_test::NotifierRecord;
namespace fs = std::filesystem;

const std::wstring kLoaderSource = L"ieUtils\\IEParsersLoader";
const std::wstring kImporterSource = L"ieUtils\\IImporter";
const std::wstring kExporterSource = L"ieUtils\\IExporter";
constexpr DWORD kJoinLimitMs = 120000;

bool isResident(const std::wstring& library) {
  void* const handle = dlopen(dex_test::narrow(library).c_str(), RTLD_NOW | RTLD_NOLOAD);
  if (handle != nullptr) dlclose(handle);
  return handle != nullptr;
}

bool waitForFile(const std::string& path) {
  const auto limit = std::chrono::steady_clock::now() + std::chrono::seconds(60);
  while (!fs::exists(path)) {
    if (std::chrono::steady_clock::now() > limit) return false;
    std::this_thread::sleep_for(std::chrono::milliseconds(2));
  }
  return true;
}

void writeText(const std::string& path, const std::string& text) {
  std::ofstream(path) << text;
}

// Adds a design point with the codes to the dataset and the code descriptions to the library.
void addPoint(DexData& data, DexDataset& dataset, const wchar_t* name,
              std::initializer_list<const wchar_t*> codes) {
  auto* point = new DexDesignPoint();
  point->setName(name);
  for (const wchar_t* code : codes) {
    auto* description = new DexCodeDescription(code);
    if (!data.addCodeToIEDataDictionary(description)) delete description;
    point->addCode(new DexCodeValues(data.getIEDataDictionary()->findCodeDiscription(code)));
  }
  dataset.add(point);
}

DexFormat formatOf(const wchar_t* guid, const std::wstring& importLibrary, const std::wstring& exportLibrary,
                   const wchar_t* extension = L"txt", bool perDataset = false) {
  return dex_test::makeFormat(guid, importLibrary, exportLibrary, extension,
                              perDataset ? DexFlags<DexFormat::EParameterName>{DexFormat::MULTIPLE_FILES_EXP}
                                         : DexFlags<DexFormat::EParameterName>{});
}

const wchar_t* const kOtherGuid = L"{33333333-2222-3333-4444-555555555555}";
const std::wstring kMissingLibrary = L"/nonexistent/libDexNone.so";

// A loader with its own container (settings requesting points, recording notifiers) and a folder.
class ParsersLoaderTestBase {
 protected:
  ParsersLoaderTestBase() { loader_.initIEData(recorded_.settings); }
  DexData& data() { return *loader_.getIEData(); }
  std::string path(const std::string& name) const { return dir_.file(name); }
  std::wstring wpath(const std::string& name) const { return dir_.wfile(name); }

  // Joins a started run: the exit code is the result, which the notifier was told once, in another
  // thread. A null handle (nothing started) reads as DEX_RESULT_NO_PARSER.
  EDexResult join(HANDLE thread, const NotifierRecord& record, int callsBefore) {
    EXPECT_NE(INVALID_HANDLE_VALUE, thread);
    if (thread == nullptr) {
      EXPECT_EQ(callsBefore, record.calls.load());
      return DEX_RESULT_NO_PARSER;
    }
    if (thread == INVALID_HANDLE_VALUE) return DEX_RESULT_FAILED;
    EXPECT_EQ(WAIT_OBJECT_0, WaitForSingleObject(thread, kJoinLimitMs));
    DWORD exitCode = 0;
    EXPECT_TRUE(GetExitCodeThread(thread, &exitCode));
    EXPECT_TRUE(CloseHandle(thread));
    const EDexResult result = DexParsersLoader::resultFromExitCode(exitCode);
    EXPECT_EQ(callsBefore + 1, record.calls.load());
    EXPECT_EQ(result, record.result.load());
    EXPECT_NE(std::this_thread::get_id(), record.thread);
    return result;
  }

  dex_test::StopFlagReset stopFlag_;
  dex_test::RecordedSettings recorded_;
  dex_test::TempDir dir_;
  DexParsersLoader loader_;
  DexFormat format_ = dex_test::scriptedFormat();
};

enum class RunMode { CALLERS_THREAD, WORKER_THREAD };

class ParsersLoaderRun : public ParsersLoaderTestBase, public ::testing::TestWithParam<RunMode> {
 protected:
  bool threaded() const { return GetParam() == RunMode::WORKER_THREAD; }

  EDexResult runImport(const std::wstring& fileName, const DexFormat* format, DexData* data = nullptr) {
    const int callsBefore = recorded_.imports->calls;
    if (threaded())
      return join(loader_.startImportInSeparateThread(fileName.c_str(), format, data), *recorded_.imports,
                  callsBefore);
    const EDexResult result = loader_.importInTheSameThread(fileName.c_str(), format, data);
    EXPECT_EQ(callsBefore, recorded_.imports->calls.load());
    return result;
  }
  EDexResult runExport(const std::wstring& fileName, const DexFormat* format, DexData* data = nullptr) {
    const int callsBefore = recorded_.exports->calls;
    if (threaded())
      return join(loader_.startExportInSeparateThread(fileName.c_str(), format, data), *recorded_.exports,
                  callsBefore);
    const EDexResult result = loader_.exportInTheSameThread(fileName.c_str(), format, data);
    EXPECT_EQ(callsBefore, recorded_.exports->calls.load());
    return result;
  }
  // An export the user stops while it runs: in a worker thread the exporter waits for the stop flag,
  // which the test sets once the exporter has started; in the caller's thread the exporter sets it
  // itself. The script goes to the file stoppingTarget plus ".script".
  EDexResult runStoppedExport(const std::wstring& fileName, const DexFormat* format,
                              const std::string& stoppingTarget, const std::string& extraCommands) {
    writeText(stoppingTarget + ".script", extraCommands + (threaded() ? "wait-stop\n" : "stop\n"));
    if (!threaded()) return runExport(fileName, format);
    const int callsBefore = recorded_.exports->calls;
    const HANDLE thread = loader_.startExportInSeparateThread(fileName.c_str(), format, nullptr);
    EXPECT_TRUE(waitForFile(stoppingTarget + ".started"));
    DexData::stopProcess_ = true;
    return join(thread, *recorded_.exports, callsBefore);
  }
};

INSTANTIATE_TEST_SUITE_P(BothModes, ParsersLoaderRun,
                         ::testing::Values(RunMode::CALLERS_THREAD, RunMode::WORKER_THREAD),
                         [](const auto& info) {
                           return info.param == RunMode::CALLERS_THREAD ? "InTheCallersThread"
                                                                        : "InAWorkerThread";
                         });

TEST_P(ParsersLoaderRun, ImportsAndExportsWithTheLoadersOrTheCallersContainerAndPassResultsThrough) {
  writeText(path("in.txt"), "point P1 A\npoint P2\n");
  EXPECT_EQ(DEX_RESULT_OK, runImport(wpath("in.txt"), &format_));
  ASSERT_EQ(1, data().getNumberOfDatasets());
  EXPECT_EQ(L"Import dataset", std::wstring(data().getDatasetAt(0)->getName().view()));
  EXPECT_EQ(2, data().getDatasetAt(0)->getNumberOfElements(-1, 2, false, false));
  DexData own(recorded_.settings);
  EXPECT_EQ(DEX_RESULT_OK, runImport(wpath("in.txt"), &format_, &own));
  EXPECT_EQ(1, own.getNumberOfDatasets());
  addPoint(data(), *data().getCurDataset(), L"P3", {L"A"});
  EXPECT_EQ(DEX_RESULT_OK, runExport(wpath("out.txt"), &format_));  // the current dataset, recorded
  EXPECT_EQ("P1 A\nP2\nP3 A\n", dex_test::readFile(path("out.txt")));
  ASSERT_EQ(1, data().getExportedFileNames().GetSize());
  EXPECT_EQ(wpath("out.txt"), std::wstring(data().getExportedFileNames()[0].view()));
  for (const int answer :
       {5, 12345, 0, -7, static_cast<int>(DEX_RESULT_WRONG_FORMAT)}) {  // remarks pass through
    writeText(path("in.txt"), "result " + std::to_string(answer) + "\n");
    EXPECT_EQ(answer, runImport(wpath("in.txt"), &format_));
    writeText(path("out.txt.script"), "result " + std::to_string(answer) + "\n");
    EXPECT_EQ(answer, runExport(wpath("out.txt"), &format_));
  }
  writeText(path("out.txt.script"), "fail-first\n");  // an exporter that never steps
  EXPECT_EQ(DEX_RESULT_FILE_ERROR, runExport(wpath("out.txt"), &format_));
}

TEST_P(ParsersLoaderRun, LoadsALibraryOnceForItsFormatsAndDropsItWhenALoadFails) {
  const DexFormat other = dex_test::scriptedFormat(L"{22222222-2222-3333-4444-555555555555}");
  writeText(path("in.txt"), "point P1\n");
  EXPECT_EQ(DEX_RESULT_OK, runImport(wpath("in.txt"), &format_));
  const unsigned loads = vyn::plugins::loadCallCountForTesting();
  EXPECT_EQ(DEX_RESULT_OK, runImport(wpath("in.txt"), &other));
  EXPECT_TRUE(loader_.loadImporter(&format_));
  EXPECT_EQ(loads, vyn::plugins::loadCallCountForTesting());
  const DexFormat missing = formatOf(kOtherGuid, kMissingLibrary, kMissingLibrary);
  const LogCapture capture;
  EXPECT_EQ(DEX_RESULT_NO_PARSER, runImport(wpath("in.txt"), &missing));
  EXPECT_EQ(DEX_RESULT_OK, runImport(wpath("in.txt"), &format_));  // the scripted library is loaded again
  EXPECT_EQ(loads + 2, vyn::plugins::loadCallCountForTesting());
  EXPECT_EQ(1, capture.count(kLoaderSource, 100));
}

TEST_P(ParsersLoaderRun, LibrariesThatCannotBeLoadedOrMakeNoParserHaveNoParserAndLogTheirLine) {
  const LogCapture capture;
  for (const DexFormat& format :
       {formatOf(kOtherGuid, kMissingLibrary, dex_test::scriptedPlugin()),
        formatOf(kOtherGuid, dex_test::noEntryPointsPlugin(), dex_test::scriptedPlugin())}) {
    writeText(path("in.txt"), "point P1\n");
    EXPECT_EQ(DEX_RESULT_NO_PARSER, runImport(wpath("in.txt"), &format));
  }
  EXPECT_EQ(2, capture.count(kLoaderSource, 100));
  EXPECT_EQ(0, data().getNumberOfDatasets());
  for (const DexFormat& format :
       {formatOf(kOtherGuid, dex_test::scriptedPlugin(), kMissingLibrary),
        formatOf(kOtherGuid, dex_test::scriptedPlugin(), dex_test::noEntryPointsPlugin())})
    EXPECT_EQ(DEX_RESULT_NO_PARSER, runExport(wpath("out.txt"), &format));
  EXPECT_EQ(2, capture.count(kLoaderSource, 52));
  EXPECT_EQ(2, capture.count(kLoaderSource, 100));
  EXPECT_FALSE(fs::exists(path("out.txt")));
  const DexFormat nothing = formatOf(L"{44444444-2222-3333-4444-555555555555}", dex_test::nullParsersPlugin(),
                                     dex_test::nullParsersPlugin());
  EXPECT_EQ(DEX_RESULT_NO_PARSER, runImport(wpath("in.txt"), &nothing));
  EXPECT_EQ(DEX_RESULT_NO_PARSER, runExport(wpath("out.txt"), &nothing));
  writeText(path("in.txt"), "make-null\n");
  EXPECT_EQ(DEX_RESULT_NO_PARSER, runImport(wpath("in.txt"), &format_));
  writeText(path("out.txt.script"), "make-null\n");
  EXPECT_EQ(DEX_RESULT_NO_PARSER, runExport(wpath("out.txt"), &format_));
  EXPECT_EQ(DEX_RESULT_NO_PARSER,
            runImport(wpath("in.txt"), nullptr));  // a null format, also with a held entry point
  ASSERT_TRUE(loader_.loadExporter(&format_));
  EXPECT_EQ(DEX_RESULT_NO_PARSER, runExport(wpath("out.txt"), nullptr));
  ASSERT_TRUE(loader_.loadImporter(&format_));
  EXPECT_EQ(DEX_RESULT_NO_PARSER, runImport(wpath("in.txt"), nullptr));
  EXPECT_FALSE(fs::exists(path("out.txt")));
}

TEST_P(ParsersLoaderRun, WithoutAnyContainerNothingRuns) {
  DexParsersLoader bare;
  const int threadsBefore = vyn::thread::liveThreadCountForTesting();
  if (threaded()) {
    EXPECT_EQ(nullptr, bare.startImportInSeparateThread(wpath("in.txt").c_str(), &format_, nullptr));
    EXPECT_EQ(nullptr, bare.startExportInSeparateThread(wpath("out.txt").c_str(), &format_, nullptr));
  } else {
    EXPECT_EQ(DEX_RESULT_NO_PARSER, bare.importInTheSameThread(wpath("in.txt").c_str(), &format_, nullptr));
    EXPECT_EQ(DEX_RESULT_NO_PARSER, bare.exportInTheSameThread(wpath("out.txt").c_str(), &format_, nullptr));
  }
  EXPECT_EQ(threadsBefore, vyn::thread::liveThreadCountForTesting());
  EXPECT_FALSE(fs::exists(path("out.txt")));
}

TEST_P(ParsersLoaderRun, PluginsThatThrowFailTheRunAndNotifiersThatThrowOrAreMissingAreLogged) {
  LogCapture capture;
  for (const char* script : {"throw\n", "make-throw\n"}) {
    writeText(path("in.txt"), script);
    EXPECT_EQ(DEX_RESULT_FAILED, runImport(wpath("in.txt"), &format_));
    writeText(path("out.txt.script"), script);
    EXPECT_EQ(DEX_RESULT_FAILED, runExport(wpath("out.txt"), &format_));
  }
  EXPECT_EQ(2, capture.count(kImporterSource, 901));
  EXPECT_EQ(2, capture.count(kExporterSource, 901));
  recorded_.imports->throws = true;
  writeText(path("in.txt"), "result 5\n");
  EXPECT_EQ(5, runImport(wpath("in.txt"), &format_));
  EXPECT_EQ(threaded() ? 1 : 0, capture.count(kImporterSource, 902));
  // A run without a notifier is logged only for a thread of its own.
  DexSettings settings;
  settings.addDataType(POINTS);
  DexData silent(settings);
  writeText(path("in.txt"), "point P1\n");
  fs::remove(path("out.txt.script"));
  capture.clear();
  for (const bool importing : {true, false}) {
    const std::wstring file = wpath(importing ? "in.txt" : "out.txt");
    if (!threaded()) {
      EXPECT_EQ(DEX_RESULT_OK, importing ? loader_.importInTheSameThread(file.c_str(), &format_, &silent)
                                         : loader_.exportInTheSameThread(file.c_str(), &format_, &silent));
      continue;
    }
    const HANDLE thread = importing ? loader_.startImportInSeparateThread(file.c_str(), &format_, &silent)
                                    : loader_.startExportInSeparateThread(file.c_str(), &format_, &silent);
    ASSERT_NE(nullptr, thread);
    ASSERT_EQ(WAIT_OBJECT_0, WaitForSingleObject(thread, kJoinLimitMs));
    DWORD exitCode = 0;
    EXPECT_TRUE(GetExitCodeThread(thread, &exitCode) && CloseHandle(thread));
    EXPECT_EQ(DEX_RESULT_OK, DexParsersLoader::resultFromExitCode(exitCode));
  }
  EXPECT_EQ(threaded() ? 1 : 0, capture.count(kImporterSource, 92));
  EXPECT_EQ(threaded() ? 1 : 0, capture.count(kExporterSource, 141));
}

TEST_P(ParsersLoaderRun, AStoppedExportDeletesEveryFileItRecordedButNoneOfAnEarlierExport) {
  EXPECT_EQ(DEX_RESULT_OK, runExport(wpath("first.txt"), &format_));
  fs::create_directory(path("folder.txt"));  // a folder is no file to delete
  LogCapture capture;
  EXPECT_EQ(DEX_RESULT_STOPPED, runStoppedExport(wpath("out.txt"), &format_, path("out.txt"),
                                                 "record folder.txt\nrecord ghost.txt\nwrite extra.txt\n"));
  EXPECT_EQ(1, capture.countMessage(L"file " + wpath("folder.txt") + L" cannot be removed"));
  EXPECT_EQ(1, capture.countMessage(L"file " + wpath("ghost.txt") + L" cannot be removed"));
  EXPECT_EQ(2, capture.countMessage(L"cannot be removed"));
  EXPECT_TRUE(fs::is_directory(path("folder.txt")) && fs::exists(path("first.txt")));
  EXPECT_FALSE(fs::exists(path("out.txt")) || fs::exists(path("extra.txt")));
  EXPECT_EQ(4, data().getExportedFileNames().GetSize());
  data().addFileNameToExported(wpath("first.txt").c_str());  // a stopped import deletes nothing
  writeText(path("in.txt"), "point P1\nwait-stop\n");
  DexData::stopProcess_ = true;
  EXPECT_EQ(DEX_RESULT_STOPPED, runImport(wpath("in.txt"), &format_));
  EXPECT_TRUE(fs::exists(path("in.txt")) && fs::exists(path("first.txt")));
}

TEST_P(ParsersLoaderRun, OneFilePerDatasetIsNamedAfterItAndTheFirstFailureOrRemarkEndsOrMarksTheRun) {
  for (const wchar_t* name : {L"North/South: 1", L"D2", L"D3"})
    data().addDataset(new DexDataset(name, 0, false));
  const DexFormat perDataset = formatOf(L"{55555555-2222-3333-4444-555555555555}", dex_test::scriptedPlugin(),
                                        dex_test::scriptedPlugin(), L"txt", true);
  const auto scripts = [this](const char* first, const char* second, const char* third) {
    writeText(path("North_South_ 1.txt.script"), first);
    writeText(path("D2.txt.script"), second);
    writeText(path("D3.txt.script"), third);
    for (const char* name : {"North_South_ 1.txt", "D2.txt", "D3.txt"})
      fs::remove(path(name));
  };
  scripts("", "", "");
  EXPECT_EQ(DEX_RESULT_OK, runExport(dir_.wpath(), &perDataset));
  EXPECT_TRUE(fs::exists(path("North_South_ 1.txt")) && fs::exists(path("D2.txt")) &&
              fs::exists(path("D3.txt")));
  EXPECT_EQ(3, data().getExportedFileNames().GetSize());
  scripts("", "result -9990\n", "");
  EXPECT_EQ(DEX_RESULT_WRONG_FORMAT, runExport(dir_.wpath(), &perDataset));
  EXPECT_TRUE(fs::exists(path("North_South_ 1.txt")) && !fs::exists(path("D3.txt")));
  scripts("", "make-null\n", "");
  EXPECT_EQ(DEX_RESULT_NO_PARSER, runExport(dir_.wpath(), &perDataset));
  EXPECT_FALSE(fs::exists(path("D3.txt")));
  scripts("result 0\n", "", "result 5\n");
  EXPECT_EQ(5, runExport(dir_.wpath(), &perDataset));
  scripts("result 5\n", "result 7\n", "result 22\n");
  EXPECT_EQ(5, runExport(dir_.wpath(), &perDataset));
  scripts("result 0\n", "result 0\n", "result 0\n");
  EXPECT_EQ(0, runExport(dir_.wpath(), &perDataset));
  scripts("", "", "");  // a stop deletes the files of the datasets exported before
  EXPECT_EQ(DEX_RESULT_STOPPED,
            runStoppedExport(dir_.wpath(), &perDataset, path("D2.txt"), "write D2-extra.txt\n"));
  for (const char* name : {"North_South_ 1.txt", "D2.txt", "D2-extra.txt", "D3.txt"})
    EXPECT_FALSE(fs::exists(path(name))) << name;
  EXPECT_EQ(3, data().getExportedFileNames().GetSize());
}

TEST_P(ParsersLoaderRun, ADatasetSplitByCodeGivesAFilePerCodeAndOneForObjectsWithoutCode) {
  DexDataset* const survey = new DexDataset(L"Survey", 0, false);
  data().addDataset(survey);
  for (const auto& [name, code] : std::initializer_list<std::pair<const wchar_t*, const wchar_t*>>{
           {L"P1", L"A"}, {L"P2", L"B"}, {L"P3", L"A"}})
    addPoint(data(), *survey, name, {code});
  addPoint(data(), *survey, L"P4", {});
  EXPECT_EQ(DEX_RESULT_OK, runExport(wpath("all.txt"), &format_));  // without the parameter: not split
  EXPECT_EQ("P1 A\nP2 B\nP3 A\nP4\n", dex_test::readFile(path("all.txt")));
  const DexFormat format = formatOf(L"{55555555-2222-3333-4444-555555555555}", dex_test::scriptedPlugin(),
                                    dex_test::scriptedPlugin(), L"csv", true);
  EXPECT_EQ(DEX_RESULT_OK, runExport(dir_.wpath(), &format));
  EXPECT_EQ("P1 A\nP3 A\n", dex_test::readFile(path("A.csv")));
  EXPECT_EQ("P2 B\n", dex_test::readFile(path("B.csv")));
  EXPECT_EQ("P4\n", dex_test::readFile(path("Survey.csv")));
  EXPECT_EQ(3, data().getNumberOfDatasets());
}

class ParsersLoaderThreads : public ParsersLoaderTestBase, public ::testing::Test {
 protected:
  // "<name> <stack size>" of the thread the run reported from.
  std::pair<std::string, std::size_t> reportedThread(const std::string& file) {
    std::ifstream in(file + ".thread");
    std::pair<std::string, std::size_t> report;
    in >> report.first >> report.second;
    return report;
  }
};

TEST_F(ParsersLoaderThreads, AThreadThatCannotBeCreatedGivesTheInvalidHandleAndItsLogLines) {
  writeText(path("in.txt"), "point P1\n");
  LogCapture capture;
  vyn::thread::failNextStartForTesting();
  EXPECT_EQ(INVALID_HANDLE_VALUE,
            loader_.startImportInSeparateThread(wpath("in.txt").c_str(), &format_, nullptr));
  vyn::thread::failNextStartForTesting();
  EXPECT_EQ(INVALID_HANDLE_VALUE,
            loader_.startExportInSeparateThread(wpath("out.txt").c_str(), &format_, nullptr));
  EXPECT_EQ(1, capture.count(kImporterSource, 48));
  EXPECT_EQ(1, capture.count(kImporterSource, 41));  // the thread start's own record
  EXPECT_EQ(1, capture.count(kExporterSource, 41));
  EXPECT_EQ(1, capture.count(kExporterSource, 40));
  EXPECT_EQ(0,
            recorded_.imports->calls.load() + recorded_.exports->calls.load() + data().getNumberOfDatasets());
  EXPECT_FALSE(fs::exists(path("out.txt")));
}

TEST_F(ParsersLoaderThreads,
       RunsAreNamedAfterTheirFunctionsAndAutoCadDrawingImportsReserveOneMebibyteOfStack) {
  const DexFormat drawing =
      formatOf(dex_test::kAutoCadDrawingId, dex_test::scriptedPlugin(), dex_test::scriptedPlugin());
  writeText(path("in.txt"), "report-thread\n");
  writeText(path("out.txt.script"), "report-thread\n");
  EXPECT_EQ(DEX_RESULT_OK,
            join(loader_.startImportInSeparateThread(wpath("in.txt").c_str(), &drawing, nullptr),
                 *recorded_.imports, 0));
  EXPECT_EQ((std::pair<std::string, std::size_t>("ImportFunction", 0x100000)),
            reportedThread(path("in.txt")));
  EXPECT_EQ(DEX_RESULT_OK,
            join(loader_.startExportInSeparateThread(wpath("out.txt").c_str(), &drawing, nullptr),
                 *recorded_.exports, 0));
  EXPECT_EQ("exportFunction", reportedThread(path("out.txt")).first);
  EXPECT_NE(std::size_t{0x100000}, reportedThread(path("out.txt")).second);
  EXPECT_EQ(DEX_RESULT_OK,
            join(loader_.startImportInSeparateThread(wpath("in.txt").c_str(), &format_, nullptr),
                 *recorded_.imports, 1));
  EXPECT_NE(std::size_t{0x100000}, reportedThread(path("in.txt")).second);
}

TEST_F(ParsersLoaderThreads, TheHostPollsTheProgressAndMaySetTheStopFlagWhileTheWorkerRuns) {
  writeText(path("in.txt"), "progress 50 100\nwait-release\n");
  HANDLE thread = loader_.startImportInSeparateThread(wpath("in.txt").c_str(), &format_, nullptr);
  ASSERT_TRUE(waitForFile(path("in.txt.started")));
  DexRunProgress::Snapshot figures = data().getProgress().get();
  EXPECT_TRUE(figures.kind == DexRunProgress::IMPORT_RUN && figures.bytesRead == 50u &&
              figures.bytesTotal == 100u);
  EXPECT_DOUBLE_EQ(0.5, data().getProgress().getFraction());
  writeText(path("in.txt.release"), "");
  EXPECT_EQ(DEX_RESULT_OK, join(thread, *recorded_.imports, 0));
  writeText(path("out.txt.script"), "steps 3\n@1 wait-release\n");
  thread = loader_.startExportInSeparateThread(wpath("out.txt").c_str(), &format_, nullptr);
  ASSERT_TRUE(waitForFile(path("out.txt.started")));
  figures = data().getProgress().get();
  EXPECT_TRUE(figures.kind == DexRunProgress::EXPORT_RUN && figures.currentStep == 0 &&
              figures.numberOfSteps == 3);
  writeText(path("out.txt.release"), "");
  EXPECT_EQ(DEX_RESULT_OK, join(thread, *recorded_.exports, 0));
  EXPECT_EQ(2, data().getProgress().get().currentStep);
  EXPECT_DOUBLE_EQ(1.0, data().getProgress().getFraction());
  fs::remove(path("in.txt.started"));
  writeText(path("in.txt"), "point P1\nwait-stop\n");
  thread = loader_.startImportInSeparateThread(wpath("in.txt").c_str(), &format_, nullptr);
  ASSERT_TRUE(waitForFile(path("in.txt.started")));
  DexData::stopProcess_ = true;
  EXPECT_EQ(DEX_RESULT_STOPPED, join(thread, *recorded_.imports, 1));
}

TEST_F(ParsersLoaderThreads, ALibraryIsHeldForOneDirectionUntilAnotherLoadOrTheLoadersEnd) {
  const DexFormat nullParsers = formatOf(L"{44444444-2222-3333-4444-555555555555}",
                                         dex_test::nullParsersPlugin(), dex_test::nullParsersPlugin());
  {
    DexParsersLoader other;  // a loader releases its library when it ends
    ASSERT_TRUE(other.loadExporter(&nullParsers));
    EXPECT_TRUE(isResident(dex_test::nullParsersPlugin()));
  }
  EXPECT_FALSE(isResident(dex_test::nullParsersPlugin()));
  ASSERT_TRUE(loader_.loadImporter(&nullParsers));
  ASSERT_TRUE(loader_.loadImporter(&format_));  // a different library releases the held one
  EXPECT_FALSE(isResident(dex_test::nullParsersPlugin()));
  ASSERT_TRUE(loader_.loadExporter(&nullParsers));
  ASSERT_TRUE(loader_.loadImporter(&format_));  // also of the other direction
  EXPECT_FALSE(isResident(dex_test::nullParsersPlugin()));
  unsigned loads = vyn::plugins::loadCallCountForTesting();
  for (const bool importing : {true, true, false, false, true})  // switching direction reloads
    ASSERT_TRUE(importing ? loader_.loadImporter(&format_) : loader_.loadExporter(&format_));
  EXPECT_EQ(loads + 2, vyn::plugins::loadCallCountForTesting());
  ASSERT_TRUE(loader_.loadImporter(&nullParsers));
  LogCapture capture;
  loads = vyn::plugins::loadCallCountForTesting();
  EXPECT_FALSE(loader_.loadImporter(nullptr) || loader_.loadExporter(nullptr));  // keeps the held library
  EXPECT_TRUE(loader_.loadImporter(&nullParsers));
  EXPECT_EQ(loads, vyn::plugins::loadCallCountForTesting());
  EXPECT_EQ(0u, capture.size());
  EXPECT_TRUE(loader_.getLastLoadError().IsEmpty());
  const DexFormat missing = formatOf(kOtherGuid, kMissingLibrary, kMissingLibrary);
  EXPECT_FALSE(loader_.loadImporter(&missing));  // tells why until a load succeeds
  EXPECT_NE(std::wstring::npos, std::wstring(loader_.getLastLoadError().view()).find(L"libDexNone.so"));
  EXPECT_TRUE(loader_.loadImporter(&nullParsers));
  EXPECT_TRUE(loader_.getLastLoadError().IsEmpty());
  const DexFormat unnamed = formatOf(L"{66666666-2222-3333-4444-555555555555}", L"", L"");
  capture.clear();
  EXPECT_FALSE(loader_.loadImporter(&unnamed) || loader_.loadExporter(&unnamed));
  EXPECT_EQ(1, capture.count(kLoaderSource, 100));
  EXPECT_EQ(1, capture.count(kLoaderSource, 52));
}

TEST(ParsersLoaderData, ContainerIsMadeByInitIEDataWhichLaterOnlyReplacesItsSettings) {
  DexParsersLoader loader;
  LogCapture capture;
  EXPECT_EQ(nullptr, loader.getIEData());
  EXPECT_EQ(1, capture.count(kLoaderSource, 132));
  DexSettings points;
  points.addDataType(POINTS);
  loader.initIEData(points);
  DexData* const data = loader.getIEData();
  data->addDataset(new DexDataset(L"kept", 0, false));
  DexSettings lines;
  lines.addDataType(LINES);
  loader.initIEData(lines);
  EXPECT_TRUE(data == loader.getIEData() && data->getNumberOfDatasets() == 1);
  EXPECT_TRUE(data->getSettings().hasDataType(LINES) && !data->getSettings().hasDataType(POINTS));
  EXPECT_EQ(1u, capture.size());
  EXPECT_EQ(DEX_RESULT_STOPPED, DexParsersLoader::resultFromExitCode(static_cast<DWORD>(DEX_RESULT_STOPPED)));
  EXPECT_EQ(DEX_RESULT_OK, DexParsersLoader::resultFromExitCode(22));
  EXPECT_EQ(-1, DexParsersLoader::resultFromExitCode(0xFFFFFFFFu));
}

}  // namespace
