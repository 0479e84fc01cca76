#include "ieUtils/IEParsersLoader.h"

#include <cstdint>

#include "hostlibs/VynLibrary.h"
#include "hostlibs/VynLogging.h"
#include "hostlibs/VynThread.h"
#include "ieObjects/IEData.h"
#include "ieUtils/IERunProgress.h"
#include "ieUtils/IESettings.h"
#include "ieUtils/detail/RunLog.h"

namespace vyn::ie {
namespace {

// Imports of the AutoCAD drawing format recurse deeply through drawing blocks: their worker reserves
// 1 MiB of stack.
constexpr const wchar_t* kAutoCadDrawingFormatId = L"{E1EE3440-4E57-491c-B580-2CC94DFDCD82}";
constexpr unsigned kAutoCadImportStackSize = 0x100000;
constexpr unsigned kReservedStackFlags = CREATE_SUSPENDED | STACK_SIZE_PARAM_IS_A_RESERVATION;

}  // namespace

DexParsersLoader::DexParsersLoader() : module_(nullptr), makeExporter_(nullptr), makeImporter_(nullptr) {}

DexParsersLoader::~DexParsersLoader() {
  // The container may hold objects of the plug-in's classes: it goes before the library's code does.
  ieData_.reset();
  detachCurrentParser();
}

// ---- The data container -----------------------------------------------------------------------------

void DexParsersLoader::initIEData(const DexSettings& settings) {
  if (ieData_ != nullptr) {
    ieData_->setSettings(settings);
    return;
  }
  ieData_.reset(new DexData(settings));
  if (!ieData_) vyn_logging::vyn_err_log(detail::kLoaderLogSource, detail::kDataContainerNotCreatedLine);
}

DexData* DexParsersLoader::getIEData() {
  if (ieData_ == nullptr) vyn_logging::vyn_err_log(detail::kLoaderLogSource, detail::kNoDataContainerLine);
  return ieData_.get();
}

// ---- Plug-in libraries ------------------------------------------------------------------------------

bool DexParsersLoader::loadImporter(const DexFormat* format) {
  return load(EDirection::IMPORT, format);
}

bool DexParsersLoader::loadExporter(const DexFormat* format) {
  return load(EDirection::EXPORT, format);
}

bool DexParsersLoader::load(EDirection direction, const DexFormat* format) {
  if (format == nullptr) return false;
  const bool forExport = direction == EDirection::EXPORT;
  const CVynStringT<wchar_t> libraryName = format->getDllName(forExport);
  const bool entryPointHeld = forExport ? makeExporter_ != nullptr : makeImporter_ != nullptr;
  if (entryPointHeld && currentDllName_ == libraryName) return true;

  // One library at a time: the held one goes, with every entry point taken from it.
  releaseHeldLibrary();
  const LibraryResult loaded =
      forExport ? GetLibraryFunction(module_, makeExporter_, libraryName, kMakeExporterEntryPoint)
                : GetLibraryFunction(module_, makeImporter_, libraryName, kMakeImporterEntryPoint);
  const bool entryPointFound = forExport ? makeExporter_ != nullptr : makeImporter_ != nullptr;
  if (loaded && entryPointFound) {
    currentDllName_ = libraryName;
    lastLoadError_.Empty();
    return true;
  }
  releaseHeldLibrary();
  lastLoadError_ = loaded.errorText();
  vyn_logging::vyn_err_log(detail::kLoaderLogSource, forExport ? detail::kExportLibraryNotLoadedLine
                                                               : detail::kImportLibraryNotLoadedLine);
  return false;
}

void DexParsersLoader::releaseHeldLibrary() {
  detachCurrentParser();
  makeExporter_ = nullptr;
  makeImporter_ = nullptr;
}

void DexParsersLoader::detachCurrentParser() {
  if (module_ != nullptr) FreeLibraryFunction(module_);
  module_ = nullptr;
}

// ---- Runs -------------------------------------------------------------------------------------------

DexParserThreadParams* DexParsersLoader::makeParams(EDirection direction,
                                                    const CVynStringT<wchar_t>& fileName,
                                                    const DexFormat* format, DexData* data, bool ownThread) {
  const bool forExport = direction == EDirection::EXPORT;
  static_cast<void>(load(direction, format));  // a failure shows as no entry point below
  DexData* const target = data != nullptr ? data : ieData_.get();
  if (target == nullptr) return nullptr;
  if (forExport ? makeExporter_ == nullptr : makeImporter_ == nullptr) return nullptr;

  DexParserThreadParams* const params = new DexParserThreadParams();
  if (params == nullptr) return nullptr;
  params->data = target;
  params->fileName = fileName;
  params->format = format;
  if (forExport) {
    params->makeParser = makeExporter_;
  } else {
    params->makeParser = makeImporter_;
  }
  params->ownThread = ownThread;
  // A host polling right after the start must not see the figures of the previous run.
  target->getProgress().begin(forExport ? DexRunProgress::EXPORT_RUN : DexRunProgress::IMPORT_RUN);
  return params;
}

EDexResult DexParsersLoader::importInTheSameThread(const CVynStringT<wchar_t>& fileName,
                                                   const DexFormat* format, DexData* data) {
  DexParserThreadParams* const params = makeParams(EDirection::IMPORT, fileName, format, data, false);
  return params != nullptr ? ImportFunction(params) : DEX_RESULT_NO_PARSER;
}

EDexResult DexParsersLoader::exportInTheSameThread(const CVynStringT<wchar_t>& fileName,
                                                   const DexFormat* format, DexData* data) {
  DexParserThreadParams* const params = makeParams(EDirection::EXPORT, fileName, format, data, false);
  return params != nullptr ? exportFunction(params) : DEX_RESULT_NO_PARSER;
}

HANDLE DexParsersLoader::startImportInSeparateThread(const CVynStringT<wchar_t>& fileName,
                                                     const DexFormat* format, DexData* data) {
  return startThread(EDirection::IMPORT, makeParams(EDirection::IMPORT, fileName, format, data, true));
}

HANDLE DexParsersLoader::startExportInSeparateThread(const CVynStringT<wchar_t>& fileName,
                                                     const DexFormat* format, DexData* data) {
  return startThread(EDirection::EXPORT, makeParams(EDirection::EXPORT, fileName, format, data, true));
}

HANDLE DexParsersLoader::startThread(EDirection direction, DexParserThreadParams* params) {
  if (params == nullptr) return nullptr;
  const bool forExport = direction == EDirection::EXPORT;
  const bool bigStack =
      !forExport && params->format != nullptr && params->format->isIdEqual(kAutoCadDrawingFormatId);
  const unsigned flags = bigStack ? kReservedStackFlags : CREATE_SUSPENDED;
  const unsigned stackSize = bigStack ? kAutoCadImportStackSize : 0;

  const HANDLE thread =
      forExport ? vyn::thread::startThread(detail::kExporterLogSource, detail::kExportThreadStartLine,
                                           L"exportFunction", exportThreadFunction, params, flags, stackSize)
                : vyn::thread::startThread(detail::kImporterLogSource, detail::kImportThreadStartLine,
                                           L"ImportFunction", ImportThreadFunction, params, flags, stackSize);
  if (thread == INVALID_HANDLE_VALUE) {
    vyn_logging::vyn_err_log(
        forExport ? detail::kExporterLogSource : detail::kImporterLogSource,
        forExport ? detail::kExportThreadNotStartedLine : detail::kImportThreadNotStartedLine);
    delete params;
    return INVALID_HANDLE_VALUE;
  }
  ResumeThread(thread);
  return thread;
}

EDexResult DexParsersLoader::resultFromExitCode(DWORD exitCode) noexcept {
  return static_cast<EDexResult>(static_cast<std::int32_t>(exitCode));
}

}  // namespace vyn::ie
