#pragma once

#include <array>
#include <cstdint>

#include "hostlibs/DexApi.h"
#include "hostlibs/VynAlloc.h"
#include "hostlibs/VynString.h"
#include "hostlibs/VynTime.h"
#include "ieObjects/IECoords.h"
#include "ieObjects/IEOwnedPointer.h"
#include "ieObjects/IEPoints.h"
#include "ieObjects/IERawData.h"
#include "ieObjects/IERawDataEquipment.h"
#include "ieObjects/IEStation.h"
#include "ieObjects/IETSRawData.h"
#include "ieObjects/IETimeMS.h"
#include "ieObjects/IETypedValues.h"

// GNSS raw records (raw kind RAW_DATA_GNSS): the common base, which is at the same time a design point,
// the base station, the measured position with its precisions, and the points measured by offsets
// from GNSS points.
//
// Error-log records (source ieObjects\IEGPSRawData, empty message) of DexGpsDop::setCombinedDops:
// - line 385: the combined position dilution does not exceed the one component present;
// - line 412: the combined geometric dilution does not exceed the two components present;
// - line 428: the combined geometric dilution does not exceed the time dilution.
namespace vyn::ie {

struct DexGpsAntennaSettings;

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

// ---- Precisions -----------------------------------------------------------------------------------

// The covariance matrix of a GNSS position: the three variances (x or north first, then y or east,
// then z or up) and the three covariances. Zeros by default. A plain value.
struct DEX_API DexGpsCoordCovMatrix {
  VYN_CLASS_ALLOCATOR

  DexGpsCoordCovMatrix() = default;
  DexGpsCoordCovMatrix(const DexGpsCoordCovMatrix&) = default;
  DexGpsCoordCovMatrix& operator=(const DexGpsCoordCovMatrix&) = default;
  virtual ~DexGpsCoordCovMatrix();

  // Horizontal: sqrt(|variance 1| + |variance 2|).
  double getHrms() const;
  // Vertical: sqrt(|variance 3|).
  double getVrms() const;
  // sqrt of the sum of the three absolute variances.
  double getRms() const;

  std::array<double, 3> variances{};
  std::array<double, 3> covariances{};
};

// The dilutions of precision of a GNSS position: horizontal, vertical and time. 0 means not known.
struct DEX_API DexGpsDop {
  VYN_CLASS_ALLOCATOR

  DexGpsDop() = default;
  DexGpsDop(const DexGpsDop&) = default;
  DexGpsDop& operator=(const DexGpsDop&) = default;
  virtual ~DexGpsDop();

  // sqrt(hdop^2 + vdop^2).
  double getPDop() const;
  // sqrt(hdop^2 + vdop^2 + tdop^2).
  double getGDop() const;
  // Fills the components that are 0 from the combined dilutions a receiver reports:
  // 1. pdop not 0, both hdop and vdop missing: hdop = sqrt(2/3) pdop, vdop = sqrt(1/3) pdop; one of
  //    them missing: sqrt(pdop^2 - known^2) when pdop^2 exceeds known^2, else line 385.
  // 2. gdop not 0, two of the three present: the missing one (hdop first, then vdop, else tdop)
  //    becomes sqrt(gdop^2 - the sum of squares) when gdop^2 exceeds that sum, else line 412; only
  //    tdop present: p = sqrt(gdop^2 - tdop^2) gives hdop and vdop as in step 1 when |gdop| exceeds
  //    |tdop|, else line 428. Other counts change nothing.
  // A logged step changes nothing.
  void setCombinedDops(double pdop, double gdop);

  double hdop = 0.0;
  double vdop = 0.0;
  double tdop = 0.0;
};

// ---- Position -------------------------------------------------------------------------------------

// A measured GNSS position: the GNSS record with its quality (solution type, satellite counts,
// covariance matrices, dilutions of precision), its earth-centred coordinates, the vector from its
// base, the base station, the antenna and the equipment used.
//
// Ownership: the position owns its three coordinate records and its base station; copies duplicate
// them. The antenna model (an antenna of the data container) and the equipment and controller (records
// of the data container) are references.
class DEX_API DexGpsPosition : public IDexGpsRawDataInterface, public IDexEquipment {
 public:
  VYN_CLASS_ALLOCATOR

  // The solution of a position. Any value cast from a number is stored.
  enum ESolutionType : std::int32_t {
    SOLUTION_NONE = 0,         // "NO_SOLUTION"
    SOLUTION_STANDALONE = 1,   // "STANDALONE"
    SOLUTION_CODE_DIFF = 2,    // "CODE_DIFF"
    SOLUTION_FLOAT = 3,        // "FLOAT"
    SOLUTION_FIXED = 4,        // "FIXED"
    SOLUTION_FIXED_SWING = 6,  // "FIXED_SWING"
    SOLUTION_FLOAT_VRLAS = 131,
    SOLUTION_FIXED_VRLAS = 132,
    SOLUTION_USER_INPUT = 133,
  };
  // The satellite systems counted.
  enum ESatelliteSystem : std::int32_t {
    SATELLITES_GPS = 0,
    SATELLITES_GLONASS = 1,
    SATELLITES_GALILEO = 2,
    SATELLITES_BEIDOU = 3,
    SATELLITES_SBAS = 4,
    SATELLITES_QZSS = 5,
  };
  static constexpr int kNumberOfSatelliteSystems = 6;
  // A satellite count, observation duration or raw kind not known.
  static constexpr int kNoCount = -1;

  // Raw kind RAW_DATA_GNSS, zero precisions, no coordinate records, SOLUTION_NONE, satellite counts and
  // observation duration kNoCount, 0 epochs, no antenna, base station or equipment.
  DexGpsPosition();
  DexGpsPosition(const DexGpsPosition&) = default;
  DexGpsPosition& operator=(const DexGpsPosition&) = default;
  ~DexGpsPosition() override;

  // ---- Record ---------------------------------------------------------------------------------
  // The stored kind: RAW_DATA_GNSS unless set otherwise (RAW_DATA_GNSS_AND_LEVEL for a position that
  // level queries find too).
  ERawDataType getRawDataType() const override { return rawDataType_; }
  // An ERawDataType value or its number.
  void setRawDataType(int type) noexcept { rawDataType_ = static_cast<ERawDataType>(type); }
  // GPS_RAW_POSITION.
  EDexGpsRawDataType getGpsRawDataType() const override { return GPS_RAW_POSITION; }
  DexObject* clone() const override;

  // ---- Equipment (references) -----------------------------------------------------------------
  void setEquipment(const DexRawDataEquipment* equipment) override { equipment_ = equipment; }
  const DexRawDataEquipment* getEquipment() const override { return equipment_; }
  void setController(const DexRawDataEquipment* controller) override { controller_ = controller; }
  const DexRawDataEquipment* getController() const override { return controller_; }

  // ---- Antenna and base -----------------------------------------------------------------------
  // Stores the reference (null allowed).
  void setGpsAntennaModel(DexGpsAntennaSettings* model) noexcept { gpsAntennaModel_ = model; }
  DexGpsAntennaSettings* getGpsAntennaModel() const noexcept { return gpsAntennaModel_; }
  void setAntennaType(const CVynStringT<wchar_t>& type) { antennaType_ = type; }
  const CVynStringT<wchar_t>& getAntennaType() const noexcept { return antennaType_; }
  // Takes ownership of station (null allowed) and deletes the one held before, unless it is the same.
  void setBaseStation(DexGpsBaseStation* station) noexcept { baseStation_.reset(station); }
  DexGpsBaseStation* getBaseStation() noexcept { return baseStation_.get(); }
  const DexGpsBaseStation* getBaseStation() const noexcept { return baseStation_.get(); }

  // ---- Coordinates (owned) --------------------------------------------------------------------
  // Each setter takes ownership of its argument (null allowed) and deletes the position held before,
  // unless it is the same pointer.
  // Earth-centred coordinates.
  void setXyzCoords(DexPosition3D* coords) noexcept { xyzCoords_.reset(coords); }
  const DexPosition3D* getXyzCoords() const noexcept { return xyzCoords_.get(); }
  void setWACoords(DexPosition3D* coords) noexcept { waCoords_.reset(coords); }
  const DexPosition3D* getWACoords() const noexcept { return waCoords_.get(); }
  // The vector from the base.
  void setDxyz(DexPosition3D* vector) noexcept { dxyz_.reset(vector); }
  const DexPosition3D* getDxyz() const noexcept { return dxyz_.get(); }

  // ---- Quality --------------------------------------------------------------------------------
  DexGpsCoordCovMatrix& getCV() noexcept { return cv_; }
  const DexGpsCoordCovMatrix& getCV() const noexcept { return cv_; }
  void setCV(const DexGpsCoordCovMatrix& cv) { cv_ = cv; }
  // The covariance matrix in north, east, up.
  DexGpsCoordCovMatrix& getCVNeu() noexcept { return cvNeu_; }
  const DexGpsCoordCovMatrix& getCVNeu() const noexcept { return cvNeu_; }
  void setCVNeu(const DexGpsCoordCovMatrix& cv) { cvNeu_ = cv; }
  DexGpsDop& getDop() noexcept { return dop_; }
  const DexGpsDop& getDop() const noexcept { return dop_; }
  void setDop(const DexGpsDop& dop) { dop_ = dop; }

  // An ESolutionType value or its number.
  void setSolutionType(int type) noexcept { solutionType_ = static_cast<ESolutionType>(type); }
  ESolutionType getSolutionType() const noexcept { return solutionType_; }
  // The word of the solution type: "NO_SOLUTION", "STANDALONE", "CODE_DIFF", "FLOAT", "FIXED",
  // "FIXED_SWING", "FLOAT_VRLAS", "FIXED_VRLAS", "USER_INPUT"; "USER_INPUT" for a value without word.
  CVynStringT<wchar_t> getSolutionTypeAsString() const;
  // The solution type of a word, compared exactly (case-sensitive); SOLUTION_USER_INPUT for any other
  // text.
  static ESolutionType solutionTypeFromText(const CVynStringT<wchar_t>& text);

  // The satellites of a system (an ESatelliteSystem value or its number) used; kNoCount when not
  // known and for another system, which setNumberOfSatellites ignores.
  void setNumberOfSatellites(int system, int count) noexcept { satellites_.set(system, count); }
  int getNumberOfSatellites(int system) const noexcept {
    return satellites_.contains(system) ? satellites_.get(system) : kNoCount;
  }
  // The length of the observation; kNoCount when not known.
  void setObsDuration(int duration) noexcept { obsDuration_ = duration; }
  int getObsDuration() const noexcept { return obsDuration_; }
  void setNumOfEpochs(int epochs) noexcept { numOfEpochs_ = epochs; }
  int getNumOfEpochs() const noexcept { return numOfEpochs_; }
  void setRtkReset(bool reset) noexcept { rtkReset_ = reset; }
  bool getRtkReset() const noexcept { return rtkReset_; }
  // Whether the position comes from a post-processed vector.
  void setPPVector(bool ppVector) noexcept { ppVector_ = ppVector; }
  bool getPPVector() const noexcept { return ppVector_; }

 protected:
  // The GNSS part, then, when target is a position, every field of this position (copies of the
  // owned records).
  void copyCommonData(DexObject* target) const override;

 private:
  DexGpsAntennaSettings* gpsAntennaModel_ = nullptr;
  ERawDataType rawDataType_ = RAW_DATA_GNSS;
  DexGpsCoordCovMatrix cv_;
  DexGpsCoordCovMatrix cvNeu_;
  DexGpsDop dop_;
  DexOwnedPointer<DexPosition3D> xyzCoords_;
  DexOwnedPointer<DexPosition3D> waCoords_;
  DexOwnedPointer<DexPosition3D> dxyz_;
  ESolutionType solutionType_ = SOLUTION_NONE;
  DexTypedArray<ESatelliteSystem, kNumberOfSatelliteSystems, int> satellites_{kNoCount};
  int obsDuration_ = kNoCount;
  int numOfEpochs_ = 0;
  CVynStringT<wchar_t> antennaType_;
  DexOwnedPointer<DexGpsBaseStation> baseStation_;
  bool rtkReset_ = false;
  bool ppVector_ = false;
  const DexRawDataEquipment* equipment_ = nullptr;
  const DexRawDataEquipment* controller_ = nullptr;
};

// ---- Offsets --------------------------------------------------------------------------------------

// A point measured by offsets from GNSS points: the GNSS record with the offset measurement (a
// total-station value record, owned and duplicated by copies). The kinds give the reference points.
//
// The virtual table continues after the GNSS record's with getOffsetType, then each kind's setters and
// getters.
class DEX_API DexGpsOffset : public IDexGpsRawDataInterface {
 public:
  VYN_CLASS_ALLOCATOR

  // The offset methods.
  enum EOffsetType : std::int32_t {
    OFFSET_AZIMUTH_DISTANCE = 0,  // DexAzimuthDistanceGpsOffset
    OFFSET_POINT_TO_LINE = 1,     // DexPtlGpsOffset
    OFFSET_TWO_DISTANCES = 2,     // DexTwoDistGpsOffset
  };

  ~DexGpsOffset() override;

  // GPS_RAW_OFFSET.
  EDexGpsRawDataType getGpsRawDataType() const override { return GPS_RAW_OFFSET; }
  virtual EOffsetType getOffsetType() const = 0;

  // A null argument removes the measurement; otherwise it becomes a copy of *data.
  void setTSRawData(const DexTSRawData* data);
  const DexTSRawData* getTSRawData() const noexcept { return tsRawData_.get(); }

 protected:
  DexGpsOffset();
  DexGpsOffset(const DexGpsOffset&) = default;
  DexGpsOffset& operator=(const DexGpsOffset&) = default;

  // The GNSS part, then, when target is an offset, a copy of the measurement.
  void copyCommonData(DexObject* target) const override;

 private:
  DexOwnedPointer<DexTSRawData> tsRawData_;
};

// An offset by azimuth and distance from one reference point.
class DEX_API DexAzimuthDistanceGpsOffset : public DexGpsOffset {
 public:
  VYN_CLASS_ALLOCATOR

  DexAzimuthDistanceGpsOffset();
  DexAzimuthDistanceGpsOffset(const DexAzimuthDistanceGpsOffset&) = default;
  DexAzimuthDistanceGpsOffset& operator=(const DexAzimuthDistanceGpsOffset&) = default;
  ~DexAzimuthDistanceGpsOffset() override;

  // OFFSET_AZIMUTH_DISTANCE.
  EOffsetType getOffsetType() const override { return OFFSET_AZIMUTH_DISTANCE; }
  DexObject* clone() const override;

  virtual void setRefPoint(const CVynStringT<wchar_t>& name) { refPoint_ = name; }
  virtual const CVynStringT<wchar_t>& getRefPoint() const { return refPoint_; }

 protected:
  void copyCommonData(DexObject* target) const override;

 private:
  CVynStringT<wchar_t> refPoint_;
};

// An offset from the line through two reference points.
class DEX_API DexPtlGpsOffset : public DexGpsOffset {
 public:
  VYN_CLASS_ALLOCATOR

  DexPtlGpsOffset();
  DexPtlGpsOffset(const DexPtlGpsOffset&) = default;
  DexPtlGpsOffset& operator=(const DexPtlGpsOffset&) = default;
  ~DexPtlGpsOffset() override;

  // OFFSET_POINT_TO_LINE.
  EOffsetType getOffsetType() const override { return OFFSET_POINT_TO_LINE; }
  DexObject* clone() const override;

  virtual void setRefPoint1(const CVynStringT<wchar_t>& name) { refPoint1_ = name; }
  virtual const CVynStringT<wchar_t>& getRefPoint1() const { return refPoint1_; }
  virtual void setRefPoint2(const CVynStringT<wchar_t>& name) { refPoint2_ = name; }
  virtual const CVynStringT<wchar_t>& getRefPoint2() const { return refPoint2_; }

 protected:
  void copyCommonData(DexObject* target) const override;

 private:
  CVynStringT<wchar_t> refPoint1_;
  CVynStringT<wchar_t> refPoint2_;
};

// A point at two distances from two reference points, on the given side of the line through them.
class DEX_API DexTwoDistGpsOffset : public DexGpsOffset {
 public:
  VYN_CLASS_ALLOCATOR

  // Left of the line.
  DexTwoDistGpsOffset();
  DexTwoDistGpsOffset(const DexTwoDistGpsOffset&) = default;
  DexTwoDistGpsOffset& operator=(const DexTwoDistGpsOffset&) = default;
  ~DexTwoDistGpsOffset() override;

  // OFFSET_TWO_DISTANCES.
  EOffsetType getOffsetType() const override { return OFFSET_TWO_DISTANCES; }
  DexObject* clone() const override;

  virtual void setRefPoint1(const CVynStringT<wchar_t>& name) { refPoint1_ = name; }
  virtual const CVynStringT<wchar_t>& getRefPoint1() const { return refPoint1_; }
  virtual void setRefPoint2(const CVynStringT<wchar_t>& name) { refPoint2_ = name; }
  virtual const CVynStringT<wchar_t>& getRefPoint2() const { return refPoint2_; }
  // True when the point lies right of the line from the first to the second reference point.
  virtual void setRight(bool right) { right_ = right; }
  virtual bool getRight() const { return right_; }

 protected:
  void copyCommonData(DexObject* target) const override;

 private:
  CVynStringT<wchar_t> refPoint1_;
  CVynStringT<wchar_t> refPoint2_;
  bool right_ = false;
};

}  // namespace vyn::ie
