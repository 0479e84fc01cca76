#include "ieObjects/IERawDataEquipment.h"

namespace vyn::ie {

DexRawDataEquipment::~DexRawDataEquipment() = default;

}  // namespace vyn::ie
