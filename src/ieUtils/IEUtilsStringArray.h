#pragma once

#include "hostlibs/VynArray.h"
#include "hostlibs/VynString.h"

namespace vyn::ie::utils {

// The list of texts that the toolbox's parsers append to and its list helpers read.
using StringArray = CVynArray<CVynStringT<wchar_t>, const CVynStringT<wchar_t>&>;

}  // namespace vyn::ie::utils
