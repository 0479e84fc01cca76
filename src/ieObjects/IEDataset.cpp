#include "ieObjects/IEDataset.h"

#include <algorithm>
#include <cstddef>
#include <utility>

#include "hostlibs/VynLogging.h"
#include "ieObjects/IEDataDictionary.h"
#include "ieObjects/IEGPSRawData.h"
#include "ieObjects/IEHorizontalAlignment.h"
#include "ieObjects/detail/DatasetLog.h"
#include "ieObjects/detail/DatasetNameIndex.h"
#include "ieObjects/detail/DatasetObjects.h"

namespace vyn::ie {

namespace {

std::shared_ptr<DexObservationInfo> newObservationInfo() {
  return std::shared_ptr<DexObservationInfo>(new DexObservationInfo());
}

bool isRawPointKind(IDexRawDataInterface::ERawDataType kind) noexcept {
  return kind == IDexRawDataInterface::RAW_DATA_TOTAL_STATION || kind == IDexRawDataInterface::RAW_DATA_GNSS;
}

}  // namespace

// ---- Construction and copy ----------------------------------------------------------------------

DexDataset::DexDataset(const CVynStringT<wchar_t>& name, int numberOfSlots, bool withNameIndex)
    : name_(name), observationInfo_(newObservationInfo()) {
  const std::size_t slots = numberOfSlots > 0 ? static_cast<std::size_t>(numberOfSlots) : 0;
  objects_.reserve(std::max<std::size_t>(slots, kReservedObjects));
  objects_.resize(slots);
  if (withNameIndex) nameIndex_ = std::make_unique<detail::DatasetNameIndex>();
}

DexDataset::DexDataset(const DexDataset& other)
    : IDexNameInterface(other), name_(other.name_), observationInfo_(newObservationInfo()) {
  objects_.reserve(kReservedObjects);
  *this = other;
}

DexDataset& DexDataset::operator=(const DexDataset& other) {
  if (&other == this) return *this;
  name_ = other.name_;
  DexDatasetProperties* const properties = getDatasetProperties();
  if (properties != nullptr) {
    const DexDatasetProperties* const source = other.getDatasetProperties();
    properties->clone(source != nullptr ? *source : DexDatasetProperties());
  }
  return *this;
}

DexDataset::~DexDataset() {
  clearContent();
}

// ---- Adding -------------------------------------------------------------------------------------

bool DexDataset::add(DexObject* object) {
  if (object == nullptr) return false;
  if (object->getNumberOfCodes() > 0) {
    codesExist_ = true;
  } else {
    objectWithoutCodes_ = true;
  }
  objects_.emplace_back(object);
  fileInNameIndex(object);
  return true;
}

bool DexDataset::addObjectList(DexObjectList* list) {
  if (list == nullptr || findObjectListByName(list->getName()) != nullptr) return false;
  return objectLists_.add(list);
}

bool DexDataset::addPointsArray(const CVynStringT<wchar_t>& name, vyn_vector<const DexDesignPoint*>* points) {
  if (points == nullptr || pointsArrays_.contains(name)) return false;
  pointsArrays_.emplace(name, std::unique_ptr<vyn_vector<const DexDesignPoint*>>(points));
  return true;
}

vyn_vector<const DexDesignPoint*>* DexDataset::findPointsArray(const CVynStringT<wchar_t>& name) const {
  const auto found = pointsArrays_.find(name);
  return found != pointsArrays_.end() ? found->second.get() : nullptr;
}

DexDatasetProperties* DexDataset::getDatasetProperties() {
  if (!datasetProperties_) datasetProperties_.reset(new DexDatasetProperties());
  return datasetProperties_.get();
}

// ---- Name index ---------------------------------------------------------------------------------

void DexDataset::fileInNameIndex(DexObject* object) {
  if (!nameIndex_ || object->getType() == OBJECT_TYPE_SHEET_POINT) return;
  nameIndex_->fileFirst(object->getName().view(), object);
}

// An entry must never outlive its object, even when the object was renamed since it was filed. The
// entry's name then passes to the first object left in the list that has it.
void DexDataset::takeOutOfNameIndex(DexObject* object) {
  if (!nameIndex_ || object == nullptr) return;
  std::wstring name;
  if (!nameIndex_->remove(object->getName().view(), object, name)) return;
  for (const std::unique_ptr<DexObject>& candidate : objects_) {
    if (candidate != nullptr && candidate->getType() != OBJECT_TYPE_SHEET_POINT &&
        candidate->getName().view() == name) {
      nameIndex_->fileFirst(name, candidate.get());
      return;
    }
  }
}

// ---- Access and finding -------------------------------------------------------------------------

DexObject* DexDataset::getObjectAt(int index) noexcept {
  return index >= 0 && static_cast<std::size_t>(index) < objects_.size()
             ? objects_[static_cast<std::size_t>(index)].get()
             : nullptr;
}

const DexObject* DexDataset::getObjectAt(int index) const noexcept {
  return const_cast<DexDataset*>(this)->getObjectAt(index);
}

DexObject* DexDataset::findObject(const CVynStringT<wchar_t>& name, int kind) {
  return const_cast<DexObject*>(std::as_const(*this).findObject(name, kind));
}

const DexObject* DexDataset::findObject(const CVynStringT<wchar_t>& name, int kind) const {
  if (nameIndex_ && kind != OBJECT_TYPE_SHEET_POINT) {
    return nameIndex_->find(name.view());
  }
  return findObjectInList(name, kind);
}

const DexObject* DexDataset::findObjectInList(const CVynStringT<wchar_t>& name, int kind) const {
  for (const std::unique_ptr<DexObject>& object : objects_) {
    if (object != nullptr && object->getName() == name &&
        (kind == OBJECT_TYPE_ALL || object->getType() == kind)) {
      return object.get();
    }
  }
  return nullptr;
}

DexObjectList* DexDataset::findObjectListByName(const CVynStringT<wchar_t>& name) {
  return objectLists_.findFirst([&name](const DexObjectList& list) { return list.getName() == name; });
}

const DexObjectList* DexDataset::findObjectListByName(const CVynStringT<wchar_t>& name) const {
  return objectLists_.findFirst([&name](const DexObjectList& list) { return list.getName() == name; });
}

DexAlignment* DexDataset::findAlignment(const CVynStringT<wchar_t>& name) {
  return alignments_.findFirst(
      [&name](const DexAlignment& alignment) { return alignment.getName() == name; });
}

const DexAlignment* DexDataset::findAlignment(const CVynStringT<wchar_t>& name) const {
  return alignments_.findFirst(
      [&name](const DexAlignment& alignment) { return alignment.getName() == name; });
}

const DexAlignment* DexDataset::findAlignmentByPartName(const CVynStringT<wchar_t>& name, int type) const {
  return alignments_.findFirst([&name, type](const DexAlignment& alignment) {
    const IDexAlignmentPart* const part = alignment.getAlignmentPart(type);
    return part != nullptr && part->getName() == name;
  });
}

const DexParcel* DexDataset::findParcelByHAlignmentName(const CVynStringT<wchar_t>& name) const {
  return parcels_.findFirst([&name](const DexParcel& parcel) {
    const DexHorizontalAlignment* const alignment = parcel.getHAlignment();
    return alignment != nullptr && alignment->getName() == name;
  });
}

const DexGpsBaseStation* DexDataset::findRawPoint(const CVynStringT<wchar_t>& name) const {
  if (!rawData_) {
    vyn_logging::vyn_err_log(detail::kDatasetLogSource, detail::kDatasetFindRawPointWithoutRawDataLine);
    return nullptr;
  }
  // A record of another class is not a base station: it is never handed out as one.
  return dynamic_cast<const DexGpsBaseStation*>(findRawPointRecord(name));
}

const IDexRawDataInterface* DexDataset::findRawPointRecord(const CVynStringT<wchar_t>& name) const {
  const DexRawData* const rawData = rawData_.get();
  if (rawData == nullptr) return nullptr;
  return rawData->getRawDataAt(rawData->findFirstIndex(
      name, [](const IDexRawDataInterface& record) { return isRawPointKind(record.getRawDataType()); }));
}

// ---- Removing and resetting ---------------------------------------------------------------------

bool DexDataset::removeObject(int index) {
  if (index < 0 || static_cast<std::size_t>(index) >= objects_.size()) return false;
  const auto position = objects_.begin() + index;
  DexObject* const object = position->release();
  objects_.erase(position);
  takeOutOfNameIndex(object);
  return true;
}

void DexDataset::resetAllData() {
  const bool indexed = nameIndex_ != nullptr;
  clearContent();
  // A new index rather than an emptied one: it hands the memory of the old one back.
  if (indexed) nameIndex_ = std::make_unique<detail::DatasetNameIndex>();
}

void DexDataset::clearContent() noexcept {
  nameIndex_.reset();
  datasetProperties_.reset();
  objects_.clear();
  surfaces_.clear();
  alignments_.clear();
  parcels_.clear();
  rawData_.reset();
  objectLists_.clear();
  surveyXSections_.clear();
  findChainageReports_.clear();
  pointsArrays_.clear();
  scanningSessions_.clear();
  jobHistory_.reset();
  orientationJobs_.clear();
  stakeoutReports_.clear();
  fieldReports_.clear();
  regions_.clear();
  codesExist_ = false;
  objectWithoutCodes_ = false;
}

// ---- Codes --------------------------------------------------------------------------------------

bool DexDataset::isCodeDefinitionUsed(const DexCodeDescription* description) const {
  if (description == nullptr) return false;
  const CVynStringT<wchar_t>& code = description->getName();
  return detail::countObjects(objects_,
                              [&code](DexObject& object) { return object.findCode(code) != nullptr; }) > 0;
}

void DexDataset::copyIEObjectsWithTheCodeToTheNewDataset(DexDataset* target,
                                                         const CVynStringT<wchar_t>& code) const {
  if (target == nullptr) return;
  // Indexes rather than iterators: when target is this dataset, adding moves the list.
  const std::size_t count = objects_.size();
  for (std::size_t i = 0; i < count; ++i) {
    const DexObject* const object = objects_[i].get();
    const DexCodeValues* const value = object != nullptr ? object->findCode(code) : nullptr;
    if (value == nullptr) continue;
    DexObject* const copy = object->clone();
    if (copy == nullptr) continue;  // the host allocator is out of memory
    copy->removeAllCodes();
    copy->addCode(new DexCodeValues(*value));
    target->add(copy);
  }
}

}  // namespace vyn::ie
