#include "ieObjects/IEFindChainage.h"

#include <cstddef>

namespace vyn::ie {

// ---- DexFindChainage -----------------------------------------------------------------------------

DexFindChainage::~DexFindChainage() = default;

void DexFindChainage::setData(int kind, double value) {
  data_.set(kind, value);
  if (kind == CUT) cutUsed_ = true;
}

// ---- DexFindChainageReport -----------------------------------------------------------------------

DexFindChainageReport::DexFindChainageReport() = default;

DexFindChainageReport::DexFindChainageReport(const DexFindChainageReport& other)
    : roadName_(other.roadName_) {
  findChainages_.reserve(other.findChainages_.size());
  for (const auto& record : other.findChainages_) {
    findChainages_.emplace_back(record ? new DexFindChainage(*record) : nullptr);
  }
}

DexFindChainageReport& DexFindChainageReport::operator=(const DexFindChainageReport& other) {
  if (&other != this) {
    DexFindChainageReport copy(other);
    findChainages_.swap(copy.findChainages_);
    roadName_ = other.roadName_;
  }
  return *this;
}

DexFindChainageReport::~DexFindChainageReport() = default;

void DexFindChainageReport::addFindChainage(DexFindChainage* record) {
  findChainages_.emplace_back(record);
}

DexFindChainage* DexFindChainageReport::getFindChainageAt(int index) noexcept {
  return index >= 0 && index < getNumberOfFindChainages()
             ? findChainages_[static_cast<std::size_t>(index)].get()
             : nullptr;
}

const DexFindChainage* DexFindChainageReport::getFindChainageAt(int index) const noexcept {
  return const_cast<DexFindChainageReport*>(this)->getFindChainageAt(index);
}

// ---- DexSurveyXSection ---------------------------------------------------------------------------

DexSurveyXSection::DexSurveyXSection() = default;

DexSurveyXSection::~DexSurveyXSection() = default;

}  // namespace vyn::ie
