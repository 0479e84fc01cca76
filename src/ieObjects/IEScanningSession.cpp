#include "ieObjects/IEScanningSession.h"

namespace vyn::ie {

DexScanningSession::DexScanningSession() = default;

DexScanningSession::~DexScanningSession() = default;

}  // namespace vyn::ie
