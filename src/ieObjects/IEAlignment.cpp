#include "ieObjects/IEAlignment.h"

#include <algorithm>
#include <cmath>
#include <cstddef>

#include "hostlibs/VynLogging.h"
#include "ieObjects/detail/AlignmentLog.h"

namespace vyn::ie {

namespace {

// Stores offset and its presence flag; a NaN clears both.
void setOptionalOffset(double offset, double& value, bool& present) noexcept {
  present = !std::isnan(offset);
  value = present ? offset : 0.0;
}

bool isPartType(int type) noexcept {
  return type >= 0 && type < IDexAlignmentPart::kNumberOfPartTypes;
}

// Whether the road-string set names part in one of its pairs. The model has no road-string set class
// yet, so no set can name a part; the road strings answer this once they exist.
bool isNamedByRoadStringSet(const IDexAlignmentPart& /*roadStringSet*/, const IDexAlignmentPart& /*part*/) {
  return false;
}

}  // namespace

DexAlignment::DexAlignment() = default;

DexAlignment::~DexAlignment() = default;

EDexObjectsType DexAlignment::getType() {
  return OBJECT_TYPE_ALIGNMENT;
}

void DexAlignment::setCorridorLeftOffset(double offset) {
  setOptionalOffset(offset, corridorLeftOffset_, hasCorridorLeftOffset_);
}

void DexAlignment::setCorridorRightOffset(double offset) {
  setOptionalOffset(offset, corridorRightOffset_, hasCorridorRightOffset_);
}

void DexAlignment::setAlignmentPart(IDexAlignmentPart* part) {
  if (part == nullptr) {
    vyn_logging::vyn_err_log(detail::kAlignmentLogSource, detail::kAlignmentNullPartLine);
    return;
  }
  const int type = part->getType();
  if (isPartType(type) && primaryParts_[static_cast<std::size_t>(type)] == nullptr) {
    primaryParts_[static_cast<std::size_t>(type)] = part;
  }
  parts_.push_back(part);
}

IDexAlignmentPart* DexAlignment::getAlignmentPart(int type) const {
  if (!isPartType(type)) {
    vyn_logging::vyn_err_log(detail::kAlignmentLogSource, detail::kAlignmentPartTypeLine);
    return nullptr;
  }
  return primaryParts_[static_cast<std::size_t>(type)];
}

bool DexAlignment::isAlignPartIncluded(const IDexAlignmentPart* part, bool deep) const {
  if (part == nullptr) return false;
  return std::any_of(parts_.begin(), parts_.end(), [part, deep](const IDexAlignmentPart* entry) {
    return entry == part || (deep && entry->getType() == IDexAlignmentPart::ROAD_STRING_SET &&
                             isNamedByRoadStringSet(*entry, *part));
  });
}

IDexAlignmentPart* DexAlignment::getAlignmentPartAt(int index) const noexcept {
  return index >= 0 && index < getNumberOfAlignmentParts() ? parts_[static_cast<std::size_t>(index)]
                                                           : nullptr;
}

bool DexAlignment::getStnInterval(double& interval) const {
  if (!(stnInterval_ > 0.0)) return false;
  interval = stnInterval_;
  return true;
}

bool DexAlignment::setStnInterval(double interval) {
  if (!(interval > 0.0)) return false;
  stnInterval_ = interval;
  return true;
}

}  // namespace vyn::ie
