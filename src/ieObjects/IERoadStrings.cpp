#include "ieObjects/IERoadStrings.h"

#include <algorithm>

#include "hostlibs/VynLogging.h"
#include "ieObjects/IEHorizontalAlignment.h"
#include "ieObjects/IEVerticalAlignment.h"
#include "ieObjects/detail/AlignmentPartsLog.h"

namespace vyn::ie {

namespace {

// The alignment of a pair that a part of kind would be compared with; null for the other kinds.
const IDexAlignmentPart* pairMemberOfKind(const DexRoadStringPair& pair, int kind) {
  switch (kind) {
    case IDexAlignmentPart::HORIZONTAL_ALIGNMENT:
      return pair.horizontal;
    case IDexAlignmentPart::VERTICAL_ALIGNMENT:
      return pair.vertical;
    default:
      return nullptr;
  }
}

bool doesStringUse(const DexRoadString& roadString, const IDexAlignmentPart& part) {
  const int kind = part.getType();
  for (int i = 0; i < roadString.getNumberOfRoadStringPairs(); ++i) {
    const IDexAlignmentPart* const member = pairMemberOfKind(*roadString.getRoadStringPairAt(i), kind);
    if (member != nullptr && member->getName().Compare(part.getName()) == 0) return true;
  }
  return false;
}

}  // namespace

DexRoadString::~DexRoadString() = default;

void DexRoadString::addRoadStringPair(DexRoadStringPair* pair) {
  if (!pairs_.add(pair))
    vyn_logging::vyn_err_log(detail::kAlignmentPartsLogSource, detail::kRoadStringNullPairLine);
}

DexRoadStringSet::~DexRoadStringSet() = default;

void DexRoadStringSet::addRoadString(DexRoadString* roadString) {
  if (!roadStrings_.add(roadString)) {
    vyn_logging::vyn_err_log(detail::kAlignmentPartsLogSource, detail::kRoadStringSetNullStringLine);
  }
}

bool DexRoadStringSet::isAlignmentPartUsed(const IDexAlignmentPart* part) const {
  if (part == nullptr) return false;
  return std::any_of(roadStrings_.begin(), roadStrings_.end(),
                     [part](const DexRoadString* roadString) { return doesStringUse(*roadString, *part); });
}

}  // namespace vyn::ie
