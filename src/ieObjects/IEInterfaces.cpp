#include "ieObjects/IEInterfaces.h"

namespace vyn::ie {

// Out of line so that each interface has one virtual table and type identity, in the library.
IDexNameInterface::~IDexNameInterface() = default;
IDexIdInterface::~IDexIdInterface() = default;
IDexStateInterface::~IDexStateInterface() = default;
IDexTimeInterface::~IDexTimeInterface() = default;
IDexObjInterface::~IDexObjInterface() = default;

}  // namespace vyn::ie
