#include "ieObjects/IEJobHistory.h"

namespace vyn::ie {

DexJobHistory::DexJobHistory(DexDataDictionary* codeLibrary) : codeLibrary_(codeLibrary) {}

DexJobHistory::~DexJobHistory() = default;

}  // namespace vyn::ie
