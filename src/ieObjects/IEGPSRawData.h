#pragma once

#include <cstdint>

#include "hostlibs/DexApi.h"
#include "hostlibs/VynAlloc.h"
#include "hostlibs/VynString.h"
#include "hostlibs/VynTime.h"
#include "ieObjects/IECoords.h"
#include "ieObjects/IEOwnedPointer.h"
#include "ieObjects/IEPoints.h"
#include "ieObjects/IERawData.h"
#include "ieObjects/IEStation.h"
#include "ieObjects/IETimeMS.h"

// GNSS raw records (raw kind RAW_DATA_GNSS): the common base, which is at the same time a design point,
// and the base station.
//
// So far the GNSS base and the base station are here; positions, offsets, covariances, dilutions of
// precision and antenna settings are still to come.
namespace vyn::ie {

class DexGpsAntennaSettings;

// The kind of a GNSS record, as IDexGpsRawDataInterface::getGpsRawDataType() answers it.
enum EDexGpsRawDataType : std::int32_t {
  GPS_RAW_OFFSET = 0,
  GPS_RAW_BASE_STATION = 1,
  GPS_RAW_POSITION = 2,
};

// The common base of the GNSS records. A GNSS record is also a design point (object kind
// OBJECT_TYPE_GPS_RAW_POINT), so it carries a name, codes and plane coordinates like any survey point;
// the record's name is the point's name. It adds a time stamp, the time with milliseconds, the antenna
// height, a depth and the plane coordinates of the observed point.
//
// Ownership: the record owns its plane station; copy construction, assignment and clone() duplicate it.
//
// The virtual table after those of the raw record (destructor, setName, getName, getRawDataType)
// continues with setTimeMS, getTimeMS and getGpsRawDataType (the plug-in ABI).
class DEX_API IDexGpsRawDataInterface : public IDexRawDataInterface, public DexDesignPoint {
 public:
  VYN_CLASS_ALLOCATOR

  ~IDexGpsRawDataInterface() override;

  // ---- Raw record -----------------------------------------------------------------------------
  // The design point's name.
  void setName(const CVynStringT<wchar_t>& name) override { DexDesignPoint::setName(name); }
  const CVynStringT<wchar_t>& getName() const override { return DexDesignPoint::getName(); }
  // RAW_DATA_GNSS.
  ERawDataType getRawDataType() const override { return RAW_DATA_GNSS; }
  virtual void setTimeMS(const DexTimeMS& time) { timeMS_ = time; }
  virtual const DexTimeMS& getTimeMS() const { return timeMS_; }
  virtual EDexGpsRawDataType getGpsRawDataType() const = 0;

  void setTime(const base::CTime& time) override { time_ = time; }
  const base::CTime& getTime() const override { return time_; }

  // ---- Design point ---------------------------------------------------------------------------
  // OBJECT_TYPE_GPS_RAW_POINT.
  EDexObjectsType getType() override;
  // A new record of the same class; the caller owns it.
  DexObject* clone() const override = 0;

  // ---- Further data ---------------------------------------------------------------------------
  double getAntennaHeight() const noexcept { return antennaHeight_; }
  void setAntennaHeight(double height) noexcept { antennaHeight_ = height; }
  double getDepth() const noexcept { return depth_; }
  void setDepth(double depth) noexcept { depth_ = depth; }
  // Takes ownership of station (null allowed) and deletes the station held before, unless it is the
  // same pointer.
  void setPlaneStation(DexStation* station) noexcept { planeStation_.reset(station); }
  const DexStation* getPlaneStation() const noexcept { return planeStation_.get(); }

 protected:
  // Empty times, antenna height and depth 0, no plane station, and a new design point.
  IDexGpsRawDataInterface();
  IDexGpsRawDataInterface(const IDexGpsRawDataInterface&) = default;
  IDexGpsRawDataInterface& operator=(const IDexGpsRawDataInterface&) = default;

  // The design point's part, then, when target is a GNSS record, the times, antenna height, depth and
  // a copy of the plane station (none when this record has none).
  void copyCommonData(DexObject* target) const override;

 private:
  base::CTime time_;
  DexTimeMS timeMS_;
  double antennaHeight_ = 0.0;
  double depth_ = 0.0;
  DexOwnedPointer<DexStation> planeStation_;
};

// A GNSS base station: the antenna model used (referred to, not owned: the antenna settings belong to
// the exchange data), the antenna type, the earth-centred coordinates of the station (owned) and the
// virtual and physical station ids.
class DEX_API DexGpsBaseStation : public IDexGpsRawDataInterface {
 public:
  VYN_CLASS_ALLOCATOR

  // No antenna model, empty antenna type, no earth-centred coordinates, station ids 0.
  DexGpsBaseStation();
  DexGpsBaseStation(const DexGpsBaseStation&) = default;
  DexGpsBaseStation& operator=(const DexGpsBaseStation&) = default;
  ~DexGpsBaseStation() override;

  // GPS_RAW_BASE_STATION.
  EDexGpsRawDataType getGpsRawDataType() const override { return GPS_RAW_BASE_STATION; }
  DexObject* clone() const override;

  DexGpsAntennaSettings* getGpsAntennaModel() const noexcept { return gpsAntennaModel_; }
  // Stores the reference (null allowed).
  void setGpsAntennaModel(DexGpsAntennaSettings* model) noexcept { gpsAntennaModel_ = model; }
  const CVynStringT<wchar_t>& getAntennaType() const noexcept { return antennaType_; }
  void setAntennaType(const CVynStringT<wchar_t>& type) { antennaType_ = type; }
  const DexPosition3D* getXyzCoords() const noexcept { return xyzCoords_.get(); }
  // Takes ownership of coords (null allowed) and deletes the position held before, unless it is the
  // same pointer.
  void setXyzCoords(DexPosition3D* coords) noexcept { xyzCoords_.reset(coords); }
  void setStationIds(int virtualId, int physicalId) noexcept {
    virtStationId_ = virtualId;
    physStationId_ = physicalId;
  }
  int getVirtStationId() const noexcept { return virtStationId_; }
  int getPhysStationId() const noexcept { return physStationId_; }

 protected:
  // The GNSS part, then, when target is a base station, this station's own fields (a copy of the
  // earth-centred coordinates).
  void copyCommonData(DexObject* target) const override;

 private:
  DexGpsAntennaSettings* gpsAntennaModel_ = nullptr;
  CVynStringT<wchar_t> antennaType_;
  DexOwnedPointer<DexPosition3D> xyzCoords_;
  int virtStationId_ = 0;
  int physStationId_ = 0;
};

}  // namespace vyn::ie
