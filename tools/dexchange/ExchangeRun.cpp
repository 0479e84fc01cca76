#include "ExchangeRun.h"

#include <unistd.h>

#include <algorithm>
#include <cctype>
#include <csignal>
#include <iostream>
#include <string>
#include <vector>

#include "ToolText.h"
#include "hostlibs/VynLogging.h"
#include "hostlibs/winport.h"
#include "ieDefinitions/IEFormatWords.h"
#include "ieDefinitions/IEFormatsData.h"
#include "ieObjects/IEData.h"
#include "ieUtils/IEAsciiFields.h"
#include "ieUtils/IEUtilsUnitWords.h"
#include "pointfiles/LayoutFinding.h"
#include "pointfiles/PointLayout.h"

namespace dexchange_tool {

using vyn::ie::DexFormat;
using vyn::ie::EDexResult;
using WideString = CVynStringT<wchar_t>;

bool fileExists(const std::string& path) {
  return PathFileExistsW(wide(path)) != 0;
}

std::vector<Option> inputOptions() {
  return {
      {"from", "FORMAT",
       "the format of the file read: a braced GUID, a registry index, a format name\n"
       "or title (or a unique beginning of one, case ignored), or an extension\n"
       "(default: the extension of the file)"},
      {"types", "LIST", "the data kinds to exchange (POINTS,LINES,...; default: those of the format)"},
      {"fields", "LIST",
       "the columns of a point file, as point field names\n"
       "(\"Name,Northing,Easting,Ht,Codes&Strings\"); NAME:WIDTH gives a column width\n"
       "and makes the lines fixed-width"},
      {"order", "ORDER",
       "the columns of a point file as an order name: PNEZD, PENZD, PNEZ, PENZ, NEZ,\n"
       "ENZ, PNE, PEN, ... (P name, N northing, E easting, Z height, D code)"},
      {"delimiter", "C",
       "the delimiter of a point file: one character, or tab, space, comma,\n"
       "semicolon, pipe (default: found from the first lines)"},
      {"units", "UNIT",
       "the distance unit of the files (METERS, USFEET, IFEET, ...; default: as in the file)"},
  };
}

Option jsonOption() {
  return {"json", "", "print the report as JSON on stdout (schema in the README)"};
}

// ---- Settings -----------------------------------------------------------------------------------

namespace {

class QuietNotifier final : public vyn::ie::IDexFinishNotifier {
 public:
  IDexFinishNotifier* clone() const override { return new QuietNotifier(); }
  void onFinished(EDexResult) override {}
};

// Answers the overwrite question as the command line decided before the run.
class DecidedMessageBox final : public vyn::ie::IDexMessageBox {
 public:
  explicit DecidedMessageBox(bool allow) : allow_(allow) {}
  IDexMessageBox* clone() const override { return new DecidedMessageBox(allow_); }
  int confirmOverwrite(HWND, const wchar_t*) override { return allow_ ? IDYES : IDNO; }

 private:
  bool allow_;
};

bool parseTypes(const std::string& list, vyn::ie::DexSettings& settings, std::string& error) {
  settings.removeAllDataTypes();
  for (const std::string& word : commaItems(list)) {
    vyn::ie::EDexDataType type{};
    if (!vyn::ie::dataTypeFromKeyword(wide(word), type)) {
      error = "--types: unknown data kind \"" + word + "\"";
      return false;
    }
    settings.addDataType(type);
  }
  return true;
}

// "Name,Northing:12,..." : point field names, each with an optional column width after a colon.
bool parseFields(const std::string& list, vyn::ie::DexUserAsciiSettingsData& ascii, std::string& error) {
  ascii.fields.clear();
  for (std::string item : commaItems(list)) {
    int width = 0;
    if (const std::size_t colon = item.rfind(':'); colon != std::string::npos) {
      const std::string digits = item.substr(colon + 1);
      if (digits.empty() || !std::all_of(digits.begin(), digits.end(), ::isdigit) || digits.size() > 4) {
        error = "--fields: bad width in \"" + item + "\"";
        return false;
      }
      width = std::stoi(digits);
      item.resize(colon);
    }
    vyn::ie::ascii_fields::FieldList one;
    if (!vyn::ie::ascii_fields::stringToFields(wide(item), one, vyn::ie::ascii_fields::OWNER_POINTS)) {
      error = "--fields: unknown point field \"" + item + "\"";
      return false;
    }
    one.front().width = width;
    one.front().alignment = 1;
    ascii.fields.push_back(one.front());
  }
  return true;
}

bool parseDelimiter(const std::string& text, wchar_t& delimiter, std::string& error) {
  static const std::pair<const char*, wchar_t> kWords[] = {
      {"tab", L'\t'}, {"space", L' '}, {"comma", L','}, {"semicolon", L';'}, {"pipe", L'|'}};
  for (const auto& [word, ch] : kWords) {
    if (lowerCase(text) == word) {
      delimiter = ch;
      return true;
    }
  }
  const WideString wideText = wide(text);
  if (wideText.GetLength() != 1 || wideText[0] == L'"') {
    error = "--delimiter: give one character or tab, space, comma, semicolon, pipe";
    return false;
  }
  delimiter = wideText[0];
  return true;
}

// The point columns of --fields or --order into ascii; false with error for a bad list or both options.
bool parseColumns(const Arguments& arguments, vyn::ie::DexUserAsciiSettingsData& ascii, std::string& error) {
  if (arguments.has("fields") && arguments.has("order")) {
    error = "give --fields or --order, not both";
    return false;
  }
  if (arguments.has("fields")) return parseFields(arguments.value("fields"), ascii, error);
  if (!arguments.has("order") ||
      vyn::ie::point_files::fieldsFromOrder(wide(arguments.value("order")).view(), ascii.fields))
    return true;
  error = "--order: \"" + arguments.value("order") +
          "\" is no order of the letters P, N, E, Z, D (N and E required, each once), e.g. PNEZD";
  return false;
}

}  // namespace

bool makeSettings(const Arguments& arguments, const DexFormat& importFormat, bool allowOverwrite,
                  vyn::ie::DexSettings& settings, std::string& error) {
  settings.dataTypes = importFormat.getDataTypes();
  if (arguments.has("types") && !parseTypes(arguments.value("types"), settings, error)) return false;
  if (arguments.has("units")) {
    vyn::ie::EDistUnits units{};
    if (!vyn::ie::utils::distUnitsFromKeyword(wide(arguments.value("units")), units)) {
      error = "--units: unknown distance unit \"" + arguments.value("units") + "\"";
      return false;
    }
    settings.distUnits = units;
  }
  auto ascii = std::make_unique<vyn::ie::DexUserAsciiSettingsData>();
  ascii->delimiter = vyn::ie::point_files::kDelimiterToFind;
  if (!parseColumns(arguments, *ascii, error)) return false;
  if (arguments.has("delimiter") && !parseDelimiter(arguments.value("delimiter"), ascii->delimiter, error))
    return false;
  delete settings.userAsciiSettings;
  settings.userAsciiSettings = ascii.release();
  settings.importNotifier = new QuietNotifier();
  settings.exportNotifier = new QuietNotifier();
  settings.messageBox = new DecidedMessageBox(allowOverwrite);
  return true;
}

// ---- The run ------------------------------------------------------------------------------------

namespace {

void onInterrupt(int) {
  vyn::ie::DexData::stopProcess_ = true;
}

// SIGINT sets the stop flag while it lives; the flag is clear before and after.
class InterruptScope {
 public:
  InterruptScope() {
    vyn::ie::DexData::stopProcess_ = false;
    struct sigaction action {};
    action.sa_handler = onInterrupt;
    sigemptyset(&action.sa_mask);
    ::sigaction(SIGINT, &action, &previous_);
  }
  ~InterruptScope() {
    ::sigaction(SIGINT, &previous_, nullptr);
    vyn::ie::DexData::stopProcess_ = false;
  }
  InterruptScope(const InterruptScope&) = delete;
  InterruptScope& operator=(const InterruptScope&) = delete;

 private:
  struct sigaction previous_ {};
};

// Keeps the log records of the run (the sink is called from the worker thread, under the log's lock).
class NoteCollector {
 public:
  explicit NoteCollector(std::vector<std::string>& notes) {
    vyn_logging::setLogSink([&notes](const vyn_logging::LogRecord& record) {
      if (!record.message.empty()) {
        notes.push_back(vyn_text::toUtf8(record.message));
      } else {
        notes.push_back("log record " + vyn_text::toUtf8(record.source) + " line " +
                        std::to_string(record.line));
      }
    });
  }
  ~NoteCollector() { vyn_logging::setLogSink({}); }
  NoteCollector(const NoteCollector&) = delete;
  NoteCollector& operator=(const NoteCollector&) = delete;
};

class ProgressBar {
 public:
  ProgressBar(std::string label, bool shown) : label_(std::move(label)), shown_(shown) {}
  ~ProgressBar() {
    if (drawn_) std::cerr << '\r' << std::string(label_.size() + 40, ' ') << '\r' << std::flush;
  }
  ProgressBar(const ProgressBar&) = delete;
  ProgressBar& operator=(const ProgressBar&) = delete;

  void draw(double fraction) {
    if (!shown_) return;
    constexpr int kWidth = 30;
    const int percent = fraction < 0.0 ? 0 : static_cast<int>(fraction * 100.0);
    const int filled = percent * kWidth / 100;
    std::cerr << '\r' << label_ << " [" << std::string(static_cast<std::size_t>(filled), '#')
              << std::string(static_cast<std::size_t>(kWidth - filled), ' ') << "] " << percent << "%"
              << std::flush;
    drawn_ = true;
  }

 private:
  std::string label_;
  bool shown_;
  bool drawn_ = false;
};

}  // namespace

RunOutcome runInWorker(vyn::ie::DexParsersLoader& loader, bool exportRun, const std::string& path,
                       const DexFormat& format) {
  RunOutcome outcome;
  vyn::ie::DexData* data = loader.getIEData();
  if (data == nullptr) return outcome;
  const InterruptScope interrupt;
  const NoteCollector collector(outcome.notes);
  ProgressBar bar(exportRun ? "writing" : "reading", ::isatty(STDERR_FILENO) != 0);
  const WideString fileName = wide(path);
  const HANDLE thread = exportRun ? loader.startExportInSeparateThread(fileName, &format, nullptr)
                                  : loader.startImportInSeparateThread(fileName, &format, nullptr);
  if (thread == nullptr) {
    outcome.result = vyn::ie::DEX_RESULT_NO_PARSER;
    return outcome;
  }
  if (thread == INVALID_HANDLE_VALUE) return outcome;
  constexpr DWORD kRefreshMilliseconds = 100;
  while (WaitForSingleObject(thread, kRefreshMilliseconds) == WAIT_TIMEOUT)
    bar.draw(data->getProgress().getFraction());
  DWORD exitCode = 0;
  GetExitCodeThread(thread, &exitCode);
  CloseHandle(thread);
  outcome.result = vyn::ie::DexParsersLoader::resultFromExitCode(exitCode);
  return outcome;
}

std::string failureText(EDexResult result, bool exportRun, const std::string& path,
                        const std::string& formatName, const vyn::ie::DexParsersLoader& loader) {
  if (result >= 0) return {};
  switch (result) {
    case vyn::ie::DEX_RESULT_STOPPED:
      return exportRun ? "stopped; " + path + " was not written" : "stopped while reading " + path;
    case vyn::ie::DEX_RESULT_NO_PARSER: {
      const std::string why = utf8(loader.getLastLoadError());
      return "no plug-in " + std::string(exportRun ? "writes " : "reads ") + formatName +
             (why.empty() ? std::string() : " (" + why + ")");
    }
    case vyn::ie::DEX_RESULT_FILE_ERROR:
      return exportRun ? "cannot write " + path : "cannot open " + path;
    case vyn::ie::DEX_RESULT_WRONG_FORMAT:
      return path + " holds nothing readable as " + formatName;
    case vyn::ie::DEX_RESULT_FILE_NOT_FOUND:
      return path + " not found";
    default:
      return std::string(exportRun ? "writing " : "reading ") + path + " failed (result " +
             std::to_string(result) + ")";
  }
}

int exitCodeOf(EDexResult result) {
  if (result >= 0) return kExitOk;
  return result == vyn::ie::DEX_RESULT_STOPPED ? kExitStopped : kExitFailure;
}

void printNotes(ToolStreams& streams, const RunOutcome& outcome) {
  constexpr std::size_t kShownNotes = 12;
  for (std::size_t i = 0; i < outcome.notes.size() && i < kShownNotes; ++i)
    streams.err << "dexchange: note: " << outcome.notes[i] << '\n';
  if (outcome.notes.size() > kShownNotes)
    streams.err << "dexchange: note: " << outcome.notes.size() - kShownNotes << " more notes\n";
}

}  // namespace dexchange_tool
