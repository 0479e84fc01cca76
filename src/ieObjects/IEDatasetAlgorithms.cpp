// The dataset's counts and walks: objects by kind and state, entity counts for drawing exports, sheet
// points to design points, numeric names, and the walk from one raw point to the next.

#include "ieObjects/IEDataset.h"

#include <algorithm>
#include <climits>
#include <cstddef>
#include <iterator>
#include <string_view>

#include "hostlibs/VynLogging.h"
#include "ieObjects/IEGPSRawData.h"
#include "ieObjects/IETSRawData.h"
#include "ieObjects/detail/DatasetLog.h"
#include "ieObjects/detail/DatasetObjects.h"
#include "ieUtils/IENaturalNames.h"

namespace vyn::ie {

namespace {

using detail::countObjects;
using detail::forEachObject;
using detail::isInState;

bool isPointKind(int kind) noexcept {
  return kind >= OBJECT_TYPE_DESIGN_POINT && kind < OBJECT_TYPE_POLYLINE;
}

// The kinds drawn as single lines: areas are drawn otherwise.
bool isLineKind(int kind) noexcept {
  return kind == OBJECT_TYPE_POLYLINE || kind == OBJECT_TYPE_BREAKLINE || kind == OBJECT_TYPE_ARC ||
         kind == OBJECT_TYPE_CIRCLE;
}

// The kinds whose objects live in the object list and are counted there.
bool isListedKind(int kind) noexcept {
  return (kind >= OBJECT_TYPE_DESIGN_POINT && kind <= OBJECT_TYPE_ARC) || kind == OBJECT_TYPE_TEXT_LABEL ||
         kind == OBJECT_TYPE_CIRCLE;
}

bool hasEqualAngles(DexObject& object) {
  const auto* const arc = dynamic_cast<const DexArc*>(&object);
  return arc != nullptr && arc->getData(DexArc::ARC_START_ANGLE) == arc->getData(DexArc::ARC_END_ANGLE);
}

// The non-empty lines of a label's text, split at "\n".
int countTextLines(DexObject& object) {
  const auto* const label = dynamic_cast<const DexTextLabel*>(&object);
  if (label == nullptr) return 0;
  int lines = 0;
  std::wstring_view rest = label->getText().view();
  while (!rest.empty()) {
    const std::size_t end = std::min(rest.find(L'\n'), rest.size());
    if (end > 0) ++lines;
    rest.remove_prefix(std::min(end + 1, rest.size()));
  }
  return lines;
}

// A foresight or sideshot whose name is its own: the raw points of the walk between raw points.
bool isNamedShot(const IDexRawDataInterface& record) {
  const auto* const shot = dynamic_cast<const IDexTSRawDataInterface*>(&record);
  if (shot == nullptr) return false;
  const EDexTSRawDataType type = shot->getType();
  return (type == TS_RAW_FORESIGHT || type == TS_RAW_SIDESHOT) &&
         shot->getNameSource() == IDexTSRawDataInterface::NAME_SOURCE_DEFAULT;
}

// The name of the design point made from station k of sheet point sheet.
CVynStringT<wchar_t> pointNameFor(const DexSheetPoint& sheet, const DexStation& station, int k) {
  const CVynStringT<wchar_t>& own = station.getName();
  if (k == 0 || (!own.IsEmpty() && own != sheet.getName())) return own;
  CVynStringT<wchar_t> name = sheet.getName() + L"_st";
  if (k >= 2) name.AppendFormat(L"%d", k - 1);
  return name;
}

}  // namespace

// ---- Counting -----------------------------------------------------------------------------------

int DexDataset::getNumberOfElements(int kind, int state, bool pointsOnly, bool linesOnly) const {
  const int listSize = static_cast<int>(objects_.size());
  if (pointsOnly && linesOnly) return listSize;
  if (pointsOnly || linesOnly) {
    const auto isCounted = pointsOnly ? isPointKind : isLineKind;
    return countObjects(
        objects_, [&](DexObject& object) { return isCounted(object.getType()) && isInState(object, state); });
  }
  switch (kind) {
    case OBJECT_TYPE_ALL:
      return listSize;
    case OBJECT_TYPE_SURFACE:
      return getNumberOfSurfaces();
    case OBJECT_TYPE_ALIGNMENT:
      return alignments_.count();
    case OBJECT_TYPE_PARCEL:
      return getNumberOfParcels();
    default:
      break;
  }
  if (!isListedKind(kind)) return 0;
  return countObjects(
      objects_, [&](DexObject& object) { return object.getType() == kind && isInState(object, state); });
}

int DexDataset::getNumberOfAlignments(int state) const {
  int count = 0;
  for (const DexAlignment* alignment : alignments_) {
    if (state == IDexStateInterface::ANY_STATE || alignment->getStateType() == state) ++count;
  }
  return count;
}

int DexDataset::getNumberOfElementsWithTheLayer(const DexLayer* layer, int kind) const {
  int count = 0;
  forEachObject(objects_, [&](DexObject& object) {
    if (object.getLayer() != layer || object.getStateType() != IDexStateInterface::ACTIVE_STATE) return;
    const int objectKind = object.getType();
    if (kind != OBJECT_TYPE_ALL && objectKind != kind) return;
    ++count;
    if (objectKind == OBJECT_TYPE_ARC && hasEqualAngles(object)) ++count;
    if (objectKind == OBJECT_TYPE_TEXT_LABEL) count += countTextLines(object);
  });
  return count;
}

int DexDataset::getNumberOfSegmentsWithTheLayer(const DexLayer* layer, int& arcs, int kind) const {
  if (kind != OBJECT_TYPE_POLYLINE && kind != OBJECT_TYPE_AREA) return 0;
  int segments = 0;
  forEachObject(objects_, [&](DexObject& object) {
    if (object.getLayer() != layer || object.getType() != kind ||
        object.getStateType() == IDexStateInterface::INACTIVE_STATE) {
      return;
    }
    const auto* const line = dynamic_cast<const DexPolyLine*>(&object);
    const int nodes = line != nullptr ? line->getNumberOfNodes() : 0;
    for (int i = 0; i < nodes; ++i)
      ++(line->getNodeBulge(i) == 0.0 ? segments : arcs);
    if (nodes == 0) return;
    if (line->isClosed()) {
      ++arcs;
    } else if (nodes > 1) {
      --(line->getNodeBulge(nodes - 1) != 0.0 ? arcs : segments);
    }
  });
  return segments;
}

int DexDataset::getNumberOfSeparatedArcsWithTheLayer(const DexLayer* layer, int& arcs) const {
  int count = 0;
  forEachObject(objects_, [&](DexObject& object) {
    if (object.getLayer() != layer || object.getType() != OBJECT_TYPE_ARC ||
        object.getStateType() != IDexStateInterface::ACTIVE_STATE) {
      return;
    }
    count += hasEqualAngles(object) ? 2 : 1;
    ++arcs;
  });
  return count;
}

// ---- Names, extent and sheet points -------------------------------------------------------------

void DexDataset::getMaxNumericObjectName(DexFlags<EDexObjectsType> kinds,
                                         utils::FreeNumericNames& names) const {
  forEachObject(objects_, [&](DexObject& object) {
    if (kinds.has(object.getType())) names.addObject(object.getName());
  });
  names.init();
}

void DexDataset::updateMinMax(const DexStation& station) {
  DexDatasetProperties* const properties = getDatasetProperties();
  if (properties != nullptr) properties->updateBorders(station);
}

// One pass: the sheet points leave the list, the other entries keep their order, and the new points
// are appended in the order of their sheet points, as removing and adding one sheet point at a time
// would leave them.
void DexDataset::transformStationsToPoints() {
  const auto isSheetPoint = [](const std::unique_ptr<DexObject>& object) {
    return object != nullptr && dynamic_cast<const DexSheetPoint*>(object.get()) != nullptr &&
           object->getType() == OBJECT_TYPE_SHEET_POINT;
  };
  if (std::none_of(objects_.begin(), objects_.end(), isSheetPoint)) return;

  std::vector<std::unique_ptr<DexObject>> sheetPoints;
  const auto firstSheetPoint = std::stable_partition(
      objects_.begin(), objects_.end(), [&](const auto& object) { return !isSheetPoint(object); });
  std::move(firstSheetPoint, objects_.end(), std::back_inserter(sheetPoints));
  objects_.erase(firstSheetPoint, objects_.end());

  for (const std::unique_ptr<DexObject>& owned : sheetPoints) {
    const auto& sheet = static_cast<const DexSheetPoint&>(*owned);
    for (int k = 0; k < sheet.getNumberOfStations(); ++k) {
      const DexOffsetStation* const station = sheet.getStation(k);
      if (station == nullptr) continue;
      DexStation named(*station);
      named.setName(pointNameFor(sheet, *station, k));
      auto* const point = new DexDesignPoint();
      if (point == nullptr) continue;  // the host allocator is out of memory
      point->setName(named.getName());
      point->setStation(named);
      sheet.copyCodesData(point);
      add(point);
    }
  }
}

// ---- Raw points ---------------------------------------------------------------------------------

bool DexDataset::getNextRawPointName(const CVynStringT<wchar_t>& name, int start,
                                     CVynStringT<wchar_t>& next) const {
  const DexRawData* const rawData = rawData_.get();
  if (rawData == nullptr) return false;
  bool found = name.IsEmpty();
  for (int i = std::max(start, 0); i < rawData->getNumberOfRawData(); ++i) {
    const IDexRawDataInterface& record = *rawData->getRawDataAt(i);
    switch (record.getRawDataType()) {
      case IDexRawDataInterface::RAW_DATA_TOTAL_STATION:
        if (found && isNamedShot(record)) {
          next = record.getName();
          return true;
        }
        if (record.getName() == name) found = true;
        break;
      case IDexRawDataInterface::RAW_DATA_GNSS:
        if (found) {
          next = record.getName();
          return true;
        }
        if (record.getName() == name) found = true;
        break;
      case IDexRawDataInterface::RAW_DATA_DIGITAL_LEVEL:
        return true;
      default:
        vyn_logging::vyn_err_log(detail::kDatasetLogSource, detail::kDatasetUnexpectedRawRecordLine);
        break;
    }
  }
  next.Empty();
  return true;
}

void DexDataset::getDesignPointsEnteredFromTheRawPointTillTheNextOne(
    const CVynStringT<wchar_t>& name, int start, vyn_vector<const DexDesignPoint*>& out) const {
  CVynStringT<wchar_t> next;
  bool collecting = false;
  for (const std::unique_ptr<DexObject>& object : objects_) {
    if (object == nullptr || object->getType() != OBJECT_TYPE_DESIGN_POINT) continue;
    const auto* const point = dynamic_cast<const DexDesignPoint*>(object.get());
    if (point == nullptr) continue;
    const CVynStringT<wchar_t>& pointName = point->getName();
    if (!collecting) {
      if (!name.IsEmpty() && pointName != name) continue;
      if (!getNextRawPointName(name, start, next)) {
        out.push_back(point);
        continue;
      }
      // Past the last record the next name is empty, so the search ends within the records (counted
      // here all the same, and in a wider type than the start).
      const long long last =
          static_cast<long long>(std::max(start, 0)) + rawData_.get()->getNumberOfRawData();
      for (long long from = static_cast<long long>(start) + 1;
           !next.IsEmpty() && findObject(next, OBJECT_TYPE_ALL) == nullptr && from <= last + 1; ++from) {
        getNextRawPointName(name, static_cast<int>(std::min<long long>(from, INT_MAX)), next);
      }
      collecting = true;
    }
    if (pointName == next) return;
    if (pointName != name && point->getStation().hasPointAttr(POINT_ATTR_ENTERED)) out.push_back(point);
  }
}

}  // namespace vyn::ie
