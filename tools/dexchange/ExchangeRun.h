#pragma once

#include <string>
#include <vector>

#include "Command.h"
#include "FormatChoice.h"
#include "hostlibs/VynString.h"
#include "ieDefinitions/IEFormats.h"
#include "ieDefinitions/IEResult.h"
#include "ieUtils/IEParsersLoader.h"
#include "ieUtils/IESettings.h"

// What the convert and info commands share: their options, the settings from the command line, and
// one import or export run in a worker thread with a progress bar, Ctrl-C and the run's notes.
namespace dexchange_tool {

inline constexpr int kExitStopped = 130;  // the user stopped the run (Ctrl-C)

// The options of the file read (info, and convert's IN): --from, --types, --fields, --order,
// --delimiter, --units; and --json.
std::vector<Option> inputOptions();
Option jsonOption();

// The run settings the options --types, --fields or --order, --delimiter and --units give (on top of
// the import format's data kinds), with quiet notifiers and a message box that answers the overwrite
// question with allowOverwrite. Without --delimiter the importer finds the delimiter in the file.
// False with error for a bad option value.
bool makeSettings(const Arguments& arguments, const vyn::ie::DexFormat& importFormat, bool allowOverwrite,
                  vyn::ie::DexSettings& settings, std::string& error);

// One run in a worker thread through the loader's own container: a progress bar on a terminal
// (stderr), Ctrl-C sets the stop flag. The run's trace and log records are kept in notes.
struct RunOutcome {
  vyn::ie::EDexResult result = vyn::ie::DEX_RESULT_FAILED;
  std::vector<std::string> notes;
};
RunOutcome runInWorker(vyn::ie::DexParsersLoader& loader, bool exportRun, const std::string& path,
                       const vyn::ie::DexFormat& format);

// The failure line of a result (empty for a success) and the exit code it ends the tool with.
std::string failureText(vyn::ie::EDexResult result, bool exportRun, const std::string& path,
                        const std::string& formatName, const vyn::ie::DexParsersLoader& loader);
int exitCodeOf(vyn::ie::EDexResult result);

// Writes the notes of a run as "dexchange: note: ..." lines (at most a few).
void printNotes(ToolStreams& streams, const RunOutcome& outcome);

// Whether a file or folder of that (UTF-8) path exists.
bool fileExists(const std::string& path);

}  // namespace dexchange_tool
