#include "hostlibs/VynLogging.h"

#include <cstdarg>
#include <cstdio>
#include <cstdlib>
#include <mutex>

#include "hostlibs/VynString.h"

namespace vyn_logging {
namespace {

std::string describe(const LogRecord& record) {
  std::string line = "dexchange";
  if (record.level == kTraceLevel) {
    line += " trace";
  } else if (record.level != kErrorLevel) {
    line += " [" + std::to_string(record.level) + "]";
  }
  if (!record.source.empty() || record.line != 0) {
    line += ": " + vyn_text::toUtf8(record.source) + "(" + std::to_string(record.line) + ")";
  }
  if (!record.message.empty()) line += ": " + vyn_text::toUtf8(record.message);
  line += '\n';
  return line;
}

void writeToDefaultSink(const LogRecord& record) {
  const std::string line = describe(record);
  const char* logFile = std::getenv("DEXCHANGE_LOG");
  if (logFile != nullptr && *logFile != '\0') {
    if (FILE* file = std::fopen(logFile, "a")) {
      std::fputs(line.c_str(), file);
      std::fclose(file);
      return;
    }
  }
  std::fputs(line.c_str(), stderr);
}

struct SinkState {
  std::mutex mutex;
  LogSink sink;
};

SinkState& state() {
  static SinkState instance;
  return instance;
}

thread_local bool insideSink = false;

void deliver(const LogRecord& record) {
  if (insideSink) {
    writeToDefaultSink(record);
    return;
  }
  SinkState& shared = state();
  const std::lock_guard<std::mutex> lock(shared.mutex);
  insideSink = true;
  try {
    if (shared.sink) {
      shared.sink(record);
    } else {
      writeToDefaultSink(record);
    }
  } catch (...) {
    // A host sink that throws must not unwind through the library; the record is lost.
  }
  insideSink = false;
}

std::wstring render(const wchar_t* format, va_list arguments) {
  CVynStringT<wchar_t> text;
  text.FormatV(format, arguments);
  return std::wstring(text.view());
}

}  // namespace

void setLogSink(LogSink sink) {
  SinkState& shared = state();
  const std::lock_guard<std::mutex> lock(shared.mutex);
  shared.sink = std::move(sink);
}

void vyn_err_log(const wchar_t* source, int line, const wchar_t* message) {
  LogRecord record;
  if (source != nullptr) record.source = source;
  record.line = line;
  if (message != nullptr) record.message = message;
  record.level = kErrorLevel;
  deliver(record);
}

void logMessage(int level, const wchar_t* format, ...) {
  va_list arguments;
  va_start(arguments, format);
  LogRecord record;
  record.message = render(format, arguments);
  va_end(arguments);
  record.level = level;
  deliver(record);
}

void traceAlways(const wchar_t* format, ...) {
  va_list arguments;
  va_start(arguments, format);
  LogRecord record;
  record.message = render(format, arguments);
  va_end(arguments);
  record.level = kTraceLevel;
  deliver(record);
}

}  // namespace vyn_logging
