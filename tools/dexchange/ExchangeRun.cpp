#include "ExchangeRun.h"

#include <unistd.h>

#include <algorithm>
#include <cctype>
#include <csignal>
#include <iostream>
#include <string>
#include <vector>

#include "hostlibs/VynLogging.h"
#include "hostlibs/winport.h"
#include "ieDefinitions/IEFormatWords.h"
#include "ieDefinitions/IEFormatsData.h"
#include "ieObjects/IEData.h"
#include "ieUtils/IEAsciiFields.h"
#include "ieUtils/IEUtilsUnitWords.h"

namespace dexchange_tool {

using vyn::ie::DexFormat;
using vyn::ie::EDexResult;
using WideString = CVynStringT<wchar_t>;

bool fileExists(const std::string& path) {
  return PathFileExistsW(wide(path)) != 0;
}

std::string utf8(const WideString& text) {
  return vyn_text::toUtf8(text.view());
}

WideString wide(const std::string& text) {
  return WideString(text.c_str(), vyn_text::CP_UTF8);
}

namespace {

// The formats the shipped plug-ins read and write, with their libraries.
constexpr const wchar_t* kShippedFormats[] = {L"{A9A6A37F-F823-4509-9B41-3AC02B45CAA2}",
                                              L"{5F39DDC1-F0FD-4F27-938A-96EFF426CD60}"};
constexpr const wchar_t* kShippedImportLibrary = L"ImportParsers";
constexpr const wchar_t* kShippedExportLibrary = L"ExportParsers";

bool isShipped(const DexFormat& format) {
  return std::any_of(std::begin(kShippedFormats), std::end(kShippedFormats),
                     [&format](const wchar_t* id) { return format.isIdEqual(id); });
}

std::string lowerCase(std::string text) {
  std::transform(text.begin(), text.end(), text.begin(),
                 [](unsigned char ch) { return static_cast<char>(std::tolower(ch)); });
  return text;
}

std::string extensionOf(const std::string& path) {
  const std::size_t slash = path.find_last_of('/');
  const std::size_t dot = path.find_last_of('.');
  if (dot == std::string::npos || (slash != std::string::npos && dot < slash)) return {};
  return path.substr(dot + 1);
}

// Whether the format names the extension (lower case, no dot) as its own or in its dialog filter.
int extensionMatch(const DexFormat& format, const std::string& extension) {
  if (lowerCase(utf8(format.getExtension(false))) == extension) return 2;
  const std::string filter = lowerCase(utf8(format.getFilterExtension()));
  const std::string pattern = "*." + extension;
  for (std::size_t at = filter.find(pattern); at != std::string::npos; at = filter.find(pattern, at + 1)) {
    const std::size_t end = at + pattern.size();
    if (end == filter.size() || filter[end] == ';' || filter[end] == ')' || filter[end] == '|') return 1;
  }
  return 0;
}

const DexFormat* findByExtension(const std::string& extension, bool forExport) {
  const vyn::ie::DexFormatsData& registry = vyn::ie::getIEFormatsData();
  const DexFormat* best = nullptr;
  int bestRank = 0;
  for (unsigned int i = 0; i < registry.getNumberOfFormats(); ++i) {
    const DexFormat* format = registry.getFormatByIndex(i);
    const int match = format == nullptr ? 0 : extensionMatch(*format, extension);
    if (match == 0) continue;
    // Shipped formats first, then the own extension before a filter's, then a library for the direction.
    const int rank =
        (isShipped(*format) ? 8 : 0) + match * 2 + (format->getDllName(forExport).IsEmpty() ? 0 : 1);
    if (rank > bestRank) {
      best = format;
      bestRank = rank;
    }
  }
  return best;
}

const DexFormat* findByName(const std::string& spec) {
  const vyn::ie::DexFormatsData& registry = vyn::ie::getIEFormatsData();
  const WideString wanted = wide(spec);
  for (unsigned int i = 0; i < registry.getNumberOfFormats(); ++i) {
    const DexFormat* format = registry.getFormatByIndex(i);
    if (format != nullptr && format->getName().CompareNoCase(wanted) == 0) return format;
  }
  for (unsigned int i = 0; i < registry.getNumberOfFormats(); ++i) {
    const DexFormat* format = registry.getFormatByIndex(i);
    if (format != nullptr && format->getTitle().CompareNoCase(wanted) == 0) return format;
  }
  return nullptr;
}

// A copy of a shipped format that names the shipped library for the direction the registry lacks.
std::unique_ptr<DexFormat> completedFormat(const DexFormat& format) {
  const WideString exportLibrary = format.getDllName(true);
  const WideString importLibrary = format.getDllName(false);
  return std::make_unique<DexFormat>(
      format.getGuid(), format.getName(), DexFormat::IMPORT_AND_EXPORT,
      exportLibrary.IsEmpty() ? WideString(kShippedExportLibrary) : exportLibrary,
      importLibrary.IsEmpty() ? WideString(kShippedImportLibrary) : importLibrary, format.getTitle(),
      format.getExtension(false), format.getFilterExtension(), format.getConfigurations(),
      format.getUsingModes(), format.getDataTypes(), format.getDistanceUnits(), format.getAngleUnits(),
      format.getParameters());
}

}  // namespace

std::unique_ptr<FormatChoice> FormatChoice::find(const std::string& spec, const std::string& path,
                                                 bool forExport, std::string& error) {
  const DexFormat* format = nullptr;
  if (spec.empty()) {
    const std::string extension = lowerCase(extensionOf(path));
    if (extension.empty()) {
      error = "cannot tell the format of " + path + " (no extension): name it with " +
              (forExport ? "--to" : "--from");
      return nullptr;
    }
    format = findByExtension(extension, forExport);
    if (format == nullptr) {
      error = "no format for the extension ." + extension + " of " + path;
      return nullptr;
    }
  } else if (spec.front() == '{') {
    format = vyn::ie::getIEFormatsData().getFormatById(wide(spec).GetString());
    if (format == nullptr) {
      error = "no format with the GUID " + spec;
      return nullptr;
    }
  } else {
    format = findByName(spec);
    if (format == nullptr)
      format = findByExtension(lowerCase(spec.front() == '.' ? spec.substr(1) : spec), forExport);
    if (format == nullptr) {
      error = "no format named " + spec;
      return nullptr;
    }
  }

  std::unique_ptr<FormatChoice> choice(new FormatChoice(format));
  if (format->getDllName(forExport).IsEmpty()) {
    if (!isShipped(*format)) {
      error = "the format " + utf8(format->getName()) + " cannot be " + (forExport ? "exported" : "imported");
      return nullptr;
    }
    choice->completed_ = completedFormat(*format);
    choice->format_ = choice->completed_.get();
  }
  return choice;
}

std::string FormatChoice::name() const {
  return utf8(format_->getName());
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

// The items of a comma-separated option value; empty items are kept (and then refused).
std::vector<std::string> commaItems(const std::string& list) {
  std::vector<std::string> items;
  std::size_t start = 0;
  while (start <= list.size()) {
    const std::size_t comma = std::min(list.find(',', start), list.size());
    items.push_back(list.substr(start, comma - start));
    start = comma + 1;
  }
  return items;
}

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
  if (arguments.has("fields") || arguments.has("delimiter")) {
    auto ascii = std::make_unique<vyn::ie::DexUserAsciiSettingsData>();
    if (arguments.has("fields") && !parseFields(arguments.value("fields"), *ascii, error)) return false;
    if (!arguments.has("fields")) {
      vyn::ie::ascii_fields::stringToFields(L"Name,Northing,Easting,Ht,FullCodes", ascii->fields,
                                            vyn::ie::ascii_fields::OWNER_POINTS);
    }
    if (arguments.has("delimiter") && !parseDelimiter(arguments.value("delimiter"), ascii->delimiter, error))
      return false;
    delete settings.userAsciiSettings;
    settings.userAsciiSettings = ascii.release();
  }
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
