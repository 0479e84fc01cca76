#include "ieObjects/IEGPSRawData.h"

namespace vyn::ie {

// ---- IDexGpsRawDataInterface --------------------------------------------------------------------

IDexGpsRawDataInterface::IDexGpsRawDataInterface() = default;

IDexGpsRawDataInterface::~IDexGpsRawDataInterface() = default;

EDexObjectsType IDexGpsRawDataInterface::getType() {
  return OBJECT_TYPE_GPS_RAW_POINT;
}

void IDexGpsRawDataInterface::copyCommonData(DexObject* target) const {
  DexDesignPoint::copyCommonData(target);
  auto* const record = dynamic_cast<IDexGpsRawDataInterface*>(target);
  if (record == nullptr || record == this) return;
  record->setTime(time_);
  record->setTimeMS(timeMS_);
  record->antennaHeight_ = antennaHeight_;
  record->depth_ = depth_;
  record->planeStation_ = planeStation_;
}

// ---- DexGpsBaseStation --------------------------------------------------------------------------

DexGpsBaseStation::DexGpsBaseStation() = default;

DexGpsBaseStation::~DexGpsBaseStation() = default;

DexObject* DexGpsBaseStation::clone() const {
  auto* const copy = new DexGpsBaseStation();
  if (copy == nullptr) return nullptr;  // the host allocator is out of memory
  copyCommonData(copy);
  return copy;
}

void DexGpsBaseStation::copyCommonData(DexObject* target) const {
  IDexGpsRawDataInterface::copyCommonData(target);
  auto* const station = dynamic_cast<DexGpsBaseStation*>(target);
  if (station == nullptr || station == this) return;
  station->gpsAntennaModel_ = gpsAntennaModel_;
  station->antennaType_ = antennaType_;
  station->xyzCoords_ = xyzCoords_;
  station->virtStationId_ = virtStationId_;
  station->physStationId_ = physStationId_;
}

}  // namespace vyn::ie
