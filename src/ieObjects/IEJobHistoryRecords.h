#pragma once

#include <cstdint>

#include "hostlibs/DexApi.h"
#include "hostlibs/VynAlloc.h"
#include "hostlibs/VynString.h"
#include "ieObjects/IEInterfaces.h"
#include "ieObjects/IEOwnedPointer.h"
#include "ieObjects/IEStation.h"
#include "ieUtils/IEUtilsUnits.h"

// The records of a field job's history that travel with the exchange data, and the link through which
// a total-station raw record points at the records that applied when it was measured.
//
// So far the observation information is here as a record without content; its values are still to
// come.
namespace vyn::ie {

// The kind of field operation that produced a raw record. Any value cast from a number is stored.
enum EDexJobHistoryDataType : std::int32_t {
  JH_DATA_NONE = -1,           // not made from a job history: the default of the raw records
  JH_DATA_OCCUPATION = 0,      // occupation of a station (also a resection)
  JH_DATA_POINT_STAKEOUT = 1,  // stakeout of a point
  JH_DATA_LINE_STAKEOUT = 2,   // stakeout of a line
  JH_DATA_SURVEYED_POINT = 3,  // surveyed point
};

// The job, the software and the surveyor under which observations were made, with the temperature,
// pressure and instrument height then in force. A plain value: copying copies every member.
class DEX_API DexCommonJobHistoryRecord {
 public:
  VYN_CLASS_ALLOCATOR

  // Empty texts, numbers 0.
  DexCommonJobHistoryRecord() = default;
  DexCommonJobHistoryRecord(const DexCommonJobHistoryRecord&) = default;
  DexCommonJobHistoryRecord& operator=(const DexCommonJobHistoryRecord&) = default;
  virtual ~DexCommonJobHistoryRecord();

  const CVynStringT<wchar_t>& getJobName() const noexcept { return jobName_; }
  void setJobName(const CVynStringT<wchar_t>& name) { jobName_ = name; }
  const CVynStringT<wchar_t>& getApplicationName() const noexcept { return applicationName_; }
  void setApplicationName(const CVynStringT<wchar_t>& name) { applicationName_ = name; }
  const CVynStringT<wchar_t>& getVersionName() const noexcept { return versionName_; }
  void setVersionName(const CVynStringT<wchar_t>& name) { versionName_ = name; }
  const CVynStringT<wchar_t>& getSurveyorName() const noexcept { return surveyorName_; }
  void setSurveyorName(const CVynStringT<wchar_t>& name) { surveyorName_ = name; }
  double getTemperature() const noexcept { return temperature_; }
  void setTemperature(double temperature) noexcept { temperature_ = temperature; }
  double getPressure() const noexcept { return pressure_; }
  void setPressure(double pressure) noexcept { pressure_ = pressure; }
  double getInstrHeight() const noexcept { return instrHeight_; }
  void setInstrHeight(double height) noexcept { instrHeight_ = height; }

  // The four texts equal ignoring case, and each number equal once both are rounded to 4 decimals.
  bool operator==(const DexCommonJobHistoryRecord& other) const;
  bool operator!=(const DexCommonJobHistoryRecord& other) const { return !(*this == other); }

 private:
  CVynStringT<wchar_t> jobName_;
  CVynStringT<wchar_t> applicationName_;
  CVynStringT<wchar_t> versionName_;
  CVynStringT<wchar_t> surveyorName_;
  double temperature_ = 0.0;
  double pressure_ = 0.0;
  double instrHeight_ = 0.0;
};

// The units a job history's values are given in. A plain value.
class DEX_API DexJobHistoryUnits {
 public:
  VYN_CLASS_ALLOCATOR

  // Meters, decimal degrees, mmHg and degrees Celsius.
  DexJobHistoryUnits() = default;
  DexJobHistoryUnits(const DexJobHistoryUnits&) = default;
  DexJobHistoryUnits& operator=(const DexJobHistoryUnits&) = default;
  virtual ~DexJobHistoryUnits();

  EDistUnits getDistanceUnits() const noexcept { return distanceUnits_; }
  void setDistanceUnits(EDistUnits units) noexcept { distanceUnits_ = units; }
  EAngleUnits getAngleUnits() const noexcept { return angleUnits_; }
  void setAngleUnits(EAngleUnits units) noexcept { angleUnits_ = units; }
  EPressureUnits getPressureUnits() const noexcept { return pressureUnits_; }
  void setPressureUnits(EPressureUnits units) noexcept { pressureUnits_ = units; }
  ETemperatureUnits getTemperatureUnits() const noexcept { return temperatureUnits_; }
  void setTemperatureUnits(ETemperatureUnits units) noexcept { temperatureUnits_ = units; }

 private:
  EDistUnits distanceUnits_ = METERS;
  EAngleUnits angleUnits_ = DECDEG;
  EPressureUnits pressureUnits_ = MMHG;
  ETemperatureUnits temperatureUnits_ = CELSIUS;
};

// The backsight of a set-up: the backsight station and the calculated and measured backsight angles
// (decimal degrees). A plain value.
class DEX_API DexBackSightJobHistoryRecord {
 public:
  VYN_CLASS_ALLOCATOR

  // A default station, angles 0.
  DexBackSightJobHistoryRecord() = default;
  DexBackSightJobHistoryRecord(const DexBackSightJobHistoryRecord&) = default;
  DexBackSightJobHistoryRecord& operator=(const DexBackSightJobHistoryRecord&) = default;
  virtual ~DexBackSightJobHistoryRecord();

  const DexStation& getBSStation() const noexcept { return bsStation_; }
  void setBSStation(const DexStation& station) { bsStation_ = station; }
  double getBSAngleCalc() const noexcept { return bsAngleCalc_; }
  void setBSAngleCalc(double angle) noexcept { bsAngleCalc_ = angle; }
  double getBSAngleMeas() const noexcept { return bsAngleMeas_; }
  void setBSAngleMeas(double angle) noexcept { bsAngleMeas_ = angle; }

 private:
  DexStation bsStation_;
  double bsAngleCalc_ = 0.0;
  double bsAngleMeas_ = 0.0;
};

// The link of a raw record to the job-history records that applied when it was measured: the kind of
// field operation, then the common record, the units, the backsight and the occupied station.
//
// The four pointers refer to records owned elsewhere (by the job history that read them); the setters
// only store them and nothing here deletes them. Copying the interface copies the kind and the four
// pointers.
//
// The virtual table after the destructor: setTime, getTime (left to the record), copyJHData,
// getJHDataType, getCommonJHRecord, setCommonJHRecord, getJHUnits, setJHUnits, getJHBackSight,
// setJHBackSight, getJHOccupation, setJHOccupation (the plug-in ABI).
class DEX_API DexJobHistoryInterface : public IDexTimeInterface {
 public:
  ~DexJobHistoryInterface() override;

  // Hands target, through its setters, a new copy of each record this one points at; target's
  // pointers whose record here is null are left alone. A null target does nothing. The copies belong
  // to target's owner: the raw records adopt them (DexJobHistoryCopies).
  virtual void copyJHData(DexJobHistoryInterface* target) const;
  virtual EDexJobHistoryDataType getJHDataType() const { return dataType_; }
  virtual const DexCommonJobHistoryRecord* getCommonJHRecord() const { return common_; }
  virtual void setCommonJHRecord(DexCommonJobHistoryRecord* record) { common_ = record; }
  virtual const DexJobHistoryUnits* getJHUnits() const { return units_; }
  virtual void setJHUnits(DexJobHistoryUnits* units) { units_ = units; }
  virtual const DexBackSightJobHistoryRecord* getJHBackSight() const { return backSight_; }
  virtual void setJHBackSight(DexBackSightJobHistoryRecord* record) { backSight_ = record; }
  virtual const DexStation* getJHOccupation() const { return occupation_; }
  virtual void setJHOccupation(DexStation* station) { occupation_ = station; }

 protected:
  // The kind (an EDexJobHistoryDataType value or its number); no records.
  explicit DexJobHistoryInterface(int dataType);
  DexJobHistoryInterface(const DexJobHistoryInterface&) = default;
  DexJobHistoryInterface& operator=(const DexJobHistoryInterface&) = default;

 private:
  friend class DexJobHistoryCopies;

  EDexJobHistoryDataType dataType_;
  DexCommonJobHistoryRecord* common_ = nullptr;
  DexJobHistoryUnits* units_ = nullptr;
  DexBackSightJobHistoryRecord* backSight_ = nullptr;
  DexStation* occupation_ = nullptr;
};

// The job-history records a raw record owns: the copies that copyJHData() gave it when it was made as
// a clone. The record points at them through its DexJobHistoryInterface like at any other records, and
// deletes them with itself. Copying the holder copies the records; the copy of a record then points
// its interface at its own copies (redirect), so that two records never share what one of them owns.
class DEX_API DexJobHistoryCopies {
 public:
  VYN_CLASS_ALLOCATOR

  DexJobHistoryCopies() = default;
  DexJobHistoryCopies(const DexJobHistoryCopies&) = default;
  DexJobHistoryCopies& operator=(const DexJobHistoryCopies&) = default;
  ~DexJobHistoryCopies();

  // Takes ownership of every record that links points at now and that this holder does not own yet.
  // Only for records made for links' owner (copyJHData into a new record).
  void adopt(DexJobHistoryInterface& links);
  // Points links at this holder's records wherever it pointed at source's (after copying source).
  void redirect(const DexJobHistoryCopies& source, DexJobHistoryInterface& links) const;

 private:
  DexOwnedPointer<DexCommonJobHistoryRecord> common_;
  DexOwnedPointer<DexJobHistoryUnits> units_;
  DexOwnedPointer<DexBackSightJobHistoryRecord> backSight_;
  DexOwnedPointer<DexStation> occupation_;
};

// The atmospheric and scale settings under which a set of observations was made. Shared between the
// exchange data and its datasets through a reference-counting pointer: a record lives while anything
// still refers to it. Copying copies every value.
class DEX_API DexObservationInfo {
 public:
  VYN_CLASS_ALLOCATOR

  DexObservationInfo();
  DexObservationInfo(const DexObservationInfo&) = default;
  DexObservationInfo& operator=(const DexObservationInfo&) = default;
  virtual ~DexObservationInfo();
};

}  // namespace vyn::ie
