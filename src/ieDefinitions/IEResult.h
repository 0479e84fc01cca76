#pragma once

#include <cstdint>

namespace vyn::ie {

// The result of every import, export and file-reading step. 0 or above is success: 22 is plain success
// and any other positive value is a remark that a plug-in defines and the library passes through.
// Negative values are failures.
enum EDexResult : std::int32_t {
  DEX_RESULT_OK = 22,
  DEX_RESULT_WRONG_FORMAT = -9990,    // the content is not what the format expects
  DEX_RESULT_FILE_ERROR = -9992,      // a file cannot be opened or created
  DEX_RESULT_NO_PARSER = -9993,       // no importer or exporter for the format
  DEX_RESULT_FILE_NOT_FOUND = -9995,  // the job-history file cannot be opened
  DEX_RESULT_STOPPED = -9996,         // stopped through DexData::stopProcess_
  DEX_RESULT_FAILED = -10000,         // general failure
};

constexpr bool isDexResultSuccess(EDexResult result) noexcept {
  return result >= 0;
}

}  // namespace vyn::ie
