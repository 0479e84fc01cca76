#include "ieUtils/IExporter.h"

#include <memory>
#include <set>
#include <string>

#include "hostlibs/FileFuncs.h"
#include "hostlibs/VynLogging.h"
#include "hostlibs/VynUi.h"
#include "ieObjects/IEData.h"
#include "ieObjects/IEDataset.h"
#include "ieUtils/IEParsersLoader.h"
#include "ieUtils/IERunProgress.h"
#include "ieUtils/IESettings.h"
#include "ieUtils/IEUtilsFiles.h"
#include "ieUtils/detail/RunCommon.h"
#include "ieUtils/detail/RunLog.h"

namespace vyn::ie {
namespace {

constexpr detail::RunLog kExportLog{detail::kExporterLogSource, detail::kExporterThrewLine,
                                    detail::kNoExportNotifierLine, detail::kExportNotifierThrewLine};

constexpr const wchar_t* kOverwriteQuestion = L"File %ls already exists. Overwrite?";
constexpr const wchar_t* kFileNotRemovedTrace = L"file %ls cannot be removed";

// The answer to the overwrite question, asked through the message box when there is one.
int askOverwrite(const wchar_t* shortPath, const IDexMessageBox* messageBox, HWND parentWindow) {
  if (messageBox != nullptr) {
    // Hosts implement the plain form; the library changes nothing else in their object.
    return const_cast<IDexMessageBox*>(messageBox)->confirmOverwrite(parentWindow, shortPath);
  }
  CVynStringT<wchar_t> question;
  question.Format(kOverwriteQuestion, shortPath);
  return vyn_ui::msg_ui().question(question, 0);
}

// Makes one exporter of the data to fileName and runs it; DEX_RESULT_NO_PARSER when the plug-in makes
// none. Only exportFunction may run an exporter, so it hands this in as a callable.
template <class RunOne>
EDexResult exportOneFilePerDataset(DexData& data, const DexParserThreadParams& block, const RunOne& runOne) {
  EDexResult result = static_cast<EDexResult>(0);
  for (int i = 0; i < data.getNumberOfDatasets(); ++i) {
    const DexDataset* const dataset = data.getDatasetAt(i);
    if (dataset == nullptr) continue;
    const CVynStringT<wchar_t> name = FileFuncs::MakeFileNameValid(dataset->getName());
    const CVynStringT<wchar_t> fileName =
        utils::createFileName(block.fileName, name, true) + block.format->getExtension(true);
    data.setCurDataset(i);
    const EDexResult datasetResult = runOne(fileName);
    if (datasetResult < 0) return datasetResult;
    // The first remark wins; plain success only replaces "nothing said yet".
    if (datasetResult > 0 && (result == 0 || result == DEX_RESULT_OK)) result = datasetResult;
  }
  return result;
}

// Deletes every file the stopped export recorded, each name once.
void deleteExportedFiles(const DexData& data) {
  std::set<std::wstring> tried;
  for (const CVynStringT<wchar_t>& name : data.getExportedFileNames()) {
    if (name.IsEmpty() || !tried.emplace(name.view()).second) continue;
    if (!FileFuncs::DelFile(name, true))
      VYN_TRACE_ALWAYS(kFileNotRemovedTrace, static_cast<const wchar_t*>(name));
  }
}

}  // namespace

// ---- Interfaces -------------------------------------------------------------------------------------

IDexExporter::~IDexExporter() = default;

DexExporterImpl::DexExporterImpl(DexData* data, const CVynStringT<wchar_t>& fileName, const DexFormat* format)
    : data(data), fileName(fileName), format(format), currentStep(-2), ieResult(DEX_RESULT_OK) {}

DexExporterImpl::~DexExporterImpl() = default;

EDexResult DexExporterImpl::doExport() {
  for (;;) {
    const bool more = singleStep();
    if (data != nullptr) data->getProgress().setExportStep(currentStep, getNumberOfSteps());
    if (DexData::stopProcess_) return DEX_RESULT_STOPPED;
    if (!more) break;
  }
  return currentStep < 0 ? DEX_RESULT_FILE_ERROR : getIEResult();
}

EDexResult DexExporterImpl::getIEResult() const {
  return ieResult;
}

// ---- The run ----------------------------------------------------------------------------------------

EDexResult exportFunction(DexParserThreadParams* params) {
  if (params == nullptr) return DEX_RESULT_FAILED;
  const std::unique_ptr<DexParserThreadParams> block(params);
  const MakeExporterFunction makeExporter = detail::entryPointOf<MakeExporterFunction>(*block);

  EDexResult result = detail::checkRunParams(*block, makeExporter != nullptr);
  if (result == DEX_RESULT_OK) {
    DexData& data = *block->data;
    data.getProgress().begin(DexRunProgress::EXPORT_RUN);
    data.clearExportedFileNames();
    const auto runOne = [&data, &block, makeExporter](const CVynStringT<wchar_t>& fileName) {
      const std::unique_ptr<IDexExporter> exporter(makeExporter(&data, fileName, block->format));
      return exporter ? exporter->doExport() : DEX_RESULT_NO_PARSER;
    };
    result = detail::guardPluginCall(kExportLog, [&] {
      const bool oneFilePerDataset = data.prepareDatasetsForMultipleFilesExport(
          block->format->isParameterSupported(DexFormat::MULTIPLE_FILES_EXP));
      return oneFilePerDataset ? exportOneFilePerDataset(data, *block, runOne) : runOne(block->fileName);
    });
    if (result == DEX_RESULT_STOPPED) deleteExportedFiles(data);
  }
  if (block->ownThread) detail::tellNotifier(block->data, &DexSettings::exportNotifier, result, kExportLog);
  return result;
}

unsigned exportThreadFunction(void* params) {
  return static_cast<unsigned>(exportFunction(static_cast<DexParserThreadParams*>(params)));
}

// ---- The overwrite question -------------------------------------------------------------------------

namespace utils {

bool isExportFileWithSameName(const CVynStringT<wchar_t>& fileName, const IDexMessageBox* messageBox,
                              HWND parentWindow) {
  if (!PathFileExistsW(fileName)) return true;
  const CVynStringT<wchar_t> shortPath = FileFuncs::CompactPath(parentWindow, fileName, true);
  try {
    return askOverwrite(shortPath, messageBox, parentWindow) == IDYES;
  } catch (abi::__forced_unwind&) {
    throw;
  } catch (...) {
    return false;  // a question that cannot be answered is no yes
  }
}

}  // namespace utils

}  // namespace vyn::ie
