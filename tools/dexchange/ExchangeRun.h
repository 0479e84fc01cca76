#pragma once

#include <memory>
#include <string>
#include <vector>

#include "Command.h"
#include "hostlibs/VynString.h"
#include "ieDefinitions/IEFormats.h"
#include "ieDefinitions/IEResult.h"
#include "ieUtils/IEParsersLoader.h"
#include "ieUtils/IESettings.h"

// What the convert and info commands share: finding a format, the settings from the command line,
// and one import or export run in a worker thread with a progress bar, Ctrl-C and the run's notes.
namespace dexchange_tool {

inline constexpr int kExitStopped = 130;  // the user stopped the run (Ctrl-C)

// The format a command line names for one direction. The shipped plug-ins read and write the point
// files ("CSV (Comma delimited)" and "Customizable ASCII Point Files") both ways although the
// registry lists each for one direction; for those the missing direction is completed with the
// shipped library of that direction.
class FormatChoice {
 public:
  // spec is a braced GUID, a format name or title (case ignored) or an extension; an empty spec takes
  // the extension of path. Among formats of one extension, the shipped point-file formats come first,
  // then the registry's order. Null with error when nothing fits or the format cannot be used in that
  // direction.
  static std::unique_ptr<FormatChoice> find(const std::string& spec, const std::string& path, bool forExport,
                                            std::string& error);

  const vyn::ie::DexFormat* format() const { return format_; }
  std::string name() const;

 private:
  explicit FormatChoice(const vyn::ie::DexFormat* format) : format_(format) {}

  std::unique_ptr<vyn::ie::DexFormat> completed_;
  const vyn::ie::DexFormat* format_;
};

// The run settings the options --types, --fields, --delimiter and --units give (on top of the import
// format's data kinds), with quiet notifiers and a message box that answers the overwrite question
// with allowOverwrite. False with error for a bad option value.
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

std::string utf8(const CVynStringT<wchar_t>& text);
CVynStringT<wchar_t> wide(const std::string& text);

}  // namespace dexchange_tool
