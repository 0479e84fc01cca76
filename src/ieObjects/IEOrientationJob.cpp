#include "ieObjects/IEOrientationJob.h"

namespace vyn::ie {

DexOrientationJob::DexOrientationJob() = default;

DexOrientationJob::~DexOrientationJob() = default;

}  // namespace vyn::ie
