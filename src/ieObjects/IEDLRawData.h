#pragma once

#include <cstdint>

#include "hostlibs/DexApi.h"
#include "hostlibs/VynAlloc.h"
#include "hostlibs/VynString.h"
#include "hostlibs/VynTime.h"
#include "ieObjects/IEOwnedPointer.h"
#include "ieObjects/IERawData.h"
#include "ieObjects/IETypedValues.h"

// Digital-level raw data (raw kind RAW_DATA_DIGITAL_LEVEL): the staff readings of a levelling job, their
// measured values and the runs they are grouped in.
namespace vyn::ie {

class DexDesignPoint;

// One run of a digital-level job: its name (the key under which the data container keeps it) and a
// second text that the plug-ins give its meaning. The data container owns the runs; sights refer to
// them. A plain value: copying copies both texts.
struct DEX_API DexDLRun {
  VYN_CLASS_ALLOCATOR

  DexDLRun() = default;
  DexDLRun(const CVynStringT<wchar_t>& runName, const CVynStringT<wchar_t>& runText)
      : name(runName), text(runText) {}

  CVynStringT<wchar_t> name;
  CVynStringT<wchar_t> text;
};

// The measured values of one staff reading: three numbers whose meaning the contents type gives. A
// value type; copying copies every field.
//
// The virtual table after the destructor: setDLRawData, getDLRawData, setContentsType,
// getContentsType (the plug-in ABI).
class DEX_API DexDLRawData {
 public:
  VYN_CLASS_ALLOCATOR

  // The places of the three values.
  enum EDexRawDataValues : std::int32_t {
    FIRST_VALUE = 0,
    SECOND_VALUE = 1,
    THIRD_VALUE = 2,
  };
  static constexpr int kNumberOfValues = 3;
  // What the values hold: numbers agreed between the plug-ins. Any value cast from a number is stored.
  enum EDexRawDataContents : std::int32_t {
    CONTENTS_DEFAULT = 0,
  };

  // Values 0 and the given contents type (an EDexRawDataContents value or its number).
  explicit DexDLRawData(int contentsType = CONTENTS_DEFAULT);
  DexDLRawData(const DexDLRawData&) = default;
  DexDLRawData& operator=(const DexDLRawData&) = default;
  virtual ~DexDLRawData();

  // Stores value at place (0 to 2); any other place is ignored.
  virtual void setDLRawData(int place, double value) { values_.set(place, value); }
  // The value at place; -1.0 for a place outside 0 to 2.
  virtual double getDLRawData(int place) const { return values_.contains(place) ? values_.get(place) : -1.0; }
  virtual void setContentsType(int contentsType) {
    contentsType_ = static_cast<EDexRawDataContents>(contentsType);
  }
  virtual EDexRawDataContents getContentsType() const { return contentsType_; }

 private:
  DexTypedValues<EDexRawDataValues, kNumberOfValues> values_;
  EDexRawDataContents contentsType_;
};

// One staff reading of a digital level: its name, time and kind, the benchmark or back point, the
// vertical offset, staff distance, instrument height and elevation, the measured values, the design
// point read and the run.
//
// Ownership: the sight owns its measured values (setMeasData copies its argument; copies duplicate
// them). The target point (a point of the dataset) and the run (kept by the data container) are
// references the sight never deletes.
class DEX_API DexDLRawDataSight : public IDexRawDataInterface {
 public:
  VYN_CLASS_ALLOCATOR

  // The kind of reading: numbers agreed between the plug-ins. Any value cast from a number is stored.
  enum EDexDLRawDataType : std::int32_t {
    DL_READING_DEFAULT = 0,
  };

  // The kind (an EDexDLRawDataType value or its number); empty texts and time, numbers 0, no values,
  // no target point, no run.
  explicit DexDLRawDataSight(int type = DL_READING_DEFAULT);
  DexDLRawDataSight(const DexDLRawDataSight&) = default;
  DexDLRawDataSight& operator=(const DexDLRawDataSight&) = default;
  ~DexDLRawDataSight() override;

  // ---- Record ---------------------------------------------------------------------------------
  void setName(const CVynStringT<wchar_t>& name) override { name_ = name; }
  const CVynStringT<wchar_t>& getName() const override { return name_; }
  // RAW_DATA_DIGITAL_LEVEL.
  ERawDataType getRawDataType() const override { return RAW_DATA_DIGITAL_LEVEL; }
  void setTime(const base::CTime& time) override { time_ = time; }
  const base::CTime& getTime() const override { return time_; }

  // ---- Reading --------------------------------------------------------------------------------
  EDexDLRawDataType getType() const noexcept { return type_; }
  // The benchmark or back point.
  void setBPName(const CVynStringT<wchar_t>& name) { bpName_ = name; }
  const CVynStringT<wchar_t>& getBPName() const noexcept { return bpName_; }
  void setVOffset(double offset) noexcept { vOffset_ = offset; }
  double getVOffset() const noexcept { return vOffset_; }
  // The staff distance.
  void setDistance(double distance) noexcept { distance_ = distance; }
  double getDistance() const noexcept { return distance_; }
  // The instrument height.
  void setHi(double height) noexcept { hi_ = height; }
  double getHi() const noexcept { return hi_; }
  void setIElevation(double elevation) noexcept { iElevation_ = elevation; }
  double getIElevation() const noexcept { return iElevation_; }
  // A null argument removes the measured values; otherwise they become a copy of *data.
  void setMeasData(const DexDLRawData* data);
  const DexDLRawData* getMeasData() const noexcept { return measData_.get(); }

  // ---- References -----------------------------------------------------------------------------
  void setTargetPoint(DexDesignPoint* point) noexcept { targetPoint_ = point; }
  DexDesignPoint* getTargetPoint() const noexcept { return targetPoint_; }
  void setDLRun(DexDLRun* run) noexcept { dlRun_ = run; }
  DexDLRun* getDLRun() const noexcept { return dlRun_; }

 private:
  base::CTime time_;
  CVynStringT<wchar_t> name_;
  CVynStringT<wchar_t> bpName_;
  EDexDLRawDataType type_;
  double vOffset_ = 0.0;
  double distance_ = 0.0;
  double hi_ = 0.0;
  double iElevation_ = 0.0;
  DexOwnedPointer<DexDLRawData> measData_;
  DexDesignPoint* targetPoint_ = nullptr;
  DexDLRun* dlRun_ = nullptr;
};

}  // namespace vyn::ie
