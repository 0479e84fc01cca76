// The PlanFeatures and Parcels handlers.

#include <memory>

#include "LandXmlHandlers.h"
#include "ieObjects/IEData.h"
#include "ieObjects/IEDataset.h"
#include "ieObjects/IEHorizontalAlignment.h"
#include "ieObjects/IEParcel.h"
#include "ieObjects/IEPoints.h"
#include "ieObjects/IEPolyLines.h"
#include "ieObjects/IERegion.h"

namespace vyn::ie::landxml {

namespace {

// Reads the name attribute into name; every other attribute is counted as not held.
void readName(ReadContext& context, std::wstring_view element, std::wstring_view attributes,
              std::wstring& name) {
  name.clear();
  forEachAttribute(attributes, [&](std::wstring_view attribute, std::wstring_view value) {
    if (attribute == attribute::kName) {
      name.assign(value);
    } else {
      context.notHeld(element, attribute);
    }
  });
}

DexStation stationOf(const Vertex& vertex) {
  DexStation station;
  station.setPosition(vertex.north, vertex.east, vertex.height);
  station.setBulge(vertex.bulge);
  return station;
}

}  // namespace

// ---- PlanFeatures --------------------------------------------------------------------------------

bool PlanFeaturesHandler::start(const ElementPath& path, std::wstring_view attributes) {
  if (geometry_.isOpen()) return geometry_.start(path, attributes);
  const std::wstring_view name = path.name();
  if (name == element::kPlanFeatures) {
    context_.notHeldAttributes(name, attributes);
    return true;
  }
  if (name == element::kPlanFeature && path.name(1) == element::kPlanFeatures) {
    readName(context_, name, attributes, name_);
    return true;
  }
  if (name == element::kCoordGeom && path.name(1) == element::kPlanFeature) {
    geometry_.begin(path, attributes);
    return true;
  }
  return false;
}

void PlanFeaturesHandler::text(const ElementPath& path, std::wstring_view text) {
  if (geometry_.isOpen()) geometry_.text(path, text);
}

void PlanFeaturesHandler::end(const ElementPath& path) {
  if (geometry_.isOpen() && geometry_.end(path)) addPolylines();
}

void PlanFeaturesHandler::addPolylines() {
  CVynStringT<wchar_t>& name = context_.scratch();
  point_files::assignText(name, name_);
  for (Run& run : geometry_.runs()) {
    std::vector<Vertex>& vertices = run.vertices;
    if (vertices.size() < 2) {
      context_.malformed(L"PlanFeature part of one point skipped", name_);
      continue;
    }
    const bool closed = run.isClosed();
    if (closed) vertices.pop_back();
    bool pointMode = geometry_.onlyChains();
    for (const Vertex& vertex : vertices)
      pointMode = pointMode && vertex.point != nullptr;
    auto polyline = std::make_unique<DexPolyLine>(pointMode);
    polyline->setName(name);
    polyline->setCloseStatus(closed);
    for (const Vertex& vertex : vertices) {
      if (pointMode) {
        polyline->addPoint(vertex.point, vertex.bulge);
      } else {
        polyline->addStation(stationOf(vertex));
      }
    }
    context_.dataset().add(polyline.release());
  }
}

// ---- Parcels -------------------------------------------------------------------------------------

bool ParcelsHandler::start(const ElementPath& path, std::wstring_view attributes) {
  if (geometry_.isOpen()) return geometry_.start(path, attributes);
  const std::wstring_view name = path.name();
  const std::wstring_view parent = path.name(1);
  if (name == element::kParcels && (parent == element::kLandXml || parent == element::kParcel)) {
    context_.notHeldAttributes(name, attributes);
    return true;
  }
  if (name == element::kParcel && parent == element::kParcels) {
    startParcel(attributes);
    return true;
  }
  if (open_.empty() || parent != element::kParcel) return false;
  if (name == element::kCenter) {
    center_.start(context_, name, attributes);
    return true;
  }
  if (name == element::kCoordGeom) {
    geometry_.begin(path, attributes);
    return true;
  }
  return false;
}

void ParcelsHandler::text(const ElementPath& path, std::wstring_view text) {
  if (geometry_.isOpen()) {
    geometry_.text(path, text);
  } else if (path.name() == element::kCenter) {
    center_.text(text);
  }
}

void ParcelsHandler::end(const ElementPath& path) {
  if (geometry_.isOpen()) {
    if (geometry_.end(path)) addBoundary();
    return;
  }
  const std::wstring_view name = path.name();
  if (name == element::kCenter) {
    endCenter();
  } else if (name == element::kParcel) {
    endParcel();
  }
}

// The runs of the CoordGeom join the boundary of the parcel being read.
void ParcelsHandler::addBoundary() {
  std::vector<Vertex>& boundary = open_.back().boundary;
  for (const Run& run : geometry_.runs()) {
    for (const Vertex& vertex : run.vertices) {
      if (!boundary.empty() && isSamePosition(boundary.back(), vertex)) {
        boundary.back().bulge = vertex.bulge;  // the joint of two runs
        continue;
      }
      boundary.push_back(vertex);
    }
  }
}

void ParcelsHandler::startParcel(std::wstring_view attributes) {
  Parcel& parcel = open_.emplace_back();
  readName(context_, element::kParcel, attributes, parcel.name);
}

void ParcelsHandler::endCenter() {
  Parcel& parcel = open_.back();
  Vertex center;
  if (!center_.end(context_, element::kCenter, center)) return;
  parcel.center = center;
  parcel.hasCenter = true;
  if (!center_.reference().empty()) parcel.centerPoint = context_.findPoint(center_.reference());
}

void ParcelsHandler::endParcel() {
  Parcel parcel = std::move(open_.back());
  open_.pop_back();
  CVynStringT<wchar_t>& name = context_.scratch();
  point_files::assignText(name, parcel.name);
  auto added = std::make_unique<DexParcel>();
  added->setName(name);
  if (parcel.centerPoint == nullptr && parcel.hasCenter) {
    auto point = std::make_unique<DexDesignPoint>();
    point->setName(name);
    point->setCoords(parcel.center.north, parcel.center.east, parcel.center.height);
    parcel.centerPoint = point.get();
    context_.dataset().add(point.release());
    context_.addPoint(parcel.centerPoint);
  }
  added->setCentralPoint(parcel.centerPoint);
  std::vector<Vertex>& boundary = parcel.boundary;
  if (boundary.size() >= 2 && isSamePosition(boundary.front(), boundary.back())) boundary.pop_back();
  if (!boundary.empty()) {
    auto region = std::make_unique<DexRegion>();
    region->setName(name);
    region->setRegionType(kParcelBoundaryRegion);
    for (const Vertex& vertex : boundary)
      region->addVertex(DexPositionWithBulge(vertex.north, vertex.east,
                                             vertex.height == kNoValue ? 0.0 : vertex.height, vertex.bulge));
    auto alignment = std::make_unique<DexHorizontalAlignment>();
    alignment->setName(name);
    if (context_.data().getIEAlignmentPartsDictionary()->addAlignmentPart(alignment.get()))
      added->setHAlignment(alignment.release());  // the dictionary owns it now
    context_.dataset().addRegion(region.release());
  }
  context_.dataset().add(added.release());
}

}  // namespace vyn::ie::landxml
