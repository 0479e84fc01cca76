#include "ieUtils/IEVersion.h"

namespace vyn::ie {

const char* getLibraryVersionString() noexcept {
  return DEXCHANGE_VERSION_STRING;
}

}  // namespace vyn::ie
