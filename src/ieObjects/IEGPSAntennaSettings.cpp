#include "ieObjects/IEGPSAntennaSettings.h"

namespace vyn::ie {

DexGpsAntennaSettings::~DexGpsAntennaSettings() = default;

}  // namespace vyn::ie
