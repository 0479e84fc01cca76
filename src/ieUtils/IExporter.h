#pragma once

#include "hostlibs/DexApi.h"
#include "hostlibs/VynAlloc.h"
#include "hostlibs/VynString.h"
#include "hostlibs/winport.h"
#include "ieDefinitions/IEFormats.h"
#include "ieDefinitions/IEResult.h"

// The exporter side of a parser plug-in: the interface the loader runs, the base every exporter derives
// from with its step driver, the overwrite question, the plug-in's "MakeExporter" entry point, and the
// run function of one export.

namespace vyn::ie {

class DexData;
class IDexExporter;
class IDexMessageBox;
struct DexParserThreadParams;

// ---- The run of one export ------------------------------------------------------------------------

// Runs one export described by params and returns its result; params is freed in every case (it must
// come from new, as DexParsersLoader makes it). The steps:
//  - no data gives DEX_RESULT_FAILED, no format or no "MakeExporter" DEX_RESULT_NO_PARSER;
//  - the data's list of exported files is emptied: it names the files of this export only (a stop
//    must never delete the files of an earlier export of the same container);
//  - a format with MULTIPLE_FILES_EXP whose settings request points, point lists, lines or areas has
//    its datasets split by code (DexData::prepareDatasetsForMultipleFilesExport) and is written one
//    file per dataset: the file name is taken as a folder, each file is named after its dataset (made
//    valid as a file name) with the format's extension, and each dataset is made current and handed
//    to an exporter of its own. The first failure ends the run with it (a plug-in that makes no
//    exporter: DEX_RESULT_NO_PARSER); otherwise the result is 0 until a dataset answers above 0, and
//    the first answer other than 0 and 22 stays (22 then 5 gives 5; 5 then 7 gives 5);
//  - otherwise one exporter writes the file name given; none gives DEX_RESULT_NO_PARSER;
//  - a result of DEX_RESULT_STOPPED deletes every file in the data's list of exported files (each
//    name once; a file that cannot be deleted leaves the trace "file <name> cannot be removed" and the
//    others are still tried);
//  - for a run in a thread of its own (params->ownThread) the export notifier of the data's settings
//    is told the result in this thread; without a notifier an error-log record (ieUtils\IExporter,
//    line 141) is written instead.
// Nothing a plug-in throws leaves the function: an exception from making, running or deleting an
// exporter ends the run with DEX_RESULT_FAILED and one error-log record (ieUtils\IExporter, line 901);
// one from the notifier leaves the result as it was and one record (line 902).
// A null params gives DEX_RESULT_FAILED.
DEX_API EDexResult exportFunction(DexParserThreadParams* params);

// exportFunction as a thread function (vyn::thread::ThreadFunction): its exit code is the result, an
// EDexResult stored in 32 bits (read it back with DexParsersLoader::resultFromExitCode).
DEX_API unsigned exportThreadFunction(void* params);

// ---- Interfaces ------------------------------------------------------------------------------------

// What the loader runs: one exporter writes the data container to one file, once, and is then deleted
// by the library through the virtual destructor. Only exportFunction calls doExport.
class DEX_API IDexExporter {
 public:
  VYN_CLASS_ALLOCATOR

  // Virtual operations, in this order (the plug-in ABI): the destructor, doExport.
  virtual ~IDexExporter();

 protected:
  // Writes the file and returns the result: DEX_RESULT_OK, another value of 0 or above for a success
  // with a remark of the plug-in's own, or a negative failure; DEX_RESULT_STOPPED when the user
  // stopped the export.
  virtual EDexResult doExport() = 0;

  IDexExporter() = default;
  IDexExporter(const IDexExporter&) = default;
  IDexExporter& operator=(const IDexExporter&) = default;

 private:
  friend EDexResult exportFunction(DexParserThreadParams* params);
};

// The base of every exporter: the container to write, the file and the format, and a step driver
// (doExport) that calls singleStep() until it answers false and checks the stop flag after every step.
// Nothing is owned: the container and the format belong to the caller of the run.
//
// A derived exporter:
//  - answers getNumberOfSteps() with the number of steps it expects (asked after every step, for the
//    progress record, so keep it cheap);
//  - carries out one step per singleStep() call and sets currentStep to the index of that step (0 for
//    the first; it is -2 before), answering false when there is nothing more to do or it cannot go on.
//    An export whose currentStep is still below 0 at the end counts as one that never carried out a
//    step (DEX_RESULT_FILE_ERROR), and the progress record reports currentStep + 1 steps done;
//  - reports a failure or a remark by setting ieResult before its last step answers false;
//  - asks utils::isExportFileWithSameName before it creates a file, and records every file it creates
//    with data->addFileNameToExported(name), so that a stopped export can delete it.
class DEX_API DexExporterImpl : public IDexExporter {
 public:
  VYN_CLASS_ALLOCATOR

  // Copies all five fields; the copy shares the container and the format.
  DexExporterImpl(const DexExporterImpl& other) = default;
  DexExporterImpl& operator=(const DexExporterImpl& other) = default;

  DexData* getData() const { return data; }
  const CVynStringT<wchar_t>& getFileName() const { return fileName; }
  const DexFormat* getFormat() const { return format; }
  int getCurrentStep() const { return currentStep; }

 protected:
  // Stores the fields; currentStep -2, ieResult DEX_RESULT_OK.
  DexExporterImpl(DexData* data, const CVynStringT<wchar_t>& fileName, const DexFormat* format);

  // Virtual operations, in this order (the plug-in ABI), after IDexExporter's destructor.
  ~DexExporterImpl() override;
  // The driver: calls singleStep() and, after every call, publishes the step to the data's progress
  // record and returns DEX_RESULT_STOPPED at once when DexData::stopProcess_ is set; goes on while
  // singleStep() answers true. Then DEX_RESULT_FILE_ERROR when no step was carried out (currentStep
  // still below 0), otherwise getIEResult().
  EDexResult doExport() override;
  // The number of steps the export will take, for a progress display.
  virtual int getNumberOfSteps() = 0;
  // Carries out the next step and advances currentStep; false when there is nothing more to do or the
  // export cannot go on.
  virtual bool singleStep() = 0;
  // The result to report: ieResult.
  virtual EDexResult getIEResult() const;

  DexData* data;                  // the container to write; not owned
  CVynStringT<wchar_t> fileName;  // the file to write (for one file per dataset, this dataset's file)
  const DexFormat* format;        // the format being written; not owned
  int currentStep;                // the step last carried out; -2 before the export starts
  EDexResult ieResult;            // the result to report; DEX_RESULT_OK
};

// ---- The plug-in's entry point ---------------------------------------------------------------------

// The type of "MakeExporter": a new exporter of the data to the file in that format, owned by the
// caller (the library deletes it after the run), or null when the plug-in does not export the format.
using MakeExporterFunction = IDexExporter* (*)(DexData* data, const CVynStringT<wchar_t>& fileName,
                                               const DexFormat* format);

// The export name the loader looks up.
inline constexpr const char* kMakeExporterEntryPoint = "MakeExporter";

// ---- The overwrite question -------------------------------------------------------------------------

namespace utils {

// Whether an exporter may write fileName: true at once when no file or folder of that name exists.
// Otherwise the user is asked about the path shortened for display (FileFuncs::CompactPath): through
// messageBox->confirmOverwrite(parentWindow, shortPath) when a message box is given (its plain, non-const
// form: the one a host implements), else through vyn_ui::msg_ui().question("File <short path> already
// exists. Overwrite?", 0). True only for the answer IDYES (6); an exception from the message box counts
// as a refusal. Exporters pass the settings' messageBox and parentWindow.
DEX_API bool isExportFileWithSameName(const CVynStringT<wchar_t>& fileName, const IDexMessageBox* messageBox,
                                      HWND parentWindow);

}  // namespace utils

}  // namespace vyn::ie

// Defines a plug-in's "MakeExporter" with C linkage, exported, and with the exact parameter types the
// loader calls it with; the arguments name the parameters:
//
//   DEX_MAKE_EXPORTER(data, fileName, format) {
//     if (format == nullptr || !format->isIdEqual(kMyFormatId)) return nullptr;
//     return new MyExporter(data, fileName, format);
//   }
// NOLINTBEGIN(bugprone-macro-parentheses): the arguments are parameter names
#define DEX_MAKE_EXPORTER(data, fileName, format)           \
  extern "C" DEX_API ::vyn::ie::IDexExporter* MakeExporter( \
      ::vyn::ie::DexData* data, const CVynStringT<wchar_t>& fileName, const ::vyn::ie::DexFormat* format)
// NOLINTEND(bugprone-macro-parentheses)
