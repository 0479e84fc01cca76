#include "ieObjects/IEArcs.h"

#include "hostlibs/vynmath.h"
#include "ieObjects/IENoValue.h"
#include "ieObjects/detail/ObjectStations.h"

namespace vyn::ie {

namespace {

// The shift shared by arcs and circles. Only a uniform scale keeps a curve a curve: then the centre
// is shifted, the radius scaled and true answered. Otherwise the object becomes inactive, nothing else
// changes and the answer is false.
template <class Values>
bool shiftCurve(DexObject& curve, DexStation& centre, Values& data, int radiusKind,
                const DexPosition3D& origin, double scaleX, double scaleY, double scaleZ, double rotation) {
  if (scaleX != scaleY || scaleY != scaleZ) {
    curve.setStateType(IDexStateInterface::INACTIVE_STATE);
    return false;
  }
  centre.shiftCoords(origin, scaleX, scaleY, scaleZ, rotation);
  data.set(radiusKind, data.get(radiusKind) * scaleX);
  return true;
}

// A direction after the coordinates turned by rotation, brought into [0, 360) by the host angle type.
double turnedDirection(double direction, double rotation) noexcept {
  return CMathAngle(direction - rotation).getDeg();
}

}  // namespace

// ---- DexArc -------------------------------------------------------------------------------------

DexArc::DexArc() {
  data_.set(ARC_OPTIONAL_VALUE_1, kNoValue);
  data_.set(ARC_OPTIONAL_VALUE_2, kNoValue);
}

DexArc::~DexArc() = default;

DexObject* DexArc::clone() const {
  auto* const copy = new DexArc();
  if (copy == nullptr) return nullptr;  // the host allocator is out of memory
  copyCommonData(copy);
  copy->setStation(station_);
  copy->data_ = data_;
  copy->setDirection(clockwise_);
  return copy;
}

void DexArc::shiftCoords(const DexPosition3D& origin, double scaleX, double scaleY, double scaleZ,
                         double rotation) {
  if (!shiftCurve(*this, station_, data_, ARC_RADIUS, origin, scaleX, scaleY, scaleZ, rotation)) return;
  data_.set(ARC_START_ANGLE, turnedDirection(data_.get(ARC_START_ANGLE), rotation));
  data_.set(ARC_END_ANGLE, turnedDirection(data_.get(ARC_END_ANGLE), rotation));
}

DexObject::EGroupType DexArc::getGroupType() {
  return GROUP_LINES;
}

EDexObjectsType DexArc::getType() {
  return OBJECT_TYPE_ARC;
}

void DexArc::setStation(const DexStation& station) {
  detail::assignStationKeepingName(station_, station);
}

void DexArc::setCenter(double x, double y, double z) noexcept {
  detail::setCoordinatesDirectly(station_, x, y, z);
}

void DexArc::setCenter(double x, double y, double z, double geoidHeight) noexcept {
  setCenter(x, y, z);
  station_.setGeoidHeight(geoidHeight);
}

bool DexArc::isDataDefined(int kind) const noexcept {
  const bool isOptional = kind == ARC_OPTIONAL_VALUE_1 || kind == ARC_OPTIONAL_VALUE_2;
  return isOptional && data_.get(kind) != kNoValue;
}

// ---- DexCircle ----------------------------------------------------------------------------------

DexCircle::DexCircle() = default;

DexCircle::~DexCircle() = default;

DexObject* DexCircle::clone() const {
  auto* const copy = new DexCircle();
  if (copy == nullptr) return nullptr;  // the host allocator is out of memory
  copyCommonData(copy);
  copy->setStation(station_);
  copy->setData(CIRCLE_RADIUS, getData(CIRCLE_RADIUS));
  return copy;
}

void DexCircle::shiftCoords(const DexPosition3D& origin, double scaleX, double scaleY, double scaleZ,
                            double rotation) {
  shiftCurve(*this, station_, data_, CIRCLE_RADIUS, origin, scaleX, scaleY, scaleZ, rotation);
}

DexObject::EGroupType DexCircle::getGroupType() {
  return GROUP_LINES;
}

EDexObjectsType DexCircle::getType() {
  return OBJECT_TYPE_CIRCLE;
}

void DexCircle::setStation(const DexStation& station) {
  detail::assignStationKeepingName(station_, station);
}

void DexCircle::setCenter(double x, double y, double z) noexcept {
  detail::setCoordinatesDirectly(station_, x, y, z);
}

void DexCircle::setCenter(double x, double y, double z, double geoidHeight) noexcept {
  setCenter(x, y, z);
  station_.setGeoidHeight(geoidHeight);
}

}  // namespace vyn::ie
