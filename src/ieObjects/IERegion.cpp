#include "ieObjects/IERegion.h"

#include "hostlibs/VynLogging.h"
#include "ieObjects/detail/RegionLog.h"

namespace vyn::ie {

DexRegion::~DexRegion() = default;

EDexObjectsType DexRegion::getType() {
  return OBJECT_TYPE_REGION;
}

const DexPositionWithBulge& DexRegion::getVertexAt(std::size_t index) const {
  if (index < vertices_.size()) return vertices_[index];
  vyn_logging::vyn_err_log(detail::kRegionLogSource, detail::kRegionVertexIndexLine);
  static const DexPositionWithBulge origin;
  return origin;
}

}  // namespace vyn::ie
