#pragma once

#include <ostream>

#include "hostlibs/VynString.h"
#include "support/TempDir.h"

namespace vyn_text {

// Lets GoogleTest show a CVynStringT in a failure message as readable text.
inline void PrintTo(const CVynStringT<wchar_t>& text, std::ostream* out) {
  *out << "L\"" << dex_test::narrow(text.view()) << '"';
}

}  // namespace vyn_text
