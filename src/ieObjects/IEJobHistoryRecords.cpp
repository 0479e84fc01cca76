#include "ieObjects/IEJobHistoryRecords.h"

#include "hostlibs/VynFormats.h"

namespace vyn::ie {
namespace {

constexpr int kComparedDecimals = 4;

bool equalRounded(double a, double b) {
  return vyn::math::round_prec(a, kComparedDecimals) == vyn::math::round_prec(b, kComparedDecimals);
}

bool equalNoCase(const CVynStringT<wchar_t>& a, const CVynStringT<wchar_t>& b) {
  return a.CompareNoCase(b) == 0;
}

// A new copy of *record for a target's setter, or null for none.
template <class T>
T* copyOf(const T* record) {
  return record != nullptr ? new T(*record) : nullptr;
}

// Takes the record held by a link into owned, unless it is owned already.
template <class T>
void adoptInto(DexOwnedPointer<T>& owned, T* linked) {
  if (linked != nullptr && linked != owned.get()) owned.reset(linked);
}

// The record a copied link should point at: own copy where it pointed at the source's.
template <class T>
T* redirected(T* linked, const DexOwnedPointer<T>& sourceOwned, const DexOwnedPointer<T>& ownCopy) {
  return linked != nullptr && linked == sourceOwned.get() ? ownCopy.get() : linked;
}

}  // namespace

// ---- Records --------------------------------------------------------------------------------------

DexCommonJobHistoryRecord::~DexCommonJobHistoryRecord() = default;

bool DexCommonJobHistoryRecord::operator==(const DexCommonJobHistoryRecord& other) const {
  return equalNoCase(jobName_, other.jobName_) && equalNoCase(applicationName_, other.applicationName_) &&
         equalNoCase(versionName_, other.versionName_) && equalNoCase(surveyorName_, other.surveyorName_) &&
         equalRounded(temperature_, other.temperature_) && equalRounded(pressure_, other.pressure_) &&
         equalRounded(instrHeight_, other.instrHeight_);
}

DexJobHistoryUnits::~DexJobHistoryUnits() = default;

DexBackSightJobHistoryRecord::~DexBackSightJobHistoryRecord() = default;

// ---- DexJobHistoryInterface -----------------------------------------------------------------------

DexJobHistoryInterface::DexJobHistoryInterface(int dataType)
    : dataType_(static_cast<EDexJobHistoryDataType>(dataType)) {}

DexJobHistoryInterface::~DexJobHistoryInterface() = default;

void DexJobHistoryInterface::copyJHData(DexJobHistoryInterface* target) const {
  if (target == nullptr) return;
  if (common_ != nullptr) target->setCommonJHRecord(copyOf(common_));
  if (units_ != nullptr) target->setJHUnits(copyOf(units_));
  if (backSight_ != nullptr) target->setJHBackSight(copyOf(backSight_));
  if (occupation_ != nullptr) target->setJHOccupation(copyOf(occupation_));
}

// ---- DexJobHistoryCopies --------------------------------------------------------------------------

DexJobHistoryCopies::~DexJobHistoryCopies() = default;

void DexJobHistoryCopies::adopt(DexJobHistoryInterface& links) {
  adoptInto(common_, links.common_);
  adoptInto(units_, links.units_);
  adoptInto(backSight_, links.backSight_);
  adoptInto(occupation_, links.occupation_);
}

void DexJobHistoryCopies::redirect(const DexJobHistoryCopies& source, DexJobHistoryInterface& links) const {
  links.common_ = redirected(links.common_, source.common_, common_);
  links.units_ = redirected(links.units_, source.units_, units_);
  links.backSight_ = redirected(links.backSight_, source.backSight_, backSight_);
  links.occupation_ = redirected(links.occupation_, source.occupation_, occupation_);
}

// ---- DexObservationInfo ---------------------------------------------------------------------------

DexObservationInfo::DexObservationInfo() = default;

DexObservationInfo::~DexObservationInfo() = default;

}  // namespace vyn::ie
