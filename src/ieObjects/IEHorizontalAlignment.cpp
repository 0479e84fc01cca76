#include "ieObjects/IEHorizontalAlignment.h"

namespace vyn::ie {

// Out of line so that each class has one virtual table and type identity, in the library.
IDexAlignmentStaEq::~IDexAlignmentStaEq() = default;

DexHorizontalAlignment::DexHorizontalAlignment() = default;

DexHorizontalAlignment::~DexHorizontalAlignment() = default;

}  // namespace vyn::ie
