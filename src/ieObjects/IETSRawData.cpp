#include "ieObjects/IETSRawData.h"

namespace vyn::ie {

namespace {

// The rule of every owned value record: null removes it, otherwise the held record (made when there is
// none) becomes a copy of the argument.
void assignValues(DexOwnedPointer<DexTSRawData>& held, const DexTSRawData* data) {
  if (data == nullptr) {
    held.reset();
  } else if (held.get() == nullptr) {
    held.reset(new DexTSRawData(*data));
  } else if (held.get() != data) {
    *held.get() = *data;
  }
}

}  // namespace

// ---- DexTSRawData -------------------------------------------------------------------------------

DexTSRawData::DexTSRawData(int contentsType)
    : contentsType_(static_cast<EDexRawDataContents>(contentsType)) {}

DexTSRawData::~DexTSRawData() = default;

// ---- IDexTSRawDataInterface ---------------------------------------------------------------------

IDexTSRawDataInterface::IDexTSRawDataInterface() = default;

IDexTSRawDataInterface::~IDexTSRawDataInterface() = default;

void IDexTSRawDataInterface::setTSRawData(const DexTSRawData* data) {
  assignValues(tsRawData_, data);
}

void IDexTSRawDataInterface::setAveragedTSRawData(const DexTSRawData* data) {
  assignValues(averagedTSRawData_, data);
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

}  // namespace vyn::ie
