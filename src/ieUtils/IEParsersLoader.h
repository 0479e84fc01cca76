#pragma once

#include <memory>
#include <variant>

#include "hostlibs/DexApi.h"
#include "hostlibs/VynAlloc.h"
#include "hostlibs/VynString.h"
#include "hostlibs/winport.h"
#include "ieDefinitions/IEFormats.h"
#include "ieDefinitions/IEResult.h"
#include "ieUtils/IExporter.h"
#include "ieUtils/IImporter.h"

// The parsers loader: the one class a host uses to run an import or an export through the parser
// plug-in a format names.

namespace vyn::ie {

class DexData;
struct DexSettings;

// The entry point a run calls: "MakeImporter" for imports, "MakeExporter" for exports. ImportFunction
// runs only an importer entry point and exportFunction only an exporter one; any other content counts as
// no entry point.
using DexMakeParser = std::variant<std::monostate, MakeImporterFunction, MakeExporterFunction>;

// The block the loader hands to ImportFunction or exportFunction: one per run, on the heap (also for
// runs in the caller's thread), freed by the run function.
struct DEX_API DexParserThreadParams {
  VYN_CLASS_ALLOCATOR

  DexData* data = nullptr;            // the container to fill or to write; not owned
  CVynStringT<wchar_t> fileName;      // a copy of the caller's file name
  const DexFormat* format = nullptr;  // the format; not owned
  DexMakeParser makeParser;           // the held library's entry point
  bool ownThread = false;             // the run has a thread of its own: its end goes to the notifier
};

// Loads the plug-in library a format names, keeps it while further runs use the same library, and runs
// one import or export in the caller's thread or in a new thread. It may own the data container that
// the host fills before an export or reads after an import (initIEData).
//
// Ownership: the loader owns the container it created (deleted with the loader) and the library it
// holds (released with the loader, after the container, so that no object made by the plug-in
// outlives its code). At most one plug-in library is held at a time: loading a different library
// releases the held one and forgets both of its entry points first; consecutive runs of formats that
// name the same library reuse it without loading it again. A switch between import and export reloads
// the library even when both directions name the same one. Neither copied nor assigned.
//
// Threads: a started run works in its own thread. Until it has ended (its handle is signalled, or the
// notifier has been told), the host must keep the loader, the data and the format alive, must not start
// another run through this loader, and must leave the data alone except for DexData::stopProcess_ and
// the data's progress record (DexData::getProgress()). The notifiers are told in the worker thread.
class DEX_API DexParsersLoader {
 public:
  VYN_CLASS_ALLOCATOR

  // Holds no library and no container.
  DexParsersLoader();
  // Deletes the container it owns, then releases the held library.
  virtual ~DexParsersLoader();
  DexParsersLoader(const DexParsersLoader&) = delete;
  DexParsersLoader& operator=(const DexParsersLoader&) = delete;

  // ---- The data container ---------------------------------------------------------------------------
  // Creates the loader's own container from the settings on the first call; later calls hand the
  // settings to the existing container (DexData::setSettings).
  void initIEData(const DexSettings& settings);
  // The loader's own container; null (with an error-log record, ieUtils\IEParsersLoader line 132) when
  // initIEData has not been called.
  DexData* getIEData();

  // ---- Plug-in libraries ----------------------------------------------------------------------------
  // Makes the import (export) library of the format the held library and takes its "MakeImporter"
  // ("MakeExporter"); true when the entry point is available. The held library is reused when its
  // entry point for this direction is held and the name is the same (exact comparison). A null format
  // answers false and changes nothing. A library that cannot be loaded, or lacks the entry point,
  // leaves no library held, an error-log record (ieUtils\IEParsersLoader, line 100 for imports, 52 for
  // exports) and false.
  bool loadImporter(const DexFormat* format);
  bool loadExporter(const DexFormat* format);
  // Why the last load that failed failed, as the system tells it (for a message to the user); empty
  // after a successful load.
  const CVynStringT<wchar_t>& getLastLoadError() const noexcept { return lastLoadError_; }

  // ---- Runs -----------------------------------------------------------------------------------------
  // In all four a null data means the loader's own container. They load (or reuse) the format's
  // library first.

  // One import (export) in the caller's thread; its result. DEX_RESULT_NO_PARSER when there is no
  // container at all or no entry point is held (the library could not be loaded); the run's result
  // otherwise (see ImportFunction and exportFunction). No notifier is told.
  EDexResult importInTheSameThread(const CVynStringT<wchar_t>& fileName, const DexFormat* format,
                                   DexData* data);
  EDexResult exportInTheSameThread(const CVynStringT<wchar_t>& fileName, const DexFormat* format,
                                   DexData* data);

  // Starts one import (export) in a new thread and returns its handle at once; the run's result comes
  // to the settings' import (export) notifier, told in the worker thread, and is the thread's exit code
  // (resultFromExitCode). The caller owns the handle and closes it with CloseHandle. Null, and nothing
  // started, when there is no container at all or no entry point is held; INVALID_HANDLE_VALUE when the
  // thread cannot be created (error-log record ieUtils\IImporter line 48, or ieUtils\IExporter line 41).
  // Imports of the AutoCAD drawing format run on a thread with 1 MiB of stack reserved; the others on
  // the system's default.
  HANDLE startImportInSeparateThread(const CVynStringT<wchar_t>& fileName, const DexFormat* format,
                                     DexData* data);
  HANDLE startExportInSeparateThread(const CVynStringT<wchar_t>& fileName, const DexFormat* format,
                                     DexData* data);

  // The result a run's thread ended with, from its exit code (GetExitCodeThread): the 32 bits read back
  // as a signed EDexResult. Wait for the handle first: until the thread ends its exit code is
  // STILL_ACTIVE (259), which a plug-in's remark 259 cannot be told apart from.
  static EDexResult resultFromExitCode(DWORD exitCode) noexcept;

 private:
  enum class EDirection { IMPORT, EXPORT };

  bool load(EDirection direction, const DexFormat* format);
  // Releases the held library and forgets both entry points.
  void releaseHeldLibrary();
  // Releases the held library (FreeLibraryFunction); the entry points and the name stay as they are.
  void detachCurrentParser();
  // The block of one run, or null when the run cannot start (no container, no entry point).
  DexParserThreadParams* makeParams(EDirection direction, const CVynStringT<wchar_t>& fileName,
                                    const DexFormat* format, DexData* data, bool ownThread);
  HANDLE startThread(EDirection direction, DexParserThreadParams* params);

  HINSTANCE module_;
  MakeExporterFunction makeExporter_;
  MakeImporterFunction makeImporter_;
  CVynStringT<wchar_t> currentDllName_;
  std::unique_ptr<DexData> ieData_;
  CVynStringT<wchar_t> lastLoadError_;
};

}  // namespace vyn::ie
