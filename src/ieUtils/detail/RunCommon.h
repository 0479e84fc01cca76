#pragma once

#include <cxxabi.h>

#include <utility>

#include "hostlibs/VynLogging.h"
#include "ieDefinitions/IEResult.h"
#include "ieUtils/IEParsersLoader.h"
#include "ieUtils/IESettings.h"

// What the import run and the export run share: the checks of the block, the guard around plug-in
// calls and the notifier at the end.
namespace vyn::ie::detail {

// Where a run logs: its source tag and the lines of its records.
struct RunLog {
  const wchar_t* source;
  int pluginThrewLine;
  int noNotifierLine;
  int notifierThrewLine;
};

// The entry point of the run's direction held in the block, or null.
template <class MakeFunction>
MakeFunction entryPointOf(const DexParserThreadParams& params) {
  const MakeFunction* const make = std::get_if<MakeFunction>(&params.makeParser);
  return make != nullptr ? *make : nullptr;
}

// DEX_RESULT_OK when the run can go on; otherwise its result: DEX_RESULT_FAILED without data,
// DEX_RESULT_NO_PARSER without a format or an entry point.
EDexResult checkRunParams(const DexParserThreadParams& params, bool hasEntryPoint);

// The result of call(), or DEX_RESULT_FAILED with an error-log record when a plug-in throws through it.
// A thread's forced unwinding (cancellation) goes on.
template <class Call>
EDexResult guardPluginCall(const RunLog& log, Call&& call) {
  try {
    return std::forward<Call>(call)();
  } catch (abi::__forced_unwind&) {
    throw;
  } catch (...) {
    vyn_logging::vyn_err_log(log.source, log.pluginThrewLine);
    return DEX_RESULT_FAILED;
  }
}

// Tells the notifier the settings hold in the field notifierField (importNotifier or exportNotifier)
// the result. No data or no notifier: an error-log record instead. A notifier that throws: one record,
// and the run goes on.
void tellNotifier(const DexData* data, IDexFinishNotifier* DexSettings::*notifierField, EDexResult result,
                  const RunLog& log);

}  // namespace vyn::ie::detail
