#include "ieObjects/IEAlignmentPartsDictionary.h"

#include <cstddef>
#include <utility>

#include "hostlibs/VynLogging.h"
#include "ieObjects/IEPoints.h"
#include "ieObjects/detail/AlignmentPartsLog.h"

namespace vyn::ie {

namespace {

using detail::kAlignmentPartsLogSource;

bool isKnownKind(int kind) {
  return kind >= 0 && kind < IDexAlignmentPart::kNumberOfPartTypes;
}

}  // namespace

IDexAlignmentPart::~IDexAlignmentPart() = default;

DexAlignmentPartsDictionary::~DexAlignmentPartsDictionary() = default;

DexAlignmentPartsDictionary::PartList* DexAlignmentPartsDictionary::listOf(int kind) {
  return const_cast<PartList*>(std::as_const(*this).listOf(kind));
}

const DexAlignmentPartsDictionary::PartList* DexAlignmentPartsDictionary::listOf(int kind) const {
  if (!isKnownKind(kind)) {
    vyn_logging::vyn_err_log(kAlignmentPartsLogSource, detail::kPartsUnknownKindLine);
    return nullptr;
  }
  return &parts_[static_cast<std::size_t>(kind)];
}

bool DexAlignmentPartsDictionary::addAlignmentPart(IDexAlignmentPart* part) {
  if (part == nullptr) {
    vyn_logging::vyn_err_log(kAlignmentPartsLogSource, detail::kPartsNullPartLine);
    return false;
  }
  PartList* const list = listOf(part->getType());
  if (list == nullptr) return false;
  return list->indexOf(part) >= 0 || list->add(part);
}

int DexAlignmentPartsDictionary::getNumberOfElements(int kind) const {
  const PartList* const list = listOf(kind);
  return list != nullptr ? list->count() : -1;
}

IDexAlignmentPart* DexAlignmentPartsDictionary::getAlignmentPartAt(int kind, int index) {
  return const_cast<IDexAlignmentPart*>(std::as_const(*this).getAlignmentPartAt(kind, index));
}

const IDexAlignmentPart* DexAlignmentPartsDictionary::getAlignmentPartAt(int kind, int index) const {
  const PartList* const list = listOf(kind);
  return list != nullptr ? list->at(index) : nullptr;
}

IDexAlignmentPart* DexAlignmentPartsDictionary::findAlignmentPart(int kind,
                                                                  const CVynStringT<wchar_t>& name) {
  return const_cast<IDexAlignmentPart*>(std::as_const(*this).findAlignmentPart(kind, name));
}

const IDexAlignmentPart* DexAlignmentPartsDictionary::findAlignmentPart(
    int kind, const CVynStringT<wchar_t>& name) const {
  const PartList* const list = listOf(kind);
  if (list == nullptr) return nullptr;
  return list->findFirst(
      [&name](const IDexAlignmentPart& part) { return part.getName().Compare(name) == 0; });
}

bool DexAlignmentPartsDictionary::isStartPointOfAnyPart(int kind,
                                                        const CVynStringT<wchar_t>& pointName) const {
  return parts_[static_cast<std::size_t>(kind)].findFirst([&pointName](const IDexAlignmentPart& part) {
    const DexDesignPoint* const startPoint = part.getStartPoint();
    return startPoint != nullptr && startPoint->getName().Compare(pointName) == 0;
  }) != nullptr;
}

bool DexAlignmentPartsDictionary::isPointUsedAsStartPoint(const CVynStringT<wchar_t>& pointName) const {
  return isStartPointOfAnyPart(IDexAlignmentPart::HORIZONTAL_ALIGNMENT, pointName) ||
         isStartPointOfAnyPart(IDexAlignmentPart::VERTICAL_ALIGNMENT, pointName);
}

}  // namespace vyn::ie
