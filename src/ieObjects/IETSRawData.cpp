#include "ieObjects/IETSRawData.h"

#include "ieObjects/detail/RawRecordCopy.h"

namespace vyn::ie {

// ---- DexTSRawData -------------------------------------------------------------------------------

DexTSRawData::DexTSRawData(int contentsType)
    : contentsType_(static_cast<EDexRawDataContents>(contentsType)) {}

DexTSRawData::~DexTSRawData() = default;

// ---- IDexTSRawDataInterface ---------------------------------------------------------------------

IDexTSRawDataInterface::IDexTSRawDataInterface() = default;

IDexTSRawDataInterface::~IDexTSRawDataInterface() = default;

void IDexTSRawDataInterface::setTSRawData(const DexTSRawData* data) {
  detail::assignHeldCopy(tsRawData_, data);
}

void IDexTSRawDataInterface::setAveragedTSRawData(const DexTSRawData* data) {
  detail::assignHeldCopy(averagedTSRawData_, data);
}

void IDexTSRawDataInterface::setWeatherInfo(const DexWeatherInfo& info) {
  detail::assignHeldCopy(weatherInfo_, &info);
}

bool IDexTSRawDataInterface::getWeatherInfo(DexWeatherInfo& info) const {
  return detail::copyHeldInto(weatherInfo_, info);
}

void IDexTSRawDataInterface::setSurveyorInfo(const DexSurveyorInfo& info) {
  detail::assignHeldCopy(surveyorInfo_, &info);
}

bool IDexTSRawDataInterface::getSurveyorInfo(DexSurveyorInfo& info) const {
  return detail::copyHeldInto(surveyorInfo_, info);
}

void IDexTSRawDataInterface::setSessionPattern(const DexSessionPattern& pattern) {
  detail::assignHeldCopy(sessionPattern_, &pattern);
}

bool IDexTSRawDataInterface::getSessionPattern(DexSessionPattern& pattern) const {
  return detail::copyHeldInto(sessionPattern_, pattern);
}

void IDexTSRawDataInterface::copyData(IDexTSRawDataInterface* target) const {
  if (target == nullptr || target == this) return;
  target->setTargetHeight(getTargetHeight());
  target->setTSRawData(getTSRawData());
  target->setAveragedTSRawData(getAveragedTSRawData());
  target->setNameSource(getNameSource());
  target->setTime(getTime());
  target->setName(getName());
}

// ---- DexTSRawDataSightInterface -----------------------------------------------------------------

DexTSRawDataSightInterface::DexTSRawDataSightInterface(ECurrentState state) : state_(state) {}

DexTSRawDataSightInterface::~DexTSRawDataSightInterface() = default;

void DexTSRawDataSightInterface::setXyz(const DexTSRawData* xyz) {
  detail::assignHeldCopy(xyz_, xyz);
}

void DexTSRawDataSightInterface::setXyz(double x, double y, double z) {
  if (!xyz_) xyz_.reset(new DexTSRawData(DexTSRawData::CONTENTS_NEU));
  DexTSRawData* const xyz = xyz_.get();
  if (xyz == nullptr) return;  // the host allocator is out of memory
  xyz->setTSRawData(DexTSRawData::FIRST_VALUE, x);
  xyz->setTSRawData(DexTSRawData::SECOND_VALUE, y);
  xyz->setTSRawData(DexTSRawData::THIRD_VALUE, z);
}

void DexTSRawDataSightInterface::copyCommonData(DexTSRawDataSightInterface* target) const {
  if (target == nullptr || target == this) return;
  copyData(target);
  target->setNote(note_);
  target->setStateType(state_);
  target->setXyz(getXyz());
}

}  // namespace vyn::ie
