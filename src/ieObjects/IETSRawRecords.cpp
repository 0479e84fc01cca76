#include "ieObjects/IETSRawRecords.h"

#include "hostlibs/VynLogging.h"
#include "ieObjects/detail/RawDataLog.h"
#include "ieObjects/detail/RawRecordCopy.h"

namespace vyn::ie {
namespace {

// The job-history part of a clone: copies of the source's records, owned by the clone.
void copyJobHistory(const DexJobHistoryInterface& source, DexJobHistoryInterface& target,
                    DexJobHistoryCopies& targetCopies) {
  source.copyJHData(&target);
  targetCopies.adopt(target);
}

// The photo notes rule of the clones: removed when the source has none, otherwise copied into the
// target's (made when it has none).
template <class Record>
void copyPhotoNotes(const DexPhotoNotes* source, Record& target) {
  if (source == nullptr) {
    target.setPhotoNotes(nullptr);
  } else if (DexPhotoNotes* const held = target.getPhotoNotes(); held != nullptr) {
    *held = *source;
  } else {
    target.setPhotoNotes(new DexPhotoNotes(*source));
  }
}

bool isStationType(int type) noexcept {
  return type >= 0 && type < DexTSRawStakeout::kNumberOfStations;
}

template <class T>
T* copyOrNull(const T* object) {
  return object != nullptr ? new T(*object) : nullptr;
}

}  // namespace

// ---- Backbearing and backsight --------------------------------------------------------------------

DexTSRawBackSightBase::DexTSRawBackSightBase() : DexTSRawDataSightInterface(ACTIVE_STATE) {}

DexTSRawBackSightBase::~DexTSRawBackSightBase() = default;

void DexTSRawBackSightBase::copyCommonData(DexTSRawDataSightInterface* target) const {
  DexTSRawDataSightInterface::copyCommonData(target);
  if (auto* const sight = dynamic_cast<DexTSRawBackSightBase*>(target); sight != nullptr)
    sight->bsPoint_ = bsPoint_;
}

DexTSRawBkb::DexTSRawBkb() = default;

DexTSRawBkb::~DexTSRawBkb() = default;

IDexTSRawDataInterface* DexTSRawBkb::clone() const {
  return detail::makeFilled([] { return new DexTSRawBkb(); },
                            [this](DexTSRawBkb* copy) { copyCommonData(copy); });
}

DexTSRawBS::DexTSRawBS() = default;

DexTSRawBS::~DexTSRawBS() = default;

IDexTSRawDataInterface* DexTSRawBS::clone() const {
  return detail::makeFilled([] { return new DexTSRawBS(); },
                            [this](DexTSRawBS* copy) { copyCommonData(copy); });
}

// ---- Foresight --------------------------------------------------------------------------------------

DexTSRawFS::DexTSRawFS(int measType, int jhDataType)
    : DexTSRawDataSightInterface(ACTIVE_STATE),
      DexJobHistoryInterface(jhDataType),
      measType_(static_cast<EMeasType>(measType)) {}

DexTSRawFS::DexTSRawFS(const DexTSRawFS& other)
    : DexTSRawDataSightInterface(other),
      DexCodesDataInterface(other),
      DexJobHistoryInterface(other),
      secondData_(other.secondData_),
      resultCoords_(other.resultCoords_),
      photoNotes_(other.photoNotes_),
      measType_(other.measType_),
      jhCopies_(other.jhCopies_) {
  jhCopies_.redirect(other.jhCopies_, *this);
}

DexTSRawFS& DexTSRawFS::operator=(const DexTSRawFS& other) {
  if (&other == this) return *this;
  DexTSRawDataSightInterface::operator=(other);
  DexCodesDataInterface::operator=(other);
  DexJobHistoryInterface::operator=(other);
  secondData_ = other.secondData_;
  resultCoords_ = other.resultCoords_;
  photoNotes_ = other.photoNotes_;
  measType_ = other.measType_;
  jhCopies_ = other.jhCopies_;
  jhCopies_.redirect(other.jhCopies_, *this);
  return *this;
}

DexTSRawFS::~DexTSRawFS() = default;

IDexTSRawDataInterface* DexTSRawFS::clone() const {
  return detail::makeFilled([this] { return new DexTSRawFS(measType_, JH_DATA_NONE); },
                            [this](DexTSRawFS* copy) { copyCommonData(copy); });
}

void DexTSRawFS::setSecondData(const DexTSRawData* data) {
  detail::assignHeldCopy(secondData_, data);
}

void DexTSRawFS::copyCommonData(DexTSRawDataSightInterface* target) const {
  DexTSRawDataSightInterface::copyCommonData(target);
  auto* const sight = dynamic_cast<DexTSRawFS*>(target);
  if (sight == nullptr || sight == this) return;
  copyCodesData(sight);
  copyJobHistory(*this, *sight, sight->jhCopies_);
  sight->setSecondData(getSecondData());
  sight->setResultCoords(copyOrNull(getResultCoords()));
  copyPhotoNotes(getPhotoNotes(), *sight);
}

// ---- Sideshot ---------------------------------------------------------------------------------------

DexTSRawSS::DexTSRawSS(int measType) : DexTSRawFS(measType, JH_DATA_NONE) {}

DexTSRawSS::~DexTSRawSS() = default;

IDexTSRawDataInterface* DexTSRawSS::clone() const {
  return detail::makeFilled([this] { return new DexTSRawSS(getMeasType()); },
                            [this](DexTSRawSS* copy) { copyCommonData(copy); });
}

void DexTSRawSS::copyCommonData(DexTSRawDataSightInterface* target) const {
  DexTSRawFS::copyCommonData(target);
  auto* const sight = dynamic_cast<DexTSRawSS*>(target);
  if (sight != nullptr && sight != this) sight->images_ = images_;
}

const utils::StringArray* DexTSRawSS::imagesOf(int type, int line) const {
  if (type >= 0 && type < kNumberOfImageTypes) return &images_[static_cast<std::size_t>(type)];
  vyn_logging::vyn_err_log(detail::kTSRawDataLogSource, line);
  return nullptr;
}

utils::StringArray* DexTSRawSS::imagesOf(int type, int line) {
  return const_cast<utils::StringArray*>(std::as_const(*this).imagesOf(type, line));
}

void DexTSRawSS::addImage(int type, const CVynStringT<wchar_t>& path) {
  if (utils::StringArray* const images = imagesOf(type, detail::kTSImageAddLine)) images->Add(path);
}

int DexTSRawSS::getNumberOfImages(int type) const {
  const utils::StringArray* const images = imagesOf(type, detail::kTSImageCountLine);
  return images != nullptr ? images->GetCount() : 0;
}

CVynStringT<wchar_t> DexTSRawSS::getImageAt(int type, int index) const {
  const utils::StringArray* const images = imagesOf(type, detail::kTSImageGetLine);
  if (images == nullptr || index < 0 || index >= images->GetCount()) return {};
  return images->GetAt(index);
}

void DexTSRawSS::removeAllImages(int type) {
  if (utils::StringArray* const images = imagesOf(type, detail::kTSImageRemoveLine)) images->RemoveAll();
}

// ---- Missing line -----------------------------------------------------------------------------------

DexTSRawMlm::DexTSRawMlm() = default;

DexTSRawMlm::~DexTSRawMlm() = default;

IDexTSRawDataInterface* DexTSRawMlm::clone() const {
  return detail::makeFilled([] { return new DexTSRawMlm(); },
                            [this](DexTSRawMlm* copy) {
                              copyData(copy);
                              copy->setSecondName(secondName_);
                            });
}

// ---- Resection --------------------------------------------------------------------------------------

DexTSRawResShot::DexTSRawResShot() = default;

DexTSRawResShot::~DexTSRawResShot() = default;

IDexTSRawDataInterface* DexTSRawResShot::clone() const {
  return detail::makeFilled([] { return new DexTSRawResShot(); },
                            [this](DexTSRawResShot* copy) {
                              copyData(copy);
                              copy->setTSRawDataResidials(copyOrNull(getTSRawDataResidials()));
                              copy->setCoords(copyOrNull(getCoords()));
                              copy->setUsedData(usedData_);
                            });
}

DexTSRawResection::~DexTSRawResection() = default;

void DexTSRawResection::addTSResShot(DexTSRawResShot* shot) {
  if (shot == nullptr) return;
  if (shot->getName().IsEmpty()) {
    if (!name_.IsEmpty()) shot->setName(name_);
  } else if (name_.IsEmpty()) {
    name_ = shot->getName();
  }
  shots_.add(shot);
}

DexAdditionalResectionData::~DexAdditionalResectionData() = default;

// ---- Station ----------------------------------------------------------------------------------------

DexTSRawStn::DexTSRawStn(int jhDataType) : DexJobHistoryInterface(jhDataType) {}

DexTSRawStn::DexTSRawStn(const DexTSRawStn& other)
    : IDexTSRawDataInterface(other),
      DexCodesDataInterface(other),
      DexJobHistoryInterface(other),
      resections_(other.resections_),
      additionalData_(other.additionalData_),
      photoNotes_(other.photoNotes_),
      note_(other.note_),
      scaleFactor_(other.scaleFactor_),
      jhCopies_(other.jhCopies_) {
  jhCopies_.redirect(other.jhCopies_, *this);
}

DexTSRawStn& DexTSRawStn::operator=(const DexTSRawStn& other) {
  if (&other == this) return *this;
  IDexTSRawDataInterface::operator=(other);
  DexCodesDataInterface::operator=(other);
  DexJobHistoryInterface::operator=(other);
  resections_ = other.resections_;
  additionalData_ = other.additionalData_;
  photoNotes_ = other.photoNotes_;
  note_ = other.note_;
  scaleFactor_ = other.scaleFactor_;
  jhCopies_ = other.jhCopies_;
  jhCopies_.redirect(other.jhCopies_, *this);
  return *this;
}

DexTSRawStn::~DexTSRawStn() = default;

IDexTSRawDataInterface* DexTSRawStn::clone() const {
  return detail::makeFilled([] { return new DexTSRawStn(JH_DATA_NONE); },
                            [this](DexTSRawStn* copy) {
                              copyData(copy);
                              copyJobHistory(*this, *copy, copy->jhCopies_);
                              copyCodesData(copy);
                              copy->note_ = note_;
                              copy->scaleFactor_ = scaleFactor_;
                              copy->resections_ = resections_;
                              copy->additionalData_ = additionalData_;
                              copy->photoNotes_ = photoNotes_;
                            });
}

const DexTSRawResection* DexTSRawStn::findTSRawResection(const CVynStringT<wchar_t>& name) const {
  return resections_.findFirst(
      [&name](const DexTSRawResection& resection) { return resection.getName() == name; });
}

// ---- Stakeout ---------------------------------------------------------------------------------------

DexTSRawStakeout::DexTSRawStakeout(int jhDataType) : DexJobHistoryInterface(jhDataType) {}

DexTSRawStakeout::DexTSRawStakeout(const DexTSRawStakeout& other)
    : IDexTSRawDataInterface(other),
      DexJobHistoryInterface(other),
      stations_(other.stations_),
      jhCopies_(other.jhCopies_) {
  jhCopies_.redirect(other.jhCopies_, *this);
}

DexTSRawStakeout& DexTSRawStakeout::operator=(const DexTSRawStakeout& other) {
  if (&other == this) return *this;
  IDexTSRawDataInterface::operator=(other);
  DexJobHistoryInterface::operator=(other);
  stations_ = other.stations_;
  jhCopies_ = other.jhCopies_;
  jhCopies_.redirect(other.jhCopies_, *this);
  return *this;
}

DexTSRawStakeout::~DexTSRawStakeout() = default;

IDexTSRawDataInterface* DexTSRawStakeout::clone() const {
  return detail::makeFilled([] { return new DexTSRawStakeout(JH_DATA_NONE); },
                            [this](DexTSRawStakeout* copy) {
                              copyData(copy);
                              copyJobHistory(*this, *copy, copy->jhCopies_);
                              copy->stations_ = stations_;
                            });
}

void DexTSRawStakeout::setStation(int type, const DexStation& station) {
  if (isStationType(type)) stations_[static_cast<std::size_t>(type)] = station;
}

const DexStation& DexTSRawStakeout::getStation(int type) const {
  if (isStationType(type)) return stations_[static_cast<std::size_t>(type)];
  vyn_logging::vyn_err_log(detail::kTSRawDataLogSource, detail::kTSStakeoutStationLine);
  return stations_[STAKE_DESIGN];
}

}  // namespace vyn::ie
