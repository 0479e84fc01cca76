#include "ieObjects/IEPoints.h"

#include "ieObjects/detail/ObjectStations.h"

namespace vyn::ie {

// ---- DexDesignPoint -----------------------------------------------------------------------------

DexDesignPoint::DexDesignPoint() = default;

DexDesignPoint::~DexDesignPoint() = default;

DexObject* DexDesignPoint::clone() const {
  auto* const copy = new DexDesignPoint();
  copyCommonData(copy);
  return copy;
}

void DexDesignPoint::shiftCoords(const DexPosition3D& origin, double scaleX, double scaleY, double scaleZ,
                                 double rotation) {
  station_.shiftCoords(origin, scaleX, scaleY, scaleZ, rotation);
}

DexObject::EGroupType DexDesignPoint::getGroupType() {
  return GROUP_POINTS;
}

void DexDesignPoint::copyCommonData(DexObject* target) const {
  DexObject::copyCommonData(target);
  auto* const point = dynamic_cast<DexDesignPoint*>(target);
  if (point == nullptr || point == this) return;
  point->setStation(station_);
  point->userStrings_ = userStrings_;
}

EDexObjectsType DexDesignPoint::getType() {
  return OBJECT_TYPE_DESIGN_POINT;
}

void DexDesignPoint::setStation(const DexStation& station) {
  detail::assignStationKeepingName(station_, station);
}

// ---- DexPtlPoint --------------------------------------------------------------------------------

DexPtlPoint::DexPtlPoint(const CVynStringT<wchar_t>& firstReferencePointIds,
                         const CVynStringT<wchar_t>& secondReferencePointIds, int coordType) {
  setPtlParams(firstReferencePointIds, secondReferencePointIds, coordType);
}

DexPtlPoint::~DexPtlPoint() = default;

DexObject* DexPtlPoint::clone() const {
  auto* const copy = new DexPtlPoint(firstReferencePointIds_, secondReferencePointIds_, coordType_);
  copyCommonData(copy);
  return copy;
}

EDexObjectsType DexPtlPoint::getType() {
  return OBJECT_TYPE_PTL_POINT;
}

void DexPtlPoint::setPtlParams(const CVynStringT<wchar_t>& firstReferencePointIds,
                               const CVynStringT<wchar_t>& secondReferencePointIds, int coordType) {
  firstReferencePointIds_ = firstReferencePointIds;
  secondReferencePointIds_ = secondReferencePointIds;
  coordType_ = static_cast<ECoordType>(coordType);
}

// ---- DexSheetPoint ------------------------------------------------------------------------------

DexSheetPoint::~DexSheetPoint() = default;

DexObject* DexSheetPoint::clone() const {
  auto* const copy = new DexSheetPoint();
  if (copy == nullptr) return nullptr;  // the host allocator is out of memory
  copyCommonData(copy);
  for (const DexOffsetStation* station : stations_) {
    auto* const stationCopy = new DexOffsetStation();
    if (stationCopy == nullptr) continue;
    *stationCopy = *station;
    copy->addStation(stationCopy);
  }
  copy->setName(name_);
  return copy;
}

void DexSheetPoint::shiftCoords(const DexPosition3D& origin, double scaleX, double scaleY, double scaleZ,
                                double rotation) {
  for (DexOffsetStation* station : stations_)
    station->shiftCoords(origin, scaleX, scaleY, scaleZ, rotation);
}

DexObject::EGroupType DexSheetPoint::getGroupType() {
  return GROUP_SHEET_POINTS;
}

EDexObjectsType DexSheetPoint::getType() {
  return OBJECT_TYPE_SHEET_POINT;
}

bool DexSheetPoint::changeStation(int index, const DexOffsetStation* station) {
  DexOffsetStation* const target = stations_.at(index);
  if (target == nullptr || station == nullptr) return false;
  *target = *station;
  return true;
}

}  // namespace vyn::ie
