#include "ieObjects/IEDLRawData.h"

#include "ieObjects/detail/RawRecordCopy.h"

namespace vyn::ie {

DexDLRawData::DexDLRawData(int contentsType)
    : contentsType_(static_cast<EDexRawDataContents>(contentsType)) {}

DexDLRawData::~DexDLRawData() = default;

DexDLRawDataSight::DexDLRawDataSight(int type) : type_(static_cast<EDexDLRawDataType>(type)) {}

DexDLRawDataSight::~DexDLRawDataSight() = default;

void DexDLRawDataSight::setMeasData(const DexDLRawData* data) {
  detail::assignHeldCopy(measData_, data);
}

}  // namespace vyn::ie
