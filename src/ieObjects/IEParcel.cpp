#include "ieObjects/IEParcel.h"

#include "hostlibs/VynLogging.h"
#include "ieObjects/detail/ParcelLog.h"

namespace vyn::ie {

DexParcel::~DexParcel() = default;

EDexObjectsType DexParcel::getType() {
  return OBJECT_TYPE_PARCEL;
}

void DexParcel::setHAlignment(DexHorizontalAlignment* alignment) {
  if (alignment == nullptr) {
    vyn_logging::vyn_err_log(detail::kParcelLogSource, detail::kParcelNullAlignmentLine);
    return;
  }
  hAlignment_ = alignment;
}

}  // namespace vyn::ie
