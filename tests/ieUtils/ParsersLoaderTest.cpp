// The parsers loader with the scripted test plug-ins (tests/plugins/DexTestScripted.cpp describes the
// scripts). Most cases run twice: in the caller's thread and in a worker thread, whose handle is joined
// and whose exit code is read.

#include "ieUtils/IEParsersLoader.h"

#include <dlfcn.h>
#include <gtest/gtest.h>

#include <chrono>
#include <filesystem>
#include <fstream>
#include <string>
#include <thread>
#include <vector>

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
using dex_test::TempDir;

const std::wstring kLoaderSource = L"ieUtils\\IEParsersLoader";
const std::wstring kImporterSource = L"ieUtils\\IImporter";
const std::wstring kExporterSource = L"ieUtils\\IExporter";

constexpr DWORD kJoinLimitMs = 120000;

bool isResident(const std::wstring& library) {
  void* const handle = dlopen(dex_test::narrow(library).c_str(), RTLD_NOW | RTLD_NOLOAD);
  if (handle == nullptr) return false;
  dlclose(handle);
  return true;
}

bool waitForFile(const std::string& path) {
  const auto limit = std::chrono::steady_clock::now() + std::chrono::seconds(60);
  while (!std::filesystem::exists(path)) {
    if (std::chrono::steady_clock::now() > limit) return false;
    std::this_thread::sleep_for(std::chrono::milliseconds(2));
  }
  return true;
}

void writeText(const std::string& path, const std::string& text) {
  std::ofstream(path) << text;
}

std::string firstLine(const std::string& path) {
  std::ifstream in(path);
  std::string line;
  std::getline(in, line);
  return line;
}

// Adds a design point with the given codes to the dataset, the code descriptions to the library.
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

DexFlags<DexFormat::EParameterName> oneFilePerDataset() {
  return DexFlags<DexFormat::EParameterName>{DexFormat::MULTIPLE_FILES_EXP};
}

enum class RunMode { CALLERS_THREAD, WORKER_THREAD };

std::string modeName(const ::testing::TestParamInfo<RunMode>& info) {
  return info.param == RunMode::CALLERS_THREAD ? "InTheCallersThread" : "InAWorkerThread";
}

// A loader with its own container (settings requesting points, recording notifiers) and a folder.
class ParsersLoaderTestBase {
 protected:
  ParsersLoaderTestBase() { loader_.initIEData(recorded_.settings); }

  DexData& data() { return *loader_.getIEData(); }
  std::string path(const std::string& name) const { return dir_.file(name); }
  std::wstring wpath(const std::string& name) const { return dir_.wfile(name); }

  // Joins a started run: the exit code is the result, and the notifier was told that result, once, in
  // another thread. A null handle (nothing started) reads as DEX_RESULT_NO_PARSER.
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
  TempDir dir_;
  DexParsersLoader loader_;
};

class ParsersLoaderRun : public ParsersLoaderTestBase, public ::testing::TestWithParam<RunMode> {
 protected:
  bool threaded() const { return GetParam() == RunMode::WORKER_THREAD; }

  EDexResult runImport(const std::wstring& fileName, const DexFormat* format, DexData* data = nullptr) {
    const int callsBefore = recorded_.imports->calls;
    if (!threaded()) {
      const EDexResult result = loader_.importInTheSameThread(fileName.c_str(), format, data);
      EXPECT_EQ(callsBefore, recorded_.imports->calls.load());
      return result;
    }
    return join(loader_.startImportInSeparateThread(fileName.c_str(), format, data), *recorded_.imports,
                callsBefore);
  }

  EDexResult runExport(const std::wstring& fileName, const DexFormat* format, DexData* data = nullptr) {
    const int callsBefore = recorded_.exports->calls;
    if (!threaded()) {
      const EDexResult result = loader_.exportInTheSameThread(fileName.c_str(), format, data);
      EXPECT_EQ(callsBefore, recorded_.exports->calls.load());
      return result;
    }
    return join(loader_.startExportInSeparateThread(fileName.c_str(), format, data), *recorded_.exports,
                callsBefore);
  }

  // An export that the user stops while it runs: in a worker thread the exporter waits for the stop
  // flag, which the test sets once the exporter has started; in the caller's thread the exporter sets the
  // flag itself. stopScript goes to the file named stoppingTarget plus ".script".
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

  DexFormat format_ = dex_test::scriptedFormat();
};

INSTANTIATE_TEST_SUITE_P(BothModes, ParsersLoaderRun,
                         ::testing::Values(RunMode::CALLERS_THREAD, RunMode::WORKER_THREAD), modeName);

// ---- Imports and exports that work ----------------------------------------------------------------------

TEST_P(ParsersLoaderRun, ImportsIntoTheImportDatasetOfItsOwnContainer) {
  writeText(path("in.txt"), "point P1 A\npoint P2\n");
  EXPECT_EQ(DEX_RESULT_OK, runImport(wpath("in.txt"), &format_));
  ASSERT_EQ(1, data().getNumberOfDatasets());
  const DexDataset* const dataset = data().getDatasetAt(0);
  EXPECT_EQ(L"Import dataset", std::wstring(dataset->getName().view()));
  EXPECT_EQ(2, dataset->getNumberOfElements(-1, 2, false, false));
}

TEST_P(ParsersLoaderRun, ACallersContainerIsUsedInsteadOfTheLoadersOwn) {
  writeText(path("in.txt"), "point P1\n");
  DexData own(recorded_.settings);
  EXPECT_EQ(DEX_RESULT_OK, runImport(wpath("in.txt"), &format_, &own));
  EXPECT_EQ(1, own.getNumberOfDatasets());
  EXPECT_EQ(0, data().getNumberOfDatasets());
}

TEST_P(ParsersLoaderRun, ExportsTheCurrentDatasetAndRecordsTheFile) {
  DexDataset* const dataset = new DexDataset(L"Survey", 0, false);
  data().addDataset(dataset);
  addPoint(data(), *dataset, L"P1", {L"A"});
  EXPECT_EQ(DEX_RESULT_OK, runExport(wpath("out.txt"), &format_));
  EXPECT_EQ("P1 A", firstLine(path("out.txt")));
  ASSERT_EQ(1, data().getExportedFileNames().GetSize());
  EXPECT_EQ(wpath("out.txt"), std::wstring(data().getExportedFileNames()[0].view()));
}

TEST_P(ParsersLoaderRun, RemarksAndResultsOutsideTheKnownOnesPassThrough) {
  for (const int answer : {5, 12345, 0, -7, static_cast<int>(DEX_RESULT_WRONG_FORMAT)}) {
    writeText(path("in.txt"), "result " + std::to_string(answer) + "\n");
    EXPECT_EQ(answer, runImport(wpath("in.txt"), &format_));
    writeText(path("out.txt.script"), "result " + std::to_string(answer) + "\n");
    EXPECT_EQ(answer, runExport(wpath("out.txt"), &format_));
  }
}

TEST_P(ParsersLoaderRun, AnExporterThatNeverStepsReportsAFileError) {
  writeText(path("out.txt.script"), "fail-first\n");
  EXPECT_EQ(DEX_RESULT_FILE_ERROR, runExport(wpath("out.txt"), &format_));
}

// ---- Libraries --------------------------------------------------------------------------------------------

TEST_P(ParsersLoaderRun, TwoFormatsOfOneLibraryLoadItOnce) {
  const DexFormat other = dex_test::scriptedFormat(L"{22222222-2222-3333-4444-555555555555}");
  writeText(path("in.txt"), "point P1\n");
  EXPECT_EQ(DEX_RESULT_OK, runImport(wpath("in.txt"), &format_));
  const unsigned loadsAfterFirst = vyn::plugins::loadCallCountForTesting();
  EXPECT_EQ(DEX_RESULT_OK, runImport(wpath("in.txt"), &other));
  EXPECT_TRUE(loader_.loadImporter(&format_));
  EXPECT_EQ(loadsAfterFirst, vyn::plugins::loadCallCountForTesting());
}

TEST_P(ParsersLoaderRun, AnImportLibraryThatCannotBeLoadedHasNoParserAndLogsLine100) {
  const DexFormat missing = dex_test::makeFormat(L"{33333333-2222-3333-4444-555555555555}",
                                                 L"/nonexistent/libDexNone.so", dex_test::scriptedPlugin());
  LogCapture capture;
  EXPECT_EQ(DEX_RESULT_NO_PARSER, runImport(wpath("in.txt"), &missing));
  EXPECT_EQ(1, capture.count(kLoaderSource, 100));
  EXPECT_EQ(0, capture.count(kLoaderSource, 52));
}

TEST_P(ParsersLoaderRun, AnExportLibraryWithoutEntryPointHasNoParserAndLogsLine52) {
  const DexFormat noEntry = dex_test::makeFormat(L"{33333333-2222-3333-4444-555555555555}",
                                                 dex_test::scriptedPlugin(), dex_test::noEntryPointsPlugin());
  LogCapture capture;
  EXPECT_EQ(DEX_RESULT_NO_PARSER, runExport(wpath("out.txt"), &noEntry));
  EXPECT_EQ(1, capture.count(kLoaderSource, 52));
  EXPECT_FALSE(std::filesystem::exists(path("out.txt")));
}

TEST_P(ParsersLoaderRun, AnExportLibraryThatCannotBeLoadedHasNoParserAndLogsLine52) {
  const DexFormat missing = dex_test::makeFormat(L"{33333333-2222-3333-4444-555555555555}",
                                                 dex_test::scriptedPlugin(), L"/nonexistent/libDexNone.so");
  LogCapture capture;
  EXPECT_EQ(DEX_RESULT_NO_PARSER, runExport(wpath("out.txt"), &missing));
  EXPECT_EQ(1, capture.count(kLoaderSource, 52));
  EXPECT_EQ(0, capture.count(kLoaderSource, 100));
  EXPECT_FALSE(std::filesystem::exists(path("out.txt")));
}

TEST_P(ParsersLoaderRun, AnImportLibraryWithoutEntryPointHasNoParserAndLogsLine100) {
  const DexFormat noEntry = dex_test::makeFormat(L"{33333333-2222-3333-4444-555555555555}",
                                                 dex_test::noEntryPointsPlugin(), dex_test::scriptedPlugin());
  writeText(path("in.txt"), "point P1\n");
  LogCapture capture;
  EXPECT_EQ(DEX_RESULT_NO_PARSER, runImport(wpath("in.txt"), &noEntry));
  EXPECT_EQ(1, capture.count(kLoaderSource, 100));
  EXPECT_EQ(0, data().getNumberOfDatasets());
}

TEST_P(ParsersLoaderRun, AFailedLoadDropsTheLibraryHeldBefore) {
  writeText(path("in.txt"), "point P1\n");
  EXPECT_EQ(DEX_RESULT_OK, runImport(wpath("in.txt"), &format_));
  const DexFormat missing =
      dex_test::makeFormat(L"{33333333-2222-3333-4444-555555555555}", L"/nonexistent/libDexNone.so",
                           L"/nonexistent/libDexNone.so");
  LogCapture capture;
  EXPECT_EQ(DEX_RESULT_NO_PARSER, runImport(wpath("in.txt"), &missing));
  // The scripted library is gone: the next run of its format loads it again.
  const unsigned loads = vyn::plugins::loadCallCountForTesting();
  EXPECT_EQ(DEX_RESULT_OK, runImport(wpath("in.txt"), &format_));
  EXPECT_EQ(loads + 1, vyn::plugins::loadCallCountForTesting());
}

TEST_P(ParsersLoaderRun, APluginThatMakesNoImporterOrExporterHasNoParser) {
  const DexFormat nothing =
      dex_test::makeFormat(L"{44444444-2222-3333-4444-555555555555}", dex_test::nullParsersPlugin(),
                           dex_test::nullParsersPlugin());
  EXPECT_EQ(DEX_RESULT_NO_PARSER, runImport(wpath("in.txt"), &nothing));
  EXPECT_EQ(DEX_RESULT_NO_PARSER, runExport(wpath("out.txt"), &nothing));
  writeText(path("in.txt"), "make-null\n");
  EXPECT_EQ(DEX_RESULT_NO_PARSER, runImport(wpath("in.txt"), &format_));
  writeText(path("out.txt.script"), "make-null\n");
  EXPECT_EQ(DEX_RESULT_NO_PARSER, runExport(wpath("out.txt"), &format_));
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
  EXPECT_FALSE(std::filesystem::exists(path("out.txt")));
}

TEST_P(ParsersLoaderRun, ANullFormatHasNoParser) {
  EXPECT_EQ(DEX_RESULT_NO_PARSER, runImport(wpath("in.txt"), nullptr));
  EXPECT_EQ(DEX_RESULT_NO_PARSER, runExport(wpath("out.txt"), nullptr));
}

TEST_P(ParsersLoaderRun, ANullFormatWithAHeldEntryPointIsAnsweredByTheRun) {
  ASSERT_TRUE(loader_.loadExporter(&format_));
  EXPECT_EQ(DEX_RESULT_NO_PARSER, runExport(wpath("out.txt"), nullptr));
  ASSERT_TRUE(loader_.loadImporter(&format_));
  EXPECT_EQ(DEX_RESULT_NO_PARSER, runImport(wpath("in.txt"), nullptr));
  EXPECT_FALSE(std::filesystem::exists(path("out.txt")));
}

// ---- Plug-ins and hosts that fail ------------------------------------------------------------------------

TEST_P(ParsersLoaderRun, APluginThatThrowsFailsTheRunWithALogLine) {
  LogCapture capture;
  for (const char* script : {"throw\n", "make-throw\n"}) {
    writeText(path("in.txt"), script);
    EXPECT_EQ(DEX_RESULT_FAILED, runImport(wpath("in.txt"), &format_));
    writeText(path("out.txt.script"), script);
    EXPECT_EQ(DEX_RESULT_FAILED, runExport(wpath("out.txt"), &format_));
  }
  EXPECT_EQ(2, capture.count(kImporterSource, 901));
  EXPECT_EQ(2, capture.count(kExporterSource, 901));
}

TEST_P(ParsersLoaderRun, ANotifierThatThrowsDoesNotChangeTheResult) {
  recorded_.imports->throws = true;
  writeText(path("in.txt"), "result 5\n");
  LogCapture capture;
  EXPECT_EQ(5, runImport(wpath("in.txt"), &format_));
  EXPECT_EQ(threaded() ? 1 : 0, capture.count(kImporterSource, 902));
}

TEST_P(ParsersLoaderRun, AMissingNotifierIsLoggedOnlyForAThreadOfItsOwn) {
  DexSettings settings;
  settings.addDataType(POINTS);
  DexData silent(settings);
  writeText(path("in.txt"), "point P1\n");
  LogCapture capture;
  if (threaded()) {
    const HANDLE thread = loader_.startImportInSeparateThread(wpath("in.txt").c_str(), &format_, &silent);
    ASSERT_NE(nullptr, thread);
    ASSERT_EQ(WAIT_OBJECT_0, WaitForSingleObject(thread, kJoinLimitMs));
    DWORD exitCode = 0;
    EXPECT_TRUE(GetExitCodeThread(thread, &exitCode));
    CloseHandle(thread);
    EXPECT_EQ(DEX_RESULT_OK, DexParsersLoader::resultFromExitCode(exitCode));
    const HANDLE exportThread =
        loader_.startExportInSeparateThread(wpath("out.txt").c_str(), &format_, &silent);
    ASSERT_NE(nullptr, exportThread);
    ASSERT_EQ(WAIT_OBJECT_0, WaitForSingleObject(exportThread, kJoinLimitMs));
    CloseHandle(exportThread);
  } else {
    EXPECT_EQ(DEX_RESULT_OK, loader_.importInTheSameThread(wpath("in.txt").c_str(), &format_, &silent));
    EXPECT_EQ(DEX_RESULT_OK, loader_.exportInTheSameThread(wpath("out.txt").c_str(), &format_, &silent));
  }
  EXPECT_EQ(threaded() ? 1 : 0, capture.count(kImporterSource, 92));
  EXPECT_EQ(threaded() ? 1 : 0, capture.count(kExporterSource, 141));
}

// ---- Stopped runs
// -------------------------------------------------------------------------------------------

TEST_P(ParsersLoaderRun, AStoppedExportDeletesEveryFileItRecorded) {
  EXPECT_EQ(DEX_RESULT_STOPPED,
            runStoppedExport(wpath("out.txt"), &format_, path("out.txt"), "write extra.txt\n"));
  EXPECT_FALSE(std::filesystem::exists(path("out.txt")));
  EXPECT_FALSE(std::filesystem::exists(path("extra.txt")));
  EXPECT_EQ(2, data().getExportedFileNames().GetSize());
}

TEST_P(ParsersLoaderRun, AFileThatCannotBeRemovedLeavesATraceAndTheOthersAreStillDeleted) {
  std::filesystem::create_directory(path("folder.txt"));  // a folder is no file to delete
  LogCapture capture;
  EXPECT_EQ(DEX_RESULT_STOPPED, runStoppedExport(wpath("out.txt"), &format_, path("out.txt"),
                                                 "record folder.txt\nrecord ghost.txt\nwrite extra.txt\n"));
  EXPECT_EQ(1, capture.countMessage(L"file " + wpath("folder.txt") + L" cannot be removed"));
  EXPECT_EQ(1, capture.countMessage(L"file " + wpath("ghost.txt") + L" cannot be removed"));
  EXPECT_EQ(2, capture.countMessage(L"cannot be removed"));
  EXPECT_TRUE(std::filesystem::is_directory(path("folder.txt")));
  EXPECT_FALSE(std::filesystem::exists(path("out.txt")));
  EXPECT_FALSE(std::filesystem::exists(path("extra.txt")));
}

TEST_P(ParsersLoaderRun, AStopNeverDeletesTheFilesOfAnEarlierExport) {
  EXPECT_EQ(DEX_RESULT_OK, runExport(wpath("first.txt"), &format_));
  EXPECT_EQ(DEX_RESULT_STOPPED, runStoppedExport(wpath("second.txt"), &format_, path("second.txt"), ""));
  EXPECT_TRUE(std::filesystem::exists(path("first.txt")));
  EXPECT_FALSE(std::filesystem::exists(path("second.txt")));
  ASSERT_EQ(1, data().getExportedFileNames().GetSize());
  EXPECT_EQ(wpath("second.txt"), std::wstring(data().getExportedFileNames()[0].view()));
}

TEST_P(ParsersLoaderRun, AStoppedImportDeletesNothing) {
  writeText(path("in.txt"), "point P1\nwait-stop\n");
  writeText(path("out.txt"), "an earlier export");
  data().addFileNameToExported(wpath("out.txt").c_str());
  DexData::stopProcess_ = true;
  EXPECT_EQ(DEX_RESULT_STOPPED, runImport(wpath("in.txt"), &format_));
  EXPECT_TRUE(std::filesystem::exists(path("in.txt")));
  EXPECT_TRUE(std::filesystem::exists(path("out.txt")));
}

// ---- One file per dataset
// -----------------------------------------------------------------------------------

class ParsersLoaderPerDataset : public ParsersLoaderRun {
 protected:
  ParsersLoaderPerDataset() {
    for (const wchar_t* name : {L"D1", L"D2", L"D3"})
      data().addDataset(new DexDataset(name, 0, false));
  }

  void scriptDataset(const std::string& name, const std::string& script) {
    writeText(path(name + ".txt.script"), script);
  }

  DexFormat perDataset_ =
      dex_test::makeFormat(L"{55555555-2222-3333-4444-555555555555}", dex_test::scriptedPlugin(),
                           dex_test::scriptedPlugin(), L"txt", oneFilePerDataset());
};

INSTANTIATE_TEST_SUITE_P(BothModes, ParsersLoaderPerDataset,
                         ::testing::Values(RunMode::CALLERS_THREAD, RunMode::WORKER_THREAD), modeName);

TEST_P(ParsersLoaderPerDataset, WritesOneFileNamedAfterEachDatasetIntoTheFolder) {
  EXPECT_EQ(DEX_RESULT_OK, runExport(dir_.wpath(), &perDataset_));
  for (const char* name : {"D1.txt", "D2.txt", "D3.txt"})
    EXPECT_TRUE(std::filesystem::exists(path(name))) << name;
  EXPECT_EQ(3, data().getExportedFileNames().GetSize());
}

TEST_P(ParsersLoaderPerDataset, AFailureEndsTheRunBeforeTheNextDataset) {
  scriptDataset("D2", "result -9990\n");
  EXPECT_EQ(DEX_RESULT_WRONG_FORMAT, runExport(dir_.wpath(), &perDataset_));
  EXPECT_TRUE(std::filesystem::exists(path("D1.txt")));
  EXPECT_FALSE(std::filesystem::exists(path("D3.txt")));
}

TEST_P(ParsersLoaderPerDataset, APluginThatMakesNoExporterEndsTheRun) {
  scriptDataset("D2", "make-null\n");
  EXPECT_EQ(DEX_RESULT_NO_PARSER, runExport(dir_.wpath(), &perDataset_));
  EXPECT_FALSE(std::filesystem::exists(path("D3.txt")));
}

TEST_P(ParsersLoaderPerDataset, TheFirstRemarkWins) {
  scriptDataset("D1", "result 0\n");
  scriptDataset("D3", "result 5\n");
  EXPECT_EQ(5, runExport(dir_.wpath(), &perDataset_));
  scriptDataset("D1", "result 5\n");
  scriptDataset("D2", "result 7\n");
  scriptDataset("D3", "result 22\n");
  EXPECT_EQ(5, runExport(dir_.wpath(), &perDataset_));
}

TEST_P(ParsersLoaderPerDataset, OnlyZeroAnswersGiveZero) {
  for (const char* name : {"D1", "D2", "D3"})
    scriptDataset(name, "result 0\n");
  EXPECT_EQ(0, runExport(dir_.wpath(), &perDataset_));
}

TEST_P(ParsersLoaderPerDataset, AStopDeletesTheFilesOfTheDatasetsExportedBefore) {
  EXPECT_EQ(DEX_RESULT_STOPPED,
            runStoppedExport(dir_.wpath(), &perDataset_, path("D2.txt"), "write D2-extra.txt\n"));
  for (const char* name : {"D1.txt", "D2.txt", "D2-extra.txt", "D3.txt"})
    EXPECT_FALSE(std::filesystem::exists(path(name))) << name;
  EXPECT_EQ(3, data().getExportedFileNames().GetSize());
}

TEST_P(ParsersLoaderPerDataset, DatasetNamesAreMadeValidFileNames) {
  data().getDatasetAt(0)->setName(L"North/South: 1");
  EXPECT_EQ(DEX_RESULT_OK, runExport(dir_.wpath(), &perDataset_));
  EXPECT_TRUE(std::filesystem::exists(path("North_South_ 1.txt")));
}

TEST_P(ParsersLoaderRun, ADatasetSplitByCodeGivesAFilePerCodeAndOneForObjectsWithoutCode) {
  DexDataset* const survey = new DexDataset(L"Survey", 0, false);
  data().addDataset(survey);
  addPoint(data(), *survey, L"P1", {L"A"});
  addPoint(data(), *survey, L"P2", {L"B"});
  addPoint(data(), *survey, L"P3", {L"A"});
  addPoint(data(), *survey, L"P4", {});
  const DexFormat format =
      dex_test::makeFormat(L"{55555555-2222-3333-4444-555555555555}", dex_test::scriptedPlugin(),
                           dex_test::scriptedPlugin(), L"csv", oneFilePerDataset());
  EXPECT_EQ(DEX_RESULT_OK, runExport(dir_.wpath(), &format));
  EXPECT_EQ("P1 A\nP3 A\n", dex_test::readFile(path("A.csv")));
  EXPECT_EQ("P2 B\n", dex_test::readFile(path("B.csv")));
  EXPECT_EQ("P4\n", dex_test::readFile(path("Survey.csv")));
  EXPECT_EQ(3, data().getNumberOfDatasets());
}

TEST_P(ParsersLoaderRun, WithoutTheParameterADatasetIsNotSplit) {
  DexDataset* const survey = new DexDataset(L"Survey", 0, false);
  data().addDataset(survey);
  addPoint(data(), *survey, L"P1", {L"A"});
  addPoint(data(), *survey, L"P2", {L"B"});
  EXPECT_EQ(DEX_RESULT_OK, runExport(wpath("all.txt"), &format_));
  EXPECT_EQ("P1 A\nP2 B\n", dex_test::readFile(path("all.txt")));
  EXPECT_EQ(1, data().getNumberOfDatasets());
}

// ---- Threads
// ------------------------------------------------------------------------------------------------

class ParsersLoaderThreads : public ParsersLoaderTestBase, public ::testing::Test {
 protected:
  // "<name> <stack size>" of the thread the run reported from.
  std::pair<std::string, std::size_t> reportedThread(const std::string& file) {
    std::ifstream in(file + ".thread");
    std::pair<std::string, std::size_t> report;
    in >> report.first >> report.second;
    return report;
  }

  DexFormat format_ = dex_test::scriptedFormat();
};

TEST_F(ParsersLoaderThreads, AThreadThatCannotBeCreatedGivesTheInvalidHandleAndItsLogLine) {
  writeText(path("in.txt"), "point P1\n");
  LogCapture capture;
  vyn::thread::failNextStartForTesting();
  EXPECT_EQ(INVALID_HANDLE_VALUE,
            loader_.startImportInSeparateThread(wpath("in.txt").c_str(), &format_, nullptr));
  EXPECT_EQ(1, capture.count(kImporterSource, 48));
  EXPECT_EQ(1, capture.count(kImporterSource, 41));  // the thread start's own record
  vyn::thread::failNextStartForTesting();
  EXPECT_EQ(INVALID_HANDLE_VALUE,
            loader_.startExportInSeparateThread(wpath("out.txt").c_str(), &format_, nullptr));
  EXPECT_EQ(1, capture.count(kExporterSource, 41));
  EXPECT_EQ(1, capture.count(kExporterSource, 40));
  EXPECT_EQ(0, recorded_.imports->calls.load());
  EXPECT_EQ(0, recorded_.exports->calls.load());
  EXPECT_EQ(0, data().getNumberOfDatasets());
  EXPECT_FALSE(std::filesystem::exists(path("out.txt")));
}

TEST_F(ParsersLoaderThreads, RunsAreNamedAfterTheirFunctions) {
  writeText(path("in.txt"), "report-thread\n");
  join(loader_.startImportInSeparateThread(wpath("in.txt").c_str(), &format_, nullptr), *recorded_.imports,
       0);
  EXPECT_EQ("ImportFunction", reportedThread(path("in.txt")).first);
  writeText(path("out.txt.script"), "report-thread\n");
  join(loader_.startExportInSeparateThread(wpath("out.txt").c_str(), &format_, nullptr), *recorded_.exports,
       0);
  EXPECT_EQ("exportFunction", reportedThread(path("out.txt")).first);
}

TEST_F(ParsersLoaderThreads, ImportsOfTheAutoCadDrawingFormatReserveOneMebibyteOfStack) {
  const DexFormat drawing = dex_test::makeFormat(dex_test::kAutoCadDrawingId, dex_test::scriptedPlugin(),
                                                 dex_test::scriptedPlugin());
  writeText(path("in.txt"), "report-thread\n");
  EXPECT_EQ(DEX_RESULT_OK,
            join(loader_.startImportInSeparateThread(wpath("in.txt").c_str(), &drawing, nullptr),
                 *recorded_.imports, 0));
  EXPECT_EQ(std::size_t{0x100000}, reportedThread(path("in.txt")).second);

  writeText(path("out.txt.script"), "report-thread\n");
  EXPECT_EQ(DEX_RESULT_OK,
            join(loader_.startExportInSeparateThread(wpath("out.txt").c_str(), &drawing, nullptr),
                 *recorded_.exports, 0));
  EXPECT_NE(std::size_t{0x100000}, reportedThread(path("out.txt")).second);

  EXPECT_EQ(DEX_RESULT_OK,
            join(loader_.startImportInSeparateThread(wpath("in.txt").c_str(), &format_, nullptr),
                 *recorded_.imports, 1));
  EXPECT_NE(std::size_t{0x100000}, reportedThread(path("in.txt")).second);
}

TEST_F(ParsersLoaderThreads, TheHostPollsTheImportPositionWhileTheWorkerReads) {
  writeText(path("in.txt"), "progress 50 100\nwait-release\n");
  const HANDLE thread = loader_.startImportInSeparateThread(wpath("in.txt").c_str(), &format_, nullptr);
  ASSERT_TRUE(waitForFile(path("in.txt.started")));
  const DexRunProgress::Snapshot figures = data().getProgress().get();
  EXPECT_EQ(DexRunProgress::IMPORT_RUN, figures.kind);
  EXPECT_EQ(50u, figures.bytesRead);
  EXPECT_EQ(100u, figures.bytesTotal);
  EXPECT_DOUBLE_EQ(0.5, data().getProgress().getFraction());
  writeText(path("in.txt.release"), "");
  EXPECT_EQ(DEX_RESULT_OK, join(thread, *recorded_.imports, 0));
}

TEST_F(ParsersLoaderThreads, TheHostPollsTheExportStepsWhileTheWorkerWrites) {
  writeText(path("out.txt.script"), "steps 3\n@1 wait-release\n");
  const HANDLE thread = loader_.startExportInSeparateThread(wpath("out.txt").c_str(), &format_, nullptr);
  ASSERT_TRUE(waitForFile(path("out.txt.started")));
  DexRunProgress::Snapshot figures = data().getProgress().get();
  EXPECT_EQ(DexRunProgress::EXPORT_RUN, figures.kind);
  EXPECT_EQ(0, figures.currentStep);
  EXPECT_EQ(3, figures.numberOfSteps);
  writeText(path("out.txt.release"), "");
  EXPECT_EQ(DEX_RESULT_OK, join(thread, *recorded_.exports, 0));
  figures = data().getProgress().get();
  EXPECT_EQ(2, figures.currentStep);
  EXPECT_DOUBLE_EQ(1.0, data().getProgress().getFraction());
}

TEST_F(ParsersLoaderThreads, TheHostMaySetTheStopFlagOfARunningImport) {
  writeText(path("in.txt"), "point P1\nwait-stop\n");
  const HANDLE thread = loader_.startImportInSeparateThread(wpath("in.txt").c_str(), &format_, nullptr);
  ASSERT_TRUE(waitForFile(path("in.txt.started")));
  DexData::stopProcess_ = true;
  EXPECT_EQ(DEX_RESULT_STOPPED, join(thread, *recorded_.imports, 0));
}

// ---- The held library
// -----------------------------------------------------------------------------------------

class ParsersLoaderLibraries : public ParsersLoaderTestBase, public ::testing::Test {
 protected:
  DexFormat scripted_ = dex_test::scriptedFormat();
  DexFormat nullParsers_ = dex_test::makeFormat(L"{44444444-2222-3333-4444-555555555555}",
                                                dex_test::nullParsersPlugin(), dex_test::nullParsersPlugin());
};

TEST_F(ParsersLoaderLibraries, LoadingADifferentLibraryReleasesTheHeldOne) {
  ASSERT_TRUE(loader_.loadImporter(&nullParsers_));
  EXPECT_TRUE(isResident(dex_test::nullParsersPlugin()));
  ASSERT_TRUE(loader_.loadImporter(&scripted_));
  EXPECT_FALSE(isResident(dex_test::nullParsersPlugin()));
}

TEST_F(ParsersLoaderLibraries, ADifferentLibraryOfTheOtherDirectionAlsoReleasesTheHeldOne) {
  ASSERT_TRUE(loader_.loadExporter(&nullParsers_));
  ASSERT_TRUE(loader_.loadImporter(&scripted_));
  EXPECT_FALSE(isResident(dex_test::nullParsersPlugin()));
  // The export entry point went with its library: exporting loads again.
  const unsigned loads = vyn::plugins::loadCallCountForTesting();
  ASSERT_TRUE(loader_.loadExporter(&nullParsers_));
  EXPECT_EQ(loads + 1, vyn::plugins::loadCallCountForTesting());
}

TEST_F(ParsersLoaderLibraries, SwitchingDirectionReloadsEvenTheSameLibrary) {
  const unsigned loads = vyn::plugins::loadCallCountForTesting();
  ASSERT_TRUE(loader_.loadImporter(&scripted_));
  ASSERT_TRUE(loader_.loadImporter(&scripted_));
  ASSERT_TRUE(loader_.loadExporter(&scripted_));
  ASSERT_TRUE(loader_.loadExporter(&scripted_));
  ASSERT_TRUE(loader_.loadImporter(&scripted_));
  EXPECT_EQ(loads + 3, vyn::plugins::loadCallCountForTesting());
}

TEST_F(ParsersLoaderLibraries, ANullFormatLoadsNothingAndKeepsTheHeldLibrary) {
  ASSERT_TRUE(loader_.loadImporter(&nullParsers_));
  LogCapture capture;
  const unsigned loads = vyn::plugins::loadCallCountForTesting();
  EXPECT_FALSE(loader_.loadImporter(nullptr));
  EXPECT_FALSE(loader_.loadExporter(nullptr));
  EXPECT_EQ(0u, capture.size());
  EXPECT_EQ(loads, vyn::plugins::loadCallCountForTesting());
  EXPECT_TRUE(isResident(dex_test::nullParsersPlugin()));
  EXPECT_TRUE(loader_.loadImporter(&nullParsers_));
  EXPECT_EQ(loads, vyn::plugins::loadCallCountForTesting());
}

TEST_F(ParsersLoaderLibraries, TheLoaderReleasesItsLibraryWhenDestroyed) {
  {
    DexParsersLoader loader;
    ASSERT_TRUE(loader.loadExporter(&nullParsers_));
    EXPECT_TRUE(isResident(dex_test::nullParsersPlugin()));
  }
  EXPECT_FALSE(isResident(dex_test::nullParsersPlugin()));
}

TEST_F(ParsersLoaderLibraries, AFailedLoadTellsWhyUntilALoadSucceeds) {
  const DexFormat missing =
      dex_test::makeFormat(L"{33333333-2222-3333-4444-555555555555}", L"/nonexistent/libDexNone.so",
                           L"/nonexistent/libDexNone.so");
  EXPECT_TRUE(loader_.getLastLoadError().IsEmpty());
  EXPECT_FALSE(loader_.loadImporter(&missing));
  EXPECT_NE(std::wstring::npos, std::wstring(loader_.getLastLoadError().view()).find(L"libDexNone.so"));
  EXPECT_TRUE(loader_.loadImporter(&nullParsers_));
  EXPECT_TRUE(loader_.getLastLoadError().IsEmpty());
}

TEST_F(ParsersLoaderLibraries, AnEmptyLibraryNameCannotBeLoaded) {
  const DexFormat unnamed = dex_test::makeFormat(L"{66666666-2222-3333-4444-555555555555}", L"", L"");
  LogCapture capture;
  EXPECT_FALSE(loader_.loadImporter(&unnamed));
  EXPECT_FALSE(loader_.loadExporter(&unnamed));
  EXPECT_EQ(1, capture.count(kLoaderSource, 100));
  EXPECT_EQ(1, capture.count(kLoaderSource, 52));
}

// ---- The container
// ----------------------------------------------------------------------------------------------

TEST(ParsersLoaderData, WithoutInitIEDataThereIsNoContainerAndALogLine) {
  DexParsersLoader loader;
  LogCapture capture;
  EXPECT_EQ(nullptr, loader.getIEData());
  EXPECT_EQ(1, capture.count(kLoaderSource, 132));
  EXPECT_EQ(1u, capture.size());
}

TEST(ParsersLoaderData, ALaterInitIEDataKeepsTheContainerAndReplacesItsSettings) {
  DexParsersLoader loader;
  DexSettings points;
  points.addDataType(POINTS);
  loader.initIEData(points);
  DexData* const data = loader.getIEData();
  ASSERT_NE(nullptr, data);
  data->addDataset(new DexDataset(L"kept", 0, false));
  DexSettings lines;
  lines.addDataType(LINES);
  LogCapture capture;
  loader.initIEData(lines);
  EXPECT_EQ(data, loader.getIEData());
  EXPECT_EQ(1, data->getNumberOfDatasets());
  EXPECT_TRUE(data->getSettings().hasDataType(LINES));
  EXPECT_FALSE(data->getSettings().hasDataType(POINTS));
  EXPECT_EQ(0u, capture.size());
}

TEST(ParsersLoaderData, ExitCodesReadBackAsSignedResults) {
  EXPECT_EQ(DEX_RESULT_STOPPED, DexParsersLoader::resultFromExitCode(static_cast<DWORD>(DEX_RESULT_STOPPED)));
  EXPECT_EQ(DEX_RESULT_OK, DexParsersLoader::resultFromExitCode(22));
  EXPECT_EQ(-1, DexParsersLoader::resultFromExitCode(0xFFFFFFFFu));
}

}  // namespace
