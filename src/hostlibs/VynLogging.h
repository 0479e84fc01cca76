#pragma once

#include <functional>
#include <string>

#include "hostlibs/DexApi.h"

// The host error log. Every unexpected state the library meets becomes one record; a host may route
// the records to its own log by installing a sink. Records are delivered one at a time (a mutex is
// held around the sink), so runs in worker threads may log freely.
namespace vyn_logging {

// Levels: 0 for error-log records, the caller's level for LOGMESSAGE, kTraceLevel for traces.
inline constexpr int kErrorLevel = 0;
inline constexpr int kTraceLevel = 9;

struct LogRecord {
  std::wstring source;   // the library's own file, e.g. "ieUtils\IEParsersLoader"; empty for traces
  int line = 0;          // the line number the library documents for this record; 0 for traces
  std::wstring message;  // the formatted text; often empty for error-log records
  int level = kErrorLevel;
};

using LogSink = std::function<void(const LogRecord&)>;

// Replaces the sink; an empty function restores the default one, which writes one line to stderr or,
// when the environment names a file in DEXCHANGE_LOG, appends it there. A sink that logs again from
// inside itself reaches the default sink instead of deadlocking.
DEX_API void setLogSink(LogSink sink);

// One error-log record. A null source or message counts as empty.
DEX_API void vyn_err_log(const wchar_t* source, int line, const wchar_t* message = L"");

// A message of the given level with printf-style formatting (%ls for wide texts).
DEX_API void logMessage(int level, const wchar_t* format, ...);

// A trace record (level kTraceLevel) with printf-style formatting.
DEX_API void traceAlways(const wchar_t* format, ...);

}  // namespace vyn_logging

#define LOGMESSAGE(level, ...) ::vyn_logging::logMessage((level), __VA_ARGS__)
#define VYN_TRACE_ALWAYS(...) ::vyn_logging::traceAlways(__VA_ARGS__)
