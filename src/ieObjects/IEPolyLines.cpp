#include "ieObjects/IEPolyLines.h"

#include <cstddef>
#include <string_view>

#include "hostlibs/VynLogging.h"
#include "ieObjects/IEDataDictionary.h"
#include "ieObjects/IEPoints.h"
#include "ieObjects/detail/ObjectsLog.h"

namespace vyn::ie {

namespace {

// The answer to a station asked for where there is none: read-only and shared by every polyline.
const DexStation& defaultStation() {
  static const DexStation station;
  return station;
}

const DexStation& logAndAnswerDefaultStation(int line) {
  vyn_logging::vyn_err_log(detail::kObjectsLogSource, line);
  return defaultStation();
}

template <class Vector>
bool isIndexOf(const Vector& items, int index) noexcept {
  return index >= 0 && static_cast<std::size_t>(index) < items.size();
}

double vertexToleranceFor(const DexStation& station) noexcept {
  return station.getCSType() == CS_GEOGRAPHIC ? DexPolyLine::kGeographicVertexTolerance
                                              : DexPolyLine::kVertexTolerance;
}

// name == codeName + codeString, without building the joined text.
bool isCodeNameWithString(std::wstring_view name, std::wstring_view codeName, std::wstring_view codeString) {
  return name.size() == codeName.size() + codeString.size() && name.starts_with(codeName) &&
         name.ends_with(codeString);
}

// Whether a code has a code string s equal to name or, when withCodeName is true, a code string s
// that follows the code's name to give name. A code without description has no name to prefix.
bool codeCarriesString(const DexCodeValues& code, const CVynStringT<wchar_t>& name, bool withCodeName) {
  const DexCodeDescription* const description = code.getDescription();
  for (int i = 0; i < code.getNumberOfTheCodeStrings(); ++i) {
    const CVynStringT<wchar_t> codeString = code.getCodeStringAt(i);
    if (codeString == name) return true;
    if (withCodeName && description != nullptr &&
        isCodeNameWithString(name.view(), description->getName().view(), codeString.view())) {
      return true;
    }
  }
  return false;
}

// Whether any code of point carries name as a code string (see codeCarriesString). A missing point
// carries nothing.
bool pointCarriesString(const DexDesignPoint* point, const CVynStringT<wchar_t>& name, bool withCodeName) {
  if (point == nullptr) return false;
  for (int i = 0; i < point->getNumberOfCodes(); ++i) {
    if (codeCarriesString(*point->getCode(i), name, withCodeName)) return true;
  }
  return false;
}

}  // namespace

// ---- DexPolyLine --------------------------------------------------------------------------------

DexPolyLine::DexPolyLine(bool usingPoints) : usingPoints_(usingPoints) {}

DexPolyLine::~DexPolyLine() = default;

DexObject* DexPolyLine::clone() const {
  auto* const copy = new DexPolyLine(usingPoints_);
  if (copy == nullptr) return nullptr;  // the host allocator is out of memory
  copyCommonData(copy);
  copyVerticesTo(*copy);
  copy->setName(name_);
  copy->setId(id_);
  copy->setCloseStatus(closed_);
  return copy;
}

void DexPolyLine::shiftCoords(const DexPosition3D& origin, double scaleX, double scaleY, double scaleZ,
                              double rotation) {
  for (DexStation& station : stations_)
    station.shiftCoords(origin, scaleX, scaleY, scaleZ, rotation);
}

DexObject::EGroupType DexPolyLine::getGroupType() {
  return GROUP_LINES;
}

EDexObjectsType DexPolyLine::getType() {
  return OBJECT_TYPE_POLYLINE;
}

const DexDrawLineProperties* DexPolyLine::getDrawLineProperties() const {
  return dynamic_cast<const DexDrawLineProperties*>(drawProperties_.get());
}

DexDrawLineProperties* DexPolyLine::getDrawLineProperties() {
  return dynamic_cast<DexDrawLineProperties*>(drawProperties_.get());
}

// -- Station mode

void DexPolyLine::addStation(const DexStation& station) {
  if (!stations_.empty() && stations_.back().compareWithPrecision(station, vertexToleranceFor(station))) {
    if (station.getBulge() != 0.0) stations_.back() = station;
    return;
  }
  stations_.push_back(station);
}

const DexStation& DexPolyLine::getStation(int index) const {
  if (!isIndexOf(stations_, index)) return logAndAnswerDefaultStation(detail::kPolyLineStationIndexLine);
  return stations_[static_cast<std::size_t>(index)];
}

DexStation* DexPolyLine::getLastStation() noexcept {
  return stations_.empty() ? nullptr : &stations_.back();
}

const DexStation* DexPolyLine::getLastStation() const noexcept {
  return stations_.empty() ? nullptr : &stations_.back();
}

bool DexPolyLine::changeStation(int index, const DexStation& station) {
  if (!isIndexOf(stations_, index)) return false;
  stations_[static_cast<std::size_t>(index)] = station;
  return true;
}

bool DexPolyLine::changeLastStation(const DexStation& station) {
  DexStation* const last = getLastStation();
  if (last == nullptr) return false;
  *last = station;
  return true;
}

bool DexPolyLine::removeStation(int index) {
  if (!isIndexOf(stations_, index)) return false;
  stations_.erase(stations_.begin() + index);
  return true;
}

void DexPolyLine::reserveNumberOfStations(int count) {
  if (count > 0) stations_.reserve(static_cast<std::size_t>(count));
}

// -- Point mode

void DexPolyLine::addPoint(DexDesignPoint* point, double bulge) {
  points_.push_back(PointEntry{point, bulge});
}

DexDesignPoint* DexPolyLine::getPoint(int index) const noexcept {
  const PointEntry* const entry = getPointEntry(index);
  return entry != nullptr ? entry->point : nullptr;
}

const DexPolyLine::PointEntry* DexPolyLine::getPointEntry(int index) const noexcept {
  return isIndexOf(points_, index) ? &points_[static_cast<std::size_t>(index)] : nullptr;
}

bool DexPolyLine::removePoint(int index) {
  if (!isIndexOf(points_, index)) return false;
  points_.erase(points_.begin() + index);
  return true;
}

// -- Either mode

int DexPolyLine::getNumberOfNodes() const noexcept {
  return usingPoints_ ? getNumberOfPoints() : getNumberOfStations();
}

const DexStation& DexPolyLine::getNodeStation(int index) const {
  if (!usingPoints_) {
    if (!isIndexOf(stations_, index)) return logAndAnswerDefaultStation(detail::kPolyLineNodeIndexLine);
    return stations_[static_cast<std::size_t>(index)];
  }
  const PointEntry* const entry = getPointEntry(index);
  if (entry == nullptr) return logAndAnswerDefaultStation(detail::kPolyLineNodeIndexLine);
  if (entry->point == nullptr) return logAndAnswerDefaultStation(detail::kPolyLineNodeWithoutPointLine);
  return entry->point->getStation();
}

double DexPolyLine::getNodeBulge(int index) const noexcept {
  if (usingPoints_) {
    const PointEntry* const entry = getPointEntry(index);
    return entry != nullptr ? entry->bulge : 0.0;
  }
  return isIndexOf(stations_, index) ? stations_[static_cast<std::size_t>(index)].getBulge() : 0.0;
}

bool DexPolyLine::setNodeBulge(int index, double bulge) noexcept {
  if (usingPoints_) {
    if (!isIndexOf(points_, index)) return false;
    points_[static_cast<std::size_t>(index)].bulge = bulge;
    return true;
  }
  if (!isIndexOf(stations_, index)) return false;
  stations_[static_cast<std::size_t>(index)].setBulge(bulge);
  return true;
}

// -- Code string

bool DexPolyLine::isCodeString() const {
  if (!usingPoints_ || points_.empty()) return false;
  if (!pointCarriesString(points_.front().point, name_, true)) return false;
  for (std::size_t i = 1; i < points_.size(); ++i) {
    if (!pointCarriesString(points_[i].point, name_, false)) return false;
  }
  return true;
}

// -- Helpers of the clones

void DexPolyLine::copyVerticesTo(DexPolyLine& target) const {
  if (usingPoints_) {
    for (const PointEntry& entry : points_)
      target.addPoint(entry.point, entry.bulge);
  } else {
    copyStationsTo(target);
  }
}

void DexPolyLine::copyStationsTo(DexPolyLine& target) const {
  for (const DexStation& station : stations_)
    target.addStation(station);
}

// ---- DexArea ------------------------------------------------------------------------------------

DexArea::DexArea(bool usingPoints) : DexPolyLine(usingPoints) {
  setCloseStatus(true);
}

DexArea::~DexArea() = default;

DexObject* DexArea::clone() const {
  auto* const copy = new DexArea(isUsingPoints());
  if (copy == nullptr) return nullptr;  // the host allocator is out of memory
  copyCommonData(copy);
  copy->areaDrawProperties_ = areaDrawProperties_;
  copyVerticesTo(*copy);
  copy->setName(getName());
  copy->setCloseStatus(isClosed());
  return copy;
}

EDexObjectsType DexArea::getType() {
  return OBJECT_TYPE_AREA;
}

// ---- DexBreakline -------------------------------------------------------------------------------

DexBreakline::DexBreakline(const CVynStringT<wchar_t>& surfaceName)
    : DexPolyLine(false), surfaceName_(surfaceName) {}

DexBreakline::~DexBreakline() = default;

const CVynStringT<wchar_t>& DexBreakline::getSurfaceName() const {
  return surfaceName_;
}

DexObject* DexBreakline::clone() const {
  auto* const copy = new DexBreakline(surfaceName_);
  if (copy == nullptr) return nullptr;  // the host allocator is out of memory
  copyCommonData(copy);
  copyStationsTo(*copy);
  copy->setName(getName());
  return copy;
}

EDexObjectsType DexBreakline::getType() {
  return OBJECT_TYPE_BREAKLINE;
}

}  // namespace vyn::ie
