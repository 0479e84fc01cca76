#include "ieObjects/IEHorizontalAlignment.h"

namespace vyn::ie {

DexHorizontalAlignment::DexHorizontalAlignment() = default;

// Out of line so that the elements are copied by the library's own copy policy.
DexHorizontalAlignment::DexHorizontalAlignment(const DexHorizontalAlignment&) = default;

DexHorizontalAlignment& DexHorizontalAlignment::operator=(const DexHorizontalAlignment&) = default;

DexHorizontalAlignment::~DexHorizontalAlignment() = default;

bool DexHorizontalAlignment::addSegment(IDexAlignmentObjInterface* element) {
  return segments_.add(element);
}

bool DexHorizontalAlignment::insertSegmentAt(int index, IDexAlignmentObjInterface* element) {
  return segments_.insert(index, element);
}

bool DexHorizontalAlignment::removeSegmentAt(int index) {
  return segments_.detach(index) != nullptr;
}

}  // namespace vyn::ie
