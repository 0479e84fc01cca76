#include "ieObjects/IEVerticalAlignment.h"

#include <cstddef>
#include <utility>

#include "hostlibs/VynLogging.h"
#include "ieObjects/detail/AlignmentPartsLog.h"

namespace vyn::ie {

// ---- DexVerticalElement -------------------------------------------------------------------------

DexVerticalElement::~DexVerticalElement() = default;

double DexVerticalElement::getData(int kind) const {
  if (kind == CURVE_LENGTH && elementType_ == VERTEX) {
    vyn_logging::vyn_err_log(detail::kAlignmentPartsLogSource, detail::kVerticalElementDatumLine);
  }
  return data_.get(kind);
}

// ---- DexLongSection -----------------------------------------------------------------------------

DexLongSection::~DexLongSection() = default;

// ---- DexVerticalAlignment -----------------------------------------------------------------------

DexVerticalAlignment::DexVerticalAlignment() = default;

DexVerticalAlignment::DexVerticalAlignment(const DexVerticalAlignment& other)
    : IDexAlignmentPart(other), IDexAlignmentStaEq(other), verticalElements_(other.verticalElements_) {
  copyLongSectionsOf(other);
}

DexVerticalAlignment& DexVerticalAlignment::operator=(const DexVerticalAlignment& other) {
  if (&other != this) {
    DexVerticalAlignment copy(other);
    IDexAlignmentPart::operator=(copy);
    IDexAlignmentStaEq::operator=(copy);
    verticalElements_.swap(copy.verticalElements_);
    longSections_.swap(copy.longSections_);
  }
  return *this;
}

DexVerticalAlignment::~DexVerticalAlignment() = default;

// Runs after the elements are copied: a section tied to the element at index i of other is tied to
// the element at index i here; a parabola outside other stays as it is.
void DexVerticalAlignment::copyLongSectionsOf(const DexVerticalAlignment& other) {
  longSections_.reserve(other.longSections_.size());
  for (const auto& section : other.longSections_) {
    DexLongSection* copy = section != nullptr ? new DexLongSection(*section) : nullptr;
    if (copy != nullptr) {
      const int index = other.verticalElements_.indexOf(section->getParabola());
      if (index >= 0) copy->setParabola(verticalElements_.at(index));
    }
    addLongSection(copy);
  }
}

void DexVerticalAlignment::addLongSection(DexLongSection* section) {
  longSections_.push_back(std::unique_ptr<DexLongSection>(section));
}

const DexLongSection* DexVerticalAlignment::getLongSectionAt(int index) const noexcept {
  return index >= 0 && index < getNumberOfLongSections()
             ? longSections_[static_cast<std::size_t>(index)].get()
             : nullptr;
}

DexLongSection* DexVerticalAlignment::getLongSectionAt(int index) noexcept {
  return const_cast<DexLongSection*>(std::as_const(*this).getLongSectionAt(index));
}

const DexLongSection* DexVerticalAlignment::findLongSection(double station) const {
  for (const auto& section : longSections_) {
    if (section != nullptr && section->getData(DexLongSection::STATION) == station) return section.get();
  }
  return nullptr;
}

DexLongSection* DexVerticalAlignment::findLongSection(double station) {
  return const_cast<DexLongSection*>(std::as_const(*this).findLongSection(station));
}

}  // namespace vyn::ie
