#pragma once

#include "hostlibs/DexApi.h"

namespace vyn::ie {

// The version of libdexchange, "major.minor.patch".
DEX_API const char* getLibraryVersionString() noexcept;

}  // namespace vyn::ie
