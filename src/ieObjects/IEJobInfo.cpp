#include "ieObjects/IEJobInfo.h"

#include <cstddef>

namespace vyn::ie {

namespace {

bool isTextIndex(int index) {
  return index >= 0 && index < DexJobInfo::kNumberOfTexts;
}

}  // namespace

DexJobInfo::~DexJobInfo() = default;

CVynStringT<wchar_t> DexJobInfo::getText(int index) const {
  return isTextIndex(index) ? texts_[static_cast<std::size_t>(index)] : CVynStringT<wchar_t>();
}

void DexJobInfo::setText(int index, const CVynStringT<wchar_t>& text) {
  if (isTextIndex(index)) texts_[static_cast<std::size_t>(index)] = text;
}

void DexJobInfo::setDisplaySettings(const DexDisplaySettings& settings) {
  displaySettings_ = settings;
  displaySettingsDefined_ = true;
}

bool DexJobInfo::getDisplaySettings(DexDisplaySettings& settings) const {
  if (displaySettingsDefined_) settings = displaySettings_;
  return displaySettingsDefined_;
}

void DexJobInfo::setCreateTime(const FILETIME& time) {
  createTime_ = time;
  definedFlags_ |= CREATE_TIME_DEFINED;
}

bool DexJobInfo::getCreateTime(FILETIME& time) const {
  if (!isDefined(CREATE_TIME_DEFINED)) return false;
  time = createTime_;
  return true;
}

bool DexJobInfo::getCreateTimeString(CVynStringT<wchar_t>& date, CVynStringT<wchar_t>& time) const {
  FILETIME local;
  SYSTEMTIME fields;
  if (!isDefined(CREATE_TIME_DEFINED) || !FileTimeToLocalFileTime(&createTime_, &local) ||
      !FileTimeToSystemTime(&local, &fields)) {
    return false;
  }
  date.Format(L"%02d/%02d/%02d", fields.wDay, fields.wMonth, fields.wYear % 100);
  time.Format(L"%02d:%02d:%02d", fields.wHour, fields.wMinute, fields.wSecond);
  return true;
}

void DexJobInfo::setDistUnits(EDistUnits units) {
  distUnits_ = units;
  definedFlags_ |= DIST_UNITS_DEFINED;
}

void DexJobInfo::setAngleUnits(EAngleUnits units) {
  angleUnits_ = units;
  definedFlags_ |= ANGLE_UNITS_DEFINED;
}

bool DexJobInfo::getDistUnits(EDistUnits& units) const {
  if (!isDefined(DIST_UNITS_DEFINED)) return false;
  units = distUnits_;
  return true;
}

bool DexJobInfo::getAngleUnits(EAngleUnits& units) const {
  if (!isDefined(ANGLE_UNITS_DEFINED)) return false;
  units = angleUnits_;
  return true;
}

EDistUnits DexJobInfo::getDistUnits() const {
  return isDefined(DIST_UNITS_DEFINED) ? distUnits_ : ANY_UNITS;
}

EAngleUnits DexJobInfo::getAngleUnits() const {
  return isDefined(ANGLE_UNITS_DEFINED) ? angleUnits_ : DECDEG;
}

}  // namespace vyn::ie
