#include "ieObjects/IERawDataEquipment.h"

namespace vyn::ie {

DexRawDataEquipment::~DexRawDataEquipment() = default;

IDexEquipment::~IDexEquipment() = default;

}  // namespace vyn::ie
