#include "ieObjects/IEFindChainage.h"

namespace vyn::ie {

DexFindChainageReport::DexFindChainageReport() = default;

DexFindChainageReport::~DexFindChainageReport() = default;

DexSurveyXSection::DexSurveyXSection() = default;

DexSurveyXSection::~DexSurveyXSection() = default;

}  // namespace vyn::ie
