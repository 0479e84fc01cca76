#include "ieObjects/IECrossSections.h"

namespace vyn::ie {

DexRoadTemplate::~DexRoadTemplate() = default;

DexRoadTemplatesDictionary::~DexRoadTemplatesDictionary() = default;

}  // namespace vyn::ie
