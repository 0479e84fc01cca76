#pragma once

#include <array>
#include <cstdint>

#include "hostlibs/DexApi.h"
#include "hostlibs/VynAlloc.h"
#include "hostlibs/VynString.h"
#include "hostlibs/VynTime.h"
#include "ieObjects/IEInterfaces.h"
#include "ieObjects/IEOwnedPointer.h"
#include "ieObjects/IERawData.h"
#include "ieObjects/IETypedValues.h"

// Total-station raw records (raw kind RAW_DATA_TOTAL_STATION): the measured values of one record, the
// weather, surveyor and session records a record may carry, the common base of every total-station
// record and the base of the sights. The eight record kinds are in IETSRawRecords.h.
namespace vyn::ie {

// The kind of a total-station record, as IDexTSRawDataInterface::getType() answers it.
enum EDexTSRawDataType : std::int32_t {
  TS_RAW_BACKBEARING = 0,
  TS_RAW_BACKSIGHT = 1,
  TS_RAW_FORESIGHT = 2,
  TS_RAW_SIDESHOT = 3,
  TS_RAW_MISSING_LINE = 4,  // missing-line measurement between two points
  TS_RAW_RESECTION_SHOT = 5,
  TS_RAW_STATION = 6,
  TS_RAW_STAKEOUT = 7,
};

// The measured values of one total-station record: four numbers whose meaning the contents type gives
// (angles and distances in one of several combinations, or coordinates), the measuring method, the
// offset kind, the number of the measurement set, whether the shot was remeasured and the prism
// constant. A value type; copying copies every field.
//
// The virtual table after the destructor: setTSRawData, getTSRawData, setContentsType,
// getContentsType, setMethodType, getMethodType, setOffsetType, getOffsetType, setSetNum, getSetNum,
// setRemeasured, getRemeasured, setPrismConst, getPrismConst (the plug-in ABI).
class DEX_API DexTSRawData {
 public:
  VYN_CLASS_ALLOCATOR

  // The places of the four values.
  enum EDexRawDataValues : std::int32_t {
    FIRST_VALUE = 0,
    SECOND_VALUE = 1,
    THIRD_VALUE = 2,
    FOURTH_VALUE = 3,
  };
  static constexpr int kNumberOfValues = 4;

  // What the values hold, by the field software's shot types: horizontal angle, vertical angle and
  // slope distance; horizontal angle with two distances; the two angles only; an offset shot;
  // coordinates; a bearing or azimuth. Any value cast from a number is stored.
  enum EDexRawDataContents : std::int32_t {
    CONTENTS_HVS = 0,
    CONTENTS_HVD = 1,
    CONTENTS_HV = 2,
    CONTENTS_OFFSET = 3,
    CONTENTS_NEU = 4,
    CONTENTS_BRGAZ = 5,
  };
  // Measuring method and offset kind: numbers agreed between the plug-ins; the model only stores them.
  enum EDexTSMethodType : std::int32_t {
    METHOD_DEFAULT = 0,
  };
  enum EDexTSOffsetType : std::int32_t {
    OFFSET_NONE = 0,
  };

  // Values 0, the given contents type (an EDexRawDataContents value or its number), method, offset and
  // set number 0, not remeasured, prism constant 0.
  explicit DexTSRawData(int contentsType = CONTENTS_HVS);
  DexTSRawData(const DexTSRawData&) = default;
  DexTSRawData& operator=(const DexTSRawData&) = default;
  virtual ~DexTSRawData();

  // Stores value at place (0 to 3); any other place is ignored.
  virtual void setTSRawData(int place, double value) { values_.set(place, value); }
  // The value at place; -1.0 for a place outside 0 to 3.
  virtual double getTSRawData(int place) const { return values_.contains(place) ? values_.get(place) : -1.0; }
  virtual void setContentsType(int contentsType) {
    contentsType_ = static_cast<EDexRawDataContents>(contentsType);
  }
  virtual EDexRawDataContents getContentsType() const { return contentsType_; }
  virtual void setMethodType(int methodType) { methodType_ = static_cast<EDexTSMethodType>(methodType); }
  virtual EDexTSMethodType getMethodType() const { return methodType_; }
  virtual void setOffsetType(int offsetType) { offsetType_ = static_cast<EDexTSOffsetType>(offsetType); }
  virtual EDexTSOffsetType getOffsetType() const { return offsetType_; }
  virtual void setSetNum(int setNum) { setNum_ = setNum; }
  virtual int getSetNum() const { return setNum_; }
  virtual void setRemeasured(bool remeasured) { remeasured_ = remeasured; }
  virtual bool getRemeasured() const { return remeasured_; }
  virtual void setPrismConst(double prismConst) { prismConst_ = prismConst; }
  virtual double getPrismConst() const { return prismConst_; }

 private:
  DexTypedValues<EDexRawDataValues, kNumberOfValues> values_;
  EDexRawDataContents contentsType_;
  EDexTSMethodType methodType_ = METHOD_DEFAULT;
  EDexTSOffsetType offsetType_ = OFFSET_NONE;
  int setNum_ = 0;
  bool remeasured_ = false;
  double prismConst_ = 0.0;
};

// The weather under which a record was measured. The plug-ins and the job history give the fields
// their meaning; the library stores and copies them. A plain value.
struct DEX_API DexWeatherInfo {
  VYN_CLASS_ALLOCATOR

  std::array<std::int32_t, 2> numbers{};
  std::array<double, 3> values{};
};

// Who measured a record. The plug-ins give the fields their meaning. A plain value.
struct DEX_API DexSurveyorInfo {
  VYN_CLASS_ALLOCATOR

  std::array<CVynStringT<wchar_t>, 2> leadingTexts;
  std::int64_t value = 0;
  std::array<CVynStringT<wchar_t>, 2> trailingTexts;
};

// The pattern of the measurement session a record belongs to. The plug-ins give the fields their
// meaning. A plain value.
struct DEX_API DexSessionPattern {
  VYN_CLASS_ALLOCATOR

  CVynStringT<wchar_t> text;
  std::int64_t leadingValue = 0;
  std::array<double, 4> values{};
  std::array<std::int32_t, 4> numbers{};
  std::int64_t trailingValue = 0;
};

// The common base of the total-station records: a name, a time stamp, the target height, a depth,
// the measured values and the averaged values (each held in a record of its own, or absent), where
// the name comes from, whether the name was left empty in the field, the instrument model, and
// optional weather, surveyor and session records.
//
// Ownership: the record owns its value records and its weather, surveyor and session records. The
// setters copy their argument (the caller keeps it); copy construction and assignment duplicate
// every owned record.
//
// The virtual table after the destructor: setName, getName, getRawDataType, getType, clone,
// setTargetHeight, getTargetHeight, setDepth, getDepth, setTSRawData, getTSRawData,
// setAveragedTSRawData, getAveragedTSRawData, setNameSource, getNameSource, setWeatherInfo,
// getWeatherInfo, setSurveyorInfo, getSurveyorInfo, setSessionPattern, getSessionPattern,
// setIsEmptyName, getIsEmptyName, setModelName, getModelName (the plug-in ABI). The time operations
// belong to the time interface's table.
class DEX_API IDexTSRawDataInterface : public IDexRawDataInterface {
 public:
  // Where a record's name comes from: a number agreed between the plug-ins. The dataset's walk from
  // raw point to raw point takes the names of foresights and sideshots whose source is
  // NAME_SOURCE_DEFAULT.
  enum ENameSource : std::int32_t {
    NAME_SOURCE_DEFAULT = 0,
  };

  ~IDexTSRawDataInterface() override;

  // ---- Virtual operations, in their fixed order -----------------------------------------------
  void setName(const CVynStringT<wchar_t>& name) override { name_ = name; }
  const CVynStringT<wchar_t>& getName() const override { return name_; }
  // RAW_DATA_TOTAL_STATION.
  ERawDataType getRawDataType() const override { return RAW_DATA_TOTAL_STATION; }
  // The kind of the record.
  virtual EDexTSRawDataType getType() const = 0;
  // A new record of the same kind with this one's data; the caller owns it. Null only when memory
  // runs out.
  virtual IDexTSRawDataInterface* clone() const = 0;
  virtual void setTargetHeight(double height) { targetHeight_ = height; }
  virtual double getTargetHeight() const { return targetHeight_; }
  virtual void setDepth(double depth) { depth_ = depth; }
  virtual double getDepth() const { return depth_; }
  // A null argument removes the held values; otherwise they become a copy of *data.
  virtual void setTSRawData(const DexTSRawData* data);
  // The held values, or null.
  virtual const DexTSRawData* getTSRawData() const { return tsRawData_.get(); }
  // As setTSRawData, for the averaged values.
  virtual void setAveragedTSRawData(const DexTSRawData* data);
  virtual const DexTSRawData* getAveragedTSRawData() const { return averagedTSRawData_.get(); }
  // An ENameSource value or its number.
  virtual void setNameSource(int nameSource) { nameSource_ = static_cast<ENameSource>(nameSource); }
  virtual ENameSource getNameSource() const { return nameSource_; }
  // The weather, surveyor and session setters make the held record on first use and copy every field
  // of the argument into it. The getters copy the held record into the argument and answer true, or
  // answer false, leaving the argument alone, when none is held.
  virtual void setWeatherInfo(const DexWeatherInfo& info);
  virtual bool getWeatherInfo(DexWeatherInfo& info) const;
  virtual void setSurveyorInfo(const DexSurveyorInfo& info);
  virtual bool getSurveyorInfo(DexSurveyorInfo& info) const;
  virtual void setSessionPattern(const DexSessionPattern& pattern);
  virtual bool getSessionPattern(DexSessionPattern& pattern) const;
  // Whether the point had no name in the field (the name was given afterwards).
  virtual void setIsEmptyName(bool isEmpty) { isEmptyName_ = isEmpty; }
  virtual bool getIsEmptyName() const { return isEmptyName_; }
  // The model of the instrument.
  virtual void setModelName(const CVynStringT<wchar_t>& name) { modelName_ = name; }
  virtual const CVynStringT<wchar_t>& getModelName() const { return modelName_; }

  void setTime(const base::CTime& time) override { time_ = time; }
  const base::CTime& getTime() const override { return time_; }

 protected:
  // Empty name and time, target height and depth 0, no values, name source 0, no weather, surveyor
  // or session record, a name that was given, no model name.
  IDexTSRawDataInterface();
  IDexTSRawDataInterface(const IDexTSRawDataInterface&) = default;
  IDexTSRawDataInterface& operator=(const IDexTSRawDataInterface&) = default;

  // Gives target, through its virtual setters, this record's target height, values, averaged values,
  // name source, time and name; not its depth, weather, surveyor, session, empty-name flag or model
  // name. A null target, or this record itself, does nothing.
  void copyData(IDexTSRawDataInterface* target) const;

 private:
  double targetHeight_ = 0.0;
  double depth_ = 0.0;
  DexOwnedPointer<DexTSRawData> tsRawData_;
  DexOwnedPointer<DexTSRawData> averagedTSRawData_;
  ENameSource nameSource_ = NAME_SOURCE_DEFAULT;
  base::CTime time_;
  CVynStringT<wchar_t> name_;
  bool isEmptyName_ = false;
  CVynStringT<wchar_t> modelName_;
  DexOwnedPointer<DexWeatherInfo> weatherInfo_;
  DexOwnedPointer<DexSurveyorInfo> surveyorInfo_;
  DexOwnedPointer<DexSessionPattern> sessionPattern_;
};

// The base of the sights (backbearing, backsight, foresight, sideshot): a total-station record with
// an edit state, a note and the coordinates computed for the sight (a value record of its own, owned
// and duplicated by copies like the measured values).
//
// The virtual table continues after those of the base with copyCommonData; the state operations belong
// to the state interface's table.
class DEX_API DexTSRawDataSightInterface : public IDexTSRawDataInterface, public IDexStateInterface {
 public:
  ~DexTSRawDataSightInterface() override;

 protected:
  // copyData(target), then the note, the state and the coordinates. The sight kinds add their own
  // fields. A null target, or this record itself, does nothing.
  virtual void copyCommonData(DexTSRawDataSightInterface* target) const;

 public:
  void setStateType(ECurrentState state) override { state_ = state; }
  ECurrentState getStateType() const override { return state_; }

  void setNote(const CVynStringT<wchar_t>& note) { note_ = note; }
  const CVynStringT<wchar_t>& getNote() const noexcept { return note_; }
  // A null argument removes the coordinates; otherwise they become a copy of *xyz.
  void setXyz(const DexTSRawData* xyz);
  // Stores x, y and z as values 0, 1 and 2 of the coordinates record, made with contents CONTENTS_NEU
  // when none is held (a held record keeps its contents type and fourth value).
  void setXyz(double x, double y, double z);
  // The coordinates computed for the sight, or null.
  const DexTSRawData* getXyz() const noexcept { return xyz_.get(); }

 protected:
  // No note, no coordinates, the given state.
  explicit DexTSRawDataSightInterface(ECurrentState state);
  DexTSRawDataSightInterface(const DexTSRawDataSightInterface&) = default;
  DexTSRawDataSightInterface& operator=(const DexTSRawDataSightInterface&) = default;

 private:
  CVynStringT<wchar_t> note_;
  ECurrentState state_;
  DexOwnedPointer<DexTSRawData> xyz_;
};

}  // namespace vyn::ie
