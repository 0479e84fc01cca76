#include "ieObjects/IEStation.h"

#include "hostlibs/VynLogging.h"
#include "ieObjects/IENoValue.h"
#include "ieObjects/detail/CoordsLog.h"
#include "ieObjects/detail/Tolerance.h"

namespace {

using vyn::ie::EPointAttrFlags;
using vyn::ie::detail::matchesWithin;

constexpr double kStationTolerance = 1e-12;
constexpr unsigned int kFlagBits = 32;
constexpr int kFirstExclusiveFlag = 1;
constexpr int kLastExclusiveFlag = 4;

constexpr unsigned int bitOf(unsigned int flag) noexcept {
  return 1u << (static_cast<unsigned int>(flag) % kFlagBits);
}

bool hasExactlyOneExclusiveFlag(unsigned int stationAttrs) noexcept {
  int count = 0;
  for (int flag = kFirstExclusiveFlag; flag <= kLastExclusiveFlag; ++flag) {
    if ((stationAttrs & bitOf(static_cast<EPointAttrFlags>(flag))) != 0) ++count;
  }
  return count == 1;
}

}  // namespace

namespace vyn::ie {

// ---- DexStation ---------------------------------------------------------------------------------

struct DexStation::Texts {
  CVynStringT<wchar_t> notes;
  CVynStringT<wchar_t> timeStamps;
  CVynStringT<wchar_t> id;
};

namespace {
const CVynStringT<wchar_t> kNoText;
}  // namespace

DexStation::Texts& DexStation::textsToWrite() {
  if (!texts_) texts_.reset(new Texts());
  return *texts_.get();
}

const CVynStringT<wchar_t>& DexStation::getNotes() const noexcept {
  return texts() != nullptr ? texts()->notes : kNoText;
}
void DexStation::setNotes(const CVynStringT<wchar_t>& notes) {
  if (texts() != nullptr || !notes.IsEmpty()) textsToWrite().notes = notes;
}
const CVynStringT<wchar_t>& DexStation::getTimeStamps() const noexcept {
  return texts() != nullptr ? texts()->timeStamps : kNoText;
}
void DexStation::setTimeStamps(const CVynStringT<wchar_t>& timeStamps) {
  if (texts() != nullptr || !timeStamps.IsEmpty()) textsToWrite().timeStamps = timeStamps;
}

DexStation::DexStation(unsigned int stationAttrs, EDexCSType csType)
    : stationAttrs_(stationAttrs), csType_(csType) {}

DexStation::DexStation(const DexStation& other)
    : DexPosition3D(other), IDexNameInterface(other), IDexIdInterface(other), ICoordInfo(other) {
  copy(other);
}

DexStation& DexStation::operator=(const DexStation& other) {
  if (this == &other) return *this;
  DexPosition3D::operator=(other);
  copy(other);
  return *this;
}

DexStation::~DexStation() = default;

void DexStation::reset() {
  texts_.reset();
  name_.Empty();
  heightDefined_ = true;
  horizCoordsDefined_ = true;
  geoidHeightDefined_ = false;
  geoidHeight_ = 0.0;
  bulge_ = 0.0;
  DexPosition3D::reset();
}

void DexStation::shiftCoords(const DexPosition3D& origin, double scaleX, double scaleY, double scaleZ,
                             double rotation) {
  shiftValues(origin, scaleX, scaleY, scaleZ, rotation);
  geoidHeight_ = geoidHeight_ * scaleZ + origin.getZ();
}

void DexStation::copy(const DexStation& other) {
  setNotes(other.getNotes());
  setTimeStamps(other.getTimeStamps());
  setName(other.getName());
  stationAttrs_ = other.stationAttrs_;
  heightDefined_ = other.isHeightDefined();
  horizCoordsDefined_ = other.isHorizCoordsDefined();
  if (other.isGeoidHeightDefined()) {
    setGeoidHeight(other.geoidHeight_);
  } else {
    geoidHeightDefined_ = false;
  }
  bulge_ = other.bulge_;
  setId(other.getId());
  csType_ = other.csType_;
  scaleFactor_ = other.scaleFactor_;
}

void DexStation::setName(const CVynStringT<wchar_t>& name) {
  name_ = name;
}

const CVynStringT<wchar_t>& DexStation::getName() const {
  return name_;
}

void DexStation::setId(const CVynStringT<wchar_t>& id) {
  if (texts() != nullptr || !id.IsEmpty()) textsToWrite().id = id;
}

const CVynStringT<wchar_t>& DexStation::getId() const {
  return texts() != nullptr ? texts()->id : kNoText;
}

bool DexStation::isHorizCoordsDefined() const {
  return horizCoordsDefined_;
}

bool DexStation::isHeightDefined() const {
  return heightDefined_ && getZ() != kNoHeight;
}

void DexStation::setPosition(double x, double y, double z) {
  setX(x);
  setY(y);
  setZ(z);
  if (x == kNoValue || y == kNoValue) horizCoordsDefined_ = false;
  if (z == kNoValue) heightDefined_ = false;
}

void DexStation::setPosition(double x, double y, double z, double geoidHeight) {
  setPosition(x, y, z);
  setGeoidHeight(geoidHeight);
}

void DexStation::setPosition(const DexPosition3D& position) {
  setPosition(position.getX(), position.getY(), position.getZ());
}

void DexStation::setGeoidHeight(double geoidHeight) noexcept {
  geoidHeight_ = geoidHeight;
  geoidHeightDefined_ = true;
}

bool DexStation::hasPointAttr(unsigned int flag) const noexcept {
  return (stationAttrs_ & bitOf(flag)) != 0;
}

void DexStation::addPointAttr(unsigned int flag) {
  stationAttrs_ |= bitOf(flag);
  if (!hasExactlyOneExclusiveFlag(stationAttrs_)) {
    vyn_logging::vyn_err_log(detail::kCoordsLogSource, detail::kExclusivePointAttrsLine);
  }
}

bool DexStation::operator==(const DexStation& other) const {
  if (!DexPosition3D::operator==(other)) return false;
  if (getNotes() != other.getNotes() || getTimeStamps() != other.getTimeStamps() || name_ != other.name_)
    return false;
  if (stationAttrs_ != other.stationAttrs_ || isHeightDefined() != other.isHeightDefined()) return false;
  if (geoidHeightDefined_ != other.geoidHeightDefined_) return false;
  if (geoidHeightDefined_ && !matchesWithin(geoidHeight_, other.geoidHeight_, kStationTolerance))
    return false;
  return matchesWithin(bulge_, other.bulge_, kStationTolerance);
}

// ---- DexOffsetStation ---------------------------------------------------------------------------

DexOffsetStation::DexOffsetStation(unsigned int stationAttrs, EDexCSType csType)
    : DexStation(stationAttrs, csType) {}

DexOffsetStation::DexOffsetStation(const DexOffsetStation& other) : DexStation(other) {
  copy(other);
}

DexOffsetStation& DexOffsetStation::operator=(const DexOffsetStation& other) {
  copy(other);
  DexStation::operator=(other);
  return *this;
}

DexOffsetStation::~DexOffsetStation() = default;

void DexOffsetStation::copy(const DexOffsetStation& other) {
  firstValue_ = other.firstValue_;
  firstText_ = other.firstText_;
  secondValue_ = other.secondValue_;
  secondText_ = other.secondText_;
  extraValues_ = other.extraValues_;
}

}  // namespace vyn::ie
