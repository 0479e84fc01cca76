#include "ieUtils/detail/RunCommon.h"

#include "ieObjects/IEData.h"

namespace vyn::ie::detail {

EDexResult checkRunParams(const DexParserThreadParams& params, bool hasEntryPoint) {
  if (params.data == nullptr) return DEX_RESULT_FAILED;
  if (params.format == nullptr || !hasEntryPoint) return DEX_RESULT_NO_PARSER;
  return DEX_RESULT_OK;
}

void tellNotifier(const DexData* data, IDexFinishNotifier* DexSettings::*notifierField, EDexResult result,
                  const RunLog& log) {
  IDexFinishNotifier* const notifier = data != nullptr ? data->getSettings().*notifierField : nullptr;
  if (notifier == nullptr) {
    vyn_logging::vyn_err_log(log.source, log.noNotifierLine);
    return;
  }
  try {
    notifier->onFinished(result);
  } catch (abi::__forced_unwind&) {
    throw;
  } catch (...) {
    // The host's object failed; the run has ended all the same and must still free its block.
    vyn_logging::vyn_err_log(log.source, log.notifierThrewLine);
  }
}

}  // namespace vyn::ie::detail
