#include "ieObjects/IERawData.h"

namespace vyn::ie {

// Out of line so that each class has one virtual table and type identity, in the library.
IDexRawDataInterface::~IDexRawDataInterface() = default;

DexRawNote::~DexRawNote() = default;

DexRawData::DexRawData() = default;

DexRawData::~DexRawData() = default;

}  // namespace vyn::ie
