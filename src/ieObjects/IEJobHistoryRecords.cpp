#include "ieObjects/IEJobHistoryRecords.h"

namespace vyn::ie {

DexObservationInfo::DexObservationInfo() = default;

DexObservationInfo::~DexObservationInfo() = default;

}  // namespace vyn::ie
